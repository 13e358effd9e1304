// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The typed layout of the man 17 with his wife 42, their child 5 and his parents 3 and 4, whose places and lines
// are worked out by hand in PathOfOneRequestTest.cpp.
//
//     y -220   [-1 father?][-2 mother?]   [-3 father?][-4 mother?]
//     y -110               [3]------------[4]
//     y    0                    [17]--[42]
//     y  110                       [5]

#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <limits>
#include <memory>
#include <ostream>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/TypedLayout.h>
#include <support/CaseRun.h>
#include <support/FamilyText.h>

namespace olvane {

// What gtest prints of a line that is not the expected one.
static void PrintTo(const TypedLayout::Line& line, std::ostream* out) {
    *out << line.x1 << "," << line.y1 << "," << line.x2 << "," << line.y2 << " holder " << line.holder
         << " family " << line.family << " child " << line.child << " role " << static_cast<int>(line.role);
}

}  // namespace olvane

namespace {

using olvane::LayoutOptions;
using olvane::LineRole;
using olvane::TypedLayout;
using support::family;
typedef TypedLayout::Index Index;

std::shared_ptr<OlvaneViewerManagerWrapProtocol> hostOf(const std::string& text) {
    return std::make_shared<support::CaseManager>(family(text));
}

TypedLayout fiveRelatives() {
    return olvane::familyLayout(17, hostOf("17+42: 5; 3+4: 17"));
}

// Places of boxes in the order of the walk.
enum Place : Index { k17, k3, kFatherOf3, kMotherOf3, k4, kFatherOf4, kMotherOf4, k42, k5 };

std::vector<std::int64_t> idsOf(const TypedLayout& layout) {
    std::vector<std::int64_t> ids;
    for (const TypedLayout::Box& box : layout.boxes) ids.push_back(box.id);
    return ids;
}

std::vector<Index> children(const TypedLayout& layout, std::size_t family) {
    const auto span = layout.childrenOf(layout.families.at(family));
    return {span.begin(), span.end()};
}

TEST(TypedLayout, hasTheBoxesInTheOrderOfTheText) {
    const TypedLayout layout = fiveRelatives();
    EXPECT_EQ((std::vector<std::int64_t>{17, 3, -1, -2, 4, -3, -4, 42, 5}), idsOf(layout));
    EXPECT_EQ(27, layout.boxes[k17].x);
    EXPECT_EQ(-12, layout.boxes[k3].x);
    EXPECT_EQ(-110, layout.boxes[k3].y);
    EXPECT_TRUE(layout.boxes[k17].male);
    EXPECT_FALSE(layout.boxes[k42].male);
    EXPECT_FALSE(layout.boxes[k17].hasHiddenRelatives);
}

TEST(TypedLayout, unknownParentsSayWhoseTheyAre) {
    const TypedLayout layout = fiveRelatives();
    EXPECT_EQ(TypedLayout::BoxKind::unknownFather, layout.boxes[kFatherOf4].kind);
    EXPECT_EQ(TypedLayout::BoxKind::unknownMother, layout.boxes[kMotherOf4].kind);
    EXPECT_EQ(4, layout.boxes[kMotherOf4].childId);
    EXPECT_EQ(k4, layout.boxes[kMotherOf4].childOf);
    EXPECT_EQ(TypedLayout::kNone, layout.boxes[k4].childOf);
}

// Marriage lines of spouses first; then, person by person, the lines to children and from parents.
TEST(TypedLayout, everyLineHasItsRoleItsFamilyAndItsChild) {
    const TypedLayout layout = fiveRelatives();
    constexpr Index kOwn = 0;
    constexpr Index kParents = 1;
    constexpr Index kNobody = TypedLayout::kNone;
    const std::vector<TypedLayout::Line> of17 = {{82, 40, 107, 40, k17, kOwn, kNobody, LineRole::marriage},
                                                 {55, -15, 55, -15, k17, kParents, k17, LineRole::bar},
                                                 {55, 0, 55, -15, k17, kParents, k17, LineRole::stem}};
    const auto lines = layout.linesOf(layout.boxes[k17]);
    EXPECT_EQ(of17, (std::vector<TypedLayout::Line>(lines.begin(), lines.end())));
    const std::vector<TypedLayout::Line> of42 = {{95, 40, 95, 95, k42, kOwn, k5, LineRole::drop}};
    const auto drop = layout.linesOf(layout.boxes[k42]);
    EXPECT_EQ(of42, (std::vector<TypedLayout::Line>(drop.begin(), drop.end())));
}

TEST(TypedLayout, everyCoupleIsOneFamilyWithItsChildren) {
    const TypedLayout layout = fiveRelatives();
    ASSERT_EQ(4u, layout.families.size());
    const Index expected[4][3] = {
        {k17, k42, k5}, {k3, k4, k17}, {kFatherOf3, kMotherOf3, k3}, {kFatherOf4, kMotherOf4, k4}};
    for (std::size_t i = 0; i < 4; ++i) {
        EXPECT_EQ(expected[i][0], layout.families[i].parents[0]) << i;
        EXPECT_EQ(expected[i][1], layout.families[i].parents[1]) << i;
        EXPECT_EQ(std::vector<Index>{expected[i][2]}, children(layout, i)) << i;
    }
}

// The focus is a woman, and her husband's box comes behind hers.
TEST(TypedLayout, theHusbandIsTheFirstOfACouple) {
    const TypedLayout layout = olvane::familyLayout(42, hostOf("42f; 17+42: 5"));
    const TypedLayout::Family& couple = layout.families.at(0);
    EXPECT_EQ(17, layout.boxes.at(static_cast<std::size_t>(couple.parents[0])).id);
    EXPECT_EQ(42, layout.boxes.at(static_cast<std::size_t>(couple.parents[1])).id);
}

TEST(TypedLayout, aChildOfALoneParentIsAFamilyOfOneParent) {
    const TypedLayout layout = olvane::familyLayout(42, hostOf("42f: 9"));
    const TypedLayout::Family& alone = layout.families.at(0);
    EXPECT_EQ(1u, layout.parentsOf(alone).size());
    EXPECT_EQ(42, layout.boxes.at(static_cast<std::size_t>(alone.parents[0])).id);
    EXPECT_EQ(9, layout.boxes.at(static_cast<std::size_t>(children(layout, 0).at(0))).id);
}

// 6 is the father's child by somebody else: its lines, and so its family, have the father alone.
TEST(TypedLayout, aHalfSiblingHangsFromTheSharedParent) {
    const TypedLayout layout = olvane::familyLayout(17, hostOf("17; 3+4: 17 8; 3: 6"));
    const auto idOf = [&layout](Index box) { return layout.boxes.at(static_cast<std::size_t>(box)).id; };
    std::vector<std::int64_t> withMother;
    std::vector<std::int64_t> withoutMother;
    for (std::size_t i = 0; i < layout.families.size(); ++i) {
        const auto parents = layout.parentsOf(layout.families[i]);
        if (idOf(parents[0]) != 3) continue;
        for (const Index child : children(layout, i)) {
            (parents.size() == 2 ? withMother : withoutMother).push_back(idOf(child));
        }
    }
    EXPECT_EQ((std::vector<std::int64_t>{8, 17}), withMother);
    EXPECT_EQ(std::vector<std::int64_t>{6}, withoutMother);
}

// A host that lists the wife twice: two boxes for her, the child twice in the couple's list, and that list visited
// once for each box of the wife.
TEST(TypedLayout, aBoxThatTheWalkVisitsAgainNamesTheFirst) {
    support::CaseFile twice = family("17+42: 5");
    twice.spouses[17] = {42, 42};
    const TypedLayout layout = olvane::familyLayout(17, std::make_shared<support::CaseManager>(twice));
    std::vector<Index> of5;
    std::vector<Index> repeats;
    for (std::size_t i = 0; i < layout.boxes.size(); ++i) {
        if (layout.boxes[i].id != 5) continue;
        of5.push_back(static_cast<Index>(i));
        repeats.push_back(layout.boxes[i].repeatOf);
    }
    ASSERT_EQ(4u, of5.size());
    EXPECT_EQ((std::vector<Index>{TypedLayout::kNone, TypedLayout::kNone, of5[0], of5[1]}), repeats);
}

TEST(TypedLayout, aPedigreeHasRolesTooAndItsOptions) {
    LayoutOptions options;
    options.generations = 2;
    const TypedLayout layout = olvane::pedigreeLayout(17, hostOf("17; 3+4: 17; 1+2: 3"), options);
    EXPECT_EQ(TypedLayout::View::pedigree, layout.view);
    EXPECT_EQ((std::vector<std::int64_t>{17, 3, 4}), idsOf(layout));
    ASSERT_EQ(1u, layout.families.size());
    std::vector<LineRole> roles;
    for (const TypedLayout::Line& line : layout.lines) roles.push_back(line.role);
    EXPECT_EQ((std::vector<LineRole>{LineRole::drop, LineRole::bar, LineRole::stem, LineRole::marriage}),
              roles);
}

TEST(TypedLayout, eachOptionOfTheFamilyViewLeavesItsRelativesOut) {
    struct Row {
        bool LayoutOptions::*option;
        std::int64_t missing;
    };
    const std::vector<Row> rows = {
        {&LayoutOptions::siblings, 8},           {&LayoutOptions::siblingSpouses, 9},
        {&LayoutOptions::niecesNephews, 10},     {&LayoutOptions::grandchildren, 12},
        {&LayoutOptions::spousesOfChildren, 11}, {&LayoutOptions::auntsUncles, 13},
        {&LayoutOptions::cousins, 15},           {&LayoutOptions::greatGrandparents, 20}};
    const std::string text = "17+42: 5; 3+4: 17 8; 8+9: 10; 5+11: 12; 1+2: 3 13; 13+14: 15; 20+21: 1";
    const auto has = [](const TypedLayout& layout, std::int64_t id) {
        for (const TypedLayout::Box& box : layout.boxes) {
            if (box.id == id) return true;
        }
        return false;
    };
    const auto host = hostOf(text);
    for (const Row& row : rows) {
        LayoutOptions options;
        EXPECT_TRUE(has(olvane::familyLayout(17, host, options), row.missing)) << row.missing;
        options.*row.option = false;
        EXPECT_FALSE(has(olvane::familyLayout(17, host, options), row.missing)) << row.missing;
    }
}

TEST(TypedLayout, theTextIsLeftOutOnRequest) {
    LayoutOptions options;
    options.withText = false;
    const TypedLayout layout = olvane::familyLayout(17, hostOf("17+42: 5"), options);
    EXPECT_EQ("", layout.text);
    EXPECT_EQ(FamilyViewLayout("17", hostOf("17+42: 5")), olvane::writeLayoutText(olvane::recordsOf(layout)));
}

TEST(TypedLayout, whatIsOutOfItsRangeIsRefused) {
    const auto host = hostOf("17+42: 5");
    for (const std::int64_t id : {std::int64_t{0}, std::int64_t{-1}, std::int64_t{2147483648},
                                  std::int64_t{4294967313}, std::numeric_limits<std::int64_t>::max()}) {
        EXPECT_THROW(olvane::familyLayout(id, host), std::invalid_argument) << id;
        EXPECT_THROW(olvane::pedigreeLayout(id, host), std::invalid_argument) << id;
    }
    EXPECT_THROW(olvane::familyLayout(17, nullptr), std::invalid_argument);
    LayoutOptions options;
    options.sizes.nodeWidth = std::numeric_limits<float>::infinity();
    EXPECT_THROW(olvane::familyLayout(17, host, options), std::invalid_argument);
    for (const int generations : {0, -1, 1001}) {
        options = LayoutOptions();
        options.generations = generations;
        EXPECT_THROW(olvane::pedigreeLayout(17, host, options), std::invalid_argument) << generations;
    }
    options = LayoutOptions();
    options.flagDepth = -1;
    EXPECT_THROW(olvane::pedigreeLayout(17, host, options), std::invalid_argument);
}

TEST(TypedLayout, aFailureOfTheHostReachesTheCaller) {
    support::CaseFile failing = family("17+42: 5");
    failing.failures[support::HostOperation::spousesForPersonWithID] = {1};
    EXPECT_THROW(olvane::familyLayout(17, std::make_shared<support::CaseManager>(failing)),
                 support::HostFailure);
}

// An uncle's wife -99, who is nobody's unknown parent: her record is cut behind its segments.
TEST(TypedLayout, ofAFailureHoldsTheWholeBoxesAndTheCutText) {
    support::CaseFile input = family("17; 1+2: 17; 101+102: 1 11");
    input.spouses[11] = {-99};
    TypedLayout layout;
    EXPECT_THROW(olvane::layOut(TypedLayout::View::family, 17, std::make_shared<support::CaseManager>(input),
                                LayoutOptions(), layout),
                 std::out_of_range);
    const std::string whole = olvane::writeLayoutText(olvane::recordsOf(layout));
    EXPECT_LT(0u, layout.boxes.size());
    EXPECT_TRUE(layout.text.starts_with(whole));
    EXPECT_NE(whole, layout.text);
    EXPECT_EQ(layout.boxes.size(), olvane::readWholeRecords(layout.text).records.size());
}

// Lays out within its first question for children.
class NestingManager : public support::CaseManager {
public:
    NestingManager(std::function<std::string()> layOut)
        : CaseManager(family("17+42: 5")), layOut_(std::move(layOut)) {}

    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override {
        if (inner.empty()) inner = layOut_();
        return CaseManager::childrenForPersonWithID(personId);
    }

    std::string inner;

private:
    std::function<std::string()> layOut_;
};

TEST(NestedLayouts, thatAreTypedLeaveTheOuterOneItsAddNodes) {
    const auto host =
        std::make_shared<NestingManager>([] { return olvane::familyLayout(5, hostOf("17+42: 5")).text; });
    EXPECT_EQ(FamilyViewLayout("17", hostOf("17+42: 5")), FamilyViewLayout("17", host));
    EXPECT_EQ(FamilyViewLayout("5", hostOf("17+42: 5")), host->inner);
}

// The focus's unknown parents come after the question for children, so they go on where the inner layout ended.
TEST(NestedLayouts, byTheEntryCallStartTheAddNodesOfTheOuterOneAgain) {
    const auto host =
        std::make_shared<NestingManager>([] { return FamilyViewLayout("5", hostOf("17+42: 5")); });
    const std::string outer = FamilyViewLayout("17", host);
    EXPECT_EQ(FamilyViewLayout("5", hostOf("17+42: 5")), host->inner);
    EXPECT_NE(std::string::npos, FamilyViewLayout("17", hostOf("17+42: 5")).find(";-1:"));
    EXPECT_EQ(std::string::npos, outer.find(";-1:"));
}

}  // namespace
