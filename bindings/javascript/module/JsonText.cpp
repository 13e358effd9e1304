// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Strings as JSON has them: quotes, backslashes and control characters are escaped, everything else stands.

#include "JsonText.h"

namespace olvane::js {

void JsonText::string(std::string_view value) {
    constexpr const char* kDigits = "0123456789abcdef";
    separate();
    text_ += '"';
    for (const char c : value) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte < 0x20) {
            text_ += "\\u00";
            text_ += kDigits[byte >> 4];
            text_ += kDigits[byte & 15];
            continue;
        }
        if (c == '"' || c == '\\') text_ += '\\';
        text_ += c;
    }
    text_ += '"';
}

}  // namespace olvane::js
