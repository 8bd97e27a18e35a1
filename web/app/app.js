// The application: files in, what `--format html` shows out.

import { h, named } from '../../sheets/write/page/dom.js';
import { show } from '../../sheets/write/page/show.js';
import { inWords, texts } from './texts.js';

const worker = new Worker(URL.createObjectURL(new Blob([WORKER], { type: 'text/javascript' })));
const waiting = new Map();
let last = 0;

const status = h('p', { role: 'status' });
const progress = h('progress', { max: '1', value: '0', hidden: true, 'aria-label': texts.calculating });
const complaints = h('ul', { class: 'complaints', role: 'alert' });
const say = (text) => { status.textContent = text; };
const complain = (text) => complaints.append(h('li', {}, named(inWords(text))));

function ask(message, transfer = []) {
  const id = ++last;
  worker.postMessage({ id, options: {}, ...message }, transfer);
  return new Promise((resolve, reject) => { waiting.set(id, { resolve, reject }); });
}
worker.onmessage = ({ data: { id, value, error, what, share } }) => {
  if (what) {
    progress.hidden = false;
    progress.value = share;
    say(texts.working(what, share));
    return;
  }
  progress.hidden = true;
  const { resolve, reject } = waiting.get(id);
  waiting.delete(id);
  if (error === undefined) resolve(value);
  else reject(new Error(error));
};
worker.onerror = (event) => complain(event.message);

const sheets = new Map(); // by their key in the worker: { source, file, patches, warnings }
const refused = new Map(); // by the same: { source, reason }
const limits = new Map(); // texts of TOML, by name
const list = h('ul', { class: 'files', 'aria-label': texts.files });
const result = h('div', { id: 'result', tabindex: '-1' });

const field = (label, input) => h('label', {}, h('span', {}, label), input);
const choice = (values, chosen, empty = texts.asStated) => h('select', {}, values.map((value) =>
  h('option', { value, selected: value === chosen }, value || empty)));
const text = () => h('input', { type: 'text' });
const illuminant = choice(['', ...ILLUMINANTS], '');
const densities = choice(STATUSES, 'E_STATUS');
const pair = choice(['auto', 'name', 'id', 'device', 'order'], 'auto');
const [paper, inks, tolerance] = [text(), text(), text()];
tolerance.inputMode = 'decimal';
const flags = Object.entries(texts.flags).map(([name, label]) =>
  ({ name, label, input: h('input', { type: 'checkbox' }) }));
const scale = choice(['auto', 'percent', 'fraction'], 'auto');
const condition = choice(['', 'M0', 'M1', 'M2', 'M3'], '', texts.whichever);
for (const select of [scale, condition]) select.addEventListener('change', () => reread());
const [reference, sample, tolerances] = [h('select'), h('select'), h('select')];
const table = h('textarea', { rows: '3', spellcheck: 'false' });
const format = h('select', { 'aria-label': texts.save }, Object.entries(texts.formats)
  .map(([value, label]) => h('option', { value }, label)));
const button = (label, onclick, disabled = false) =>
  h('button', { type: 'button', class: 'turn', disabled, onclick }, label);
const buttons = ['report', 'compare', 'run', 'predict'].map((call) =>
  button(texts[call], () => judge(call), true));
const save = button(texts.save, () => saveAs(), true);

// What the user chose stays.
const chosen = new Set();
for (const select of [reference, sample, tolerances])
  select.addEventListener('change', () => chosen.add(select));
function fill(select, entries, start) {
  const before = chosen.has(select) ? select.value : null;
  select.replaceChildren(...entries.map(([value, label]) => h('option', { value }, label)));
  const values = entries.map(([value]) => String(value));
  select.value = values.includes(before) ? before : values[start] ?? values[0] ?? '';
}

function showFiles() {
  const entry = (name, about, lines, close) => h('li', {}, named(name), ` · ${about}`,
    h('button', { type: 'button', class: 'turn', 'aria-label': texts.remove(name), onclick: () => {
      close();
      showFiles();
      (list.querySelector('button') ?? input).focus();
    } }, '×'),
    lines.length ? h('ul', {}, lines.map((line) => h('li', {}, named(inWords(line))))) : null);
  list.replaceChildren(
    ...[...sheets].map(([key, { file, patches, warnings }]) =>
      entry(file, texts.patches(patches), warnings, () => forget(key))),
    ...[...refused].map(([key, { source, reason }]) =>
      entry(source.name, texts.unread, [reason], () => refused.delete(key))),
    ...[...limits.keys()].map((name) => entry(name, texts.limits, [], () => limits.delete(name))));
  const names = [...sheets].map(([key, { file }]) => [key, file]);
  fill(reference, names, 0);
  fill(sample, names, 1);
  fill(tolerances, [['', texts.none], ...[...limits.keys()].map((name) => [name, name])], limits.size);
  const [report, compare, run, predict] = buttons;
  report.disabled = predict.disabled = sheets.size === 0;
  compare.disabled = run.disabled = sheets.size < 2;
}

// Away with a result that is not of these files and wishes.
let shown; // what it was asked for by
function clear() {
  shown = null;
  save.disabled = true;
  result.replaceChildren();
  document.title = texts.title;
}

function forget(key) {
  sheets.delete(key);
  ask({ call: 'close', keys: [key] });
  if (shown?.keys.includes(key)) clear();
}

async function read(key, source) {
  say(texts.reading(source.name));
  try {
    if (source.size > 2 ** 29) throw new Error(texts.tooLarge(source.name));
    const bytes = new Uint8Array(await source.arrayBuffer());
    const options = { scale: scale.value, condition: condition.value };
    const about = await ask({ call: 'open', keys: [key], name: source.name, bytes, options }, [bytes.buffer]);
    refused.delete(key);
    sheets.set(key, { source, ...about });
  } catch (error) {
    const reason = texts.refused(source.name, error.message);
    if (sheets.has(key)) forget(key);
    refused.set(key, { source, reason });
    complain(reason);
  }
  showFiles();
}

let opened = 0;
async function open(files) {
  complaints.replaceChildren();
  for (const file of files)
    if (/\.toml$/i.test(file.name)) {
      limits.set(file.name, await file.text());
      showFiles();
    } else {
      await read(++opened, file);
    }
  say(texts.done);
}

async function reread() {
  complaints.replaceChildren();
  clear();
  for (const [key, { source }] of [...sheets, ...refused]) await read(key, source);
  say(texts.done);
}

let pasted = 0;
function take(rows) {
  if (rows.trim() !== '') open([new File([rows], texts.pasted(++pasted))]);
}

// NAME:PERCENT, with commas between.
function inkTints() {
  return inks.value.split(',').map((wish) => wish.trim()).filter(Boolean).map((wish) => {
    const [, name, percent] = /^(.*):\s*(\d+)$/.exec(wish) ?? [];
    if (name === undefined) throw new Error(texts.noInk(wish));
    return [name.trim(), Number(percent)];
  });
}

// A decimal comma is one, and not left out.
function numberIn(input, label) {
  const wish = input.value.trim();
  if (wish === '') return null;
  if (!/^\d+([.,]\d+)?$/.test(wish)) throw new Error(texts.noNumber(label, wish));
  return Number(wish.replace(',', '.'));
}

function request(call) {
  const options = { illuminant: illuminant.value, status: densities.value, paper: paper.value };
  if (call === 'report') return [[...sheets.keys()], options];
  if (call === 'predict') return [[Number(sample.value)], { ...options, ink: inkTints() }];
  const aims = Number(reference.value);
  const limited = { ...options, tolerances: limits.get(tolerances.value) ?? '',
    tolerances_name: tolerances.value || 'tolerances' };
  if (call === 'run') return [[aims, ...[...sheets.keys()].filter((key) => key !== aims)],
    { ...limited, unread: [...refused.values()].map(({ reason }) => reason) }];
  return [[aims, Number(sample.value)], { ...limited, pair: pair.value,
    tolerance: numberIn(tolerance, texts.tolerance),
    ...Object.fromEntries(flags.map(({ name, input: { checked } }) => [name, checked])) }];
}

async function judge(call) {
  complaints.replaceChildren();
  say(texts.calculating);
  try {
    const [keys, options] = request(call);
    document.title = show(await ask({ call, keys, options: { ...options, format: 'page' } }), result);
    const walker = document.createTreeWalker(result, NodeFilter.SHOW_TEXT);
    while (walker.nextNode())
      if (walker.currentNode.data.includes('--'))
        walker.currentNode.data = inWords(walker.currentNode.data);
    shown = { call, keys, options };
    save.disabled = false;
    result.focus();
    say(texts.done);
  } catch (error) {
    clear();
    complain(error.message);
    say('');
  }
}

async function saveAs() {
  const { call, keys, options } = shown;
  const chosen = format.value;
  try {
    const written = await ask({ call, keys, options: { ...options, format: chosen } });
    const href = URL.createObjectURL(new Blob([written], { type: 'text/plain' }));
    const endings = { json: 'json', csv: 'csv', cgats: 'txt', table: 'txt' };
    h('a', { href, download: `${call}.${endings[chosen]}` }).click();
    setTimeout(() => URL.revokeObjectURL(href), 60000);
  } catch (error) {
    complain(error.message);
  }
}

const input = h('input', { type: 'file', multiple: true, onchange: () => open(input.files) });
document.title = texts.title;
document.getElementById('page').append(
  h('header', { class: 'open' }, h('h1', {}, texts.title), h('p', {}, texts.intro),
    field(texts.choose, input), field(texts.paste, table), button(texts.take, () => {
      take(table.value);
      table.value = '';
    }), list,
    h('div', { class: 'wishes' }, field(texts.illuminant, illuminant),
      field(texts.status, densities), field(texts.paper, paper), field(texts.aims, reference),
      field(texts.sheet, sample), field(texts.pair, pair), field(texts.tolerance, tolerance),
      field(texts.tolerances, tolerances), flags.map(({ label, input }) => field(label, input)),
      field(texts.inks, inks), field(texts.scale, scale), field(texts.condition, condition)),
    h('p', { class: 'wishes' }, buttons, format, save), progress, status, complaints),
  result);
showFiles();
for (const kind of ['dragover', 'drop'])
  document.addEventListener(kind, (event) => {
    event.preventDefault();
    if (kind !== 'drop') return;
    if (event.dataTransfer.files.length) open(event.dataTransfer.files);
    else take(event.dataTransfer.getData('text/plain')); // cells of a spreadsheet
  });
// From a server the page is kept for the time without one. A page of the disk is there anyway.
if (location.protocol !== 'file:') navigator.serviceWorker?.register('service_worker.js');
