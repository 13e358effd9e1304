// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <gtest/gtest.h>

#include <limits>
#include <stdexcept>
#include <string>

#include <olvane/charts/Charts.h>
#include <olvane/charts/ViewOption.h>

namespace olvane::charts {
namespace {

// What is usual in the table is what a request has that nobody changed.
TEST(ViewOptions, areUsuallyWhatARequestHas) {
    const ViewRequest untouched;
    ViewRequest request;
    for (const ViewOption& option : viewOptions()) {
        if (option.form.name != "view") option.set(request, option.form.usual);
    }
    EXPECT_EQ(request.chart.to, untouched.chart.to);
    EXPECT_EQ(request.chart.up, untouched.chart.up);
    EXPECT_EQ(request.chart.down, untouched.chart.down);
    EXPECT_EQ(request.chart.direction, untouched.chart.direction);
    EXPECT_EQ(request.chart.spouses, untouched.chart.spouses);
    EXPECT_EQ(request.chart.siblings, untouched.chart.siblings);
    EXPECT_EQ(request.chart.compact, untouched.chart.compact);
    EXPECT_EQ(request.chart.fanOf, untouched.chart.fanOf);
    EXPECT_EQ(request.chart.fanAngle, untouched.chart.fanAngle);
    EXPECT_EQ(request.chart.ways, untouched.chart.ways);
    EXPECT_EQ(request.chart.mostWays, untouched.chart.mostWays);
    EXPECT_EQ(request.chart.language, untouched.chart.language);
    EXPECT_EQ(request.chart.marks, untouched.chart.marks);
    EXPECT_EQ(request.chart.effort, untouched.chart.effort);
    EXPECT_EQ(request.chart.onePart, untouched.chart.onePart);
    EXPECT_EQ(request.chart.aspect, untouched.chart.aspect);
    EXPECT_EQ(request.chart.mirrored, untouched.chart.mirrored);
    EXPECT_EQ(request.chart.layout.generations, untouched.chart.layout.generations);
    EXPECT_EQ(request.chart.sizes.boxWidth, untouched.chart.sizes.boxWidth);
    EXPECT_EQ(request.chart.sizes.boxHeight, untouched.chart.sizes.boxHeight);
    EXPECT_EQ(request.chart.sizes.gapX, untouched.chart.sizes.gapX);
    EXPECT_EQ(request.chart.sizes.gapY, untouched.chart.sizes.gapY);
    EXPECT_EQ(request.unknownParents, untouched.unknownParents);
}

TEST(ViewOptions, takeNumbersInTheirRangeAndWholeOnesWhereTheyAreCounted) {
    const OptionForm& angle = viewOption("angle").form;
    EXPECT_TRUE(takes(angle, 90.5));
    EXPECT_FALSE(takes(angle, 89.9));
    EXPECT_FALSE(takes(angle, std::numeric_limits<double>::quiet_NaN()));
    const OptionForm& effort = viewOption("effort").form;
    EXPECT_TRUE(takes(effort, 100));
    EXPECT_FALSE(takes(effort, 101));
    EXPECT_FALSE(takes(effort, 1.5));
    EXPECT_TRUE(takes(viewOption("direction").form, 3));
    EXPECT_FALSE(takes(viewOption("direction").form, 4));
}

// A word that is none stays none, so that the call for a picture refuses it; 256 is not 0.
TEST(ViewOptions, keepWhatIsNoWordOutOfRange) {
    ViewRequest request;
    for (const double number : {256.0, -1.0, 1e300}) {
        viewOption("view").set(request, number);
        EXPECT_STREQ(nameOf(request.chart.view), "") << number;
    }
}

TEST(ViewOptions, showTheGroupsOfRelativesWhoseBitsAreSet) {
    ViewRequest request;
    viewOption("shown").set(request, 0x04 + 0x20);
    for (const RelativeGroup& group : relativeGroups()) {
        const bool isShown = group.name == "siblings" || group.name == "grandchildren";
        EXPECT_EQ(request.chart.layout.*group.shown, isShown) << group.name;
    }
}

TEST(ViewOptions, nameTheOptionThatNobodyHas) {
    try {
        viewOption("colour");
        FAIL();
    } catch (const std::out_of_range& error) {
        EXPECT_STREQ("there is no option colour", error.what());
    }
}

}  // namespace
}  // namespace olvane::charts
