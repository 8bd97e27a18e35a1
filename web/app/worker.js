// Reads and judges away from the page, which so stays alive. Takes { id, call, keys, … } and answers { id,
// value } or { id, error }, and meanwhile { id, what, share }.

import create from 'module.mjs';
import wasm from 'module.wasm';
import { load } from '../vantrel.js';

const ready = load(create, wasm);
const sheets = new Map(); // by key

onmessage = async ({ data: { id, call, name, bytes, keys, options } }) => {
  let told = 0;
  const tell = (what, share) => {
    const now = performance.now();
    if (now - told < 50) return;
    told = now;
    postMessage({ id, what, share });
  };
  const calls = {
    open: (vantrel) => {
      calls.close();
      const sheet = vantrel.read(bytes, { name, ...options }, tell);
      sheets.set(keys[0], sheet);
      return { file: sheet.file, patches: sheet.patches, warnings: sheet.warnings };
    },
    close: () => {
      sheets.get(keys[0])?.close();
      sheets.delete(keys[0]);
    },
    report: ({ report }, given) => report(given, options, tell),
    compare: ({ compare }, given) => compare(...given, options, tell),
    run: ({ run }, [aims, ...given]) => run(given, aims, options),
    predict: ({ predict }, given) => predict(...given, options),
  };
  try {
    const vantrel = await ready;
    const { read, answers } = vantrel; // texts but for the page
    postMessage({ id, value: calls[call](options.format === 'page' ? vantrel : { read, ...answers },
      keys.map((key) => sheets.get(key))) });
  } catch (error) {
    postMessage({ id, error: error.message });
  }
};
