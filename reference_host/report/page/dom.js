// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Elements out of values. A text becomes a text, whatever it holds: nothing here reads markup.

const SVG = 'http://www.w3.org/2000/svg';

function fill(element, properties, children) {
  for (const [name, value] of Object.entries(properties || {})) {
    if (value === undefined || value === null || value === false) continue;
    if (name.startsWith('on')) {
      element.addEventListener(name.slice(2), value);
    } else {
      element.setAttribute(name, value === true ? '' : shown(value));
    }
  }
  for (const child of children.flat(Infinity)) {
    if (child === undefined || child === null || child === '') continue;
    element.append(child instanceof Node ? child : shown(child));
  }
  return element;
}

function el(tag, properties, ...children) {
  return fill(document.createElement(tag), properties, children);
}

function svg(tag, properties, ...children) {
  return fill(document.createElementNS(SVG, tag), properties, children);
}

// A text of somebody else's, which may run the other way.
function name(text, properties) {
  return el('bdi', properties, text);
}

function say(text) {
  document.querySelector('.told').textContent = shown(text);
}
