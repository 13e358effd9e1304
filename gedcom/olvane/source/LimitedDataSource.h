// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

namespace olvane::gedcom {

// A data source that ends a layout which grows without measure: it counts the relatives that it returns, each time that
// they are asked for.
//
// Holds: refers to the other source, which must outlive it. For one layout.
// Fails: std::length_error, with a sentence for the user, where more than that many relatives are asked for.
class LimitedDataSource final : public OlvaneViewerManagerWrapProtocol {
public:
    LimitedDataSource(OlvaneViewerManagerWrapProtocol& source, std::size_t mostRelatives)
        : source_(source), mostRelatives_(mostRelatives) {}

    std::int64_t fatherForPersonWithID(std::int64_t personId) override;
    std::int64_t motherForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override;
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override;
    bool isPersonDead(std::int64_t personId) override;
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override;
    std::int32_t sexOfPersonWithID(std::int64_t personId) override;

private:
    void count(std::size_t relatives);

    OlvaneViewerManagerWrapProtocol& source_;
    std::size_t mostRelatives_;
    std::size_t countedRelatives_ = 0;
};

}  // namespace olvane::gedcom
