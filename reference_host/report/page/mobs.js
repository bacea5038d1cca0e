// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The chain of mobs: boxes with their slots, and an arrow from each source clip to what it names.

function partsOf(node, member) {
  return Array.isArray(node && node[member]) ? node[member] : [];
}

const MOB_TITLES = ['Master mob', 'File mob', 'Source mob'];

function mobTitle(mob, place) {
  return MOB_TITLES[place] || mob.class || 'Mob';
}

function plainText(text) {
  return String(text === undefined ? '' : text).replace(/^"|"$/g, '');
}

// What a slot plays: its first source clip or timecode, within sequences too.
function played(slot) {
  const within = (node) => [node, ...partsOf(node, 'Components').flatMap(within)];
  const all = partsOf(slot, 'Segment').flatMap(within);
  return all.find((node) => node.SourceID !== undefined) ||
         all.find((node) => node.class === 'Timecode') || all[0] || {};
}

function slotBox(slot, mobs) {
  const segment = played(slot);
  const kind = plainText(segment.DataDefinition).replace(/^DataDef_/, '').replace(/^Legacy/, '').replace(/ \{.*$/, '');
  const target = mobs.findIndex((mob) => mob.MobID === segment.SourceID);
  const isDrop = String(segment.Drop).startsWith('True');
  const rows = [['Edit rate', slot.EditRate], ['Length', segment.Length]];
  if (segment.class === 'Timecode') {
    rows.push(['Timecode', timecodeText(Number(segment.Start), Number(segment.FPS), isDrop)],
              ['Counts', segment.FPS + (isDrop ? ' a second, drop-frame' : ' a second')]);
  }
  if (segment.SourceID !== undefined) {
    rows.push(['From', segment.StartTime],
              ['Leads to', target < 0 ? 'nothing further'
                                      : mobTitle(mobs[target], target).toLowerCase() + ', slot ' + segment.SourceMobSlotID]);
  }
  return line('li', {class: 'slot', 'data-slot': slot.SlotID,
                   'data-mob': target < 0 ? undefined : target,
                   'data-target': target < 0 ? undefined : segment.SourceMobSlotID},
    el('p', {class: 'slot-title'}, 'Slot ', value(slot.SlotID, 'Slot'), kind ? ' \u00b7 ' + kind : '',
      plainText(slot.SlotName) ? [' \u00b7 ', name(plainText(slot.SlotName))] : ''),
    factRows(rows));
}

function mobBox(mob, place, mobs) {
  return el('section', {class: 'mob', 'aria-label': mobTitle(mob, place)},
    el('h3', {}, mobTitle(mob, place)),
    facts([['Name', plainText(mob.Name)], ['Id', mob.MobID]]),
    el('ul', {class: 'slots'}, partsOf(mob, 'Slots').map((slot) => slotBox(slot, mobs))),
    partsOf(mob, 'EssenceDescription').map((descriptor) =>
      unfolding(['Descriptor ', el('span', {class: 'fine'}, descriptor.class)], () => properties(descriptor))),
    unfolding('All of it', () => properties(mob, ['EssenceDescription'])));
}

// A path from a slot to the one that it names: between boxes side by side, or along their left edges
// where they stand one below the other.
function arrowPath(from, to, origin) {
  const y1 = from.top + from.height / 2 - origin.top;
  const y2 = to.top + to.height / 2 - origin.top;
  if (to.left > from.right) {
    const x1 = from.right - origin.left;
    const x2 = to.left - origin.left - 2;
    const middle = (x1 + x2) / 2;
    return `M${x1} ${y1}C${middle} ${y1} ${middle} ${y2} ${x2} ${y2}`;
  }
  const x1 = from.left - origin.left;
  const x2 = to.left - origin.left - 2;
  const out = Math.min(x1, x2) - 14;
  return `M${x1} ${y1}C${out} ${y1} ${out} ${y2} ${x2} ${y2}`;
}

function mobChain(description) {
  const mobs = partsOf(description, 'Mobs');
  const boxes = mobs.map((mob, place) => mobBox(mob, place, mobs));
  const lines = svg('svg', {class: 'arrows', 'aria-hidden': 'true'});
  const chain = el('div', {class: 'mobs'}, boxes, lines);
  const draw = () => {
    const origin = chain.getBoundingClientRect();
    lines.replaceChildren(
      svg('defs', {}, svg('marker', {id: 'point', viewBox: '0 0 8 8', refX: 7, refY: 4, markerWidth: 7,
                                     markerHeight: 7, orient: 'auto-start-reverse'},
        svg('path', {d: 'M0 0L8 4L0 8Z'}))),
      ...[...chain.querySelectorAll('.slot[data-target]')].flatMap((slot) => {
        const target = [...boxes[slot.dataset.mob].querySelectorAll('.slot')].find((one) =>
          one.dataset.slot === slot.dataset.target);
        return target ? [svg('path', {class: 'arrow', 'marker-end': 'url(#point)',
          d: arrowPath(slot.getBoundingClientRect(), target.getBoundingClientRect(), origin)})] : [];
      }));
  };
  new ResizeObserver(draw).observe(chain);
  return chain;
}
