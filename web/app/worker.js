// Reads and judges away from the page, which so stays alive. Takes { id, call, … } and answers { id,
// value } or { id, error }, and meanwhile { id, what, share }.

import create from 'module.mjs';
import wasm from 'module.wasm';
import { load } from '../vantrel.js';

const ready = load(create, wasm);
const sheets = new Map(); // by the id of the message that opened them

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
      const sheet = vantrel.read(bytes, { name, ...options }, tell);
      sheets.set(id, sheet);
      return { file: sheet.file, patches: sheet.patches, warnings: sheet.warnings };
    },
    close: () => {
      sheets.get(keys[0]).close();
      sheets.delete(keys[0]);
    },
    report: (vantrel, given) => vantrel.report(given, options, tell),
    compare: (vantrel, given) => vantrel.compare(...given, options, tell),
    run: (vantrel, [aims, ...given]) => vantrel.run(given, aims, options),
    predict: (vantrel, given) => vantrel.predict(...given, options),
  };
  try {
    const vantrel = await ready;
    postMessage({ id, value: calls[call](vantrel, keys?.map((key) => sheets.get(key))) });
  } catch (error) {
    postMessage({ id, error: error.message });
  }
};
