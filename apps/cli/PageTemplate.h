// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace olvane::cli {

// The viewer page without a family: HTML that holds the engine and the page's code. Empty in a command that was
// built without it.
std::string_view pageTemplate();

}  // namespace olvane::cli
