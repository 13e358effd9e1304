// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Families that have made other programs fail.

#include <olvane/charts/Charts.h>
#include <olvane/charts/Everybody.h>
#include <olvane/picture/Judge.h>

#include <gtest/gtest.h>

#include <stdexcept>
#include <tuple>
#include <vector>

namespace {

using olvane::charts::everybodyChart;
using olvane::charts::EverybodyOptions;
using olvane::kin::ChildKind;
using olvane::kin::KinGraph;
using olvane::kin::KinGraphBuilder;
using olvane::kin::kNobody;
using olvane::kin::Place;
using olvane::kin::Sex;
using olvane::kin::UnionState;
using olvane::picture::Judgement;
using olvane::picture::Picture;

class EverybodyCases : public testing::Test {
protected:
    Place person(Sex sex = Sex::male) { return builder_.addPerson(++last_, sex); }
    void family(Place father, Place mother, std::initializer_list<Place> children) {
        const auto u = builder_.addUnion(father, mother, UnionState::married);
        for (const Place child : children) builder_.addChild(u, child, ChildKind::birth);
    }
    const Picture& draw(int marks = 0) {
        graph_ = builder_.build();
        EverybodyOptions options;
        options.marks = marks;
        picture_ = everybodyChart(graph_, options);
        return picture_;
    }
    void expectReadable() const {
        const Judgement j = olvane::picture::judge(picture_, &graph_);
        EXPECT_EQ(j.persons, static_cast<std::size_t>(graph_.personCount()));
        EXPECT_EQ(std::tuple(j.overlaps, j.hits, j.tracks, j.touches, j.unjoined, *j.untold),
                  std::tuple(0U, 0U, 0U, 0U, 0U, 0U));
    }
    const olvane::picture::Box& box(Place person) const {
        return picture_.boxes[static_cast<std::size_t>(person)];
    }

    KinGraphBuilder builder_;
    std::int64_t last_ = 0;
    KinGraph graph_;
    Picture picture_;
};

TEST_F(EverybodyCases, coupleStandsSideBySideAboveItsChildren) {
    const Place a = person(), b = person(Sex::female), c = person(), d = person();
    family(a, b, {c, d});
    draw();
    EXPECT_EQ(box(a).y, box(b).y);
    EXPECT_EQ(box(b).x - box(a).x, 80);   // 55 wide, 25 apart
    EXPECT_EQ(box(c).y - box(a).y, 110);  // 80 high, 30 apart
    EXPECT_EQ(box(d).x - box(c).x, 80);
    EXPECT_EQ(box(a).x, box(c).x);
    expectReadable();
}

TEST_F(EverybodyCases, manStandsBetweenTwoWives) {
    const Place a = person(), b = person(Sex::female), c = person(Sex::female);
    family(a, b, {person(), person()});
    family(a, c, {person()});
    draw();
    EXPECT_EQ(olvane::picture::judge(picture_).sideBySide, 2U);
    EXPECT_EQ(box(b).x + box(c).x, 2 * box(a).x);
    expectReadable();
}

TEST_F(EverybodyCases, somebodyTheirOwnAncestor) {
    const Place a = person(), b = person(), c = person();
    family(a, kNobody, {b});
    family(b, kNobody, {c});
    family(c, kNobody, {a});
    draw();
    expectReadable();
}

TEST_F(EverybodyCases, somebodyTheirOwnParent) {
    const Place a = person();
    family(a, kNobody, {a, person()});
    draw();
    expectReadable();
}

TEST_F(EverybodyCases, somebodyMarriedToThemself) {
    const Place a = person();
    family(a, a, {person(), person()});
    draw();
    expectReadable();
}

TEST_F(EverybodyCases, daughterMarriedToHerFather) {
    const Place a = person(), b = person(Sex::female), c = person(Sex::female);
    family(a, b, {c});
    family(a, c, {person()});
    draw();
    expectReadable();
}

TEST_F(EverybodyCases, uncleMarriedToHisNiece) {
    const Place a = person(), b = person(Sex::female), uncle = person(), brother = person(),
                niece = person(Sex::female);
    family(a, b, {uncle, brother});
    family(brother, kNobody, {niece});
    family(uncle, niece, {person()});
    draw();
    EXPECT_EQ(box(uncle).y, box(niece).y);
    EXPECT_GT(box(niece).y, box(brother).y);
    expectReadable();
}

TEST_F(EverybodyCases, oneHundredUnionsOfOneCouple) {
    const Place a = person(), b = person(Sex::female);
    for (int i = 0; i < 100; ++i) family(a, b, {person()});
    draw();
    expectReadable();
}

// Above each child stands a parent of all others, too: what hangs from the one must be drawn above the other's lines,
// and the other way round, and there are as many of both as there is room for.
TEST_F(EverybodyCases, twelveFamiliesOfEachParentAboveTheSameChildren) {
    const Place parents[] = {person(), person()};
    const Place children[] = {person(), person()};
    for (int i = 0; i < 6; ++i) {
        for (const Place parent : parents) family(parent, kNobody, {children[0], children[1]});
    }
    draw();
    expectReadable();
}

TEST_F(EverybodyCases, couplesWithoutAGapAreJoined) {
    const Place man = person();
    family(man, person(Sex::female), {});
    graph_ = builder_.build();
    EverybodyOptions options;
    options.sizes.gapX = 0;
    picture_ = everybodyChart(graph_, options);
    expectReadable();
}

TEST_F(EverybodyCases, twelveHundredSpouses) {
    const Place a = person();
    for (int i = 0; i < 1200; ++i) family(a, person(Sex::female), {person()});
    draw();
    expectReadable();
    EXPECT_EQ(olvane::picture::judge(picture_).sideBySide, 2U);
}

TEST_F(EverybodyCases, ringOfCouples) {
    std::vector<Place> ring;
    ring.reserve(9);
    for (int i = 0; i < 9; ++i) ring.push_back(person());
    for (std::size_t i = 0; i < 9; ++i) family(ring[i], ring[(i + 1) % 9], {});
    draw();
    EXPECT_EQ(olvane::picture::judge(picture_).sideBySide, 8U);
    expectReadable();
}

TEST_F(EverybodyCases, lineOfTwoHundredThousandGenerations) {
    Place above = person();
    for (int i = 1; i < 200'000; ++i) {
        const Place below = person();
        family(above, kNobody, {below});
        above = below;
    }
    draw();
    EXPECT_EQ(box(above).y, 110.0 * 199'999);
    EXPECT_EQ(box(above).x, box(0).x);
}

TEST_F(EverybodyCases, familyOfAHundredThousandChildren) {
    const Place a = person();
    const auto u = builder_.addUnion(a, kNobody, UnionState::married);
    for (int i = 0; i < 100'000; ++i) builder_.addChild(u, person(), ChildKind::birth);
    draw();
    EXPECT_EQ(picture_.boxes.size(), 100'001U);
}

TEST_F(EverybodyCases, partsStandBesideOneAnotherTheLargestFirst) {
    const Place lone = person(), a = person(), b = person(Sex::female);
    family(a, b, {});
    graph_ = builder_.build();
    EverybodyOptions options;
    options.onePart = false;
    picture_ = everybodyChart(graph_, options);
    expectReadable();
    EXPECT_LT(box(b).x, box(lone).x);
    options.onePart = true;
    EXPECT_EQ(everybodyChart(graph_, options).boxes.size(), 1U);
}

TEST_F(EverybodyCases, isTheViewEverybodyOfARequest) {
    const Place a = person(), b = person(Sex::female);
    family(a, b, {person()});
    person();
    graph_ = builder_.build();
    olvane::charts::ChartRequest request;
    request.view = olvane::charts::View::everybody;
    request.focus = b;
    EXPECT_EQ(olvane::charts::chartOf(graph_, request).view, "everybody");
    EXPECT_EQ(olvane::charts::chartOf(graph_, request).boxes.size(), 3U);
    request.onePart = false;
    EXPECT_EQ(olvane::charts::chartOf(graph_, request).boxes.size(), 4U);
}

TEST_F(EverybodyCases, focusThatIsNotThere) {
    person();
    graph_ = builder_.build();
    EverybodyOptions options;
    options.focus = 1;
    EXPECT_THROW(everybodyChart(graph_, options), std::out_of_range);
}

}  // namespace
