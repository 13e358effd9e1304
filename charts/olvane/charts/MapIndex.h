// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <span>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/Export.h>
#include <olvane/charts/ChartProgress.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/kin/PersonCaption.h>

namespace olvane::charts {

// Everybody as a map: places, lines, kin and names, in the order in which they are looked up.
//
// The persons are their own spatial index. Boxes of one row never overlap, so a row sorted by x answers "who is between
// here and there" by bisection, and "who is the first in this column of pixels" as well; a tree of rectangles would
// take 20 bytes a person more and answer slower. Lines are sorted in the same way within bands: band 0 lies above the
// first row, band i from row i - 1 to the next row, and the last band has the pieces that pass whole rows.
//
// Units: quarters of a point; x grows right, y grows down. A person is a place in the persons' lists, from 0.
// Holds: rows are sorted by y, the persons of a row by x, the bars of a band by x1, its uprights by x, marks by person.
// Memory: about 55 bytes a person and the names.
struct OLVANE_API MapIndex {
    static constexpr std::int32_t kUnit = 4;      // in a point
    static constexpr std::int32_t kNobody = -1;   // a partner who is not known
    static constexpr std::uint8_t kSexMask = 3;   // of Flags: kin::Sex
    static constexpr std::uint8_t kJoined = 4;    // a line of marriage leads to the next person of the row
    static constexpr std::uint8_t kDivorced = 8;  // of that marriage
    static constexpr std::uint8_t kSurnameLast = 16;  // the whole name is names, a space and surnames
    static constexpr std::int32_t kChildBits = 28;    // of children; a kin::ChildKind lies above them
    static constexpr std::uint32_t kPersonLabel = 0x80000000U;

    // Lines join the members of a union; an adopted line leads to a child that is none by birth.
    enum class Role : std::uint8_t { marriage, divorced, descent, adopted };

    struct Row {
        std::int32_t y;             // of the upper edges
        std::uint32_t firstPerson;  // up to that of the next row
        std::int32_t year;          // the middle one of the births in the row; 0 where none is known
        bool operator==(const Row&) const = default;
    };
    struct Band {
        std::int32_t top;  // of the pieces in the band
        std::int32_t bottom;
        std::uint32_t firstBar;
        std::uint32_t firstUpright;
        bool operator==(const Band&) const = default;
    };
    struct Bar {
        std::int32_t x1;
        std::int32_t x2;
        std::int32_t y;
        Role role;
        bool operator==(const Bar&) const = default;
    };
    struct Upright {
        std::int32_t x;
        std::int32_t y1;
        std::int32_t y2;
        Role role;
        bool operator==(const Upright&) const = default;
    };
    // A sign at a box; boxes with the same number are linked without a line.
    struct Mark {
        std::uint32_t person;
        std::uint32_t number;
        bool operator==(const Mark&) const = default;
    };
    // Labels for a map drawn with 2^-level pixels a point.
    struct LabelLevel {
        std::uint32_t level;
        std::uint32_t firstLabel;
        bool operator==(const LabelLevel&) const = default;
    };
    // The name of a branch: a surname, by its place in strings, or kPersonLabel and the person whom the most
    // descend from. weight counts those who bear the surname, or descend.
    struct Label {
        std::int32_t x;
        std::int32_t y;
        std::uint32_t text;
        std::uint32_t weight;
        bool operator==(const Label&) const = default;
    };

    std::int32_t boxWidth = 0;
    std::int32_t boxHeight = 0;
    std::vector<Row> rows;
    std::vector<std::int32_t> x;         // of the left edges
    std::vector<std::uint32_t> numbers;  // the person's place in the data, from 1: each once
    std::vector<std::int16_t> births;
    std::vector<std::int16_t> deaths;
    std::vector<std::uint8_t> flags;
    std::vector<std::uint32_t> names;  // places in strings
    std::vector<std::uint32_t> surnames;
    std::vector<std::string> strings;                   // each once; the first is empty
    std::vector<std::array<std::int32_t, 2>> partners;  // by union
    std::vector<std::uint8_t> states;                   // kin::UnionState, by union
    std::vector<std::uint32_t> childStarts;             // by union, and the end of the last
    std::vector<std::uint32_t> children;
    std::vector<Band> bands;
    std::vector<Bar> bars;
    std::vector<Upright> uprights;
    std::vector<Mark> marks;
    std::vector<LabelLevel> labelLevels;
    std::vector<Label> labels;  // of each level, the weightiest first

    bool operator==(const MapIndex&) const = default;
};

// The map of all parts of a family, as everybodyChart places it. captions has one entry for each person of the graph; progress
// is called while everybody is placed, if not null.
//
// Holds: the same family gives the same map on every machine.
// Fails: std::invalid_argument where there are not as many captions as persons; std::length_error for more than
//        2^28 persons, or a map wider or higher than 2^29 points.
OLVANE_API MapIndex mapIndexOf(const kin::KinGraph& graph, std::span<const kin::PersonCaption> captions,
                               const ChartProgress* progress = nullptr);

// A map as bytes, and back.
//
// Form: all numbers are little-endian. "OLVMAP\r\n"; then as 32-bit numbers the version (1), the number of all bytes,
// the checksum of all 32-bit words behind it (FNV-1a: from 2166136261, h = (h ^ word) * 16777619), persons and unions.
// Sections follow, each a 32-bit kind, the 32-bit number of its bytes, and these, with zeros up to a multiple of four:
//
//    1 box      width, height                           9 strings   ends of the texts, as 32-bit numbers: how many, then
//    2 rows     y, first person, year                               each; then the texts as UTF-8
//    3 places   x, less that of the person before      10 unions    2 partners each (-1 for none)
//               in the row                             11 states    a byte for each union
//    4 numbers  32 bits each                           12 starts    of each union's children, and the end
//    5 births   16 bits each, signed                   13 children  32 bits each, the kind in the upper four
//    6 deaths   16 bits each, signed                   14 bands     top, bottom, first bar, first upright
//    7 flags    a byte each                            15 bars      x1 less the one before in the band, length,
//    8 names    all names, then all surnames                        8 y + role: three lists
//   16 uprights x less the one before in the band, 8 y1 + role, length: three lists
//   17 marks    person, number                         18 levels    level, first label
//   19 labels   x, y, text, weight
//
// Kinds beyond these are skipped. A reader takes no number on trust: sums stay within 32 bits, places within their
// lists, and what MapIndex holds is so.
// Fails: std::length_error for a map of 4 GiB or more; std::runtime_error, with a sentence for the user, for
//        bytes that are no map, are damaged, or end early.
OLVANE_API std::string writeMapIndex(const MapIndex& map);
OLVANE_API MapIndex readMapIndex(std::string_view bytes);

}  // namespace olvane::charts
