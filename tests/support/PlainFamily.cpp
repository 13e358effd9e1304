// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The slow and plain way of each edit: every list is looked through.

#include "PlainFamily.h"

#include <algorithm>
#include <iterator>
#include <set>

namespace support {

namespace {

typedef std::vector<std::int64_t> Ids;

bool contains(const Ids& list, std::int64_t id) {
    return std::find(list.begin(), list.end(), id) != list.end();
}

void addOnce(Ids& list, std::int64_t id) {
    if (!contains(list, id)) list.push_back(id);
}

bool isSamePair(const std::array<std::int64_t, 2>& a, const std::array<std::int64_t, 2>& b) {
    return a == b || (a[0] == b[1] && a[1] == b[0]);
}

Ids idsOf(std::span<const olvane::FamilyId> list) {
    return Ids(list.begin(), list.end());
}

std::string differenceOfPerson(const olvane::Family& table, std::int64_t id,
                               const PlainFamily::Person& plain) {
    const olvane::PersonRow row = table.person(id);
    const auto said = [id](const char* what) {
        return std::string(what) + " of person " + std::to_string(id);
    };
    if (row.father != plain.father || row.mother != plain.mother) return said("parents");
    if (row.sex != plain.sex || row.dead != plain.dead) return said("sex or death");
    if (row.birth != plain.birth || row.birthWritten != plain.birth) return said("birth");
    if (!row.death.empty() || row.deathWritten != plain.deathWritten) return said("death");
    if (idsOf(table.spouses(id)) != plain.spouses) return said("spouses");
    if (table.preferredSpouse(id) != plain.preferred) return said("preferred spouse");
    if (idsOf(table.children(id)) != plain.children) return said("children");
    std::vector<std::string> names;
    for (const olvane::NamePart& part : table.names(id)) names.emplace_back(part.text);
    if (names != plain.names) return said("names");
    std::map<std::string, std::string> fields;
    for (const olvane::LabelField& field : table.fields(id)) fields.emplace(field.key, field.text);
    if (fields != plain.fields) return said("fields");
    return {};
}

}  // namespace

void PlainFamily::putPerson(const olvane::PersonRow& row) {
    Person& person = persons[row.id];
    const std::set<std::int64_t> before{person.father, person.mother};
    const std::set<std::int64_t> after{row.father, row.mother};
    person.father = row.father;
    person.mother = row.mother;
    person.sex = row.sex;
    person.dead = row.dead;
    person.birth = row.birth;
    person.deathWritten = row.deathWritten;
    for (const std::int64_t parent : before) {
        if (parent != 0 && after.count(parent) == 0) std::erase(persons.at(parent).children, row.id);
    }
    for (const std::int64_t parent : after) {
        if (parent != 0 && before.count(parent) == 0) addOnce(persons.at(parent).children, row.id);
    }
}

void PlainFamily::removePerson(std::int64_t id) {
    persons.erase(id);
    for (auto& [other, person] : persons) {
        for (std::int64_t* named : {&person.father, &person.mother, &person.preferred}) {
            if (*named == id) *named = 0;
        }
        std::erase(person.spouses, id);
        std::erase(person.children, id);
    }
    for (auto at = families.begin(); at != families.end();) {
        Couple& family = at->second;
        bool isNamed = false;
        for (std::int64_t& partner : family.partners) {
            isNamed = isNamed || partner == id;
            if (partner == id) partner = 0;
        }
        const auto isIt = [id](const olvane::FamilyChild& child) { return child.child == id; };
        isNamed = std::erase_if(family.children, isIt) > 0 || isNamed;
        const bool isEmpty = family.partners == std::array<std::int64_t, 2>{} && family.children.empty();
        at = isNamed && isEmpty ? families.erase(at) : std::next(at);
    }
}

void PlainFamily::addSpouse(std::int64_t person, std::int64_t spouse) {
    Person& one = persons.at(person);
    if (one.spouses.empty()) one.preferred = spouse;
    addOnce(one.spouses, spouse);
}

void PlainFamily::separate(std::int64_t number) {
    const auto two = families.at(number).partners;
    if (two[0] == 0 || two[1] == 0) return;
    for (const auto& [other, family] : families) {
        if (other != number && isSamePair(family.partners, two)) return;
    }
    for (int i = 0; i < 2; ++i) {
        Person& person = persons.at(two[static_cast<std::size_t>(i)]);
        const std::int64_t spouse = two[static_cast<std::size_t>(1 - i)];
        std::erase(person.spouses, spouse);
        if (person.preferred == spouse) person.preferred = 0;
    }
}

void PlainFamily::putFamily(const olvane::FamilyRow& row, const std::vector<olvane::FamilyChild>& children) {
    const auto old = families.find(row.number);
    if (old != families.end() && !isSamePair(old->second.partners, {row.partner0, row.partner1})) {
        separate(row.number);
    }
    families[row.number] = {{row.partner0, row.partner1}, row.state, children};
    if (row.partner0 != 0 && row.partner1 != 0) {
        addSpouse(row.partner0, row.partner1);
        addSpouse(row.partner1, row.partner0);
    }
    for (const std::int64_t partner : {row.partner0, row.partner1}) {
        if (partner == 0) continue;
        for (const olvane::FamilyChild& child : children) addOnce(persons.at(partner).children, child.child);
    }
}

void PlainFamily::removeFamily(std::int64_t number) {
    separate(number);
    families.erase(number);
}

std::string differenceOf(const olvane::Family& table, const PlainFamily& plain) {
    const std::vector<olvane::FamilyId> ids = table.personIds();
    if (ids.size() != plain.persons.size() || table.personCount() != ids.size()) return "number of persons";
    for (const auto& [id, person] : plain.persons) {
        if (!table.hasPerson(id)) return "no person " + std::to_string(id);
        std::string difference = differenceOfPerson(table, id, person);
        if (!difference.empty()) return difference;
    }
    if (table.familyCount() != plain.families.size()) return "number of families";
    for (const auto& [number, family] : plain.families) {
        const olvane::FamilyRow row = table.family(number);
        const std::array<std::int64_t, 2> partners{row.partner0, row.partner1};
        if (partners != family.partners || row.state != family.state ||
            table.familyChildren(number) != family.children) {
            return "family " + std::to_string(number);
        }
    }
    return {};
}

}  // namespace support
