// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The rows that the module for JavaScript is tried with as well.

#include <gtest/gtest.h>

#include <fstream>
#include <nlohmann/json.hpp>
#include <string>

#include <olvane/picture/TextFit.h>

namespace olvane::picture {
namespace {

using nlohmann::json;

const json& fixture() {
    static const json kRows = json::parse(std::ifstream(OLVANE_FIXTURES "/texts.json"));
    return kRows;
}

TEST(TextsFixture, aLineIsShortenedAsInTheRows) {
    const json all = fixture();  // outlives the loop
    for (const json& row : all["lines"]) {
        const std::string text = row["text"];
        EXPECT_EQ(fitLine(cleanText(text), {row["size"], row["bold"]}, row["width"]), row["line"]) << text;
    }
}

TEST(TextsFixture, aTextIsBrokenIntoTheLinesOfTheRows) {
    const json all = fixture();  // outlives the loop
    for (const json& row : all["broken"]) {
        const std::string text = row["text"];
        const FittedText fitted =
            fitText(cleanText(text), {row["size"], row["bold"]}, row["width"], row["most"]);
        EXPECT_EQ(!fitted.shortened && !fitted.wordBroken, row["whole"]) << text;
        EXPECT_EQ(json(fitted.lines), row["lines"]) << text;
    }
}

TEST(TextsFixture, aNameIsBrokenIntoTheLinesOfTheRows) {
    const json all = fixture();  // outlives the loop
    for (const json& row : all["names"]) {
        const std::string given = row["given"];
        const std::string surname = row["surname"];
        const FittedName name =
            fitName(given, surname, row.value("surnameFirst", false), {row["width"], row["height"]});
        EXPECT_EQ(name.size, row["size"]) << given;
        EXPECT_EQ(json(name.lines), row["lines"]) << given;
    }
}

TEST(TextsFixture, aTextRunsAsItsFirstLetterDoes) {
    const json all = fixture();  // outlives the loop
    for (const std::string text : all["fromTheRight"]) EXPECT_TRUE(runsRightToLeft(text)) << text;
    for (const std::string text : all["fromTheLeft"]) EXPECT_FALSE(runsRightToLeft(text)) << text;
}

}  // namespace
}  // namespace olvane::picture
