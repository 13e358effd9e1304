// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cli/LayoutRun.h>

namespace olvane::cli {

// A switch of the views family and near that leaves out some relatives.

struct FamilySwitch {
    const char* name;
    bool olvane::LayoutOptions::*shown;
    const char* pageName;  // in an address of a page
    const char* help;
};

constexpr FamilySwitch kFamilySwitches[] = {
    {"--no-aunts-uncles", &olvane::LayoutOptions::auntsUncles, "auntsUncles",
     "Leave out siblings of the parents, and so cousins too"},
    {"--no-cousins", &olvane::LayoutOptions::cousins, "cousins",
     "Leave out children of the parents' siblings"},
    {"--no-siblings", &olvane::LayoutOptions::siblings, "siblings", "Leave out siblings and half siblings"},
    {"--no-sibling-spouses", &olvane::LayoutOptions::siblingSpouses, "siblingSpouses",
     "Leave out spouses of the siblings"},
    {"--no-nieces-nephews", &olvane::LayoutOptions::niecesNephews, "niecesNephews",
     "Leave out children of the siblings"},
    {"--no-grandchildren", &olvane::LayoutOptions::grandchildren, "grandchildren", "Leave out grandchildren"},
    {"--no-great-grandparents", &olvane::LayoutOptions::greatGrandparents, "greatGrandparents",
     "Leave out great-grandparents"},
    {"--no-spouses-of-children", &olvane::LayoutOptions::spousesOfChildren, "spousesOfChildren",
     "Leave out spouses of the children"},
};

}  // namespace olvane::cli
