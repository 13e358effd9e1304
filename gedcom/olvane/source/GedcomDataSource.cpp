// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine's eight questions, answered from a GEDCOM file.

#include <olvane/source/GedcomDataSource.h>

namespace olvane::gedcom {

namespace {

PersonId asPerson(std::int64_t id) {
    return static_cast<PersonId>(id);
}

std::int64_t knownOrNot(PersonId id) {
    return id == 0 ? OlvaneViewerManagerWrapProtocol::kPersonNotFound : std::int64_t{id};
}

std::vector<std::int64_t> asHostIds(std::span<const PersonId> persons) {
    return std::vector<std::int64_t>(persons.begin(), persons.end());
}

}  // namespace

PersonId GedcomDataSource::parentOf(std::int64_t personId, PersonId Family::*slot) const {
    const FamilyId family = parentFamilyOf(data_, asPerson(personId), parents_);
    return family == 0 ? 0 : data_.family(family).*slot;
}

std::int64_t GedcomDataSource::fatherForPersonWithID(std::int64_t personId) {
    return knownOrNot(parentOf(personId, &Family::husband));
}

std::int64_t GedcomDataSource::motherForPersonWithID(std::int64_t personId) {
    return knownOrNot(parentOf(personId, &Family::wife));
}

std::vector<std::int64_t> GedcomDataSource::spousesForPersonWithID(std::int64_t personId) {
    return asHostIds(data_.spouses(asPerson(personId)));
}

std::vector<std::int64_t> GedcomDataSource::childrenForPersonWithID(std::int64_t personId) {
    return asHostIds(data_.children(asPerson(personId)));
}

bool GedcomDataSource::isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) {
    const auto spouses = data_.spouses(asPerson(personId));
    return !spouses.empty() && std::int64_t{spouses.front()} == spouseId;
}

bool GedcomDataSource::isPersonDead(std::int64_t personId) {
    return data_.person(asPerson(personId)).dead;
}

std::string GedcomDataSource::dateForPersonWithID(std::int64_t personId, bool isBirth) {
    const Person& person = data_.person(asPerson(personId));
    return sortText(isBirth ? person.birth : person.death);
}

std::int32_t GedcomDataSource::sexOfPersonWithID(std::int64_t personId) {
    return static_cast<std::int32_t>(data_.person(asPerson(personId)).sex);
}

}  // namespace olvane::gedcom
