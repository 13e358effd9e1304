// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

namespace olvane::cli {

// A script that no font of the machine shows, and the package of Debian that has one.
struct MissingScript {
    std::string script;
    std::string package;
};

// Which scripts of the texts that an SVG draws have a character that hasFont says no to, each once, in the order of
// their first character. Characters that draw nothing need no font.
std::vector<MissingScript> missingScripts(std::string_view svg,
                                          const std::function<bool(std::uint32_t)>& hasFont);

// "no font shows Thai (in Debian: fonts-thai-tlwg)"; empty for nothing that is missing.
std::string missingFontsText(const std::vector<MissingScript>& missing);

}  // namespace olvane::cli
