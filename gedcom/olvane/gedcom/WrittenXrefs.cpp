// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/gedcom/WrittenXrefsInternal.h>

#include <algorithm>

namespace olvane::gedcom {
namespace {

// An identifier may hold anything but what ends it.
bool isPlainXref(std::string_view xref) {
    constexpr std::size_t kLongest = 64;
    return !xref.empty() && xref.size() <= kLongest && xref.find_first_of("@#! \t") == std::string_view::npos;
}

}  // namespace

bool HiddenRecords::isBare(FamilyId id) const {
    const Family& family = data_.family(id);
    if (isHidden(family.husband) || isHidden(family.wife)) return true;
    if (family.husband != 0 || family.wife != 0) return false;
    const auto links = data_.childLinks(id);
    return std::any_of(links.begin(), links.end(),
                       [this](const ChildLink& link) { return isHidden(link.child); });
}

WrittenXrefs::WrittenXrefs(const GedcomData& data, const HiddenRecords& hidden)
    : persons_(data.personCount()), families_(data.familyCount()), shared_(data.sharedRecords().size()) {
    keepPlain(data, hidden);
    for (const Person& person : data.persons()) taken_.insert(std::string(person.xref));
    for (const Family& family : data.families()) taken_.insert(std::string(family.xref));
    for (std::size_t i = 0; i < persons_.size(); ++i) make(persons_[i], "P", i + 1);
    for (std::size_t i = 0; i < families_.size(); ++i) make(families_[i], "U", i + 1);
    for (std::size_t i = 0; i < shared_.size(); ++i) make(shared_[i], "R", i + 1);
}

// All that stay come first, so that none that is made is one of them.
void WrittenXrefs::keepPlain(const GedcomData& data, const HiddenRecords& hidden) {
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        if (!hidden.isHidden(id)) keep(persons_[id - 1], data.person(id).xref, hidden.names());
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) {
        if (!hidden.isBare(id)) keep(families_[id - 1], data.family(id).xref, hidden.names());
    }
    const auto shared = data.sharedRecords();
    for (std::size_t i = 0; i < shared.size(); ++i) {
        if (hidden.isWritten(shared[i].value)) keep(shared_[i], shared[i].xref, hidden.names());
    }
}

void WrittenXrefs::keep(std::string& name, std::string_view xref, const HiddenNames& hidden) {
    if (isPlainXref(xref) && !hidden.shownText(xref).empty() && taken_.insert(std::string(xref)).second) {
        name = xref;
    }
}

void WrittenXrefs::make(std::string& name, const char* prefix, std::size_t number) {
    if (!name.empty()) return;
    name = prefix + std::to_string(number);
    while (!taken_.insert(name).second) name += 'X';
}

}  // namespace olvane::gedcom
