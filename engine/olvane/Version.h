// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// The version of these headers, by the rules of semantic versions: while the major number is 0, each minor number may
// break what the one before promised. docs/promises.md says what is promised.
#define OLVANE_VERSION_MAJOR 0
#define OLVANE_VERSION_MINOR 1
#define OLVANE_VERSION_PATCH 0
