// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The viewer's looks, one set of sheets for all viewers of a page.

import colours from "../styles/colours.css";
import controls from "../styles/controls.css";
import viewer from "../styles/viewer.css";

let sheets: readonly CSSStyleSheet[] | null = null;

export function viewerStyles(): readonly CSSStyleSheet[] {
    sheets ??= [colours, controls, viewer].map((text) => {
        const sheet = new CSSStyleSheet();
        sheet.replaceSync(text);
        return sheet;
    });
    return sheets;
}
