// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Remarks on a graph and its years, each beside the nearest data without it; and their words.

#include <olvane/kin/DataCheck.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <random>
#include <stdexcept>

#include "KinFamily.h"

using namespace olvane::kin;

namespace {

Years exactly(int year) {
    return {year, year, false};
}

Lives noDates(const KinGraph& graph) {
    Lives lives;
    lives.persons.resize(static_cast<std::size_t>(graph.personCount()));
    lives.marriages.resize(static_cast<std::size_t>(graph.unionCount()));
    return lives;
}

std::string kindsIn(const KinFamily& family, const Lives& lives) {
    std::string kinds;
    for (const Remark& remark : checkData(family.graph(), lives))
        kinds += (kinds.empty() ? "" : " ") + std::string(nameOf(remark.kind));
    return kinds;
}

// A father, a mother and a child; years of birth and death, 0 for unknown.
struct Dates {
    int birth = 0;
    int death = 0;
};

std::string kindsOf(Dates father, Dates mother, Dates child, int marriage = 0, const char* how = "Cid.m") {
    const std::string line = std::string("Ben + Ada: ") + how;
    const KinFamily family{line.c_str()};
    Lives lives = noDates(family.graph());
    const Dates all[] = {father, mother, child};
    for (std::size_t i = 0; i < 3; ++i) {
        if (all[i].birth != 0) lives.persons[i].birth = exactly(all[i].birth);
        if (all[i].death != 0) lives.persons[i].death = exactly(all[i].death);
    }
    if (marriage != 0) lives.marriages[0] = exactly(marriage);
    return kindsIn(family, lives);
}

}  // namespace

TEST(DataCheck, deathBeforeBirth) {
    EXPECT_EQ(kindsOf({}, {}, {1900, 1899}), "diedBeforeBirth");
    EXPECT_EQ(kindsOf({}, {}, {1900, 1900}), "");
}

TEST(DataCheck, livesBeyondTheLongest) {
    EXPECT_EQ(kindsOf({}, {}, {1800, 1800 + kLongestLife + 1}), "livedTooLong");
    EXPECT_EQ(kindsOf({}, {}, {1800, 1800 + kLongestLife}), "");
}

TEST(DataCheck, birthBeforeAParent) {
    EXPECT_EQ(kindsOf({1900, 0}, {}, {1899, 0}), "bornBeforeParent");
    EXPECT_EQ(kindsOf({1870, 0}, {}, {1899, 0}), "");
}

TEST(DataCheck, parentsWhoAreTooYoungOrTooOld) {
    EXPECT_EQ(kindsOf({1900, 0}, {}, {1900 + kYoungestParent - 1, 0}), "parentTooYoung");
    EXPECT_EQ(kindsOf({1900, 0}, {}, {1900 + kYoungestParent, 0}), "");
    EXPECT_EQ(kindsOf({}, {1800, 0}, {1800 + kOldestMother + 1, 0}), "parentTooOld");
    EXPECT_EQ(kindsOf({}, {1800, 0}, {1800 + kOldestMother, 0}), "");
    EXPECT_EQ(kindsOf({1800, 0}, {}, {1800 + kOldestFather + 1, 0}), "parentTooOld");
    EXPECT_EQ(kindsOf({1800, 0}, {}, {1800 + kOldestFather, 0}), "");
}

TEST(DataCheck, birthAfterTheDeathOfAParent) {
    EXPECT_EQ(kindsOf({1800, 1840}, {}, {1842, 0}), "bornAfterParentsDeath");
    EXPECT_EQ(kindsOf({1800, 1840}, {}, {1841, 0}), "");
    EXPECT_EQ(kindsOf({}, {1800, 1840}, {1841, 0}), "bornAfterParentsDeath");
    EXPECT_EQ(kindsOf({}, {1800, 1840}, {1840, 0}), "");
}

TEST(DataCheck, marriageBeforeBirthAndAfterDeath) {
    EXPECT_EQ(kindsOf({1900, 0}, {}, {}, 1899), "marriedBeforeBirth");
    EXPECT_EQ(kindsOf({}, {1800, 1840}, {}, 1841), "marriedAfterDeath");
    EXPECT_EQ(kindsOf({1800, 1840}, {1810, 1840}, {}, 1840), "");
}

TEST(DataCheck, adoptiveParentsMayBeOfAnyAge) {
    EXPECT_EQ(kindsOf({1900, 0}, {}, {1895, 0}, 0, "Cid.m"), "bornBeforeParent");
    EXPECT_EQ(kindsOf({1900, 0}, {}, {1895, 0}, 0, "Cid.m(adopted)"), "");
}

TEST(DataCheck, childrenByBirthInTwoFamilies) {
    const KinFamily two{"Ben + Ada: Cid.m", "Dan + Eve: Cid"};
    EXPECT_EQ(kindsIn(two, noDates(two.graph())), "severalBirthFamilies");
    const KinFamily adopted{"Ben + Ada: Cid.m", "Dan + Eve: Cid(adopted)"};
    EXPECT_EQ(kindsIn(adopted, noDates(adopted.graph())), "");
}

TEST(DataCheck, ownAncestors) {
    const KinFamily loop{"Uno + Una: Due.m", "Due + Dora: Tre.m", "Tre + Tina: Uno.m Ugo.m"};
    EXPECT_EQ(kindsIn(loop, noDates(loop.graph())), "ownAncestor ownAncestor ownAncestor");
    EXPECT_THAT(ownAncestors(loop.graph()),
                testing::UnorderedElementsAre(loop["Uno"], loop["Due"], loop["Tre"]));
    const KinFamily line{"Uno + Una: Due.m", "Due + Dora: Tre.m"};
    EXPECT_EQ(kindsIn(line, noDates(line.graph())), "");
    const KinFamily self{"Ouro + Mona: Ouro.m"};
    EXPECT_THAT(ownAncestors(self.graph()), testing::ElementsAre(self["Ouro"]));
}

// A person is their own ancestor if the walk over all parents comes back.
TEST(DataCheck, ownAncestorsAreThoseWhomAPlainWalkFinds) {
    std::mt19937 random(11);
    for (int run = 0; run < 300; ++run) {
        KinGraphBuilder builder;
        const auto count = static_cast<Place>(2 + random() % 9);
        for (Place i = 0; i < count; ++i) builder.addPerson(i + 1, Sex::unknown);
        for (Place i = 0; i < count; ++i) {
            const auto pick = [&random, count] {
                return static_cast<Place>(random() % static_cast<unsigned>(count));
            };
            if (random() % 3 == 0) continue;
            builder.addChild(builder.addUnion(pick(), pick(), UnionState::married), i, ChildKind::birth);
        }
        const KinGraph graph = builder.build();
        std::vector<Place> expected;
        for (Place start = 0; start < count; ++start) {
            std::vector<Place> found;
            std::vector<bool> seen(static_cast<std::size_t>(count), false);
            const auto reach = [&graph, &found, &seen](Place person) {
                if (graph.unionsAsChild(person).empty()) return;
                for (const Place parent : graph.partners(graph.unionsAsChild(person).front())) {
                    if (seen[static_cast<std::size_t>(parent)]) continue;
                    seen[static_cast<std::size_t>(parent)] = true;
                    found.push_back(parent);
                }
            };
            reach(start);
            for (std::size_t i = 0; i < found.size(); ++i) reach(found[i]);
            if (seen[static_cast<std::size_t>(start)]) expected.push_back(start);
        }
        EXPECT_EQ(ownAncestors(graph), expected);
    }
}

TEST(DataCheck, openAndWideDatesAccuseNobody) {
    const KinFamily family{"Ben + Ada: Cid.m"};
    Lives lives = noDates(family.graph());
    lives.persons[2].birth = {1900, Years::kOpenEnd, false};
    lives.persons[2].death = exactly(1905);
    EXPECT_EQ(kindsIn(family, lives), "");
    lives.persons[2].birth = {1908, 1908, true};
    EXPECT_EQ(kindsIn(family, lives), "");
    lives.persons[2].birth = {1911, 1911, true};
    EXPECT_EQ(kindsIn(family, lives), "diedBeforeBirth");
}

TEST(DataCheck, listsOfAnotherLengthAreRefused) {
    const KinFamily family{"Ben + Ada: Cid.m"};
    EXPECT_THROW(checkData(family.graph(), Lives{}), std::invalid_argument);
    EXPECT_THROW(livingPersons(family.graph(), Lives{}, 2000), std::invalid_argument);
}

TEST(RemarkText, everyKindHasASentenceInEveryLanguage) {
    const RemarkNames names{[](Place person) { return "P" + std::to_string(person); },
                            [](std::uint32_t family) { return "F" + std::to_string(family); }};
    for (std::size_t kind = 0; kind < kRemarkKinds; ++kind) {
        const Remark remark{static_cast<RemarkKind>(kind), 1, 2, 3, 60};
        std::vector<std::string> texts;
        for (const Language language : kLanguages) {
            texts.push_back(remarkText(remark, names, language));
            EXPECT_NE(texts.back().find("P1"), std::string::npos) << texts.back();
            EXPECT_EQ(texts.back().find('{'), std::string::npos) << texts.back();
            // What one language says of the other person, the family and the years, each says.
            for (const char* const part : {"P2", "F3", "60"}) {
                EXPECT_EQ(texts.back().find(part) == std::string::npos,
                          texts.front().find(part) == std::string::npos)
                    << texts.back();
            }
        }
        EXPECT_NE(texts[0], texts[1]);
        EXPECT_NE(texts[0], texts[2]);
        EXPECT_STRNE(nameOf(remark.kind), "");
    }
}

TEST(RemarkText, putsNamesWhereTheLanguageWantsThem) {
    const RemarkNames names{[](Place person) { return person == 1 ? "Cid" : "Ada"; },
                            [](std::uint32_t) { return "F1"; }};
    const Remark remark{RemarkKind::parentTooOld, 1, 2, 0, 60};
    EXPECT_EQ(remarkText(remark, names, Language::english), "Cid has a parent older than 60, Ada");
    EXPECT_EQ(remarkText(remark, names, Language::german), "Cid hat einen Elternteil über 60 Jahren, Ada");
    EXPECT_EQ(remarkText(remark, names, Language::spanish), "Cid tiene un progenitor de más de 60 años, Ada");
}

TEST(LivingPersons, areThoseBornWithinTheLongestLifeWithoutASignOfDeath) {
    const KinFamily family{"Ben + Ada"};
    Lives lives = noDates(family.graph());
    lives.persons[0].birth = exactly(2000 - kLongestLife + 1);
    EXPECT_THAT(livingPersons(family.graph(), lives, 2000), testing::ElementsAre(true, true));
    lives.persons[0].birth = exactly(2000 - kLongestLife);
    EXPECT_THAT(livingPersons(family.graph(), lives, 2000), testing::ElementsAre(false, false));
    lives.persons[0].birth = exactly(1990);
    lives.persons[0].isDead = true;
    EXPECT_THAT(livingPersons(family.graph(), lives, 2000), testing::ElementsAre(false, false));
}

TEST(LivingPersons, withoutDatesAreThoseWithinTwoSteps) {
    // Kin of Old's line: child, grandchild's parents and so on without dates; Theo was born in 1990.
    const KinFamily family{"Adam + Eva: Seth.m", "Seth + Sara: Noah.m", "Noah + Nora: Theo.m",
                           "Theo + Thea: Tim.m", "Tim + Tina: Tom.m"};
    Lives lives = noDates(family.graph());
    lives.persons[static_cast<std::size_t>(family["Theo"])].birth = exactly(1990);
    const auto living = livingPersons(family.graph(), lives, 2020);
    const auto isLiving = [&living, &family](const char* name) {
        return static_cast<bool>(living[static_cast<std::size_t>(family[name])]);
    };
    EXPECT_TRUE(isLiving("Theo") && isLiving("Noah") && isLiving("Seth") && isLiving("Tim") &&
                isLiving("Tom"));
    EXPECT_TRUE(isLiving("Thea") && isLiving("Tina"));
    EXPECT_FALSE(isLiving("Adam") || isLiving("Eva"));
}
