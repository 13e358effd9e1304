// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A person's box: what it is made of, how relatives are added, and who owns whom.

#include <stdexcept>

#include <gtest/gtest.h>

#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

#include <olvane/graph/TreeViewPerson.h>
#include <unit/graph/Visits.h>

namespace {

using unit::Keys;
using unit::keysOf;

TEST(NewPerson, standsAtTheOriginWithoutRelativesMarksOrLines) {
    const TreeViewPerson person(7);
    EXPECT_EQ(7, person.getPersonId());
    EXPECT_EQ(-1, person.getParentId());
    EXPECT_FALSE(person.hasBeenVisited());
    EXPECT_FALSE(person.gender);
    EXPECT_FALSE(person.allChildrenLoaded);
    EXPECT_FALSE(person.nonDisplayedSpousesLoaded);
    EXPECT_FALSE(person.hasNonDisplayedRelationships);
    EXPECT_TRUE(person.spouseEdges.empty());
    EXPECT_TRUE(person.unownedSpouseEdges.empty());
    EXPECT_TRUE(person.generationEdges.empty());
    EXPECT_TRUE(person.allChildren.empty());
    EXPECT_EQ(-1, person.preferredFatherIndex);
    EXPECT_EQ(-1, person.preferredMotherIndex);
    EXPECT_TRUE(person.parents.empty());
    EXPECT_TRUE(person.spouses.empty());
    EXPECT_TRUE(person.nonDisplayedSpouses.empty());
    EXPECT_TRUE(person.children.empty());
    EXPECT_TRUE(person.siblings.empty());
    EXPECT_TRUE(person.lineSegments.empty());
    EXPECT_TRUE(person.spouseLines.empty());
    EXPECT_EQ(0.0f, person.getNodeCenter().x);
    EXPECT_EQ(0.0f, person.getNodeCenter().y);
}

TEST(NewPerson, fieldsWithoutADefaultAreZero) {
    const TreeViewPerson person(7);
    EXPECT_FALSE(person.isProximalPerson);
    EXPECT_EQ(0.0f, person.layoutWidth);
    EXPECT_EQ(0.0f, person.spouseLineOffset);
}

TEST(AddedPerson, isTheLastOfItsListWithTheGivenSexAndNothingElse) {
    TreeViewPerson owner(1);
    owner.gender = true;
    TreeViewPerson::Persons list;
    owner.addPerson(2, list, false);
    TreeViewPerson& added = owner.addPerson(3, list, true);
    EXPECT_EQ((Keys{2, 3}), keysOf(list));
    EXPECT_EQ(&list.back(), &added);
    EXPECT_TRUE(added.gender);
    EXPECT_EQ(-1, added.parentId);
    EXPECT_EQ(-1, added.preferredFatherIndex);
    EXPECT_TRUE(added.parents.empty());
    EXPECT_FALSE(list.front().gender);
}

TEST(AddedPerson, keyAddedTwiceStandsTwiceAndEveryWalkVisitsBoth) {
    TreeViewPerson person(1);
    for (int i = 0; i < 2; ++i) {
        person.addParent(2, true);
        person.addSpouse(3, false);
        person.addNonDisplayedSpouse(4);
        person.addChildWithNoOtherSpouse(5, true);
        person.addSibling(6, true);
    }
    typedef TreeViewPerson::Visitor Visitor;
    EXPECT_EQ((Keys{2, 2}), keysOf([&](const Visitor& v) { person.parentsIterator(v); }));
    EXPECT_EQ((Keys{3, 3}), keysOf([&](const Visitor& v) { person.spouseIterator(v); }));
    EXPECT_EQ((Keys{4, 4}), keysOf([&](const Visitor& v) { person.nonDisplayedSpouseIterator(v); }));
    EXPECT_EQ((Keys{5, 5}), keysOf([&](const Visitor& v) { person.childrenIterator(-1, v); }));
    EXPECT_EQ((Keys{5, 5}), keysOf([&](const Visitor& v) { person.allChildrenIterator(true, v); }));
    EXPECT_EQ((Keys{6, 6}), keysOf([&](const Visitor& v) { person.allSiblingsIterator(false, v); }));
    EXPECT_EQ((Keys{6, 6}), keysOf([&](const Visitor& v) { person.allSiblingsIterator(true, v); }));
}

TEST(AddedPerson, childAndSiblingHelpersFillAnyList) {
    TreeViewPerson person(1);
    TreeViewPerson::Persons list;
    TreeViewPerson& child = person.addChild(5, list, true);
    EXPECT_EQ(&list.back(), &child);
    EXPECT_TRUE(child.gender);
    TreeViewPerson& sibling = person.addSiblingHelper(6, list, false);
    EXPECT_EQ(&list.back(), &sibling);
    EXPECT_FALSE(sibling.gender);
    EXPECT_EQ((Keys{5, 6}), keysOf(list));
}

TEST(AddedPerson, keepsItsOwnRelativesWhileItsListGrows) {
    TreeViewPerson person(1);
    person.addSpouse(2, false).addChildWithNoOtherSpouse(3, true).getNodeCenter().x = 5.5f;
    for (int key = 10; key < 40; ++key) person.addSpouse(key, false);
    ASSERT_EQ(31, person.getSpouseCount());
    ASSERT_EQ(1, person.spouses[0].getChildrenWithNoOtherParentCount());
    EXPECT_EQ(5.5f, person.spouses[0].children[-1][0].getNodeCenter().x);
}

TEST(PersonsParents, bothSetOnAPersonWithoutAny) {
    TreeViewPerson person(1);
    person.setParents(7, 9);
    EXPECT_EQ((Keys{7, 9}), keysOf(person.parents));
    EXPECT_EQ(0, person.preferredFatherIndex);
    EXPECT_EQ(1, person.preferredMotherIndex);
    EXPECT_EQ(7, person.getPreferredFather().personId);
    EXPECT_EQ(9, person.getPreferredMother().personId);
    EXPECT_TRUE(person.parents[0].gender);
    EXPECT_FALSE(person.parents[1].gender);
}

TEST(PersonsParents, setAgainStandBehindTheEarlierOnesAndArePreferred) {
    TreeViewPerson person(1);
    person.setParents(7, 9);
    person.setParents(17, 19);
    EXPECT_EQ((Keys{7, 9, 17, 19}), keysOf(person.parents));
    EXPECT_EQ(2, person.preferredFatherIndex);
    EXPECT_EQ(3, person.preferredMotherIndex);
    EXPECT_EQ(17, person.getPreferredFather().personId);
}

TEST(PersonsParents, fatherAloneLeavesTheMotherUnset) {
    TreeViewPerson person(1);
    person.setParentsFatherOnly(7);
    EXPECT_EQ(1, person.getParentCount());
    EXPECT_EQ(7, person.getPreferredFather().personId);
    EXPECT_TRUE(person.getPreferredFather().gender);
    EXPECT_EQ(-1, person.preferredMotherIndex);
    EXPECT_THROW(person.getPreferredMother(), std::out_of_range);
}

TEST(PersonsParents, motherAloneLeavesTheFatherUnset) {
    TreeViewPerson person(1);
    person.setParentsMotherOnly(9);
    EXPECT_EQ(1, person.getParentCount());
    EXPECT_EQ(0, person.preferredMotherIndex);
    EXPECT_EQ(9, person.getPreferredMother().personId);
    EXPECT_FALSE(person.getPreferredMother().gender);
    EXPECT_EQ(-1, person.preferredFatherIndex);
    EXPECT_THROW(person.getPreferredFather(), std::out_of_range);
}

TEST(PersonsParents, motherSetAfterTheFatherLeavesHimPreferred) {
    TreeViewPerson person(1);
    person.setParentsFatherOnly(7);
    person.setParentsMotherOnly(9);
    EXPECT_EQ(0, person.preferredFatherIndex);
    EXPECT_EQ(1, person.preferredMotherIndex);
}

TEST(PersonsParents, parentAddedPlainlyIsNobodysPreferredOne) {
    TreeViewPerson person(1);
    TreeViewPerson& parent = person.addParent(7, true);
    EXPECT_EQ(&person.parents[0], &parent);
    EXPECT_TRUE(parent.gender);
    EXPECT_EQ(-1, person.preferredFatherIndex);
    EXPECT_EQ(-1, person.preferredMotherIndex);
    EXPECT_THROW(person.getPreferredFather(), std::out_of_range);
}

TEST(PersonsParents, preferredIndexBeyondTheListFails) {
    TreeViewPerson person(1);
    person.setParents(7, 9);
    person.preferredFatherIndex = 2;
    person.preferredMotherIndex = -2;
    EXPECT_THROW(person.getPreferredFather(), std::out_of_range);
    EXPECT_THROW(person.getPreferredMother(), std::out_of_range);
}

TEST(PersonsSpouses, preferredOneIsTheFirst) {
    TreeViewPerson person(1);
    EXPECT_THROW(person.getPreferredSpouse(), std::out_of_range);
    person.addSpouse(2, false);
    TreeViewPerson& second = person.addSpouse(3, true);
    EXPECT_EQ(2, person.getPreferredSpouse().personId);
    EXPECT_FALSE(person.getPreferredSpouse().gender);
    EXPECT_EQ(&person.spouses[1], &second);
    EXPECT_TRUE(second.gender);
}

TEST(PersonsSpouses, hiddenSpouseIsAWomanEvenWhenAHusbandAndWalksAsOne) {
    TreeViewPerson wife(1);
    TreeViewPerson& husband = wife.addNonDisplayedSpouse(2);
    EXPECT_EQ(&wife.nonDisplayedSpouses[0], &husband);
    EXPECT_FALSE(husband.gender);
    husband.addSpouse(1, false);
    husband.addChildWithNoOtherSpouse(5, true);
    husband.addChildWithSpouse(6, 1, true);
    // A man's only children would come first.
    EXPECT_EQ((Keys{6, 5}), keysOf(husband.getAllChildrenIterator(false)));
}

TEST(PersonsSiblings, halfSiblingNamesTheSharedParentAndAFullOneNone) {
    TreeViewPerson person(1);
    TreeViewPerson& half = person.addHalfSibling(5, 3, true);
    EXPECT_EQ(&person.siblings[0], &half);
    EXPECT_EQ(5, half.getPersonId());
    EXPECT_EQ(3, half.getParentId());
    EXPECT_TRUE(half.gender);
    TreeViewPerson& full = person.addSibling(5, true);
    EXPECT_EQ(&person.siblings[1], &full);
    EXPECT_EQ(-1, full.getParentId());
    EXPECT_TRUE(full.gender);
}

TEST(PersonsChildren, standUnderTheOtherParentsKey) {
    TreeViewPerson person(1);
    TreeViewPerson& first = person.addChildWithSpouse(5, 2, true);
    EXPECT_EQ(&person.children[2][0], &first);
    person.addChildWithSpouse(6, 2, false);
    person.addChildWithSpouse(7, 3, true);
    EXPECT_EQ((Keys{5, 6}), keysOf(person.children[2]));
    EXPECT_EQ((Keys{7}), keysOf(person.children[3]));
    EXPECT_TRUE(person.children[2][0].gender);
    EXPECT_FALSE(person.children[2][1].gender);
}

TEST(PersonsChildren, childUnderKeyMinusOneIsAChildWithNoOtherParent) {
    TreeViewPerson person(1);
    person.addChildWithSpouse(5, -1, true);
    TreeViewPerson& second = person.addChildWithNoOtherSpouse(6, false);
    EXPECT_EQ(&person.children[-1][1], &second);
    EXPECT_EQ((Keys{5, 6}), keysOf(person.children[-1]));
    EXPECT_EQ(2, person.getChildrenWithNoOtherParentCount());
}

TEST(PlainFields, areReadAsTheyWereWritten) {
    TreeViewPerson person(1);
    person.setGender(true);
    EXPECT_TRUE(person.gender);
    person.setGender(false);
    EXPECT_FALSE(person.gender);
    person.setHasBeenVisited(true);
    EXPECT_TRUE(person.hasBeenVisited());
    person.setHasBeenVisited(false);
    EXPECT_FALSE(person.hasBeenVisited());
    person.getNodeCenter().x = 27.5f;
    person.getNodeCenter().y = -110.0f;
    EXPECT_EQ(27.5f, person.nodeCenter.x);
    EXPECT_EQ(-110.0f, person.nodeCenter.y);
}

TEST(CopyOfAPerson, isDeep) {
    TreeViewPerson person(1);
    person.addSpouse(2, false).addChildWithNoOtherSpouse(3, true);
    person.addChildWithSpouse(4, 2, true);
    TreeViewPerson copy(person);
    copy.spouses[0].children[-1][0].personId = 30;
    copy.children[2][0].addSpouse(40, false);
    EXPECT_EQ(3, person.spouses[0].children[-1][0].personId);
    EXPECT_EQ(0, person.children[2][0].getSpouseCount());
    EXPECT_EQ(1, copy.children[2][0].getSpouseCount());
}

TEST(CopyOfAPerson, takesEveryPlainFieldAlong) {
    TreeViewPerson person(1);
    person.isProximalPerson = true;
    person.layoutWidth = 135.0f;
    person.spouseLineOffset = -5.0f;
    person.parentId = 3;
    person.gender = true;
    person.setHasBeenVisited(true);
    person.hasNonDisplayedRelationships = true;
    person.getNodeCenter() = TreePoint{1.5f, 2.5f};
    person.addLineSegment(1.0f, 2.0f, 3.0f, 4.0f, true);
    const TreeViewPerson copy(person);
    EXPECT_TRUE(copy.isProximalPerson);
    EXPECT_EQ(135.0f, copy.layoutWidth);
    EXPECT_EQ(-5.0f, copy.spouseLineOffset);
    EXPECT_EQ(3, copy.parentId);
    EXPECT_TRUE(copy.gender);
    EXPECT_TRUE(copy.hasBeenVisited());
    EXPECT_TRUE(copy.hasNonDisplayedRelationships);
    EXPECT_EQ(1.5f, copy.nodeCenter.x);
    EXPECT_EQ(1u, copy.lineSegments.size());
}

}  // namespace
