// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the page holds: of all clips what the table shows, and of each its details.

const report = JSON.parse(document.getElementById('report').textContent);
const clips = report.clips;
clips.forEach((clip, number) => {
  clip.number = number;
  clip.text = folded([clip.name, clip.path, clip.place, clip.codec, clip.codecName, clip.soundCodec,
                      clip.soundName, rateText(pictureRate(clip)), clip.width && clip.width + 'x' + clip.height,
                      clip.start, clip.colors, ...clip.traits.map((trait) => trait.words),
                      ...clip.warnings.map((warning) => warning.reason)].join('\n'));
});

function detailsOf(clip) {
  return JSON.parse(document.getElementById('clip-' + clip.number).textContent);
}

// Where a picture is: in the page, or beside it.
function sourceOf(picture) {
  return picture.file || 'data:' + picture.type + ';base64,' + picture.data;
}
