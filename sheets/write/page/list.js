// vantrel list: the names and tables of the program.

import { h } from './dom.js';
import { searchTable } from './table.js';

const digits = (rows, field) =>
  (rows.every((row) => Number.isInteger(row[field] ?? 0)) ? 0 : 4);

export function listPage({ list, rows }) {
  const [first, ...fields] = Object.keys(rows[0]);
  const label = (field) => (field === 'nm' ? field
    : field.charAt(0).toUpperCase() + field.slice(1).replaceAll('_', ' '));
  return [
    h('h1', {}, label(list)),
    searchTable({
      caption: 'All rows', noun: 'row', rows,
      columns: [
        { label: label(first), value: (row) => String(row[first]) },
        ...fields.map((field) => ({ label: label(field), value: (row) => row[field],
          decimals: rows.some((row) => typeof row[field] === 'number') ? digits(rows, field)
            : undefined })),
      ],
      text: (row) => Object.values(row).join(' '),
    }),
  ];
}
