// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/kin/KinGraph.h>

namespace olvane::kin {

// What a box says about its person. UTF-8; any text is allowed, it is data and never markup.
struct PersonLabel {
    std::string given;
    std::string surname;
    // Written and read with the surname in front.
    bool surnameFirst = false;
    std::string birth;  // a year as it is to be read: "1819", "~1819"; empty if not known
    std::string death;
    Sex sex = Sex::unknown;
    // Drawn as "Living", with nothing else of this label in the picture.
    bool living = false;
    // Further lines below the years, each shortened to its box: places, an occupation.
    std::vector<std::string> details;
};

// A person's name for a sentence; "Living" or "Name not known" where there is none to state.
std::string fullName(const PersonLabel& label);

}  // namespace olvane::kin
