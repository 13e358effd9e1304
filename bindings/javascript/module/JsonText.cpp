// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Strings as JSON has them: quotes, backslashes and control characters are escaped, everything else stands.

#include "JsonText.h"

namespace olvane::js {

void JsonText::string(std::string_view value) {
    constexpr const char* kDigits = "0123456789abcdef";
    separate();
    text_ += '"';
    // What needs no escape, which is nearly everything, goes over in runs.
    std::size_t begin = 0;
    for (std::size_t at = 0; at < value.size(); ++at) {
        const auto byte = static_cast<unsigned char>(value[at]);
        if (byte >= 0x20 && byte != '"' && byte != '\\') continue;
        text_.append(value, begin, at - begin);
        begin = at + 1;
        if (byte >= 0x20) {
            text_ += '\\';
            text_ += value[at];
        } else {
            text_ += "\\u00";
            text_ += kDigits[byte >> 4];
            text_ += kDigits[byte & 15];
        }
    }
    text_.append(value, begin);
    text_ += '"';
}

}  // namespace olvane::js
