// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the seams between sheets are.

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <random>
#include <stdexcept>

#include <olvane/draw/SheetPlan.h>

namespace olvane::draw {
namespace {

// Without margins, so that numbers can be followed; strips of 10.
SheetRequest on(double width, double height) {
    SheetRequest request;
    request.paper = {width, height, false};
    request.margin = 0;
    request.strip = 10;
    return request;
}

SheetSubject wide(double width, double height, std::vector<PictureArea> boxes = {}) {
    SheetSubject subject;
    subject.width = width;
    subject.height = height;
    subject.boxes = std::move(boxes);
    subject.others = {{0, 0, width, height}};
    return subject;
}

TEST(SheetPlan, paperIsFoundByNameOrBySize) {
    EXPECT_EQ(paperOf("A0")->width, 841);
    EXPECT_EQ(paperOf("A3")->height, 420);
    EXPECT_EQ(paperOf("letter")->height, 279.4);
    EXPECT_EQ(paperOf("914x1500")->width, 914);
    EXPECT_FALSE(paperOf("914x1500")->mayTurn);
    for (const char* text : {"a4", "A5", "", "x", "914x", "x914", "914x1500x2", "-914x1500", "49x100",
                             "100x20001", "1e3x1000", "99999999999999999999x100"}) {
        EXPECT_FALSE(paperOf(text).has_value()) << text;
    }
}

TEST(SheetPlan, oneSheetShowsAllAsLargeAsItMay) {
    const SheetPlan plan = planSheets(wide(400, 100), on(200, 300));
    ASSERT_EQ(plan.sheets.size(), 1u);
    EXPECT_DOUBLE_EQ(plan.scale, 0.5);
    const SheetPlan small = planSheets(wide(20, 10), on(200, 300));
    EXPECT_DOUBLE_EQ(small.scale, 10);
}

TEST(SheetPlan, paperTurnsForAWidePicture) {
    SheetRequest request = on(200, 300);
    request.paper.mayTurn = true;
    const SheetPlan plan = planSheets(wide(600, 300), request);
    EXPECT_EQ(plan.paper.width, 300);
    EXPECT_DOUBLE_EQ(plan.scale, 0.5);
    EXPECT_EQ(planSheets(wide(300, 300), request).paper.width, 200);
}

// 390 is what two sheets of 200 hold together with a strip of 10, if the seam may be anywhere.
TEST(SheetPlan, severalSheetsShareAStrip) {
    SheetRequest request = on(200, 300);
    request.columns = 2;
    const SheetPlan plan = planSheets(wide(390, 10), request);
    ASSERT_EQ(plan.sheets.size(), 2u);
    EXPECT_DOUBLE_EQ(plan.scale, 1);
    EXPECT_DOUBLE_EQ(plan.sheets[1].window.x, 190);
}

// A box of 40 lies where the seam would be: the seam moves to the left of it, and the picture becomes smaller.
TEST(SheetPlan, seamLiesBesideABoxWhereItCan) {
    SheetRequest request = on(200, 300);
    request.columns = 2;
    const SheetPlan plan = planSheets(wide(390, 10, {{175, 0, 40, 10}}), request);
    EXPECT_EQ(plan.cutBoxes, 0u);
    const double seam = plan.sheets[1].window.x + request.strip / plan.scale / 2;
    EXPECT_TRUE(seam <= 175.001 || seam >= 214.999) << seam;
    EXPECT_LT(plan.scale, 1);
    EXPECT_GT(plan.scale, 0.8);
}

// Nothing but one long box: it must be cut, and that is counted.
TEST(SheetPlan, countsBoxesThatNoSheetShowsWhole) {
    SheetRequest request = on(200, 300);
    request.columns = 2;
    const SheetPlan plan = planSheets(wide(390, 10, {{0, 0, 390, 10}}), request);
    EXPECT_EQ(plan.cutBoxes, 1u);
}

TEST(SheetPlan, eachRowOfSheetsChoosesItsOwnSeams) {
    SheetRequest request = on(200, 200);
    request.rows = 2;
    request.columns = 2;
    const SheetPlan plan = planSheets(wide(380, 380, {{180, 0, 30, 40}, {150, 340, 36, 40}}), request);
    EXPECT_EQ(plan.cutBoxes, 0u);
    ASSERT_EQ(plan.starts.size(), 2u);
    EXPECT_NE(plan.starts[0][1], plan.starts[1][1]);
}

TEST(SheetPlan, aScaleTakesAsManySheetsAsItNeeds) {
    SheetRequest request = on(200, 200);
    request.scale = 2;
    const SheetPlan plan = planSheets(wide(480, 100), request);
    EXPECT_EQ(plan.sheets.size(), 5u);  // 960 of paper: 200 and four times 190
    request.scale = 100;
    EXPECT_THROW((void)planSheets(wide(480, 100000), request), std::length_error);
}

TEST(SheetPlan, blankSheetsAreLeftOut) {
    SheetSubject subject = wide(1000, 100);
    subject.others = {{0, 0, 50, 50}, {970, 0, 30, 50}};
    SheetRequest request = on(200, 200);
    request.scale = 1;
    const SheetPlan plan = planSheets(subject, request);
    ASSERT_EQ(plan.sheets.size(), 2u);
    EXPECT_EQ(plan.sheets[1].column, plan.columnsOfRow[0] - 1);
}

TEST(SheetPlan, refusesWhatIsNoLength) {
    SheetRequest request = on(200, 200);
    EXPECT_THROW((void)planSheets(wide(std::numeric_limits<double>::quiet_NaN(), 1), request),
                 std::invalid_argument);
    request.rows = 0;
    EXPECT_THROW((void)planSheets(wide(1, 1), request), std::invalid_argument);
    request = on(15, 200);
    EXPECT_THROW((void)planSheets(wide(1, 1), request), std::invalid_argument);
}

// By a second, plain reading of the plan: every place of the picture is on a sheet, and a box is cut only where every
// place within the last seventh of the sheet cuts one.
TEST(SheetPlan, coversEveryPlaceAndCutsNoBoxNeedlessly) {
    std::mt19937 random(7);
    for (int round = 0; round < 60; ++round) {
        const auto upTo = [&](double most) { return std::uniform_real_distribution<>(0, most)(random); };
        SheetSubject subject = wide(300 + upTo(3000), 300 + upTo(3000));
        for (int i = 0; i < 80; ++i) {
            const double width = 10 + upTo(60);
            subject.boxes.push_back({upTo(subject.width - width), upTo(subject.height - 40), width, 40});
        }
        SheetRequest request = on(200, 280);
        request.rows = 1 + round % 3;
        request.columns = 1 + round % 4;
        const SheetPlan plan = planSheets(subject, request);
        EXPECT_LE(plan.rows, request.rows);
        EXPECT_LE(plan.columns, request.columns);
        for (int i = 0; i < 50; ++i) {
            const double x = upTo(subject.width);
            const double y = upTo(subject.height);
            EXPECT_TRUE(std::any_of(plan.sheets.begin(), plan.sheets.end(), [&](const SheetWindow& sheet) {
                const PictureArea& w = sheet.window;
                return x >= w.x - 1e-6 && x <= w.x + w.width + 1e-6 && y >= w.y - 1e-6 &&
                       y <= w.y + w.height + 1e-6;
            }));
        }
        const double strip = plan.strip / plan.scale;
        const auto crossed = [&](double seam, double top, double bottom) {
            return std::count_if(subject.boxes.begin(), subject.boxes.end(), [&](const PictureArea& box) {
                return box.y < bottom && box.y + box.height > top && box.x + strip / 2 < seam &&
                       box.x + box.width - strip / 2 > seam;
            });
        };
        for (std::size_t row = 0; row < plan.starts.size(); ++row) {
            const double bottom = plan.tops[row] + plan.roomHeight() / plan.scale;
            for (std::size_t i = 1; i < plan.starts[row].size(); ++i) {
                const double room = plan.roomWidth() / plan.scale;
                const double high = plan.starts[row][i - 1] + room - strip / 2;
                const auto cut = crossed(plan.starts[row][i] + strip / 2, plan.tops[row], bottom);
                for (int k = 0; k <= 100; ++k) {
                    EXPECT_LE(cut, crossed(high - room / 7 * k / 100, plan.tops[row], bottom));
                }
            }
        }
    }
}

}  // namespace
}  // namespace olvane::draw
