// vantrel predict: what two models expect of each combination, beside the measurement.

import { count, fixed, h, named } from './dom.js';
import { searchTable } from './table.js';

const nameOf = (prediction) => prediction.measured?.name ??
  prediction.inks.map((ink) => `${ink.name} ${ink.percent} %`).join(' + ');

export function predictPage(result) {
  const lab = (side, title) => ['L*', 'a*', 'b*'].map((label, i) => ({ id: `${side}-${label}`,
    label: `${label} ${title}`, decimals: 2, value: (row) => row[side]?.lab[i] }));
  const difference = (side, title) => ({ id: `${side}-de`, label: `ΔE00 ${title}`, decimals: 2,
    value: (row) => row[side].de00_to_measured });
  return [
    h('h1', {}, 'Predicted overprints'),
    h('p', { class: 'about' }, named(result.file), ` · ${result.illuminant} · on `,
      named(result.paper), ` · ${count(result.predictions.length, 'combination')}`),
    result.left_out ? h('p', { class: 'note' }, `Left out: ${count(result.left_out, 'overprint')} ` +
      'of more than three inks, of fractions of a percent, or without a solid.') : null,
    searchTable({
      caption: 'All combinations',
      noun: 'combination',
      columns: [
        { id: 'name', label: 'Combination', value: nameOf },
        ...lab('halftone', 'halftone'), difference('halftone', 'halftone'),
        ...lab('film', 'film'), difference('film', 'film'), ...lab('measured', 'measured'),
      ],
      rows: result.predictions,
      rgb: (row) => (row.measured ?? row.halftone).rgb,
      text: (row) => `${nameOf(row)} ${row.inks.map((ink) => ink.name).join(' ')}`,
    }),
  ];
}
