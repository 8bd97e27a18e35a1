// What is wrong with the layout of a page; runs in the browser.

export function faultsOfLayout() {
  const faults = [];
  const within = document.documentElement.clientWidth;
  if (document.documentElement.scrollWidth > within) faults.push('the page scrolls sideways');

  // Every line of text that is to be seen, as a box.
  const boxes = [];
  const walker = document.createTreeWalker(document.getElementById('page'), NodeFilter.SHOW_TEXT);
  for (let node = walker.nextNode(); node; node = walker.nextNode()) {
    const parent = node.parentElement;
    if (!node.data.trim() || !parent.checkVisibility() || parent.closest('title, style')) continue;
    const range = document.createRange();
    range.selectNodeContents(node);
    for (const box of range.getClientRects())
      if (box.width && box.height) boxes.push({ node, box, scrolls: parent.closest('.scroll') });
  }
  const label = ({ node }) => `"${node.data.trim().slice(0, 30)}"`;
  for (const one of boxes)
    if (!one.scrolls && (one.box.left < -1 || one.box.right > within + 1))
      faults.push(`${label(one)} leaves the page`);

  boxes.sort((a, b) => a.box.top - b.box.top);
  boxes.forEach((first, i) => {
    for (let j = i + 1; j < boxes.length && boxes[j].box.top < first.box.bottom - 3; ++j) {
      const second = boxes[j];
      const across = Math.min(first.box.right, second.box.right) -
        Math.max(first.box.left, second.box.left);
      if (first.node !== second.node && across > 2)
        faults.push(`${label(first)} overlaps ${label(second)}`);
    }
  });

  for (const svg of document.querySelectorAll('.plot svg')) {
    const frame = svg.parentElement.getBoundingClientRect();
    const box = svg.getBoundingClientRect();
    if (box.width < 250 || box.height < 200) faults.push('a picture is too small');
    if (box.right > frame.right + 1) faults.push('a picture leaves its frame');
  }
  return faults;
}
