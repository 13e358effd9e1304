// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/SearchTexts.h>

namespace olvane::gedcom {

// What a search looks into of a file: names of all types, titles, dates of birth and death, and the values, places and
// years of all facts of persons and of their marriages, where the file was read with facts. Ids are those of the file.
//
// Lifetime: the data must outlive the texts.
class GedcomSearchTexts : public kin::SearchTexts {
public:
    explicit GedcomSearchTexts(const GedcomData& data) : data_(data) {}

    std::size_t personCount() const override { return data_.personCount(); }
    std::int64_t id(std::size_t place) const override { return static_cast<std::int64_t>(place) + 1; }
    void visit(std::size_t place, const Visitor& visitor) const override;

private:
    void visitNames(PersonId id, const Visitor& visitor) const;
    void visitMarriedNames(PersonId id, const Visitor& visitor) const;

    const GedcomData& data_;
};

}  // namespace olvane::gedcom
