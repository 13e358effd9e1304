// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine's eight questions, answered from a table.

#include <olvane/kin/FamilyDataSource.h>

namespace olvane {

namespace {

std::int64_t knownOrNot(FamilyId id) {
    return id == 0 ? OlvaneViewerManagerWrapProtocol::kPersonNotFound : std::int64_t{id};
}

std::vector<std::int64_t> asHostIds(std::span<const FamilyId> persons) {
    return std::vector<std::int64_t>(persons.begin(), persons.end());
}

}  // namespace

std::int64_t FamilyDataSource::fatherForPersonWithID(std::int64_t personId) {
    return knownOrNot(family_.father(personId));
}

std::int64_t FamilyDataSource::motherForPersonWithID(std::int64_t personId) {
    return knownOrNot(family_.mother(personId));
}

std::vector<std::int64_t> FamilyDataSource::spousesForPersonWithID(std::int64_t personId) {
    return asHostIds(family_.spouses(personId));
}

std::vector<std::int64_t> FamilyDataSource::childrenForPersonWithID(std::int64_t personId) {
    return asHostIds(family_.children(personId));
}

bool FamilyDataSource::isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) {
    const FamilyId preferred = family_.preferredSpouse(personId);
    return preferred != 0 && std::int64_t{preferred} == spouseId;
}

bool FamilyDataSource::isPersonDead(std::int64_t personId) {
    return family_.isDead(personId);
}

std::string FamilyDataSource::dateForPersonWithID(std::int64_t personId, bool isBirth) {
    return std::string(isBirth ? family_.birth(personId) : family_.death(personId));
}

std::int32_t FamilyDataSource::sexOfPersonWithID(std::int64_t personId) {
    return static_cast<std::int32_t>(family_.sex(personId));
}

}  // namespace olvane
