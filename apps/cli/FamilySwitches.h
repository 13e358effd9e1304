// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <stdexcept>
#include <string>
#include <string_view>

#include <cli/LayoutRun.h>
#include <olvane/charts/ViewOption.h>

namespace olvane::cli {

// How the command calls what leaves out a group of relatives, in the views family and near.
struct FamilySwitch {
    std::string_view group;
    const char* name;
    const char* help;
};

constexpr FamilySwitch kFamilySwitches[] = {
    {"auntsUncles", "--no-aunts-uncles", "Leave out siblings of the parents, and so cousins too"},
    {"cousins", "--no-cousins", "Leave out children of the parents' siblings"},
    {"siblings", "--no-siblings", "Leave out siblings and half siblings"},
    {"siblingSpouses", "--no-sibling-spouses", "Leave out spouses of the siblings"},
    {"niecesNephews", "--no-nieces-nephews", "Leave out children of the siblings"},
    {"grandchildren", "--no-grandchildren", "Leave out grandchildren"},
    {"greatGrandparents", "--no-great-grandparents", "Leave out great-grandparents"},
    {"spousesOfChildren", "--no-spouses-of-children", "Leave out spouses of the children"},
};

// Whether a request shows the group.
// Fails: std::out_of_range for a group that the table of options does not have.
inline bool& shownBy(const FamilySwitch& option, LayoutRequest& request) {
    for (const charts::RelativeGroup& group : charts::relativeGroups()) {
        if (group.name == option.group) return request.chart.layout.*group.shown;
    }
    throw std::out_of_range("there is no group " + std::string(option.group));
}

}  // namespace olvane::cli
