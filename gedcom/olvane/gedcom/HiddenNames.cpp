// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/gedcom/HiddenNames.h>

#include <algorithm>

#include <olvane/gedcom/NameFinderInternal.h>

namespace olvane::gedcom {

HiddenNames::HiddenNames(const GedcomData& data, const std::vector<bool>& hidden) {
    if (std::find(hidden.begin(), hidden.end(), true) == hidden.end()) return;
    const auto finder = std::make_shared<NameFinder>();
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        const bool isHidden = id <= hidden.size() && hidden[id - 1];
        isHidden ? finder->add(data, id) : finder->addOther(data, id);
    }
    finder->buildIndex();
    finder_ = finder;
}

std::string_view HiddenNames::shownPlace(std::string_view text) const {
    return isAnybodyHidden() && finder_->isNamedIn(text) ? std::string_view() : text;
}

std::string_view HiddenNames::shownText(std::string_view text) const {
    return isAnybodyHidden() && finder_->isHintedAtIn(text) ? std::string_view() : shownPlace(text);
}

}  // namespace olvane::gedcom
