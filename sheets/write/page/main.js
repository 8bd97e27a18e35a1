// Shows the document that the page holds.

import { comparePage } from './compare.js';
import { h } from './dom.js';
import { inkPage } from './ink.js';
import { listPage } from './list.js';
import { predictPage } from './predict.js';
import { reportPage } from './report.js';

const data = document.getElementById('data');
const result = JSON.parse(data.textContent);
data.remove(); // a large one is not held twice

const pages = {
  report: [reportPage, () => result.sheets.map((sheet) => sheet.file).join(', ')],
  compare: [comparePage, () => `${result.sample.file} against ${result.reference.file}`],
  predict: [predictPage, () => `${result.file}, predicted`],
  ink: [inkPage, () => `${result.patch.name}, ${result.file}`],
  list: [listPage, () => result.list],
};
const [show, title] = pages[result.command];
document.title = title();
document.getElementById('page').append(
  ...[show(result)].flat(Infinity).filter(Boolean),
  h('footer', {}, 'Made by Vantrel. All numbers are in this file; it asks nothing of any network.'));
