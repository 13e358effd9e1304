// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace olvane::draw {

// Text for element content and for attributes in double quotes: cleaned, with everything that could be markup
// written as an entity.
std::string escaped(std::string_view text);

// A number of px with at most one decimal, the same on every machine: "12", "-0.5".
std::string px(double value);

// Parts of a text that put and joined write: a number as px has it, a whole number, a text as escaped has it.
struct Number {
    double value;
};
inline Number number(double value) {
    return {value};
}
struct Whole {
    long long value;
};
inline Whole whole(long long value) {
    return {value};
}
struct Escaped {
    std::string_view text;
};
void append(std::string& svg, std::string_view text);
void append(std::string& svg, Number part);
void append(std::string& svg, Whole part);
void append(std::string& svg, Escaped part);

// Appends the parts one after the other, without making texts of their own of them.
template <class... Parts>
void put(std::string& svg, const Parts&... parts) {
    (append(svg, parts), ...);
}

template <class... Parts>
std::string joined(const Parts&... parts) {
    std::string text;
    put(text, parts...);
    return text;
}

}  // namespace olvane::draw
