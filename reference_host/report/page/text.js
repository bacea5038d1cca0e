// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How numbers and texts are written for people.

// Characters that are not seen, or that turn the order of others, are shown by their numbers; so a
// name can't look like another one.
const HIDDEN = /[\u0000-\u001f\u007f-\u009f\u061c\u200b\u200e\u200f\u2028\u2029\u202a-\u202e\u2060\u2066-\u2069\ufeff]/g;
function shown(text) {
  return String(text).replace(HIDDEN, (hidden) => {
    const code = hidden.charCodeAt(0);
    return code < 0x20 ? String.fromCharCode(0x2400 + code)
                       : '\u2039U+' + code.toString(16).toUpperCase().padStart(4, '0') + '\u203a';
  });
}

function counted(count, thing, things = thing + 's') {
  return count.toLocaleString('en') + '\u00a0' + (count === 1 ? thing : things);
}

// At most so many digits behind the point, and no zeros at the end.
function plain(number, digits) {
  return String(Number(number.toFixed(digits)));
}

function ratio(text) {
  const [numerator, denominator] = String(text || '').split('/').map(Number);
  return numerator > 0 && denominator > 0 ? numerator / denominator : 0;
}

function rateText(rate) {
  return rate ? plain(ratio(rate), 3) : '';
}

// The rate of a clip's pictures. That of sound alone is of edit units, which nobody sees.
function pictureRate(clip) {
  return clip.width ? clip.rate : undefined;
}

function framesText(clip) {
  const rate = rateText(pictureRate(clip));
  return rate && rate + '\u00a0fps';
}

function durationText(seconds) {
  if (seconds === undefined) return '';
  if (seconds < 60) return plain(seconds, seconds < 10 ? 2 : 1) + '\u00a0s';
  const whole = Math.round(seconds);
  const two = (number) => String(number).padStart(2, '0');
  const minutes = Math.floor(whole / 60);
  return minutes < 60 ? minutes + ':' + two(whole % 60)
                      : Math.floor(minutes / 60) + ':' + two(minutes % 60) + ':' + two(whole % 60);
}

const UNITS = ['B', 'kB', 'MB', 'GB', 'TB'];
function bytesText(bytes) {
  if (bytes === undefined) return '';
  let unit = 0;
  let number = bytes;
  while (number >= 999.5 && unit + 1 < UNITS.length) {
    number /= 1000;
    ++unit;
  }
  return (unit === 0 ? number : number.toPrecision(3)) + '\u00a0' + UNITS[unit];
}

// In the reader's time zone.
function dateText(date) {
  const time = new Date(date || NaN);
  if (isNaN(time)) return '';
  const two = (number) => String(number).padStart(2, '0');
  return time.getFullYear() + '-' + two(time.getMonth() + 1) + '-' + two(time.getDate()) + '\u00a0' +
         two(time.getHours()) + ':' + two(time.getMinutes());
}

function rasterText(clip) {
  return clip.width ? clip.width + '\u00a0\u00d7\u00a0' + clip.height : '';
}

function codecText(clip) {
  return clip.codecName || clip.codec || '';
}

function soundText(clip) {
  if (!clip.channels) return '';
  const name = clip.soundName || clip.soundCodec || 'sound';
  const rate = clip.soundRate ? ', ' + plain(clip.soundRate / 1000, 3) + '\u00a0kHz' : '';
  return name + ', ' + clip.channels + '\u00a0ch' + rate;
}

// What is compared when people search: letters without marks and case.
function folded(text) {
  return String(text).normalize('NFKD').replace(/\p{M}/gu, '').toLowerCase();
}

// The address of a frame; where numbers are dropped, at rates that are multiples of 30.
function timecodeText(frame, framesPerSecond, drops) {
  if (!(framesPerSecond > 0)) return '';
  let at = frame;
  if (drops && framesPerSecond % 30 === 0) {
    const dropped = framesPerSecond / 15;
    const inMinute = framesPerSecond * 60 - dropped;
    const inTen = inMinute * 10 + dropped;
    const tens = Math.floor(at / inTen);
    const rest = at % inTen;
    at += dropped * (9 * tens + (rest >= dropped ? Math.floor((rest - dropped) / inMinute) : 0));
  }
  const two = (number) => String(Math.floor(number)).padStart(2, '0');
  const seconds = at / framesPerSecond;
  return two(seconds / 3600 % 24) + ':' + two(seconds / 60 % 60) + ':' + two(seconds % 60) +
         (drops ? ';' : ':') + two(at % framesPerSecond);
}
