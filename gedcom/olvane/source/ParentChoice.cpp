// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/source/ParentChoice.h>

#include <algorithm>

namespace olvane::gedcom {

FamilyId parentFamilyOf(const GedcomData& data, PersonId id, const ParentChoice& choice) {
    const auto links = data.parentLinks(id);
    const auto firstOf = [&](const auto& isWanted) {
        const auto found = std::find_if(links.begin(), links.end(), [&](const FamilyLink& link) {
            return link.family != 0 && isWanted(link);
        });
        return found == links.end() ? data.person(id).parentFamily : found->family;
    };
    if (choice.child == id && choice.family != 0) {
        const FamilyId family = firstOf([&](const FamilyLink& link) { return link.family == choice.family; });
        if (family == choice.family) return family;
    }
    switch (choice.order) {
        case ParentOrder::adoptive:
            return firstOf([](const FamilyLink& link) { return link.pedigree == Pedigree::adopted; });
        case ParentOrder::inOrder:
            return firstOf([](const FamilyLink&) { return true; });
        case ParentOrder::birth:
            break;
    }
    return data.person(id).parentFamily;
}

}  // namespace olvane::gedcom
