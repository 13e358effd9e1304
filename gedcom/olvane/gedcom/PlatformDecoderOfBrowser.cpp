// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Encodings where JavaScript is at hand: the module asks its TextDecoder, and so carries no tables.

#include <olvane/gedcom/PlatformDecoderInternal.h>

#include <cstring>

// Passes the text to composed_text, once. Returns 0 where the label is not known; nothing is passed then.
extern "C" __attribute__((import_module("olvane"), import_name("decode"))) int decodeByBrowser(
    const char* label, std::size_t labelLength, const char* bytes, std::size_t length, void* result);

namespace olvane::gedcom {

std::optional<std::string> decodedByPlatform(const KnownEncoding& encoding, std::string_view bytes) {
    if (encoding.browserLabel == nullptr) return {};
    std::string text;
    const int known = decodeByBrowser(encoding.browserLabel, std::strlen(encoding.browserLabel), bytes.data(),
                                      bytes.size(), &text);
    if (known == 0) return {};
    return text;
}

}  // namespace olvane::gedcom
