// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures of every view with right and left exchanged.

#include <gtest/gtest.h>

#include <AnyKin.h>

#include <algorithm>
#include <cmath>
#include <memory>
#include <optional>
#include <random>
#include <string>
#include <vector>

#include <olvane/charts/LaterSide.h>
#include <olvane/charts/Views.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/shared/Mirror.h>

namespace olvane::charts {
namespace {

using picture::Judgement;
using picture::Picture;

constexpr View kViews[] = {View::family,    View::pedigree,  View::near, View::ancestors, View::descendants,
                           View::hourglass, View::relatives, View::fan,  View::kinship,   View::everybody};

std::vector<std::optional<std::size_t>> countsOf(const Judgement& judged) {
    return {judged.overlaps, judged.hits,     judged.crossings, judged.tracks,
            judged.touches,  judged.unjoined, judged.untold,    judged.slanted};
}

// A family of every shape, as a table, which the engine's views take as well.
Family familyOf(unsigned seed) {
    std::mt19937 random(seed);
    const auto choose = [&random](int count) {
        return static_cast<int>(random() % static_cast<unsigned>(count));
    };
    Family family;
    const int persons = 5 + choose(30);
    for (int i = 1; i <= persons; ++i) {
        PersonRow person;
        person.id = i;
        // Parents come before, a man and a woman.
        if (i > 4 && choose(4) != 0) {
            person.father = 1 + 2 * choose((i - 1) / 2);
            person.mother = 2 + 2 * choose((i - 1) / 2);
        }
        person.sex = i % 2 == 1 ? kin::Sex::male : kin::Sex::female;
        family.addPerson(person);
    }
    return family;
}

Picture pictureOf(const Family& family, View view, bool mirrored, Direction direction) {
    ViewRequest request;
    request.chart.view = view;
    request.chart.mirrored = mirrored;
    request.chart.direction = direction;
    request.chart.effort = 0;
    return pictureOf(family, 5, request, 5);
}

TEST(LaterSide, isWhereTheChildStandsInEveryView) {
    Family family;
    family.addPerson({.id = 1, .sex = kin::Sex::male});
    family.addPerson({.id = 2, .sex = kin::Sex::female});
    family.addPerson({.id = 3, .father = 1, .mother = 2});
    family.addFamily({.number = 1, .partner0 = 1, .partner1 = 2}, std::vector<FamilyChild>{{3}});
    for (const View view : kViews) {
        if (view == View::fan) continue;
        for (int direction = 0; direction < 4; ++direction) {
            for (const bool mirrored : {false, true}) {
                ViewRequest request;
                request.chart.view = view;
                request.chart.direction = static_cast<Direction>(direction);
                request.chart.mirrored = mirrored;
                const std::int64_t focus = view == View::descendants ? 1 : 3;
                const Picture picture = pictureOf(family, focus, request, 1);
                const auto boxOf = [&picture](std::int64_t id) {
                    return *std::find_if(picture.boxes.begin(), picture.boxes.end(),
                                         [id](const picture::Box& box) { return box.id == id; });
                };
                const picture::Box parent = boxOf(1);
                const picture::Box child = boxOf(3);
                const bool isSideways = view == View::pedigree || (view != View::family && direction >= 2);
                const picture::Side side =
                    isSideways ? (child.x > parent.x ? picture::Side::right : picture::Side::left)
                               : (child.y > parent.y ? picture::Side::bottom : picture::Side::top);
                EXPECT_EQ(laterSideOf(request.chart), side)
                    << nameOf(view) << " " << direction << (mirrored ? " mirrored" : "");
            }
        }
    }
}

TEST(Mirror, exchangesRightAndLeftWithinTheSameBounds) {
    for (unsigned seed = 1; seed <= 12; ++seed) {
        const Family family = familyOf(seed);
        for (const View view : kViews) {
            SCOPED_TRACE("family " + std::to_string(seed) + ", " + nameOf(view));
            const auto direction = static_cast<Direction>(seed % 4);
            const Picture plain = pictureOf(family, view, false, direction);
            const Picture mirrored = pictureOf(family, view, true, direction);
            ASSERT_EQ(plain.boxes.size(), mirrored.boxes.size());
            ASSERT_EQ(plain.lines.size(), mirrored.lines.size());
            // Each box has changed places about one axis, and stands as high as before.
            const auto middleOf = [](const picture::Box& box) {
                return box.x + static_cast<double>(box.width) / 2;
            };
            const double axis = middleOf(plain.boxes[0]) + middleOf(mirrored.boxes[0]);
            for (std::size_t i = 0; i < plain.boxes.size(); ++i) {
                EXPECT_EQ(plain.boxes[i].id, mirrored.boxes[i].id);
                EXPECT_NEAR(middleOf(plain.boxes[i]) + middleOf(mirrored.boxes[i]), axis, 1e-6);
                EXPECT_EQ(plain.boxes[i].y, mirrored.boxes[i].y);
            }
            for (std::size_t i = 0; i < plain.lines.size(); ++i) {
                const picture::Line& one = plain.lines[i];
                const picture::Line& other = mirrored.lines[i];
                EXPECT_NEAR(one.x1 + one.x2 + other.x1 + other.x2, 2 * axis, 1e-6);
                EXPECT_EQ(one.y1 + one.y2, other.y1 + other.y2);
                ASSERT_EQ(one.bridgeCount, other.bridgeCount);
                for (std::size_t b = 0; b < one.bridgeCount && one.y1 == one.y2; ++b) {
                    EXPECT_NEAR(plain.bridgesOf(one)[b] + mirrored.bridgesOf(other)[one.bridgeCount - 1 - b],
                                axis, 1e-6);
                }
            }
            if (testing::Test::HasFailure()) return;
        }
    }
}

TEST(Mirror, leavesTheJudgesCountsAsTheyAre) {
    for (unsigned seed = 1; seed <= 12; ++seed) {
        const Family family = familyOf(seed);
        for (const View view : kViews) {
            if (view == View::fan) continue;  // the judge has nothing to say of it
            SCOPED_TRACE("family " + std::to_string(seed) + ", " + nameOf(view));
            const auto direction = static_cast<Direction>(seed % 4);
            EXPECT_EQ(countsOf(picture::judge(pictureOf(family, view, true, direction))),
                      countsOf(picture::judge(pictureOf(family, view, false, direction))));
        }
    }
}

// The plain fan's first ancestor, the father, stands at the left of the top; in the mirror at its right.
TEST(Mirror, turnsTheRingsOfAFanTheOtherWay) {
    Family family;
    for (std::int64_t id = 1; id <= 3; ++id) {
        PersonRow person;
        person.id = id;
        if (id == 3) person.father = 1;
        if (id == 3) person.mother = 2;
        person.sex = id == 2 ? kin::Sex::female : kin::Sex::male;
        family.addPerson(person);
    }
    ViewRequest request;
    request.chart.view = View::fan;
    request.chart.fanAngle = 180;
    const auto arcOfFather = [&] {
        const Picture picture = pictureOf(family, 3, request);
        for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
            if (picture.boxes[i].id == 1) return std::pair(picture.arcs[i].from, picture.arcs[i].to);
        }
        return std::pair(0.0, 0.0);
    };
    EXPECT_EQ(arcOfFather(), std::pair(-90.0, 0.0));
    request.chart.mirrored = true;
    EXPECT_EQ(arcOfFather(), std::pair(0.0, 90.0));
}

TEST(Mirror, ofAMirroredPictureOfEverybodyKeepsItsPlaces) {
    const Family family = familyOf(7);
    ViewRequest request;
    request.chart.view = View::everybody;
    request.chart.mirrored = true;
    const Picture first = pictureOf(family, 5, request);
    request.chart.earlier = &first;
    const Picture second = pictureOf(family, 5, request);
    ASSERT_EQ(first.boxes.size(), second.boxes.size());
    for (std::size_t i = 0; i < first.boxes.size(); ++i) {
        EXPECT_EQ(first.boxes[i].id, second.boxes[i].id);
        EXPECT_NEAR(first.boxes[i].x, second.boxes[i].x, 1e-6);
    }
}

}  // namespace
}  // namespace olvane::charts
