// The page of --format html in a real browser. A file in cases/ holds commands, each with all that
// its page says, or what the elements of "$ COMMAND @ SELECTOR" say; RENEW=1 writes the files anew.

import assert from 'node:assert/strict';
import { readFileSync, readdirSync, writeFileSync } from 'node:fs';
import { after, test } from 'node:test';
import { end, open, small, wide } from './browser.mjs';
import { faultsOfLayout } from './layout.mjs';
import { pointAtMarks, textOfPage } from './text.mjs';

after(end);

const folder = new URL('cases/', import.meta.url);
for (const name of readdirSync(folder)) {
  const file = new URL(name, folder);
  const written = [];
  const blocks = readFileSync(file, 'utf8').split(/^\$ /m).slice(1);
  for (const block of blocks) {
    const [first] = block.split('\n');
    const [command, selector = '#page'] = first.split(' @ ');
    test(first, async () => {
      const page = await open(command);
      await page.evaluate(pointAtMarks);
      const said = `${first}\n${await page.evaluate(textOfPage, selector)}\n`;
      written.push(`$ ${said}`);
      assert.deepEqual(page.complaints, []);
      await page.close();
      if (!process.env.RENEW) assert.equal(said.trim(), block.trim());
      else if (written.length === blocks.length) writeFileSync(file, written.join('\n'));
    });
    if (selector !== '#page') continue;
    for (const [size, scheme] of [[wide, 'light'], [small, 'dark']])
      test(`${first} at ${size.width}: nothing overlaps, pictures have words`, async () => {
        const page = await open(command, size, scheme);
        assert.deepEqual(await page.evaluate(faultsOfLayout), []);
        for (const label of await page.$$eval('.plot svg', (all) =>
          all.map((svg) => `${svg.getAttribute('role')} ${svg.getAttribute('aria-label')}`)))
          assert.match(label, /^img .{20}/);
        await page.emulateMedia({ media: 'print' });
        assert.equal(await page.evaluate(() => getComputedStyle(document.body).backgroundColor),
          'rgb(255, 255, 255)');
        await page.close();
      });
  }
}

test('a click on a sheet of a run shows its zones, of which one is lost', async () => {
  const page = await open('python3 make_run.py run; vantrel run run/sheet_*.txt --aims run/aims.txt');
  const profile = page.locator('figure', { hasText: 'Ink-zone profile' });
  assert.equal(await profile.locator('[aria-label=bar] rect').count(), 4 * 6);
  await page.locator('.sheets button').nth(7).click();
  assert.match(await profile.innerText(), /sheet 8, run\/sheet_08\.txt/);
  assert.equal(await profile.locator('[aria-label=bar] rect').count(), 4 * 5);
  await page.close();
});

test('thirty sheets of 32 readings print on two sheets of A4, with the table of all values', async () => {
  const page = await open(`sed 's/range(1, 11)/range(1, 31)/;s/{"C": 50}, /&{"C": 25}, /' make_run.py > thirty.py
    python3 thirty.py thirty; vantrel run thirty/sheet_*.txt --aims thirty/aims.txt --tolerances run.toml`);
  const pdf = (await page.pdf({ preferCSSPageSize: true })).toString('latin1');
  const sizes = [...pdf.matchAll(/\/MediaBox *\[ *0 0 ([\d.]+) ([\d.]+)/g)].map((box) =>
    box.slice(1).map((points) => Math.round(points * 25.4 / 72)));
  assert.deepEqual(sizes, [[210, 297], [297, 210]]);
  await page.emulateMedia({ media: 'print' });
  await page.setViewportSize({ width: Math.floor((297 - 16) / 25.4 * 96), height: 900 });
  await page.evaluate(() => dispatchEvent(new Event('beforeprint')));
  const table = page.locator('.patches table');
  assert.deepEqual([await table.locator('tbody tr').count(), await table.locator('thead th').count()], [32, 31]);
  const [wide, held] = await table.evaluate((all) => [all.scrollWidth, all.parentElement.clientWidth]);
  assert.ok(wide <= held, `${wide} of ${held}`);
  await page.close();
});

test('rows are sorted, searched, paged, and all printed', async () => {
  // 120 patches in the order of 1, 38, 75, …, 120: no two of the same darkness.
  const page = await open(`(echo name,tint,ink,$(seq -s, 400 10 700); i=0; while [ $i -lt 121 ]; do
    n=$((i * 37 % 121)); i=$((i + 1)); r=$(seq -s, $((90 * 121 - 80 * n)) -1 $((90 * 121 - 80 * n - 30)));
    echo "Patch $n,$((n * 100 / 120)),Grey,$r"; done) > long.csv; vantrel report long.csv`);
  const column = (name) => page.$$eval('.patches', ([patches], wanted) => {
    const at = [...patches.querySelectorAll('thead th')].findIndex((th) => th.textContent === wanted);
    return [...patches.querySelectorAll('tbody tr')].map((row) => row.cells[at].textContent);
  }, name);
  const patches = (...numbers) => numbers.map((n) => `Patch ${n}`);
  const head = (name) => page.getByRole('button', { name, exact: true });
  const search = (text) => page.getByRole('searchbox').fill(text);
  const starts = async (wanted) =>
    assert.deepEqual((await column('Patch')).slice(0, wanted.length), wanted);
  await starts(patches(0, 37, 74, 111, 27));
  await page.getByRole('button', { name: 'Next' }).click();
  await starts(patches(50 * 37 % 121, 51 * 37 % 121));
  await page.getByRole('button', { name: 'Next' }).click();
  assert.equal(await page.innerText('.count'), '101–121 of 121 patches');
  await head('Area').click(); // back to the first page; patches of no area come last
  const rising = (await column('Area')).map(Number);
  assert.deepEqual(rising, [...rising].sort((a, b) => a - b));
  await head('Area').press('Enter');
  const falling = (await column('Area')).map(Number);
  assert.deepEqual(falling, [...falling].sort((a, b) => b - a));
  assert.ok(falling.at(-1) > rising[0], falling);
  assert.equal(await page.locator('[aria-sort=descending]').innerText(), 'Area');
  await head('Patch').click();
  await starts(patches(...Array(50).keys()));
  await search(' pATCH 11');
  assert.deepEqual(await column('Patch'), patches(11, 110, 111, 112, 113, 114, 115, 116, 117, 118, 119));
  assert.equal(await page.innerText('.count'), '11 patches found among 121');
  assert.ok(await page.locator('.pager').isHidden());
  await search('nothing');
  assert.deepEqual(await column('Patch'), []);
  await search('');
  for (const [event, rows] of [['beforeprint', 121], ['afterprint', 50]]) {
    await page.evaluate((name) => dispatchEvent(new Event(name)), event);
    assert.equal((await column('Patch')).length, rows);
  }
  assert.deepEqual(page.complaints, []);
  await page.close();
});

test('swatches are spread over all of many patches', async () => {
  const page = await open('(echo name,$(seq -s, 400 10 700); seq 3000 | sed "s/$/,$(seq -s, 31)/") ' +
    '> many.csv; vantrel report many.csv');
  assert.equal(await page.locator('.mosaic .swatch').last().getAttribute('title'), '2999');
  await page.close();
});

test('a chosen patch joins the spectra', async () => {
  const page = await open('vantrel report two_ink_halftone.txt');
  const legend = () => page.locator('.legend').first().locator('bdi').allInnerTexts();
  const solids = ['Paper', 'Magenta 100', 'Yellow 100'];
  const button = page.getByRole('button', { name: 'Yellow 40', exact: true });
  for (const [pressed, shown] of [['true', [...solids, 'Yellow 40']], ['false', solids]]) {
    await button.click();
    assert.equal(await button.getAttribute('aria-pressed'), pressed);
    assert.deepEqual(await legend(), shown);
  }
  await page.close();
});

test('a page of very many patches holds a choice and says so', async () => {
  // Half as many again as a page holds, alike but for one dark patch.
  const sheet = (name, dark) => `seq 75000 | awk 'BEGIN { printf "name"; for (n = 400; n <= 700; n += 10)
    printf ",%d", n; print "" } { printf "Patch %d", $1; for (n = 0; n < 31; ++n)
    printf ",%.3f", $1 == 40001 ? ${dark} + n / 9 : 70 + $1 / 7e3 + n / 9; print "" }' > ${name}`;
  const report = await open(`${sheet('many.csv', 4)}; vantrel report many.csv`);
  const about = (page) => page.locator('header').first().innerText();
  assert.match(await about(report), /^many.csv\s+75,000 patches .*The page holds 50,000 of 75,000 patches: all \d+ that are the paper, .* and an even choice of the others\..*--format csv gives all/s);
  const compare = await open(`${sheet('other.csv', 9)}; vantrel compare many.csv other.csv --tolerance 1`);
  assert.match(await about(compare), /75,000 patches .*The page holds 50,000 of 75,000 patches: all \d+ that are the paper, the largest of a formula or above ΔE00 1, and/s);
  assert.match(await compare.innerText('.verdict'), /1 of 75000 pairs are above .*at Patch 40001/);
  for (const page of [report, compare]) {
    await page.getByRole('searchbox').fill('40001');
    assert.equal(await page.innerText('.count'), '1 patch found among 50,000');
    // two thirds of 200, 2000 to 2009 and 20000 to 20099
    await page.getByRole('searchbox').fill('Patch 200');
    const [, found] = /of (\d+) patches found/.exec(await page.innerText('.count'));
    assert.ok(found >= 70 && found <= 78, found);
    assert.deepEqual(page.complaints, []);
    await page.close();
  }
});
