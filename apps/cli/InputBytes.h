// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace olvane::cli {

// All bytes of the standard input, for a path of "-", or of a file or pipe.
// Fails: throws UsageError.
std::string readInputBytes(const std::string& path);

// What the input is called in messages: "standard input", or the path.
std::string inputName(const std::string& path);

}  // namespace olvane::cli
