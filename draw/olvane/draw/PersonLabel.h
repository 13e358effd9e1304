// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace olvane::draw {

enum class LabelSex : std::uint8_t { male, female, other };

// How many relatives of a person have no box in the picture.
struct HiddenRelatives {
    int parents = 0;
    int spouses = 0;
    int children = 0;
};

// What a box tells about its person. UTF-8; any text is allowed, it is data and never markup.
struct PersonLabel {
    std::string given;
    std::string surname;
    // Written and read with the surname in front.
    bool surnameFirst = false;
    std::string birth;  // a year as it is to be read: "1819", "~1819"; empty if not known
    std::string death;
    LabelSex sex = LabelSex::other;
    // Drawn as "Living", with nothing else of this label in the picture.
    bool living = false;
    // For the mark on a box whose person has hidden relatives; without it the mark tells no numbers.
    std::optional<HiddenRelatives> hidden;
};

// How a child came to the parents whom its line leads to.
enum class ParentLink : std::uint8_t { birth, adopted, foster };

}  // namespace olvane::draw
