// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <unordered_set>
#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/gedcom/HiddenNames.h>

namespace olvane::gedcom {

// What a written file leaves out for the sake of hidden persons.
//
// Lifetime: refers to the data and to the list of who is hidden.
class HiddenRecords {
public:
    HiddenRecords(const GedcomData& data, const std::vector<bool>& hidden)
        : data_(data), hidden_(hidden), names_(data, hidden) {}

    const HiddenNames& names() const { return names_; }
    bool isHidden(PersonId id) const { return id != 0 && id <= hidden_.size() && hidden_[id - 1]; }
    // A family of which nothing is written but who belongs to it: one with a hidden partner, or without a partner and
    // with hidden children, who alone know of it.
    bool isBare(FamilyId id) const;
    bool isWritten(std::string_view text) const { return text.empty() || !names_.shownText(text).empty(); }

private:
    const GedcomData& data_;
    const std::vector<bool>& hidden_;
    HiddenNames names_;
};

// The identifiers of the records of a written file. Those that are plain and name nobody hidden stay as they are; others
// are made, and none of these is one that stays or one that is hidden.
class WrittenXrefs {
public:
    WrittenXrefs(const GedcomData& data, const HiddenRecords& hidden);

    const std::string& ofPerson(PersonId id) const { return persons_[id - 1]; }
    const std::string& ofFamily(FamilyId id) const { return families_[id - 1]; }
    const std::string& ofShared(std::size_t place) const { return shared_[place]; }

private:
    void keepPlain(const GedcomData& data, const HiddenRecords& hidden);
    void keep(std::string& name, std::string_view xref, const HiddenNames& hidden);
    void make(std::string& name, const char* prefix, std::size_t number);

    std::unordered_set<std::string> taken_;
    std::vector<std::string> persons_;
    std::vector<std::string> families_;
    std::vector<std::string> shared_;  // by place in the data's shared records
};

}  // namespace olvane::gedcom
