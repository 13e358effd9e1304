// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomReader.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomKin.h>

namespace olvane::gedcom {
namespace {

// Kim is adopted by 2 and 3, fostered by 4 alone, and the child by birth of 5 and 6; in this order.
GedcomData adopted() {
    return readGedcomBytes(
        "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n"
        "0 @I1@ INDI\n1 NAME Kim //\n1 FAMC @F1@\n2 PEDI foster\n1 FAMC @F2@\n2 PEDI adopted\n1 FAMC @F3@\n2 "
        "PEDI birth\n"
        "0 @I2@ INDI\n1 SEX M\n1 FAMS @F2@\n0 @I3@ INDI\n1 SEX F\n1 FAMS @F2@\n0 @I4@ INDI\n1 SEX F\n1 FAMS "
        "@F1@\n"
        "0 @I5@ INDI\n1 SEX M\n1 FAMS @F3@\n0 @I6@ INDI\n1 SEX F\n1 FAMS @F3@\n"
        "0 @F1@ FAM\n1 WIFE @I4@\n1 CHIL @I1@\n0 @F2@ FAM\n1 HUSB @I2@\n1 WIFE @I3@\n1 CHIL @I1@\n"
        "0 @F3@ FAM\n1 HUSB @I5@\n1 WIFE @I6@\n1 CHIL @I1@\n0 TRLR\n",
        "adopted.ged", ReadOptions());
}

constexpr std::int64_t kNobody = OlvaneViewerManagerWrapProtocol::kPersonNotFound;

struct Expected {
    ParentChoice choice;
    std::int64_t father;
    std::int64_t mother;
};

TEST(ParentChoices, answerTheParentsThatAreAskedForFirst) {
    const GedcomData data = adopted();
    const Expected all[] = {
        {{ParentOrder::birth, 0, 0}, 5, 6},
        {{ParentOrder::adoptive, 0, 0}, 2, 3},
        {{ParentOrder::inOrder, 0, 0}, kNobody, 4},
        {{ParentOrder::birth, 1, 1}, kNobody, 4},
        {{ParentOrder::inOrder, 1, 3}, 5, 6},
        {{ParentOrder::birth, 2, 1}, 5, 6},    // a choice for somebody else
        {{ParentOrder::birth, 1, 999}, 5, 6},  // a family that the person is no child of
    };
    for (const Expected& expected : all) {
        GedcomDataSource source(data, expected.choice);
        EXPECT_EQ(source.fatherForPersonWithID(1), expected.father);
        EXPECT_EQ(source.motherForPersonWithID(1), expected.mother);
        const kin::KinGraph graph = kinGraphOf(data, expected.choice);
        const auto& partners = graph.partners(graph.unionsAsChild(0).front());
        EXPECT_EQ(partners[1], static_cast<kin::Place>(expected.mother - 1));
        EXPECT_EQ(graph.unionsAsChild(0).size(), 3U);
    }
}

TEST(ParentChoices, thoseByBirthAreThePersonsOwnFatherAndMother) {
    const GedcomData data = adopted();
    GedcomDataSource source(data);
    EXPECT_EQ(source.fatherForPersonWithID(1), data.person(1).father);
    EXPECT_EQ(source.motherForPersonWithID(1), data.person(1).mother);
}

}  // namespace
}  // namespace olvane::gedcom
