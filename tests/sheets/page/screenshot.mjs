// Takes the picture of a report for the documentation: node screenshot.mjs FILE

import { end, example, open } from './browser.mjs';

const page = await open(['report', example], { width: 1200, height: 1060 });
await page.screenshot({ path: process.argv[2] });
await end();
