import create from './module.mjs';
import { constants, table } from './functions.js';
import { functionsOf } from './rows.js';
import { load } from './vantrel.js';
import { peaksOf } from './peaks.js';

const url = new URL('module.wasm', import.meta.url);
const inNode = typeof process === 'object' && process.versions?.node;
const bytes = inNode ? await (await import('node:fs/promises')).readFile(url)
  : await (await fetch(url)).arrayBuffer();
const { wasm, ...files } = await load(create, bytes);

export const { read, readSpectra, report, compare, run, predict, ink } = files;
export const { calculateSpecialDensity, chooseBPWavelen, findMaxDensityPoints } = peaksOf(wasm);
export { constants };
