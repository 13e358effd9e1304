// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Judges who may be alive, in doubt for the person's privacy. First those whose birth says so, then from each
// of them two steps to their kin, through whomever they lead, to those whose dates cannot tell.

#include <cli/LivingPersons.h>

#include <cstdint>

#include <cli/AgeLimits.h>

namespace olvane::cli {

namespace {

constexpr int kSteps = 2;

enum class Sign : std::uint8_t { alive, dead, cannotTell };

// The latest year that the birth may have been in; "after 1900" has none.
bool bornBefore(const gedcom::GedcomDate& birth, int year) {
    if (!birth.isRead() || birth.mark == gedcom::DateMark::after) return false;
    return (birth.mark == gedcom::DateMark::between ? birth.lastYear : birth.year) <= year;
}

bool mayBeBornAfter(const gedcom::GedcomDate& birth, int year) {
    if (!birth.isRead()) return false;
    return (birth.mark == gedcom::DateMark::between ? birth.lastYear : birth.year) > year;
}

Sign signOf(const gedcom::Person& person, int thisYear) {
    const int oldestBirth = thisYear - kLongestLife;
    if (person.dead || bornBefore(person.birth, oldestBirth)) return Sign::dead;
    return mayBeBornAfter(person.birth, oldestBirth) ? Sign::alive : Sign::cannotTell;
}

void addKin(const gedcom::GedcomData& data, gedcom::PersonId id, std::vector<gedcom::PersonId>& kin) {
    const gedcom::Person& person = data.person(id);
    if (person.father != 0) kin.push_back(person.father);
    if (person.mother != 0) kin.push_back(person.mother);
    for (const gedcom::PersonId child : data.children(id)) kin.push_back(child);
    for (const gedcom::PersonId spouse : data.spouses(id)) kin.push_back(spouse);
}

// Everybody within so many steps of those marked, each looked at once.
void markWithin(const gedcom::GedcomData& data, std::vector<bool>& near) {
    std::vector<gedcom::PersonId> ring;
    for (std::size_t i = 0; i < near.size(); ++i) {
        if (near[i]) ring.push_back(static_cast<gedcom::PersonId>(i + 1));
    }
    for (int step = 0; step < kSteps; ++step) {
        std::vector<gedcom::PersonId> kin;
        for (const gedcom::PersonId id : ring) addKin(data, id, kin);
        ring.clear();
        for (const gedcom::PersonId id : kin) {
            if (near[id - 1]) continue;
            near[id - 1] = true;
            ring.push_back(id);
        }
    }
}

}  // namespace

std::vector<bool> livingPersons(const gedcom::GedcomData& data, int thisYear) {
    const std::size_t count = data.personCount();
    std::vector<Sign> signs;
    std::vector<bool> near(count, false);
    for (const gedcom::Person& person : data.persons()) {
        signs.push_back(signOf(person, thisYear));
        near[signs.size() - 1] = signs.back() == Sign::alive;
    }
    markWithin(data, near);
    std::vector<bool> living(count, false);
    for (std::size_t i = 0; i < count; ++i) {
        living[i] = signs[i] == Sign::alive || (signs[i] == Sign::cannotTell && near[i]);
    }
    return living;
}

}  // namespace olvane::cli
