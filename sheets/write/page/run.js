// vantrel run: the verdict on a press run, what drifts, what to change.

import { picture, seriesPlot, zonesPlot } from './charts.js';
import { limitsTable } from './compare.js';
import { advice, count, fixed, h, inkColours, named, smallTable, warnings } from './dom.js';
import { searchTable } from './table.js';

const colourOf = (series) => inkColours[series.subject] ?? '#777777';
const charted = ['density', 'tone_value', 'solid', 'delta_ch', 'delta_l', 'neutral', 'paper',
  'mean_de00'];

function verdict({ verdict: word, says, findings }) {
  const [, first, rest] = says.match(/^(.*?)[:,] (.*)$/s);
  return h('div', { class: `verdict ${word ?? ''}` },
    h('p', { class: 'word' }, word ? `${first[0].toUpperCase()}${first.slice(1)}` : 'No verdict'),
    h('p', {}, `${rest[0].toUpperCase()}${rest.slice(1)}.`),
    h('ul', {}, findings.map((text) => h('li', {}, named(text)))));
}

function limitsOf({ low, high, decimals }) {
  if (high === null) return '';
  return low === null ? `up to ${fixed(high, decimals)}`
    : `${fixed(low, decimals)} to ${fixed(high, decimals)}`;
}

// In words, for those who do not see the chart.
function says(series) {
  const end = [...series.values].reverse().find((value) => value !== null);
  const slope = series.slope === null ? '' : `, ${fixed(series.slope, series.decimals + 1)} ± ` +
    `${fixed(series.slope_uncertainty, series.decimals + 1)} a sheet`;
  return `${fixed(end, series.decimals)} last${slope}`;
}

function charts(result) {
  const shown = charted.flatMap((attribute) =>
    result.series.filter((series) => series.attribute === attribute));
  return h('section', {},
    h('p', { class: 'note' }, 'Over the sheets: the mean of the zones, their range, the limits.'),
    h('div', { class: 'strip' }, shown.map((series) =>
      picture(series.title, seriesPlot(series, colourOf(series)), () => says(series)).element)));
}

// The densities over the zones of one sheet, which a click chooses.
function profile(result) {
  const densities = result.series.filter(({ attribute, zones }) => attribute === 'density' &&
    zones.some((sheet) => sheet && Object.keys(sheet).length > 1));
  if (!densities.length) return null;
  let sheet = result.sheets.length - 1;
  const curves = () => densities.filter((series) => series.zones[sheet]).map((series) =>
    ({ name: series.subject, colour: colourOf(series), zones: series.zones[sheet],
      value: series.values[sheet] }));
  const plot = picture('Ink-zone profile', (...frame) => zonesPlot(curves())(...frame),
    () => `sheet ${sheet + 1}, ${result.sheets[sheet].file}: density less that of the sheet`);
  const buttons = result.sheets.map(({ file }, i) => h('button', { type: 'button',
    class: 'choose', title: file, 'aria-pressed': String(i === sheet), onclick: () => {
      sheet = i;
      buttons.forEach((button, k) => button.setAttribute('aria-pressed', String(k === sheet)));
      plot.draw();
    } }, String(i + 1)));
  return h('section', {}, h('nav', { class: 'sheets', 'aria-label': 'Sheets' }, 'Sheet ', buttons),
    plot.element);
}

const statistics = (result) => smallTable('Readings over the sheets', [
  { label: 'Reading', text: ({ title }) => named(title) },
  { label: 'Limits', number: true, text: limitsOf },
  ...[['Aim', 'aim', 0], ['Mean', 'mean', 0], ['SD', 'deviation', 0], ['Slope', 'slope', 1],
    ['±', 'slope_uncertainty', 1]].map(([label, field, more]) => ({ label, number: true,
    text: (series) => fixed(series[field], series.decimals + more) })),
  { label: 'Left at', number: true, text: (series) => series.first_outside ?? '' },
  { label: 'Will leave at', number: true, text: (series) => series.leaves_at ?? '' },
], result.series);

export function runPage(result) {
  const about = [count(result.sheets.length, 'sheet'), result.job, result.instrument,
    result.condition, result.illuminant, result.status,
    result.by_date ? `${result.sheets[0].created} to ${result.sheets.at(-1).created}`
      : result.sheets.length === 1 ? result.sheets[0].created : '',
    `aims ${result.aims}`];
  return h('div', { class: 'sheet run' },
    h('header', {}, h('h1', {}, 'Press run'),
      h('p', { class: 'about' }, named(about.filter(Boolean).join(' · ')))),
    verdict(result),
    warnings(result.warnings),
    charts(result),
    profile(result),
    limitsTable(`Limits: ${result.tolerances}, on the sheet that is farthest from each`,
      result.limits),
    advice('Solids of the last sheet', result),
    h('div', { class: 'values' }, statistics(result), searchTable({
      caption: 'All values',
      noun: 'reading',
      columns: [
        { label: 'Reading', value: ({ title }) => title },
        ...result.sheets.map(({ file, created }, i) => ({ label: String(i + 1),
          decimals: ({ decimals }) => decimals, title: `${file} ${created}`,
          value: ({ values }) => values[i] })),
      ],
      rows: result.series,
      colour: colourOf,
      text: ({ title, attribute }) => `${title} ${attribute}`,
    })));
}
