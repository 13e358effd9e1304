// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Passes every question on, and counts the relatives in the answers. They are what a layout's time and memory grow
// with, long before there is anything of it to measure.

#include <olvane/source/LimitedDataSource.h>

#include <stdexcept>

namespace olvane::gedcom {

std::int64_t LimitedDataSource::fatherForPersonWithID(std::int64_t personId) {
    count(1);
    return source_.fatherForPersonWithID(personId);
}

std::int64_t LimitedDataSource::motherForPersonWithID(std::int64_t personId) {
    count(1);
    return source_.motherForPersonWithID(personId);
}

std::vector<std::int64_t> LimitedDataSource::spousesForPersonWithID(std::int64_t personId) {
    std::vector<std::int64_t> spouses = source_.spousesForPersonWithID(personId);
    count(spouses.size());
    return spouses;
}

std::vector<std::int64_t> LimitedDataSource::childrenForPersonWithID(std::int64_t personId) {
    std::vector<std::int64_t> children = source_.childrenForPersonWithID(personId);
    count(children.size());
    return children;
}

bool LimitedDataSource::isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) {
    return source_.isPreferredSpouse(personId, spouseId);
}

bool LimitedDataSource::isPersonDead(std::int64_t personId) {
    return source_.isPersonDead(personId);
}

std::string LimitedDataSource::dateForPersonWithID(std::int64_t personId, bool isBirth) {
    return source_.dateForPersonWithID(personId, isBirth);
}

std::int32_t LimitedDataSource::sexOfPersonWithID(std::int64_t personId) {
    return source_.sexOfPersonWithID(personId);
}

void LimitedDataSource::count(std::size_t relatives) {
    countedRelatives_ += relatives;
    if (countedRelatives_ <= mostRelatives_) return;
    throw std::length_error("the layout is too large: more than " + std::to_string(mostRelatives_ / 1000000) +
                            " million relatives are asked for; choose another focus, or leave relatives or "
                            "generations out");
}

}  // namespace olvane::gedcom
