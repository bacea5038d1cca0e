// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Which view is shown: the part of the address behind # says it.

history.scrollRestoration = 'manual';

const main = document.getElementById('main');
const table = makeTable();
let scrolled = 0;
let lastClip = null;
let keys = {};  // of the view that is shown: the addresses to which they lead

function goTo(address) {
  location.hash = address;
}

function tab(address, label) {
  return el('a', {href: address, class: 'tab'}, label);
}
const tabs = [tab('#/', ['Clips ', el('span', {class: 'count'}, clips.length)]),
              tab('#/odd', ['Odd ', el('span', {class: 'count'}, report.odd.length)])];
document.querySelector('header.bar').append(
  el('p', {class: 'title'}, name(report.title)),
  el('nav', {'aria-label': 'Pages'}, tabs),
  el('p', {class: 'made fine'}, 'Made ' + dateText(report.made) + ' by ' + report.program +
    (report.isWhole ? '' : ', before all movies were read')),
  themeButton());

function showOnly(title, numbers) {
  table.showOnly(title, numbers);
  scrolled = 0;
  lastClip = null;
  goTo('#/');
}

function show() {
  const [, page, number] = location.hash.split('/');
  const wasTable = table.view.isConnected;
  if (wasTable) scrolled = scrollY;
  const clip = page === 'clip' ? clips[number - 1] : undefined;
  tabs.forEach((one, i) => {
    const isHere = (i === 1) === (page === 'odd');
    if (isHere) one.setAttribute('aria-current', clip ? 'true' : 'page');
    else one.removeAttribute('aria-current');
  });
  if (clip || page === 'odd') {
    const shownView = clip ? clipView(clip, table.order().includes(clip) ? table.order() : clips)
                           : oddView(showOnly);
    lastClip = clip || lastClip;
    keys = shownView.keys || {};
    main.replaceChildren(shownView.view);
    document.title = shown(shownView.title + ' \u2013 ' + report.title);
    scrollTo(0, 0);
    shownView.heading.focus({preventScroll: true});
    return;
  }
  keys = {};
  main.replaceChildren(table.view);
  document.title = shown(report.title);
  table.show();
  scrollTo(0, scrolled);
  if (lastClip) table.focusClip(lastClip);
  lastClip = null;
}

addEventListener('hashchange', show);
addEventListener('keydown', (event) => {
  if (event.target.closest('input, select, textarea') || event.ctrlKey || event.altKey || event.metaKey) return;
  if (keys[event.key]) goTo(keys[event.key]);
  if (event.key === '/') {
    event.preventDefault();
    if (!table.view.isConnected) {
      lastClip = null;
      goTo('#/');
      addEventListener('hashchange', () => table.focusSearch(), {once: true});
    } else {
      table.focusSearch();
    }
  }
});
show();
// For whoever measures how long it takes until the page can be used.
requestAnimationFrame(() => setTimeout(() => performance.mark('usable')));
