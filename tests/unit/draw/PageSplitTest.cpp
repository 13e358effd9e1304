// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Laying pictures out on paper.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <utility>

#include <olvane/draw/PageSplit.h>

namespace olvane::draw {
namespace {

using testing::HasSubstr;
using testing::Not;

SvgPicture pictureOf(int width, int height) {
    SvgPicture picture;
    picture.width = width;
    picture.height = height;
    picture.svg = "<?xml version=\"1.0\"?>\n<svg width=\"" + std::to_string(width) + "\" height=\"" +
                  std::to_string(height) + "\"></svg>\n";
    picture.lines.push_back({0, 0, static_cast<double>(width), static_cast<double>(height)});
    return picture;
}

const Paper kA4 = *paperOfName("A4");

TEST(PageSplit, paperIsFoundByName) {
    EXPECT_EQ(paperOfName("A3")->width, 297);
    EXPECT_EQ(paperOfName("letter")->height, 279.4);
    EXPECT_FALSE(paperOfName("a4").has_value());
}

TEST(PageSplit, smallPictureTakesOneUprightSheetWithoutMarks) {
    const auto sheets = splitPages(pictureOf(400, 500), kA4, "Bergs");
    ASSERT_EQ(sheets.size(), 1u);
    EXPECT_THAT(sheets[0].svg, HasSubstr("width=\"210mm\" height=\"297mm\""));
    EXPECT_THAT(sheets[0].svg, Not(HasSubstr("stroke-dasharray")));
    EXPECT_THAT(sheets[0].svg, Not(HasSubstr("row 1")));
}

TEST(PageSplit, widePictureTurnsThePaper) {
    const auto sheets = splitPages(pictureOf(1000, 400), kA4, "Bergs");
    ASSERT_EQ(sheets.size(), 1u);
    EXPECT_THAT(sheets[0].svg, HasSubstr("width=\"297mm\" height=\"210mm\""));
}

TEST(PageSplit, pictureThatNearlyFitsIsMadeSmaller) {
    EXPECT_EQ(splitPages(pictureOf(2000, 1000), kA4, "").size(), 1u);
    EXPECT_GT(splitPages(pictureOf(2200, 1400), kA4, "").size(), 1u);
}

TEST(PageSplit, largePictureIsSplitRowByRowWithItsPlacePrintedOnEachSheet) {
    const auto sheets = splitPages(pictureOf(3000, 3000), kA4, "Bergs");
    ASSERT_GT(sheets.size(), 4u);
    EXPECT_THAT(sheets[0].svg, HasSubstr("row 1 of "));
    EXPECT_THAT(sheets[0].svg, HasSubstr("column 1 of "));
    EXPECT_THAT(sheets[1].svg, HasSubstr("column 2 of "));
    EXPECT_THAT(sheets.back().svg, HasSubstr(">Bergs</text>"));
}

TEST(PageSplit, innerSheetHasASeamTowardsEachNeighbour) {
    const auto sheets = splitPages(pictureOf(10000, 500), kA4, "");
    ASSERT_GT(sheets.size(), 2u);
    const auto seams = [](const std::string& svg) {
        std::size_t count = 0;
        for (auto at = svg.find("dasharray"); at != std::string::npos; at = svg.find("dasharray", at + 1))
            ++count;
        return count;
    };
    EXPECT_EQ(seams(sheets.front().svg), 1u);
    EXPECT_EQ(seams(sheets[1].svg), 2u);
    EXPECT_EQ(seams(sheets.back().svg), 1u);
}

// Where the window of a sheet begins and how wide it is, from its viewBox.
std::pair<double, double> windowOf(const std::string& svg) {
    const std::size_t second = svg.find("viewBox=\"", svg.find("viewBox=\"") + 1) + 9;
    std::size_t used = 0;
    const std::string numbers = svg.substr(second, 60);
    const double x = std::stod(numbers, &used);
    const std::size_t y = numbers.find(' ') + 1;
    const std::size_t width = numbers.find(' ', y) + 1;
    return {x, std::stod(numbers.substr(width))};
}

TEST(PageSplit, neighboursShareAStripAndTheLastReachesTheEnd) {
    const auto sheets = splitPages(pictureOf(10000, 500), kA4, "");
    for (std::size_t i = 1; i < sheets.size(); ++i) {
        const auto [before, width] = windowOf(sheets[i - 1].svg);
        const auto [start, ignored] = windowOf(sheets[i].svg);
        EXPECT_NEAR(before + width - start, 15 * 96 / 25.4, 0.2);
    }
    const auto [start, width] = windowOf(sheets.back().svg);
    EXPECT_GE(start + width, 10000);
    EXPECT_LT(start, 10000);
}

TEST(PageSplit, blankSheetsAreLeftOut) {
    SvgPicture picture = pictureOf(10000, 500);
    picture.lines = {{0, 100, 200, 0}, {9000, 100, 200, 0}};
    const auto sheets = splitPages(picture, kA4, "");
    ASSERT_EQ(sheets.size(), 2u);
    EXPECT_THAT(sheets[0].svg, HasSubstr("column 1 of "));
    EXPECT_THAT(sheets[1].svg, Not(HasSubstr("column 2 of ")));
}

TEST(PageSplit, sheetHoldsOnlyTheBoxesThatItShows) {
    SvgPicture picture = pictureOf(10000, 500);
    picture.svg = "<svg>[left][right]</svg>";
    picture.boxes = {{{10, 10, 100, 100}, 5, 6}, {{9900, 10, 50, 100}, 11, 7}};
    const auto sheets = splitPages(picture, kA4, "");
    EXPECT_THAT(sheets.front().svg, HasSubstr("<svg>[left]</svg>"));
    EXPECT_THAT(sheets.back().svg, HasSubstr("<svg>[right]</svg>"));
}

TEST(PageSplit, sheetHoldsOnlyTheStrokesThatItShows) {
    SvgPicture picture = pictureOf(10000, 500);
    picture.svg = "<svg>{M1}{M2}{M3}[right]</svg>";
    picture.strokes = {{{10, 10, 100, 0}, 5, 4}, {{0, 20, 10000, 0}, 9, 4}, {{9900, 10, 0, 50}, 13, 4}};
    picture.boxes = {{{9900, 60, 50, 100}, 17, 7}};
    const auto sheets = splitPages(picture, kA4, "");
    ASSERT_GT(sheets.size(), 2u);
    EXPECT_THAT(sheets.front().svg, HasSubstr("<svg>{M1}{M2}</svg>"));
    EXPECT_THAT(sheets[1].svg, HasSubstr("<svg>{M2}</svg>"));
    EXPECT_THAT(sheets.back().svg, HasSubstr("<svg>{M2}{M3}[right]</svg>"));
}

TEST(PageSplit, titleIsText) {
    const auto sheets = splitPages(pictureOf(10000, 500), kA4, "<script>");
    EXPECT_THAT(sheets[0].svg, Not(HasSubstr("<script")));
}

}  // namespace
}  // namespace olvane::draw
