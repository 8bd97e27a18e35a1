// The application: files in, what `--format html` shows out.

import { h, named } from '../../sheets/write/page/dom.js';
import { show } from '../../sheets/write/page/show.js';
import { texts } from './texts.js';

const worker = new Worker(URL.createObjectURL(new Blob([WORKER], { type: 'text/javascript' })));
const waiting = new Map();
let last = 0;

const status = h('p', { role: 'status' });
const progress = h('progress', { max: '1', value: '0', hidden: true, 'aria-label': texts.calculating });
const complaints = h('ul', { class: 'complaints', role: 'alert' });
const say = (text) => { status.textContent = text; };
const complain = (text) => complaints.append(h('li', {}, named(text)));

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
  if (error === undefined) resolve({ id, value });
  else reject(new Error(error));
};
worker.onerror = (event) => complain(event.message);

const sheets = new Map(); // by their key in the worker
const limits = new Map(); // texts of TOML, by name
const list = h('ul', { class: 'files', 'aria-label': texts.files });
const result = h('div', { id: 'result', tabindex: '-1' });

const field = (label, input) => h('label', {}, h('span', {}, label), input);
const choice = (values, chosen) => h('select', {}, values.map((value) =>
  h('option', { value, selected: value === chosen }, value || texts.asStated)));
const text = () => h('input', { type: 'text' });
const illuminant = choice(['', ...ILLUMINANTS], '');
const densities = choice(STATUSES, 'E_STATUS');
const pair = choice(['auto', 'name', 'id', 'device', 'order'], 'auto');
const [paper, inks] = [text(), text()];
const tolerance = h('input', { type: 'number', min: '0', step: 'any' });
const corrected = h('input', { type: 'checkbox' });
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
  const entry = (name, about, warnings, close) => h('li', {}, named(name), ' · ', about,
    button('×', close), warnings.length
      ? h('ul', {}, warnings.map((line) => h('li', {}, named(line)))) : null);
  list.replaceChildren(
    ...[...sheets].map(([key, { file, patches, warnings }]) =>
      entry(file, texts.patches(patches), warnings, () => {
        sheets.delete(key);
        ask({ call: 'close', keys: [key] });
        showFiles();
      })),
    ...[...limits.keys()].map((name) => entry(name, texts.limits, [], () => {
      limits.delete(name);
      showFiles();
    })));
  for (const closer of list.querySelectorAll('button'))
    closer.setAttribute('aria-label', texts.remove(closer.parentNode.firstChild.textContent));
  const names = [...sheets].map(([key, { file }]) => [key, file]);
  fill(reference, names, 0);
  fill(sample, names, 1);
  fill(tolerances, [['', texts.none], ...[...limits.keys()].map((name) => [name, name])], limits.size);
  const [report, compare, run, predict] = buttons;
  report.disabled = predict.disabled = sheets.size === 0;
  compare.disabled = run.disabled = sheets.size < 2;
}

async function open(files) {
  complaints.replaceChildren();
  for (const file of files) {
    say(texts.reading(file.name));
    try {
      if (file.size > 2 ** 29) throw new Error(texts.tooLarge(file.name));
      if (/\.toml$/i.test(file.name)) {
        limits.set(file.name, await file.text());
      } else {
        const bytes = new Uint8Array(await file.arrayBuffer());
        const { id, value } = await ask({ call: 'open', name: file.name, bytes }, [bytes.buffer]);
        sheets.set(id, value);
      }
    } catch (error) {
      complain(texts.refused(file.name, error.message));
    }
    showFiles();
  }
  say(texts.done);
}

let pasted = 0;
function take() {
  if (table.value.trim() === '') return;
  open([new File([table.value], texts.pasted(++pasted))]);
  table.value = '';
}

// NAME:PERCENT, with commas between.
function inkTints() {
  return inks.value.split(',').map((wish) => wish.trim()).filter(Boolean).map((wish) => {
    const [, name, percent] = /^(.*):\s*(\d+)$/.exec(wish) ?? [];
    if (name === undefined) throw new Error(texts.noInk(wish));
    return [name.trim(), Number(percent)];
  });
}

function request(call) {
  const options = { illuminant: illuminant.value, status: densities.value, paper: paper.value };
  if (call === 'report') return [[...sheets.keys()], options];
  if (call === 'predict') return [[Number(sample.value)], { ...options, ink: inkTints() }];
  const aims = Number(reference.value);
  const limited = { ...options, tolerances: limits.get(tolerances.value) ?? '',
    tolerances_name: tolerances.value || 'tolerances' };
  if (call === 'run') return [[aims, ...[...sheets.keys()].filter((key) => key !== aims)], limited];
  return [[aims, Number(sample.value)], { ...limited, pair: pair.value,
    tolerance: tolerance.value === '' ? null : Number(tolerance.value),
    substrate_corrected: corrected.checked }];
}

let shown; // what is shown was asked for by this
async function judge(call) {
  complaints.replaceChildren();
  say(texts.calculating);
  try {
    const [keys, options] = request(call);
    const { value } = await ask({ call, keys, options: { ...options, format: 'page' } });
    document.title = show(value, result);
    shown = { call, keys, options };
    save.disabled = false;
    result.focus();
    say(texts.done);
  } catch (error) {
    complain(error.message);
    say('');
  }
}

async function saveAs() {
  const { call, keys, options } = shown;
  const chosen = format.value;
  try {
    const { value } = await ask({ call, keys, options: { ...options, format: chosen } });
    const written = chosen === 'json' ? `${JSON.stringify(value, null, 1)}\n` : value;
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
    field(texts.choose, input), field(texts.paste, table), button(texts.take, take), list,
    h('div', { class: 'wishes' }, field(texts.illuminant, illuminant),
      field(texts.status, densities), field(texts.paper, paper), field(texts.aims, reference),
      field(texts.sheet, sample), field(texts.pair, pair), field(texts.tolerance, tolerance),
      field(texts.tolerances, tolerances), field(texts.corrected, corrected),
      field(texts.inks, inks)),
    h('p', { class: 'wishes' }, buttons, format, save), progress, status, complaints),
  result);
showFiles();
for (const kind of ['dragover', 'drop'])
  document.addEventListener(kind, (event) => {
    event.preventDefault();
    if (kind === 'drop') open(event.dataTransfer.files);
  });

// From a server the page is kept for the time without one. A page of the disk is there anyway.
if (location.protocol !== 'file:') navigator.serviceWorker?.register('service_worker.js');
