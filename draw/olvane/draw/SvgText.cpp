// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The two ways by which anything gets into a picture: escaped text and numbers.

#include <olvane/draw/SvgTextInternal.h>

#include <cmath>

#include <olvane/picture/TextMetrics.h>

namespace olvane::draw {

namespace {

std::string_view entityOf(char c) {
    switch (c) {
        case '&':
            return "&amp;";
        case '<':
            return "&lt;";
        case '>':
            return "&gt;";
        case '"':
            return "&quot;";
        case '\'':
            return "&#39;";
        default:
            return {};
    }
}

}  // namespace

void append(std::string& svg, std::string_view text) {
    svg += text;
}

void append(std::string& svg, Number part) {
    const long long tenths = std::llround(part.value * 10);
    const long long size = tenths < 0 ? -tenths : tenths;
    if (tenths < 0) svg += '-';
    append(svg, whole(size / 10));
    if (size % 10 == 0) return;
    svg += '.';
    svg += static_cast<char>('0' + size % 10);
}

void append(std::string& svg, Whole part) {
    svg += std::to_string(part.value);
}

void append(std::string& svg, Escaped part) {
    for (const char c : picture::cleanText(part.text)) {
        const std::string_view entity = entityOf(c);
        if (entity.empty()) {
            svg += c;
        } else {
            svg += entity;
        }
    }
}

std::string escaped(std::string_view text) {
    return joined(Escaped{text});
}

std::string px(double value) {
    return joined(number(value));
}

}  // namespace olvane::draw
