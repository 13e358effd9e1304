// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The two roads by which anything gets into a picture: escaped text and numbers.

#include <olvane/draw/SvgTextInternal.h>

#include <cmath>

#include <olvane/draw/TextMeasureInternal.h>

namespace olvane::draw {

std::string escaped(std::string_view text) {
    std::string result;
    for (const char c : cleanText(text)) {
        switch (c) {
            case '&':
                result += "&amp;";
                break;
            case '<':
                result += "&lt;";
                break;
            case '>':
                result += "&gt;";
                break;
            case '"':
                result += "&quot;";
                break;
            case '\'':
                result += "&#39;";
                break;
            default:
                result += c;
        }
    }
    return result;
}

std::string px(double value) {
    const long long tenths = std::llround(value * 10);
    const long long size = tenths < 0 ? -tenths : tenths;
    std::string text = tenths < 0 ? "-" : "";
    text += std::to_string(size / 10);
    if (size % 10 != 0) text += "." + std::to_string(size % 10);
    return text;
}

std::string cutText(std::string_view text) {
    constexpr std::size_t kMostBytes = 1000;
    if (text.size() <= kMostBytes) return std::string(text);
    std::size_t end = kMostBytes;
    while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80) --end;
    return std::string(text.substr(0, end)) + "\xE2\x80\xA6";
}

}  // namespace olvane::draw
