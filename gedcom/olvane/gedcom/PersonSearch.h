// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <limits>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

// Persons whom a user may mean by a text.
//
// "I17" and "@I17@" are the person of that xref, if there is one; a plain number that is no xref is the
// person of that id. Any other text is words of a name, in any order: each must begin a word of one of the
// person's names (or of its pieces). Capitals and accents do not count: "gruber" finds Grüber, "lukasz"
// Łukasz.
//
// Holds: persons with each word whole come first, then the rest, each in the order of the file. At most
//        limit.
std::vector<PersonId> findPersons(const GedcomData& data, std::string_view text,
                                  std::size_t limit = std::numeric_limits<std::size_t>::max());

}  // namespace olvane::gedcom
