// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/Kinship.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <stdexcept>

#include "KinFamily.h"

using namespace olvane::kin;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

Kinship kinship(const KinFamily& family, const char* a, const char* b, std::size_t limit = 50) {
    KinshipFinder finder(family.graph());
    return finder.between(family[a], family[b], {limit});
}

}  // namespace

TEST(Kinship, fullSiblingsShareBothParents) {
    const KinFamily family{"Adam + Eva: Seth.m Sara.f"};
    const Kinship found = kinship(family, "Seth", "Sara");
    ASSERT_THAT(found.blood, SizeIs(1));
    EXPECT_EQ(found.blood[0].up, 1);
    EXPECT_EQ(found.blood[0].down, 1);
    EXPECT_FALSE(found.blood[0].half);
    EXPECT_THAT(found.blood[0].ancestors, ElementsAre(family["Adam"], family["Eva"]));
    EXPECT_THAT(found.blood[0].persons, ElementsAre(family["Seth"], family["Adam"], family["Sara"]));
    EXPECT_EQ(found.bloodCount, 1u);
    EXPECT_EQ(found.phi, 0.25);
    EXPECT_EQ(found.degree, 2);
    EXPECT_THAT(found.marriage, IsEmpty());
    EXPECT_EQ(found.marriageCount, 0u);
}

TEST(Kinship, halfSiblingsShareOneOfTwoKnownParents) {
    const KinFamily family{"Adam + Eva: Seth.m", "Adam + Lili: Kain.m"};
    const Kinship found = kinship(family, "Seth", "Kain");
    ASSERT_THAT(found.blood, SizeIs(1));
    EXPECT_TRUE(found.blood[0].half);
    EXPECT_THAT(found.blood[0].ancestors, ElementsAre(family["Adam"]));
    EXPECT_EQ(found.phi, 0.125);
}

TEST(Kinship, anUnknownOtherParentLeavesItOpenWhetherSiblingsAreHalf) {
    const KinFamily family{"Adam + Eva: Seth.m", "Adam + ?: Kain.m"};
    EXPECT_FALSE(kinship(family, "Seth", "Kain").blood.at(0).half);
}

TEST(Kinship, aDirectLineHasNothingOnOneSide) {
    const KinFamily family{"Adam + Eva: Seth.m", "Seth + Sara: Noah.m"};
    const Kinship found = kinship(family, "Eva", "Noah");
    ASSERT_THAT(found.blood, SizeIs(1));
    EXPECT_EQ(found.blood[0].up, 0);
    EXPECT_EQ(found.blood[0].down, 2);
    EXPECT_THAT(found.blood[0].ancestors, ElementsAre(family["Eva"]));
    EXPECT_THAT(found.blood[0].persons, ElementsAre(family["Eva"], family["Seth"], family["Noah"]));
    EXPECT_EQ(found.phi, 0.125);
}

TEST(Kinship, doubleCousinsAreRelatedInTwoWays) {
    const KinFamily family{"Abel + Anna: Bert.m Bodo.m", "Carl + Cora: Dora.f Dina.f", "Bert + Dora: Emil.m",
                           "Bodo + Dina: Else.f"};
    const Kinship found = kinship(family, "Emil", "Else");
    EXPECT_THAT(found.blood, SizeIs(2));
    EXPECT_EQ(found.bloodCount, 2u);
    EXPECT_EQ(found.phi, 0.125);
    EXPECT_EQ(found.degree, 4);
}

TEST(Kinship, aPersonWhoDescendsTwiceIsRelatedOverBothParents) {
    // The parents of Theo are brother and sister: phi(Theo, Theo) = (1 + 1/4) / 2.
    const KinFamily family{"Abel + Anna: Bert.m Bea.f Bodo.m", "Bert + Bea: Theo.m"};
    const Kinship found = kinship(family, "Theo", "Bodo");
    EXPECT_EQ(found.bloodCount, 2u);
    EXPECT_EQ(found.phi, 0.25);
    EXPECT_EQ(kinship(family, "Theo", "Theo").phi, 0.625);
    // Father's side, mother's side.
    EXPECT_EQ(kinship(family, "Theo", "Abel").bloodCount, 2u);
}

TEST(Kinship, oneWayMayPassBothPartnersOfACouple) {
    // Over Bert and Bea: from Theo up Bert to the couple at the top and down Bea to Tina.
    const KinFamily family{"Abel + Anna: Bert.m Bea.f", "Bert + Bea: Theo.m Tina.f"};
    const Kinship found = kinship(family, "Theo", "Tina");
    EXPECT_EQ(found.bloodCount, 3u);
    ASSERT_THAT(found.blood, SizeIs(3));
    EXPECT_EQ(found.blood[0].length(), 2);
    EXPECT_EQ(found.blood[1].length(), 4);
    EXPECT_THAT(found.blood[2].persons,
                ElementsAre(family["Theo"], family["Bea"], family["Abel"], family["Bert"], family["Tina"]));
}

TEST(Kinship, adoptiveWaysStandApartFromThoseByBlood) {
    const KinFamily family{"Bruno + Birte: Finn.m Fee.f", "Anselm + Agnes: Finn(adopted) Alma.f"};
    const Kinship byBlood = kinship(family, "Finn", "Fee");
    EXPECT_EQ(byBlood.bloodCount, 1u);
    EXPECT_EQ(byBlood.legalCount, 0u);
    const Kinship byLaw = kinship(family, "Finn", "Alma");
    EXPECT_THAT(byLaw.blood, IsEmpty());
    EXPECT_EQ(byLaw.bloodCount, 0u);
    EXPECT_EQ(byLaw.phi, 0.0);
    EXPECT_EQ(byLaw.degree, std::nullopt);
    ASSERT_THAT(byLaw.legal, SizeIs(1));
    EXPECT_EQ(byLaw.legal[0].bond, Bond::adopted);
    EXPECT_THAT(byLaw.legal[0].ancestors, ElementsAre(family["Anselm"], family["Agnes"]));
    EXPECT_EQ(byLaw.legalCount, 1u);
}

TEST(Kinship, aStepfatherWhoAdoptedIsNoSecondMother) {
    const KinFamily family{"Jan + Mia: Leo.m", "Sam + Mia: Leo(adopted) Lea.f"};
    const Kinship found = kinship(family, "Leo", "Lea");
    ASSERT_THAT(found.blood, SizeIs(1));
    EXPECT_TRUE(found.blood[0].half);
    ASSERT_THAT(found.legal, SizeIs(1));
    EXPECT_THAT(found.legal[0].ancestors, ElementsAre(family["Sam"]));
    EXPECT_EQ(found.phi, 0.125);
}

TEST(Kinship, twoMothersAreParentsLikeOthers) {
    const KinFamily family{"Ann.f + Bea: Cleo.f Carl.m"};
    EXPECT_THAT(kinship(family, "Cleo", "Carl").blood.at(0).ancestors,
                ElementsAre(family["Ann"], family["Bea"]));
    EXPECT_THAT(kinship(family, "Ann", "Bea").marriage, SizeIs(1));
}

TEST(Kinship, spousesAreRelatedByMarriageAlone) {
    const KinFamily family{"Max + Eva: Sven.m", "Walter + Wanda: Eva Erika.f"};
    const Kinship found = kinship(family, "Max", "Erika");
    EXPECT_THAT(found.blood, IsEmpty());
    ASSERT_THAT(found.marriage, SizeIs(2));
    EXPECT_EQ(found.marriage[0].links(), 3);
    EXPECT_EQ(found.marriageCount, 2u);
    EXPECT_EQ(kinship(family, "Max", "Eva").marriage.at(0).links(), 1);
}

TEST(Kinship, aWifeWhoIsACousinIsBoth) {
    const KinFamily family{"Josiah + Sarah: Susannah.f Jos.m", "Robert + Susannah: Charles.m",
                           "Jos + Bessy: Emma.f", "Charles + Emma"};
    const Kinship found = kinship(family, "Charles", "Emma");
    EXPECT_EQ(found.degree, 4);
    EXPECT_EQ(found.phi, 0.0625);
    ASSERT_THAT(found.marriage, SizeIs(1));
    EXPECT_THAT(found.marriage[0].persons, ElementsAre(family["Charles"], family["Emma"]));
}

TEST(Kinship, siblingsWhoMarriedSiblingsAreRelatedTheOtherWayToo) {
    const KinFamily family{"Abel + Anna: Bert.m Bea.f", "Carl + Cora: Dora.f Dirk.m", "Bert + Dora",
                           "Dirk + Bea"};
    const Kinship found = kinship(family, "Bert", "Bea");
    EXPECT_EQ(found.degree, 2);
    ASSERT_THAT(found.marriage, SizeIs(2));
    EXPECT_THAT(found.marriage[0].persons,
                ElementsAre(family["Bert"], family["Dora"], family["Carl"], family["Dirk"], family["Bea"]));
}

TEST(Kinship, strangersHaveNoWayAtAll) {
    const KinFamily family{"Ada + Ben: Cid.m", "Dora + Egon: Fred.m"};
    const Kinship found = kinship(family, "Cid", "Fred");
    EXPECT_FALSE(found.isRelated());
    EXPECT_EQ(found.phi, 0.0);
    EXPECT_EQ(found.bloodCount, 0u);
    EXPECT_EQ(found.legalCount, 0u);
    EXPECT_EQ(found.marriageCount, 0u);
    EXPECT_EQ(found.degree, std::nullopt);
}

TEST(Kinship, loopsLeaveNumbersOpenAndWaysStillListed) {
    const KinFamily family{"Uno + Una: Due.m Dina.f", "Due + Dora: Tre.m", "Tre + Tina: Uno.m"};
    const Kinship found = kinship(family, "Due", "Dina");
    EXPECT_TRUE(found.bloodLoop);
    EXPECT_EQ(found.phi, std::nullopt);
    EXPECT_EQ(found.bloodCount, std::nullopt);
    ASSERT_THAT(found.blood, testing::Not(IsEmpty()));
    EXPECT_THAT(found.blood[0].persons, ElementsAre(family["Due"], family["Uno"], family["Dina"]));
    EXPECT_EQ(found.degree, 2);
}

TEST(Kinship, aLoopBelowLeavesNumbersAlone) {
    const KinFamily family{"Abel + Anna: Bert.m Bea.f", "Bert + Cora: Dirk.m", "Emil + Ella: Otto.m",
                           "Otto + Olga: Emil.m", "Bea.f + Otto"};
    const Kinship found = kinship(family, "Bert", "Bea");
    EXPECT_FALSE(found.bloodLoop);
    EXPECT_EQ(found.phi, 0.25);
    EXPECT_EQ(kinship(family, "Otto", "Bea").phi, std::nullopt);
}

TEST(Kinship, theirOwnParentIsALoop) {
    const KinFamily family{"Ouro + Mona: Ouro.m Sid.m"};
    EXPECT_EQ(kinship(family, "Ouro", "Sid").phi, std::nullopt);
    EXPECT_FALSE(kinship(family, "Ouro", "Sid").blood.empty());
}

TEST(Kinship, aSecondFamilyByBirthIsNotByBlood) {
    const KinFamily family{"Abel + Anna: Theo.m", "Bert + Bea: Theo Tina.f"};
    const Kinship found = kinship(family, "Theo", "Tina");
    EXPECT_EQ(found.bloodCount, 0u);
    ASSERT_THAT(found.legal, SizeIs(1));
    EXPECT_EQ(found.legal[0].bond, Bond::other);
}

TEST(Kinship, loneParentsInTwoFamiliesAreBothByBlood) {
    const KinFamily family{"Abel + ?: Theo.m", "? + Anna: Theo Tina.f"};
    EXPECT_EQ(kinship(family, "Theo", "Abel").degree, 1);
    EXPECT_EQ(kinship(family, "Theo", "Tina").degree, 2);
}

TEST(Kinship, countsBeyondALimitAreStillExact) {
    // Generations of brother and sister: 1 + 2 (1 + 2 (...)) ways.
    KinGraphBuilder builder;
    Place man = builder.addPerson(1, Sex::male);
    Place woman = builder.addPerson(2, Sex::female);
    const int kGenerations = 40;
    for (int i = 0; i < kGenerations; ++i) {
        const UnionPlace u = builder.addUnion(man, woman, UnionState::married);
        man = builder.addPerson(2 * i + 3, Sex::male);
        woman = builder.addPerson(2 * i + 4, Sex::female);
        builder.addChild(u, man, ChildKind::birth);
        builder.addChild(u, woman, ChildKind::birth);
    }
    const KinGraph graph = builder.build();
    KinshipFinder finder(graph);
    const Kinship found = finder.between(man, woman, {5});
    EXPECT_THAT(found.blood, SizeIs(5));
    EXPECT_EQ(found.bloodCount, (std::uint64_t{1} << kGenerations) - 1);
    EXPECT_EQ(found.blood[0].length(), 2);
    EXPECT_EQ(found.blood[4].length(), 6);
}

TEST(Kinship, countsAbove53BitsAreLeftOpenButNotThoseBelowAHugeAncestry) {
    KinGraphBuilder builder;
    Place man = builder.addPerson(1, Sex::male);
    Place woman = builder.addPerson(2, Sex::female);
    std::int64_t id = 3;
    for (int i = 0; i < 120; ++i) {
        const UnionPlace u = builder.addUnion(man, woman, UnionState::married);
        man = builder.addPerson(id++, Sex::male);
        woman = builder.addPerson(id++, Sex::female);
        builder.addChild(u, man, ChildKind::birth);
        builder.addChild(u, woman, ChildKind::birth);
    }
    const Place wives[] = {builder.addPerson(id++, Sex::female), builder.addPerson(id++, Sex::female)};
    Place children[2];
    for (int i = 0; i < 2; ++i) {
        children[i] = builder.addPerson(id++, Sex::male);
        builder.addChild(builder.addUnion(man, wives[i], UnionState::married), children[i], ChildKind::birth);
    }
    const KinGraph graph = builder.build();
    KinshipFinder finder(graph);
    EXPECT_EQ(finder.between(man, woman).bloodCount, std::nullopt);
    // Half brothers: their father's ancestors, however many, lie above the one way.
    EXPECT_EQ(finder.between(children[0], children[1]).bloodCount, 1u);
}

TEST(Kinship, aLineOfTwoHundredThousandGenerationsIsNoDepthOfCalls) {
    KinGraphBuilder builder;
    const int kGenerations = 200'000;
    Place father = builder.addPerson(1, Sex::male);
    const Place first = father;
    std::int64_t id = 2;
    for (int i = 0; i < kGenerations; ++i) {
        const Place mother = builder.addPerson(id++, Sex::female);
        const UnionPlace u = builder.addUnion(father, mother, UnionState::married);
        father = builder.addPerson(id++, Sex::male);
        builder.addChild(u, father, ChildKind::birth);
    }
    const KinGraph graph = builder.build();
    KinshipFinder finder(graph);
    const Kinship found = finder.between(father, first);
    EXPECT_EQ(found.degree, kGenerations);
    EXPECT_EQ(found.bloodCount, 1u);
    EXPECT_EQ(found.phi, 0.0);  // too small for a number
}

TEST(Kinship, placesOutsideTheGraphAreRefused) {
    const KinFamily family{"Adam + Eva"};
    KinshipFinder finder(family.graph());
    EXPECT_THROW(finder.between(0, 2), std::out_of_range);
    EXPECT_THROW(finder.coefficient(-1, 0), std::out_of_range);
}
