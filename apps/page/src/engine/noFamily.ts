// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Stands in for the binding's family.mjs in the page, where no program has a family of its own.

export class Family {}
