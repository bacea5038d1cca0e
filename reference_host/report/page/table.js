// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The table of clips. Of thousands of rows those near the screen exist alone; all rows are equally
// high, so the others' place is known.

const MORE_ROWS = 12;  // beyond each end of the screen

function poster(clip) {
  const box = el('span', {class: 'poster', 'aria-hidden': 'true'});
  if (clip.poster) {
    box.append(el('img', {src: sourceOf(clip.poster), alt: '', width: clip.poster.width,
                          height: clip.poster.height, decoding: 'async'}));
  } else {
    box.classList.add('none');
    box.append(clip.failed ? '!' : clip.width ? 'no picture' : clip.channels ? '\u266a' : '\u2013');
  }
  return box;
}

function brief(clip) {
  return [codecText(clip) || (clip.channels ? clip.soundName || 'sound' : ''), rasterText(clip),
          framesText(clip), durationText(clip.seconds)]
      .filter(Boolean).join(' \u00b7 ');
}

function marks(clip) {
  const box = el('span', {class: 'marks'});
  if (clip.failed) {
    box.append(el('span', {class: 'mark bad'}, 'Not described'));
  } else if (clip.warnings.length) {
    box.append(el('span', {class: 'mark warn'}, counted(clip.warnings.length, 'warning')));
  }
  const names = [...new Set(clip.traits.map((trait) => TRAIT_NAMES[trait.id] || trait.id))];
  const seen = names.length > 2 ? 1 : 2;
  for (const text of names.slice(0, seen)) box.append(el('span', {class: 'mark'}, text));
  if (names.length > seen) {
    const rest = names.slice(seen);
    box.append(el('span', {class: 'mark', title: rest.join(', ')}, '+' + rest.length,
                  el('span', {class: 'unseen'}, ': ' + rest.join(', '))));
  }
  return box;
}

function clipRow(clip, place) {
  return el('tr', {class: 'clip', 'aria-rowindex': place + 2, 'data-place': place},
    el('th', {scope: 'row', class: 'name'},
      el('div', {class: 'named'}, poster(clip),
        el('div', {class: 'words'},
          el('a', {href: '#/clip/' + (clip.number + 1), class: 'open'}, name(clip.name)),
          el('span', {class: 'file'}, name(clip.file)),
          el('span', {class: 'brief'}, brief(clip))))),
    COLUMNS.slice(1).map((column) => el('td', {class: column.id + (column.number ? ' number' : '')},
      column.id === 'warnings' ? marks(clip) : column.text(clip))));
}

function groupRow(row, place) {
  return el('tr', {class: 'group', 'aria-rowindex': place + 2},
    el('th', {scope: 'row', class: 'name'},
      el('div', {}, name(row.group), el('span', {class: 'count'}, counted(row.count, 'clip')))),
    COLUMNS.slice(1).map((column) => el('td', {class: column.id})));
}

function spacer() {
  return el('tr', {class: 'spacer', 'aria-hidden': 'true'}, el('td'));
}

// Keeps what is made once: going back to it finds search, place and focus as they were.
function makeTable() {
  let rows = [];
  let isWhole = false;  // for paper
  let from = 0;
  let to = 0;
  const head = el('tr', {'aria-rowindex': 1});
  const body = el('tbody');
  const above = spacer();
  const below = spacer();
  const table = el('table', {class: 'clips'}, el('caption', {class: 'unseen'}, 'Clips'),
                   el('thead', {}, head), body);
  const found = el('p', {class: 'found', role: 'status'});
  const nothing = el('p', {class: 'nothing', hidden: true}, 'No clip fits. ',
    el('button', {type: 'button', onclick: () => clearAll()}, 'Show all'));

  function rowHeight() {
    return parseFloat(getComputedStyle(table).getPropertyValue('--row-pixels')) || 72;
  }

  function setSpace(row, count) {
    row.firstChild.style.height = count * rowHeight() + 'px';
    row.hidden = count === 0;
  }

  // Makes the rows near the screen. Rows that stay are left alone, so they keep focus.
  function draw() {
    const height = rowHeight();
    const top = isWhole ? 0 : -body.getBoundingClientRect().top;
    const first = isWhole ? 0 : Math.max(0, Math.min(rows.length, Math.floor(top / height) - MORE_ROWS));
    const last = isWhole ? rows.length
                         : Math.max(first, Math.min(rows.length, Math.ceil((top + innerHeight) / height) + MORE_ROWS));
    if (first === from && last === to) return;
    const had = new Map([...body.querySelectorAll('tr:not(.spacer)')].map((row) => [row.clipRow, row]));
    const wanted = rows.slice(first, last).map((row, i) => {
      const element = had.get(row) || (row.group !== undefined ? groupRow(row, first + i)
                                                               : clipRow(row, first + i));
      element.clipRow = row;
      had.delete(row);
      return element;
    });
    for (const gone of had.values()) gone.remove();
    wanted.forEach((row, i) => {
      const before = i === 0 ? above : wanted[i - 1];
      if (before.nextSibling !== row) before.after(row);
    });
    from = first;
    to = last;
    setSpace(above, first);
    setSpace(below, rows.length - last);
    keepOneTabStop();
  }

  // The links are reached by one Tab, and each other by arrows.
  let current = null;
  function keepOneTabStop() {
    const links = [...body.querySelectorAll('a.open')];
    const stop = links.find((link) => link.closest('tr').clipRow === current) || links[0];
    for (const link of links) link.tabIndex = link === stop ? 0 : -1;
  }

  function change() {
    rows = rowsToShow();
    current = rows.includes(current) ? current : null;
    from = to = -1;
    body.replaceChildren(above, below);
    table.setAttribute('aria-rowcount', rows.length + 1);
    const count = rows.filter((row) => row.group === undefined).length;
    found.textContent = (count === clips.length ? counted(count, 'clip')
                                                : count + ' of ' + counted(clips.length, 'clip')) +
                        (filters.only ? ': ' + shown(filters.only.title) : '');
    nothing.hidden = count > 0;
    table.hidden = count === 0;
    showOrder();
    draw();
  }

  function showOrder() {
    for (const cell of head.children) {
      const isSorted = cell.dataset.column === filters.sort;
      cell.setAttribute('aria-sort', !isSorted ? 'none' : filters.isFalling ? 'descending' : 'ascending');
    }
    sortBy.value = filters.sort;
    reset.hidden = !(filters.words || filters.only || filters.pressed.some((set) => set.size));
  }

  function sort(id) {
    filters.isFalling = filters.sort === id && !filters.isFalling;
    filters.sort = id;
    change();
  }

  function clearAll() {
    filters.words = search.value = '';
    filters.only = null;
    for (const set of filters.pressed) set.clear();
    for (const chip of bar.querySelectorAll('.chip')) chip.setAttribute('aria-pressed', 'false');
    change();
    search.focus();
  }

  for (const column of COLUMNS) {
    head.append(el('th', {scope: 'col', class: column.id + (column.number ? ' number' : ''),
                          'data-column': column.id, 'aria-sort': 'none'},
      el('button', {type: 'button', onclick: () => sort(column.id)}, column.title)));
  }

  const search = el('input', {type: 'search', id: 'search', autocomplete: 'off', spellcheck: 'false',
                              placeholder: 'Names, folders, codecs, 1920x1080 \u2026'});
  search.addEventListener('input', () => {
    filters.words = search.value;
    change();
  });
  const sortBy = el('select', {id: 'sort', onchange: () => sort(sortBy.value)},
                    COLUMNS.map((column) => el('option', {value: column.id}, column.title)));
  const reverse = el('button', {type: 'button', class: 'sortby', onclick: () => sort(filters.sort)}, 'Reverse order');
  const groupBy = el('select', {id: 'group'},
                     GROUPINGS.map((one) => el('option', {value: one.id}, one.title)));
  groupBy.addEventListener('change', () => {
    filters.grouping = groupBy.value;
    change();
  });
  const reset = el('button', {type: 'button', class: 'reset', hidden: true, onclick: () => clearAll()},
                   'Clear filters');
  const bar = el('div', {class: 'tools'},
    el('div', {class: 'fields'},
      el('label', {class: 'search'}, el('span', {}, 'Search'), search),
      el('label', {class: 'sortby'}, el('span', {}, 'Sort by'), sortBy), reverse,
      el('label', {}, el('span', {}, 'Group by'), groupBy), reset),
    chips(change));

  function moveTo(place) {
    let at = Math.max(0, Math.min(rows.length - 1, place));
    const step = place >= rows.length ? -1 : 1;
    while (rows[at] && rows[at].group !== undefined) at += step;
    if (!rows[at]) return;
    current = rows[at];
    const height = rowHeight();
    const top = body.getBoundingClientRect().top + scrollY + at * height;
    const hidden = table.tHead.getBoundingClientRect().height;
    if (top - hidden < scrollY) scrollTo(0, top - hidden);
    if (top + height > scrollY + innerHeight) scrollTo(0, top + height - innerHeight);
    draw();
    keepOneTabStop();
    const link = body.querySelector('a.open[tabindex="0"]');
    if (link) link.focus({preventScroll: true});
  }

  body.addEventListener('focusin', (event) => {
    const row = event.target.closest('tr.clip');
    if (row) current = row.clipRow;
    keepOneTabStop();
  });
  body.addEventListener('keydown', (event) => {
    const row = event.target.closest('tr.clip');
    if (!row || event.altKey || event.ctrlKey || event.metaKey) return;
    const at = rows.indexOf(row.clipRow);
    const page = Math.max(1, Math.floor(innerHeight / rowHeight()) - 2);
    const up = (place) => rows[place] && rows[place].group !== undefined && place > 0 ? place - 1 : place;
    const place = {ArrowDown: at + 1, ArrowUp: up(at - 1), PageDown: at + page, PageUp: up(at - page),
                   Home: 0, End: rows.length}[event.key];
    if (place === undefined) return;
    event.preventDefault();
    moveTo(place);
  });
  // A click anywhere in the row opens it, but for one that ends a selection.
  body.addEventListener('click', (event) => {
    const row = event.target.closest('tr.clip');
    if (row && !event.target.closest('a') && getSelection().isCollapsed) {
      row.querySelector('a.open').click();
    }
  });

  let isAsked = false;
  const ask = () => {
    if (isAsked) return;
    isAsked = true;
    requestAnimationFrame(() => {
      isAsked = false;
      if (table.isConnected) draw();
    });
  };
  addEventListener('scroll', ask, {passive: true});
  addEventListener('resize', () => {
    from = to = -1;
    ask();
  });
  addEventListener('beforeprint', () => {
    isWhole = true;
    draw();
  });
  addEventListener('afterprint', () => {
    isWhole = false;
    draw();
  });

  const view = el('section', {class: 'table-view', 'aria-label': 'Clips'},
                  el('h1', {class: 'unseen'}, 'Clips of ' + report.title), bar, found, nothing, table);
  return {
    view,
    show() {
      change();
    },
    // Only clips of these numbers.
    showOnly(title, numbers) {
      filters.only = {title, numbers: new Set(numbers)};
    },
    focusClip(clip) {
      const at = rows.indexOf(clip);
      if (at >= 0) moveTo(at);
    },
    focusSearch() {
      search.focus();
      search.select();
    },
    order: () => rows.filter((row) => row.group === undefined),
  };
}
