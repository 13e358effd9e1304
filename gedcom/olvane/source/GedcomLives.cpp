// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/source/GedcomLives.h>

namespace olvane::gedcom {

kin::Years yearsOf(const GedcomDate& date) {
    kin::Years years;
    if (!date.isRead()) return years;
    if (date.mark != DateMark::before) years.first = date.year;
    if (date.mark != DateMark::after) years.last = date.mark == DateMark::between ? date.lastYear : date.year;
    years.isAbout = date.mark == DateMark::about;
    return years;
}

kin::Lives livesOf(const GedcomData& data, const kin::KinGraph& graph) {
    kin::Lives lives;
    lives.persons.reserve(data.personCount());
    for (const Person& person : data.persons())
        lives.persons.push_back({yearsOf(person.birth), yearsOf(person.death), person.dead});
    lives.marriages.reserve(static_cast<std::size_t>(graph.unionCount()));
    for (kin::UnionPlace u = 0; u < graph.unionCount(); ++u)
        lives.marriages.push_back(yearsOf(data.family(graph.family(u)).marriage));
    return lives;
}

}  // namespace olvane::gedcom
