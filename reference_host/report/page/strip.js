// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Pictures from the whole movie, which are one picture: each cell shows a part of it.

// As many in a row that rows are full, and none is much smaller than it is stored.
const STRIP_COLUMNS = [12, 6, 4, 3, 2];
function columnsFor(width, cell) {
  return STRIP_COLUMNS.find((columns) => width / columns >= 0.8 * cell) || 2;
}

function filmstrip(strip) {
  const source = sourceOf(strip);
  const count = strip.frames.length;
  const list = el('ol', {class: 'strip'});
  strip.frames.forEach((frame, i) => {
    const label = frame.timecode || 'frame ' + frame.frame;
    const picture = el('img', {src: source, alt: ''});
    picture.style.width = count * 100 + '%';
    picture.style.transform = 'translateX(' + -100 * i / count + '%)';
    const cell = el('div', {class: 'cell', role: 'img',
                            'aria-label': frame.problem ? label + ' can\u2019t be read' : 'Picture at ' + label},
                    picture);
    cell.style.aspectRatio = strip.width + ' / ' + strip.height;
    list.append(el('li', {}, cell,
      el('div', {class: 'under'}, frame.timecode ? value(frame.timecode) : '',
        el('span', {class: 'fine'}, 'frame ', value(frame.frame, 'Frame'))),
      frame.problem ? el('p', {class: 'fine'}, frame.problem) : ''));
  });
  list.style.setProperty('--cell', strip.width + 'px');
  new ResizeObserver(() => {
    list.style.setProperty('--columns', columnsFor(list.clientWidth, strip.width));
  }).observe(list);
  return roving(list, '.value');
}
