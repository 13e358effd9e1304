// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace olvane::cli {

// The same PDF with every page larger by that factor: its unit is a multiple of a point (ISO 32000-1, 7.7.3.3,
// UserUnit, of version 1.6), which is how pages beyond 14,400 points are written. Appended as an update, so that no
// offset changes.
//
// Holds: pdf has one classic table of cross-references, as cairo writes it.
// Fails: std::runtime_error where it has none.
std::string withUserUnit(std::string pdf, int unit);

}  // namespace olvane::cli
