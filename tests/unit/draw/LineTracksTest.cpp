// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Keeping families apart that would share a track.

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <vector>

#include <olvane/draw/LineTracksInternal.h>

namespace olvane::draw {
namespace {

// Two rows of boxes with a gap from y 80 to y 110.
const std::vector<LayoutRecord> kRows = readLayoutText("1:0:0:0:;2:400:0:0:;3:0:110:0:;4:400:110:0:;");

// From parents above at `joint` to children below.
FamilyLine familyAt(int trunk, int joint, const std::vector<int>& children) {
    FamilyLine family;
    family.trunk = trunk;
    family.joint = joint;
    family.taps.push_back({joint, 40, FamilyTap::kNoRecord});
    for (std::size_t i = 0; i < children.size(); ++i) family.taps.push_back({children[i], 110, i});
    return family;
}

std::vector<double> placesOf(const std::vector<FamilyLine>& families) {
    return separateTracks(families, kRows, LineDirection::downward, BoxSize());
}

TEST(LineTracks, loneFamilyKeepsItsPlace) {
    EXPECT_EQ(placesOf({familyAt(95, 60, {0, 120})}), std::vector<double>({95}));
}

TEST(LineTracks, familiesSideBySideKeepTheirPlaces) {
    EXPECT_EQ(placesOf({familyAt(95, 60, {0, 120}), familyAt(95, 260, {200, 300})}),
              std::vector<double>({95, 95}));
}

TEST(LineTracks, familiesAtDifferentHeightsKeepTheirPlaces) {
    EXPECT_EQ(placesOf({familyAt(95, 60, {0, 120}), familyAt(87, 100, {50, 130})}),
              std::vector<double>({95, 87}));
}

TEST(LineTracks, familiesOnOneTrackArePutApartWithinTheGap) {
    const auto places = placesOf({familyAt(95, 60, {0, 120}), familyAt(95, 100, {50, 200})});
    ASSERT_EQ(places.size(), 2u);
    EXPECT_GE(std::abs(places[0] - places[1]), 8);
    for (const double place : places) {
        EXPECT_GT(place, 80);
        EXPECT_LT(place, 110);
    }
}

TEST(LineTracks, orderWithFewerCrossingsIsTaken) {
    // The right family's children lie further right than the left family reaches; its drop comes down inside.
    // With the right family on top, its drop crosses nothing.
    const auto places = placesOf({familyAt(95, 10, {0, 100}), familyAt(95, 60, {60, 300})});
    EXPECT_LT(places[1], places[0]);
}

TEST(LineTracks, stemAndDropOfOneColumnDoNotRunIntoEachOther) {
    // A child of the first stands where the drop of the second comes down.
    const auto places = placesOf({familyAt(95, 10, {100}), familyAt(95, 100, {200})});
    EXPECT_GT(places[0], places[1]);
}

TEST(LineTracks, manyFamiliesOnOneTrackAllGetTheirOwn) {
    std::vector<FamilyLine> families;
    for (int i = 0; i < 5; ++i) families.push_back(familyAt(95, i * 3, {i * 3, 400}));
    std::vector<double> places = placesOf(families);
    std::sort(places.begin(), places.end());
    for (std::size_t i = 1; i < places.size(); ++i) EXPECT_GE(places[i] - places[i - 1], 4);
}

}  // namespace
}  // namespace olvane::draw
