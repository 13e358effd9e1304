// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Text of East Asian encodings. The platform knows the characters; where they begin and end must be known here, to
// bring together those that a line end parts.

#include <olvane/gedcom/MultiByteTextInternal.h>

#include <cstddef>
#include <string_view>
#include <utility>

#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/PlatformDecoderInternal.h>

namespace olvane::gedcom {
namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

bool isLineEnd(char c) {
    return c == '\n' || c == '\r';
}

// Bytes of the character that begins with this one: two above ASCII, but for single kana of Shift_JIS, the third set of
// EUC-JP, and characters of four bytes in GB18030, whose second is a digit.
std::size_t characterLength(std::string_view rest, const KnownEncoding& encoding) {
    const auto first = static_cast<unsigned char>(rest.front());
    if (first <= 0x80) return 1;
    if (encoding.name == "Shift_JIS" && first >= 0xA0 && first <= 0xDF) return 1;
    if (encoding.name == "EUC-JP" && first == 0x8F) return 3;
    const bool digitNext = rest.size() > 1 && rest[1] >= '0' && rest[1] <= '9';
    const bool chinese = encoding.name == "GBK" || encoding.name == "GB18030";
    return chinese && digitNext ? 4 : 2;
}

// The bytes with each cut character before the line end that cut it.
std::string withWholeCharacters(std::string_view bytes, const KnownEncoding& encoding) {
    std::string whole;
    whole.reserve(bytes.size());
    while (!bytes.empty()) {
        const std::size_t length = characterLength(bytes, encoding);
        std::size_t here = 1;
        while (here < length && here < bytes.size() && !isLineEnd(bytes[here])) ++here;
        whole += bytes.substr(0, here);
        bytes.remove_prefix(here);
        const std::size_t gap = here < length ? findConcText(bytes) : std::string_view::npos;
        if (gap == std::string_view::npos || bytes.size() - gap < length - here) continue;
        whole += bytes.substr(gap, length - here);
        whole += bytes.substr(0, gap);
        bytes.remove_prefix(gap + length - here);
    }
    return whole;
}

std::size_t countReplacements(std::string_view text) {
    std::size_t count = 0;
    for (std::size_t at = text.find(kReplacement); at != std::string_view::npos;
         at = text.find(kReplacement, at + kReplacement.size())) {
        ++count;
    }
    return count;
}

}  // namespace

bool turnMultiByte(std::string& bytes, const KnownEncoding& encoding, DiagnosticList& diagnostics) {
    auto text = decodedByPlatform(encoding, withWholeCharacters(bytes, encoding));
    if (!text) return false;
    bytes = std::move(*text);
    if (const std::size_t faults = countReplacements(bytes); faults != 0) {
        diagnostics.add(DiagnosticKind::badCharacter, Severity::error, 0,
                        DiagnosticPhrase{DiagnosticSentence::faultsInText,
                                         {std::string(encoding.name), std::to_string(faults)}},
                        DiagnosticSentence::maybeOtherEncoding);
    }
    return true;
}

}  // namespace olvane::gedcom
