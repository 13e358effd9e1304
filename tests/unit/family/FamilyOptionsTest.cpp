// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What each option of the family view takes off the chart. One family has a relative of every kind; a row
// says which of them are missing when its option is off.

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

#include <olvane/family/FamilyOptions.h>
#include <support/CaseRun.h>

#include "LaidOutCase.h"

namespace {

using views::LaidOutCase;
typedef std::set<int> Ids;

// The focus 1 with a wife 2, a son 3 whose wife is 4 and whose child is 5, parents 10 and 11, a brother 20
// with a wife 21 and a son 22, the father's parents 30 and 31 and brother 50 with a wife 51 and a son 52, and
// great-grandparents 40 and 41.
const std::string kEveryKind =
    "focus 1\n"
    "spouses 1 2\nspouses 2 1\nchildren 1 3\nchildren 2 3\nfather 3 1\nmother 3 2\n"
    "spouses 3 4\nspouses 4 3\nchildren 3 5\nchildren 4 5\nfather 5 3\nmother 5 4\n"
    "father 1 10\nmother 1 11\nchildren 10 1 20\nchildren 11 1 20\nspouses 10 11\nspouses 11 10\n"
    "father 20 10\nmother 20 11\nspouses 20 21\nspouses 21 20\nchildren 20 22\nchildren 21 22\n"
    "father 22 20\nmother 22 21\n"
    "father 10 30\nmother 10 31\nchildren 30 10 50\nchildren 31 10 50\nspouses 30 31\nspouses 31 30\n"
    "father 50 30\nmother 50 31\nspouses 50 51\nspouses 51 50\nchildren 50 52\nchildren 51 52\n"
    "father 52 50\nmother 52 51\n"
    "father 30 40\nmother 30 41\nchildren 40 30\nchildren 41 30\nspouses 40 41\nspouses 41 40\n";

const Ids kEverybody{1, 2, 3, 4, 5, 10, 11, 20, 21, 22, 30, 31, 40, 41, 50, 51, 52};

Ids without(const Ids& missing) {
    Ids rest;
    for (const int id : kEverybody) {
        if (missing.count(id) == 0) rest.insert(id);
    }
    return rest;
}

Ids shownWith(const std::string& options) {
    LaidOutCase chart(options + kEveryKind);
    return chart.realPersons();
}

std::string textWith(const std::string& options) {
    return support::layoutText(support::parseCase(options + kEveryKind));
}

struct Row {
    std::string key;
    Ids missingWhenOff;
};

const std::vector<Row> kRows{
    {"ACTV_Fam_ShowAuntsUncles", {50, 51, 52}},
    {"ACTV_Fam_ShowCousins", {52}},
    {"ACTV_Fam_ShowSiblings", {20, 21, 22}},
    {"ACTV_Fam_ShowSiblingSpouses", {21}},
    {"ACTV_Fam_ShowNeicesNephews", {22}},
    {"ACTV_Fam_ShowGrandchildren", {5}},
    {"ACTV_Fam_ShowGreatGrandparents", {40, 41}},
    {"ACTV_Fam_ShowGreatGreatGrandparents", {}},
    {"ACTV_Fam_ShowGreatGreatGreatGrandparents", {}},
    {"ACTV_Fam_ShowSpousesOfChildren", {4}},
    {"INDICATE_NON_DISPLAYED_RELATIONSHIPS", {}},
};

TEST(FamilyOptions, keysKeepTheSpellingThatHostsStore) {
    using namespace SharedTreeViewer;
    EXPECT_EQ("ACTV_Fam_ShowAuntsUncles", kTreeViewFamShowAuntsUnclesKey);
    EXPECT_EQ("ACTV_Fam_ShowCousins", kTreeViewFamShowCousinsKey);
    EXPECT_EQ("ACTV_Fam_ShowSiblings", kTreeViewFamShowSiblingsKey);
    EXPECT_EQ("ACTV_Fam_ShowSiblingSpouses", kTreeViewFamShowSiblingSpousesKey);
    EXPECT_EQ("ACTV_Fam_ShowNeicesNephews", kTreeViewFamShowNeicesNephewsKey);
    EXPECT_EQ("ACTV_Fam_ShowGrandchildren", kTreeViewFamShowGrandchildrenKey);
    EXPECT_EQ("ACTV_Fam_ShowGreatGrandparents", kTreeViewFamShowGreatGrandparentsKey);
    EXPECT_EQ("ACTV_Fam_ShowGreatGreatGrandparents", kTreeViewFamShowGreatGreatGrandparentsKey);
    EXPECT_EQ("ACTV_Fam_ShowGreatGreatGreatGrandparents", kTreeViewFamShowGreatGreatGreatGrandparentsKey);
    EXPECT_EQ("ACTV_Fam_ShowSpousesOfChildren", kTreeViewFamShowSpousesOfChildrenKey);
    EXPECT_EQ("INDICATE_NON_DISPLAYED_RELATIONSHIPS", IndicateNonDisplayedRelationships);
}

TEST(FamilyOptions, everybodyIsShownWhenNoOptionIsGiven) {
    EXPECT_EQ(kEverybody, shownWith(""));
}

TEST(FamilyOptions, eachOptionTakesItsOwnRelativesOffTheChart) {
    for (const Row& row : kRows) {
        EXPECT_EQ(without(row.missingWhenOff), shownWith("option " + row.key + " 0\n")) << row.key;
    }
}

TEST(FamilyOptions, anOptionThatIsOnEqualsAnOptionThatIsAbsent) {
    const std::string plain = textWith("");
    ASSERT_FALSE(plain.empty());
    for (const Row& row : kRows) EXPECT_EQ(plain, textWith("option " + row.key + " 1\n")) << row.key;
}

TEST(FamilyOptions, keysThatNothingReadsChangeNothing) {
    const std::string plain = textWith("");
    ASSERT_FALSE(plain.empty());
    EXPECT_EQ(plain, textWith("option ACTV_Fam_ShowGreatGreatGrandparents 0\n"));
    EXPECT_EQ(plain, textWith("option ACTV_Fam_ShowGreatGreatGreatGrandparents 0\n"));
    EXPECT_EQ(plain, textWith("option ACTV_Fam_ShowNiecesNephews 0\n")) << "the right spelling is no key";
}

TEST(FamilyOptions, hiddenRelativesAreFlaggedWhateverTheOptionSays) {
    const std::string noSiblings = "option ACTV_Fam_ShowSiblings 0\n";
    LaidOutCase flagged(noSiblings + "option INDICATE_NON_DISPLAYED_RELATIONSHIPS 1\n" + kEveryKind);
    LaidOutCase notFlagged(noSiblings + "option INDICATE_NON_DISPLAYED_RELATIONSHIPS 0\n" + kEveryKind);
    EXPECT_TRUE(flagged.flag(10));
    EXPECT_TRUE(notFlagged.flag(10));
}

TEST(FamilyOptions, cousinsNeedTheirParentsToBeShown) {
    EXPECT_EQ(without({50, 51, 52}),
              shownWith("option ACTV_Fam_ShowCousins 1\noption ACTV_Fam_ShowAuntsUncles 0\n"));
}

TEST(FamilyOptions, spousesAndChildrenOfSiblingsNeedTheSiblings) {
    EXPECT_EQ(without({20, 21, 22}), shownWith("option ACTV_Fam_ShowSiblings 0\n"
                                               "option ACTV_Fam_ShowSiblingSpouses 1\n"
                                               "option ACTV_Fam_ShowNeicesNephews 1\n"));
}

TEST(FamilyOptions, withoutSiblingsThereIsNoSiblingListAtAll) {
    LaidOutCase chart("option ACTV_Fam_ShowSiblings 0\n" + kEveryKind);
    EXPECT_EQ(0, chart.person(1).getSiblingCount());
}

TEST(FamilyOptions, spousesChildrenStepChildrenParentsAndGrandparentsHaveNoOption) {
    std::string allOff;
    for (const Row& row : kRows) allOff += "option " + row.key + " 0\n";
    LaidOutCase chart(allOff + kEveryKind + "children 2 3 6\nmother 6 2\n");
    EXPECT_EQ((Ids{1, 2, 3, 6, 10, 11, 30, 31}), chart.realPersons());
}

TEST(FamilyOptions, grandchildrenHangFromTheChildAloneWhenItsSpouseIsHidden) {
    LaidOutCase chart("option ACTV_Fam_ShowSpousesOfChildren 0\n" + kEveryKind);
    EXPECT_EQ(1, chart.person(3).getChildrenWithNoOtherParentCount());
}

}  // namespace
