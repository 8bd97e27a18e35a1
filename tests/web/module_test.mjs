// The WebAssembly module under Node gives what the program gives, and refuses what it refuses.

import assert from 'node:assert/strict';
import { execFileSync } from 'node:child_process';
import { readFileSync } from 'node:fs';
import { join } from 'node:path';
import { test } from 'node:test';
import { fileURLToPath, pathToFileURL } from 'node:url';
import { load } from '../../web/vantrel.js';

const { WEB, VANTREL } = process.env; // the folder of the module, and the program
const data = fileURLToPath(new URL('../sheets/data', import.meta.url));
const { default: create } = await import(pathToFileURL(join(WEB, 'module.mjs')));
const vantrel = await load(create, readFileSync(join(WEB, 'module.wasm')));

const opened = (name, options) =>
  vantrel.read(readFileSync(join(data, name)), { name, ...options });
const program = (...words) => {
  try {
    return JSON.parse(execFileSync(VANTREL, [...words, '--format', 'json'],
      { cwd: data, encoding: 'utf8', stdio: ['ignore', 'pipe', 'ignore'] }));
  } catch (failure) { // the tolerance is exceeded
    return JSON.parse(failure.stdout);
  }
};

// The calibrated model is fitted with the system's own functions, whose last digits differ.
const rounded = (result) => JSON.parse(JSON.stringify(result,
  (key, value) => (typeof value === 'number' ? Number(value.toPrecision(9)) : value)));

test('every file is reported as by the program', () => {
  for (const name of ['press.txt', 'proof.csv', 'tints_semicolons.csv', 'tabs_latin1_cr.txt', 'aims.txt'])
    assert.deepEqual(vantrel.report(opened(name)), program('report', name));
  assert.deepEqual(vantrel.report(opened('conditions.cxf', { condition: 'M0', scale: 'fraction' })),
    program('report', 'conditions.cxf', '--condition', 'M0', '--scale', 'fraction'));
});

test('a comparison, a press run, predictions and one ink', () => {
  assert.deepEqual(
    vantrel.compare(opened('aims.txt'), opened('press.txt'), { formula: ['cmc', 'de94', 'de2000'],
      weights: { cmc: [1.5, 1.2] }, pair: 'id', words: 'hue', tolerance: 5.5, second_illuminant: 'F7_2DEG' }),
    program('compare', 'aims.txt', 'press.txt', '--formula', 'cmc,de94,de2000', '--weights',
      'cmc=1.5,1.2', '--pair', 'id', '--words', 'hue', '--tolerance', '5.5', '--second-illuminant',
      'F7_2DEG'));
  const sheet = opened('press.txt');
  const limits = join(data, '../../../examples/offset.toml');
  assert.deepEqual(
    vantrel.run([sheet, opened('proof.csv')], opened('aims.txt'), { status: 'T_STATUS', paper: 'Paper',
      tolerances: readFileSync(limits, 'utf8'), tolerances_name: limits }),
    program('run', 'press.txt', 'proof.csv', '--aims', 'aims.txt', '--status', 'T_STATUS', '--paper', 'Paper',
      '--tolerances', limits));
  assert.deepEqual(rounded(vantrel.predict(sheet)), rounded(program('predict', 'press.txt')));
  assert.deepEqual(vantrel.ink(sheet, { patch: 'Grau', against: 'B4', illuminant: 'C_2DEG' }),
    program('ink', 'press.txt', '--patch', 'Grau', '--against', 'B4', '--illuminant', 'C_2DEG'));
});

test('spectra in memory are a sheet', () => {
  const file = opened('press.txt');
  const { spectra, names } = file;
  const [a, b] = [file, vantrel.readSpectra(spectra, { names, name: 'memory', scale: 'percent' })]
    .map((sheet) => vantrel.report(sheet, { paper: 'Paper' }).sheets[0].patches);
  assert.deepEqual(b.map(({ name, lab, density }) => [name, lab, density]),
    a.map(({ name, lab, density }) => [name, lab, density]));
  assert.deepEqual([file.ids, names], [a.map(({ id }) => id), a.map(({ name }) => name)]);
  assert.throws(() => vantrel.readSpectra(spectra.subarray(1)), /rows of 31/);
  assert.throws(() => vantrel.readSpectra(spectra, { names: names.slice(1) }), /with a name each/);
  assert.throws(() => vantrel.readSpectra(spectra, { names: names.with(2, 'a\0b') }), /a character 0/);
  file.close();
  assert.throws(() => vantrel.report(file), /press\.txt is closed/);
});

test('refusals are told, progress too, and memory is given back', () => {
  assert.throws(() => vantrel.read('CGATS.17\nBEGIN_DATA\n1\t2\n', { name: 'x' }), /^Error: x: no measurement file/);
  const bytes = readFileSync(join(data, 'press.txt'));
  const view = new DataView(bytes.buffer, bytes.byteOffset, bytes.length);
  assert.equal(vantrel.read(view, { name: 7 }).file, '7');
  for (const given of [undefined, 5, {}, Promise.resolve(bytes), new Blob([bytes])])
    assert.throws(() => vantrel.read(given), /^TypeError: read\(\) takes/);
  for (const given of [undefined, {}, { pointer: 8 }])
    assert.throws(() => vantrel.report([given]), /^TypeError: what is no sheet/);
  const sheet = vantrel.read(bytes);
  assert.throws(() => vantrel.compare(sheet, sheet, { tolerance: NaN }), /^TypeError: an option holds NaN/);
  assert.throws(() => vantrel.report([]), /there is no sheet/);
  assert.throws(() => vantrel.read(bytes, {}, 'tell'), /no function/);
  const shares = [];
  const before = vantrel.wasm.HEAPU8.length;
  const free = () => { // the place of the next function in the module's table
    const place = vantrel.wasm.addFunction(() => {}, 'v');
    vantrel.wasm.removeFunction(place);
    return place;
  };
  const place = free();
  for (let i = 0; i < 2000; ++i) {
    vantrel.read(bytes, {}, (what, share) => shares.push(share)).close();
    assert.throws(() => vantrel.read(bytes, { papier: 1 }), /no option "papier"/);
    assert.throws(() => vantrel.read(bytes, {}, () => { throw new Error('enough'); }), /^Error: enough$/);
  }
  assert.ok(shares.length >= 2000 && shares.every((share) => share >= 0 && share <= 1));
  assert.deepEqual([vantrel.wasm.HEAPU8.length, free()], [before, place]);
});
