// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Parents through the callbacks: both slots of a real person are always filled, and every look at an unknown
// parent makes a new unknown parent.

#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

#include <support/FamilyText.h>
#include <unit/boundary/Request.h>

namespace {

using support::family;
using unit::Calls;
using unit::failureOf;
using unit::kUnknownKeyFailure;
using unit::Request;

// The parents of a person as id texts; "unset" for a slot that was left alone.
struct ParentTexts {
    std::string father;
    std::string mother;

    bool operator==(const ParentTexts&) const = default;
};

std::ostream& operator<<(std::ostream& out, const ParentTexts& texts) {
    return out << texts.father << " and " << texts.mother;
}

ParentTexts parentsOf(Request& request, support::PersonId id) {
    int father = -1;
    int mother = -1;
    request.callbacks.getParents(request.key(id), father, mother);
    return {father == -1 ? "unset" : request.idText(father), mother == -1 ? "unset" : request.idText(mother)};
}

void expectRecord(const Request& request, const std::string& text, bool male, const std::string& child,
                  const std::string& otherParent) {
    const AddNodeValues record = request.glue.getAddNodeValue(text);
    EXPECT_EQ(male, record.male) << text;
    EXPECT_EQ(text, record.addNodeText);
    EXPECT_EQ(child, record.childText) << text;
    EXPECT_EQ(otherParent, record.otherParentText) << text;
}

TEST(AddNodes, twoRealParentsNeedNone) {
    Request request(family("3+4: 17"));
    EXPECT_EQ((ParentTexts{"3", "4"}), parentsOf(request, 17));
    EXPECT_TRUE(request.glue.addNodes.empty());
}

TEST(AddNodes, missingMotherStandsBesideTheRealFather) {
    Request request(family("3: 17"));
    EXPECT_EQ((ParentTexts{"3", "-1"}), parentsOf(request, 17));
    EXPECT_EQ(1u, request.glue.addNodes.size());
    expectRecord(request, "-1", false, "17", "3");
}

TEST(AddNodes, missingFatherStandsBesideTheRealMother) {
    Request request(family("4f: 17"));
    EXPECT_EQ((ParentTexts{"-1", "4"}), parentsOf(request, 17));
    EXPECT_EQ(1u, request.glue.addNodes.size());
    expectRecord(request, "-1", true, "17", "4");
}

TEST(AddNodes, twoUnknownParentsStandBesideEachOther) {
    Request request(family("17"));
    EXPECT_EQ((ParentTexts{"-1", "-2"}), parentsOf(request, 17));
    EXPECT_EQ(2u, request.glue.addNodes.size());
    expectRecord(request, "-1", true, "17", "-2");
    expectRecord(request, "-2", false, "17", "-1");
}

TEST(AddNodes, everyLookAtTheSamePersonMakesNewOnesAndKeepsTheOld) {
    Request request(family("17"));
    parentsOf(request, 17);
    EXPECT_EQ((ParentTexts{"-3", "-4"}), parentsOf(request, 17));
    EXPECT_EQ(4u, request.glue.addNodes.size());
    expectRecord(request, "-1", true, "17", "-2");
    expectRecord(request, "-3", true, "17", "-4");
}

TEST(AddNodes, takeOrdinaryKeysInOneSequenceWithRealPersons) {
    Request request(family("3: 17"));
    const int child = request.key(17);
    int father = -1;
    int mother = -1;
    request.callbacks.getParents(child, father, mother);
    EXPECT_EQ(0, child);
    EXPECT_EQ(1, father);
    EXPECT_EQ(2, mother);
    request.callbacks.getParents(child, father, mother);
    EXPECT_EQ(1, father);
    EXPECT_EQ(3, mother);
}

TEST(AddNodes, eachRequestStartsTheirIdsAtMinusOneAgain) {
    Request request(family("17"));
    parentsOf(request, 17);
    olvane::resetAddParentId();
    EXPECT_EQ((ParentTexts{"-1", "-2"}), parentsOf(request, 17));
}

TEST(AddNodes, haveNoParentsThemselvesAndTheHostIsNotAsked) {
    Request request(family("17"));
    parentsOf(request, 17);
    request.newCalls();
    EXPECT_EQ((ParentTexts{"unset", "unset"}), parentsOf(request, -1));
    EXPECT_EQ(Calls{}, request.newCalls());
    EXPECT_EQ((ParentTexts{"-3", "-4"}), parentsOf(request, 17));  // the look used up no id
}

TEST(AddNodes, parentsOfAnAddNodeStayAsTheCallerSetThem) {
    Request request(family("17"));
    int father = 123;
    int mother = 456;
    request.callbacks.getParents(request.key(-1), father, mother);
    EXPECT_EQ(123, father);
    EXPECT_EQ(456, mother);
}

TEST(AddNodes, fatherIsAskedForBeforeTheMother) {
    Request request(family("17"));
    parentsOf(request, 17);
    EXPECT_EQ((Calls{"fatherForPersonWithID 17", "motherForPersonWithID 17"}), request.newCalls());
}

TEST(AddNodes, failingMotherLeavesTheFathersIdUsedUp) {
    support::CaseFile input = family("17");
    input.failures[support::HostOperation::motherForPersonWithID] = {1};
    Request request(input);
    EXPECT_EQ("motherForPersonWithID fails at call 1",
              failureOf<support::HostFailure>([&] { parentsOf(request, 17); }));
    EXPECT_TRUE(request.glue.addNodes.empty());
    EXPECT_EQ((ParentTexts{"-2", "-3"}), parentsOf(request, 17));
}

TEST(AddNodes, onlyTheNotFoundValueMeansThatAParentIsUnknown) {
    support::CaseFile input = family("17");
    input.fathers[17] = 0x7fffffff;
    input.mothers[17] = 0;
    Request request(input);
    EXPECT_EQ((ParentTexts{"2147483647", "0"}), parentsOf(request, 17));
    EXPECT_TRUE(request.glue.addNodes.empty());
}

TEST(AddNodes, notFoundIsTheLargest64BitNumber) {
    EXPECT_EQ(0x7fffffffffffffff, OlvaneViewerManagerWrapProtocol::kPersonNotFound);
}

TEST(AddNodes, parentsIdIsCutToItsLow32Bits) {
    support::CaseFile input = family("17");
    input.fathers[17] = 0x100000003;
    input.mothers[17] = 0x7fffffff00000004;
    Request request(input);
    EXPECT_EQ((ParentTexts{"3", "4"}), parentsOf(request, 17));
}

TEST(AddNodes, parentsOfAnUnknownKeyFailByNameAndTheHostIsNotAsked) {
    Request request(family("17"));
    int father = -1;
    int mother = -1;
    EXPECT_EQ(kUnknownKeyFailure,
              failureOf<std::out_of_range>([&] { request.callbacks.getParents(7, father, mother); }));
    EXPECT_EQ(Calls{}, request.newCalls());
}

// Five readers hold every id below 1 for an unknown parent, so a person of id 0 is an unknown parent without a record.
TEST(NegativeIds, personOfIdZeroIsAnUnknownParentToEveryReaderAndHasNoRecord) {
    Request request(family("17"));
    const int key = request.key(0);
    SpouseSet spouses;
    ChildrenSet children;
    EXPECT_EQ((ParentTexts{"unset", "unset"}), parentsOf(request, 0));
    request.callbacks.getSpouses(key, spouses);
    EXPECT_TRUE(spouses.empty());
    EXPECT_TRUE(request.callbacks.isAddNode(key));
    EXPECT_EQ(kUnknownKeyFailure,
              failureOf<std::out_of_range>([&] { request.callbacks.getChildren(key, children); }));
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { request.callbacks.isMale(key); }));
    EXPECT_EQ(Calls{}, request.newCalls());
}

TEST(NegativeIds, personOfIdOneIsRealToEveryReader) {
    Request request(family("1: 5"));
    const int key = request.key(1);
    SpouseSet spouses;
    ChildrenSet children;
    EXPECT_EQ((ParentTexts{"-1", "-2"}), parentsOf(request, 1));
    EXPECT_FALSE(request.callbacks.isAddNode(key));
    EXPECT_TRUE(request.callbacks.isMale(key));
    request.callbacks.getSpouses(key, spouses);
    request.callbacks.getChildren(key, children);
    EXPECT_EQ(1u, children.size());
    EXPECT_EQ((Calls{"fatherForPersonWithID 1", "motherForPersonWithID 1", "sexOfPersonWithID 1",
                     "spousesForPersonWithID 1", "childrenForPersonWithID 1", "dateForPersonWithID 5 1"}),
              request.newCalls());
}

TEST(NegativeIds, unknownParentsSexIsThatOfTheSlot) {
    Request request(family("17f"));
    parentsOf(request, 17);
    request.newCalls();
    EXPECT_TRUE(request.callbacks.isMale(request.key(-1)));
    EXPECT_FALSE(request.callbacks.isMale(request.key(-2)));
    EXPECT_EQ(Calls{}, request.newCalls());
}

}  // namespace
