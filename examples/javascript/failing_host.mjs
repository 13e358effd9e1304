// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
// A database that breaks down in the middle of a layout, and what its program learns of that.

import { HostError, loadOlvane } from "olvane";

const brokenFamily = {
    fatherOf: () => null,
    motherOf: () => null,
    spousesOf: () => [],
    childrenOf() {
        throw new Error("the database is closed");
    },
    isPreferredSpouse: () => false,
    isDead: () => false,
    dateOf: () => "",
    sexOf: () => 0,
};

const olvane = await loadOlvane();
try {
    olvane.layout(brokenFamily, 17);
} catch (error) {
    if (!(error instanceof HostError)) throw error;
    console.log(`${error.status}, ${error.records.length} records: ${error.cause.message}`);
}
