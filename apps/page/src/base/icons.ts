// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The small pictures on buttons: strokes on a square of 24 px.

import type { Sex } from "olvane";
import { svg } from "./dom";
import { kSilhouettes } from "./silhouettes";

const kPaths = {
    search: "M10.5 4a6.5 6.5 0 1 0 .01 0zM15.5 15.5 20 20",
    back: "M15 5l-7 7 7 7",
    forward: "M9 5l7 7-7 7",
    plus: "M12 5v14M5 12h14",
    minus: "M5 12h14",
    fit: "M4 9V4h5M15 4h5v5M20 15v5h-5M9 20H4v-5",
    home: "M12 3v4M12 17v4M3 12h4M17 12h4M12 9a3 3 0 1 0 .01 0z",
    options: "M4 7h9M17 7h3M15 4.5v5M4 17h3M11 17h9M9 14.5v5",
    file: "M12 4v11M7.5 11l4.5 4.5 4.5-4.5M4 19.5h16",
    panel: "M4 5h16v14H4zM14.5 5v14",
    close: "M6 6l12 12M18 6L6 18",
    warning: "M12 4L2.8 20h18.4zM12 10v4.5M12 17.2v.3",
    family: "M12 4v6M6 14v-4h12v4M4 14h4v5H4zM16 14h4v5h-4zM10 2.5h4v3h-4z",
    pedigree: "M3 10h4v4H3zM7 12h4M11 6v12M11 6h4M11 18h4M15 4h5v4h-5zM15 16h5v4h-5z",
    views: "M4 4h6v6H4zM14 4h6v6h-6zM4 14h6v6H4zM14 14h6v6h-6z",
    near: "M9 9h6v6H9zM3 3h4v4H3zM17 3h4v4h-4zM3 17h4v4H3zM17 17h4v4h-4zM7 5h10M12 5v4M12 15v4M7 19h10",
    ancestors: "M9.5 16h5v5h-5zM3 3h5v5H3zM16 3h5v5h-5zM5.5 8v4h13V8M12 12v4",
    descendants: "M9.5 3h5v5h-5zM3 16h5v5H3zM16 16h5v5h-5zM5.5 16v-4h13v4M12 12V8",
    hourglass:
        "M10 10h4v4h-4zM4 3h4v4H4zM16 3h4v4h-4zM4 17h4v4H4zM16 17h4v4h-4zM8 7l2.5 3M16 7l-2.5 3M8 17l2.5-3M16 17l-2.5-3",
    relatives: "M10 3h4v4h-4zM3 11h4v4H3zM10 11h4v4h-4zM17 11h4v4h-4zM5 11V9h14v2M12 7v4M12 15v6M8 21h8",
    fan: "M12 21L3 10a14 14 0 0 1 18 0zM7.5 15.5a7 7 0 0 1 9 0M12 21V7",
    kinship: "M4 17h5v4H4zM15 17h5v4h-5zM9.5 3h5v4h-5zM6.5 17v-5h11v5M12 7v5",
    everybody:
        "M3 3h3v3H3zM10.5 3h3v3h-3zM18 3h3v3h-3zM3 10.5h3v3H3zM10.5 10.5h3v3h-3zM18 10.5h3v3h-3zM3 18h3v3H3zM10.5 18h3v3h-3zM18 18h3v3h-3z",
    map: "M3 6l6-2.5 6 2.5 6-2.5v14.5L15 20.5 9 18l-6 2.5zM9 3.5V18M15 6v14.5",
    up: "M6 15l6-6 6 6",
    duplicates: "M5 9h10v10H5zM9 9V5h10v10h-4",
    lock: "M6 11h12v9H6zM8.5 11V8a3.5 3.5 0 0 1 7 0v3",
} as const;

export type IconName = keyof typeof kPaths;

export function icon(name: IconName): SVGSVGElement {
    const picture = svg("svg", {
        class: "icon",
        viewBox: "0 0 24 24",
        "aria-hidden": "true",
        focusable: "false",
    });
    picture.append(svg("path", { d: kPaths[name] }));
    return picture;
}

export function silhouette(sex: Sex): SVGSVGElement {
    const picture = svg("svg", {
        class: "silhouette " + sex,
        viewBox: "0 0 44 42",
        "aria-hidden": "true",
        focusable: "false",
    });
    picture.append(svg("path", { d: kSilhouettes[sex] }));
    return picture;
}
