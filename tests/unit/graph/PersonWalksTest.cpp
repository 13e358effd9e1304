// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The walks over a person's relatives. The order of a visit is the order on the page, so every order is stated
// here with a family small enough to follow.

#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/graph/TreeViewPerson.h>
#include <unit/graph/Visits.h>

namespace {

using unit::failureOf;
using unit::kEmptyFunctionFailure;
using unit::Keys;
using unit::keysOf;

typedef TreeViewPerson::Visitor Visitor;

constexpr int kMan = 1;
constexpr int kWife = 2;

// The children of the couple below: a of the man alone, b and c of both, d of the wife alone.
constexpr int kA = 10;
constexpr int kB = 11;
constexpr int kC = 12;
constexpr int kD = 13;

// The couple with the man as the owner of the graph, or with the wife.
TreeViewPerson couple(int owner, int partner, bool ownerIsMale, int ownersChild, int partnersChild) {
    TreeViewPerson person(owner);
    person.setGender(ownerIsMale);
    person.addSpouse(partner, !ownerIsMale).addChildWithNoOtherSpouse(partnersChild, true);
    person.addChildWithNoOtherSpouse(ownersChild, true);
    person.addChildWithSpouse(kB, partner, true);
    person.addChildWithSpouse(kC, partner, false);
    return person;
}

TreeViewPerson manOfTheCouple() {
    return couple(kMan, kWife, true, kA, kD);
}

TreeViewPerson wifeOfTheCouple() {
    return couple(kWife, kMan, false, kD, kA);
}

Keys allChildren(TreeViewPerson& person, bool includeBastards) {
    return keysOf([&](const Visitor& visitor) { person.allChildrenIterator(includeBastards, visitor); });
}

// --- Children.

TEST(ChildWalk, mansChildrenWithoutSecondParentComeFirstAndHisWifesLast) {
    TreeViewPerson man = manOfTheCouple();
    EXPECT_EQ((Keys{kA, kB, kC, kD}), allChildren(man, true));
    EXPECT_EQ((Keys{kA, kB, kC}), allChildren(man, false));
}

TEST(ChildWalk, womansChildrenWithoutSecondParentComeLastAndHerHusbandsFirst) {
    TreeViewPerson wife = wifeOfTheCouple();
    EXPECT_EQ((Keys{kA, kB, kC, kD}), allChildren(wife, true));
    EXPECT_EQ((Keys{kB, kC, kD}), allChildren(wife, false));
}

TEST(ChildWalk, goesMarriageByMarriageInTheOrderOfTheSpouses) {
    TreeViewPerson man(1);
    man.setGender(true);
    man.addSpouse(3, false).addChildWithNoOtherSpouse(33, true);
    man.addSpouse(2, false).addChildWithNoOtherSpouse(22, true);
    man.addChildWithSpouse(21, 2, true);
    man.addChildWithSpouse(31, 3, true);
    EXPECT_EQ((Keys{31, 33, 21, 22}), allChildren(man, true));
}

TEST(ChildWalk, looksAtTheWalkersSexAloneSoThatTwoMenBothWalkAsMen) {
    TreeViewPerson man = manOfTheCouple();
    man.spouses[0].setGender(true);
    EXPECT_EQ((Keys{kA, kB, kC, kD}), allChildren(man, true));
}

TEST(ChildWalk, doesNotReachListsUnderAKeyThatIsNoSpouses) {
    TreeViewPerson man = manOfTheCouple();
    man.addChildWithSpouse(99, 77, true);
    EXPECT_EQ((Keys{kA, kB, kC}), allChildren(man, false));
}

TEST(ChildWalk, underOneKeyGoesFromFirstToLast) {
    TreeViewPerson man = manOfTheCouple();
    EXPECT_EQ((Keys{kB, kC}), keysOf([&](const Visitor& v) { man.childrenIterator(kWife, v); }));
    EXPECT_EQ((Keys{kA}), keysOf([&](const Visitor& v) { man.childrenIterator(-1, v); }));
    EXPECT_EQ(Keys{}, keysOf([&](const Visitor& v) { man.childrenIterator(77, v); }));
}

TEST(ChildWalk, withOneSpouseSetsTheMansChildrenWithoutSecondParentLeftAndTheWomansRight) {
    TreeViewPerson man = manOfTheCouple();
    TreeViewPerson wife = wifeOfTheCouple();
    EXPECT_EQ((Keys{kA, kB, kC, kD}),
              keysOf([&](const Visitor& v) { man.allChildrenWithSpouseIterator(man.spouses[0], v); }));
    EXPECT_EQ((Keys{kA, kB, kC, kD}),
              keysOf([&](const Visitor& v) { wife.allChildrenWithSpouseIterator(wife.spouses[0], v); }));
}

TEST(ChildWalk, withSharedAndTheSpousesChildrenWithoutSecondParentLeavesOutThePersonsOwn) {
    TreeViewPerson man = manOfTheCouple();
    TreeViewPerson wife = wifeOfTheCouple();
    EXPECT_EQ((Keys{kB, kC, kD}), keysOf(man.getChildrenAndBastardsWithSpouseIterator(man.spouses[0])));
    EXPECT_EQ((Keys{kA, kB, kC}), keysOf(wife.getChildrenAndBastardsWithSpouseIterator(wife.spouses[0])));
}

typedef std::vector<std::pair<int, int>> KeyPairs;

KeyPairs childrenWithOtherParent(TreeViewPerson& person) {
    KeyPairs pairs;
    person.childAndSpouseIterator([&](TreeViewPerson& child, TreeViewPerson& other) {
        pairs.emplace_back(child.personId, other.personId);
    });
    return pairs;
}

TEST(ChildAndSpouseWalk, manStandsAsTheOtherParentOfHisChildrenWithoutSecondParentFirst) {
    TreeViewPerson man = manOfTheCouple();
    EXPECT_EQ((KeyPairs{{kA, kMan}, {kB, kWife}, {kC, kWife}}), childrenWithOtherParent(man));
}

TEST(ChildAndSpouseWalk, womanStandsAsTheOtherParentOfHerChildrenWithoutSecondParentLast) {
    TreeViewPerson wife = wifeOfTheCouple();
    EXPECT_EQ((KeyPairs{{kB, kMan}, {kC, kMan}, {kD, kWife}}), childrenWithOtherParent(wife));
}

TEST(ChildAndSpouseWalk, handsOutThePersonAndTheSpouseThemselves) {
    TreeViewPerson man = manOfTheCouple();
    std::vector<TreeViewPerson*> others;
    man.childAndSpouseIterator([&](TreeViewPerson&, TreeViewPerson& other) { others.push_back(&other); });
    EXPECT_EQ((std::vector<TreeViewPerson*>{&man, &man.spouses[0], &man.spouses[0]}), others);
}

// --- Siblings.

TreeViewPerson withSiblings(int self, const Keys& siblings) {
    TreeViewPerson person(self);
    for (const int key : siblings) person.addSibling(key, true);
    return person;
}

Keys siblingsFromSelf(TreeViewPerson& person) {
    return keysOf([&](const Visitor& visitor) { person.allSiblingsIterator(true, visitor); });
}

TEST(SiblingWalk, plainOneGoesFromFirstToLastWithThePersonsOwnEntry) {
    TreeViewPerson person = withSiblings(1, {20, 21, 1, 23, 24});
    EXPECT_EQ((Keys{20, 21, 1, 23, 24}),
              keysOf([&](const Visitor& v) { person.allSiblingsIterator(false, v); }));
}

TEST(SiblingWalk, fromThePersonGoesOutwardToTheLeftThenFromThePersonToTheRight) {
    TreeViewPerson person = withSiblings(1, {20, 21, 1, 23, 24});
    EXPECT_EQ((Keys{21, 20, 1, 23, 24}), siblingsFromSelf(person));
}

TEST(SiblingWalk, fromThePersonStandingFirstIsThePlainOne) {
    TreeViewPerson person = withSiblings(1, {1, 23, 24});
    EXPECT_EQ((Keys{1, 23, 24}), siblingsFromSelf(person));
}

TEST(SiblingWalk, fromThePersonStandingLastEndsWithThePerson) {
    TreeViewPerson person = withSiblings(1, {20, 21, 1});
    EXPECT_EQ((Keys{21, 20, 1}), siblingsFromSelf(person));
}

TEST(SiblingWalk, fromAPersonWithoutAnEntryIsTheWholeListBackwards) {
    TreeViewPerson person = withSiblings(1, {20, 21, 22});
    EXPECT_EQ((Keys{22, 21, 20}), siblingsFromSelf(person));
}

TEST(SiblingWalk, fromThePersonTakesTheFirstOfTwoOwnEntries) {
    TreeViewPerson person = withSiblings(1, {20, 1, 21, 1});
    EXPECT_EQ((Keys{20, 1, 21, 1}), siblingsFromSelf(person));
}

TEST(SiblingWalk, backwardsOneGoesFromLastToFirstWithMinusOneBesideEach) {
    TreeViewPerson person = withSiblings(1, {20, 1, 21});
    Keys keys;
    Keys numbers;
    person.allSiblingsReverseIterator([&](TreeViewPerson& sibling, int number) {
        keys.push_back(sibling.personId);
        numbers.push_back(number);
    });
    EXPECT_EQ((Keys{21, 1, 20}), keys);
    EXPECT_EQ((Keys{-1, -1, -1}), numbers);
}

TEST(SiblingWalk, emptyListIsVisitedInNoDirection) {
    TreeViewPerson person(1);
    EXPECT_EQ(Keys{}, keysOf([&](const Visitor& v) { person.allSiblingsIterator(false, v); }));
    EXPECT_EQ(Keys{}, siblingsFromSelf(person));
    int visits = 0;
    person.allSiblingsReverseIterator([&](TreeViewPerson&, int) { ++visits; });
    EXPECT_EQ(0, visits);
}

// --- Ancestors.

// A father with both parents, of whom his mother has two again, and a mother without any.
TreeViewPerson withAncestors() {
    TreeViewPerson person(1);
    person.setParents(2, 3);
    person.getPreferredFather().setParents(4, 5);
    person.getPreferredFather().getPreferredMother().setParents(6, 7);
    return person;
}

TEST(AncestorWalk, goesRowByRowThroughTheParents) {
    TreeViewPerson person = withAncestors();
    EXPECT_EQ((Keys{2, 3}), keysOf([&](const Visitor& v) { person.parentsIterator(v); }));
    EXPECT_EQ((Keys{4, 5}), keysOf([&](const Visitor& v) { person.grandparentsIterator(v); }));
    EXPECT_EQ((Keys{6, 7}), keysOf([&](const Visitor& v) { person.greatGrandparentsIterator(v); }));
}

TEST(AncestorWalk, bothSidesComeFathersFirst) {
    TreeViewPerson person = withAncestors();
    person.getPreferredMother().setParents(8, 9);
    person.getPreferredMother().getPreferredFather().setParents(10, 11);
    EXPECT_EQ((Keys{4, 5, 8, 9}), keysOf(person.getGrandparentIterator()));
    EXPECT_EQ((Keys{6, 7, 10, 11}), keysOf(person.getGreatGrandparentIterator()));
}

TEST(AncestorWalk, countsAreThoseOfTheWalks) {
    TreeViewPerson person = withAncestors();
    EXPECT_EQ(2, person.getParentCount());
    EXPECT_EQ(2, person.getGrandparentCount());
    EXPECT_EQ(2, person.getGreatGrandparentCount());
    TreeViewPerson alone(1);
    EXPECT_EQ(0, alone.getParentCount());
    EXPECT_EQ(0, alone.getGrandparentCount());
    EXPECT_EQ(0, alone.getGreatGrandparentCount());
}

// --- Spouses.

TEST(SpouseWalk, goesFromFirstToLast) {
    TreeViewPerson person(1);
    for (const int key : {5, 3, 4}) person.addSpouse(key, false);
    EXPECT_EQ((Keys{5, 3, 4}), keysOf([&](const Visitor& v) { person.spouseIterator(v); }));
    EXPECT_EQ((Keys{5, 3, 4}), keysOf(person.getSpouseIterator()));
}

TEST(SpouseWalk, hiddenSpousesHaveAWalkOfTheirOwn) {
    TreeViewPerson person(1);
    person.addSpouse(5, false);
    for (const int key : {8, 7}) person.addNonDisplayedSpouse(key);
    EXPECT_EQ((Keys{8, 7}), keysOf([&](const Visitor& v) { person.nonDisplayedSpouseIterator(v); }));
    EXPECT_EQ((Keys{5}), keysOf(person.getSpouseIterator()));
}

TEST(SpouseWalk, withThePersonAheadVisitsThePersonFirst) {
    TreeViewPerson person(1);
    EXPECT_EQ((Keys{1}), keysOf(person.getSelfAndSpousesIterator()));
    person.addSpouse(5, false);
    person.addSpouse(3, false);
    EXPECT_EQ((Keys{1, 5, 3}), keysOf(person.getSelfAndSpousesIterator()));
}

// --- Walks for later.

TEST(WalkForLater, walksAsTheOneAtOnceDoes) {
    TreeViewPerson man = manOfTheCouple();
    man.setParents(3, 4);
    EXPECT_EQ((Keys{kB, kC}), keysOf(man.getChildrenIterator(kWife)));
    EXPECT_EQ((Keys{kA, kB, kC, kD}), keysOf(man.getAllChildrenIterator(true)));
    EXPECT_EQ((Keys{kA, kB, kC}), keysOf(man.getAllChildrenIterator(false)));
    EXPECT_EQ((Keys{3, 4}), keysOf(man.getParentIterator()));
}

TEST(WalkForLater, seesWhoIsThereWhenItIsCalled) {
    TreeViewPerson person(1);
    const TreeViewPerson::Iterator walk = person.getSpouseIterator();
    EXPECT_EQ(Keys{}, keysOf(walk));
    person.addSpouse(5, false);
    EXPECT_EQ((Keys{5}), keysOf(walk));
    EXPECT_EQ((Keys{5}), keysOf(walk));
}

// --- Visitors.

TEST(Visitor, mayWriteToThePersonItIsGiven) {
    TreeViewPerson person(1);
    person.addSpouse(5, false);
    person.spouseIterator([](TreeViewPerson& spouse) { spouse.layoutWidth = 135.0f; });
    EXPECT_EQ(135.0f, person.spouses[0].layoutWidth);
}

TEST(Visitor, mayAddToOtherListsThanTheOneWalked) {
    TreeViewPerson person(1);
    person.addSpouse(5, false);
    person.addSpouse(6, false);
    person.spouseIterator([&](TreeViewPerson& spouse) {
        spouse.addChildWithNoOtherSpouse(10 + spouse.personId, true);
        person.addChildWithSpouse(20 + spouse.personId, spouse.personId, true);
    });
    EXPECT_EQ((Keys{25, 15, 26, 16}), [&] {
        person.setGender(true);
        return allChildren(person, true);
    }());
}

TEST(Visitor, isCalledForPersonsMarkedAsVisitedToo) {
    TreeViewPerson person(1);
    person.addSpouse(5, false).setHasBeenVisited(true);
    EXPECT_EQ((Keys{5}), keysOf(person.getSpouseIterator()));
}

TEST(Visitor, leftEmptyFailsByNameAtTheFirstPerson) {
    TreeViewPerson person = manOfTheCouple();
    person.setParents(3, 4);
    person.addSibling(5, true);
    const Visitor nobody;
    for (const TreeViewPerson::Iterator& walk :
         {person.getSpouseIterator(), person.getParentIterator(), person.getAllChildrenIterator(true),
          person.getChildrenIterator(kWife), person.getSelfAndSpousesIterator()}) {
        EXPECT_EQ(kEmptyFunctionFailure, failureOf<boost::bad_function_call>([&] { walk(nobody); }));
    }
    EXPECT_EQ(kEmptyFunctionFailure,
              failureOf<boost::bad_function_call>([&] { person.allSiblingsIterator(true, nobody); }));
    EXPECT_EQ(kEmptyFunctionFailure, failureOf<boost::bad_function_call>([&] {
                  person.allSiblingsReverseIterator(TreeViewPerson::ReverseVisitor());
              }));
    EXPECT_EQ(kEmptyFunctionFailure, failureOf<boost::bad_function_call>([&] {
                  person.childAndSpouseIterator(TreeViewPerson::PairVisitor());
              }));
}

TEST(Visitor, leftEmptyDoesNoHarmOnAnEmptyWalk) {
    TreeViewPerson person(1);
    const Visitor nobody;
    EXPECT_NO_THROW(person.spouseIterator(nobody));
    EXPECT_NO_THROW(person.parentsIterator(nobody));
    EXPECT_NO_THROW(person.allChildrenIterator(true, nobody));
    EXPECT_NO_THROW(person.allSiblingsIterator(true, nobody));
    EXPECT_NO_THROW(person.getGreatGrandparentIterator()(nobody));
    EXPECT_NO_THROW(person.allSiblingsReverseIterator(TreeViewPerson::ReverseVisitor()));
}

TEST(Visitor, failureOfItsOwnPassesThroughAndEndsTheWalk) {
    TreeViewPerson person(1);
    for (const int key : {5, 6, 7}) person.addSpouse(key, false);
    Keys visited;
    const auto failAtTheSecond = [&](TreeViewPerson& spouse) {
        visited.push_back(spouse.personId);
        if (spouse.personId == 6) throw std::runtime_error("enough");
    };
    EXPECT_EQ("enough", failureOf<std::runtime_error>([&] { person.spouseIterator(failAtTheSecond); }));
    EXPECT_EQ((Keys{5, 6}), visited);
}

// --- Counts.

TEST(Counts, areTheSizesOfTheLists) {
    TreeViewPerson man = manOfTheCouple();
    man.addSibling(1, true);
    man.addSibling(7, true);
    man.addNonDisplayedSpouse(2);
    EXPECT_EQ(1, man.getSpouseCount());
    EXPECT_EQ(1, man.getNonDisplayedSpouseCount());
    EXPECT_EQ(2, man.getSiblingCount());  // with the person's own entry
    EXPECT_EQ(2, man.getChildrenWithSpouseCount(kWife));
    EXPECT_EQ(1, man.getChildrenWithSpouseCount(-1));
    EXPECT_EQ(1, man.getChildrenWithNoOtherParentCount());
}

TEST(Counts, allChildrenAreCountedWithoutTheSpousesLoneOnesThatTheWalkVisits) {
    TreeViewPerson man = manOfTheCouple();
    EXPECT_EQ(3, man.getAllChildrenCount());
    EXPECT_EQ(4u, allChildren(man, true).size());
}

TEST(Counts, childrenUnderAKeyThatIsNoSpousesAreNotCounted) {
    TreeViewPerson man = manOfTheCouple();
    man.addChildWithSpouse(99, 77, true);
    EXPECT_EQ(3, man.getAllChildrenCount());
}

TEST(Counts, spouseListedTwiceCountsTheSharedChildrenTwice) {
    TreeViewPerson man = manOfTheCouple();
    man.addSpouse(kWife, false);
    EXPECT_EQ(5, man.getAllChildrenCount());
}

TEST(Counts, childIsFoundUnderItsOtherParentAlone) {
    TreeViewPerson man = manOfTheCouple();
    EXPECT_TRUE(man.hasChildWithSpouse(kWife, kB));
    EXPECT_TRUE(man.hasChildWithSpouse(-1, kA));
    EXPECT_FALSE(man.hasChildWithSpouse(kWife, kA));
    EXPECT_FALSE(man.hasChildWithSpouse(-1, kB));
}

TEST(Counts, lookForAChildUnderAMissingKeyLeavesAnEmptyListThere) {
    TreeViewPerson man = manOfTheCouple();
    EXPECT_FALSE(man.hasChildWithSpouse(99, 5));
    ASSERT_EQ(1u, man.children.count(99));
    EXPECT_TRUE(man.children[99].empty());
}

TEST(Counts, everyLookByKeyLeavesAnEmptyListUnderAMissingOne) {
    TreeViewPerson person(1);
    person.childrenIterator(5, [](TreeViewPerson&) {});
    EXPECT_EQ(0, person.getChildrenWithSpouseCount(6));
    EXPECT_EQ(0, person.getChildrenWithNoOtherParentCount());
    person.addSpouse(7, false);
    EXPECT_EQ(0, person.getAllChildrenCount());
    for (const int key : {5, 6, -1, 7}) EXPECT_EQ(1u, person.children.count(key)) << key;
    EXPECT_EQ(Keys{}, allChildren(person, true));
}

}  // namespace
