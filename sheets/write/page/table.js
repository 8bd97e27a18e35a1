// The table of all patches: sorted, searched and paged by TanStack Table, shown as a plain table.

import {
  columnFilteringFeature, constructTable, createFilteredRowModel, createPaginatedRowModel,
  createSortedRowModel, globalFilteringFeature, rowPaginationFeature, rowSortingFeature,
  tableFeatures,
} from '@tanstack/table-core';
import { storeReactivityBindings } from '@tanstack/table-core/store-reactivity-bindings';
import { count, fixed, h, named, swatch } from './dom.js';

const pageSize = 50;
const mostPrinted = 2000;
const words = new Intl.Collator('en', { numeric: true, sensitivity: 'base' });
const compare = (a, b) => (typeof a === 'string' ? words.compare(a, b) : a - b);

const isNumber = ({ decimals }) => (decimals ?? null) !== null;
const decimalsOf = ({ decimals }, row) => (typeof decimals === 'function' ? decimals(row) : decimals);

const features = () => tableFeatures({
  coreReactivityFeature: storeReactivityBindings(),
  columnFilteringFeature,
  globalFilteringFeature,
  rowSortingFeature,
  rowPaginationFeature,
  filteredRowModel: createFilteredRowModel(),
  sortedRowModel: createSortedRowModel(),
  paginatedRowModel: createPaginatedRowModel(),
});

// columns: [{ label, title, value: (row) => text or number or null, decimals }, …], of which the
// first names the row; the row may tell its decimals. `colour` and `text` give the row's swatch and
// what the search looks into. With `onChoose` the rows can be chosen.
export function searchTable({ caption, noun, columns, rows, colour, text, onChoose }) {
  const used = columns.filter((column, i) =>
    i === 0 || rows.some((row) => (column.value(row) ?? null) !== null));
  const table = constructTable({
    features: features(),
    data: rows,
    columns: used.map((column, i) => ({
      id: String(i),
      accessorFn: (row) => column.value(row) ?? undefined,
      sortUndefined: 'last',
      sortFn: (a, b, id) => compare(a.getValue(id), b.getValue(id)),
      sortDescFirst: false,
    })),
    getColumnCanGlobalFilter: (column) => column.id === '0',
    globalFilterFn: (row, id, wanted) => text(row.original).toLowerCase().includes(wanted),
    initialState: { pagination: { pageIndex: 0, pageSize } },
    autoResetPageIndex: false,
  });
  const chosen = new Set();

  const heads = used.map((column, i) => h('th', { scope: 'col',
    class: isNumber(column) ? 'number' : null },
  h('button', { type: 'button', title: column.title ?? null,
    onclick: () => { table.getColumn(String(i)).toggleSorting(); table.firstPage(); show(); } },
  column.label)));
  const body = h('tbody');
  const status = h('p', { class: 'count', role: 'status' });
  const search = h('input', { type: 'search', placeholder: 'Search',
    'aria-label': `Search: ${caption}`, oninput: () => {
      table.setGlobalFilter(search.value.trim().toLowerCase());
      table.firstPage();
      show();
    } });
  const turn = (label, action) => h('button', { type: 'button', class: 'turn',
    onclick: () => { table[action](); show(); } }, label);
  const [back, on] = [turn('Previous', 'previousPage'), turn('Next', 'nextPage')];
  const pager = h('nav', { class: 'pager', 'aria-label': `Pages: ${caption}` }, back, on);

  function rowOf(row) {
    return h('tr', {}, used.map((column, i) => {
      const value = column.value(row);
      if (i) return h('td', { class: isNumber(column) ? 'number' : null },
        isNumber(column) ? fixed(value, decimalsOf(column, row)) : named(value ?? '–'));
      const name = [colour ? swatch(colour(row)) : null, named(value)];
      return h('th', { scope: 'row' }, !onChoose ? name : h('button', { type: 'button',
        class: 'choose', 'aria-pressed': String(chosen.has(row)), onclick: (event) => {
          if (!chosen.delete(row)) chosen.add(row);
          event.currentTarget.setAttribute('aria-pressed', String(chosen.has(row)));
          onChoose(chosen);
        } }, name));
    }));
  }

  function show(printed = false) {
    const all = table.getPrePaginatedRowModel().rows;
    const page = printed && all.length <= mostPrinted ? all : table.getRowModel().rows;
    body.replaceChildren(...page.map((row) => rowOf(row.original)));
    used.forEach((column, i) => {
      const order = table.getColumn(String(i)).getIsSorted();
      heads[i].setAttribute('aria-sort',
        order === 'asc' ? 'ascending' : order === 'desc' ? 'descending' : 'none');
    });
    const first = all.indexOf(page[0]) + 1;
    const range = page.length < all.length
      ? `${first.toLocaleString('en')}–${(first + page.length - 1).toLocaleString('en')} of ` : '';
    const among = all.length < rows.length ? ` found among ${rows.length.toLocaleString('en')}` : '';
    status.textContent = `${range}${count(all.length, noun)}${among}`;
    back.disabled = !table.getCanPreviousPage();
    on.disabled = !table.getCanNextPage();
    pager.hidden = all.length <= pageSize;
  }

  addEventListener('beforeprint', () => show(true));
  addEventListener('afterprint', () => show());
  show();
  return h('section', { class: 'patches' },
    h('div', { class: 'bar' }, h('h3', {}, caption), search, status),
    h('div', { class: 'scroll', tabindex: '0', role: 'region', 'aria-label': caption },
      h('table', { 'aria-label': caption }, h('thead', {}, h('tr', {}, heads)), body)),
    pager);
}
