// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <optional>

namespace olvane::cli {

// The time that outputs are to be dated with: SOURCE_DATE_EPOCH of the environment, in seconds since 1970, as
// https://reproducible-builds.org/specs/source-date-epoch has it. Empty where it is not set or empty.
// Fails: throws UsageError where it is no whole number from 0 to the end of the year 9999.
std::optional<std::chrono::sys_seconds> sourceDate();

}  // namespace olvane::cli
