// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string_view>

namespace olvane::picture {

// Takes a text piece by piece, in order; a character may be cut between two pieces. A piece is valid only during the call.
// What writes to a sink holds no more of the text at once than a piece, whatever the length of the names in it.
using TextSink = std::function<void(std::string_view piece)>;

}  // namespace olvane::picture
