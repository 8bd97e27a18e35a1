// A command's result as the elements of a page.

import { comparePage } from './compare.js';
import { inkPage } from './ink.js';
import { listPage } from './list.js';
import { predictPage } from './predict.js';
import { reportPage } from './report.js';
import { runPage } from './run.js';

// Puts the result in place of what an element holds, and gives its title.
export function show(result, place) {
  const pages = {
    report: [reportPage, () => result.sheets.map((sheet) => sheet.file).join(', ')],
    compare: [comparePage, () => `${result.sample.file} against ${result.reference.file}`],
    predict: [predictPage, () => `${result.file}, predicted`],
    run: [runPage, () => `Press run of ${result.sheets.length} sheets`],
    ink: [inkPage, () => `${result.patch.name}, ${result.file}`],
    list: [listPage, () => result.list],
  };
  const [page, title] = pages[result.command];
  place.replaceChildren(...[page(result)].flat(Infinity).filter(Boolean));
  return title();
}
