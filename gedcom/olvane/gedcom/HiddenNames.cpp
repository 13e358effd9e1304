// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/gedcom/HiddenNames.h>

#include <algorithm>

#include <olvane/gedcom/NameSpotterInternal.h>

namespace olvane::gedcom {

HiddenNames::HiddenNames(const GedcomData& data, const std::vector<bool>& hidden) {
    if (std::find(hidden.begin(), hidden.end(), true) == hidden.end()) return;
    const auto spotter = std::make_shared<NameSpotter>();
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        const bool isHidden = id <= hidden.size() && hidden[id - 1];
        isHidden ? spotter->add(data, id) : spotter->addOther(data, id);
    }
    spotter->settle();
    spotter_ = spotter;
}

std::string_view HiddenNames::shownPlace(std::string_view text) const {
    return isAnybodyHidden() && spotter_->isNamedIn(text) ? std::string_view() : text;
}

std::string_view HiddenNames::shownText(std::string_view text) const {
    return isAnybodyHidden() && spotter_->isHintedAtIn(text) ? std::string_view() : shownPlace(text);
}

}  // namespace olvane::gedcom
