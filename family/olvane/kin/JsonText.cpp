// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Strings as JSON has them: quotes, backslashes and control characters are escaped, everything else stands.

#include <cstddef>

#include <olvane/kin/KinJson.h>

namespace olvane::kin {

void appendJsonText(std::string& json, std::string_view text) {
    constexpr std::string_view kDigits = "0123456789abcdef";
    json += '"';
    // What needs no escape, which is nearly everything, goes over in runs.
    std::size_t begin = 0;
    for (std::size_t at = 0; at < text.size(); ++at) {
        const auto byte = static_cast<unsigned char>(text[at]);
        if (byte >= 0x20 && byte != '"' && byte != '\\') continue;
        json.append(text, begin, at - begin);
        begin = at + 1;
        if (byte >= 0x20) {
            json += '\\';
            json += text[at];
        } else {
            json += "\\u00";
            json += kDigits[byte >> 4];
            json += kDigits[byte & 15];
        }
    }
    json.append(text, begin);
    json += '"';
}

std::string jsonText(std::string_view text) {
    std::string json;
    appendJsonText(json, text);
    return json;
}

}  // namespace olvane::kin
