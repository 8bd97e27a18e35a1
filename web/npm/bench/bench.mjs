// Prints what ΔE00 of a pair costs in the package, as ratios to two others on objects that were made
// before and to the library natively: medians of interleaved turns, processor time. The arguments are
// the folder of the package, node_modules with the others, and native.c compiled.

import { execFileSync } from 'node:child_process';
import { createRequire } from 'node:module';
import { join, resolve } from 'node:path';
import { pathToFileURL } from 'node:url';

const [ours, modules, native] = process.argv.slice(2).map((path) => resolve(path));
const { labToDE2000 } = await import(pathToFileURL(join(ours, 'index.js')));
const { resolve: found } = createRequire(join(modules, 'any.js'));
const culori = await import(pathToFileURL(found('culori')));
const { default: Color } = await import(pathToFileURL(found('colorjs.io')));

const PAIRS = 100000;
const pairs = Array.from({ length: PAIRS }, (_, i) => [
  [(i * 37) % 101, ((i * 53) % 161) - 80, ((i * 71) % 163) - 81],
  [(i * 41) % 103, ((i * 59) % 157) - 78, ((i * 67) % 167) - 83]]);
const rows = [0, 1].map((side) => Float64Array.from(pairs.flatMap((pair) => pair[side])));
const made = (make) => pairs.map((pair) => pair.map(make));
const [inCulori, inColor] = [made(([l, a, b]) => ({ mode: 'lab65', l, a, b })),
  made((lab) => new Color('lab', lab))];
const difference = culori.differenceCiede2000();
const total = (each, make) => each.reduce((sum, pair) => sum + make(pair), 0);

const turns = {
  'the library in C': () => execFileSync(native, { encoding: 'utf8' }).split(' ').map(Number),
  labToDE2000: () => labToDE2000(rows[0], rows[1], 1, 1).reduce((sum, value) => sum + value, 0),
  'culori': () => total(inCulori, ([a, b]) => difference(a, b)),
  'colorjs.io': () => total(inColor, ([a, b]) => a.deltaE2000(b)),
};
const times = Object.fromEntries(Object.keys(turns).map((name) => [name, []]));
let expected;
for (let turn = 0; turn < 9; ++turn)
  for (const [name, run] of Object.entries(turns)) {
    const before = process.cpuUsage();
    const answer = run();
    const { user, system } = process.cpuUsage(before);
    const [ns, sum] = Array.isArray(answer) ? answer : [(user + system) * 1e3 / PAIRS, answer];
    expected ??= sum;
    if (!(Math.abs(sum / expected - 1) < 1e-9)) throw new Error(`${name}: ${sum}, not ${expected}`);
    times[name].push(ns);
  }

const median = (values) => values.sort((a, b) => a - b)[values.length >> 1];
const own = median(times.labToDE2000);
console.log(`ΔE00 of ${PAIRS} pairs: labToDE2000 takes ${own.toFixed(0)} ns a pair`);
for (const [name, goal] of [['culori', 0.2], ['colorjs.io', 0.2], ['the library in C', 2.5]]) {
  const other = median(times[name]);
  console.log(`  ${(own / other).toFixed(2)} of ${name}, ${other.toFixed(0)} ns (goal: at most ${goal})`);
}
