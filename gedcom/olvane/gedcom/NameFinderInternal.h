// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

// Finds certain persons in texts. A text names one of them if it holds a word of a given name or nickname and a word of
// a surname, their own or a spouse's. It hints at one if it holds a single word that is a name of theirs and of nobody
// else. Case and accents do not count, nor do order and distance. In scripts without spaces a name is found wherever it
// stands.
//
// Holds: words are kept as 64-bit hashes, so once in a long while a text is taken to name somebody whom it does not;
//        never the other way round. Time is linear in names and texts.
class NameFinder {
public:
    void add(const GedcomData& data, PersonId id);
    // Somebody else, whose given names and surnames are no hint.
    void addOther(const GedcomData& data, PersonId id);
    // To be called behind the last add, before the first question.
    void buildIndex();
    bool isNamedIn(std::string_view text) const;
    bool isHintedAtIn(std::string_view text) const;

private:
    // Each sorted, without doubles.
    std::vector<std::uint64_t> givenWords_;
    std::vector<std::uint64_t> surnameWords_;
    std::vector<std::uint64_t> pairs_;       // a given word and a surname word of one person
    std::vector<std::uint64_t> ownWords_;    // of given names, nicknames and surnames
    std::vector<std::uint64_t> otherWords_;  // of the others' given names and surnames
};

}  // namespace olvane::gedcom
