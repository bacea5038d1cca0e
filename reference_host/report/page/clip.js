// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A clip's own view.

const ROUTES = {
  header: 'by its header',
  library: 'through FFmpeg',
  none: 'by neither way',
};

function section(id, title, ...content) {
  return el('section', {class: 'part', 'aria-labelledby': id}, el('h2', {id}, title), content);
}

function warningBox(warning) {
  return el('li', {class: warning.kind === 'failure' ? 'warning bad' : 'warning'},
    el('p', {dir: 'auto'}, warning.reason),
    warning.hint ? el('p', {class: 'hint', dir: 'auto'}, 'What helps: ' + warning.hint) : '',
    warning.code ? el('p', {class: 'fine'}, 'The module answered ', value(warning.code), '.') : '');
}

function trackTable(details) {
  const columns = [['Track', (track) => track.number], ['Holds', (track) => track.kind],
                   ['Codec', (track) => track.codecName || track.codec || ''],
                   ['Code', (track) => track.codec || ''],
                   ['Rate', (track) => track.rate || ''], ['Length', (track) => track.length],
                   ['Raster', (track) => rasterText(track)],
                   ['Channels', (track) => track.channels], ['Bits', (track) => track.bits]];
  const used = columns.filter(([, of]) => details.tracks.some((track) => of(track) || of(track) === 0));
  return el('div', {class: 'wide'}, el('table', {class: 'small'},
    el('thead', {}, el('tr', {}, used.map(([title]) => el('th', {scope: 'col'}, title)))),
    roving(el('tbody', {}, details.tracks.map((track) => el('tr', {}, used.map(([, of]) => {
      const text = of(track);
      return el('td', {}, text === undefined || text === '' ? '' : value(text));
    })))), '.value')));
}

function summary(clip, details) {
  return facts([
    ['Path', clip.path],
    ['Place for others', clip.place],
    ['Length', clip.seconds === undefined ? undefined : durationText(clip.seconds)],
    ['Frames', clip.width ? clip.length : undefined],
    ['Edit units', clip.width ? undefined : clip.length],
    ['First timecode', clip.start],
    ['Rate', pictureRate(clip)],
    ['Edit rate', clip.width ? undefined : clip.rate],
    ['Raster', clip.width ? clip.width + 'x' + clip.height : undefined],
    ['Codec', codecText(clip) && clip.codec ? codecText(clip) + ' (' + clip.codec + ')' : codecText(clip)],
    ['Alpha', clip.alpha ? 'yes' : undefined],
    ['Colours', clip.colors],
    ['Sound', soundText(clip)],
    ['Size', clip.size === undefined ? undefined : clip.size + ' bytes'],
    ['Changed', clip.date],
    ['Read', ROUTES[clip.route] && ROUTES[clip.route] + (details.routeReason ? ', since ' + details.routeReason : '')],
    ['Id', clip.id],
  ]);
}

function pictures(clip, details) {
  if (details.strip) return filmstrip(details.strip);
  if (clip.failed) {
    return el('div', {class: 'placeholder'},
      clip.poster ? el('img', {src: sourceOf(clip.poster), alt: 'Picture that a catalog has of it'}) : '',
      el('p', {}, 'No pictures: ' + (clip.warnings[0] ? clip.warnings[0].reason : 'it is not described')));
  }
  const why = clip.warnings.find((warning) => warning.kind === 'pictures');
  return el('div', {class: 'placeholder'}, el('p', {}, why ? 'No pictures. ' + why.reason : 'The movie has no pictures.'));
}

function notDrawn(details) {
  const sounds = details.tracks.filter((track) => track.kind === 'sound').length;
  return sounds <= details.waves.length ? ''
       : el('p', {class: 'fine'}, details.waves.length + ' of ' + sounds + ' sound tracks are drawn.');
}

function samplesPart(clip, details) {
  const isUnmapped = clip.route === 'library' && !clip.failed &&
                     !clip.warnings.some((warning) => warning.kind === 'samples');
  const content = details.samples ? sampleFacts(details.samples)
                : isUnmapped ? el('p', {}, 'Where they lie is not known: FFmpeg tells no map of this kind of file.') : '';
  return content && section('part-samples', 'Samples in the file', content);
}

// `keys`: where keys lead while the view is shown.
function clipView(clip, order) {
  const details = {tracks: [], columns: [], parameters: [], waves: [], ...detailsOf(clip)};
  const at = order.indexOf(clip);
  const step = (by, label, key) => {
    const to = order[at + by];
    return el('a', {class: 'step', href: to ? '#/clip/' + (to.number + 1) : undefined, title: 'Key ' + key,
                    'aria-disabled': to ? undefined : 'true', role: to ? undefined : 'link'}, label);
  };
  const heading = el('h1', {tabindex: '-1'}, name(clip.name));
  const tracks = new Map(details.tracks.map((track) => [track.number, track]));
  const view = el('article', {class: 'clip-view'},
    el('nav', {class: 'steps', 'aria-label': 'Clips'},
      el('a', {href: '#/', class: 'step', title: 'Key Escape'}, '\u2190 All clips'),
      el('span', {class: 'fine'}, at < 0 ? '' : (at + 1) + ' of ' + order.length),
      step(-1, 'Previous', 'k'), step(1, 'Next', 'j')),
    heading,
    brief(clip) ? el('p', {class: 'brief'}, brief(clip)) : '',
    clip.warnings.length || clip.traits.length
      ? section('part-warnings', clip.failed ? 'Not described' : 'Worth a look',
          el('ul', {class: 'against'}, clip.warnings.map(warningBox)),
          el('ul', {class: 'traits'}, clip.traits.map((trait) => el('li', {},
            el('span', {class: 'mark'}, TRAIT_NAMES[trait.id] || trait.id), ' ', trait.words))))
      : '',
    section('part-pictures', 'Pictures', pictures(clip, details)),
    details.waves.length ? section('part-sound', 'Sound', details.waves.map((wave) =>
      waveform(wave, tracks.get(wave.track))), notDrawn(details)) : '',
    section('part-facts', 'Facts', summary(clip, details),
      details.tracks.length ? trackTable(details) : ''),
    details.columns.length ? section('part-columns', 'Bin columns', facts(details.columns.map((column) =>
      [column.name, column.value]))) : '',
    details.parameters.length ? section('part-parameters', 'Parameters', facts(details.parameters.map((one) =>
      [one.label || one.name, one.words === one.defaultWords ? one.words : one.words + ' (default: ' + one.defaultWords + ')'])))
      : '',
    samplesPart(clip, details),
    details.description ? section('part-mobs', 'Mobs', mobChain(details.description)) : '');
  const address = (to) => to && '#/clip/' + (to.number + 1);
  const keys = {j: address(order[at + 1]), k: address(order[at - 1]), Escape: '#/'};
  return {view, heading, title: clip.name, keys};
}
