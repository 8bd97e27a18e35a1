import create from './module.mjs';
import { constants, table } from './functions.js';
import { functionsOf } from './rows.js';
import { load } from './vantrel.js';
import { peaksOf } from './peaks.js';

const url = new URL('module.wasm', import.meta.url);
const inNode = typeof process === 'object' && process.versions?.node;
const system = 'node:fs/promises'; // which bundlers for browsers must not look for
const bytes = inNode ? await (await import(/* webpackIgnore: true */ /* @vite-ignore */ system)).readFile(url)
  : await (await fetch(url)).arrayBuffer();
const { wasm, ...calls } = await load(create, bytes);

export const { read, readSpectra, report, compare, run, predict, ink } = calls;
export const { calculateSpecialDensity, chooseBPWavelen, findMaxDensityPoints } = peaksOf(wasm);
export { constants };
