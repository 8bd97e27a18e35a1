// Runs commands as one types them, in a folder with the sheets, and opens the pages that they write
// in Chromium.

import { spawnSync } from 'node:child_process';
import { cpSync, mkdtempSync, rmSync, writeFileSync } from 'node:fs';
import { createRequire } from 'node:module';
import { tmpdir } from 'node:os';
import { delimiter, dirname, join, resolve } from 'node:path';
import { fileURLToPath } from 'node:url';

const { MODULES, VANTREL } = process.env; // node_modules and the program
const { chromium } = createRequire(resolve(MODULES, 'any.js'))('playwright-core');
const root = fileURLToPath(new URL('../../..', import.meta.url));
export const folder = mkdtempSync(join(tmpdir(), 'vantrel_page_'));
for (const sheets of ['tests/sheets/data', 'examples'])
  cpSync(join(root, sheets), folder, { recursive: true });
export const browser = await chromium.launch({ executablePath: process.env.CHROMIUM ?? '/usr/bin/chromium' });

export async function end() {
  await browser.close();
  rmSync(folder, { recursive: true });
}

export const small = { width: 390, height: 844 };
export const wide = { width: 1280, height: 900 };

// `page.complaints` gathers errors, console lines and requests.
export async function open(command, viewport = wide, colorScheme = 'light') {
  const PATH = dirname(resolve(VANTREL)) + delimiter + process.env.PATH;
  const { status, stdout, stderr } = spawnSync('sh', ['-c', `${command} --format html`],
    { cwd: folder, encoding: 'utf8', maxBuffer: 1e9, env: { ...process.env, PATH } });
  if (status > 1 || !stdout) throw new Error(`${command}: ${status} ${stderr}`);
  writeFileSync(join(folder, 'page.html'), stdout);
  const url = `file://${join(folder, 'page.html')}`;
  const page = await browser.newPage({ viewport, colorScheme, deviceScaleFactor: 1 });
  page.complaints = [];
  page.on('console', (line) => page.complaints.push(line.text()));
  page.on('pageerror', (error) => page.complaints.push(error.message));
  page.on('request', (request) => {
    if (request.url() !== url) page.complaints.push(`request ${request.url()}`);
  });
  await page.goto(url);
  await page.waitForFunction(() =>
    [...document.querySelectorAll('.plot')].every((plot) => plot.querySelector('svg')));
  return page;
}
