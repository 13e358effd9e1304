// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/LayoutPicture.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/picture/Judge.h>

using olvane::TypedLayout;
using olvane::picture::BoxKind;
using olvane::picture::Family;
using olvane::picture::Index;
using olvane::picture::judge;
using olvane::picture::kNone;
using olvane::picture::LayoutPictureOptions;
using olvane::picture::MarkKind;
using olvane::picture::Picture;
using olvane::picture::pictureOf;
using testing::ElementsAre;

namespace kin = olvane::kin;

namespace {

// A layout made by hand, and what is known beside it. Ids are those of the graph, in the order of the persons.
class LayoutPicture : public testing::Test {
protected:
    TypedLayout::Index addBox(std::int64_t id, int x, int y) {
        TypedLayout::Box box;
        box.id = id;
        box.x = x;
        box.y = y;
        layout_.boxes.push_back(box);
        return static_cast<TypedLayout::Index>(layout_.boxes.size()) - 1;
    }
    TypedLayout::Index addUnknownMother(TypedLayout::Index child, int x, int y) {
        const TypedLayout::Index box = addBox(-1, x, y);
        layout_.boxes.back().kind = TypedLayout::BoxKind::unknownMother;
        layout_.boxes.back().childOf = child;
        return box;
    }
    void addFamily(TypedLayout::Index father, TypedLayout::Index mother,
                   const std::vector<TypedLayout::Index>& children) {
        TypedLayout::Family family;
        family.parents[0] = father;
        family.parents[1] = mother;
        family.firstChild = static_cast<std::uint32_t>(layout_.children.size());
        family.childCount = static_cast<std::uint32_t>(children.size());
        layout_.children.insert(layout_.children.end(), children.begin(), children.end());
        layout_.families.push_back(family);
    }
    void addPersons(int count) {
        for (int id = 1; id <= count; ++id) builder_.addPerson(id, kin::Sex::unknown);
    }
    void addUnion(kin::Place a, kin::Place b, std::uint32_t number, kin::UnionState state,
                  const std::vector<std::pair<kin::Place, kin::ChildKind>>& children) {
        const kin::UnionPlace u = builder_.addUnion(a, b, state, number);
        for (const auto& [child, kind] : children) builder_.addChild(u, child, kind);
    }
    Picture paint(bool unknownParents = true) {
        const kin::KinGraph known = builder_.build();
        LayoutPictureOptions options;
        options.known = &known;
        options.unknownParents = unknownParents;
        Picture picture = pictureOf(layout_, options);
        untold_ = judge(picture, &known).untold.value_or(99);
        return picture;
    }

    TypedLayout layout_;
    kin::KinGraphBuilder builder_;
    std::size_t untold_ = 0;
};

constexpr auto kBirth = kin::ChildKind::birth;
constexpr auto kMarried = kin::UnionState::married;

}  // namespace

// The focus hangs from its father and the box of the unknown mother, the siblings from the father alone.
TEST_F(LayoutPicture, fullSiblingsOfAnUnknownMotherAreOneFamily) {
    const auto focus = addBox(1, 0, 110);
    const auto father = addBox(2, 0, 0);
    const auto sister = addBox(3, 80, 110);
    const auto mother = addUnknownMother(focus, 80, 0);
    addFamily(father, mother, {focus});
    addFamily(father, TypedLayout::kNone, {sister});
    addPersons(3);
    addUnion(1, kin::kNobody, 5, kin::UnionState::unknown, {{0, kBirth}, {2, kBirth}});
    const Picture picture = paint();
    ASSERT_EQ(picture.families.size(), 1u);
    EXPECT_THAT(picture.children(picture.families[0]), ElementsAre(0, 2));
    EXPECT_EQ(picture.parents(picture.families[0]).size(), 2u);
    EXPECT_EQ(picture.families[0].number, 5u);
}

TEST_F(LayoutPicture, fullSiblingsStayOneFamilyWhereUnknownParentsAreLeftOut) {
    const auto focus = addBox(1, 0, 110);
    const auto father = addBox(2, 0, 0);
    const auto sister = addBox(3, 80, 110);
    const auto half = addBox(4, 160, 110);
    addFamily(father, addUnknownMother(focus, 80, 0), {focus});
    addFamily(father, TypedLayout::kNone, {sister, half});
    addPersons(5);
    addUnion(1, kin::kNobody, 5, kin::UnionState::unknown, {{0, kBirth}, {2, kBirth}});
    addUnion(1, 4, 6, kMarried, {{3, kBirth}});
    const Picture picture = paint(false);
    ASSERT_EQ(picture.families.size(), 2u);
    EXPECT_THAT(picture.children(picture.families[0]), ElementsAre(0, 2));
    EXPECT_EQ(picture.parents(picture.families[0]).size(), 1u);
    EXPECT_EQ(picture.families[0].number, 5u);
    EXPECT_THAT(picture.children(picture.families[1]), ElementsAre(3));
    EXPECT_EQ(picture.families[1].number, 6u);
}

TEST_F(LayoutPicture, siblingsOfAnotherMotherAreAFamilyOfTheirOwn) {
    const auto focus = addBox(1, 0, 110);
    const auto father = addBox(2, 0, 0);
    const auto half = addBox(3, 80, 110);
    const auto mother = addUnknownMother(focus, 80, 0);
    addFamily(father, mother, {focus});
    addFamily(father, TypedLayout::kNone, {half});
    addPersons(4);
    addUnion(1, kin::kNobody, 5, kin::UnionState::unknown, {{0, kBirth}});
    addUnion(1, 3, 6, kMarried, {{2, kBirth}});
    const Picture picture = paint();
    ASSERT_EQ(picture.families.size(), 2u);
    EXPECT_EQ(picture.families[1].number, 6u);
    EXPECT_EQ(picture.families[1].parentCount, 1);
    EXPECT_EQ(picture.boxes[1].hiddenPartners, 1);
}

TEST_F(LayoutPicture, unknownParentsCanBeLeftOut) {
    const auto focus = addBox(1, 0, 110);
    const auto father = addBox(2, 0, 0);
    addFamily(father, addUnknownMother(focus, 80, 0), {focus});
    addPersons(2);
    addUnion(1, kin::kNobody, 5, kin::UnionState::unknown, {{0, kBirth}});
    const Picture picture = paint(false);
    EXPECT_EQ(picture.boxes.size(), 2u);
    ASSERT_EQ(picture.families.size(), 1u);
    EXPECT_EQ(picture.families[0].parentCount, 1);
    EXPECT_EQ(judge(picture).unjoined, 0u);
}

// By birth a child of others, who are not shown; by adoption of those who are drawn.
TEST_F(LayoutPicture, adoptionIsJudgedByTheParentsWhoAreDrawn) {
    const auto child = addBox(1, 40, 110);
    addFamily(addBox(2, 0, 0), addBox(3, 80, 0), {child});
    addPersons(5);
    addUnion(3, 4, 7, kMarried, {{0, kBirth}});
    addUnion(1, 2, 8, kin::UnionState::unmarried, {{0, kin::ChildKind::adopted}});
    const Picture picture = paint();
    ASSERT_EQ(picture.families.size(), 1u);
    EXPECT_THAT(picture.kinds(picture.families[0]), ElementsAre(kin::ChildKind::adopted));
    EXPECT_EQ(picture.families[0].style, kin::UnionState::unmarried);
    EXPECT_EQ(picture.families[0].number, 8u);
    EXPECT_EQ(picture.boxes[0].hiddenParents, 2);
}

TEST_F(LayoutPicture, aCoupleMarriedTwiceIsTwoFamilies) {
    const auto man = addBox(1, 0, 0);
    const auto woman = addBox(2, 80, 0);
    addFamily(man, woman, {addBox(3, 0, 110), addBox(4, 80, 110)});
    addPersons(4);
    addUnion(0, 1, 1, kin::UnionState::divorced, {{2, kBirth}});
    addUnion(0, 1, 2, kMarried, {{3, kBirth}});
    const Picture picture = paint();
    ASSERT_EQ(picture.families.size(), 2u);
    EXPECT_EQ(picture.families[0].style, kin::UnionState::divorced);
    EXPECT_THAT(picture.children(picture.families[1]), ElementsAre(3));
    const auto j = judge(picture);
    EXPECT_EQ(j.hits + j.tracks + j.touches + j.unjoined, 0u);
}

// A daughter who is shown as the wife of somebody as well, far from her parents' children.
TEST_F(LayoutPicture, aKnownRelationThatIsNotDrawnHasAMark) {
    addBox(1, 0, 0);
    addBox(2, 500, 0);
    addBox(3, 900, 0);
    addPersons(3);
    addUnion(0, kin::kNobody, 1, kin::UnionState::unknown, {{1, kBirth}});
    addUnion(1, 2, 2, kMarried, {});
    const Picture picture = paint();
    ASSERT_EQ(picture.marks.size(), 2u);
    EXPECT_EQ(picture.marks[0].kind, MarkKind::parentsElsewhere);
    EXPECT_EQ(picture.marks[0].boxes[0], 1);
    EXPECT_EQ(picture.marks[1].kind, MarkKind::partnersElsewhere);
    EXPECT_NE(picture.marks[0].number, picture.marks[1].number);
    EXPECT_EQ(untold_, 0u);
}

TEST_F(LayoutPicture, boxesOfOnePersonAreNumberedFromTheNearest) {
    addBox(1, 0, 0);
    addBox(2, 900, 0);
    addBox(2, 100, 0);
    layout_.boxes.push_back(layout_.boxes[1]);
    layout_.boxes.back().repeatOf = 1;
    addPersons(2);
    const Picture picture = paint();
    ASSERT_EQ(picture.boxes.size(), 3u) << "a box that repeats another at the same place is none";
    EXPECT_EQ(picture.boxes[1].repeat, 2);
    EXPECT_EQ(picture.boxes[2].repeat, 1);
    ASSERT_EQ(picture.marks.size(), 1u);
    EXPECT_EQ(picture.marks[0].kind, MarkKind::samePerson);
}

TEST_F(LayoutPicture, withoutWhatIsKnownFamiliesAreThoseOfTheLayout) {
    const auto focus = addBox(1, 0, 110);
    addFamily(addBox(2, 0, 0), addBox(3, 80, 0), {focus, focus});
    const Picture picture = pictureOf(layout_);
    ASSERT_EQ(picture.families.size(), 1u);
    EXPECT_THAT(picture.children(picture.families[0]), ElementsAre(0));
    EXPECT_EQ(picture.families[0].style, kin::UnionState::unknown);
    EXPECT_EQ(picture.families[0].number, 0u);
}
