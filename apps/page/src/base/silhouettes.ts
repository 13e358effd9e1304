// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The figures of boxes, lists and the legend: path data by sex.

import type { Sex } from "olvane";

// 44 by 40 px.
export const kSilhouettes: Record<Sex, string> = {
    male: "M22 1.5a9 9 0 1 0 .01 0zM4 40v-5c0-8 5-12.5 11-13.5l7 5 7-5c6 1 11 5.5 11 13.5v5z",
    female:
        "M22 1c-8 0-11.5 5.5-11.5 12 0 5.5-.5 8.5-3.5 11.5 4 1.5 8 1 10.5-.5v3h9v-3c2.5 1.5 6.5 2 10.5.5-3-3-3.5-6-3.5-11.5 0-6.5-3.5-12-11.5-12z" +
        "M6 40c0-8 5-12.5 11-13.5h10c6 1 11 5.5 11 13.5z",
    other: "M22 2.5a8 8 0 1 0 .01 0zM5.5 38.7v-3c0-8 7-12 16.5-12s16.5 4 16.5 12v3z",
};
