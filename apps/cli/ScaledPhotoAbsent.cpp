// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Stands in for the scaling of photographs in a command that was built without libraries for pictures.

#include <cli/ScaledPhoto.h>

#include <cli/UsageError.h>

namespace olvane::cli {

std::optional<std::string> scaledPhoto(const std::string&, int) {
    throw UsageError("this olvane was built without librsvg, so it cannot scale photographs");
}

}  // namespace olvane::cli
