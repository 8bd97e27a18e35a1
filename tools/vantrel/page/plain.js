// Any other result as headings, figures and tables, by the names of its fields.

import { picture, spectraPlot } from './charts.js';
import { h, named, smallTable, swatch } from './dom.js';

const titleOf = (field) => {
  const words = field.replaceAll('_', ' ');
  return words.charAt(0).toUpperCase() + words.slice(1);
};
const isObject = (value) => typeof value === 'object' && value !== null && !Array.isArray(value);
const isPlain = (value) => typeof value !== 'object' || value === null;
const isColour = (value) => /^#[0-9a-f]{6}$/.test(value);

function text(value) {
  if (value === null || value === undefined) return '–';
  if (typeof value === 'number')
    return Number.isInteger(value) ? String(value) : String(Number(value.toPrecision(6)));
  if (typeof value === 'boolean') return value ? 'yes' : 'no';
  if (isColour(value)) return [swatch(value), ` ${value}`];
  if (Array.isArray(value))
    return value.flatMap((one, i) => [i ? ', ' : '', isPlain(one) ? text(one) : shorter(one)]);
  return isObject(value) ? shorter(value) : named(value);
}
const shorter = (value) => (Array.isArray(value) ? text(value)
  : Object.entries(value).flatMap(([field, one], i) =>
    [`${i ? ', ' : ''}${titleOf(field)} `, text(one)]));

const isNumber = (value) => typeof value === 'number';

function tableOf(title, rows) {
  const fields = [...new Set(rows.flatMap((row) => Object.keys(row)))];
  return smallTable(title, fields.map((field) => ({ label: titleOf(field),
    number: rows.some((row) => isNumber(row[field])), text: (row) => text(row[field]) })), rows);
}

function spectrumOf(refl, rgb, name) {
  return h('div', { class: 'pictures' }, picture('Spectrum',
    spectraPlot([{ name, rgb, refl }]),
    () => `Reflectance in percent, ${refl[0].toFixed(2)} at 400 nm to ${refl[30].toFixed(2)} at ` +
      '700 nm.').element);
}

// The fields of an object: its plain ones in one table, the others under a title of their own.
function fieldsOf(object, title) {
  const entries = Object.entries(object).filter(([field]) => field !== 'command');
  const inTable = ([, value]) => isPlain(value) ||
    (Array.isArray(value) && value.every(isPlain) && value.length < 12);
  const plain = entries.filter(inTable);
  return [
    plain.length ? smallTable(title, [
      { label: 'Field', text: ([field]) => titleOf(field) },
      { label: 'Value', text: ([, value]) => text(value) },
    ], plain) : null,
    ...entries.filter((entry) => !inTable(entry)).map(([field, value]) => {
      if (field === 'refl' && value.length === 31)
        return spectrumOf(value, isColour(object.rgb) ? object.rgb : 'gray', object.name ?? title);
      if (Array.isArray(value) && value.every(isObject)) return tableOf(titleOf(field), value);
      if (Array.isArray(value))
        return smallTable(titleOf(field), [{ label: titleOf(field), text }], value);
      const rows = Object.entries(value);
      return rows.every(([, one]) => isObject(one))
        ? tableOf(titleOf(field), rows.map(([name, one]) => ({ name, ...one })))
        : fieldsOf(value, titleOf(field));
    }),
  ];
}

export function plainPage(result, title) {
  return [h('h1', {}, title), h('section', { class: 'plain' }, fieldsOf(result, title))];
}
