// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which options change which views, as far as tests without an engine need it; the engine's own table is compared with the
// rows of views.json by the tests of the JavaScript package.

import { kViewNames, learnOptions, type ViewName } from "../src/base/views";

const trees: readonly ViewName[] = ["near", "ancestors", "descendants", "hourglass", "relatives"];
const directed: readonly ViewName[] = [...trees, "kinship", "everybody"];

learnOptions([
    { name: "view", views: kViewNames },
    { name: "shown", views: ["family", "near"] },
    { name: "up", views: ["ancestors", "hourglass", "relatives", "fan"] },
    { name: "down", views: ["descendants", "hourglass", "relatives", "fan"] },
    { name: "direction", views: directed },
    { name: "compact", views: directed },
    { name: "folded", views: trees },
    { name: "unknownParents", views: ["family", "pedigree"] },
]);
