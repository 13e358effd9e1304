// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A file as persons and unions: places, numbers, orders and kinds.

#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/source/GedcomKin.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

using kin::ChildKind;
using kin::KinGraph;
using kin::kNobody;
using kin::UnionState;
using testing::ElementsAre;

KinGraph graphOf(const std::string& records) {
    return kinGraphOf(read(document(records)));
}

TEST(GedcomKin, personsStandByTheirIdsWithTheirSex) {
    const KinGraph graph = graphOf("0 @Z@ INDI\n1 SEX F\n0 @A@ INDI\n1 SEX M\n0 @B@ INDI\n1 SEX X\n");
    ASSERT_EQ(graph.personCount(), 3);
    EXPECT_EQ(graph.id(2), 3);
    EXPECT_EQ(graph.placeOf(2), 1);
    EXPECT_EQ(graph.sex(0), kin::Sex::female);
    EXPECT_EQ(graph.sex(1), kin::Sex::male);
    EXPECT_EQ(graph.sex(2), kin::Sex::unknown);
    EXPECT_EQ(graph.unionCount(), 0);
}

TEST(GedcomKin, unionsAreTheFamiliesInOrderWithTheirNumbers) {
    const KinGraph graph = graphOf(
        "0 @I1@ INDI\n1 FAMS @F1@\n1 FAMS @F3@\n0 @I2@ INDI\n1 FAMS @F3@\n0 @I3@ INDI\n1 FAMC @F3@\n"
        "0 @F1@ FAM\n1 WIFE @I1@\n0 @F2@ FAM\n0 @F3@ FAM\n1 WIFE @I2@\n1 HUSB @I1@\n1 CHIL @I3@\n");
    ASSERT_EQ(graph.unionCount(), 2);
    EXPECT_EQ(graph.family(0), 1U);
    EXPECT_EQ(graph.family(1), 3U);
    EXPECT_THAT(graph.partners(1), ElementsAre(0, 1));
    EXPECT_THAT(graph.children(1), ElementsAre(2));
    EXPECT_EQ(graph.otherPartner(0, 0), kNobody);
}

TEST(GedcomKin, theStateIsThatOfACouple) {
    const KinGraph graph = graphOf(
        "0 @I1@ INDI\n0 @I2@ INDI\n0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 MARR\n"
        "0 @F2@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 MARR\n1 DIV\n"
        "0 @F3@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n0 @F4@ FAM\n1 HUSB @I1@\n1 MARR\n");
    EXPECT_EQ(graph.state(0), UnionState::married);
    EXPECT_EQ(graph.state(1), UnionState::divorced);
    EXPECT_EQ(graph.state(2), UnionState::unknown);
    EXPECT_EQ(graph.state(3), UnionState::unknown);
}

TEST(GedcomKin, unionsOfAPartnerFollowTheirOwnLinks) {
    const KinGraph graph = graphOf(
        "0 @I1@ INDI\n1 FAMS @F3@\n1 FAMS @F9@\n1 FAMS @F1@\n"
        "0 @F1@ FAM\n1 HUSB @I1@\n0 @F2@ FAM\n1 HUSB @I1@\n0 @F3@ FAM\n1 HUSB @I1@\n");
    EXPECT_THAT(graph.unionsAsPartner(0), ElementsAre(2, 0, 1));
}

TEST(GedcomKin, theFamilyOfBirthComesFirst) {
    const KinGraph graph = graphOf(
        "0 @I1@ INDI\n0 @I2@ INDI\n0 @I3@ INDI\n"
        "0 @I4@ INDI\n1 FAMC @F3@\n2 PEDI foster\n1 FAMC @F1@\n2 PEDI adopted\n1 FAMC @F2@\n"
        "0 @F1@ FAM\n1 HUSB @I1@\n1 CHIL @I4@\n0 @F2@ FAM\n1 WIFE @I2@\n1 CHIL @I4@\n"
        "0 @F3@ FAM\n1 HUSB @I3@\n1 CHIL @I4@\n");
    EXPECT_THAT(graph.unionsAsChild(3), ElementsAre(1, 2, 0));
    EXPECT_THAT(graph.childKinds(0), ElementsAre(ChildKind::adopted));
    EXPECT_THAT(graph.childKinds(1), ElementsAre(ChildKind::birth));
    EXPECT_THAT(graph.childKinds(2), ElementsAre(ChildKind::foster));
}

TEST(GedcomKin, childrenOfEitherSideAreChildren) {
    const KinGraph graph = graphOf(
        "0 @I1@ INDI\n1 FAMS @F1@\n0 @I2@ INDI\n1 FAMC @F1@\n2 PEDI sealing\n"
        "0 @I3@ INDI\n0 @I4@ INDI\n1 FAMC @F1@\n2 PEDI adopted\n1 FAMC @F1@\n"
        "0 @F1@ FAM\n1 HUSB @I1@\n1 CHIL @I9@\n1 CHIL @I4@\n1 CHIL @I3@\n1 CHIL @I4@\n");
    EXPECT_THAT(graph.children(0), ElementsAre(3, 2, 1));
    EXPECT_THAT(graph.childKinds(0), ElementsAre(ChildKind::adopted, ChildKind::birth, ChildKind::sealing));
    EXPECT_THAT(graph.unionsAsChild(1), ElementsAre(0));
    EXPECT_THAT(graph.unionsAsChild(2), ElementsAre(0));
}

TEST(GedcomKin, aCoupleThatDidNotMarryIsUnmarried) {
    const KinGraph graph = kinGraphOf(
        read(document7("0 @I1@ INDI\n0 @I2@ INDI\n0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 NO MARR\n"
                       "0 @F2@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 MARR N\n"
                       "0 @F3@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 NO MARR\n1 MARR\n")));
    EXPECT_EQ(graph.state(0), UnionState::unmarried);
    EXPECT_EQ(graph.state(1), UnionState::unmarried);
    EXPECT_EQ(graph.state(2), UnionState::married);
}

TEST(GedcomKin, aLoneFatherIsPartnerZeroWhateverHisSlot) {
    const KinGraph graph =
        graphOf("0 @I1@ INDI\n1 SEX M\n0 @I2@ INDI\n0 @F1@ FAM\n1 WIFE @I1@\n1 CHIL @I2@\n");
    EXPECT_THAT(graph.partners(0), ElementsAre(0, kNobody));
    EXPECT_THAT(graph.unionsAsPartner(0), ElementsAre(0));
    EXPECT_THAT(graph.unionsAsChild(1), ElementsAre(0));
}

TEST(GedcomKin, aPedigreeOfAnotherKindIsUnknown) {
    const KinGraph graph =
        graphOf("0 @I1@ INDI\n0 @I2@ INDI\n1 FAMC @F1@\n2 PEDI _LIKE\n0 @F1@ FAM\n1 HUSB @I1@\n");
    EXPECT_THAT(graph.childKinds(0), ElementsAre(ChildKind::unknown));
}

TEST(GedcomKin, whoIsTheirOwnParentOrPartnerIsKept) {
    const KinGraph graph =
        graphOf("0 @I1@ INDI\n1 FAMC @F1@\n1 FAMS @F1@\n0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I1@\n1 CHIL @I1@\n");
    EXPECT_THAT(graph.partners(0), ElementsAre(0, 0));
    EXPECT_THAT(graph.children(0), ElementsAre(0));
    EXPECT_THAT(graph.unionsAsPartner(0), ElementsAre(0));
}

}  // namespace
}  // namespace olvane::gedcom::test
