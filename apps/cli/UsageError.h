// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <stdexcept>
#include <string>

namespace olvane::cli {

// Something that the user has to change: a wrong file, a person who does not exist, a place that cannot be
// written. The command ends with status 2 and what() on stderr, one line or more, the first behind "olvane:
// ".
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

}  // namespace olvane::cli
