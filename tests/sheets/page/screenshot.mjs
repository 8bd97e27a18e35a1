// Takes the pictures of pages for the documentation: node screenshot.mjs FOLDER

import { end, open } from './browser.mjs';

for (const [name, command] of [
  ['report', 'vantrel report two_ink_halftone.txt'],
  ['run', 'python3 make_run.py run; vantrel run run/sheet_*.txt --aims run/aims.txt --tolerances run.toml'],
]) {
  const page = await open(command, { width: 1200, height: 1060 });
  await page.screenshot({ path: `${process.argv[2]}/${name}.png` });
}
await end();
