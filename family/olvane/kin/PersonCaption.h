// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>

namespace olvane::kin {

// What is written at a person's place in a large chart: texts for people to read, and years, 0 where not known.
struct PersonCaption {
    std::string name;     // whole, as it is shown; empty where it is not known
    std::string surname;  // the part of it that branches of a family are called by
    std::int16_t birth = 0;
    std::int16_t death = 0;
};

}  // namespace olvane::kin
