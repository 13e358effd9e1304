// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/gedcom/GedcomData.h>
#include <olvane/source/ParentChoice.h>

namespace olvane::gedcom {

// A GEDCOM file as the engine's data source: the person of id n is the n-th of the file.
//
// Holds: refers to the data, which must outlive it. Nothing is kept between questions, so several threads may
//        each have one around the same data.
class GedcomDataSource final : public OlvaneViewerManagerWrapProtocol {
public:
    explicit GedcomDataSource(const GedcomData& data, const ParentChoice& parents = {})
        : data_(data), parents_(parents) {}

    std::int64_t fatherForPersonWithID(std::int64_t personId) override;
    std::int64_t motherForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override;
    // The first spouse of the file is the preferred one.
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override;
    bool isPersonDead(std::int64_t personId) override;
    // Birth or death, in a form that sorts; empty where the file has none that can be read.
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override;
    std::int32_t sexOfPersonWithID(std::int64_t personId) override;

private:
    PersonId parentOf(std::int64_t personId, PersonId Family::*slot) const;

    const GedcomData& data_;
    ParentChoice parents_;
};

}  // namespace olvane::gedcom
