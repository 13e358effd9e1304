// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

// Tells whether a text names one of certain persons: a word of a given name or nickname, and a word of a surname, their
// own or a spouse's. Case and accents do not count, nor do order and distance. In scripts without spaces a name is found
// wherever it stands.
//
// Holds: words are kept as 64-bit hashes, so once in a long while a text is taken to name somebody whom it does not;
//        never the other way round. Time is linear in names and texts.
class NameSpotter {
public:
    void add(const GedcomData& data, PersonId id);
    // To be called behind the last add, before the first question.
    void settle();
    bool isNamedIn(std::string_view text) const;

private:
    // Each sorted, without doubles.
    std::vector<std::uint64_t> givenWords_;
    std::vector<std::uint64_t> surnameWords_;
    std::vector<std::uint64_t> pairs_;  // a given word and a surname word of one person
};

}  // namespace olvane::gedcom
