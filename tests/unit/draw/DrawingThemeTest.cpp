// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Every theme keeps its promise of contrast, by the formula of the Web Content Accessibility Guidelines.

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <string>
#include <string_view>

#include <olvane/draw/DrawingTheme.h>

namespace olvane::draw {
namespace {

double channel(std::string_view hex) {
    const double value = std::stoi(std::string(hex), nullptr, 16) / 255.0;
    return value <= 0.04045 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
}

double luminance(std::string_view colour) {
    return 0.2126 * channel(colour.substr(1, 2)) + 0.7152 * channel(colour.substr(3, 2)) +
           0.0722 * channel(colour.substr(5, 2));
}

double contrast(std::string_view one, std::string_view other) {
    const double a = luminance(one);
    const double b = luminance(other);
    return (std::max(a, b) + 0.05) / (std::min(a, b) + 0.05);
}

constexpr double kText = 4.5;   // level AA
constexpr double kShape = 3.0;  // what is not text

class DrawingThemes : public testing::TestWithParam<const char*> {
protected:
    const DrawingTheme& theme() const { return *themeOfName(GetParam()); }
};

TEST(DrawingTheme, contrastOfBlackToWhiteIsTwentyOne) {
    EXPECT_NEAR(contrast("#000000", "#ffffff"), 21, 0.01);
}

TEST(DrawingTheme, unknownNameGivesNone) {
    EXPECT_EQ(themeOfName("pink"), nullptr);
}

TEST_P(DrawingThemes, textsCanBeReadOnEveryBox) {
    for (const kin::Sex sex : {kin::Sex::male, kin::Sex::female, kin::Sex::unknown}) {
        EXPECT_GE(contrast(theme().text, theme().coloursOf(sex).fill), kText);
        EXPECT_GE(contrast(theme().quietText, theme().coloursOf(sex).fill), kText);
    }
}

TEST_P(DrawingThemes, textsCanBeReadOnThePage) {
    EXPECT_GE(contrast(theme().text, theme().page), kText);
    EXPECT_GE(contrast(theme().quietText, theme().page), kText);
}

TEST_P(DrawingThemes, marksCanBeRead) {
    EXPECT_GE(contrast(theme().badgeText, theme().badge), kText);
}

TEST_P(DrawingThemes, bordersAndLinesStandOffThePage) {
    for (const std::string_view colour : {theme().line, theme().focus, theme().unknownParent,
                                          theme().male.border, theme().female.border, theme().other.border}) {
        EXPECT_GE(contrast(colour, theme().page), kShape) << colour;
    }
    for (const std::string_view colour : theme().ways) {
        EXPECT_GE(contrast(colour, theme().page), kShape) << colour;
    }
    EXPECT_GE(contrast(theme().page, theme().focus), kText);  // of captions
}

TEST_P(DrawingThemes, menAndWomenDifferInGreyToo) {
    EXPECT_GT(contrast(theme().male.fill, theme().female.fill), 1.05);
}

INSTANTIATE_TEST_SUITE_P(All, DrawingThemes, testing::Values("light", "dark", "print"),
                         [](const auto& tested) { return std::string(tested.param); });

}  // namespace
}  // namespace olvane::draw
