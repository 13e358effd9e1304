// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include <olvane/kin/PersonIndex.h>

namespace olvane::js {

// What a search finds, at most limit persons, in the order that search.mjs reads: for each the id, the fit, and the
// reasons with the text of the record in which each was found.
std::string searchJson(const kin::PersonIndex& index, const kin::SearchTexts& texts, std::string_view text,
                       std::size_t limit);

}  // namespace olvane::js
