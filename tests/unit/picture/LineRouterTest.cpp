// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/LineRouter.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <random>

#include <olvane/picture/Judge.h>
#include <olvane/picture/PictureJson.h>

using olvane::picture::Box;
using olvane::picture::Direction;
using olvane::picture::Family;
using olvane::picture::Index;
using olvane::picture::judge;
using olvane::picture::Judgement;
using olvane::picture::kNone;
using olvane::picture::Line;
using olvane::picture::LineRole;
using olvane::picture::Mark;
using olvane::picture::MarkKind;
using olvane::picture::Picture;
using olvane::picture::pictureJson;
using olvane::picture::routeLines;
using olvane::picture::RouteOptions;

namespace kin = olvane::kin;

namespace {

Index addBox(Picture& picture, double x, double y) {
    Box box;
    box.id = static_cast<std::int64_t>(picture.boxes.size()) + 1;
    box.x = x;
    box.y = y;
    box.width = 55;
    box.height = 80;
    picture.boxes.push_back(box);
    return static_cast<Index>(picture.boxes.size()) - 1;
}

void addFamily(Picture& picture, const std::vector<Index>& parents, const std::vector<Index>& children) {
    Family family;
    family.firstMember = static_cast<std::uint32_t>(picture.members.size());
    family.parentCount = static_cast<std::uint8_t>(parents.size());
    family.childCount = static_cast<std::uint32_t>(children.size());
    picture.members.insert(picture.members.end(), parents.begin(), parents.end());
    picture.members.insert(picture.members.end(), children.begin(), children.end());
    picture.childKinds.resize(picture.members.size());
    picture.families.push_back(family);
}

// Turns a picture whose children stand below so that they stand in the direction.
void turn(Picture& picture, Direction direction) {
    for (Box& box : picture.boxes) {
        if (direction == Direction::up) box.y = -box.y - static_cast<double>(box.height);
        if (direction == Direction::right || direction == Direction::left) {
            std::swap(box.x, box.y);
            std::swap(box.width, box.height);
        }
        if (direction == Direction::left) box.x = -box.x - static_cast<double>(box.width);
    }
}

// Rows of boxes with families between anybody, many of them as in life, some over several rows, some upwards.
class LayeredPicture {
public:
    explicit LayeredPicture(std::uint32_t seed) : random_(seed) {}

    Picture make() {
        const int rows = 1 + upTo(4);
        double y = 0;
        for (int r = 0; r < rows; ++r) {
            double x = upTo(20) * 27.5;
            rows_.emplace_back();
            for (int i = upTo(9); i >= 0; --i) {
                rows_.back().push_back(addBox(picture_, x, y));
                x += 80 + (upTo(3) == 0 ? upTo(8) * 20.0 : 0.0);
            }
            y += 110;
        }
        for (int i = upTo(static_cast<int>(picture_.boxes.size())); i > 0; --i) addAnyFamily();
        return picture_;
    }

private:
    int upTo(int most) { return static_cast<int>(random_() % static_cast<std::uint32_t>(most + 1)); }
    Index anyOf(const std::vector<Index>& list) { return list[random_() % list.size()]; }
    const std::vector<Index>& anyRow() { return rows_[random_() % rows_.size()]; }

    void addAnyFamily() {
        const std::size_t r = random_() % rows_.size();
        std::vector<Index> parents{anyOf(rows_[r])};
        const int kind = upTo(9);
        if (kind < 5 && parents[0] != rows_[r].back()) parents.push_back(parents[0] + 1);
        if (kind == 5) parents.push_back(anyOf(rows_[r]));
        if (kind == 6) parents.push_back(anyOf(anyRow()));
        std::vector<Index> children;
        for (int i = upTo(3); i > 0; --i) {
            const bool ordinary = upTo(5) > 0 && r + 1 < rows_.size();
            const Index child = anyOf(ordinary ? rows_[r + 1] : anyRow());
            if (std::find(children.begin(), children.end(), child) == children.end())
                children.push_back(child);
        }
        addFamily(picture_, parents, children);
    }

    std::mt19937 random_;
    Picture picture_;
    std::vector<std::vector<Index>> rows_;
};

std::vector<LineRole> rolesOf(const Picture& picture, std::size_t family) {
    std::vector<LineRole> roles;
    for (const Line& line : picture.linesOf(picture.families[family])) roles.push_back(line.role);
    return roles;
}

std::size_t faultsOf(const Judgement& j) {
    return j.hits + j.tracks + j.touches + j.unjoined + j.slanted;
}

}  // namespace

TEST(LineRouter, aCoupleWithOneChildBelowHasTwoPieces) {
    Picture picture;
    const Index man = addBox(picture, 0, 0);
    const Index woman = addBox(picture, 80, 0);
    const Index child = addBox(picture, 40, 110);
    addFamily(picture, {man, woman}, {child});
    routeLines(picture);
    EXPECT_THAT(rolesOf(picture, 0), testing::ElementsAre(LineRole::marriage, LineRole::stem));
    EXPECT_EQ(picture.lines[0].y1, 40);
    EXPECT_EQ(picture.lines[1].x1, 67.5) << "from the middle of the marriage line, right above the child";
    EXPECT_EQ(picture.lines[1].child, child);
    EXPECT_EQ(faultsOf(judge(picture)), 0u);
}

TEST(LineRouter, siblingsHangFromOneBar) {
    Picture picture;
    const Index father = addBox(picture, 80, 0);
    const Index a = addBox(picture, 0, 110);
    const Index b = addBox(picture, 80, 110);
    const Index c = addBox(picture, 160, 110);
    addFamily(picture, {father}, {a, b, c});
    routeLines(picture);
    // The bar in two pieces, each of the child at its end.
    EXPECT_THAT(rolesOf(picture, 0),
                testing::UnorderedElementsAre(LineRole::drop, LineRole::bar, LineRole::bar, LineRole::stem,
                                              LineRole::stem, LineRole::stem));
    double y = 0;
    for (const Line& line : picture.lines) {
        if (line.role != LineRole::bar) continue;
        EXPECT_TRUE(line.child == a || line.child == c);
        EXPECT_TRUE(y == 0 || y == line.y1);
        y = line.y1;
    }
    EXPECT_EQ(faultsOf(judge(picture)), 0u);
}

// A second wife stands behind the first: her line leads over the first one's box, and never behind it.
TEST(LineRouter, aSpouseLineNeverPassesBehindAnotherSpouse) {
    Picture picture;
    const Index man = addBox(picture, 0, 0);
    std::vector<Index> wives;
    for (int i = 1; i <= 6; ++i) wives.push_back(addBox(picture, 80 * i, 0));
    for (const Index wife : wives) {
        const Index child = addBox(picture, picture.boxes[static_cast<std::size_t>(wife)].x, 110);
        addFamily(picture, {man, wife}, {child});
    }
    routeLines(picture);
    const Judgement j = judge(picture);
    EXPECT_EQ(faultsOf(j), 0u);
    EXPECT_EQ(j.crossings, 0u) << "nested, they need not cross";
    EXPECT_EQ(j.partnersElsewhereMarks, 0u);
}

// Each family's children stand below the other family.
TEST(LineRouter, whatCrossesHasABridge) {
    Picture picture;
    const Index a = addBox(picture, 0, 0);
    const Index b = addBox(picture, 400, 0);
    const Index c = addBox(picture, 400, 110);
    const Index d = addBox(picture, 0, 110);
    addFamily(picture, {a}, {c});
    addFamily(picture, {b}, {d});
    routeLines(picture);
    EXPECT_EQ(judge(picture).crossings, 1u);
    EXPECT_EQ(picture.bridges.size(), 1u);
    std::size_t held = 0;
    for (const Line& line : picture.lines) {
        for (const double place : picture.bridgesOf(line)) {
            EXPECT_EQ(line.y1, line.y2) << "what lies flat jumps";
            EXPECT_GT(place, std::min(line.x1, line.x2));
            EXPECT_LT(place, std::max(line.x1, line.x2));
            ++held;
        }
    }
    EXPECT_EQ(held, 1u);
}

// Three couples whose children stand one couple further to the right: a staircase of bars has no crossing.
TEST(LineRouter, barsStandInTheOrderOfFewestCrossings) {
    Picture picture;
    std::vector<Index> parents;
    parents.reserve(3);
    for (int i = 0; i < 3; ++i) parents.push_back(addBox(picture, 160 * i, 0));
    for (int i = 0; i < 3; ++i) {
        const Index one = addBox(picture, 160 * i + 200, 110);
        const Index other = addBox(picture, 160 * i + 280, 110);
        addFamily(picture, {parents[static_cast<std::size_t>(i)]}, {one, other});
    }
    routeLines(picture);
    EXPECT_EQ(judge(picture).crossings, 0u);
}

TEST(LineRouter, aChildAtTheEndHasAPieceOfTheBarOfItsOwn) {
    Picture picture;
    const Index father = addBox(picture, 80, 0);
    const Index a = addBox(picture, 0, 110);
    const Index b = addBox(picture, 160, 110);
    addFamily(picture, {father}, {a, b});
    routeLines(picture);
    const auto lines = picture.linesOf(picture.families[0]);
    const auto own = std::count_if(lines.begin(), lines.end(), [b](const Line& line) {
        return line.role == LineRole::bar && line.child == b;
    });
    EXPECT_EQ(own, 1);
    EXPECT_EQ(faultsOf(judge(picture)), 0u);
}

TEST(LineRouter, whatAMarkExpressesHasNoLine) {
    Picture picture;
    const Index father = addBox(picture, 0, 0);
    const Index here = addBox(picture, 0, 110);
    const Index there = addBox(picture, 800, 110);
    addFamily(picture, {father}, {here, there});
    picture.marks.push_back({{there, father, kNone}, 1, MarkKind::parentsElsewhere});
    routeLines(picture);
    EXPECT_EQ(picture.lines.size(), 1u);
    EXPECT_EQ(picture.marks.size(), 1u);
    EXPECT_EQ(faultsOf(judge(picture)), 0u);
}

// Twenty families in a gap of 30 points all overlap: where rows stay, marks take over; where they may be
// moved apart, every line finds room.
TEST(LineRouter, gapsGrowOrMarksTakeOver) {
    Picture picture;
    for (int i = 0; i < 20; ++i) {
        const Index parent = addBox(picture, 80 * i, 0);
        const Index child = addBox(picture, 80 * (19 - i) + (i < 10 ? 4000 : -4000), 110);
        addFamily(picture, {parent}, {child});
    }
    Picture grown = picture;
    routeLines(picture);
    EXPECT_EQ(faultsOf(judge(picture)), 0u);
    RouteOptions options;
    options.growGaps = true;
    routeLines(grown, options);
    EXPECT_EQ(faultsOf(judge(grown)), 0u);
    EXPECT_EQ(judge(grown).parentsElsewhereMarks, 0u);
    EXPECT_GT(grown.boxes[1].y, 110);
    EXPECT_EQ(grown.boxes[0].y, 0);
}

TEST(LineRouter, nobodyAndARoundChartStayAsTheyAre) {
    Picture nobody;
    routeLines(nobody);
    EXPECT_TRUE(nobody.lines.empty());
    Picture round;
    addBox(round, 0, 0);
    round.arcs.resize(1);
    addFamily(round, {0}, {0});
    round.lines.resize(1);
    routeLines(round);
    EXPECT_EQ(round.lines.size(), 1u);
}

TEST(LineRouter, randomFamiliesAreDrawnWithoutAFaultInEveryDirection) {
    std::size_t marks = 0;
    std::size_t families = 0;
    for (std::uint32_t seed = 1; seed <= 1000; ++seed) {
        for (const bool grow : {false, true}) {
            Picture picture = LayeredPicture(seed).make();
            RouteOptions options;
            options.direction = static_cast<Direction>(seed % 4);
            options.growGaps = grow;
            turn(picture, options.direction);
            routeLines(picture, options);
            const Judgement j = judge(picture);
            ASSERT_EQ(faultsOf(j), 0u)
                << "seed " << seed << " grow " << grow << ": hits " << j.hits << " tracks " << j.tracks
                << " touches " << j.touches << " unjoined " << j.unjoined << "\n"
                << pictureJson(picture);
            ASSERT_EQ(j.overlaps, 0u);
            marks += picture.marks.size();
            families += picture.families.size();
        }
    }
    EXPECT_LT(marks, families / 100) << "marks are for what finds no place";
}

// The second wife's line takes the middle of the space beside the man, so the first one's drop stands aside.
TEST(LineRouter, anOnlyChildNearlyBelowHasAStraightLine) {
    Picture picture;
    const Index man = addBox(picture, 0, 0);
    const Index first = addBox(picture, 80, 0);
    const Index second = addBox(picture, 160, 0);
    const Index child = addBox(picture, 40, 110);
    addFamily(picture, {man, first}, {child});
    addFamily(picture, {man, second}, {});
    routeLines(picture);
    EXPECT_THAT(rolesOf(picture, 0), testing::ElementsAre(LineRole::marriage, LineRole::stem));
    EXPECT_NE(picture.lines[1].x1, 67.5);
    EXPECT_EQ(faultsOf(judge(picture)), 0u);
}
