// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/PictureJson.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include <nlohmann/json.hpp>

#include <olvane/picture/PictureJsonReader.h>

#include "RandomPicture.h"

using olvane::picture::Box;
using olvane::picture::BoxKind;
using olvane::picture::Picture;
using olvane::picture::PictureFacts;
using olvane::picture::pictureJson;
using olvane::picture::PictureJsonError;
using olvane::picture::readPictureJson;
using testing::HasSubstr;

namespace kin = olvane::kin;

namespace {

// A person of id 7 with an unknown mother, in a family of number 3 with one line that jumps at y 92.5.
Picture smallPicture() {
    Picture picture;
    picture.view = "family";
    picture.focus = 0;
    picture.boxes.resize(2);
    picture.boxes[0].id = 7;
    picture.boxes[0].y = 110;
    picture.boxes[0].x = -1.0 / 3;
    picture.boxes[0].width = picture.boxes[1].width = 55;
    picture.boxes[0].height = picture.boxes[1].height = 80;
    picture.boxes[0].hasFlag = true;
    picture.boxes[0].hiddenChildren = 4;
    picture.boxes[1].kind = BoxKind::unknownParent;
    picture.boxes[1].sex = kin::Sex::female;
    picture.boxes[1].childOf = 0;
    picture.families.push_back({0, 0, 1, 1, 3, 1, kin::UnionState::divorced});
    picture.members = {1, 0};
    picture.childKinds = {kin::ChildKind::birth, kin::ChildKind::adopted};
    picture.lines.push_back({27.5, 80, 27.5, 110, 0, 0, 1, olvane::picture::LineRole::drop});
    picture.bridges = {92.5};
    picture.marks.push_back({{0, 1, olvane::picture::kNone}, 1, olvane::picture::MarkKind::parentsElsewhere});
    return picture;
}

}  // namespace

TEST(PictureJson, saysEverythingInOrder) {
    PictureFacts facts;
    facts.person = [](std::int64_t id, const olvane::picture::TextSink& write) {
        write("");
        write("{\"xref\": \"I");
        write(std::to_string(id) + "\"}");
    };
    facts.familyXref = [](std::uint32_t) { return "F\"3"; };
    facts.familyLabel = [](std::uint32_t) { return "1839"; };
    EXPECT_EQ(pictureJson(smallPicture(), facts), R"({
 "format": 2,
 "view": "family",
 "focus": 7,
 "boxes": [
  {"id": 7, "kind": "person", "x": -0.333, "y": 110, "width": 55, "height": 80, "repeat": 0, "hidden": {"parents": 0, "partners": 0, "children": 4}, "flag": false, "person": {"xref": "I7"}},
  {"id": 0, "kind": "unknownParent", "x": 0, "y": 0, "width": 55, "height": 80, "sex": "female", "childOf": 0}
 ],
 "families": [
  {"number": 3, "xref": "F\"3", "label": "1839", "parents": [1], "children": [0], "childKinds": ["adopted"], "style": "divorced",
   "lines": [
    {"role": "drop", "x1": 27.5, "y1": 80, "x2": 27.5, "y2": 110, "child": 0, "bridges": [92.5]}]}
 ],
 "marks": [
  {"kind": "parentsElsewhere", "boxes": [0, 1], "number": 1}
 ]
}
)");
}

TEST(PictureJson, whatIsReadIsWrittenAgain) {
    const std::string small = pictureJson(smallPicture());
    EXPECT_EQ(pictureJson(readPictureJson(small)), small);
    for (std::uint32_t seed = 1; seed <= 300; ++seed) {
        const std::string json = pictureJson(olvane::test::randomPicture(seed));
        ASSERT_EQ(pictureJson(readPictureJson(json)), json);
    }
}

TEST(PictureJson, textsStayTexts) {
    PictureFacts facts;
    facts.familyLabel = [](std::uint32_t) { return "a\"b\\c\n\x01\xC3\xA9"; };
    const auto json = nlohmann::json::parse(pictureJson(smallPicture(), facts));
    EXPECT_EQ(json["families"][0]["label"], "a\"b\\c\n\x01\xC3\xA9");
}

TEST(PictureJson, aRoundChartHasRingsInsteadOfPlaces) {
    Picture picture;
    picture.boxes.resize(1);
    picture.boxes[0].id = 1;
    picture.arcs.push_back({2, -90, 22.5});
    const auto json = nlohmann::json::parse(pictureJson(picture));
    EXPECT_EQ(json["boxes"][0]["ring"], 2);
    EXPECT_EQ(json["boxes"][0]["to"], 22.5);
    EXPECT_FALSE(json["boxes"][0].contains("x"));
    picture.arcs[0] = {25, 180 - 1e-5, 180 - 3e-9};  // so thin a cell is still one
    EXPECT_THAT(pictureJson(picture), HasSubstr("\"from\": 179.99999, \"to\": 179.999999997"));
    EXPECT_TRUE(readPictureJson(json.dump()).isRound());
}

TEST(PictureJson, numbersThatAreNoneAreZero) {
    Picture picture;
    picture.boxes.resize(1);
    picture.boxes[0].x = std::numeric_limits<double>::infinity();
    picture.boxes[0].y = std::numeric_limits<double>::quiet_NaN();
    EXPECT_THAT(pictureJson(picture), HasSubstr("\"x\": 0, \"y\": 0"));
}

TEST(PictureJsonReader, placesBoxesOfARoundChartByTheirRings) {
    const Picture picture =
        readPictureJson(R"({"format": 2, "rings": [0, 10, 30], "middleX": 100, "middleY": 50,
        "boxes": [{"id": 1, "ring": 0, "from": 0, "to": 360}, {"id": 2, "ring": 1, "from": 0, "to": 90},
                  {"id": 3, "ring": 1, "from": -90, "to": 90}, {"id": 4, "ring": 1, "from": 0, "to": 1e11},
                  {"id": 5, "ring": 2, "from": 0, "to": 90}]})");
    const double places[5][4] = {
        {90, 40, 20, 20}, {100, 20, 30, 30}, {70, 20, 60, 30}, {70, 20, 60, 60}, {0, 0, 0, 0}};
    for (std::size_t i = 0; i < 5; ++i) {
        const Box& box = picture.boxes[i];
        EXPECT_NEAR(box.x, places[i][0], 1e-6) << i;
        EXPECT_NEAR(box.y, places[i][1], 1e-6) << i;
        EXPECT_NEAR(static_cast<double>(box.width), places[i][2], 1e-6) << i;
        EXPECT_NEAR(static_cast<double>(box.height), places[i][3], 1e-6) << i;
    }
}

TEST(PictureJsonReader, refusesWhatIsNoPicture) {
    const std::string deep = "{\"format\": 2, \"x\": " + std::string(100000, '[') + "}";
    for (const std::string& text :
         {std::string("{"), std::string("[]"), std::string("{\"format\": 1}"), deep,
          std::string(R"({"format": 2, "boxes": 5})"),
          std::string(R"({"format": 2, "boxes": [{"id": 1, "x": "a"}]})"),
          std::string(R"({"format": 2, "boxes": [{"id": 1, "x": 1e300}]})"),
          std::string(R"({"format": 2, "boxes": [{"id": 1}, {"id": 2, "ring": 1}]})"),
          std::string(R"({"format": 2, "boxes": [{"id": 1}], "families": [{"parents": [1]}]})"),
          std::string(R"({"format": 2, "boxes": [{"id": 1}], "families": [{"parents": [-1]}]})"),
          std::string(R"({"format": 2, "boxes": [{"id": 1}], "families": [{"parents": [0, 0, 0]}]})"),
          std::string(R"({"format": 2, "boxes": [{"id": 1}], "marks": [{"boxes": []}]})")}) {
        EXPECT_THROW(readPictureJson(text), PictureJsonError) << text.substr(0, 80);
    }
}

TEST(PictureJsonReader, ignoresFieldsThatItDoesNotKnow) {
    const Picture picture = readPictureJson(
        R"({"format": 2, "new": [1], "focus": 3, "boxes": [{"id": 9}, {"id": 3, "colour": "red", "person": {"sex": "male"}}]})");
    EXPECT_EQ(picture.focus, 1);
    EXPECT_EQ(picture.boxes[1].sex, kin::Sex::male);
}
