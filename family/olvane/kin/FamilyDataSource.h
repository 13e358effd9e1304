// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <utility>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/kin/Family.h>

namespace olvane {

// A table of a family as the engine's data source.
//
// Holds: a copy of the table, which shares its rows; later edits of the other one are not seen. Nothing is kept
//        between questions, so several threads may share one.
// Fails: std::out_of_range for a person who is not in the table.
class OLVANE_API FamilyDataSource final : public OlvaneViewerManagerWrapProtocol {
public:
    explicit FamilyDataSource(Family family) : family_(std::move(family)) {}

    std::int64_t fatherForPersonWithID(std::int64_t personId) override;
    std::int64_t motherForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override;
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override;
    bool isPersonDead(std::int64_t personId) override;
    // Birth or death, in the form that sorts.
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override;
    // 0 male, 1 female, 2 unknown, who counts as female.
    std::int32_t sexOfPersonWithID(std::int64_t personId) override;

private:
    Family family_;
};

}  // namespace olvane
