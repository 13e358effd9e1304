// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <gtest/gtest.h>

#include <olvane/charts/BoxForm.h>

using namespace olvane::charts;

namespace {

TEST(BoxForm, boxesAreWideWhereGenerationsStandSideBySide) {
    EXPECT_EQ(usualBoxForm(View::family, Direction::down), BoxForm::tall);
    EXPECT_EQ(usualBoxForm(View::family, Direction::left), BoxForm::tall);
    EXPECT_EQ(usualBoxForm(View::fan, Direction::right), BoxForm::tall);
    EXPECT_EQ(usualBoxForm(View::pedigree, Direction::down), BoxForm::wide);
    EXPECT_EQ(usualBoxForm(View::ancestors, Direction::up), BoxForm::tall);
    EXPECT_EQ(usualBoxForm(View::ancestors, Direction::left), BoxForm::wide);
    EXPECT_EQ(usualBoxForm(View::descendants, Direction::right), BoxForm::wide);
}

TEST(BoxForm, setsTheSizesOfChartsAndOfTheEngine) {
    ChartRequest chart;
    chart.sizes.gapX = 99;
    setBoxForm(chart, BoxForm::wide);
    EXPECT_EQ(chart.sizes.boxWidth, 105);
    EXPECT_EQ(chart.sizes.boxHeight, 40);
    EXPECT_EQ(chart.sizes.gapX, ChartSizes().gapX);
    EXPECT_EQ(chart.sizes.gapY, 45);
    chart.view = View::pedigree;
    setBoxForm(chart, BoxForm::wide);
    EXPECT_EQ(chart.sizes.gapX, 30);
    EXPECT_EQ(chart.sizes.gapY, 14);
    EXPECT_EQ(chart.layout.sizes.lineInset, 15);
    setBoxForm(chart, BoxForm::tall);
    EXPECT_EQ(chart.sizes.boxWidth, 55);
    EXPECT_EQ(chart.layout.sizes.nodeHeight, 80);
}

TEST(BoxForm, flagsStandAtTheLastColumnOfAPedigree) {
    ChartRequest chart;
    flagBeyondGenerations(chart);
    EXPECT_EQ(chart.layout.flagDepth, 4);
    chart.layout.generations = 7;
    flagBeyondGenerations(chart);
    EXPECT_EQ(chart.layout.flagDepth, 6);
    chart.layout.generations = 1;
    flagBeyondGenerations(chart);
    EXPECT_EQ(chart.layout.flagDepth, 1);
}

}  // namespace
