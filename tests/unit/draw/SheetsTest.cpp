// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Laying pictures out on paper.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

#include <olvane/draw/Sheets.h>

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

std::vector<SvgPicture> sheetsAt(const SvgPicture& picture, double scale, const std::string& title = "") {
    SheetRequest request;
    request.paper = *paperOf("A4");
    request.scale = scale * kMillimetresOfPx;
    return drawSheets(picture, request, title).sheets;
}

TEST(Sheets, onePictureOnOneSheetHasNoMarks) {
    const auto sheets = sheetsAt(pictureOf(400, 500), 0, "Bergs");
    ASSERT_EQ(sheets.size(), 1u);
    EXPECT_THAT(sheets[0].svg, HasSubstr("width=\"210mm\" height=\"297mm\""));
    EXPECT_THAT(sheets[0].svg, Not(HasSubstr("stroke-dasharray")));
    EXPECT_THAT(sheets[0].svg, Not(HasSubstr("row 1")));
    EXPECT_THAT(sheets[0].svg, Not(HasSubstr("Map of the sheets")));
}

// 190 mm of room are 718.1 px: a picture of 400 by 400 px is 1.795 times as large, and in the middle of 277 mm.
TEST(Sheets, onePictureStandsInTheMiddle) {
    const auto sheets = sheetsAt(pictureOf(400, 400), 0);
    EXPECT_THAT(sheets[0].svg, HasSubstr("viewBox=\"0 -91.6 400 583.2\""));
}

TEST(Sheets, aLegendTakesRoomOnlyWhereThereIsOne) {
    SvgPicture picture = pictureOf(400, 400);
    EXPECT_EQ(subjectOf(picture).others.size(), 1u);
    picture.legend = {10, 20, 30, 40};
    const auto others = subjectOf(picture).others;
    ASSERT_EQ(others.size(), 2u);
    EXPECT_EQ(others[1].x, 10);
    EXPECT_EQ(others[1].height, 40);
}

TEST(Sheets, widePictureTurnsThePaper) {
    const auto sheets = sheetsAt(pictureOf(1000, 400), 0);
    ASSERT_EQ(sheets.size(), 1u);
    EXPECT_THAT(sheets[0].svg, HasSubstr("width=\"297mm\" height=\"210mm\""));
}

TEST(Sheets, largePictureIsSplitRowByRowWithItsPlaceOnEachSheet) {
    const auto sheets = sheetsAt(pictureOf(3000, 3000), 1, "Bergs");
    ASSERT_GT(sheets.size(), 4u);
    EXPECT_THAT(sheets[0].svg, HasSubstr("row 1 of "));
    EXPECT_THAT(sheets[0].svg, HasSubstr("column 1 of "));
    EXPECT_THAT(sheets[1].svg, HasSubstr("column 2 of "));
    EXPECT_THAT(sheets.back().svg, HasSubstr(">Bergs</text>"));
}

TEST(Sheets, theFirstHasAMapAndTheOthersHaveNone) {
    SvgPicture picture = pictureOf(3000, 3000);
    picture.lines = {{0, 1000, 3000, 0}};
    picture.boxes = {{{10, 900, 100, 100}, 0, 0}};
    picture.svg = "<svg></svg>";
    const auto sheets = sheetsAt(picture, 1);
    EXPECT_THAT(sheets[0].svg, HasSubstr("Map of the sheets"));
    for (std::size_t i = 1; i < sheets.size(); ++i)
        EXPECT_THAT(sheets[i].svg, Not(HasSubstr("Map of the sheets")));
}

// A picture that fills the first sheet is moved down, so that the map lies on nothing.
TEST(Sheets, theMapStandsAboveAPictureWithoutRoom) {
    const SvgPicture picture = pictureOf(3000, 3000);  // its one line covers everything
    SheetRequest request;
    request.paper = *paperOf("A4");
    request.scale = kMillimetresOfPx;
    const SheetDrawing drawing = drawSheets(picture, request, "");
    EXPECT_LT(drawing.plan.sheets[0].window.y, -10);
    EXPECT_THAT(drawing.sheets[0].svg, HasSubstr("Map of the sheets"));
}

TEST(Sheets, marginsSayWhatFollowsAndWhereALineGoesOn) {
    SvgPicture picture = pictureOf(1300, 400);
    picture.lines = {{0, 100, 1300, 0}};
    SheetRequest request;
    request.paper = {210, 297, false};
    request.columns = 2;
    const SheetDrawing drawing = drawSheets(picture, request, "");
    ASSERT_EQ(drawing.sheets.size(), 2u);
    EXPECT_THAT(drawing.sheets[0].svg, HasSubstr(">to sheet 2</text>"));
    EXPECT_THAT(drawing.sheets[1].svg, HasSubstr(">to sheet 1</text>"));
    const auto triangles = [](const std::string& svg) {
        std::size_t count = 0;
        for (auto at = svg.find("z\"/>\n"); at != std::string::npos; at = svg.find("z\"/>\n", at + 1))
            ++count;
        return count;
    };
    EXPECT_EQ(triangles(drawing.sheets[1].svg), 1u);
}

TEST(Sheets, innerSheetHasASeamTowardsEachNeighbour) {
    const auto sheets = sheetsAt(pictureOf(10000, 500), 1);
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

TEST(Sheets, neighboursShareAStripAndTheLastReachesTheEnd) {
    const auto sheets = sheetsAt(pictureOf(10000, 500), 1);
    for (std::size_t i = 1; i < sheets.size(); ++i) {
        const auto [before, width] = windowOf(sheets[i - 1].svg);
        const auto [start, ignored] = windowOf(sheets[i].svg);
        EXPECT_NEAR(before + width - start, 15 * 96 / 25.4, 0.2);
    }
    const auto [start, width] = windowOf(sheets.back().svg);
    EXPECT_GE(start + width, 10000);
    EXPECT_LT(start, 10000);
}

TEST(Sheets, blankSheetsAreLeftOut) {
    SvgPicture picture = pictureOf(10000, 500);
    picture.lines = {{0, 100, 200, 0}, {9000, 100, 200, 0}};
    const auto sheets = sheetsAt(picture, 1);
    ASSERT_EQ(sheets.size(), 2u);
    EXPECT_THAT(sheets[0].svg, HasSubstr("column 1 of "));
    EXPECT_THAT(sheets[1].svg, Not(HasSubstr("column 2 of ")));
}

TEST(Sheets, sheetHoldsOnlyTheBoxesThatItShows) {
    SvgPicture picture = pictureOf(10000, 500);
    picture.svg = "<svg>[left][right]</svg>";
    picture.boxes = {{{10, 10, 100, 100}, 5, 6}, {{9900, 10, 50, 100}, 11, 7}};
    const auto sheets = sheetsAt(picture, 1);
    EXPECT_THAT(sheets.front().svg, HasSubstr("<svg>[left]</svg>"));
    EXPECT_THAT(sheets.back().svg, HasSubstr("<svg>[right]</svg>"));
}

TEST(Sheets, sheetHoldsOnlyTheStrokesThatItShows) {
    SvgPicture picture = pictureOf(10000, 500);
    picture.svg = "<svg>{M1}{M2}{M3}[right]</svg>";
    picture.strokes = {{{10, 10, 100, 0}, 5, 4}, {{0, 20, 10000, 0}, 9, 4}, {{9900, 10, 0, 50}, 13, 4}};
    picture.boxes = {{{9900, 60, 50, 100}, 17, 7}};
    const auto sheets = sheetsAt(picture, 1);
    ASSERT_GT(sheets.size(), 2u);
    EXPECT_THAT(sheets.front().svg, HasSubstr("<svg>{M1}{M2}</svg>"));
    EXPECT_THAT(sheets[1].svg, HasSubstr("<svg>{M2}</svg>"));
    EXPECT_THAT(sheets.back().svg, HasSubstr("<svg>{M2}{M3}[right]</svg>"));
}

TEST(Sheets, titleIsText) {
    const auto sheets = sheetsAt(pictureOf(10000, 500), 1, "<script>");
    EXPECT_THAT(sheets[0].svg, Not(HasSubstr("<script")));
}

}  // namespace
}  // namespace olvane::draw
