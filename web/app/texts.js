// Every text of the application.

export const texts = {
  title: 'Vantrel: measurement files',
  intro: 'Open files of reflectance spectra: CGATS text, CSV or CxF. They stay on this machine; the ' +
    'page asks nothing of any network.',
  choose: 'Open files, or drop them here',
  paste: 'Or paste a table, from a spreadsheet too: a heading with wavelengths, a row for each patch',
  take: 'Read the table',
  pasted: (number) => `Pasted table ${number}`,
  files: 'Files',
  patches: (count) => `${count.toLocaleString('en')} ${count === 1 ? 'patch' : 'patches'}`,
  limits: 'tolerances',
  unread: 'not read; a press run counts it as missing',
  remove: (name) => `Close ${name}`,
  asStated: 'as the file says',
  illuminant: 'Illuminant',
  status: 'Density status',
  scale: 'Scale of the files',
  condition: 'Measurement condition',
  whichever: 'M1, or what the file has',
  paper: 'Paper (patch; empty for the usual one)',
  aims: 'Aims (of a press run: of all other files)',
  sheet: 'Sheet',
  pair: 'Pair patches by',
  tolerance: 'Tolerance, ΔE00',
  tolerances: 'Tolerances (a TOML file)',
  none: 'none',
  flags: {
    substrate_corrected: 'Aims on the paper of the sheet',
    force_pairs: 'Pairs that disagree too',
    allow_missing: 'Patches may be missing',
    advice: 'What to change at the press',
  },
  inks: 'Inks to predict: NAME:PERCENT, commas between (empty: all overprints)',
  noNumber: (label, wish) => `${label}: ${wish} is no number`,
  noInk: (wish) => `${wish} is no NAME:PERCENT`,
  report: 'Report',
  compare: 'Compare',
  run: 'Press run',
  predict: 'Predict overprints',
  save: 'Save as',
  formats: { json: 'JSON', csv: 'CSV', cgats: 'CGATS text', table: 'text' },
  working: (what, share) => `${what}: ${Math.round(share * 100)} %`,
  reading: (name) => `Reading ${name}`,
  calculating: 'Calculating',
  done: 'Done',
  refused: (name, reason) => (reason.startsWith(name) ? reason : `${name}: ${reason}`),
  tooLarge: (name) => `${name} is larger than 512 MiB, the largest file that is read`,
};

// What stands here for the options of the program that its texts name.
const here = { ...texts.flags, paper: 'Paper', scale: texts.scale, condition: texts.condition,
  pair: texts.pair, illuminant: texts.illuminant, tolerance: texts.tolerance, ink: 'Inks to predict',
  format: texts.save };
export const inWords = (text) => text.replace(/(?:the option |(?<=^|[\s(;])--)([a-z]+(?:[-_][a-z]+)*)/g,
  (option, name) => {
    const key = name.replaceAll('-', '_');
    return Object.hasOwn(here, key) ? `“${here[key]}”` : option;
  });
