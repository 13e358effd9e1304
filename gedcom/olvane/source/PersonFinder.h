// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <memory>
#include <string>
#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/PersonIndex.h>

namespace olvane::gedcom {

// The persons of a file by what a user types. The index is made at the first text that is no identifier.
//
// Lifetime: the data must outlive the finder.
// Threads: one call at a time.
class PersonFinder {
public:
    explicit PersonFinder(const GedcomData& data) : data_(data) {}

    // Everybody who fits, the best first. A person who has the text as xref or number is the only one.
    std::vector<PersonId> find(const std::string& text,
                               std::size_t limit = std::numeric_limits<std::size_t>::max());
    // Those whom the text can only mean: whose names have each word or a word that begins so; where there is nobody,
    // those in whose records all words stand.
    std::vector<PersonId> meant(const std::string& text);

private:
    PersonId byIdentifier(const std::string& text) const;
    const kin::PersonIndex& index();

    const GedcomData& data_;
    std::unique_ptr<kin::PersonIndex> index_;
};

}  // namespace olvane::gedcom
