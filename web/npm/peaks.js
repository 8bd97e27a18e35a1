// The functions of windows over a spectrum, whose arrays have no fixed length.

import { requireNumbers } from './vantrel.js';

const BANDS = 31;

export function peaksOf(wasm) {
  // Calls work(refl, more) with the places of the spectrum and of `size` bytes after it.
  function withSpectrum(name, refl, size, work) {
    if (refl?.length !== BANDS) throw new TypeError(`refl of ${name}() takes ${BANDS} numbers`);
    requireNumbers(refl, `refl of ${name}()`);
    const at = wasm._malloc(BANDS * 8 + size) >>> 0;
    if (!at) throw new Error('not enough memory');
    try {
      wasm.HEAPF64.set(refl, at / 8);
      return work(at, at + BANDS * 8);
    } finally {
      wasm._free(at);
    }
  }

  return {
    findMaxDensityPoints: (refl) =>
      withSpectrum('findMaxDensityPoints', refl, 8 + BANDS * 16, (at, count) => {
        wasm._FindMaxDensityPoints(at, count + 8, count);
        return Array.from({ length: wasm.HEAP32[count / 4] }, (_, i) => ({
          density: wasm.HEAPF64[count / 8 + 1 + 2 * i], band: wasm.HEAP32[count / 4 + 4 + 4 * i] }));
      }),
    chooseBPWavelen: (refl, points) =>
      withSpectrum('chooseBPWavelen', refl, points.length * 16, (at, peaks) => {
        points.forEach(({ band }, i) => { wasm.HEAP32[peaks / 4 + 4 * i + 2] = band; });
        return wasm._ChooseBPWavelen(at, peaks, points.length);
      }),
    calculateSpecialDensity: (refl, centre, weights) =>
      withSpectrum('calculateSpecialDensity', refl, weights.length * 8, (at, window) => {
        wasm.HEAPF64.set(weights, window / 8);
        return wasm.__Z23CalculateSpecialDensityPKdiPdi(at, centre, window, weights.length);
      }),
  };
}
