// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

#include <support/CaseFile.h>

namespace support {

// A family in compact form, for tests: families parted by ";", each a person or a couple with its children.
//
//     family("17+42: 5 6f; 3+4: 17")    17 and his wife 42 have a son 5 and a daughter 6; 17 is a son of 3
//     and 4 family("17; 42f: 9")              17, a man; 42, a woman, has a son 9 of an unknown father
//
// Holds: the focus is the first person named. A couple is the husband, then the wife; "f" marks every other
//        woman. Both sides of each tie are stated: lists of parents and of children, and both lists of spouses,
//        in the order of the text. Nothing is stated once only: a couple named twice stands twice in the lists.
// Fails: std::invalid_argument, naming the place, for a text that is not of this form.
CaseFile family(std::string_view text);

}  // namespace support
