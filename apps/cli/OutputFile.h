// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace olvane::cli {

// Writes a whole file or nothing: first beside its place, then moved there, so that a failure leaves what was
// there before. "-" is the standard output; a device or pipe is written straight.
// Fails: throws UsageError; no partial file is left.
void writeOutput(const std::string& path, std::string_view content);

// Writes to the standard output and makes sure that it arrived. A signal that is only marked does not cut it.
// Fails: throws UsageError.
void writeStandardOutput(std::string_view content);

}  // namespace olvane::cli
