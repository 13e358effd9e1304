// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/KinGraph.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <stdexcept>

using olvane::kin::ChildKind;
using olvane::kin::KinGraph;
using olvane::kin::KinGraphBuilder;
using olvane::kin::kNobody;
using olvane::kin::Place;
using olvane::kin::Sex;
using olvane::kin::UnionState;
using testing::ElementsAre;

TEST(KinGraph, listsStandInTheOrderInWhichTheyWereAdded) {
    KinGraphBuilder builder;
    const Place man = builder.addPerson(1, Sex::male);
    const Place first = builder.addPerson(2, Sex::female);
    const Place second = builder.addPerson(3, Sex::female);
    const Place a = builder.addPerson(4, Sex::male);
    const Place b = builder.addPerson(5, Sex::female);
    const auto early = builder.addUnion(man, first, UnionState::divorced, 7);
    const auto late = builder.addUnion(man, second, UnionState::married, 9);
    builder.addChild(late, b, ChildKind::birth);
    builder.addChild(early, b, ChildKind::step);
    builder.addChild(early, a, ChildKind::birth);
    builder.orderUnionsAsChild(b, {late});
    const KinGraph graph = builder.build();

    EXPECT_THAT(graph.unionsAsPartner(man), ElementsAre(early, late));
    EXPECT_THAT(graph.children(early), ElementsAre(b, a));
    EXPECT_THAT(graph.childKinds(early), ElementsAre(ChildKind::step, ChildKind::birth));
    EXPECT_THAT(graph.unionsAsChild(b), ElementsAre(late, early));
    EXPECT_EQ(graph.otherPartner(late, second), man);
    EXPECT_EQ(graph.family(late), 9u);
    EXPECT_EQ(graph.state(early), UnionState::divorced);
}

TEST(KinGraph, aChildNamedTwiceIsOneChild) {
    KinGraphBuilder builder;
    const Place woman = builder.addPerson(1, Sex::female);
    const Place child = builder.addPerson(2, Sex::unknown);
    const auto alone = builder.addUnion(kNobody, woman, UnionState::unknown);
    builder.addChild(alone, child, ChildKind::adopted);
    builder.addChild(alone, child, ChildKind::birth);
    const KinGraph graph = builder.build();
    EXPECT_THAT(graph.children(alone), ElementsAre(child));
    EXPECT_THAT(graph.childKinds(alone), ElementsAre(ChildKind::adopted));
    EXPECT_EQ(graph.otherPartner(alone, woman), kNobody);
}

TEST(KinGraph, somebodyMarriedToThemselfIsInTheUnionOnce) {
    KinGraphBuilder builder;
    const Place self = builder.addPerson(1, Sex::male);
    const auto u = builder.addUnion(self, self, UnionState::married);
    const KinGraph graph = builder.build();
    EXPECT_THAT(graph.unionsAsPartner(self), ElementsAre(u));
    EXPECT_EQ(graph.otherPartner(u, self), self);
}

TEST(KinGraph, findsPersonsByAnyNumber) {
    KinGraphBuilder builder;
    const Place one = builder.addPerson(1, Sex::male);
    const Place other = builder.addPerson(900, Sex::female);
    const KinGraph graph = builder.build();
    EXPECT_EQ(graph.placeOf(1), one);
    EXPECT_EQ(graph.placeOf(900), other);
    EXPECT_EQ(graph.placeOf(2), kNobody);
}

TEST(KinGraph, refusesWhatWasNeverAdded) {
    KinGraphBuilder builder;
    const Place one = builder.addPerson(1, Sex::male);
    EXPECT_THROW(builder.addPerson(1, Sex::male), std::invalid_argument);
    EXPECT_THROW(builder.addUnion(one, 5, UnionState::married), std::out_of_range);
    EXPECT_THROW(builder.addUnion(kNobody, kNobody, UnionState::married), std::invalid_argument);
    EXPECT_THROW(builder.addChild(0, one, ChildKind::birth), std::out_of_range);
}
