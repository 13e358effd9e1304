// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include <olvane/gedcom/DiagnosticListInternal.h>
#include <olvane/gedcom/TextArenaInternal.h>
#include <olvane/gedcom/TextEncodingInternal.h>

namespace olvane::gedcom {

// The text of a file: its bytes, made fit to be cut into lines, and what was made of them.
struct TextStore {
    std::string bytes;
    TextArena arena;
};

// Makes values fit to be kept: decoded, without doubled @, without control characters, trimmed. Most values
// are so already and are kept as a view into the bytes.
//
// Holds: what is kept is well-formed UTF-8 on one line.
class TextInterner {
public:
    TextInterner(TextStore& store, const TextForm& form, DiagnosticList& diagnostics)
        : store_(store), form_(form), diagnostics_(diagnostics) {}

    std::string_view keep(std::string_view raw, std::uint32_t line);
    // The same, but with its line ends.
    std::string_view keepLines(std::string_view raw, std::uint32_t line);
    // For text that was made of kept texts.
    std::string_view keepMade(std::string_view text) { return store_.arena.keep(text); }

private:
    std::string_view keepAs(std::string_view raw, std::uint32_t line, bool keepsLineEnds);
    bool isPlain(std::string_view raw) const;
    bool liesInBytes(std::string_view text) const;
    std::string decoded(std::string_view raw, std::uint32_t line);
    void unescapeAt(std::string& text) const;
    void removeControls(std::string& text, std::uint32_t line, bool keepsLineEnds);

    TextStore& store_;
    const TextForm& form_;
    DiagnosticList& diagnostics_;
};

}  // namespace olvane::gedcom
