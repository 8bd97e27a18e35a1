// vantrel ink: one patch, under every status and illuminant, and beside another one.

import { legend, picture, weightsPlot } from './charts.js';
import { chosenPaper, colourOf, figures, fixed, h, named, smallTable, swatch, triple,
  warnings } from './dom.js';
import { spectraPicture } from './report.js';

const number = (label, value, decimals = 2) =>
  ({ label, number: true, text: (row) => fixed(value(row), decimals) });

function keyFigures({ patch, against, illuminant, ...result }) {
  const optional = [['Dot area', 'dot_area'], ['Gain', 'dot_gain'], ['Contrast', 'print_contrast'],
    ['Hue error', 'hue_error'], ['Grayness', 'grayness'], ['Trap', 'trap']];
  return figures([
    ['L*a*b*', triple(patch.lab), illuminant],
    ['C* and h', `${fixed(patch.lch[1])}  ${fixed(patch.lch[2])}°`],
    ['ΔE00 to the paper', fixed(patch.de00_to_paper),
      chosenPaper(result.paper, result.paper_chosen)],
    ['Density', fixed(patch.density, 3), `${patch.response ?? ''}, ${result.status}`],
    ...optional.filter(([, field]) => patch[field] !== null)
      .map(([label, field]) => [label, fixed(patch[field])]),
    ['Brightness', fixed(result.brightness), 'percent'],
    ['Whiteness', fixed(result.whiteness), result.no_whiteness ?? 'ASTM E313'],
    ...(against ? [['ΔE00', fixed(against.de00), ['to ', named(against.name)]]] : []),
  ]);
}

function densityTable({ statuses, paper }) {
  const responses = [...new Set(statuses.flatMap((status) => Object.keys(status.densities)))];
  return smallTable(paper === null ? 'Absolute densities' : 'Densities over the paper', [
    { label: 'Status', text: (row) => row.status },
    { label: 'Read by', text: (row) => row.response ?? '–' },
    number('Density', (row) => row.density, 3),
    ...responses.map((name) => number(name, (row) => row.densities[name], 3)),
  ], statuses);
}

const colourTable = ({ illuminants, against }) => smallTable('Colours', [
  { label: 'Illuminant', text: (row) => [swatch(colourOf(row)), row.illuminant] },
  ...['L*', 'a*', 'b*'].map((label, i) => number(label, (row) => row.lab[i])),
  number('C*', (row) => row.lch[1]), number('h', (row) => row.lch[2]),
  ...(!against ? [] : [
    number('ΔE00', (row) => row.de00), number('Metamerism', (row) => row.metamerism),
    number('DIN 6172', (row) => row.din6172)]),
], illuminants);

function weightsPicture(against) {
  const curves = [{ name: 'along a*', colour: '#c8385e', weights: against.a_weights },
    { name: 'along b*', colour: '#3f7fd0', weights: against.b_weights }];
  const peak = ({ name, weights }) => {
    const most = weights.reduce((best, one, i) =>
      (Math.abs(one) > Math.abs(weights[best]) ? i : best), 0);
    return `${name} most at ${400 + 10 * most} nm`;
  };
  return picture('Where the difference lies', weightsPlot(curves),
    () => `Share of each band in the difference from ${against.name}: ` +
      `${curves.map(peak).join(', ')}.`, legend(curves)).element;
}

export function inkPage(result) {
  const { patch, against } = result;
  const series = [{ name: patch.name, colour: colourOf(patch), refl: patch.refl },
    ...(against ? [{ name: against.name, colour: colourOf(against), refl: against.refl,
      dashed: true }] : [])];
  return [
    h('header', {},
      h('h1', {}, swatch(colourOf(patch)), named(patch.name)),
      h('p', { class: 'about' }, named(result.file), ` · id `, named(patch.id), ' · ',
        Object.entries(patch.device).map(([ink, percent]) => `${ink} ${percent}`).join(' '))),
    keyFigures(result),
    warnings(result.warnings),
    h('div', { class: 'pictures' },
      spectraPicture(series, () => `${fixed(patch.refl[0])} % at 400 nm, ${fixed(patch.refl[30])} ` +
        `% at 700 nm${against ? `; broken line ${against.name}` : ''}.`).element,
      against ? weightsPicture(against) : null),
    densityTable(result),
    colourTable(result),
  ];
}
