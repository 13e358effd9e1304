// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace olvane::cli {

// UTF-8 text as a terminal may show it: characters that command a terminal or reorder what stands around them are
// written as \u202E, the form of JSON. These are the control characters but tab and line feed, C1 controls, line and
// paragraph separators, and the embeddings, overrides and isolates of the bidirectional algorithm (UAX 9). A byte that
// is no UTF-8 stays.
std::string visibleText(std::string_view text);

// visibleText where the descriptor is a terminal; else the text as it is, for other programs.
std::string textFor(int descriptor, std::string_view text);

}  // namespace olvane::cli
