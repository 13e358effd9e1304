// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace olvane::picture {

// Values of Grapheme_Cluster_Break (UAX 29), and Extended_Pictographic, which excludes them.
enum class GraphemeClass : std::uint8_t {
    other,
    cr,
    lf,
    control,
    extend,
    zwj,
    regionalIndicator,
    prepend,
    spacingMark,
    l,
    v,
    t,
    lv,
    lvt,
    pictographic
};

// Values of Line_Break (UAX 14) by their short names, resolved by LB1. cpWide and opWide are CP and OP of East
// Asian width; idPict is unassigned and Extended_Pictographic.
enum class LineClass : std::uint8_t {
    al,
    b2,
    ba,
    bb,
    bk,
    cb,
    cl,
    cm,
    cp,
    cpWide,
    cr,
    eb,
    em,
    ex,
    gl,
    h2,
    h3,
    hl,
    hy,
    id,
    idPict,
    in,
    is,
    jl,
    jt,
    jv,
    lf,
    nl,
    ns,
    nu,
    op,
    opWide,
    po,
    pr,
    qu,
    ri,
    sp,
    sy,
    wj,
    zw,
    zwj
};

// none: draws nothing of its own, or on the letter before it.
enum class WidthClass : std::uint8_t { usual, none, wide, emoji };

enum class DirectionClass : std::uint8_t { neutral, leftToRight, rightToLeft };

struct TextProperties {
    GraphemeClass grapheme = GraphemeClass::other;
    LineClass line = LineClass::al;
    WidthClass width = WidthClass::usual;
    DirectionClass direction = DirectionClass::neutral;
};

// A character that is none (-1 as well) is like U+FFFD.
TextProperties textPropertiesOf(std::int32_t character);

// Reads the character at the front of a text that is not empty; -1 for a byte that begins none in strict UTF-8.
// size becomes the number of its bytes, at least 1.
std::int32_t decodeFront(std::string_view text, std::size_t& size);

// Calls visit(character, its bytes) for each character of a text.
template <class Visit>
void forEachCharacter(std::string_view text, Visit visit) {
    while (!text.empty()) {
        std::size_t size = 1;
        const std::int32_t character = decodeFront(text, size);
        visit(character, text.substr(0, size));
        text.remove_prefix(size);
    }
}

// The table: characters in runs that have one record; lengths of runs are packed, seven bits a byte, low ones
// first. Hangul syllables have the record of the first one.
struct TextRecord {
    std::uint8_t grapheme;
    std::uint8_t line;
    std::uint8_t width;
    std::uint8_t direction;
};
extern const TextRecord kTextRecords[];
extern const std::uint8_t kTextRunLengths[];
extern const std::uint8_t kTextRunRecords[];
extern const std::size_t kTextRunCount;

}  // namespace olvane::picture
