// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Names of media as names of an archive's members. Version 7.0 writes them as relative addresses, older files as paths.

#include <olvane/gedcom/GedcomMedia.h>

namespace olvane::gedcom {
namespace {

int hexDigit(char c) {
    if (c >= '0' && c <= '9') return c - '0';
    if (c >= 'A' && c <= 'F') return c - 'A' + 10;
    return c >= 'a' && c <= 'f' ? c - 'a' + 10 : -1;
}

std::string withoutPercents(std::string_view text) {
    std::string plain;
    for (std::size_t at = 0; at < text.size(); ++at) {
        const int high = text[at] == '%' && at + 2 < text.size() ? hexDigit(text[at + 1]) : -1;
        const int low = high < 0 ? -1 : hexDigit(text[at + 2]);
        plain += low < 0 ? text[at] : static_cast<char>(high * 16 + low);
        if (low >= 0) at += 2;
    }
    return plain;
}

bool climbs(std::string_view path) {
    for (;;) {
        const std::size_t slash = path.find('/');
        const std::string_view step = path.substr(0, slash);
        if (step == ".." || step == "." || step.empty()) return true;
        if (slash == std::string_view::npos) return false;
        path.remove_prefix(slash + 1);
    }
}

}  // namespace

std::optional<std::string> memberOfArchive(std::string_view file) {
    constexpr std::string_view kForbidden("\\:\0", 3);
    std::string path = withoutPercents(file);
    if (path.find_first_of(kForbidden) != std::string::npos || climbs(path)) return {};
    return path;
}

}  // namespace olvane::gedcom
