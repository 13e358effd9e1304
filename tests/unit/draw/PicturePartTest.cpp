// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A part of a picture has what lies in it and nothing else, at the size and place that it has in the whole.

#include <gtest/gtest.h>

#include <limits>
#include <regex>
#include <stdexcept>
#include <string>
#include <vector>

#include <olvane/charts/Charts.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/kin/KinGraph.h>

namespace olvane::draw {
namespace {

// 1 and 2 have 3, 4 and 5, who stand side by side below them.
DrawingContent content(charts::View view) {
    kin::KinGraphBuilder builder;
    for (std::int64_t id = 1; id <= 5; ++id) builder.addPerson(id, kin::Sex::unknown);
    const kin::UnionPlace u = builder.addUnion(0, 1, kin::UnionState::married);
    for (const kin::Place child : {2, 3, 4}) builder.addChild(u, child, kin::ChildKind::birth);
    charts::ChartRequest request;
    request.view = view;
    request.fanOf = charts::FanOf::descendants;
    DrawingContent content;
    content.picture = charts::chartOf(builder.build(), request);
    content.labelOf = [](std::int64_t id) {
        kin::PersonLabel label;
        label.given = "P" + std::to_string(id);
        return label;
    };
    return content;
}

bool names(const SvgPicture& picture, int person) {
    return picture.svg.find("<title>P" + std::to_string(person)) != std::string::npos;
}

const picture::Box& boxOf(const DrawingContent& content, std::int64_t id) {
    for (const picture::Box& box : content.picture.boxes) {
        if (box.id == id) return box;
    }
    throw std::out_of_range("no box");
}

PictureArea areaOf(const picture::Box& box) {
    return {box.x, box.y, static_cast<double>(box.width), static_cast<double>(box.height)};
}

TEST(PicturePart, hasTheBoxesThatLieInItAlone) {
    const DrawingContent all = content(charts::View::descendants);
    const SvgPicture whole = drawSvg(all, DrawingOptions());
    const SvgPicture part = partOf(whole, areaOf(boxOf(all, 4)), "Part");
    for (int person = 1; person <= 5; ++person) {
        EXPECT_TRUE(names(whole, person)) << person;
        EXPECT_EQ(names(part, person), person == 4) << person;
    }
    // Two px a point, from where the box lies in the whole.
    EXPECT_EQ(part.width, 110);
    EXPECT_EQ(part.height, 160);
    const PictureArea& drawn =
        whole.boxes[static_cast<std::size_t>(&boxOf(all, 4) - all.picture.boxes.data())].area;
    const std::string view = "viewBox=\"" + std::to_string(static_cast<int>(drawn.x)) + " " +
                             std::to_string(static_cast<int>(drawn.y)) + " 110 160\"";
    EXPECT_NE(part.svg.find(view), std::string::npos) << part.svg.substr(0, 200);
    EXPECT_NE(part.svg.find("<title>Part</title>"), std::string::npos);
}

TEST(PicturePart, endsAtTheEdgesOfThePicture) {
    const DrawingContent all = content(charts::View::descendants);
    const SvgPicture whole = drawSvg(all, DrawingOptions());
    const SvgPicture part = partOf(whole, {-10000, -10000, 20000, 20000}, "");
    EXPECT_EQ(part.width, whole.width);
    EXPECT_EQ(part.height, whole.height);
    for (int person = 1; person <= 5; ++person) EXPECT_TRUE(names(part, person)) << person;
}

TEST(PicturePart, canBeCutOutOfARoundChart) {
    const DrawingContent all = content(charts::View::fan);
    const SvgPicture whole = drawSvg(all, DrawingOptions());
    const picture::Box& middle = boxOf(all, 1);
    const SvgPicture part = partOf(whole, {middle.x + 1, middle.y + 1, 10, 10}, "");
    EXPECT_TRUE(names(part, 1));
    EXPECT_EQ(part.width, 20);
}

TEST(PicturePart, endsHalfAGapAroundTheBoxesThatItIsFor) {
    const DrawingContent all = content(charts::View::descendants);
    const picture::Box& from = boxOf(all, 3);
    const picture::Box& to = boxOf(all, 4);
    const auto place = [&all](const picture::Box& box) {
        return static_cast<picture::Index>(&box - all.picture.boxes.data());
    };
    const std::vector<picture::Index> boxes{place(to), place(from)};
    const PictureArea area = areaAround(all.picture, boxes);
    EXPECT_EQ(area.x, from.x - 12);
    EXPECT_EQ(area.width, to.x - from.x + 55 + 24);
    EXPECT_EQ(area.height, 80 + 24);
    const SvgPicture part = partOf(drawSvg(all, DrawingOptions()), area, "");
    EXPECT_TRUE(names(part, 3) && names(part, 4));
    EXPECT_FALSE(names(part, 5) || names(part, 1));
    EXPECT_EQ(areaAround(all.picture, {}).width, 0);
    const std::vector<picture::Index> nobody{5};
    EXPECT_THROW(areaAround(all.picture, nobody), std::out_of_range);
}

TEST(PicturePart, refusesAPartThatShowsNothing) {
    const SvgPicture whole = drawSvg(content(charts::View::descendants), DrawingOptions());
    EXPECT_THROW(partOf(whole, {5000, 0, 100, 100}, ""), std::invalid_argument);
    EXPECT_THROW(partOf(whole, {0, 0, std::numeric_limits<double>::quiet_NaN(), 100}, ""),
                 std::invalid_argument);
}

}  // namespace
}  // namespace olvane::draw
