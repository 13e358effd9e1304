// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/charts/Charts.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/PictureJson.h>

#include <algorithm>
#include <limits>
#include <map>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

#include "KinFamily.h"

using namespace olvane::kin;
using namespace olvane::charts;
using olvane::picture::Box;
using olvane::picture::judge;
using olvane::picture::Judgement;
using olvane::picture::Line;
using olvane::picture::LineRole;
using olvane::picture::MarkKind;
using olvane::picture::Picture;
using olvane::picture::pictureJson;

namespace {

ChartRequest requestFor(View view, Place focus) {
    ChartRequest request;
    request.view = view;
    request.focus = focus;
    return request;
}

const Box& boxOf(const Picture& picture, const KinGraph& graph, Place person) {
    const auto found = std::find_if(picture.boxes.begin(), picture.boxes.end(),
                                    [&](const Box& box) { return graph.placeOf(box.id) == person; });
    if (found == picture.boxes.end()) throw std::out_of_range("nobody of that name is shown");
    return *found;
}

// A family, one chart of it, and its boxes by name.
struct Drawn {
    Drawn(const KinFamily& of, const ChartRequest& request)
        : family(of), picture(chartOf(of.graph(), request)) {}

    const Box& operator[](const std::string& name) const {
        return boxOf(picture, family.graph(), family[name]);
    }
    std::size_t faults() const {
        const Judgement judged = judge(picture, &family.graph());
        return judged.overlaps + judged.hits + judged.crossings + judged.tracks + judged.touches +
               judged.unjoined + judged.untold.value_or(1) + judged.unmarked + judged.slanted;
    }
    std::size_t marksOf(MarkKind kind) const {
        return static_cast<std::size_t>(
            std::count_if(picture.marks.begin(), picture.marks.end(),
                          [kind](const auto& mark) { return mark.kind == kind; }));
    }

    const KinFamily& family;
    Picture picture;
};

// A line of people, each the only child of the one before.
KinGraph lineOf(int generations) {
    KinGraphBuilder builder;
    Place last = builder.addPerson(1, Sex::male);
    for (int i = 1; i < generations; ++i) {
        const Place child = builder.addPerson(i + 1, Sex::male);
        builder.addChild(builder.addUnion(last, kNobody, UnionState::unknown), child, ChildKind::birth);
        last = child;
    }
    return builder.build();
}

// Everybody has two parents, up to that many generations; person 0 is the focus.
KinGraph fullAncestry(int generations) {
    KinGraphBuilder builder;
    std::vector<Place> level{builder.addPerson(1, Sex::male)};
    std::int64_t id = 1;
    for (int generation = 0; generation < generations; ++generation) {
        std::vector<Place> next;
        for (const Place child : level) {
            const Place father = builder.addPerson(++id, Sex::male);
            const Place mother = builder.addPerson(++id, Sex::female);
            builder.addChild(builder.addUnion(father, mother, UnionState::married), child, ChildKind::birth);
            next.push_back(father);
            next.push_back(mother);
        }
        level.swap(next);
    }
    return builder.build();
}

const std::vector<View> kRowViews{View::near, View::ancestors, View::descendants, View::hourglass,
                                  View::relatives};

}  // namespace

// --- What each view shows, and where.

TEST(Descendants, aCoupleStandsOverTheMiddleOfItsChildren) {
    const KinFamily family{"Adam + Eva: Kain.m Abel.m Seth.m"};
    const Drawn drawn(family, requestFor(View::descendants, family["Adam"]));
    // Boxes are 55 wide, 25 apart: three children take 215, and the couple's 135 stand over their middle.
    EXPECT_EQ(drawn["Kain"].x, 0);
    EXPECT_EQ(drawn["Abel"].x, 80);
    EXPECT_EQ(drawn["Seth"].x, 160);
    EXPECT_EQ(drawn["Adam"].x, 40);
    EXPECT_EQ(drawn["Eva"].x, 120);
    EXPECT_EQ(drawn["Adam"].y, 0);
    EXPECT_EQ(drawn["Abel"].y, 110);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Descendants, linesRunFromTheCoupleOverABarToEachChild) {
    const KinFamily family{"Adam + Eva: Kain.m Abel.m"};
    const Drawn drawn(family, requestFor(View::descendants, family["Adam"]));
    ASSERT_EQ(drawn.picture.families.size(), 1U);
    const auto lines = drawn.picture.linesOf(drawn.picture.families[0]);
    ASSERT_EQ(lines.size(), 5U);
    const auto is = [](const Line& line, LineRole role, double x1, double y1, double x2, double y2) {
        return line.role == role && line.x1 == x1 && line.y1 == y1 && line.x2 == x2 && line.y2 == y2;
    };
    EXPECT_TRUE(is(lines[0], LineRole::marriage, 55, 40, 80, 40));
    EXPECT_TRUE(is(lines[1], LineRole::drop, 67.5, 40, 67.5, 95));
    EXPECT_TRUE(is(lines[2], LineRole::bar, 27.5, 95, 107.5, 95));
    EXPECT_TRUE(is(lines[3], LineRole::stem, 27.5, 95, 27.5, 110));
    EXPECT_TRUE(is(lines[4], LineRole::stem, 107.5, 95, 107.5, 110));
}

TEST(Descendants, aManStandsBetweenHisTwoWivesWithTheChildrenOfEachUnderThem) {
    const KinFamily family{"Jakob + Lea: Ruben.m Levi.m", "Jakob + Rahel: Josef.m Benjamin.m"};
    const Drawn drawn(family, requestFor(View::descendants, family["Jakob"]));
    EXPECT_LT(drawn["Lea"].x, drawn["Jakob"].x);
    EXPECT_LT(drawn["Jakob"].x, drawn["Rahel"].x);
    EXPECT_LT(drawn["Ruben"].x, drawn["Levi"].x);
    EXPECT_LT(drawn["Levi"].x, drawn["Josef"].x);
    EXPECT_LT(drawn["Josef"].x, drawn["Benjamin"].x);
    EXPECT_EQ(drawn.faults(), 0U);
    EXPECT_TRUE(drawn.picture.marks.empty());
}

TEST(Descendants, aLineToTheThirdWifePassesOverTheSecond) {
    const KinFamily family{"Ein + Erste: Anna.f", "Ein + Zweite: Berta.f", "Ein + Dritte: Clara.f"};
    const Drawn drawn(family, requestFor(View::descendants, family["Ein"]));
    EXPECT_LT(drawn["Erste"].x, drawn["Ein"].x);
    EXPECT_LT(drawn["Ein"].x, drawn["Zweite"].x);
    EXPECT_LT(drawn["Zweite"].x, drawn["Dritte"].x);
    EXPECT_LT(drawn["Berta"].x, drawn["Clara"].x);
    EXPECT_EQ(drawn.faults(), 0U);
    EXPECT_TRUE(drawn.picture.marks.empty());
    // The line leaves at the top of the first row, above everything.
    EXPECT_TRUE(std::any_of(drawn.picture.lines.begin(), drawn.picture.lines.end(),
                            [](const Line& line) { return line.y1 < 0 && line.y2 < 0; }));
}

TEST(Descendants, cousinsWhoMarryHaveOneBoxEachAndAMarkLeadsToTheSecondParents) {
    const KinFamily family{"Opa + Oma: Vater.m Mitte.m Onkel.m", "Vater + Mutter: Sohn.m",
                           "Mitte + Frau: Kind.m", "Onkel + Tante: Base.f", "Sohn + Base: Enkel.m"};
    const Drawn drawn(family, requestFor(View::descendants, family["Opa"]));
    EXPECT_EQ(drawn.picture.boxes.size(), 12U);
    EXPECT_EQ(drawn["Sohn"].y, drawn["Base"].y);
    ASSERT_EQ(drawn.marksOf(MarkKind::parentsElsewhere), 1U);
    EXPECT_EQ(drawn.picture.marks[0].number, 1);
    const Box& marked = drawn.picture.boxes[static_cast<std::size_t>(drawn.picture.marks[0].boxes[0])];
    EXPECT_EQ(marked.id, drawn["Base"].id);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Descendants, aSecondLineIsDrawnWhereItIsShortAndCrossesNone) {
    const KinFamily family{"Opa + Oma: Vater.m Onkel.m", "Vater + Mutter: Sohn.m", "Onkel + Tante: Base.f",
                           "Sohn + Base: Enkel.m"};
    const Drawn drawn(family, requestFor(View::descendants, family["Opa"]));
    EXPECT_TRUE(drawn.picture.marks.empty());
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Descendants, spousesCanBeLeftOut) {
    const KinFamily family{"Adam + Eva: Kain.m", "Kain + Awan: Henoch.m"};
    ChartRequest request = requestFor(View::descendants, family["Adam"]);
    request.spouses = false;
    const Drawn drawn(family, request);
    EXPECT_EQ(drawn.picture.boxes.size(), 3U);
    EXPECT_EQ(drawn["Kain"].hiddenPartners, 1);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Descendants, endAfterTheGenerationsAskedFor) {
    const KinFamily family{"A + ?: B.m", "B + ?: C.m", "C + ?: D.m"};
    ChartRequest request = requestFor(View::descendants, family["A"]);
    request.down = 2;
    const Drawn drawn(family, request);
    EXPECT_EQ(drawn.picture.boxes.size(), 3U);
    EXPECT_EQ(drawn["C"].hiddenChildren, 1);
}

TEST(Descendants, childrenOfAParentAloneHangFromThatParent) {
    const KinFamily family{"? + Hagar: Ismael.m Kedar.m"};
    const Drawn drawn(family, requestFor(View::descendants, family["Hagar"]));
    EXPECT_EQ(drawn.picture.families[0].parentCount, 1);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Descendants, areNarrowerWhenTheyArePackedTighter) {
    // The two families below are four wide each, and their parents stand over the outer ends otherwise.
    const KinFamily family{"A + B: C.m D.m E.m", "C + ?: f.m g.m h.m i.m", "E + ?: j.m k.m l.m m.m",
                           "i + ?: n.m o.m p.m q.m", "j + ?: r.m s.m t.m u.m"};
    ChartRequest request = requestFor(View::descendants, family["A"]);
    const auto widthOf = [&] {
        double right = 0;
        for (const Box& box : chartOf(family.graph(), request).boxes) {
            right = std::max(right, box.x + static_cast<double>(box.width));
        }
        return right;
    };
    const double usual = widthOf();
    request.compact = true;
    EXPECT_LT(widthOf(), usual);
    EXPECT_EQ(Drawn(family, request).faults(), 0U);
}

TEST(Ancestors, parentsStandAboveTheirChildFatherLeft) {
    const KinFamily family{"Vater + Mutter: Ich.m", "Opa + Oma: Vater"};
    const Drawn drawn(family, requestFor(View::ancestors, family["Ich"]));
    EXPECT_EQ(drawn["Ich"].y, 220);
    EXPECT_EQ(drawn["Vater"].y, 110);
    EXPECT_EQ(drawn["Opa"].y, 0);
    EXPECT_LT(drawn["Vater"].x, drawn["Mutter"].x);
    EXPECT_EQ(drawn["Opa"].x + drawn["Oma"].x, 2 * drawn["Vater"].x);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Ancestors, anAncestorReachedTwiceStandsOnce) {
    const KinFamily family{"Ahn + Ahne: Vater.m Mutter.f", "Vater + Mutter: Ich.m"};
    const Drawn drawn(family, requestFor(View::ancestors, family["Ich"]));
    EXPECT_EQ(drawn.picture.boxes.size(), 5U);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Ancestors, siblingsStandBesideThemOnDemand) {
    const KinFamily family{"Vater + Mutter: Alt.m Ich.m Jung.f", "Opa + Oma: Onkel.m Vater"};
    ChartRequest request = requestFor(View::ancestors, family["Ich"]);
    EXPECT_EQ(Drawn(family, request).picture.boxes.size(), 5U);
    request.siblings = true;
    const Drawn drawn(family, request);
    EXPECT_EQ(drawn.picture.boxes.size(), 8U);
    EXPECT_LT(drawn["Alt"].x, drawn["Ich"].x);
    EXPECT_LT(drawn["Ich"].x, drawn["Jung"].x);
    EXPECT_LT(drawn["Onkel"].x, drawn["Vater"].x);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Hourglass, hasAncestorsAboveAndDescendantsBelow) {
    const KinFamily family{"Vater + Mutter: Ich.m", "Ich + Frau: Kind.m"};
    const Drawn drawn(family, requestFor(View::hourglass, family["Ich"]));
    EXPECT_EQ(drawn["Vater"].y, 0);
    EXPECT_EQ(drawn["Ich"].y, 110);
    EXPECT_EQ(drawn["Kind"].y, 220);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Relatives, reachFromAncestorsDownToTheGenerationAskedFor) {
    const KinFamily family{"Opa + Oma: Onkel.m Vater.m", "Vater + Mutter: Ich.m", "Onkel + Tante: Vetter.m",
                           "Vetter + Base: Neffe.m"};
    ChartRequest request = requestFor(View::relatives, family["Ich"]);
    request.up = 2;
    request.down = 1;
    const Drawn drawn(family, request);
    EXPECT_EQ(drawn.picture.boxes.size(), 10U);
    EXPECT_EQ(drawn["Vetter"].y, drawn["Ich"].y);
    EXPECT_EQ(drawn.faults(), 0U);
    request.up = 1;
    EXPECT_EQ(Drawn(family, request).picture.boxes.size(), 3U);
}

TEST(Relatives, whatHangsBetweenBothParentsAncestorsStartsATreeOfItsOwn) {
    const KinFamily family{"FV + FM: Vater.m", "MV + MM: Mutter.f",    "FMV + FMM: FM Bruder.m",
                           "? + X: MV",        "Bruder + Y: Vetter.m", "Vater + Mutter: Ich.m",
                           "Z + ZZ: MM",       "FVV + FVM: FV"};
    ChartRequest request = requestFor(View::relatives, family["Ich"]);
    request.up = 3;
    request.down = 1;
    const Drawn drawn(family, request);
    EXPECT_EQ(drawn.marksOf(MarkKind::parentsElsewhere), 1U);
    EXPECT_EQ(drawn["Bruder"].y, drawn["FM"].y);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Near, showsThePersonsOfTheFamilyView) {
    const KinFamily family{"Opa + Oma: Onkel.m Vater.m", "Vater + Mutter: Ich.m Bruder.m",
                           "Ich + Frau: Kind.m", "Onkel + Tante: Vetter.m", "Vetter + Base: Neffe.m"};
    const Drawn drawn(family, requestFor(View::near, family["Ich"]));
    EXPECT_NO_THROW(drawn["Vetter"]);
    EXPECT_NO_THROW(drawn["Kind"]);
    EXPECT_THROW(drawn["Neffe"], std::out_of_range);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(Near, leavesOutTheRelativesThatAreSwitchedOff) {
    const KinFamily family{"Opa + Oma: Onkel.m Vater.m", "Vater + Mutter: Ich.m Bruder.m",
                           "Ich + Frau: Kind.m", "Onkel + Tante: Vetter.m", "Kind + Braut: Enkel.m"};
    ChartRequest request = requestFor(View::near, family["Ich"]);
    const auto isShown = [&](const std::string& name) {
        try {
            (void)Drawn(family, request)[name];
            return true;
        } catch (const std::out_of_range&) {
            return false;
        }
    };
    for (const auto& [name, relatives] : {std::pair{"Vetter", &olvane::LayoutOptions::cousins},
                                          std::pair{"Onkel", &olvane::LayoutOptions::auntsUncles},
                                          std::pair{"Bruder", &olvane::LayoutOptions::siblings},
                                          std::pair{"Braut", &olvane::LayoutOptions::spousesOfChildren},
                                          std::pair{"Enkel", &olvane::LayoutOptions::grandchildren}}) {
        EXPECT_TRUE(isShown(name)) << name;
        request.layout.*relatives = false;
        EXPECT_FALSE(isShown(name)) << name;
        EXPECT_TRUE(isShown("Vater"));
        EXPECT_EQ(Drawn(family, request).faults(), 0U) << name;
        request.layout.*relatives = true;
    }
}

TEST(KinshipChart, showsTheWaysBetweenTwoPersonsAndNobodyElse) {
    const KinFamily family{"Opa + Oma: Vater.m Onkel.m Tante.f", "Vater + Mutter: Ich.m Bruder.m",
                           "Onkel + Frau: Vetter.m"};
    ChartRequest request = requestFor(View::kinship, family["Ich"]);
    request.to = family["Vetter"];
    request.ways = WayChoice::blood;
    const Drawn drawn(family, request);
    EXPECT_EQ(drawn.picture.boxes.size(), 6U);
    ASSERT_EQ(drawn.picture.ways.size(), 1U);
    EXPECT_EQ(drawn.picture.boxesOf(drawn.picture.ways[0]).size(), 5U);
    EXPECT_EQ(drawn.picture.ancestorsOf(drawn.picture.ways[0]).size(), 2U);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(KinshipChart, saysAtBothEndsWhatTheOneIsToTheOther) {
    const KinFamily family{"Opa + Oma: Vater.m Onkel.m", "Vater + Mutter: Ich.m", "Onkel + Tante: Base.f",
                           "Base + Mann: Nichte.f"};
    ChartRequest request = requestFor(View::kinship, family["Onkel"]);
    request.to = family["Ich"];
    Picture picture = chartOf(family.graph(), request);
    EXPECT_EQ(picture.focusIs, "uncle (father's brother)");
    EXPECT_EQ(picture.otherIs, "nephew");
    EXPECT_EQ(boxOf(picture, family.graph(), family["Ich"]).id,
              picture.boxes[static_cast<std::size_t>(picture.other)].id);
    request.language = Language::german;
    EXPECT_EQ(chartOf(family.graph(), request).focusIs, "Onkel väterlicherseits");
}

// Brothers who married sisters: the children are cousins twice, by fathers and by mothers.
TEST(KinshipChart, severalWaysRunSideBySideAndNoneOverItself) {
    const KinFamily family{"Opa + Oma: Vater.m Onkel.m", "Opi + Omi: Mutter.f Tante.f",
                           "Vater + Mutter: Ich.m", "Onkel + Tante: Base.f"};
    ChartRequest request = requestFor(View::kinship, family["Ich"]);
    request.to = family["Base"];
    request.ways = WayChoice::blood;
    const Picture picture = chartOf(family.graph(), request);
    ASSERT_EQ(picture.ways.size(), 2U);
    const auto meet = [](const auto& a, const auto& b) {
        const bool isUpright = a.x1 == a.x2;
        if (isUpright != (b.x1 == b.x2)) return false;
        return isUpright ? a.x1 == b.x1 && std::min(a.y2, b.y2) > std::max(a.y1, b.y1)
                         : a.y1 == b.y1 && std::min(a.x2, b.x2) > std::max(a.x1, b.x1);
    };
    for (std::size_t i = 0; i < picture.wayPieces.size(); ++i) {
        for (std::size_t k = 0; k < i; ++k) EXPECT_FALSE(meet(picture.wayPieces[i], picture.wayPieces[k]));
    }
    // The stem to the child of both is on both ways, each beside the other.
    std::vector<double> stems;
    const Box& child = boxOf(picture, family.graph(), family["Ich"]);
    for (const auto& piece : picture.wayPieces) {
        if (piece.x1 == piece.x2 && piece.y1 < child.y && piece.y2 > child.y && piece.x1 > child.x &&
            piece.x1 < child.x + 55) {
            stems.push_back(piece.x1 - child.x - 27.5);
        }
    }
    EXPECT_EQ(stems, (std::vector<double>{0, 2.5}));
}

// Four generations of brothers and sisters who married: the two at the foot are related by 15 ways, and all but those of
// the nearest generations come down the same lines.
TEST(KinshipChart, linesOfManyWaysAreNoBroaderThanThreeOfThem) {
    const KinFamily family{"A0 + B0: A1.m B1.f", "A1 + B1: A2.m B2.f", "A2 + B2: A3.m B3.f",
                           "A3 + B3: A4.m B4.f"};
    ChartRequest request = requestFor(View::kinship, family["A4"]);
    request.to = family["B4"];
    request.mostWays = 0;
    const Drawn drawn(family, request);
    const olvane::picture::Picture& picture = drawn.picture;
    ASSERT_EQ(picture.ways.size(), 15U);
    std::map<double, int> together;  // by the height of an upright piece in the gap above the lowest row
    const Box& lowest = boxOf(picture, family.graph(), family["A4"]);
    for (std::size_t way = 0; way < picture.ways.size(); ++way) {
        const auto pieces = picture.piecesOf(picture.ways[way]);
        EXPECT_TRUE(way >= 3 || !pieces.empty());
        for (const auto& piece : pieces) {
            if (piece.x1 == piece.x2 && piece.y1 < lowest.y && piece.y2 > lowest.y && piece.x1 > lowest.x &&
                piece.x1 < lowest.x + 55) {
                ++together[piece.x1];
            }
        }
    }
    EXPECT_EQ(together.size(), 3U);
    EXPECT_LE(together.rbegin()->first - together.begin()->first, 5.0 + 1e-9);
}

TEST(KinshipChart, ofStrangersShowsTheTwoWithoutAWay) {
    const KinFamily family{"Adam + Eva", "Romeo + Julia"};
    ChartRequest request = requestFor(View::kinship, family["Adam"]);
    request.to = family["Romeo"];
    const Drawn drawn(family, request);
    EXPECT_EQ(drawn.picture.boxes.size(), 2U);
    EXPECT_TRUE(drawn.picture.ways.empty());
    EXPECT_EQ(drawn.picture.focusIs + drawn.picture.otherIs, "");
    EXPECT_NE(drawn.picture.other, olvane::picture::kNone);
}

// --- Fans.

TEST(FanOfAncestors, fathersHaveTheLeftHalfOfTheirChildsCell) {
    const KinFamily family{"Vater + Mutter: Ich.m", "? + Oma: Vater"};
    ChartRequest request = requestFor(View::fan, family["Ich"]);
    request.fanAngle = 180;
    const Drawn drawn(family, request);
    const auto arcOf = [&](const std::string& name) {
        return drawn.picture.arcs[static_cast<std::size_t>(&drawn[name] - drawn.picture.boxes.data())];
    };
    EXPECT_EQ(arcOf("Vater").from, -90);
    EXPECT_EQ(arcOf("Vater").to, 0);
    EXPECT_EQ(arcOf("Mutter").to, 90);
    // The grandfather is not known: his cell stays free.
    EXPECT_EQ(arcOf("Oma").from, -45);
    EXPECT_EQ(arcOf("Oma").to, 0);
    EXPECT_EQ(arcOf("Oma").ring, 2);
    EXPECT_EQ(arcOf("Oma").line, &drawn["Oma"] - drawn.picture.boxes.data());
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(FanOfAncestors, theMiddleOfTheTopRingTouchesTheTopOfThePicture) {
    const KinFamily family{"Vater + Mutter: Ich.m"};
    ChartRequest request = requestFor(View::fan, family["Ich"]);
    request.fanAngle = 180;
    const Drawn drawn(family, request);
    // The middle has the radius 40, half of a box's height; the ring around it is 55 thick.
    EXPECT_DOUBLE_EQ(drawn.picture.middleX, 95);
    EXPECT_DOUBLE_EQ(drawn.picture.middleY, 95);
    EXPECT_NEAR(drawn["Vater"].y, 0, 1e-9);
    EXPECT_NEAR(drawn["Vater"].x, 0, 1e-9);
    EXPECT_NEAR(static_cast<double>(drawn["Vater"].width), 95, 1e-4);
}

TEST(FanOfDescendants, spousesHaveARingOfTheirOwnUnderWhichTheirChildrenStand) {
    const KinFamily family{"Jakob + Lea: Ruben.m Levi.m", "Jakob + Rahel: Josef.m"};
    ChartRequest request = requestFor(View::fan, family["Jakob"]);
    request.fanOf = FanOf::descendants;
    request.fanAngle = 180;
    const Drawn drawn(family, request);
    const auto arcOf = [&](const std::string& name) {
        return drawn.picture.arcs[static_cast<std::size_t>(&drawn[name] - drawn.picture.boxes.data())];
    };
    EXPECT_EQ(arcOf("Lea").ring, 1);
    EXPECT_EQ(arcOf("Ruben").ring, 2);
    EXPECT_DOUBLE_EQ(arcOf("Lea").from, -90);
    EXPECT_DOUBLE_EQ(arcOf("Lea").to, 30);  // two of three children
    EXPECT_DOUBLE_EQ(arcOf("Ruben").to, -30);
    EXPECT_DOUBLE_EQ(arcOf("Josef").from, 30);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(FanOfAncestors, twentyFiveGenerationsTakeKnownCellsOnly) {
    const KinGraph graph = lineOf(40);
    ChartRequest request = requestFor(View::fan, graph.personCount() - 1);
    EXPECT_EQ(chartOf(graph, request).boxes.size(), 26U);
}

// --- Directions.

TEST(Direction, turnsTheChartAndNotTheBoxes) {
    const KinFamily family{"Adam + Eva: Kain.m Abel.m"};
    ChartRequest request = requestFor(View::descendants, family["Adam"]);
    const Drawn down(family, request);
    for (const Direction direction : {Direction::up, Direction::left, Direction::right}) {
        request.direction = direction;
        const Drawn turned(family, request);
        EXPECT_EQ(turned.faults(), 0U);
        EXPECT_EQ(turned["Kain"].width, 55);
        EXPECT_EQ(turned["Kain"].height, 80);
    }
    request.direction = Direction::up;
    EXPECT_GT(Drawn(family, request)["Adam"].y, Drawn(family, request)["Kain"].y);
    request.direction = Direction::left;
    EXPECT_GT(Drawn(family, request)["Adam"].x, Drawn(family, request)["Kain"].x);
    request.direction = Direction::right;
    // Sideways, a couple stands one below the other, 25 apart, and generations are 30 apart.
    EXPECT_EQ(Drawn(family, request)["Eva"].y, 105);
    EXPECT_EQ(Drawn(family, request)["Kain"].x, 85);
}

// --- Awkward families.

TEST(AwkwardFamilies, somebodyTheirOwnFatherIsDrawnOnce) {
    const KinFamily family{"Ouroboros + ?: Ouroboros"};
    for (const View view : kRowViews) {
        const Drawn drawn(family, requestFor(view, family["Ouroboros"]));
        EXPECT_EQ(drawn.picture.boxes.size(), 1U);
        EXPECT_EQ(drawn.faults(), 0U);
    }
}

TEST(AwkwardFamilies, somebodyTheirOwnGrandfatherIsDrawnOnce) {
    const KinFamily family{"A + B: C.m", "C + D: A"};
    for (const View view : kRowViews) {
        const Drawn drawn(family, requestFor(view, family["A"]));
        EXPECT_EQ(drawn.faults(), 0U) << nameOf(view);
    }
}

TEST(AwkwardFamilies, marriedToOneselfTakesOneBox) {
    KinGraphBuilder builder;
    const Place self = builder.addPerson(1, Sex::unknown);
    const Place child = builder.addPerson(2, Sex::male);
    builder.addChild(builder.addUnion(self, self, UnionState::married), child, ChildKind::birth);
    const KinGraph graph = builder.build();
    for (const View view : kRowViews) {
        const Picture picture = chartOf(graph, requestFor(view, self));
        const Judgement judged = judge(picture, &graph);
        EXPECT_EQ(judged.overlaps + judged.unjoined + judged.untold.value_or(1), 0U) << nameOf(view);
    }
}

TEST(AwkwardFamilies, aCoupleOfOneSexStandsInTheOrderOfTheData) {
    const KinFamily family{"Anna.f + Berta.f: Kind.x(adopted)"};
    const Drawn drawn(family, requestFor(View::descendants, family["Berta"]));
    EXPECT_LT(drawn["Anna"].x, drawn["Berta"].x);
    EXPECT_EQ(drawn.picture.kinds(drawn.picture.families[0])[0], ChildKind::adopted);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(AwkwardFamilies, aCoupleThatMarriedTwiceKeepsItsSecondFamilyByAMark) {
    const KinFamily family{"Liz + Dick: Erst.m", "Liz + Dick: Zweit.m"};
    const Drawn drawn(family, requestFor(View::descendants, family["Liz"]));
    EXPECT_EQ(drawn.picture.families.size(), 2U);
    EXPECT_EQ(drawn.marksOf(MarkKind::partnersElsewhere), 1U);
    EXPECT_EQ(drawn.faults(), 0U);
}

TEST(AwkwardFamilies, anAdoptedChildHasBothItsParentFamilies) {
    const KinFamily family{"Vater + Mutter: Kind.m", "Wahlvater + Wahlmutter: Kind(adopted)"};
    const Drawn drawn(family, requestFor(View::ancestors, family["Kind"]));
    EXPECT_EQ(drawn.picture.boxes.size(), 5U);
    EXPECT_EQ(drawn.faults(), 0U);
    EXPECT_TRUE(drawn.picture.marks.empty());
}

// The x of every stem at the top of a box, from left to right.
std::vector<double> stemsOver(const Picture& picture, const Box& box) {
    std::vector<double> stems;
    for (const Line& line : picture.lines) {
        if (line.role != LineRole::stem || std::max(line.y1, line.y2) != box.y) continue;
        if (line.x1 > box.x && line.x1 < box.x + box.width) stems.push_back(line.x1);
    }
    std::sort(stems.begin(), stems.end());
    return stems;
}

// Two families of parents stand side by side over their child, as parts of one tree; a third would have no place for its
// line, so that it is a tree of its own with a mark.
TEST(AwkwardFamilies, twoFamiliesOfParentsHaveALineAndAThirdHasAMark) {
    const char* const birth = "Vater + Mutter: Kind.m";
    const char* const adopted = "Wahlvater + Wahlmutter: Kind(adopted)";
    const KinFamily two{birth, adopted};
    const KinFamily three{birth, adopted, "Pfleger + Pflegerin: Kind(foster)"};
    const Drawn ofTwo(two, requestFor(View::ancestors, two["Kind"]));
    const Drawn ofThree(three, requestFor(View::ancestors, three["Kind"]));
    for (const Drawn* drawn : {&ofTwo, &ofThree}) {
        const Box& child = (*drawn)["Kind"];
        const double middle = child.x + child.width / 2;
        EXPECT_THAT(stemsOver(drawn->picture, child), testing::ElementsAre(middle - 6, middle + 6));
        const Box& last = (*drawn)["Wahlmutter"];
        EXPECT_EQ(middle, ((*drawn)["Vater"].x + last.x + last.width) / 2);
        EXPECT_EQ(drawn->faults(), 0U);
    }
    EXPECT_EQ(ofTwo.marksOf(MarkKind::parentsElsewhere), 0U);
    EXPECT_EQ(ofThree.marksOf(MarkKind::parentsElsewhere), 1U);
}

// In every view and every direction: each person once, nothing that misleads, every relation drawn or marked.
void expectSoundInEveryView(const KinFamily& family, const std::string& focus, const std::string& other) {
    const KinGraph& graph = family.graph();
    for (int view = static_cast<int>(View::near); view <= static_cast<int>(View::everybody); ++view) {
        for (int choice = 0; choice < 8; ++choice) {
            ChartRequest request = requestFor(static_cast<View>(view), family[focus]);
            request.to = family[other];
            request.direction = static_cast<Direction>(choice % 4);
            request.fanOf = static_cast<FanOf>(choice / 4);
            request.compact = choice >= 4;
            request.siblings = choice >= 4;
            SCOPED_TRACE(std::string(nameOf(request.view)) + " " + std::to_string(choice));
            const Picture picture = chartOf(graph, request);
            const Judgement judged = judge(picture, &graph);
            EXPECT_EQ(judged.persons, judged.boxes);
            EXPECT_EQ(judged.overlaps + judged.unjoined + judged.untold.value_or(1) + judged.unmarked, 0U);
            if (request.view == View::fan) continue;
            EXPECT_EQ(judged.hits + judged.tracks + judged.touches + judged.slanted, 0U);
        }
    }
}

TEST(AwkwardFamilies, childrenOfOneKnownParentInEveryView) {
    expectSoundInEveryView(
        KinFamily{"? + Mutter: A.m B.f", "Vater + ?: C.m", "A + ?: D.f", "Vater + Mutter: E.m"}, "Mutter",
        "D");
}

TEST(AwkwardFamilies, coupleOfOneSexInEveryView) {
    expectSoundInEveryView(KinFamily{"Anna.f + Berta.f: Kind.x(adopted) Zweites.m",
                                     "Carl.m + Dirk.m: Drittes.f(adopted)", "Zweites + Drittes: Enkel.m"},
                           "Anna", "Enkel");
}

TEST(AwkwardFamilies, unknownSexInEveryView) {
    const KinFamily family{"X.x + Y.x: Z.x W.x", "Z + V.x: U.x"};
    expectSoundInEveryView(family, "X", "U");
    const Drawn drawn(family, requestFor(View::descendants, family["X"]));
    EXPECT_EQ(drawn["X"].sex, Sex::unknown);
    EXPECT_LT(drawn["X"].x, drawn["Y"].x);
}

TEST(AwkwardFamilies, parentFamiliesOfEveryKindInEveryView) {
    const KinFamily family{"Vater + Mutter: Kind.m", "Wahlvater + Wahlmutter: Kind(adopted)",
                           "Pfleger + Pflegerin: Kind(foster)", "Stiefvater + Mutter: Kind(step)",
                           "Kind + Frau: Enkel.f"};
    expectSoundInEveryView(family, "Kind", "Vater");
    expectSoundInEveryView(family, "Enkel", "Stiefvater");
    const Drawn drawn(family, requestFor(View::ancestors, family["Kind"]));
    EXPECT_EQ(drawn.picture.boxes.size(), 8U);
    std::multiset<ChildKind> kinds;
    for (const auto& one : drawn.picture.families) kinds.insert(drawn.picture.kinds(one)[0]);
    EXPECT_EQ(kinds, (std::multiset<ChildKind>{ChildKind::birth, ChildKind::adopted, ChildKind::foster,
                                               ChildKind::step}));
}

TEST(AwkwardFamilies, doubleCousinsAndTheirMarriageInEveryView) {
    expectSoundInEveryView(
        KinFamily{"A + B: C.m D.m", "E + F: G.f H.f", "C + G: I.m", "D + H: J.f", "I + J: K.m"}, "A", "K");
}

TEST(AwkwardFamilies, halfSiblingsOfBothParentsInEveryView) {
    expectSoundInEveryView(
        KinFamily{"Vater + Erste: A.m", "Vater + Zweite: B.f", "Dritter + Zweite: C.m", "A + B: D.m"},
        "Vater", "C");
}

TEST(AwkwardFamilies, ownAncestorInEveryView) {
    expectSoundInEveryView(KinFamily{"A + B: C.m", "C + D: A"}, "A", "C");
    expectSoundInEveryView(KinFamily{"Ouroboros + Frau: Ouroboros"}, "Ouroboros", "Frau");
}

TEST(AwkwardFamilies, twelveHundredSpousesAreDrawn) {
    KinGraphBuilder builder;
    const Place man = builder.addPerson(1, Sex::male);
    for (int i = 0; i < 1200; ++i) {
        const Place wife = builder.addPerson(2 * i + 2, Sex::female);
        const Place child = builder.addPerson(2 * i + 3, Sex::male);
        builder.addChild(builder.addUnion(man, wife, UnionState::married), child, ChildKind::birth);
    }
    const KinGraph graph = builder.build();
    const Picture picture = chartOf(graph, requestFor(View::descendants, man));
    EXPECT_EQ(picture.boxes.size(), 2401U);
    const Judgement judged = judge(picture, &graph);
    EXPECT_EQ(judged.overlaps + judged.hits + judged.crossings + judged.tracks + judged.touches +
                  judged.unjoined + judged.untold.value_or(1),
              0U);
}

TEST(AwkwardFamilies, aLineOfTwoHundredThousandGenerationsNeedsNoStack) {
    const KinGraph graph = lineOf(200000);
    const Picture up = chartOf(graph, requestFor(View::ancestors, graph.personCount() - 1));
    EXPECT_EQ(up.boxes.size(), 200000U);
    EXPECT_EQ(up.boxes.back().y, 0);
    const Picture down = chartOf(graph, requestFor(View::descendants, 0));
    EXPECT_EQ(down.boxes.back().y, 199999.0 * 110);
    const Picture both = chartOf(graph, requestFor(View::relatives, 100000));
    EXPECT_EQ(both.boxes.size(), 200000U);
}

TEST(AwkwardFamilies, aChainOfMarriagesStandsInOneRowWithoutAStack) {
    KinGraphBuilder builder;
    constexpr int kPersons = 20000;
    for (int i = 0; i < kPersons; ++i) builder.addPerson(i + 1, Sex::unknown);
    for (int i = 0; i + 1 < kPersons; ++i) builder.addUnion(i, i + 1, UnionState::married);
    // All have one child, so that all are shown.
    builder.addPerson(kPersons + 1, Sex::male);
    for (int i = 0; i < kPersons; ++i) {
        builder.addChild(builder.addUnion(i, kNobody, UnionState::unknown), kPersons, ChildKind::birth);
    }
    const KinGraph graph = builder.build();
    EXPECT_EQ(chartOf(graph, requestFor(View::ancestors, kPersons)).boxes.size(), kPersons + 1U);
}

TEST(AwkwardFamilies, everyGenerationOfAFullAncestryStandsInOneRow) {
    const KinGraph graph = fullAncestry(8);
    const Picture picture = chartOf(graph, requestFor(View::ancestors, 0));
    EXPECT_EQ(picture.boxes.size(), 511U);
    // The uppermost row has 256 boxes side by side, and nothing is wider.
    double right = 0;
    for (const Box& box : picture.boxes) right = std::max(right, box.x + static_cast<double>(box.width));
    EXPECT_EQ(right, 256 * 80 - 25);
    EXPECT_EQ(judge(picture).crossings, 0U);
}

// --- What is refused.

TEST(Charts, refusePersonsWhoAreNotThere) {
    const KinFamily family{"Adam + Eva"};
    EXPECT_THROW(chartOf(family.graph(), requestFor(View::descendants, 2)), std::out_of_range);
    EXPECT_THROW(chartOf(family.graph(), requestFor(View::descendants, -1)), std::out_of_range);
    EXPECT_THROW(chartOf(family.graph(), requestFor(View::kinship, 0)), std::out_of_range);
}

TEST(Charts, refuseTheViewsOfTheEngine) {
    const KinFamily family{"Adam + Eva"};
    EXPECT_THROW(chartOf(family.graph(), requestFor(View::family, 0)), std::invalid_argument);
    EXPECT_THROW(chartOf(family.graph(), requestFor(View::pedigree, 0)), std::invalid_argument);
}

TEST(Charts, refuseNumbersThatMeanNothing) {
    const KinFamily family{"Adam + Eva"};
    const auto isRefused = [&](void (*change)(ChartRequest&)) {
        ChartRequest request = requestFor(View::hourglass, 0);
        change(request);
        try {
            chartOf(family.graph(), request);
        } catch (const std::invalid_argument&) {
            return true;
        }
        return false;
    };
    EXPECT_FALSE(isRefused([](ChartRequest&) {}));
    EXPECT_TRUE(isRefused([](ChartRequest& request) { request.up = -1; }));
    EXPECT_TRUE(isRefused([](ChartRequest& request) { request.down = -1; }));
    EXPECT_TRUE(isRefused([](ChartRequest& request) { request.mostWays = -1; }));
    EXPECT_TRUE(isRefused([](ChartRequest& request) { request.sizes.gapY = 1.1F * kLargestSize; }));
    EXPECT_TRUE(isRefused(
        [](ChartRequest& request) { request.fanAngle = std::numeric_limits<double>::quiet_NaN(); }));
}

TEST(Charts, takeAsManyGenerationsAsAnIntCanSay) {
    const KinFamily family{"Opa + Oma: Vater.m Onkel.m", "Vater + Mutter: Ich.m", "Onkel + Tante: Base.f"};
    ChartRequest request = requestFor(View::relatives, family["Ich"]);
    const std::size_t all = chartOf(family.graph(), request).boxes.size();
    request.up = request.down = std::numeric_limits<int>::max();
    EXPECT_EQ(chartOf(family.graph(), request).boxes.size(), all);
}

TEST(Charts, takeSizesOfBoxesByIdAsByPlace) {
    const KinFamily family{"Adam + Eva: Kain.m Abel.m"};
    std::vector<BoxSize> sizes(static_cast<std::size_t>(family.graph().personCount()), {55, 80});
    sizes[static_cast<std::size_t>(family["Kain"])] = {140, 30};
    const std::int64_t kain = family.graph().id(family["Kain"]);
    const SizedBox sized[] = {
        {kain, {1, 1}}, {999, {7, 7}}, {kain, {140, 30}}};  // the last counts, 999 is nobody
    for (const View view :
         {View::near, View::descendants, View::hourglass, View::relatives, View::everybody}) {
        ChartRequest byPlace = requestFor(view, family["Adam"]);
        byPlace.boxSizes = sizes;
        ChartRequest byId = requestFor(view, family["Adam"]);
        byId.sizedBoxes = sized;
        const Picture chart = chartOf(family.graph(), byId);
        EXPECT_EQ(pictureJson(chart), pictureJson(chartOf(family.graph(), byPlace)));
        for (const Box& box : chart.boxes) EXPECT_EQ(box.width, box.id == kain ? 140 : 55);
        byId.boxSizes = sizes;
        EXPECT_THROW(chartOf(family.graph(), byId), std::invalid_argument);
    }
}

TEST(Charts, refuseSizesThatAreNone) {
    const KinFamily family{"Adam + Eva"};
    ChartRequest request = requestFor(View::descendants, 0);
    request.sizes.boxWidth = std::numeric_limits<float>::quiet_NaN();
    EXPECT_THROW(chartOf(family.graph(), request), std::invalid_argument);
    request.sizes.boxWidth = -1;
    EXPECT_THROW(chartOf(family.graph(), request), std::invalid_argument);
    request.sizes.boxWidth = 55;
    const std::vector<BoxSize> one(1);
    request.boxSizes = one;
    EXPECT_THROW(chartOf(family.graph(), request), std::invalid_argument);
    request.boxSizes = {};
    const SizedBox narrow[] = {{family.graph().id(0), {-1, 80}}};
    request.sizedBoxes = narrow;
    EXPECT_THROW(chartOf(family.graph(), request), std::invalid_argument);
}
