// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Normal forms where JavaScript is at hand, which knows them: the module asks it, and so carries no tables.

#include <olvane/gedcom/UnicodeTextInternal.h>

// Hands the composed form back by composedText, once. Nothing is handed back for a text that is ill-formed.
extern "C" __attribute__((import_module("olvane"), import_name("compose"))) void composeByBrowser(
    const char* text, std::size_t length, void* result);

extern "C" __attribute__((export_name("composed_text"))) void composedText(void* result, const char* text,
                                                                           std::size_t length) {
    static_cast<std::string*>(result)->assign(text, length);
}

namespace olvane::gedcom {

std::string composed(const std::string& text) {
    if (isAscii(text)) return text;
    std::string result;
    composeByBrowser(text.data(), text.size(), &result);
    return result.empty() ? text : result;
}

}  // namespace olvane::gedcom
