// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/FontCoverage.h>

#include <algorithm>
#include <array>

#include <olvane/picture/TextMetrics.h>

namespace olvane::cli {

namespace {

struct ScriptRange {
    std::uint32_t first;
    std::uint32_t last;
    std::string_view script;
    std::string_view package;
};

constexpr std::string_view kCore = "fonts-noto-core";
constexpr std::string_view kCjk = "fonts-noto-cjk";
constexpr auto kScripts = std::to_array<ScriptRange>({
    {0x0020, 0x024F, "Latin", "fonts-dejavu-core"},
    {0x0370, 0x03FF, "Greek", "fonts-dejavu-core"},
    {0x0400, 0x052F, "Cyrillic", "fonts-dejavu-core"},
    {0x0530, 0x058F, "Armenian", kCore},
    {0x0590, 0x05FF, "Hebrew", kCore},
    {0x0600, 0x08FF, "Arabic", kCore},
    {0x0900, 0x097F, "Devanagari", kCore},
    {0x0980, 0x0DFF, "a script of India", kCore},
    {0x0E00, 0x0E7F, "Thai", "fonts-thai-tlwg"},
    {0x10A0, 0x10FF, "Georgian", kCore},
    {0x1100, 0x11FF, "Korean", kCjk},
    {0x2600, 0x27BF, "symbols and emoji", "fonts-noto-color-emoji"},
    {0x2E80, 0x303F, "Chinese and Japanese", kCjk},
    {0x3040, 0x30FF, "Japanese", kCjk},
    {0x3100, 0x9FFF, "Chinese and Japanese", kCjk},
    {0xAC00, 0xD7FF, "Korean", kCjk},
    {0xF900, 0xFAFF, "Chinese and Japanese", kCjk},
    {0xFB50, 0xFDFF, "Arabic", kCore},
    {0xFE70, 0xFEFF, "Arabic", kCore},
    {0xFF00, 0xFFEF, "Chinese and Japanese", kCjk},
    {0x1F000, 0x1FAFF, "emoji", "fonts-noto-color-emoji"},
    {0x20000, 0x3FFFF, "Chinese and Japanese", kCjk},
});

MissingScript scriptOf(std::uint32_t character) {
    for (const ScriptRange& range : kScripts) {
        if (character >= range.first && character <= range.last) {
            return {std::string(range.script), std::string(range.package)};
        }
    }
    return {"some of its characters", std::string(kCore)};
}

std::uint32_t characterOf(std::string_view bytes) {
    const auto lead = static_cast<unsigned char>(bytes[0]);
    if (bytes.size() == 1) return lead;
    std::uint32_t character = lead & (0x7Fu >> bytes.size());
    for (const char c : bytes.substr(1))
        character = (character << 6u) | (static_cast<unsigned char>(c) & 0x3Fu);
    return character;
}

// Bytes of the character at the front of valid UTF-8.
std::size_t sizeOfFront(std::string_view text) {
    const auto lead = static_cast<unsigned char>(text[0]);
    const std::size_t size = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : lead >= 0xC0 ? 2 : 1;
    return std::min(size, text.size());
}

// Calls visit(character) for each character that is drawn.
template <class Visit>
void forEachDrawn(std::string_view svg, Visit visit) {
    for (std::size_t at = svg.find("<text"); at != std::string_view::npos; at = svg.find("<text", at)) {
        at = std::min(svg.find('>', at), svg.size());
        const std::size_t end = std::min(svg.find("</text>", at), svg.size());
        while (at < end) {
            const std::size_t size = sizeOfFront(svg.substr(at));
            visit(svg.substr(at, size));
            at += size;
        }
    }
}

}  // namespace

std::vector<MissingScript> missingScripts(std::string_view svg,
                                          const std::function<bool(std::uint32_t)>& hasFont) {
    std::vector<MissingScript> missing;
    std::vector<std::uint32_t> seen;
    forEachDrawn(svg, [&](std::string_view bytes) {
        const std::uint32_t character = characterOf(bytes);
        if (character < 0x80) return;
        const auto place = std::lower_bound(seen.begin(), seen.end(), character);
        if (place != seen.end() && *place == character) return;
        seen.insert(place, character);
        if (picture::textWidth(bytes, {}) == 0 || hasFont(character)) return;
        MissingScript script = scriptOf(character);
        const bool isKnown = std::any_of(missing.begin(), missing.end(), [&](const MissingScript& known) {
            return known.script == script.script;
        });
        if (!isKnown) missing.push_back(std::move(script));
    });
    return missing;
}

std::string missingFontsText(const std::vector<MissingScript>& missing) {
    std::string text;
    for (const MissingScript& script : missing) {
        text += (text.empty() ? "no font shows " : ", and none shows ") + script.script +
                " (in Debian: " + script.package + ")";
    }
    return text;
}

}  // namespace olvane::cli
