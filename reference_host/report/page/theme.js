// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Light, dark, or as the system has it; remembered where the browser lets pages remember.

const THEMES = ['system', 'light', 'dark'];
const THEME_KEY = 'cliphost-theme';

function rememberedTheme() {
  try {
    return localStorage.getItem(THEME_KEY);
  } catch {
    return null;
  }
}

function setTheme(theme) {
  document.documentElement.dataset.theme = theme;
  try {
    localStorage.setItem(THEME_KEY, theme);
  } catch {
    // It lasts as long as the page.
  }
}

function themeButton() {
  const button = el('button', {type: 'button', class: 'theme'});
  const show = () => {
    const theme = document.documentElement.dataset.theme;
    button.textContent = 'Theme: ' + theme;
  };
  button.addEventListener('click', () => {
    const now = THEMES.indexOf(document.documentElement.dataset.theme);
    setTheme(THEMES[(now + 1) % THEMES.length]);
    show();
  });
  const remembered = rememberedTheme();
  setTheme(THEMES.includes(remembered) ? remembered : 'system');
  show();
  return button;
}
