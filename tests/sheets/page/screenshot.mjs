// Takes the picture of a report for the documentation: node screenshot.mjs FILE

import { end, open } from './browser.mjs';

const page = await open('vantrel report two_ink_halftone.txt', { width: 1200, height: 1060 });
await page.screenshot({ path: process.argv[2] });
await end();
