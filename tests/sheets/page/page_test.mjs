// The page of --format html in a real browser.

import assert from 'node:assert/strict';
import { readFileSync } from 'node:fs';
import { after, test } from 'node:test';
import { end, example, file, json, open, small, wide } from './browser.mjs';
import { faultsOfLayout } from './layout.mjs';

after(end);

const text = readFileSync(example, 'utf8');
const [head, body] = text.split('BEGIN_DATA\n');
const lines = body.split('END_DATA')[0].trim().split('\n');
const sheetOf = (name, rows) => file(name, `${head.replace('SETS\t31', `SETS\t${rows.length}`)}` +
  `BEGIN_DATA\n${rows.join('\n')}\nEND_DATA\n`);
const renamed = (line, name) => line.replace(/"[^"]*"/, () => `"${name.replaceAll('"', '""')}"`);

// The same print, each patch a little darker than the one before.
const press = sheetOf('press.txt', lines.map((line, i) => line.split('\t').map((cell, column) =>
  (column < 4 ? cell : (Number(cell) * (1 - i / 200)).toFixed(3))).join('\t')));
const hostile = ['<script>window.taken = 1</script>', '</script><img src=x onerror=taken=1>',
  '<!-- <b>', '&amp; \'quoted\' ""', '🎨 שלום ‮abc', '__proto__'];
const strange = sheetOf('strange.txt', lines.map((line, i) => renamed(line, hostile[i] ?? `P ${i}`)));
const long = sheetOf('long.txt', Array.from({ length: 120 }, (_, i) =>
  renamed(lines[i % 31], `Patch ${i + 1}`).replace(/^\d+/, String(i + 1))));

const commands = {
  report: ['report', example],
  sheets: ['report', example, press],
  compare: ['compare', example, press, '--tolerance', '2', '--formula', 'de2000,cmc'],
  predict: ['predict', example],
  ink: ['ink', example, '--patch', 'Magenta 100', '--against', 'Magenta 90'],
  list: ['list', 'illuminants'],
  strange: ['report', strange],
};

const rowsOf = (page) => page.$$eval('.patches', ([patches]) =>
  [...patches.querySelectorAll('tbody tr')].map((row) => Object.fromEntries(
    [...row.cells].map((cell, i) =>
      [patches.querySelectorAll('thead th')[i].textContent, cell.textContent]))));
const shown = (value, decimals = 2) => (value === null ? '–' : value.toFixed(decimals));
const figuresOf = (page) => page.$$eval('.figures > div', (all) =>
  all.map((one) => one.innerText.replace(/\s+/g, ' ')));

for (const [name, words] of Object.entries(commands))
  for (const [size, scheme] of [[wide, 'light'], [small, 'dark']])
    test(`${name} at ${size.width}: no error, no request, nothing overlaps`, async () => {
      const page = await open(words, size, scheme);
      assert.deepEqual(await page.evaluate(faultsOfLayout), []);
      await page.emulateMedia({ media: 'print' });
      assert.equal(await page.evaluate(() => getComputedStyle(document.body).backgroundColor),
        'rgb(255, 255, 255)');
      for (const label of await page.$$eval('.plot svg', (all) =>
        all.map((svg) => `${svg.getAttribute('role')} ${svg.getAttribute('aria-label')}`)))
        assert.match(label, /^img .{20}/);
      assert.deepEqual(page.complaints, []);
      await page.close();
    });

test('the numbers of a report are those of its JSON', async () => {
  const page = await open(commands.report);
  const [sheet] = json(commands.report).sheets;
  const rows = await rowsOf(page);
  assert.equal(rows.length, sheet.patches.length);
  sheet.patches.forEach((patch, i) => assert.deepEqual(rows[i], {
    Patch: patch.name, Id: patch.id, M: shown(patch.device.CMYK_M, 0),
    Y: shown(patch.device.CMYK_Y, 0), 'L*': shown(patch.lab[0]), 'a*': shown(patch.lab[1]),
    'b*': shown(patch.lab[2]), 'C*': shown(patch.lch[1]), h: shown(patch.lch[2]),
    'ΔE00': shown(patch.de00_to_paper), 'Resp.': patch.response, D: shown(patch.density, 3),
    Area: shown(patch.dot_area), Gain: shown(patch.dot_gain), Contrast: shown(patch.print_contrast),
    'Hue err.': shown(patch.hue_error), Grayness: shown(patch.grayness), Trap: shown(patch.trap),
  }));
  const { paper } = sheet;
  const figures = await figuresOf(page);
  const gain = Math.max(...sheet.patches.map((patch) => patch.dot_gain));
  assert.equal(figures[0], `Paper L*a*b* ${paper.lab.map((v) => shown(v)).join(' ')} ${paper.name}`);
  assert.ok(figures.includes(`Whiteness ${shown(paper.whiteness)} ASTM E313`), figures);
  assert.ok(figures.some((one) => one.startsWith(`Largest gain ${shown(gain)} `)), figures);

  // Every band of the spectra and every tone value, in the tables behind the pictures.
  const [spectra, tones] = await page.$$eval('figure details', (all) => all.map((details) =>
    [...details.querySelectorAll('tbody tr')].map((row) => row.textContent)));
  assert.deepEqual(tones, sheet.tone_values.flatMap(({ solid, values }) => values.map((value) =>
    `${solid}${value.nominal}${shown(value.dot_area)}${shown(value.dot_gain)}`)));
  const solid = sheet.patches.find((patch) => patch.name === 'Yellow 100');
  spectra.forEach((row, i) => assert.equal(row,
    `${400 + 10 * i}${[sheet.patches[0], sheet.patches[10], solid].map((p) => shown(p.refl[i])).join('')}`));
  await page.close();
});

test('a comparison opens with its verdict and shows its pairs', async () => {
  for (const [tolerance, verdict] of [['2', 'Failed'], ['90', 'Passed'], [null, 'No tolerance']]) {
    const words = ['compare', example, press, ...(tolerance ? ['--tolerance', tolerance] : [])];
    const page = await open(words);
    const result = json(words);
    const { mean, p95, max, max_patch: worst } = result.statistics.de2000;
    const stated = await page.innerText('.verdict');
    assert.match(stated, new RegExp(`^${verdict}`));
    assert.ok(stated.includes(`${shown(max)}, at ${worst}`), stated);
    assert.deepEqual(await figuresOf(page), [`ΔE00 mean ${shown(mean)}`,
      `95th percentile ${shown(p95)}`, `Largest ${shown(max)} ${worst}`]);
    const rows = await rowsOf(page);
    result.pairs.forEach((pair, i) => {
      assert.equal(rows[i]['ΔE00'], shown(pair.de2000));
      assert.equal(rows[i]['b* sample'], shown(pair.sample.lab[2]));
      assert.equal(rows[i].Difference, pair.verbal || '');
    });
    await page.close();
  }
});

test('a histogram counts every patch', async () => {
  const same = ['compare', example, example];
  for (const words of [commands.report, commands.compare, same]) {
    const page = await open(words);
    const counted = await page.$$eval('.plot svg:has([aria-label=rect])', ([svg]) => {
      const ticks = [...svg.querySelectorAll('[aria-label="y-axis tick label"] text')]
        .filter((tick) => tick.textContent);
      const [low, high] = [ticks[0], ticks.at(-1)].map((tick) =>
        ({ count: Number(tick.textContent), y: tick.getBoundingClientRect().y }));
      return [...svg.querySelectorAll('[aria-label=rect] rect')]
        .reduce((sum, bar) => sum + bar.getBoundingClientRect().height, 0) *
        (high.count - low.count) / (low.y - high.y);
    });
    assert.equal(Math.round(counted), lines.length);
    await page.close();
  }
});

test('predictions show both models and the measurement', async () => {
  const page = await open(commands.predict);
  const rows = await rowsOf(page);
  json(commands.predict).predictions.forEach((one, i) => {
    assert.equal(rows[i]['L* halftone'], shown(one.halftone.lab[0]));
    assert.equal(rows[i]['ΔE00 film'], shown(one.film.de00_to_measured));
    assert.equal(rows[i]['b* measured'], shown(one.measured.lab[2]));
  });
  await page.close();
});

test('one patch is shown under every status and illuminant', async () => {
  const page = await open(commands.ink);
  const { patch, against, statuses, illuminants } = json(commands.ink);
  const tables = await page.$$eval('main > .scroll', (all) => all.map((one) =>
    [...one.querySelectorAll('tbody tr')].map((row) => [...row.cells].map((c) => c.textContent))));
  assert.deepEqual(tables[0].map((row) => row.slice(0, 3)),
    statuses.map((one) => [one.status, one.response, shown(one.density, 3)]));
  assert.deepEqual(tables[1].map((row) => row.slice(0, 4).concat(row[6])), illuminants.map((one) =>
    [one.illuminant, ...one.lab.map((v) => shown(v)), shown(one.de00)]));
  const figures = await figuresOf(page);
  assert.ok(figures.includes(`ΔE00 ${shown(against.de00)} to ${against.name}`), figures);
  assert.ok(figures[0].startsWith(`L*a*b* ${patch.lab.map((v) => shown(v)).join(' ')} `), figures);
  await page.close();
});

test('rows are sorted, searched, paged, and all printed', async () => {
  const page = await open(['report', long]);
  const { patches } = json(['report', long]).sheets[0];
  const column = async (name) => (await rowsOf(page)).map((row) => row[name]);
  const head = (name) => page.getByRole('button', { name, exact: true });
  assert.deepEqual(await column('Patch'), patches.slice(0, 50).map((patch) => patch.name));
  await page.getByRole('button', { name: 'Next' }).click();
  assert.equal((await column('Patch'))[0], 'Patch 51');

  const gains = patches.map((patch) => patch.dot_gain).filter((gain) => gain !== null);
  await head('Gain').click(); // goes back to the first page
  assert.deepEqual(await column('Gain'), gains.sort((a, b) => a - b).slice(0, 50).map((g) => shown(g)));
  await head('Gain').press('Enter');
  assert.deepEqual(await column('Gain'), gains.reverse().slice(0, 50).map((g) => shown(g)));
  assert.equal(await page.locator('[aria-sort=descending]').innerText(), 'Gain');
  await head('Patch').click();
  assert.deepEqual((await column('Patch')).slice(8, 11), ['Patch 9', 'Patch 10', 'Patch 11']);

  await page.getByRole('searchbox').fill(' pATCH 11');
  assert.deepEqual(await column('Patch'), [11, 110, 111, 112, 113, 114, 115, 116, 117, 118, 119]
    .map((i) => `Patch ${i}`));
  assert.equal(await page.innerText('.count'), '11 patches found among 120');
  await page.getByRole('searchbox').fill('nothing');
  assert.deepEqual(await rowsOf(page), []);

  await page.getByRole('searchbox').fill('');
  await page.evaluate(() => dispatchEvent(new Event('beforeprint')));
  assert.equal((await rowsOf(page)).length, 120);
  await page.evaluate(() => dispatchEvent(new Event('afterprint')));
  assert.equal((await rowsOf(page)).length, 50);
  assert.deepEqual(page.complaints, []);
  await page.close();
});

test('a chosen patch joins the spectra', async () => {
  const page = await open(commands.report);
  const legend = () => page.locator('.legend').first().locator('bdi').allInnerTexts();
  assert.deepEqual(await legend(), ['Paper', 'Magenta 100', 'Yellow 100']);
  const button = page.getByRole('button', { name: 'Yellow 40', exact: true });
  await button.click();
  assert.deepEqual(await legend(), ['Paper', 'Magenta 100', 'Yellow 100', 'Yellow 40']);
  assert.equal(await button.getAttribute('aria-pressed'), 'true');
  await button.click();
  assert.equal((await legend()).length, 3);
  await page.close();
});

test('each ink of a sheet that names one a patch has its solid and its column', async () => {
  const bands = Array.from({ length: 31 }, (_, i) => 400 + 10 * i);
  const row = (ink, tint, refl) => [ink, tint, ...bands.map((nm) => (nm > 550 ? refl : 80))].join();
  const page = await open(['report', file('spots.csv', [['ink', 'tint', ...bands].join(),
    row('Paper', 0, 80), row('Gold', 7.1, 70), row('Gold', 100, 20), row('Jade', 100, 9)].join('\n'))]);
  assert.deepEqual(await page.locator('.legend').first().locator('bdi').allInnerTexts(),
    ['Paper', 'Gold 100', 'Jade 100']);
  assert.deepEqual((await rowsOf(page)).map(({ Gold, Jade }) => [Gold, Jade]),
    [['0.0', '–'], ['7.1', '–'], ['100.0', '–'], ['–', '100']]);
  await page.close();
});

test('names from the file are text', async () => {
  const page = await open(commands.strange);
  const names = json(commands.strange).sheets[0].patches.map((patch) => patch.name);
  assert.equal(names[0], hostile[0]);
  assert.deepEqual((await rowsOf(page)).map((row) => row.Patch), names);
  assert.equal(await page.evaluate(() => window.taken), undefined);
  assert.equal(await page.locator('img, b').count(), 0);
  await page.close();
});
