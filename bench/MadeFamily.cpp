// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The families that layouts are timed with: how they are grown, and how they answer.

#include "MadeFamily.h"

#include <cmath>
#include <utility>

namespace bench {

std::int64_t MadeFamily::add(std::int32_t sex, std::int64_t father, std::int64_t mother, int year) {
    Person person;
    person.sex = sex;
    person.father = father;
    person.mother = mother;
    person.year = year;
    persons_.push_back(std::move(person));
    const auto id = static_cast<std::int64_t>(persons_.size());
    if (father != 0) at(father).children.push_back(id);
    if (mother != 0) at(mother).children.push_back(id);
    return id;
}

void MadeFamily::marry(std::int64_t a, std::int64_t b) {
    at(a).spouses.push_back(b);
    at(b).spouses.push_back(a);
}

std::int64_t MadeFamily::addSpouse(std::int64_t id) {
    const std::int64_t spouse = add(at(id).sex == 0 ? 1 : 0, 0, 0, at(id).year + 1);
    marry(id, spouse);
    return spouse;
}

std::int64_t MadeFamily::addChild(std::int64_t a, std::int64_t b, int place, int year) {
    const bool firstIsFather = at(a).sex == 0;
    return add(place % 2, firstIsFather ? a : b, firstIsFather ? b : a, year);
}

void MadeFamily::addUnit(std::int64_t a, std::int64_t b, int children, int grandchildren, int year) {
    for (int i = 0; i < children; ++i) {
        const std::int64_t child = addChild(a, b, i, year + i % 20);
        const std::int64_t spouse = addSpouse(child);
        for (int j = 0; j < grandchildren; ++j) addChild(child, spouse, j, year + 25 + j);
    }
}

MadeFamily::Couple MadeFamily::addParents(std::int64_t child, int year) {
    const std::int64_t father = add(0, 0, 0, year);
    const std::int64_t mother = add(1, 0, 0, year);
    marry(father, mother);
    at(child).father = father;
    at(child).mother = mother;
    at(father).children.push_back(child);
    at(mother).children.push_back(child);
    return {father, mother};
}

void MadeFamily::addAncestors(std::int64_t child, int generations, int year) {
    if (generations == 0) return;
    const Couple parents = addParents(child, year);
    addAncestors(parents.father, generations - 1, year - 30);
    addAncestors(parents.mother, generations - 1, year - 30);
}

MadeFamily MadeFamily::descendants(int persons) {
    MadeFamily family;
    const std::int64_t focus = family.add(0, 0, 0, 1900);
    const std::int64_t wife = family.addSpouse(focus);
    family.addUnit(focus, wife, static_cast<int>(std::lround((persons - 2) / 7.0)), 5, 1925);
    return family;
}

MadeFamily MadeFamily::kin(int persons) {
    const bool small = persons <= 30;
    const int units = small ? 1 : static_cast<int>(std::lround((persons - 20) / 20.0));
    const int auntsUncles = small ? 0 : units;
    MadeFamily family;
    const std::int64_t focus = family.add(0, 0, 0, 1900);
    const std::int64_t wife = family.addSpouse(focus);
    const Couple parents = family.addParents(focus, 1870);
    const Couple fathers = family.addParents(parents.father, 1840);
    const Couple mothers = family.addParents(parents.mother, 1840);
    for (const std::int64_t grandparent : {fathers.father, fathers.mother, mothers.father, mothers.mother}) {
        family.addParents(grandparent, 1810);
    }
    family.addUnit(focus, wife, units, 3, 1925);
    family.addUnit(parents.father, parents.mother, units, 3, 1901);
    family.addUnit(fathers.father, fathers.mother, auntsUncles, 3, 1871);
    family.addUnit(mothers.father, mothers.mother, auntsUncles, 3, 1871);
    const std::int64_t second = family.add(1, 0, 0, 1875);
    family.marry(parents.father, second);
    family.addChild(parents.father, second, 1, 1905);
    const std::int64_t former = family.add(0, 0, 0, 1895);
    family.marry(former, wife);
    family.addChild(former, wife, 0, 1922);
    return family;
}

MadeFamily MadeFamily::ancestors(int generations) {
    MadeFamily family;
    family.addAncestors(family.add(0, 0, 0, 1990), generations, 1960);
    return family;
}

MadeFamilySource::MadeFamilySource(MadeFamily family) : family_(std::move(family)) {}

std::int64_t MadeFamilySource::fatherForPersonWithID(std::int64_t personId) {
    const std::int64_t father = family_.person(personId).father;
    return father == 0 ? kPersonNotFound : father;
}

std::int64_t MadeFamilySource::motherForPersonWithID(std::int64_t personId) {
    const std::int64_t mother = family_.person(personId).mother;
    return mother == 0 ? kPersonNotFound : mother;
}

std::vector<std::int64_t> MadeFamilySource::spousesForPersonWithID(std::int64_t personId) {
    return family_.person(personId).spouses;
}

std::vector<std::int64_t> MadeFamilySource::childrenForPersonWithID(std::int64_t personId) {
    return family_.person(personId).children;
}

bool MadeFamilySource::isPreferredSpouse(std::int64_t, std::int64_t) {
    return false;
}

bool MadeFamilySource::isPersonDead(std::int64_t) {
    return false;
}

std::string MadeFamilySource::dateForPersonWithID(std::int64_t personId, bool isBirth) {
    const int year = family_.person(personId).year;
    return isBirth && year != 0 ? std::to_string(year) : std::string();
}

std::int32_t MadeFamilySource::sexOfPersonWithID(std::int64_t personId) {
    return family_.person(personId).sex;
}

}  // namespace bench
