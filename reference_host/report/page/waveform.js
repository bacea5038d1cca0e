// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How loud a sound track is over its length.

const FULL = 255;  // of a level

function levelPath(levels) {
  if (levels.length === 0) return '';
  const up = levels.map((level, i) => i + ' ' + (FULL - level));
  const down = levels.map((level, i) => i + ' ' + (FULL + level)).reverse();
  return 'M' + [...up, ...down].join('L') + 'Z';
}

function waveform(wave, track) {
  const level = wave.highest !== undefined ? plain(wave.highest, 1) + '\u00a0dB' : '';
  const unheard = wave.isWhole && !wave.lacksSamples ? 'silent' : 'nothing heard in what was read';
  const title = 'Sound track ' + wave.track +
                (track ? ', ' + counted(track.channels || 0, 'channel') : '');
  const width = Math.max(1, wave.peaks.length - 1);
  const notes = [wave.isWhole ? '' : 'looked at in pieces', wave.lacksSamples ? 'parts can\u2019t be read' : '']
      .filter(Boolean).join('; ');
  return el('figure', {class: 'wave'},
    el('figcaption', {}, el('span', {}, title),
      line('span', {class: 'fine'}, level ? ['highest ', value(level, 'Highest')] : unheard, ', ',
        value(durationText(wave.seconds), 'Length'), notes ? '; ' + notes : '')),
    svg('svg', {viewBox: '0 0 ' + width + ' ' + 2 * FULL, preserveAspectRatio: 'none', role: 'img',
                'aria-label': title + ': ' + (level ? 'highest ' + level : unheard)},
      svg('path', {class: 'peak', d: levelPath(wave.peaks)}),
      svg('path', {class: 'mean', d: levelPath(wave.means)}),
      svg('line', {class: 'middle', x1: 0, x2: width, y1: FULL, y2: FULL, 'vector-effect': 'non-scaling-stroke'})));
}
