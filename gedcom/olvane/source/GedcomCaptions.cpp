// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/source/GedcomLabels.h>

#include <cstddef>
#include <string>

namespace olvane::gedcom {

std::vector<kin::PersonCaption> captionsOf(const GedcomData& data) {
    std::vector<kin::PersonCaption> captions;
    captions.reserve(data.personCount());
    for (std::size_t i = 0; i < data.personCount(); ++i) {
        const auto id = static_cast<PersonId>(i + 1);
        const Person& person = data.person(id);
        const PersonName& name = data.firstName(id);
        PersonName surname;
        surname.surname = name.surname;
        captions.push_back({displayName(name, kMostCaptionBytes), displayName(surname, kMostCaptionBytes),
                            person.birth.year, person.death.year});
    }
    return captions;
}

}  // namespace olvane::gedcom
