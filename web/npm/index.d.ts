/** Rows of numbers, one after the other: of spectra 31 each, of colours three. */
export type Rows = ArrayLike<number>;
export type Numbers = number | ArrayLike<number>;

/** What include/vantrel.h calls A_STATUS, D50_2DEG and so on. */
export const constants: Record<string, number>;

/** A measurement; what is not closed is freed at some time after the last use. */
export interface Sheet {
  readonly file: string;
  readonly patches: number;
  readonly warnings: string[];
  readonly names: string[];
  readonly ids: string[];
  /** A row of 31 percentages for each patch; null of a file of colours alone. */
  readonly spectra: Float64Array | null;
  close(): void;
}
export interface Reading { name?: string; scale?: 'auto' | 'percent' | 'fraction'; condition?: 'M0' | 'M1' | 'M2' | 'M3' }
/** Named as the options of the program, with underscores for hyphens. */
export interface Options {
  illuminant?: string; status?: string; paper?: string;
  format?: 'json' | 'page' | 'csv' | 'cgats' | 'table';
  [option: string]: unknown;
}
export type Tell = (what: string, share: number) => void;

/** CGATS text, CSV or CxF. Throws an Error with the reason where a file is refused. */
export function read(bytes: string | ArrayBuffer | ArrayBufferView | number[], options?: Reading, tell?: Tell): Sheet;
export function readSpectra(spectra: Rows, options?: Reading & { names?: string[]; bands?: number;
  wavelengths?: number[]; device?: Record<string, (number | null)[]> }): Sheet;
/** What the commands of the program answer: an object as docs/json.md tells, or a text by `format`. */
export function report(sheets: Sheet | Sheet[], options?: Options & { secondSheet?: Sheet }, tell?: Tell): any;
export function compare(aims: Sheet, sheet: Sheet, options?: Options, tell?: Tell): any;
export function run(sheets: Sheet | Sheet[], aims: Sheet, options?: Options): any;
export function predict(sheet: Sheet, options?: Options): any;
export function ink(sheet: Sheet, options: Options & { patch: string }): any;

/** An absorption peak; band b lies at 400 + 10 b nm. */
export interface Peak { density: number; band: number }
/** The absorption peaks of one spectrum in order of wavelength, by a window of five bands. */
export function findMaxDensityPoints(refl: Rows): Peak[];
/** Which of the peaks of one spectrum borders its brightest stretch, on the side nearer to its crest. */
export function chooseBPWavelen(refl: Rows, points: { band: number }[]): number;
/** The density of one spectrum in a window of any width, whose middle weight is that of band `centre`: 5
 * where the windowed sum is 0 or less, 0 where the window reaches outside the spectrum. */
export function calculateSpecialDensity(refl: Rows, centre: number, weights: Rows): number;
