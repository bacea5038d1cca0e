// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What is odd about all clips together.

const MOST_NAMED = 12;  // of a group

function groupLabel(finding, group) {
  return finding.id === 'copies' ? counted(group.clips.length, 'copy', 'copies')
       : finding.id === 'rates' ? rateText(group.label) + '\u00a0fps'
       : group.label;
}

// Rates by their size; the others as they are told.
function inOrder(finding) {
  return finding.id === 'rates' ? [...finding.groups].sort((a, b) => ratio(a.label) - ratio(b.label)) : finding.groups;
}

function oddView(showOnly) {
  const heading = el('h1', {tabindex: '-1'}, 'What is odd');
  const view = el('article', {class: 'odd-view'}, heading,
    report.odd.length === 0
      ? el('p', {}, 'Nothing. All clips are alike in what mixes badly, and none was told anything against.')
      : '',
    report.odd.map((finding) => {
      const all = [...new Set(finding.groups.flatMap((group) => group.clips))];
      return el('section', {class: 'finding', 'aria-labelledby': 'odd-' + finding.id},
        el('h2', {id: 'odd-' + finding.id}, finding.title, ' ', el('span', {class: 'count'}, all.length)),
        el('p', {class: 'fine'}, finding.words),
        el('ul', {class: 'groups'}, inOrder(finding).map((group) => el('li', {},
          el('button', {type: 'button', class: 'chip',
                        onclick: () => showOnly(finding.title + ', ' + groupLabel(finding, group), group.clips)},
            groupLabel(finding, group), el('span', {class: 'count'}, group.clips.length)),
          el('span', {class: 'names'}, group.clips.slice(0, MOST_NAMED).map((number, i) =>
            [i ? ', ' : '', el('a', {href: '#/clip/' + (number + 1)}, name(clips[number].name))]),
            group.clips.length > MOST_NAMED ? ' and ' + (group.clips.length - MOST_NAMED) + ' more' : '')))));
    }));
  return {view, heading, title: 'What is odd'};
}
