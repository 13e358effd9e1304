// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/picture/Picture.h>

namespace olvane::picture {

// Whether a person is hidden: hidden has an entry for each person, entry 0 for person 1, or is empty for nobody.
bool isHidden(const std::vector<bool>& hidden, std::int64_t id);

// Takes out of a picture what it states of hidden persons beside their boxes and who belongs to which family: the kind of
// a hidden child, further parents of a hidden person, number and state of a family with a hidden partner, and the words of
// a way over one of them.
void hidePersons(const std::vector<bool>& hidden, Picture& picture);

}  // namespace olvane::picture
