// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Values that can be selected, and that a click or Enter copies.

async function copy(text) {
  try {
    await navigator.clipboard.writeText(text);
  } catch {
    // Without permission, as in pages that are opened from disks by some browsers.
    const field = el('textarea', {class: 'unseen', 'aria-hidden': 'true'});
    field.value = text;
    document.body.append(field);
    const before = document.activeElement;
    field.select();
    document.execCommand('copy');
    field.remove();
    before.focus();
  }
  say('Copied: ' + text);
}

function value(text, label) {
  const element = el('span', {class: 'value', role: 'button', tabindex: '-1', dir: 'auto',
                              title: 'Click to copy',
                              'aria-label': label ? label + ': ' + text + ', copy' : undefined}, text);
  const doCopy = () => copy(String(text));
  element.addEventListener('click', () => {
    if (getSelection().isCollapsed) doCopy();
  });
  element.addEventListener('keydown', (event) => {
    if (event.key === 'Enter' || event.key === ' ') {
      event.preventDefault();
      doCopy();
    }
  });
  return element;
}

// One of its values is reached by Tab, the others from there by the arrows.
function roving(list, selector) {
  const items = () => [...list.querySelectorAll(selector)].filter((item) => item.offsetParent !== null);
  const first = list.querySelector(selector);
  if (first) first.tabIndex = 0;
  list.addEventListener('focusin', (event) => {
    const now = event.target.closest(selector);
    if (!now) return;
    for (const item of list.querySelectorAll(selector)) item.tabIndex = item === now ? 0 : -1;
  });
  list.addEventListener('keydown', (event) => {
    const all = items();
    const at = all.indexOf(event.target);
    const to = {ArrowDown: at + 1, ArrowUp: at - 1, Home: 0, End: all.length - 1}[event.key];
    if (at < 0 || to === undefined || event.altKey || event.ctrlKey || event.metaKey) return;
    event.preventDefault();
    all[Math.max(0, Math.min(all.length - 1, to))].focus();
  });
  return list;
}

// Values within other words, which Tab reaches as one.
function line(tag, properties, ...words) {
  return roving(el(tag, properties, words), '.value');
}

// A text that would be broken several times beside others.
const LONG = 40;

// Rows of [label, value]; those without a value are left out.
function factRows(rows, properties) {
  const list = el('dl', {class: 'facts', ...properties});
  for (const [label, text] of rows) {
    if (text === undefined || text === '') continue;
    list.append(el('div', {class: String(text).length > LONG && 'long'}, el('dt', {}, label),
                   el('dd', {}, text instanceof Node ? text : value(text, label))));
  }
  return list;
}

function facts(rows, properties) {
  return roving(factRows(rows, properties), '.value');
}
