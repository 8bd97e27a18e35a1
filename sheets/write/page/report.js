// vantrel report: each sheet with its key figures, pictures and patches.

import { histogramPlot, legend, mostPoints, picture, planePlot, scalePlot, spectraPlot,
  tonePlot }
  from './charts.js';
import { advice, chosenPaper, colourOf, count, figures, fixed, h, leftOut, named, smallTable, spread,
  swatch, triple, warnings } from './dom.js';
import { searchTable } from './table.js';

const mostSwatches = 2000;
const mostCards = 60;
const mostChosen = 8;
const mostDevices = 16;

const largest = (patches, field) => patches.reduce((best, patch) =>
  (patch[field] !== null && !(best && best[field] >= patch[field]) ? patch : best), null);

// The percent of an ink that a patch names; an ink may have any name, that of a method too.
const valueOf = ({ device }, ink) => (Object.hasOwn(device, ink) ? device[ink] : undefined);

// The first patch of each ink by itself at 100 %. An ink that a patch does not name is at 0.
function solidsOf(sheet) {
  const inks = new Set(sheet.inks);
  const solids = new Map();
  for (const patch of sheet.patches) {
    const printed = Object.entries(patch.device).filter(([ink, percent]) =>
      inks.has(ink) && percent !== 0);
    if (printed.length === 1 && printed[0][1] === 100 && !solids.has(printed[0][0]))
      solids.set(printed[0][0], patch);
  }
  return solids;
}

// The patch of a solid, and its ink where the name of the patch, a number say, does not tell it.
const processInks = new Map([['CMYK_C', 'Cyan'], ['CMYK_M', 'Magenta'], ['CMYK_Y', 'Yellow'],
  ['CMYK_K', 'Black']]);
function solidName(ink, patch) {
  const called = processInks.get(ink) ?? ink;
  return patch.toLowerCase().includes(called.toLowerCase()) ? patch : `${patch} (${called})`;
}

// One curve an ink, from paper to solid.
const toneCurves = (sheet, solids) => sheet.tone_values.map(({ ink, solid, tone_value: how, values }) =>
  ({ name: solidName(ink, solid) + (how === 'sctv' ? ', SCTV' : ''), colour: solids.has(ink) ? colourOf(solids.get(ink)) : 'gray', points: [
    { nominal: 0, area: 0, gain: 0 },
    ...values.map((value) =>
      ({ nominal: value.nominal, sctv: value.sctv, ...(how === 'sctv'
        ? { area: value.sctv, gain: value.sctv - value.nominal }
        : { area: value.dot_area, gain: value.dot_gain }) })),
    { nominal: 100, area: 100, gain: 0 }] }));

function secondPaper(other) {
  const which = ['to ', chosenPaper(other.paper, other.chosen), ' of ', named(other.file)];
  return other.sum === null ? ['Paper ΔE00', fixed(other.de00), which] :
    ['Metamerism', fixed(other.sum), [...which, ` under ${other.illuminant}; DIN 6172 ` +
      `${fixed(other.din6172)}, ΔE00 ${fixed(other.de00)}`]];
}

function keyFigures(sheet, solids) {
  const { paper } = sheet;
  const gain = largest(sheet.patches, 'dot_gain');
  const contrast = largest(sheet.patches, 'print_contrast');
  return figures([
    ...(paper.lab ? [
      ['Paper L*a*b*', triple(paper.lab), chosenPaper(paper.name, paper.chosen)],
      ['Brightness', fixed(paper.brightness), 'percent'],
      ['Whiteness', fixed(paper.whiteness),
        paper.whiteness === null ? paper.no_whiteness : 'ASTM E313'],
    ] : [['Paper', 'none', `${paper.chosen}; densities are absolute, and what is relative to a ` +
      'paper is left out']]),
    paper.metamerism && secondPaper(paper.metamerism),
    ...[...solids].slice(0, 8).map(([ink, solid]) =>
      [['Density ', swatch(colourOf(solid))], fixed(solid.density, 3),
        [named(solidName(ink, solid.name)), solid.response ? `, ${solid.response}` : '']]),
    gain && ['Largest gain', fixed(gain.dot_gain), named(gain.name)],
    contrast && ['Largest contrast', fixed(contrast.print_contrast), named(contrast.name)],
  ].filter(Boolean));
}

export function swatches(patches, note) {
  const shown = spread(patches, mostSwatches);
  const cards = patches.length <= mostCards;
  const thinned = shown.length < patches.length
    ? `${count(shown.length, 'swatch')} of ${patches.length.toLocaleString('en')}, evenly spread. `
    : '';
  return h('figure', { class: 'wide' },
    h('figcaption', {}, h('strong', {}, 'Swatches'), ' ', h('span', { class: 'says' },
      thinned + note)),
    cards
      ? h('ul', { class: 'cards' }, shown.map((patch) =>
        h('li', {}, swatch(patch.colour), named(patch.name))))
      : h('div', { class: 'mosaic', role: 'img', 'aria-label':
          `${thinned}Swatches of the patches in the order of the file; the table names them.` },
      shown.map((patch) => h('span', { class: 'swatch', colour: patch.colour, title: patch.name }))));
}

const spectrumTable = (series) => h('details', {}, h('summary', {}, 'Numbers'),
  smallTable('Reflectance in percent', [
    { label: 'nm', number: true, text: (i) => String(400 + 10 * i) },
    ...series.map((one) => ({ label: named(one.name), number: true,
      text: (i) => fixed(one.refl[i]) })),
  ], series[0].refl.map((_, i) => i)));

const toneTable = (curves) => h('details', {}, h('summary', {}, 'Numbers'),
  smallTable('Dot area and gain', [
    { label: 'Ink', text: ([curve]) => named(curve.name) },
    { label: 'Nominal %', number: true, text: ([, point]) => String(point.nominal) },
    { label: 'Area %', number: true, text: ([, point]) => fixed(point.area) },
    { label: 'Gain', number: true, text: ([, point]) => fixed(point.gain) },
    { label: 'SCTV %', number: true, text: ([, point]) => fixed(point.sctv) },
  ], curves.flatMap((curve) => curve.points.slice(1, -1).map((point) => [curve, point]))));

// The spectra, to which chosen patches are added, and what follows the choice.
export function spectraPicture(fixedSeries, says) {
  const measured = (all) => all.filter((one) => one.refl); // not colours alone
  let series = measured(fixedSeries);
  const keys = h('div');
  const numbers = h('div');
  const refresh = () => {
    keys.replaceChildren(legend(series));
    numbers.replaceChildren(series.length ? spectrumTable(series) : '');
  };
  refresh();
  const spectra = picture('Spectra', (width) => spectraPlot(series)(width), says, keys, numbers);
  return { element: spectra.element, add(more) {
    series = measured([...fixedSeries, ...more]);
    refresh();
    spectra.draw();
  } };
}

function tonePictures(curves) {
  const most = curves.map((curve) => {
    const point = curve.points.reduce((a, b) => (b.gain > a.gain ? b : a));
    return `${curve.name} gains at most ${fixed(point.gain)} at ${point.nominal} %`;
  }).join('; ');
  return [
    picture('Tone values', tonePlot(curves, 'area'),
      () => `Measured dot area over the nominal tone value; the broken line is no gain.`,
      legend(curves), toneTable(curves)).element,
    picture('Gain', tonePlot(curves, 'gain'), () => `${most}.`, legend(curves)).element,
  ];
}

function greyPicture(greys) {
  const curves = [['CMY', '#8a5a44'], ['CMY grey', '#8a8a2a'], ['K', '#555555']]
    .map(([name, colour]) => ({ name, colour, points: greys.filter(({ scale }) => scale === name)
      .map(({ nominal, density }) => ({ nominal, value: density })) }))
    .filter(({ points }) => points.length);
  return curves.length ? picture('Neutral density', scalePlot(curves, 'Visual density'), () =>
    'Over the paper, along the grey scales.', legend(curves),
    h('details', {}, h('summary', {}, 'Numbers'), smallTable('Grey scales', [
      { label: 'Patch', text: ({ scale, name }) => [`${scale} `, named(name)] },
      { label: 'Nominal %', number: true, text: ({ nominal }) => String(nominal) },
      { label: 'D', number: true, text: ({ density }) => fixed(density, 3) },
    ], greys))).element : null;
}

function attributeTables(sheet) {
  const having = (field) => sheet.patches.filter((patch) => patch[field] !== null).slice(0, 200);
  const name = { label: 'Patch', text: (patch) => [swatch(colourOf(patch)), named(patch.name)] };
  const number = (label, field, decimals = 2) =>
    ({ label, number: true, text: (patch) => fixed(patch[field], decimals) });
  const blocks = [
    ['Solids', 'hue_error', [number('Density', 'density', 3), number('Hue error', 'hue_error'),
      number('Grayness', 'grayness')]],
    ['Overprints', 'trap', [number('Density', 'density', 3), number('Trap', 'trap')]],
    ['Shadows', 'print_contrast', [number('Gain', 'dot_gain'),
      number('Contrast', 'print_contrast')]],
  ];
  const tables = blocks.map(([title, field, columns]) => {
    const rows = having(field);
    return rows.length ? smallTable(title, [name, ...columns], rows) : null;
  }).filter(Boolean);
  return tables.length ? h('div', { class: 'tables' }, tables) : null;
}

function columnsOf(sheet) {
  const number = (label, field, decimals, title) =>
    ({ label, decimals, title, value: (patch) => patch[field] });
  const part = (label, field, i) =>
    ({ label, decimals: 2, value: (patch) => patch[field][i] });
  const devices = [...new Set(sheet.patches.flatMap((patch) => Object.keys(patch.device)))];
  const whole = (field) => sheet.patches.every((patch) => Number.isInteger(valueOf(patch, field) ?? 0));
  const inks = ({ device }) => Object.entries(device).filter(([, percent]) => percent !== 0)
    .map(([ink, percent]) => `${ink} ${percent}`).join(', ') || null;
  return [
    { label: 'Patch', value: (patch) => patch.name },
    { label: 'Id', value: (patch) => patch.id },
    ...devices.length > mostDevices ? [{ label: 'Inks', value: inks }]
      : devices.map((field) => ({ label: field.replace(/^CMYK_/, ''),
        decimals: whole(field) ? 0 : 1, title: `${field}, percent`,
        value: (patch) => valueOf(patch, field) })),
    part('L*', 'lab', 0), part('a*', 'lab', 1), part('b*', 'lab', 2),
    part('C*', 'lch', 1), part('h', 'lch', 2),
    number('ΔE00', 'de00_to_paper', 2, 'Colour difference to the paper, CIEDE2000'),
    { label: 'Resp.', title: 'Response that reads the patch',
      value: (patch) => patch.response },
    number('D', 'density', 3, 'Density over the paper'),
    number('Area', 'dot_area', 2, 'Dot area, percent'),
    number('Gain', 'dot_gain', 2, 'Dot gain, percentage points'),
    number('SCTV', 'sctv', 2, 'Spot colour tone value (ISO 20654), percent'),
    number('Contrast', 'print_contrast', 2, 'Print contrast, percent'),
    number('Hue err.', 'hue_error', 2, 'Hue error, percent'),
    number('Grayness', 'grayness', 2, 'Grayness, percent'),
    number('Trap', 'trap', 2, 'Trap (Preucil), percent'),
  ];
}

function sheetSection(sheet, id, heading) {
  const solids = solidsOf(sheet);
  const curves = toneCurves(sheet, solids);
  const paperPatch = sheet.patches.find((patch) => patch.name === sheet.paper.name);
  const always = new Set([paperPatch, ...solids.values()].filter(Boolean));
  const thinned = [...always, ...spread(sheet.patches.filter((patch) => !always.has(patch)),
    mostPoints)];
  let chosen = new Set();
  const points = () => [...thinned.filter((patch) => !chosen.has(patch)), ...chosen].map((patch) =>
    ({ ...patch, chosen: chosen.has(patch) }));
  const farthest = largest(sheet.patches, 'de00_to_paper');
  const series = [
    ...(paperPatch ? [{ ...paperPatch, colour: colourOf(paperPatch), dashed: true }] : []),
    ...[...solids].slice(0, 12).map(([ink, solid]) =>
      ({ ...solid, colour: colourOf(solid), name: solidName(ink, solid.name) })),
  ];
  const spectra = spectraPicture(series, () => [
    paperPatch ? 'The paper (broken line)' : '', solids.size ? count(solids.size, 'solid') : '',
  ].filter(Boolean).join(' and ') + `${paperPatch || solids.size ? '; c' : 'C'}hoose patches in ` +
    'the table to see theirs.');
  const plane = picture('a*b* plane', (width) => planePlot(points(), sheet.paper.lab)(width),
    () => (thinned.length < sheet.patches.length
      ? `${count(thinned.length, 'patch')} of ${sheet.patches.length.toLocaleString('en')}, ` +
        'evenly spread. ' : '') +
      (sheet.paper.lab ? `The diamond is the paper, a* ${fixed(sheet.paper.lab[1])}, ` +
        `b* ${fixed(sheet.paper.lab[2])}.` : ''));
  const distances = sheet.paper.lab && picture('ΔE00 to the paper',
    histogramPlot(sheet.patches.map((patch) => patch.de00_to_paper), 'ΔE00'),
    () => `Largest ${fixed(farthest.de00_to_paper)}, ${farthest.name}.`);
  const { source } = sheet;
  return h('section', { class: 'sheet', id },
    h('header', {},
      h(heading, {}, named(sheet.file)),
      h('p', { class: 'about' }, [
        count(sheet.patches.length + (sheet.left_out ?? 0), 'patch'),
        sheet.inks.length ? count(sheet.inks.length, 'ink') : null,
        sheet.illuminant, sheet.status, sheet.n_factor !== 1 ? `n = ${sheet.n_factor}` : null,
        source.condition,
        source.bands ? `measured at ${source.first_nm}–${source.last_nm} nm in ` +
          count(source.bands, 'band') : 'colours alone, no spectra',
        source.averaged ? 'averaged to 10 nm and corrected for the width' : null,
        source.interpolated ? 'interpolated to 10 nm' : null,
        source.held ? 'the last value held to 400 or 700 nm' : null,
        source.scaled_to_percent ? 'brought to percent' : null,
      ].filter(Boolean).join(' · ')),
      leftOut(sheet.patches.length, sheet)),
    keyFigures(sheet, solids),
    warnings(sheet.warnings),
    advice('Advice for the solids', sheet),
    swatches(sheet.patches.map((patch) => ({ name: patch.name, colour: colourOf(patch) })),
      'In the order of the file, as a screen can show them.'),
    h('div', { class: 'pictures' }, source.bands ? spectra.element : null,
      ...(curves.length ? tonePictures(curves) : []),
      greyPicture(sheet.greys), plane.element, distances?.element, attributeTables(sheet)),
    searchTable({
      caption: 'All patches', noun: 'patch', columns: columnsOf(sheet), rows: sheet.patches,
      colour: colourOf, text: (patch) => `${patch.name} ${patch.id}`,
      onChoose(all) {
        chosen = new Set([...all].slice(-mostChosen));
        spectra.add([...chosen].filter((patch) => !always.has(patch))
          .map((patch) => ({ ...patch, colour: colourOf(patch) })));
        plane.draw();
      },
    }));
}

export function reportPage({ sheets }) {
  const overview = sheets.length < 2 ? null : h('section', {},
    h('h1', {}, `${sheets.length} press sheets`),
    smallTable('Sheets', [
      { label: 'Sheet', text: ([sheet, i]) => h('a', { href: `#sheet-${i}` }, named(sheet.file)) },
      { label: 'Patches', number: true,
        text: ([sheet]) => (sheet.patches.length + (sheet.left_out ?? 0)).toLocaleString('en') },
      { label: 'Paper L*a*b*', number: true, text: ([sheet]) => (sheet.paper.lab ? triple(sheet.paper.lab) : '–') },
      { label: 'Largest gain', number: true,
        text: ([sheet]) => fixed(largest(sheet.patches, 'dot_gain')?.dot_gain) },
    ], sheets.map((sheet, i) => [sheet, i])));
  return [
    overview,
    sheets.map((sheet, i) => sheetSection(sheet, `sheet-${i}`, overview ? 'h2' : 'h1')),
  ];
}
