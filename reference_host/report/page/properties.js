// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// An object of an AAF file as it is: its values, and what it holds, to unfold.

function isHeld(member) {
  return Array.isArray(member);
}

function titleOf(node) {
  const label = node.Name || node.SlotName || node.SlotID || node.DataDefinition || '';
  return [node.class, label ? el('span', {class: 'fine'}, ' ', name(String(label).replace(/^"|"$/g, ''))) : ''];
}

function properties(node, without) {
  const members = Object.entries(node).filter(([member]) => member !== 'class' && !(without || []).includes(member));
  return el('div', {class: 'node'},
    facts(members.filter(([, held]) => !isHeld(held)).map(([member, text]) => [member, String(text)])),
    members.filter(([, held]) => isHeld(held)).map(([member, nodes]) => nodes.map((one) => unfolding(
      [el('span', {class: 'member'}, member), ' ', ...titleOf(one)], () => properties(one)))));
}

// Its content is made when it is first opened.
function unfolding(title, make, isOpen) {
  const box = el('details', {class: 'unfold'}, el('summary', {}, title));
  const fillIn = () => {
    if (box.open && box.children.length === 1) box.append(make());
  };
  box.addEventListener('toggle', fillIn);
  if (isOpen) {
    box.open = true;
    fillIn();
  }
  return box;
}
