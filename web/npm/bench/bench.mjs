// Prints what ΔE00 of a pair costs in the package, as ratios to two others on objects that were made
// before and to the library natively: medians of interleaved turns, processor time. Beside the package in
// ../npm, with native.c compiled as ./native: scripts/web copies it there.

import { execFileSync } from 'node:child_process';
import { fileURLToPath } from 'node:url';
import Color from 'colorjs.io';
import { differenceCiede2000 } from 'culori';
import { labToDE2000 } from '../npm/index.js';

const native = fileURLToPath(new URL('native', import.meta.url));

const PAIRS = 100000;
const pairs = Array.from({ length: PAIRS }, (_, i) => [
  [(i * 37) % 101, ((i * 53) % 161) - 80, ((i * 71) % 163) - 81],
  [(i * 41) % 103, ((i * 59) % 157) - 78, ((i * 67) % 167) - 83]]);
const rows = [0, 1].map((side) => Float64Array.from(pairs.flatMap((pair) => pair[side])));
const made = (make) => pairs.map((pair) => pair.map(make));
const inCulori = (mode) => made(([l, a, b]) => ({ mode, l, a, b }));
const [plain, adapted] = [inCulori('lab65'), inCulori('lab')]; // which it brings to D65 first
const inColor = made((lab) => new Color('lab', lab));
const difference = differenceCiede2000();
const total = (each, make) => each.reduce((sum, pair) => sum + make(pair), 0);

const turns = {
  'the library in C': () => execFileSync(native, { encoding: 'utf8' }).split(' ').map(Number),
  labToDE2000: () => labToDE2000(rows[0], rows[1], 1, 1).reduce((sum, value) => sum + value, 0),
  culori: () => total(plain, ([a, b]) => difference(a, b)),
  'culori, colours under D50': () => total(adapted, ([a, b]) => difference(a, b)),
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
    if (!(Math.abs(sum / expected - 1) < (/D50/.test(name) ? 0.1 : 1e-5))) throw new Error(`${name}: ${sum}, not ${expected}`);
    times[name].push(ns);
  }

const median = (values) => values.sort((a, b) => a - b)[values.length >> 1];
const own = median(times.labToDE2000);
console.log(`ΔE00 of ${PAIRS} pairs: labToDE2000 takes ${own.toFixed(0)} ns a pair`);
for (const [name, goal] of [['culori', 0.2], ['culori, colours under D50', 0.2], ['colorjs.io', 0.2],
  ['the library in C', 2.5]]) {
  const other = median(times[name]);
  console.log(`  ${(own / other).toFixed(2)} of ${name}, ${other.toFixed(0)} ns (goal: at most ${goal})`);
}
