// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/Judge.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <string>

#include <nlohmann/json.hpp>

#include <olvane/picture/PictureJson.h>
#include <olvane/picture/PictureJsonReader.h>

#include "PlainJudge.h"
#include "RandomPicture.h"

using olvane::picture::Box;
using olvane::picture::Family;
using olvane::picture::Finding;
using olvane::picture::FindingKind;
using olvane::picture::Index;
using olvane::picture::judge;
using olvane::picture::Judgement;
using olvane::picture::Picture;
using olvane::picture::readPictureJson;
using olvane::test::plainJudgement;
using olvane::test::randomPicture;
using testing::DoubleEq;
using testing::DoubleNear;
using testing::ElementsAre;

namespace kin = olvane::kin;

namespace {

std::string textOf(const std::filesystem::path& path) {
    std::ifstream file(path);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

std::map<std::string, std::size_t> countsOf(const Judgement& judgement) {
    return {{"overlaps", judgement.overlaps},
            {"hits", judgement.hits},
            {"crossings", judgement.crossings},
            {"tracks", judgement.tracks},
            {"touches", judgement.touches},
            {"unjoined", judgement.unjoined},
            {"couples", judgement.couples},
            {"sideBySide", judgement.sideBySide},
            {"repeats", judgement.repeats},
            {"unmarked", judgement.unmarked},
            {"slanted", judgement.slanted},
            {"samePerson", judgement.samePersonMarks},
            {"parentsElsewhere", judgement.parentsElsewhereMarks},
            {"partnersElsewhere", judgement.partnersElsewhereMarks}};
}

// What a picture does not name in "expected" is expected to be 0; persons are compared where they are named.
class JudgedPicture : public testing::Test {
public:
    explicit JudgedPicture(std::filesystem::path path) : path_(std::move(path)) {}

    void TestBody() override {
        const std::string text = textOf(path_);
        const auto json = nlohmann::json::parse(text);
        const Judgement judgement = judge(readPictureJson(text));
        for (const auto& [name, count] : countsOf(judgement)) {
            EXPECT_EQ(count, json["expected"].value(name, std::size_t{0})) << name << ": " << json["says"];
        }
        if (json["expected"].contains("persons")) {
            EXPECT_EQ(judgement.persons, json["expected"]["persons"]);
        }
    }

private:
    std::filesystem::path path_;
};

const bool kPicturesAreRegistered = [] {
    for (const auto& entry : std::filesystem::directory_iterator(OLVANE_PICTURES)) {
        if (entry.path().extension() != ".json") continue;
        const std::filesystem::path& path = entry.path();
        testing::RegisterTest("JudgedPicture", path.stem().c_str(), nullptr, nullptr, path.c_str(), 1,
                              [path]() -> testing::Test* { return new JudgedPicture(path); });
    }
    return true;
}();

Picture pictureNamed(const std::string& name) {
    return readPictureJson(textOf(std::string(OLVANE_PICTURES) + "/" + name + ".json"));
}

}  // namespace

// A count of which no picture is wrong would be held by nothing; every one is 0 in most pictures.
TEST(Judge, everyCountHasAPictureThatIsWrongInIt) {
    std::map<std::string, std::size_t> sums = countsOf(Judgement());
    for (const auto& entry : std::filesystem::directory_iterator(OLVANE_PICTURES)) {
        if (entry.path().extension() != ".json") continue;
        for (const auto& [name, count] : countsOf(judge(readPictureJson(textOf(entry.path())))))
            sums[name] += count;
    }
    for (const auto& [name, sum] : sums) EXPECT_GT(sum, 0U) << name;
}

TEST(Judge, countsAsThePlainOneDoesOverRandomPictures) {
    ASSERT_TRUE(kPicturesAreRegistered);
    std::map<std::string, std::size_t> sums;
    for (std::uint32_t seed = 1; seed <= 3000; ++seed) {
        const Picture picture = randomPicture(seed);
        auto counts = countsOf(judge(picture));
        auto plain = countsOf(plainJudgement(picture));
        for (const char* name : {"samePerson", "parentsElsewhere", "partnersElsewhere"}) {
            counts.erase(name);
            plain.erase(name);
        }
        ASSERT_EQ(counts, plain) << "seed " << seed << "\n" << pictureJson(picture);
        for (const auto& [name, count] : counts) sums[name] += count;
    }
    for (const auto& [name, sum] : sums) {
        EXPECT_TRUE(sum > 100 || name == "slanted") << name << " is hardly tried";
    }
}

TEST(Judge, relationsThatNoEntryAndNoMarkExpressAreUntold) {
    kin::KinGraphBuilder builder;
    const kin::Place father = builder.addPerson(1, kin::Sex::male);
    const kin::Place mother = builder.addPerson(2, kin::Sex::female);
    const kin::Place child = builder.addPerson(3, kin::Sex::female);
    const kin::Place hidden = builder.addPerson(4, kin::Sex::female);
    const kin::Place foster = builder.addPerson(5, kin::Sex::male);
    builder.addChild(builder.addUnion(father, mother, kin::UnionState::married), child,
                     kin::ChildKind::birth);
    builder.addChild(builder.addUnion(foster, kin::kNobody, kin::UnionState::unknown), child,
                     kin::ChildKind::foster);
    builder.addUnion(father, hidden, kin::UnionState::married);
    const kin::KinGraph known = builder.build();

    Picture picture = pictureNamed("couple-with-child");
    EXPECT_EQ(judge(picture).untold, std::nullopt);
    EXPECT_EQ(judge(picture, &known).untold, 0u);
    Box box;
    box.id = 5;
    box.x = 500;
    picture.boxes.push_back(box);
    EXPECT_EQ(judge(picture, &known).untold, 1u) << "the foster father is shown and not joined";
    picture.marks.push_back({{2, 3, olvane::picture::kNone}, 1, olvane::picture::MarkKind::parentsElsewhere});
    EXPECT_EQ(judge(picture, &known).untold, 0u);
    picture.families.clear();
    EXPECT_EQ(judge(picture, &known).untold, 3u) << "both parents of the child, and the couple";
    EXPECT_EQ(plainJudgement(picture, &known).untold, 3u);
}

TEST(Judge, findingsNameTheBoxesAndFamilies) {
    std::vector<Finding> findings;
    judge(pictureNamed("line-through-a-box"), nullptr, &findings);
    EXPECT_THAT(findings, ElementsAre(Finding{FindingKind::hit, 0, 1}));
    judge(pictureNamed("overlapping-boxes"), nullptr, &findings);
    EXPECT_THAT(findings, ElementsAre(Finding{FindingKind::overlap, 0, 1}));
}

// Boxes of 55 by 80 from (0, 0) to (135, 190): 25,650 of 4,400 each is 5.8295... boxes for 3 persons.
TEST(Judge, measuresAreInBoxes) {
    const Judgement judgement = judge(pictureNamed("couple-with-child"));
    EXPECT_THAT(judgement.width, DoubleEq(135));
    EXPECT_THAT(judgement.height, DoubleEq(190));
    EXPECT_THAT(judgement.areaPerPerson, DoubleNear(25650.0 / 4400 / 3, 1e-9));
    EXPECT_THAT(judgement.aspect, DoubleNear(135.0 / 190, 1e-9));
    EXPECT_THAT(judgement.medianLineLength, DoubleNear(95.0 / 55, 1e-9)) << "25 of marriage and 70 of drop";
}

TEST(Judge, movedIsCountedFromTheFocus) {
    const Picture before = pictureNamed("couple-with-child");
    Picture after = before;
    for (Box& box : after.boxes) box.x += 500;
    EXPECT_THAT(olvane::picture::movedShare(before, after), DoubleEq(0));
    after.boxes[2].y += 110;
    EXPECT_THAT(olvane::picture::movedShare(before, after), DoubleNear(1.0 / 3, 1e-9));
}

TEST(Judge, anEmptyPictureHasNothingToCount) {
    const Judgement judgement = judge(Picture());
    EXPECT_EQ(judgement, Judgement());
}

// A row of couples with a bar over all of them: 40,000 boxes that a comparison of all pairs could not judge.
TEST(Judge, judgesTensOfThousandsOfBoxes) {
    Picture picture;
    for (Index i = 0; i < 40000; ++i) {
        Box box;
        box.id = i + 1;
        box.x = 80.0 * (i % 4000);
        const Index row = i / 4000;
        box.y = 110.0 * row;
        box.width = 55;
        box.height = 80;
        picture.boxes.push_back(box);
        if (i % 2 == 0) continue;
        Family family;
        family.firstMember = static_cast<std::uint32_t>(picture.members.size());
        family.firstLine = static_cast<std::uint32_t>(picture.lines.size());
        family.parentCount = 2;
        family.lineCount = 1;
        picture.members.insert(picture.members.end(), {i - 1, i});
        picture.lines.push_back({box.x - 25, box.y + 40, box.x, box.y + 40});
        picture.families.push_back(family);
    }
    picture.childKinds.resize(picture.members.size());
    const Judgement judgement = judge(picture);
    EXPECT_EQ(judgement.couples, 20000u);
    EXPECT_EQ(judgement.sideBySide, 20000u);
    EXPECT_EQ(judgement.overlaps + judgement.hits + judgement.crossings + judgement.unjoined, 0u);
}
