// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Where the samples of a movie lie.

function sizeChart(track) {
  const most = Math.max(1, ...track.sizes);
  const count = track.sizes.length;
  return el('figure', {class: 'chart'},
    el('figcaption', {}, el('span', {}, 'Size of samples over time'),
      line('span', {class: 'fine'}, 'up to ', value(bytesText(most), 'Largest'), track.samples > count
        ? [', means of ', value(counted(Math.round(track.samples / count), 'sample'), 'Means of')] : '')),
    svg('svg', {viewBox: '0 0 ' + count + ' 100', preserveAspectRatio: 'none', role: 'img',
                'aria-label': 'Sizes of samples over time, from ' + bytesText(Math.min(...track.sizes)) +
                              ' to ' + bytesText(most)},
      track.sizes.map((size, i) => svg('rect', {x: i + 0.08, y: 100 - 100 * size / most, width: 0.84,
                                                height: 100 * size / most}))));
}

function groupsText(groups) {
  if (!groups) return 'none stands alone';
  if (groups.longest === 1) return 'every picture stands alone';
  return groups.shortest === groups.longest
      ? counted(groups.count, 'group') + ' of ' + counted(groups.longest, 'picture')
      : counted(groups.count, 'group') + ' of ' + groups.shortest + ' to ' + groups.longest +
        ' pictures, ' + plain(groups.mean, 1) + ' in the mean';
}

function sampleFacts(samples) {
  const box = el('div', {class: 'samples'});
  for (const track of samples.tracks) {
    box.append(el('h3', {}, 'Track ' + track.track + ', ' + track.kind),
      facts([
        ['Samples', track.samples],
        ['Bytes', track.bytes],
        ['Runs in the file', track.runs],
        ['Smallest sample', track.smallest === undefined ? undefined : track.smallest],
        ['Largest sample', track.largest === undefined ? undefined : track.largest],
        ['Pictures between those that stand alone', track.sizes ? groupsText(track.groups) : undefined],
      ]),
      track.faults.map((fault) => el('p', {class: 'warning'}, fault)),
      track.sizes && track.sizes.length > 1 ? sizeChart(track) : '');
  }
  box.append(...interleaving(samples.interleaving));
  return box;
}

function interleaving(found) {
  if (!found) return [];
  const words = ['Sound and picture of one time lie at most ',
                 value(plain(found.widest, 2) + '\u00a0s', 'Apart'), ' of playing apart.'];
  return [el('h3', {}, 'Interleaving'), line('p', {}, words),
    found.breaks.length === 0 ? '' : el('div', {class: 'wide'}, el('table', {class: 'small'},
      line('caption', {}, 'Where they are more than 2 seconds apart', found.count > found.breaks.length
        ? ['. The first ' + found.breaks.length + ' of ', value(found.count.toLocaleString('en'), 'Places')] : ''),
      el('thead', {}, el('tr', {}, ['At byte', 'Track', 'At', 'Apart from', 'By'].map((title) =>
        el('th', {scope: 'col'}, title)))),
      roving(el('tbody', {}, found.breaks.map((one) => el('tr', {},
        [one.position, one.track, durationText(one.at), 'track ' + one.from, durationText(one.seconds)]
          .map((text) => el('td', {}, value(text)))))), '.value')))];
}
