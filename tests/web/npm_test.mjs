// The npm package, installed from its tarball into an empty folder: every line of the golden tables, and
// the example of its README. In Chromium the same calls give the same.

import assert from 'node:assert/strict';
import { execFileSync } from 'node:child_process';
import { copyFileSync, mkdtempSync, readFileSync, readdirSync, rmSync, writeFileSync } from 'node:fs';
import { createServer } from 'node:http';
import { tmpdir } from 'node:os';
import { join } from 'node:path';
import { after, test } from 'node:test';
import { fileURLToPath, pathToFileURL } from 'node:url';
import { browser, end } from '../sheets/page/browser.mjs';

const { WEB } = process.env;
const root = fileURLToPath(new URL('../..', import.meta.url));
const folder = mkdtempSync(join(tmpdir(), 'vantrel_npm_'));
after(() => Promise.all([rmSync(folder, { recursive: true }), end()]));
const run = (cwd, command, ...words) => execFileSync(command, words, { cwd, encoding: 'utf8' });

const tarball = run(join(WEB, 'npm'), 'npm', 'pack', '--silent', '--pack-destination', folder).trim();
run(folder, 'npm', 'install', '--silent', '--offline', '--no-save', join(folder, tarball));
const installed = pathToFileURL(join(folder, 'node_modules/vantrel/'));
const vantrel = await import(new URL('index.js', installed));
const { table } = await import(new URL('functions.js', installed));

const golden = join(root, 'tests/golden');
const inputs = new Map();
function numbers(text) {
  return text.split(',').flatMap((part) => {
    const [count, value] = part.includes('*') ? part.split('*') : [1, part];
    return Array(Number(count)).fill(Number(value.replace(/^(-?)inf$/, '$1Infinity').replace('nan', 'NaN')));
  });
}
for (const line of readFileSync(join(golden, 'inputs.txt'), 'utf8').split('\n')) {
  const [, name, value] = /^(\w+)\s*=\s*(\S+)/.exec(line) ?? [];
  if (name) inputs.set(name, inputs.get(value) ?? numbers(value));
}

function argumentOf({ kind }, text) {
  if (text === 'null') return null;
  const values = inputs.get(text) ?? (text in vantrel.constants ? [vantrel.constants[text]] : numbers(text));
  return kind === 'number' ? values[0] : values;
}

function agree(actual, expected, tolerance, line) {
  if (expected === '*' || expected === 'null') return;
  if (expected.startsWith('"')) {
    assert.equal(`"${actual}"`, expected, line);
    return;
  }
  const got = typeof actual === 'number' ? [actual] : [...actual];
  const want = inputs.get(expected) ?? (expected in vantrel.constants ? [vantrel.constants[expected]] : numbers(expected));
  want.forEach((value, i) => {
    const near = tolerance ?? 1e-12 * Math.max(1, Math.abs(value));
    assert.ok(Object.is(got[i], value) || got[i] === value || Math.abs(got[i] - value) <= near,
      `${line}: ${got[i]} for ${value}`);
  });
}

// Those of the package's own shapes, as the golden tables have them.
const ofPeaks = {
  FindMaxDensityPoints(refl) {
    const peaks = vantrel.findMaxDensityPoints(refl);
    const first = [0, 1, 2].map((i) => peaks[i] ?? { density: 0, band: 0 });
    return [first.map(({ density }) => density), first.map(({ band }) => band), peaks.length];
  },
  ChooseBPWavelen: (refl, bands, count) =>
    [vantrel.chooseBPWavelen(refl, [...bands].slice(0, count).map((band) => ({ band })))],
  CalculateSpecialDensity: (refl, centre, weights, width) =>
    [vantrel.calculateSpecialDensity(refl, centre, weights.slice(0, width))],
};
const calls = []; // of functions by name, with what they gave

test('every line of the golden tables', () => {
  const rows = new Map(table.map((row) => [row.name, row]));
  const tried = new Set();
  for (const file of readdirSync(golden).filter((name) => name !== 'inputs.txt'))
    for (const whole of readFileSync(join(golden, file), 'utf8').split('\n')) {
      const line = whole.replace(/#.*/, '').replace(/ ! .*/, '').trim();
      const [call, tolerance] = line.split(' ~ ');
      const [, name, given, kind, rest] = /^(\S+)((?: [^=]*?)?) (=|fails|returns)((?: .*)?)$/.exec(call) ?? [];
      const row = rows.get(name);
      if (name in ofPeaks && !given.includes('null')) {
        const results = ofPeaks[name](...given.trim().split(' ').map((text, i) =>
          (i && !text.includes(',') ? Number(text) : inputs.get(text) ?? numbers(text))));
        tried.add(name);
        rest.trim().split(' ').forEach((expected, i) => agree(results[i], expected, tolerance && Number(tolerance), line));
      }
      if (!row) continue;
      const inputsOf = row.args.filter(({ kind: one }) => one !== 'output');
      const words = given.trim().split(/\s+/).filter(Boolean);
      if (words.includes('null') && inputsOf.some(({ nullable }, i) => words[i] === 'null' && !nullable)) {
        assert.throws(() => vantrel[row.js](...words.map((text, i) => argumentOf(inputsOf[i], text))), TypeError);
        continue;
      }
      const values = words.map((text, i) => argumentOf(inputsOf[i], text));
      tried.add(name);
      if (kind === 'fails' && / null/.test(rest)) continue; // outputs are the package's own
      if (kind === 'fails' && row.succeeds) {
        assert.throws(() => vantrel[row.js](...values), RangeError, line);
        continue;
      }
      const wanted = (rest.match(/"[^"]*"|\S+/g) ?? []);
      const result = vantrel[row.js](...values);
      calls.push([row.js, values, result]);
      const results = row.args.length === inputsOf.length ? [result]
        : result?.constructor === Object ? Object.values(result) : [result];
      if (kind === 'returns' && row.args.length !== inputsOf.length) wanted.shift();
      wanted.forEach((expected, i) => {
        if (expected !== 'unwritten') agree(results[i], expected, tolerance && Number(tolerance), line);
      });
    }
  assert.deepEqual([...rows.keys(), ...Object.keys(ofPeaks)].filter((name) => !tried.has(name)), []);
});

test('in Chromium the same calls give the same', async () => {
  const types = { js: 'text/javascript', mjs: 'text/javascript', wasm: 'application/wasm' };
  const server = createServer(({ url }, answer) => {
    const type = types[url.split('.').pop()];
    answer.setHeader('Content-Type', type ?? 'text/html');
    answer.end(type ? readFileSync(new URL(url.slice(1), installed)) : '');
  });
  await new Promise((ready) => { server.listen(0, '127.0.0.1', ready); });
  const page = await browser.newPage();
  await page.goto(`http://127.0.0.1:${server.address().port}/`);
  run(fileURLToPath(installed), join(WEB, 'node_modules/.bin/esbuild'), 'index.js', '--bundle', '--minify',
    '--format=esm', '--target=es2022', '--log-level=error', '--outfile=bundle.js');
  const sheet = readFileSync(join(root, 'tests/sheets/data/press.txt'), 'utf8');
  const [results, report] = await page.evaluate(async ([asked, text]) => {
    const [installed, bundled] = [await import('/index.js'), await import('/bundle.js')];
    return [asked.map(([name, values]) => installed[name](...values)),
      bundled.report(bundled.read(text, { name: 'press.txt' }))];
  }, [calls.map(([name, values]) => [name, values]), sheet]);
  assert.deepEqual(results, calls.map(([, , result]) => result));
  assert.deepEqual(report, vantrel.report(vantrel.read(sheet, { name: 'press.txt' })));
  server.close();
  server.closeAllConnections();
});

test('rows are what single calls are', () => {
  const lab = Float64Array.from({ length: 306 }, (_, i) => (i * 37) % 91);
  const first = lab.subarray(0, 153);
  const second = lab.subarray(153);
  const one = (values, i) => values.subarray(i * 3, i * 3 + 3);
  for (const aims of [second, one(second, 7)]) {
    const rows = vantrel.labToDE2000(first, aims, 2, 0.7);
    assert.deepEqual(rows, Float64Array.from({ length: 51 }, (_, i) =>
      vantrel.labToDE2000(one(first, i), aims.length > 3 ? one(aims, i) : aims, 2, 0.7)));
  }
  assert.deepEqual(vantrel.densityToDotArea(1.5, [0.3, 0.7], 1)[1], vantrel.densityToDotArea(1.5, 0.7, 1));
  assert.throws(() => vantrel.labToDE2000(first, second.subarray(3), 1, 1), /equally many rows, or of one/);
  assert.throws(() => vantrel.reflToCIELAB(lab, 'D50_2DEG'), /reflToCIELAB\(\) takes rows of 31 numbers/);
  assert.throws(() => vantrel.reflToCIELAB(new Float64Array(31), 'D51'), /illumObs of reflToCIELAB\(\) is D51/);
  assert.throws(() => vantrel.reflToDensity(new Float64Array(62), null, 99, 1), /row 0: for /);
});

test('what is no number and no name of its kind is refused', () => {
  const spectra = Array.from({ length: 62 }, (_, i) => 20 + i);
  const one = spectra.slice(31);
  assert.deepEqual(vantrel.reflToCIELAB(spectra, ['D50_2DEG', 'F7_10DEG']).slice(3), vantrel.reflToCIELAB(one, 'F7_10DEG'));
  for (const illuminant of [NaN, 1.5, 2 ** 32, 'toString', '__proto__', 'A_STATUS', 'NUM_ILLUM_OBS', null, []])
    assert.throws(() => vantrel.reflToCIELAB(one, illuminant), /^TypeError: illumObs of reflToCIELAB\(\)/);
  assert.throws(() => vantrel.reflToDensity(one, null, 'D50_2DEG', 1), /^TypeError: status of/);
  for (const value of [null, undefined, '40', [40]]) {
    assert.throws(() => vantrel.reflToCIELAB(one.with(3, value), 'D50_2DEG'), /^TypeError: refl of .* at place 3/);
    assert.throws(() => vantrel.readSpectra(one.with(3, value)), /^TypeError: spectra of .* at place 3/);
  }
});

test('the example of the README', () => {
  copyFileSync(join(root, 'tests/sheets/data/press.txt'), join(folder, 'sheet.txt'));
  const example = /```js\n([^`]*)```/.exec(readFileSync(new URL('README.md', installed), 'utf8'))[1];
  writeFileSync(join(folder, 'example.mjs'), example);
  const printed = run(folder, process.execPath, 'example.mjs');
  assert.match(printed, /^Float64Array\(48\) \[\s*95\.42[^]*name: 'Paper'[^]*\n1\.20\d+\n$/);
});
