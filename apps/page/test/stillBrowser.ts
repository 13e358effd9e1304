// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Imported first: what the page's code asks of a browser when it is loaded, as of a reader who asked for stillness.

Object.assign(globalThis, {
    matchMedia: () => ({ matches: true, addEventListener: () => {} }),
    cancelAnimationFrame: () => {},
});
if (!("navigator" in globalThis)) Object.assign(globalThis, { navigator: { maxTouchPoints: 0 } });
