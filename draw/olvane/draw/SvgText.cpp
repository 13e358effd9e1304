// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The two roads by which anything gets into a picture: escaped text and numbers.

#include <olvane/draw/SvgTextInternal.h>

#include <cmath>

#include <olvane/picture/TextMetrics.h>

namespace olvane::draw {

std::string escaped(std::string_view text) {
    std::string result;
    for (const char c : picture::cleanText(text)) {
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

}  // namespace olvane::draw
