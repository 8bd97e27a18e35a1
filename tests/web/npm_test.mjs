// The npm package, installed from its tarball into an empty folder: every line of the golden tables, and
// the example of its README.

import assert from 'node:assert/strict';
import { execFileSync } from 'node:child_process';
import { copyFileSync, mkdtempSync, readFileSync, readdirSync, rmSync, writeFileSync } from 'node:fs';
import { tmpdir } from 'node:os';
import { join } from 'node:path';
import { after, test } from 'node:test';
import { fileURLToPath, pathToFileURL } from 'node:url';

const { WEB } = process.env;
const root = fileURLToPath(new URL('../..', import.meta.url));
const folder = mkdtempSync(join(tmpdir(), 'vantrel_npm_'));
after(() => rmSync(folder, { recursive: true }));
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

test('every line of the golden tables', () => {
  const rows = new Map(table.map((row) => [row.name.slice(1), row]));
  const tried = new Set();
  for (const file of readdirSync(golden).filter((name) => name !== 'inputs.txt'))
    for (const whole of readFileSync(join(golden, file), 'utf8').split('\n')) {
      const line = whole.replace(/#.*/, '').replace(/ ! .*/, '').trim();
      const [call, tolerance] = line.split(' ~ ');
      const [, name, given, kind, rest] = /^(\S+)((?: [^=]*?)?) (=|fails|returns)((?: .*)?)$/.exec(call) ?? [];
      const row = rows.get(name);
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
      const results = row.args.length === inputsOf.length ? [result]
        : result?.constructor === Object ? Object.values(result) : [result];
      if (kind === 'returns' && row.args.length !== inputsOf.length) wanted.shift();
      wanted.forEach((expected, i) => {
        if (expected !== 'unwritten') agree(results[i], expected, tolerance && Number(tolerance), line);
      });
    }
  assert.ok(tried.size >= 80, `${tried.size} functions`);
});

test('rows are what single calls are', () => {
  const lab = Float64Array.from({ length: 300 }, (_, i) => (i * 37) % 91);
  const first = lab.subarray(0, 150);
  const second = lab.subarray(150);
  const rows = vantrel.labToDE2000(first, second, 1, 1);
  assert.equal(rows.length, 50);
  rows.forEach((value, i) => assert.equal(value,
    vantrel.labToDE2000(first.subarray(i * 3, i * 3 + 3), second.subarray(i * 3, i * 3 + 3), 1, 1)));
  assert.deepEqual(vantrel.densityToDotArea(1.5, [0.3, 0.7], 1)[1], vantrel.densityToDotArea(1.5, 0.7, 1));
  assert.throws(() => vantrel.reflToCIELAB(lab, 'D50_2DEG'), /reflToCIELAB\(\) takes rows of 31 numbers/);
  assert.throws(() => vantrel.reflToCIELAB(new Float64Array(31), 'D51'), /illumObs of reflToCIELAB\(\) is D51/);
  assert.throws(() => vantrel.reflToDensity(new Float64Array(62), null, 99, 1), /row 0: for /);
});

test('the example of the README', () => {
  copyFileSync(join(root, 'tests/sheets/data/press.txt'), join(folder, 'sheet.txt'));
  const example = /```js\n([^`]*)```/.exec(readFileSync(new URL('README.md', installed), 'utf8'))[1];
  writeFileSync(join(folder, 'example.mjs'), example);
  const printed = run(folder, process.execPath, 'example.mjs');
  assert.match(printed, /^Float64Array\(48\) \[\s*95\.42[^]*name: 'Paper'[^]*\n1\.20\d+\n$/);
});
