// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Which clips the table shows: what is searched, chips that are pressed, the order, and groups.

const TRAIT_NAMES = {
  noSound: 'No sound',
  silent: 'Silent',
  noTimecode: 'No timecode',
  variableRate: 'Variable rate',
  rotated: 'Rotated',
  pixelAspect: 'Pixels not square',
  edits: 'Edit list',
  provider: 'Sample provider',
  notInterleaved: 'Poorly interleaved',
};

// Of each kind one chip has to fit, where some are pressed. `most`: the chips of the kind that are shown;
// what is worth a look is shown however rare it is.
const CHIP_KINDS = [
  {title: 'Codec', most: 8, of: (clip) => [codecText(clip) || (clip.channels ? 'Sound alone' : '')]},
  {title: 'Rate', most: 8, of: (clip) => [framesText(clip)]},
  {title: 'Worth a look',
   of: (clip) => [clip.failed ? 'Not described' : clip.warnings.length ? 'Warnings' : '',
                  ...clip.traits.map((trait) => TRAIT_NAMES[trait.id] || trait.id)]},
];

// What clips of a group have in common; the groups come in the order of these texts.
const GROUPINGS = [
  {id: 'none', title: 'Nothing'},
  {id: 'folder', title: 'Folder', of: (clip) => clip.folder},
  {id: 'codec', title: 'Codec', of: (clip) => codecText(clip) || 'No picture'},
  {id: 'rate', title: 'Rate', of: (clip) => framesText(clip) || 'No rate'},
];

// Orders of clips, rising with a sign of 1 and falling with -1. Those without a value come last in both.
const by = (of, compare) => (sign) => (a, b) => {
  const left = of(a);
  const right = of(b);
  if (left === undefined || right === undefined) return (left === undefined) - (right === undefined);
  return sign * compare(left, right);
};
const byNumber = (of) => by(of, (left, right) => left - right);
const words = new Intl.Collator('en', {numeric: true, sensitivity: 'base'});
const byText = (of) => by((clip) => of(clip) || undefined, words.compare);

// The first timecode that the movie itself has. Where nobody knows whether it has one, its clip counts
// from zero; of a movie that is gone, the catalog's is told.
function startText(clip) {
  return clip.hasTimecode || clip.failed ? clip.start || '' : '';
}

// A column of the table. Its cells have its id as their class, by which narrow screens leave it out.
const COLUMNS = [
  {id: 'name', title: 'Name', order: byText((clip) => clip.name)},
  {id: 'length', title: 'Length', number: true, order: byNumber((clip) => clip.seconds),
   text: (clip) => durationText(clip.seconds)},
  {id: 'start', title: 'Timecode', order: byText(startText), text: startText},
  {id: 'rate', title: 'Rate', number: true, order: byNumber((clip) => ratio(pictureRate(clip)) || undefined),
   text: (clip) => rateText(pictureRate(clip))},
  {id: 'raster', title: 'Raster', number: true,
   order: byNumber((clip) => clip.width ? clip.width * clip.height : undefined), text: rasterText},
  {id: 'codec', title: 'Codec', order: byText(codecText), text: codecText},
  {id: 'sound', title: 'Sound', order: byText(soundText), text: soundText},
  {id: 'size', title: 'Size', number: true, order: byNumber((clip) => clip.size),
   text: (clip) => bytesText(clip.size)},
  {id: 'date', title: 'Date', order: byText((clip) => clip.date), text: (clip) => dateText(clip.date)},
  {id: 'warnings', title: 'Warnings', number: true,
   order: byNumber((clip) => clip.warnings.length + clip.traits.length / 100)},
];

const filters = {
  words: '',
  pressed: CHIP_KINDS.map(() => new Set()),
  only: null,  // numbers of clips of a finding, with its title
  sort: 'name',
  isFalling: false,
  grouping: 'none',
};

function fits(clip, wanted) {
  return wanted.every((word) => clip.text.includes(word)) &&
         filters.pressed.every((set, kind) => set.size === 0 ||
                                              CHIP_KINDS[kind].of(clip).some((label) => set.has(label))) &&
         (!filters.only || filters.only.numbers.has(clip.number));
}

// Clips in their order, with {group, count} before those of a group.
function rowsToShow() {
  const wanted = folded(filters.words).split(/\s+/).filter(Boolean);
  const column = COLUMNS.find((one) => one.id === filters.sort);
  const order = column.order(filters.isFalling ? -1 : 1);
  const found = clips.filter((clip) => fits(clip, wanted));
  found.sort((a, b) => order(a, b) || words.compare(a.name, b.name) || a.number - b.number);
  const grouping = GROUPINGS.find((one) => one.id === filters.grouping);
  if (!grouping.of) return found;
  const groups = new Map();
  for (const clip of found) {
    const group = grouping.of(clip);
    if (!groups.has(group)) groups.set(group, []);
    groups.get(group).push(clip);
  }
  return [...groups].sort((a, b) => words.compare(a[0], b[0]))
      .flatMap(([group, members]) => [{group, count: members.length}, ...members]);
}

function chips(changed) {
  const box = el('div', {class: 'chips', role: 'group', 'aria-label': 'Filters'});
  CHIP_KINDS.forEach((kind, place) => {
    const counts = new Map();
    for (const clip of clips) {
      for (const label of new Set(kind.of(clip))) {
        if (label) counts.set(label, (counts.get(label) || 0) + 1);
      }
    }
    const most = [...counts].sort((a, b) => b[1] - a[1]).slice(0, kind.most);
    if (most.length === 0 || (most.length === 1 && place < 2)) return;
    box.append(el("span", {class: "kind"}, kind.title), ...most.map(([label, count]) => {
      const chip = el('button', {type: 'button', class: 'chip', 'aria-pressed': 'false'}, label,
                      el('span', {class: 'count'}, count));
      chip.addEventListener('click', () => {
        const set = filters.pressed[place];
        const isPressed = !set.has(label);
        if (isPressed) set.add(label); else set.delete(label);
        chip.setAttribute('aria-pressed', isPressed);
        changed();
      });
      return chip;
    }));
  });
  return box;
}
