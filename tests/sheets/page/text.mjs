// All that a page says, as lines of text. Runs in the browser.

// Points at the last mark of each picture, which then tells its numbers.
export function pointAtMarks() {
  for (const svg of document.querySelectorAll('.plot svg')) {
    const mark = [...svg.querySelectorAll('circle, rect, [aria-label=line] path')].at(-1);
    const { x, y } = mark.getPointAtLength(0).matrixTransform(mark.getScreenCTM());
    for (const kind of ['pointerenter', 'pointermove'])
      svg.dispatchEvent(new PointerEvent(kind,
        { clientX: x, clientY: y, pointerType: 'mouse', bubbles: true }));
  }
}

export function textOfPage(within) {
  const lines = [];
  const text = (element) => {
    const swatch = (one) => (one.style.getPropertyValue('--colour')
      ? `[${one.style.getPropertyValue('--colour')}] ` : '');
    const inside = [...element.childNodes].map((node) =>
      (node.nodeType === Node.TEXT_NODE ? node.data : text(node))).join('');
    const title = element.title ? ` (${element.title})` : '';
    return (swatch(element) + inside + title).replace(/\s+/g, ' ');
  };
  const line = (...words) => lines.push(words.join(' ').trim());

  // Rows or columns, whichever are fewer.
  function table(element) {
    if (element.caption) line(`# ${text(element.caption)}`);
    const rows = [...element.rows].map((row) => [...row.cells].map((cell) => text(cell).trim()));
    const turned = rows[0].map((_, i) => rows.map((row) => row[i]));
    for (const cells of rows.length > rows[0].length ? turned : rows) line(cells.join(' | '));
  }

  // Axes with their ticks, and the marks by their places along the axes.
  function plot(svg) {
    const scales = { x: null, y: null };
    for (const axis of ['x', 'y']) {
      const words = (kind) => [...svg.querySelectorAll(`[aria-label="${axis}-axis ${kind}"] text`)];
      const ticks = words('tick label').filter((tick) => tick.textContent).map((tick) => {
        const { e, f } = tick.transform.baseVal.consolidate().matrix;
        const value = Number(tick.textContent.replace('−', '-').replace(',', ''));
        return { value, at: axis === 'x' ? e : f, label: tick.textContent };
      });
      line(`${axis}: ${words('label').map((label) => label.textContent)}:`,
        ticks.map((tick) => tick.label).join(' '));
      const [low, high] = [ticks[0], ticks.at(-1)];
      scales[axis] = (at) => Number((low.value + (at - low.at) * (high.value - low.value) /
        (high.at - low.at)).toFixed(1)) + 0;
    }
    const place = (x, y) => `${scales.x(x)},${scales.y(y)}`;
    const colour = (mark, way) => mark.getAttribute(way) ?? mark.parentElement.getAttribute(way);
    const marks = new Map();
    const add = (label, mark) => marks.set(label, [...(marks.get(label) ?? []), mark]);
    for (const path of svg.querySelectorAll('[aria-label=line] path, [aria-label=link] path')) {
      const points = path.getAttribute('d').slice(1).replaceAll('M', 'L').split('L')
        .map((point) => place(...point.split(',').map(Number)));
      if (colour(path, 'stroke-width') !== '4') // not the edge of a line
        add(`line ${colour(path, 'stroke')}`, points.join(' '));
    }
    for (const dot of svg.querySelectorAll('[aria-label=dot] > *')) {
      const { e, f } = dot.transform.baseVal.consolidate()?.matrix ?? {};
      add(dot.tagName, `${dot.tagName === 'circle'
        ? place(dot.cx.baseVal.value, dot.cy.baseVal.value) : place(e, f)} ${colour(dot, 'fill')}`);
    }
    for (const bar of svg.querySelectorAll('[aria-label=rect] rect')) {
      const { x, y, width, height } = bar.getBBox();
      add('bar', `${scales.x(x - 1)}–${scales.x(x + width)}: ${scales.y(y) - scales.y(y + height)}`);
    }
    for (const [label, all] of marks) line(`${label}: ${all.join('; ')}`);
    for (const word of svg.querySelectorAll('[aria-label=text] text')) line(word.textContent);
    for (const tip of svg.querySelectorAll('[aria-label=tip] text > tspan'))
      line('tip:', tip.textContent.replace('\u200b', ''));
  }

  function walk(element) {
    if (element.matches('svg')) plot(element);
    else if (element.matches('table')) table(element);
    else if (/^H\d$/.test(element.tagName)) line('#'.repeat(element.tagName[1]), text(element));
    else if (element.hidden) return;
    else if (element.matches('dl > div, .bar, .pager')) line(...[...element.children].map(text));
    else if (element.matches('.word')) line(element.parentElement.className.trim(), text(element));
    else if (element.matches('p, figcaption, summary')) line(text(element));
    else if (element.matches('ul, .mosaic'))
      line([...element.children].map((child) => text(child).trim()).join(' | '));
    else [...element.children].forEach(walk);
  }
  document.querySelectorAll(within).forEach(walk);
  return lines.filter(Boolean).join('\n');
}
