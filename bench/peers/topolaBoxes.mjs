// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What topola lays out without a page: boxes of one size, which nothing draws.

export const WIDTH = 55;
export const HEIGHT = 80;

// Asked for its style element alone.
const page = { querySelector: () => ({ __data__: 0 }) };

/** Options of a chart of data around a person; topola is the module, as it is loaded. */
export function topolaOptions({ CompositeRenderer }, data, person) {
  class FixedBoxes extends CompositeRenderer {
    getPreferredIndiSize() {
      return [WIDTH, HEIGHT];
    }
    getCss() {
      return '';
    }
    render() {}
  }
  const options = { data, startIndi: person, svgSelector: page };
  return Object.assign(options, { renderer: new FixedBoxes(options) });
}
