// The application in Chromium shows what the program's page shows, and asks nothing of any network.

import assert from 'node:assert/strict';
import { execFileSync } from 'node:child_process';
import { closeSync, openSync, readFileSync, writeSync } from 'node:fs';
import { createServer } from 'node:http';
import { join } from 'node:path';
import { after, test } from 'node:test';
import { pathToFileURL } from 'node:url';
import { inWords } from '../../web/app/texts.js';
import { browser, end, folder, open, small, wide } from '../sheets/page/browser.mjs';
import { faultsOfLayout } from '../sheets/page/layout.mjs';
import { textOfPage } from '../sheets/page/text.mjs';

after(end);

const app = join(process.env.WEB, 'app');
const url = pathToFileURL(join(app, 'index.html')).href;

async function openApp(viewport, files, colorScheme = 'light') {
  const page = await browser.newPage({ viewport, colorScheme, deviceScaleFactor: 1 });
  page.setDefaultTimeout(20000);
  page.complaints = [];
  page.on('console', (line) => page.complaints.push(line.text()));
  page.on('pageerror', (error) => page.complaints.push(error.message));
  page.on('request', (request) => {
    if (!/^(blob:|file:.*app\/(index.html|icon.svg)$)/.test(request.url())) page.complaints.push(request.url());
  });
  await page.goto(url);
  await give(page, files.map((name) => join(folder, name)));
  return page;
}

async function give(page, files, timeout = 30000) {
  await page.evaluate(() => { document.querySelector('[role=status]').textContent = ''; });
  await page.setInputFiles('input[type=file]', files);
  await page.getByRole('status').filter({ hasText: 'Done' }).waitFor({ timeout });
}

async function press(page, name) {
  await page.getByRole('button', { name, exact: true }).click();
  await page.waitForFunction(() => document.querySelector('#result > *') &&
    [...document.querySelectorAll('.plot')].every((plot) => plot.querySelector('svg')));
}

// Roles of the accessibility tree whose nodes have no name.
async function nameless(page) {
  const devtools = await page.context().newCDPSession(page);
  const { nodes } = await devtools.send('Accessibility.getFullAXTree');
  const named = nodes.filter(({ ignored, role }) =>
    !ignored && /button|box|link|slider|progress|image|table|region|dialog|tab$/i.test(role.value));
  assert.ok(named.length > 15, `${named.length} controls`);
  return named.filter(({ name }) => !name?.value).map(({ role, properties }) => [role.value, properties]);
}

const said = (page, within) => page.evaluate(textOfPage, within);

for (const [button, command, files] of [
  ['Report', 'vantrel report press.txt', ['press.txt']],
  ['Compare', 'vantrel compare aims.txt press.txt --tolerances offset.toml',
    ['aims.txt', 'press.txt', 'offset.toml']],
  ['Press run', 'vantrel run press.txt proof.csv --aims aims.txt --tolerances offset.toml',
    ['aims.txt', 'press.txt', 'proof.csv', 'offset.toml']],
  ['Predict overprints', 'vantrel predict press.txt', ['press.txt']],
])
  test(`${button} is the page of ${command}`, async () => {
    const [ours, theirs] = [await openApp(wide, files), await open(command)];
    await press(ours, button);
    assert.equal(await said(ours, '#result > *'), inWords(await said(theirs, '#page > :not(footer)')));
    assert.doesNotMatch(await ours.innerText('main'), /--[a-z]/);
    assert.deepEqual(await nameless(ours), []);
    assert.deepEqual([...ours.complaints, ...theirs.complaints], []);
    await ours.close();
    await theirs.close();
  });

test('a telephone in the dark, a file that is no measurement, a tolerance, files closed', async () => {
  const page = await openApp(small, ['press.txt', 'offset.toml', 'page.html', 'proof.csv'], 'dark');
  assert.match(await page.innerText('.complaints'), /^page\.html:.*: ./);
  await page.getByLabel('Tolerance, ΔE00').fill('2,5');
  await press(page, 'Compare');
  assert.match(await page.innerText('.verdict'), /ailed[^]* above ΔE00 2\.5;/);
  assert.deepEqual(await page.evaluate(faultsOfLayout), []);
  await page.getByLabel(/^Paper \(/).fill('No such patch');
  await page.getByRole('button', { name: 'Report', exact: true }).click();
  await page.getByRole('alert').filter({ hasText: 'No such patch' }).waitFor();
  assert.equal(await page.innerText('#result'), '');
  assert.ok(await page.getByRole('button', { name: 'Save as' }).isDisabled());
  await page.getByLabel('Tolerance, ΔE00').fill('1e');
  await page.getByRole('button', { name: 'Compare', exact: true }).click();
  await page.getByRole('alert').filter({ hasText: 'Tolerance, ΔE00: 1e is no number' }).waitFor();
  await page.getByLabel(/^Paper \(/).fill('');
  await press(page, 'Press run');
  assert.match(await page.innerText('#result'), /not judged: page\.html:11: /);
  assert.match(await page.innerText('.files'), /0\.961, is taken for a fraction; “Scale of the files” sets/);
  await page.getByLabel('Scale of the files').selectOption('fraction');
  await page.getByText('0.961').waitFor({ state: 'detached' });
  assert.equal(await page.innerText('#result'), '');
  for (const name of ['press.txt', 'proof.csv']) await page.getByLabel(`Close ${name}`).click();
  assert.equal(await page.evaluate(() => document.activeElement.getAttribute('aria-label')), 'Close page.html');
  assert.ok(await page.getByRole('button', { name: 'Report', exact: true }).isDisabled());
  assert.deepEqual(page.complaints, []);
  await page.close();
});

test('a table pasted by the keyboard, inks to predict, a result saved', async () => {
  const page = await openApp(wide, []);
  const rows = readFileSync(join(folder, 'tints_semicolons.csv'), 'utf8').replaceAll(';', '\t');
  await page.getByLabel(/^Or paste a table/).fill(rows);
  await page.keyboard.press('Tab');
  await page.keyboard.press('Enter');
  await page.getByText('Pasted table 1 · ').waitFor();
  await press(page, 'Report');
  assert.equal(await page.evaluate(() => document.activeElement.id), 'result');
  const waiting = page.waitForEvent('download');
  await page.getByLabel('Save as').first().selectOption('CSV');
  await page.getByRole('button', { name: 'Save as' }).click();
  assert.equal((await waiting).suggestedFilename(), 'report.csv');
  assert.match(readFileSync(await (await waiting).path(), 'utf8'), /^file,.*nm700,warnings\r?\nPasted table 1,/);
  const sheet = page.locator('label', { hasText: /^Sheet/ }).locator('select');
  await sheet.selectOption('Pasted table 1');
  await page.evaluate((cells) => { // out of a spreadsheet
    const dataTransfer = new DataTransfer();
    dataTransfer.setData('text/plain', cells);
    document.dispatchEvent(new DragEvent('drop', { dataTransfer, cancelable: true }));
  }, rows);
  await page.getByText('Pasted table 2 · ').waitFor();
  assert.equal(await sheet.locator('option:checked').innerText(), 'Pasted table 1');
  await page.getByLabel(/^Inks/).fill('Magenta 100:40, Gelb: 70');
  await press(page, 'Predict overprints');
  assert.match(await page.innerText('#result'), /Magenta 100 40 % \+ .* 70 %/);
  assert.deepEqual(page.complaints, []);
  await page.close();
});

test('a file of 200 MB, the page alive meanwhile', async () => {
  const [head, rows] = readFileSync(join(folder, 'press.txt'), 'utf8').split(/^BEGIN_DATA\r?\n/m);
  const row = rows.split('\n')[3];
  const large = join(folder, 'large.txt');
  const file = openSync(large, 'w');
  let patches = 0;
  writeSync(file, `${head.replace(/^NUMBER_OF_SETS.*\r?\n/m, '')}BEGIN_DATA\n`);
  for (let size = 0; size < 2e8; patches += 10000)
    size += writeSync(file, Array.from({ length: 10000 }, (_, i) => `${row.replace(/^\S+/, patches + i)}\n`).join(''));
  writeSync(file, 'END_DATA\n');
  closeSync(file);
  const page = await openApp(wide, []);
  const longest = page.evaluate(() => new Promise((resolve) => {
    let last = performance.now();
    let most = 0;
    const tick = () => {
      most = Math.max(most, performance.now() - last);
      last = performance.now();
      if (document.querySelector('.files li')) resolve(most);
      else setTimeout(tick, 10);
    };
    tick();
  }));
  await give(page, [large], 240000);
  assert.ok(await longest < 2000, `the page stood still for ${await longest} ms`);
  assert.match(await page.innerText('.files'), new RegExp(`large.txt · ${patches.toLocaleString('en')} patches`));
  page.setDefaultTimeout(240000);
  await press(page, 'Report');
  assert.match(await page.innerText('#result'), new RegExp(`50,000 of ${patches.toLocaleString('en')} patches`));
  assert.deepEqual(page.complaints, []);
  await page.close();
});

test('from a server it is kept and opens without one', async () => {
  const types = { html: 'text/html', js: 'text/javascript', svg: 'image/svg+xml', webmanifest: 'application/json' };
  const server = createServer(({ url: path }, answer) => {
    const name = path === '/' ? 'index.html' : path.slice(1);
    answer.setHeader('Content-Type', types[name.split('.').pop()]);
    answer.end(readFileSync(join(app, name)));
  });
  await new Promise((ready) => { server.listen(0, '127.0.0.1', ready); });
  const page = await browser.newPage();
  const at = `http://127.0.0.1:${server.address().port}/index.html`;
  await page.goto(at);
  await page.evaluate(() => navigator.serviceWorker.ready);
  server.closeAllConnections();
  await new Promise((closed) => { server.close(closed); });
  await page.goto(at);
  await give(page, [join(folder, 'press.txt')]);
  await press(page, 'Report');
  assert.match(await page.title(), /press\.txt/);
  const waiting = page.waitForEvent('download');
  await page.getByRole('button', { name: 'Save as' }).click();
  assert.equal(readFileSync(await (await waiting).path(), 'utf8'), execFileSync(process.env.VANTREL,
    ['report', 'press.txt', '--format', 'json'], { cwd: folder, encoding: 'utf8', stdio: ['ignore', 'pipe', 'ignore'] }));
  await page.close();
});
