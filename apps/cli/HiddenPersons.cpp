// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/HiddenPersons.h>

#include <algorithm>
#include <chrono>

#include <cli/LivingPersons.h>
#include <cli/SourceDate.h>

namespace olvane::cli {

std::vector<bool> hiddenPersons(const gedcom::GedcomData& data, const HidingOptions& options) {
    if (!options.hideLiving) return {};
    return livingPersons(data, options.year != 0 ? options.year : presentYear());
}

int presentYear() {
    auto time = std::chrono::floor<std::chrono::seconds>(std::chrono::system_clock::now());
    if (const auto date = sourceDate()) time = std::min(time, *date);
    return static_cast<int>(std::chrono::year_month_day(std::chrono::floor<std::chrono::days>(time)).year());
}

}  // namespace olvane::cli
