// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace olvane::cli {

// All of some texts as one, with the separator between them. Empty ones in front leave nothing.
template <class Texts>
std::string joined(const Texts& texts, std::string_view separator) {
    std::string all;
    for (const std::string_view text : texts) {
        if (!all.empty()) all += separator;
        all += text;
    }
    return all;
}

}  // namespace olvane::cli
