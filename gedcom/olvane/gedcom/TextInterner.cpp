// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Values on their way from the file to the records. Nearly all are plain ASCII or sound UTF-8 and cost one
// look.

#include <olvane/gedcom/TextInternerInternal.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <functional>

#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom {
namespace {

bool isControl(char c) {
    return static_cast<unsigned char>(c) < 0x20 || c == 0x7F;
}

// What a character asks of a value that holds it.
enum Demand : unsigned char { kNothing = 0, kDecoding = 1, kCare = 2 };

constexpr std::array<unsigned char, 256> kDemands = [] {
    std::array<unsigned char, 256> demands{};
    for (std::size_t c = 0; c < demands.size(); ++c) {
        demands[c] = c < 0x20 || c == 0x7F || c == '@' ? kCare : (c >= 0x80 ? kDecoding : kNothing);
    }
    return demands;
}();

bool isWhiteControl(char c) {
    return c == '\t' || c == '\n' || c == '\r' || c == '\v' || c == '\f';
}

}  // namespace

bool TextInterner::isPlain(std::string_view raw) const {
    unsigned demands = 0;
    for (const char c : raw) demands |= kDemands[static_cast<unsigned char>(c)];
    return demands == kNothing || (demands == kDecoding && form_.coding == ValueCoding::utf8 && isUtf8(raw));
}

bool TextInterner::liesInBytes(std::string_view text) const {
    const std::string& bytes = store_.bytes;
    const std::less<const char*> before;
    return !before(text.data(), bytes.data()) && before(text.data(), bytes.data() + bytes.size());
}

std::string_view TextInterner::keep(std::string_view raw, std::uint32_t line) {
    return keepAs(raw, line, false);
}

std::string_view TextInterner::keepLines(std::string_view raw, std::uint32_t line) {
    return keepAs(raw, line, true);
}

std::string_view TextInterner::keepAs(std::string_view raw, std::uint32_t line, bool keepsLineEnds) {
    raw = trimmed(raw);
    if (isPlain(raw)) return liesInBytes(raw) ? raw : store_.arena.keep(raw);
    std::string text = decoded(raw, line);
    unescapeAt(text);
    removeControls(text, line, keepsLineEnds);
    return store_.arena.keep(trimmed(text));
}

std::string TextInterner::decoded(std::string_view raw, std::uint32_t line) {
    std::size_t faults = 0;
    std::string text = decodeText(raw, form_, faults);
    if (faults != 0) {
        diagnostics_.add(DiagnosticKind::badCharacter, Severity::warning, line,
                         DiagnosticPhrase{DiagnosticSentence::faultsInValue,
                                          {std::to_string(faults), std::string(form_.encoding->name)}},
                         DiagnosticSentence::asWellAsCanBe, text);
    }
    return text;
}

void TextInterner::unescapeAt(std::string& text) const {
    if (!form_.doublesEveryAt) {
        if (text.starts_with("@@")) text.erase(0, 1);
        return;
    }
    std::size_t kept = 0;
    for (std::size_t at = 0; at < text.size(); ++at) {
        text[kept++] = text[at];
        if (text[at] == '@' && at + 1 < text.size() && text[at + 1] == '@') ++at;
    }
    text.resize(kept);
}

void TextInterner::removeControls(std::string& text, std::uint32_t line, bool keepsLineEnds) {
    const auto isKept = [keepsLineEnds](char c) { return keepsLineEnds && c == '\n'; };
    std::replace_if(
        text.begin(), text.end(), [&](char c) { return isWhiteControl(c) && !isKept(c); }, ' ');
    const std::size_t removed = std::erase_if(text, [&](char c) { return isControl(c) && !isKept(c); });
    if (removed == 0) return;
    diagnostics_.add(DiagnosticKind::controlCharacter, Severity::warning, line,
                     DiagnosticPhrase{DiagnosticSentence::controlCharacters, {std::to_string(removed)}},
                     DiagnosticSentence::leftOut, text);
}

}  // namespace olvane::gedcom
