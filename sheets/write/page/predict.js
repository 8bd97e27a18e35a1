// vantrel predict: what three models expect of each combination, beside the measurement.

import { chosenPaper, colourOf, count, fixed, h, named, warnings } from './dom.js';
import { searchTable } from './table.js';

const nameOf = (prediction) => prediction.measured?.name ??
  prediction.inks.map((ink) => `${ink.name} ${ink.percent} %`).join(' + ');

export function predictPage(result) {
  const lab = (side) => ['L*', 'a*', 'b*'].map((label, i) => ({
    label: `${label} ${side}`, decimals: 2, value: (row) => row[side]?.lab[i] }));
  const density = (side) => ({ label: `D ${side}`, decimals: 3,
    title: `Density over the paper, ${side}`, value: (row) => row[side]?.density });
  const difference = (side) => ({ label: `ΔE00 ${side}`, decimals: 2,
    title: 'CIEDE2000 to the measurement', value: (row) => row[side]?.de00_to_measured });
  return [
    h('h1', {}, 'Predicted overprints'),
    h('p', { class: 'about' }, named(result.file), ` · ${result.illuminant} · on `,
      chosenPaper(result.paper, result.paper_chosen),
      ` · ${count(result.predictions.length, 'combination')}`),
    warnings(result.warnings),
    result.left_out ? h('p', { class: 'note' }, `Left out: ${count(result.left_out, 'overprint')} ` +
      'of more than four inks, of fractions of a percent, or without a solid.') : null,
    h('p', { class: 'note' }, result.calibration.words, '.'),
    [...new Set(result.predictions.flatMap((row) => row.lacking))].map((text) =>
      h('p', { class: 'note' }, `The sheet holds ${text}.`)),
    searchTable({
      caption: 'All combinations',
      noun: 'combination',
      columns: [
        { label: 'Combination', value: nameOf },
        ...['halftone', 'film', 'calibrated', 'measured'].flatMap((side) => [...lab(side),
          density(side), ...(side === 'measured' ? [] : [difference(side)])]),
      ],
      rows: result.predictions,
      colour: (row) => colourOf(row.measured ?? row.calibrated ?? row.halftone),
      text: (row) => `${nameOf(row)} ${row.inks.map((ink) => ink.name).join(' ')}`,
    }),
  ];
}
