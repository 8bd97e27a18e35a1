// Runs the program and opens what it writes in Chromium.

import { execFileSync } from 'node:child_process';
import { mkdtempSync, rmSync, writeFileSync } from 'node:fs';
import { createRequire } from 'node:module';
import { tmpdir } from 'node:os';
import { join, resolve } from 'node:path';

const { MODULES, VANTREL } = process.env; // node_modules and the program
const { chromium } = createRequire(resolve(MODULES, 'any.js'))('playwright-core');
export const example = process.env.EXAMPLE;
export const folder = mkdtempSync(join(tmpdir(), 'vantrel_page_'));
const browser = await chromium.launch({ executablePath: process.env.CHROMIUM ?? '/usr/bin/chromium' });

export async function end() {
  await browser.close();
  rmSync(folder, { recursive: true });
}

function vantrel(words, format) {
  try {
    return execFileSync(VANTREL, [...words, '--format', format], { encoding: 'utf8', maxBuffer: 1e9 });
  } catch (failure) {
    if (failure.status === 1 && failure.stdout) return failure.stdout; // out of tolerance
    throw failure;
  }
}
export const json = (words) => JSON.parse(vantrel(words, 'json'));

export function file(name, text) {
  const path = join(folder, name);
  writeFileSync(path, text);
  return path;
}

export const small = { width: 390, height: 844 };
export const wide = { width: 1280, height: 900 };

// Opens the page of a command; `page.complaints` gathers errors, console lines and requests.
export async function open(words, viewport = wide, colorScheme = 'light') {
  const url = `file://${file('page.html', vantrel(words, 'html'))}`;
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
