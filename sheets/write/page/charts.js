// The pictures: SVG by Observable Plot, drawn again when their width changes.

import * as Plot from '@observablehq/plot';
import { colourOf, h, named, swatch } from './dom.js';

export const mostPoints = 2000;
const bands = Array.from({ length: 31 }, (_, i) => 400 + 10 * i);
const printWidths = { half: 330, sixth: 112 }; // of a sheet of paper
const drawn = new Set();
const self = (field) => ({ value: field, scale: null }); // colours that are the data's own

addEventListener('beforeprint', () => drawn.forEach((draw) => draw(true)));
addEventListener('afterprint', () => drawn.forEach((draw) => draw()));

// A picture with its title, what it says in words, and further elements. `plot(width, printed)`
// gives Plot's options, `label()` the words.
export function picture(title, plot, label, ...more) {
  const frame = h('div', { class: 'plot' });
  const words = h('span', { class: 'says' });
  let shown = 0;
  function draw(printed = false) {
    const width = !printed ? frame.clientWidth
      : frame.closest('.strip') ? printWidths.sixth : printWidths.half;
    if (!width) return;
    shown = width;
    const svg = Plot.plot({
      width, marginTop: 28, marginRight: 16, marginBottom: 36,
      style: { fontSize: !printed ? '12px' : width < 200 ? '6px' : '9px', fontFamily: 'inherit', background: 'none', overflow: 'visible' },
      ...plot(width, printed),
    });
    svg.setAttribute('role', 'img');
    svg.setAttribute('aria-label', `${title}. ${label()}`);
    frame.replaceChildren(svg);
    words.textContent = label();
  }
  drawn.add(draw);
  new ResizeObserver(() => {
    if (Math.abs(frame.clientWidth - shown) > 4) draw();
  }).observe(frame);
  const element = h('figure', {}, h('figcaption', {}, h('strong', {}, title), ' ', words), frame,
    ...more);
  return { element, draw: () => draw() };
}

export function legend(series) {
  return h('ul', { class: 'legend' }, series.map((one) =>
    h('li', { class: one.dashed ? 'dashed' : null }, swatch(one.colour), named(one.name))));
}

// A line in its own colour on an edge that sets it off from any ground.
const edged = (data, options, dashed) => [
  Plot.line(data, { ...options, stroke: 'currentColor', strokeWidth: 4, strokeOpacity: 0.45 }),
  Plot.line(data, { ...options, stroke: self('colour'), strokeWidth: 2.5,
    strokeDasharray: dashed ? '5 3' : null }),
];

// series: [{ name, colour, refl, dashed }, …]
export function spectraPlot(series) {
  const points = series.flatMap((one, z) => one.refl.map((refl, i) =>
    ({ z, name: one.name, colour: one.colour, dashed: one.dashed, nm: bands[i], refl })));
  const top = Math.max(100, ...points.map((point) => point.refl));
  const way = { x: 'nm', y: 'refl', z: 'z' };
  return (width) => ({
    height: Math.min(380, Math.max(260, width * 0.6)),
    x: { label: 'Wavelength (nm)', domain: [400, 700], tickFormat: 'd', ticks: width < 420 ? 4 : 7 },
    y: { label: 'Reflectance (%)', domain: [0, top], nice: true, grid: true },
    marks: [
      edged(points.filter((point) => !point.dashed), way, false),
      edged(points.filter((point) => point.dashed), way, true),
      Plot.tip(points, Plot.pointer({ ...way,
        title: (point) => `${point.name}\n${point.nm} nm: ${point.refl.toFixed(2)} %` })),
    ],
  });
}

// curves: [{ name, colour, weights }, …], signed, the largest 100
export function weightsPlot(curves) {
  const points = curves.flatMap(({ name, colour, weights }) =>
    weights.map((weight, i) => ({ name, colour, weight, nm: bands[i] })));
  const way = { x: 'nm', y: 'weight', z: 'name' };
  return (width) => ({
    height: Math.min(380, Math.max(260, width * 0.6)),
    x: { label: 'Wavelength (nm)', domain: [400, 700], tickFormat: 'd', ticks: width < 420 ? 4 : 7 },
    y: { label: 'Weight', domain: [-100, 100], grid: true },
    marks: [
      Plot.ruleY([0]),
      edged(points, way),
      Plot.tip(points, Plot.pointer({ ...way,
        title: (point) => `${point.name}\n${point.nm} nm: ${point.weight.toFixed(2)}` })),
    ],
  });
}

// curves: [{ name, colour, points: [{ nominal, area, gain }, …] }, …]; what: 'area' or 'gain'
export function tonePlot(curves, what) {
  const points = curves.flatMap((curve, z) =>
    curve.points.map((point) => ({ ...point, z, name: curve.name, colour: curve.colour,
      dashed: curve.dashed })));
  const top = what === 'area' ? 100 : 10;
  const way = { x: 'nominal', y: what, z: 'z' };
  return (width) => ({
    height: Math.min(340, Math.max(240, width * 0.6)),
    x: { label: 'Nominal tone value (%)', domain: [0, 100], ticks: 5 },
    y: { label: what === 'area' ? 'Dot area (%)' : 'Gain (points)', grid: true, nice: true,
      domain: [Math.min(0, ...points.map((point) => point[what])),
        Math.max(top, ...points.map((point) => point[what]))] },
    marks: [
      what === 'area'
        ? Plot.line([[0, 0], [100, 100]], { strokeDasharray: '3 3', strokeOpacity: 0.6 }) : null,
      edged(points.filter((point) => !point.dashed), way, false),
      edged(points.filter((point) => point.dashed), way, true),
      Plot.dot(points, { ...way, r: 3, fill: self('colour'), stroke: 'currentColor',
        strokeOpacity: 0.6 }),
      Plot.tip(points, Plot.pointer({ ...way, title: (point) =>
        `${point.name} ${point.nominal} %\nArea ${point.area.toFixed(2)} %, ` +
        `gain ${point.gain.toFixed(2)}` })),
    ],
  });
}

// curves: [{ name, colour, dashed, points: [{ nominal, value }, …] }, …]
export function scalePlot(curves, label) {
  const points = curves.flatMap((curve, z) => curve.points.map((point) => ({ ...point, z,
    name: curve.name, colour: curve.colour, dashed: curve.dashed })));
  const way = { x: 'nominal', y: 'value', z: 'z' };
  return (width) => ({
    height: Math.min(340, Math.max(240, width * 0.6)),
    x: { label: 'Nominal tone value (%)', domain: [0, 100], ticks: 5 },
    y: { label, grid: true, nice: true },
    marks: [
      Plot.ruleY([0]),
      edged(points.filter((point) => !point.dashed), way, false),
      edged(points.filter((point) => point.dashed), way, true),
      Plot.tip(points, Plot.pointer({ ...way, title: (point) =>
        `${point.name} ${point.nominal} %\n${point.value.toFixed(3)}` })),
    ],
  });
}

// points: [{ name, lab, reference, chosen }, …], `reference` another L*a*b* or nothing
export function planePlot(points, paper) {
  const place = (lab, { name }) => ({ a: lab[1], b: lab[2], name, lab, colour: colourOf({ lab }) });
  const measured = points.map((point) => ({ ...place(point.lab, point), chosen: point.chosen }));
  const aims = points.filter((point) => point.reference).map((point) => ({
    ...place(point.reference, point), to: point.lab }));
  const whites = paper ? [place(paper, { name: 'Paper' })] : [];
  const all = [...measured, ...aims, ...whites, { a: 0, b: 0 }];
  const range = (axis) => all.reduce(([low, high], point) =>
    [Math.min(low, point[axis]), Math.max(high, point[axis])], [0, 0]);
  const [a, b] = [range('a'), range('b')];
  const half = Math.max(a[1] - a[0], b[1] - b[0], 20) / 2 * 1.1;
  const around = ([low, high]) => [(low + high) / 2 - half, (low + high) / 2 + half];
  const many = points.length > 300;
  return (width) => {
    const side = Math.min(width, 480);
    return {
      width: side, height: side, marginLeft: 44, marginRight: 12,
      x: { label: 'a*', domain: around(a), grid: true, ticks: 6 },
      y: { label: 'b*', domain: around(b), grid: true, ticks: 6 },
      marks: [
        Plot.ruleX([0], { strokeOpacity: 0.5 }),
        Plot.ruleY([0], { strokeOpacity: 0.5 }),
        Plot.link(aims, { x1: 'a', y1: 'b', x2: (d) => d.to[1], y2: (d) => d.to[2],
          strokeOpacity: 0.6 }),
        Plot.dot(aims, { x: 'a', y: 'b', r: many ? 3 : 5, strokeWidth: 1.25 }),
        Plot.dot(measured, { x: 'a', y: 'b', r: many ? 2 : 4, fill: self('colour'),
          stroke: 'currentColor', strokeWidth: 0.75, strokeOpacity: 0.6 }),
        Plot.dot(measured.filter((d) => d.chosen), { x: 'a', y: 'b', r: 8, strokeWidth: 2 }),
        Plot.dot(whites, { x: 'a', y: 'b', r: 6, symbol: 'diamond', strokeWidth: 1.5 }),
        Plot.tip([...measured, ...whites], Plot.pointer({ x: 'a', y: 'b', title: (d) =>
          `${d.name}\nL* ${d.lab[0].toFixed(2)}  a* ${d.a.toFixed(2)}  b* ${d.b.toFixed(2)}` })),
      ],
    };
  };
}

// 1, 2 or 5 times a power of ten.
function roundStep(least) {
  const power = 10 ** Math.floor(Math.log10(least));
  return power * ([1, 2, 5].find((times) => times * power >= least) ?? 10);
}

export function histogramPlot(values, label, limit) {
  const marked = limit === null || limit === undefined ? [] : [limit];
  const top = [...marked, ...values].reduce((a, b) => Math.max(a, b), 0.1);
  const step = roundStep(top / 20);
  const thresholds = Array.from({ length: Math.floor(top / step) + 2 }, (_, i) => i * step);
  return (width) => ({
    height: Math.min(340, Math.max(240, width * 0.6)),
    x: { label, domain: [0, thresholds.at(-1)], nice: true },
    y: { label: 'Patches', grid: true, ticks: 5, tickSize: 0,
      tickFormat: (value) => (Number.isInteger(value) ? value.toLocaleString('en') : '') },
    marks: [
      Plot.rectY(values, Plot.binX({ y: 'count' }, { x: (value) => value, thresholds,
        fill: 'currentColor', fillOpacity: 0.55, tip: true })),
      Plot.ruleY([0]),
      Plot.ruleX(marked, { stroke: 'var(--fail)', strokeWidth: 2 }),
      Plot.text(marked, { x: (value) => value, frameAnchor: 'top', dy: -12, fill: 'var(--fail)',
        textAnchor: limit > top / 2 ? 'end' : 'start', text: (value) => `Tolerance ${value}` }),
    ],
  });
}

// A reading over the sheets of a run: the value of each, the range of its zones, the limits.
export function seriesPlot({ values, lowest, highest, low, high, aim, decimals }, colour) {
  const points = values.map((value, i) => ({ sheet: i + 1, value, low: lowest[i],
    high: highest[i] })).filter(({ value }) => value !== null);
  const limits = [low, high].filter((limit) => limit !== null);
  return (width) => ({
    height: width < 200 ? 62 : 200, marginTop: width < 200 ? 4 : 8,
    marginBottom: width < 200 ? 12 : 20, marginLeft: width < 200 ? 24 : 40,
    marginRight: width < 200 ? 4 : 16,
    x: { label: null, domain: [0.5, values.length + 0.5], ticks: Math.min(values.length, 6),
      tickFormat: (sheet) => (Number.isInteger(sheet) ? sheet : '') },
    y: { label: null, nice: true, grid: true, ticks: 4 },
    marks: [
      Plot.areaY(points, { x: 'sheet', y1: 'low', y2: 'high', fill: colour, fillOpacity: 0.2 }),
      Plot.ruleY(limits, { stroke: 'var(--fail)', strokeDasharray: '4 3' }),
      aim === null ? null : Plot.ruleY([aim], { strokeOpacity: 0.5 }),
      Plot.line(points, { x: 'sheet', y: 'value', stroke: colour, strokeWidth: 2 }),
      Plot.dot(points, { x: 'sheet', y: 'value', r: 2.5, fill: colour }),
      Plot.tip(points, Plot.pointerX({ x: 'sheet', y: 'value', title: (point) =>
        `Sheet ${point.sheet}: ${point.value.toFixed(decimals)}\nzones ` +
        `${point.low.toFixed(decimals)} to ${point.high.toFixed(decimals)}` })),
    ],
  });
}

// curves: [{ name, colour, value, zones: { 1: density, … } }, …]
export function zonesPlot(curves) {
  const points = curves.flatMap(({ name, colour, value, zones }) => Object.entries(zones).map(
    ([zone, density]) => ({ name, colour, zone: Number(zone), density, off: density - value })));
  return (width, printed) => ({
    height: printed ? 90 : 200,
    fx: { label: 'Zone' }, x: { axis: null, domain: curves.map(({ name }) => name) },
    y: { label: 'ΔD', grid: true, nice: true },
    marks: [
      Plot.barY(points, { fx: 'zone', x: 'name', y: 'off', fill: self('colour'), tip: true,
        title: (point) => `${point.name}, zone ${point.zone}: ${point.density.toFixed(3)}` }),
      Plot.ruleY([0]),
    ],
  });
}
