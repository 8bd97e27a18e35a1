// The functions of the library over rows of Float64Array.

import { requireNumbers } from './vantrel.js';

const SIZES = { double: 8, float: 4, int: 4, unsigned: 4, wchar_t: 4 };
const HEAPS = { double: 'HEAPF64', float: 'HEAPF32', int: 'HEAP32', unsigned: 'HEAPU32', wchar_t: 'HEAPU32' };

// `table` has a row for each function: its C name, its arguments in their order, `call(f, at, i)` that
// calls f for row i, whether it tells of success, and why it would not. `constants` are the numbers
// behind names.
export function functionsOf(wasm, table, constants) {
  let arena = 0;
  let capacity = 0;
  function reserve(size) {
    if (size <= capacity) return;
    wasm._free(arena);
    capacity = 0;
    arena = wasm._malloc(size) >>> 0;
    if (!arena) throw new Error('not enough memory');
    capacity = size;
  }

  // A name is that of a constant of the argument's kind, with or without the ending of them all.
  function numberOf(value, { ending, whole }, label) {
    if (typeof value === 'number' && (!whole || (value | 0) === value)) return value;
    const found = [value, value + ending].find((name) => typeof value === 'string' &&
      Object.hasOwn(constants, name) && name.endsWith(ending) && !name.startsWith('NUM_'));
    if (found === undefined)
      throw new TypeError(`${label} is ${value}, no ${whole ? 'whole number' : 'number'} and no name`);
    return constants[found];
  }

  // What is given for an argument: { data, rows } of an array, { value } of a number.
  function taken(argument, value, name) {
    const { count, kind, nullable } = argument;
    const label = `${argument.name} of ${name}()`;
    if (kind === 'number') {
      if (!Array.isArray(value) && !ArrayBuffer.isView(value))
        return { value: numberOf(value, argument, label), rows: 1 };
      const data = Array.from(value, (one) => numberOf(one, argument, label));
      if (!data.length) throw new TypeError(`${label} takes a number, or one for each row`);
      return { data, rows: data.length };
    }
    if ((value === null || value === undefined) && nullable) return { value: 0, rows: 1 };
    const rows = value?.length / count;
    if (!(rows >= 1) || !Number.isInteger(rows))
      throw new TypeError(`${label} takes rows of ${count} numbers`);
    requireNumbers(value, label);
    return { data: value, rows };
  }

  const textAt = (codes) => String.fromCodePoint(...codes.subarray(0, codes.indexOf(0)));

  function resultOf({ count, type }, at, rows) {
    const heap = wasm[HEAPS[type]];
    const begin = at / SIZES[type];
    if (type === 'wchar_t') {
      const texts = Array.from({ length: rows }, (_, i) =>
        textAt(heap.subarray(begin + i * count, begin + (i + 1) * count)));
      return rows === 1 ? texts[0] : texts;
    }
    if (rows === 1 && count === 1) return heap[begin];
    return Float64Array.from(heap.subarray(begin, begin + rows * count));
  }

  function run({ symbol, js, args, call, succeeds, reason }, given) {
    const inputs = args.filter(({ kind }) => kind !== 'output');
    if (given.length > inputs.length)
      throw new TypeError(`${js}() takes ${inputs.length} arguments, not ${given.length}`);
    const values = inputs.map((argument, i) => taken(argument, given[i], js));
    const rows = Math.max(1, ...values.map((value) => value.rows));
    if (values.some((value) => value.rows !== 1 && value.rows !== rows))
      throw new TypeError(`${js}() takes arrays of equally many rows, or of one`);

    // Each array has its place, and each argument where it begins and how far it is to the next row.
    let size = 16; // of the four pointers of weights
    const place = (bytes) => (size += bytes) - bytes;
    const at = args.map((argument) => {
      const { kind, count, type } = argument;
      if (kind === 'output')
        return { begin: place(Math.ceil(rows * count * SIZES[type] / 8) * 8), step: count * SIZES[type] };
      const { data, value, rows: own } = values[inputs.indexOf(argument)];
      if (!data) return { begin: value, step: 0 };
      if (kind === 'number') return { values: data };
      return { begin: place(Math.ceil(data.length * SIZES[type] / 8) * 8), data, type,
        step: own === 1 ? 0 : count * SIZES[type], weights: kind === 'weights' };
    });
    reserve(size);
    args.forEach(({ kind, type, count }, i) => {
      const one = at[i];
      if (kind !== 'output' && !one.data) return;
      one.begin += arena;
      if (kind === 'output' && type === 'int')
        wasm.HEAP32.fill(-1, one.begin / 4, one.begin / 4 + rows * count); // what is not written
      if (one.data) wasm[HEAPS[one.type]].set(one.data, one.begin / SIZES[one.type]);
      if (one.weights) {
        const curves = [0, 1, 2, 3].map((curve) => one.begin + curve * 31 * 8);
        wasm.HEAPU32.set(curves, arena / 4);
        one.begin = arena;
      }
    });

    const outputs = args.map((argument, i) => [argument, at[i].begin])
      .filter(([{ kind }]) => kind === 'output');
    const returned = new Float64Array(outputs.length ? 0 : rows);
    const atOnce = rows > 1 && !at.some(({ values }) => values) ? wasm[`${symbol}Rows`] : undefined; // of few functions
    atOnce?.(...args.flatMap(({ kind }, i) => (kind === 'array' ? [at[i].begin, at[i].step] : at[i].begin)), rows);
    for (let i = 0; !atOnce && i < rows; ++i) {
      const result = call(wasm[symbol], at, i);
      if (!outputs.length) returned[i] = result;
      else if (succeeds && !result)
        throw new RangeError(`${js}()${rows === 1 ? '' : `, row ${i}`}: ${reason}`);
    }
    if (!outputs.length) return rows === 1 ? returned[0] : returned;
    const results = outputs.map(([argument, begin]) =>
      [argument.name, resultOf(argument, begin, rows)]);
    return results.length === 1 ? results[0][1] : Object.fromEntries(results);
  }

  return Object.fromEntries(table.map((row) => [row.js, (...given) => run(row, given)]));
}
