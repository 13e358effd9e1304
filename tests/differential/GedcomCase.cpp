// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Real families as cases, so that every person of them can be laid out by every build and by the plain
// layout.

#include "GedcomCase.h"

#include <olvane/gedcom/GedcomReader.h>

namespace support {

namespace {

std::vector<PersonId> idsOf(std::span<const olvane::gedcom::PersonId> ids) {
    return std::vector<PersonId>(ids.begin(), ids.end());
}

void addPerson(CaseFile& family, const olvane::gedcom::GedcomData& data, olvane::gedcom::PersonId id) {
    const olvane::gedcom::Person& person = data.person(id);
    family.sexes[id] = static_cast<std::int32_t>(person.sex);
    if (person.father != 0) family.fathers[id] = person.father;
    if (person.mother != 0) family.mothers[id] = person.mother;
    if (!data.spouses(id).empty()) family.spouses[id] = idsOf(data.spouses(id));
    if (!data.children(id).empty()) family.children[id] = idsOf(data.children(id));
    if (person.birth.isGiven()) family.births[id] = olvane::gedcom::sortText(person.birth);
    if (person.death.isGiven()) family.dates[id] = olvane::gedcom::sortText(person.death);
    if (person.dead) family.dead[id] = true;
}

}  // namespace

CaseFile caseOfGedcom(const std::string& path) {
    const olvane::gedcom::GedcomData data = olvane::gedcom::readGedcomFile(path);
    CaseFile family;
    family.focus = 1;
    for (std::size_t id = 1; id <= data.personCount(); ++id) {
        addPerson(family, data, static_cast<olvane::gedcom::PersonId>(id));
    }
    return family;
}

}  // namespace support
