// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Stands in for the page where it could not be built, because no compiler for browsers is installed.

#include <cli/PageTemplate.h>

namespace olvane::cli {

std::string_view pageTemplate() {
    return {};
}

}  // namespace olvane::cli
