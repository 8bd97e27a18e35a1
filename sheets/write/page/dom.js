// Elements and numbers as text. Nothing here parses HTML: names from files can only become text.

// h('a', { href: '#x', class: 'link', onclick: … }, 'text', element, …)
export function h(tag, attributes = {}, ...children) {
  const element = document.createElement(tag);
  for (const [name, value] of Object.entries(attributes)) {
    if (value === null || value === undefined || value === false) continue;
    if (name.startsWith('on')) element.addEventListener(name.slice(2), value);
    else if (name === 'colour') element.style.setProperty('--colour', value);
    else element.setAttribute(name, value === true ? '' : value);
  }
  element.append(...children.flat(Infinity).filter((child) => (child ?? '') !== ''));
  return element;
}

// Text of a file, which may run from right to left.
export const named = (text) => h('bdi', {}, text);

export const swatch = (colour) => h('span', { class: 'swatch', colour, 'aria-hidden': 'true' });

const missing = '–';
export const fixed = (value, decimals = 2) => (value === null || value === undefined ? missing
  : value.toFixed(decimals).replace(/^-(0\.?0*)$/, '$1'));
export const triple = (values, decimals = 2) =>
  values.map((value) => fixed(value, decimals)).join('  ');
export const count = (number, noun) =>
  `${number.toLocaleString('en')} ${noun}${number === 1 ? '' : noun.endsWith('h') ? 'es' : 's'}`;

// The colour that a patch has, whatever its illuminant, for an eye that is used to the white of the
// screen.
export const colourOf = ({ lab }) => `lab(${lab.map((value) => fixed(value)).join(' ')})`;

// What is missing from a page of very many patches, or nothing.
export const leftOut = (shown, { left_out: missing, kept }) => (missing
  ? h('p', { class: 'note' }, `The page holds ${shown.toLocaleString('en')} of ` +
    `${count(shown + missing, 'patch')}: ${kept}, and an even choice of the others. Tables, ` +
    'pictures and searches are of these; --format csv gives all.') : null);

// [[term, text or element, what it means], …] as a row of figures.
export function figures(entries) {
  return h('dl', { class: 'figures' }, entries.map(([term, value, remark]) =>
    h('div', {}, h('dt', {}, term), h('dd', {}, value),
      remark ? h('dd', { class: 'remark' }, remark) : null)));
}

// A small table that needs no sorting: columns [{ label, text: (row) => …, number: true }, …].
export function smallTable(caption, columns, rows) {
  const cell = (tag, column, content) =>
    h(tag, { class: column.number ? 'number' : null, scope: tag === 'th' ? 'col' : null }, content);
  return h('div', { class: 'scroll' }, h('table', {},
    h('caption', {}, caption),
    h('thead', {}, h('tr', {}, columns.map((column) => cell('th', column, column.label)))),
    h('tbody', {}, rows.map((row) =>
      h('tr', {}, columns.map((column) => cell('td', column, column.text(row))))))));
}

// The density change that brings each solid nearest to its aim, nothing where there is none.
export const advice = (title, result) => (result.advice?.length ? [
  smallTable(title, [
    { label: 'Ink', text: ({ ink, patch }) => named(patch ?? ink) },
    { label: 'ΔE00', number: true, text: ({ de00 }) => fixed(de00) },
    { label: 'Density change', number: true, text: ({ density_change: change }) =>
      (change > 0 ? '+' : '') + fixed(change, 3) },
    { label: 'ΔE00 after', number: true, text: ({ de00_after: after }) => fixed(after) },
    { label: '', text: (row) => row.words },
  ], result.advice),
  h('p', { class: 'note' }, result.advice_from),
] : null);

export const inkColours = { Cyan: '#009ee0', Magenta: '#e5007d', Yellow: '#d9c400', Black: '#555555',
  CMYK_C: '#009ee0', CMYK_M: '#e5007d', CMYK_Y: '#d9c400', CMYK_K: '#555555' };

// Which patch stands for the paper, and why.
export const chosenPaper = (name, reason) =>
  [name === null ? 'no paper' : named(name), ` (${reason})`];

// What the program warned of, line by line.
export const warnings = (lines) => (lines.length
  ? h('ul', { class: 'note' }, lines.map((line) => h('li', {}, named(line)))) : null);

// At most `most` of the items, evenly spread over all of them.
export function spread(items, most) {
  if (items.length <= most) return items;
  return Array.from({ length: most }, (_, i) => items[Math.floor(i * items.length / most)]);
}
