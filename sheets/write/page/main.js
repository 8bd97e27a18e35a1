// Shows the document that the page holds.

import { h } from './dom.js';
import { show } from './show.js';

const data = document.getElementById('data');
const result = JSON.parse(data.textContent);
data.remove(); // a large one is not held twice
const page = document.getElementById('page');
document.title = show(result, page);
page.append(h('footer', {},
  'Made by Vantrel. All numbers are in this file; it asks nothing of any network.'));
