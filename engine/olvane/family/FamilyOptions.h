// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace SharedTreeViewer {

// Keys of the option map that the family view reads. Each option that is read stands at true when its key is
// absent. The spelling of every key is what hosts store in their settings, "Neices" included.
inline const std::string kTreeViewFamShowAuntsUnclesKey = "ACTV_Fam_ShowAuntsUncles";
inline const std::string kTreeViewFamShowCousinsKey = "ACTV_Fam_ShowCousins";  // needs aunts and uncles
inline const std::string kTreeViewFamShowSiblingsKey = "ACTV_Fam_ShowSiblings";
inline const std::string kTreeViewFamShowSiblingSpousesKey = "ACTV_Fam_ShowSiblingSpouses";
inline const std::string kTreeViewFamShowNeicesNephewsKey = "ACTV_Fam_ShowNeicesNephews";
inline const std::string kTreeViewFamShowGrandchildrenKey = "ACTV_Fam_ShowGrandchildren";
inline const std::string kTreeViewFamShowGreatGrandparentsKey = "ACTV_Fam_ShowGreatGrandparents";
inline const std::string kTreeViewFamShowSpousesOfChildrenKey = "ACTV_Fam_ShowSpousesOfChildren";

// Declared for hosts that store them, and read by nothing: setting one changes nothing.
inline const std::string kTreeViewFamShowGreatGreatGrandparentsKey = "ACTV_Fam_ShowGreatGreatGrandparents";
inline const std::string kTreeViewFamShowGreatGreatGreatGrandparentsKey =
    "ACTV_Fam_ShowGreatGreatGreatGrandparents";

// Set by every family request, and read by no layouter: relatives off the picture are always flagged.
inline const std::string IndicateNonDisplayedRelationships = "INDICATE_NON_DISPLAYED_RELATIONSHIPS";

}  // namespace SharedTreeViewer
