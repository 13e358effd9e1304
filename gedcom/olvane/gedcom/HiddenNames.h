// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

class NameFinder;

// The names of hidden persons, and which texts about others may be shown beside them: the rules that GedcomWriter.h
// states, for whatever else shows texts of a file.
//
// Holds: keeps nothing of the data. Safe to ask on several threads.
// Units: making it takes time with the number of persons, a question with the length of the text.
class HiddenNames {
public:
    // Nobody is hidden, and every text is shown.
    HiddenNames() = default;
    // hidden: an entry for each person, entry 0 for person 1; empty for nobody.
    HiddenNames(const GedcomData& data, const std::vector<bool>& hidden);

    bool isAnybodyHidden() const { return finder_ != nullptr; }

    // A place or a date, which may bear a name by chance: nothing where it names somebody hidden, by a given name or
    // nickname and a surname; else the text.
    std::string_view shownPlace(std::string_view text) const;
    // A text that may be about anybody: nothing where it names somebody hidden, or holds a single word that is a name
    // of somebody hidden and of nobody else.
    std::string_view shownText(std::string_view text) const;

private:
    std::shared_ptr<const NameFinder> finder_;
};

}  // namespace olvane::gedcom
