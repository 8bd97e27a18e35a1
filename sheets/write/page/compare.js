// vantrel compare: the verdict, and the pairs that it rests on.

import { histogramPlot, legend, mostPoints, picture, planePlot, scalePlot, tonePlot }
  from './charts.js';
import { advice, chosenPaper, colourOf, count, figures, fixed, h, inkColours, leftOut, named,
  smallTable, spread, swatch, warnings } from './dom.js';
import { spectraPicture, swatches } from './report.js';
import { searchTable } from './table.js';

const labeller = ({ labels }) => (formula) => labels[formula];
const labText = (lab) => lab.map((value) => fixed(value)).join(' ');

function verdict(result) {
  const [formula] = result.formulas;
  const labelOf = labeller(result);
  const { max, max_patch: patch } = result.statistics[formula];
  const worst = [`The largest ${labelOf(formula)} is ${fixed(max)}, at `, named(patch)];
  const [, word, rest] = result.says.match(/^(.*?)[:;] (.*)$/s);
  return h('div', { class: `verdict ${result.verdict ?? ''}` },
    h('p', { class: 'word' }, word),
    h('p', {}, `${rest[0].toUpperCase()}${rest.slice(1)}. `, worst, '.'),
    result.corrected?.verdict
      ? h('p', {}, `Substrate-corrected: ${result.corrected.verdict}.`) : null);
}

const papersNote = ({ reference, sample, papers }) => h('p', { class: 'note' },
  'Paper of the reference: ', chosenPaper(reference.paper, reference.paper_chosen),
  '; of the sample: ', chosenPaper(sample.paper, sample.paper_chosen),
  papers ? `; between them ΔE00 ${fixed(papers.de00)}` +
    (papers.metamerism === null ? '' : `, metamerism ${fixed(papers.metamerism)}`) : '', '.');

const repeats = ({ means }) => ['reference', 'sample'].map((side) => means[side] &&
  h('p', { class: 'note' }, `${count(means[side].patches, 'patch')} of the ${side} as the mean of ` +
    'repeats; the widest, ', named(means[side].widest),
  `, has ${means[side].repeats} up to ΔE00 ${fixed(means[side].spread)} from their mean.`));

const digits = (limit) => (limit.formula === 'density' ? 3 : 2);
const statisticNames = { maximum: 'largest', mean: 'mean', p95: '95th percentile' };

export const limitsTable = (caption, limits) => (limits?.length ? smallTable(caption, [
  { label: 'Patches', text: (limit) => limit.patches },
  { label: 'Quantity', text: (limit) => `${limit.label}, ${statisticNames[limit.statistic]}` },
  { label: 'Judged', number: true, text: (limit) => `${limit.judged} of ${limit.found}` },
  { label: 'Measured', number: true, text: (limit) => fixed(limit.measured, digits(limit)) },
  { label: 'Limit', number: true, text: (limit) => fixed(limit.limit, digits(limit)) },
  { label: 'Margin', number: true, text: (limit) => fixed(limit.margin, digits(limit)) },
  { label: 'Verdict', text: (limit) => limit.verdict },
  { label: 'Largest at', text: ({ max_patch: patch, sheet, note }) => [patch,
    sheet && `sheet ${sheet}`, note].filter(Boolean).flatMap((text, i) => [i ? '; ' : '', named(text)]) },
], limits) : null);

// Both tone values of spot inks: by density, and by ISO 20654.
function spotTable(steps) {
  const spots = steps.filter((step) => step.sample_sctv !== null);
  return spots.length ? smallTable('Tone values of spot inks', [
    { label: 'Ink', text: ({ ink }) => named(ink) },
    { label: 'Nominal %', number: true, text: ({ nominal }) => String(nominal) },
    ...[['SCTV aim', 'reference_sctv'], ['SCTV', 'sample_sctv'], ['Dot area aim', 'reference'],
      ['Dot area', 'sample']].map(([label, field]) =>
      ({ label, number: true, text: (step) => fixed(step[field]) })),
  ], spots) : null;
}

// The tone curves of both sheets over each other.
function tonePicture(steps) {
  const known = steps.filter((step) => step.reference !== null && step.sample !== null);
  if (!known.length) return null;
  const curves = [...new Set(known.map(({ ink }) => ink))].flatMap((ink) =>
    ['reference', 'sample'].map((side) => ({ name: `${ink}, ${side}`, dashed: side === 'reference',
      colour: inkColours[ink] ?? '#777777', points: [{ nominal: 0, area: 0, gain: 0 },
        ...known.filter((step) => step.ink === ink).map((step) => ({ nominal: step.nominal,
          area: step[side], gain: step[side] - step.nominal })),
        { nominal: 100, area: 100, gain: 0 }] })));
  const far = known.reduce((a, b) =>
    (Math.abs(b.sample - b.reference) > Math.abs(a.sample - a.reference) ? b : a));
  return picture('Tone values', tonePlot(curves, 'area'), () => 'Dot area of the sample, broken of ' +
    `the reference; farthest apart at ${far.ink} ${far.nominal} %, ` +
    `${fixed(far.sample)} for ${fixed(far.reference)}.`, legend(curves)).element;
}

// The scales of cyan, magenta and yellow, and of black: how far from grey, and how dark.
function greyPictures(greys) {
  if (!greys.length) return null;
  const curve = (scale, name, field, dashed, colour) => ({ name: `${scale}, ${name}`, dashed, colour,
    points: greys.filter((step) => step.scale === scale && step[field] !== null)
      .map((step) => ({ nominal: step.nominal, value: step[field] })) });
  const both = (...rows) => [['CMY', '#8a5a44'], ['CMY grey', '#8a8a2a'], ['K', '#555555']].flatMap(([scale, colour]) =>
    rows.map(([name, field, dashed]) => curve(scale, name, field, dashed, colour)))
    .filter(({ points }) => points.length);
  const differences = both(['ΔCh', 'delta_ch', false], ['ΔL*', 'delta_l', true]);
  const densities = both(['sample', 'density', false], ['reference', 'reference_density', true]);
  const farthest = Math.max(...greys.map((step) => step.delta_ch));
  return [
    picture('Grey scales', scalePlot(differences, 'Δ'), () =>
      `From the aims: ΔCh up to ${fixed(farthest)}, ΔL* broken.`, legend(differences)).element,
    densities.length ? picture('Neutral density', scalePlot(densities, 'Visual density'), () =>
      'Over the paper, along the scales; the reference is broken.', legend(densities)).element
      : null,
    smallTable('Grey scales', [
      { label: 'Patch', text: ({ scale, name }) => [`${scale} `, named(name)] },
      { label: 'Nominal %', number: true, text: ({ nominal }) => String(nominal) },
      { label: 'ΔCh', number: true, text: (step) => fixed(step.delta_ch) },
      { label: 'ΔL*', number: true, text: (step) => fixed(step.delta_l) },
      { label: 'D aim', number: true, text: (step) => fixed(step.reference_density, 3) },
      { label: 'D', number: true, text: (step) => fixed(step.density, 3) },
    ], greys),
  ];
}

function unpaired(result) {
  const side = (title, names) => names.length
    ? h('p', { class: 'note' }, `${count(names.length, 'patch')} of the ${title} alone: `,
      names.slice(0, 20).flatMap((name, i) => [i ? ', ' : '', named(name)]),
      names.length > 20 ? ' …' : '') : null;
  return [side('reference', result.unpaired.reference), side('sample', result.unpaired.sample)];
}

function pairColumns(result) {
  const labelOf = labeller(result);
  const lab = (side, short) => ['L*', 'a*', 'b*'].map((label, i) =>
    ({ label: `${label} ${short}`, decimals: 2, title: `${label}, ${side}`,
      value: (pair) => pair[side].lab[i] }));
  return [
    { label: 'Patch', value: (pair) => pair.name },
    ...result.formulas.map((formula) =>
      ({ label: labelOf(formula), decimals: 2, value: (pair) => pair[formula] })),
    { label: 'Difference', value: (pair) => pair.verbal },
    { label: 'Metam.', decimals: 2, value: (pair) => pair.metamerism,
      title: `Metamerism between ${result.illuminant} and ${result.second_illuminant}` },
    ...lab('reference', 'ref.'), ...lab('sample', 'sample'),
    { label: 'Resp.', title: 'Response that reads the reference',
      value: (pair) => pair.response },
    { label: 'D ref.', decimals: 3, title: 'Density over the paper, reference',
      value: (pair) => pair.reference.density },
    { label: 'ΔD', decimals: 3, title: 'Density, sample less reference',
      value: (pair) => pair.density_difference },
  ];
}

const spectraOf = (pair) => [
  { name: `${pair.name}, reference`, colour: colourOf(pair.reference),
    refl: pair.reference.refl, dashed: true },
  { name: `${pair.name}, sample`, colour: colourOf(pair.sample), refl: pair.sample.refl },
];

const bothColours = ({ reference, sample }) =>
  `linear-gradient(to bottom right, ${colourOf(reference)} 50%, ${colourOf(sample)} 50%)`;

const pairings = { name: 'name', id: 'id', device: 'device values', order: 'place in the file' };

const overview = (result) => h('header', {},
  h('h1', {}, named(result.sample.file), ' against ', named(result.reference.file)),
  h('p', { class: 'about' }, [count(result.pairs.length + (result.left_out ?? 0), 'patch'),
    `paired by ${pairings[result.paired_by]}`, result.illuminant, result.status].join(' · ')),
  leftOut(result.pairs.length, result));

const statisticsTable = (result) => smallTable('Differences', [
  { label: 'Formula', text: labeller(result) },
  ...[['Mean', 'mean'], ['95th percentile', 'p95'], ['Largest', 'max']].map(([label, field]) =>
    ({ label, number: true, text: (name) => fixed(result.statistics[name][field]) })),
  { label: 'At', text: (name) => named(result.statistics[name].max_patch) },
], result.formulas);

export function comparePage(result) {
  const { formulas, pairs, statistics } = result;
  const labelOf = labeller(result);
  if (!pairs.length) return [overview(result), h('p', {}, 'No patch has a partner.'),
    unpaired(result)];
  const [formula] = formulas;
  const worst = result.worst.map((i) => pairs[i]);
  const paper = pairs.find((pair) => pair.sample.name === result.sample.paper);
  let chosen = new Set();
  const always = new Set(worst);
  const thinned = [...always, ...spread(pairs.filter((pair) => !always.has(pair)), mostPoints)];
  const points = () => [...thinned.filter((pair) => !chosen.has(pair)), ...chosen].map((pair) =>
    ({ name: pair.name, lab: pair.sample.lab, reference: pair.reference.lab,
      chosen: chosen.has(pair) }));
  const plane = picture('a*b* plane', (width) => planePlot(points(), paper?.sample.lab)(width), () =>
    (thinned.length < pairs.length ? `${count(thinned.length, 'patch')} of ` +
      `${pairs.length.toLocaleString('en')}, evenly spread. ` : '') +
    'Rings are the reference, filled points the sample' + (paper ? ', the diamond its paper.' : '.'));
  const spectra = spectraPicture(spectraOf(worst[0]), () =>
    'Reference (broken line) and sample of the worst patch; choose more in the table.');
  const { mean, p95, max } = statistics[formula];
  const histogram = picture(`${labelOf(formula)} of all patches`,
    histogramPlot(pairs.map((pair) => pair[formula]), labelOf(formula), result.tolerance),
    () => `Mean ${fixed(mean)}, 95th percentile ${fixed(p95)}, largest ${fixed(max)}.`);
  return [
    overview(result),
    verdict(result),
    papersNote(result),
    warnings(result.warnings),
    formulas.length === 1 ? figures([
      [`${labelOf(formula)} mean`, fixed(mean)],
      ['95th percentile', fixed(p95)],
      ['Largest', fixed(max), named(statistics[formula].max_patch)],
    ]) : statisticsTable(result),
    repeats(result),
    unpaired(result),
    limitsTable(result.tolerances ?? 'Limits', result.limits),
    limitsTable(`${result.tolerances}, substrate-corrected`, result.corrected?.limits),
    h('div', { class: 'tables' }, smallTable(`The worst ${worst.length} by ${labelOf(formula)}`, [
      { label: 'Patch', text: (pair) => [swatch(colourOf(pair.reference)),
        swatch(colourOf(pair.sample)), named(pair.name)] },
      ...formulas.map((name) => ({ label: labelOf(name), number: true,
        text: (pair) => fixed(pair[name]) })),
      { label: 'Difference', text: (pair) => pair.verbal ?? '–' },
      { label: 'Reference L*a*b*', number: true, text: (pair) => labText(pair.reference.lab) },
      { label: 'Sample L*a*b*', number: true, text: (pair) => labText(pair.sample.lab) },
    ], worst)),
    advice('Advice for the solids', result),
    h('div', { class: 'pictures' }, histogram.element, plane.element,
      tonePicture(result.tone_values), spotTable(result.tone_values), greyPictures(result.greys),
      pairs.some((pair) => pair.sample.refl) ? spectra.element : null,
      swatches(pairs.map((pair) => ({ name: pair.name, colour: bothColours(pair) })),
        'The reference upper left, the sample lower right, as a screen can show them.')),
    searchTable({
      caption: 'All patches', noun: 'patch', columns: pairColumns(result), rows: pairs,
      colour: (pair) => colourOf(pair.sample),
      text: (pair) => `${pair.name} ${pair.reference.name} ${pair.verbal}`,
      onChoose(all) {
        chosen = new Set([...all].slice(-4));
        spectra.add([...chosen].filter((pair) => pair !== worst[0]).flatMap(spectraOf));
        plane.draw();
      },
    }),
  ];
}
