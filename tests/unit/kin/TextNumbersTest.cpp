// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/detail/TextNumbers.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

using olvane::kin::TextNumbers;
using testing::ElementsAre;
using testing::IsEmpty;

TEST(TextNumbers, textsAreNumberedAsTheyComeAndKeepTheirNumbers) {
    TextNumbers numbers;
    EXPECT_EQ(numbers.find(""), TextNumbers::kNone);
    EXPECT_EQ(numbers.numberOf("emma"), 0U);
    EXPECT_EQ(numbers.numberOf(""), 1U);
    EXPECT_EQ(numbers.numberOf("emma"), 0U);
    for (std::uint32_t i = 2; i < 5000; ++i)
        ASSERT_EQ(numbers.numberOf("a longer text " + std::to_string(i)), i);
    EXPECT_EQ(numbers.size(), 5000U);
    for (std::uint32_t i = 2; i < 5000; ++i) {
        const std::string text = "a longer text " + std::to_string(i);
        ASSERT_EQ(numbers.find(text), i);
        ASSERT_EQ(numbers[i], text);
    }
    EXPECT_EQ(numbers.find("emma"), 0U);
    EXPECT_EQ(numbers[1], "");
    EXPECT_EQ(numbers.find("emm"), TextNumbers::kNone);
}

TEST(TextNumbers, textsOfOneBeginningAndOfBytesThatAreZeroAreDifferent) {
    using namespace std::string_view_literals;
    TextNumbers numbers;
    EXPECT_EQ(numbers.numberOf("a"sv), 0U);
    EXPECT_EQ(numbers.numberOf("a\0"sv), 1U);
    EXPECT_EQ(numbers.numberOf("a\0\0"sv), 2U);
    EXPECT_EQ(numbers.numberOf("\0a"sv), 3U);
    EXPECT_EQ(numbers.find("a\0\0"sv), 2U);
}

namespace {

std::vector<std::uint32_t> holding(const TextNumbers& numbers, std::string_view part) {
    std::vector<std::uint32_t> found;
    numbers.visitHolding(part, [&found](std::uint32_t number) { found.push_back(number); });
    return found;
}

std::vector<std::uint32_t> beginning(const TextNumbers& numbers, std::string_view part) {
    std::vector<std::uint32_t> found;
    numbers.visitBeginning(part, [&found](std::uint32_t number) { found.push_back(number); });
    return found;
}

}  // namespace

TEST(TextNumbers, textsThatHoldAPartAreFoundInOrderAndNoneAcrossTwo) {
    TextNumbers numbers;
    EXPECT_THAT(holding(numbers, "a"), IsEmpty());
    for (const char* const text : {"anna", "", "emma", "an", "nan", "annanan"}) numbers.numberOf(text);
    EXPECT_THAT(holding(numbers, "a"), ElementsAre(0, 2, 3, 4, 5));
    EXPECT_THAT(holding(numbers, "an"), ElementsAre(0, 3, 4, 5));
    EXPECT_THAT(holding(numbers, "nan"), ElementsAre(4, 5));
    EXPECT_THAT(holding(numbers, "anna"), ElementsAre(0, 5));
    EXPECT_THAT(holding(numbers, "annanan"), ElementsAre(5));
    EXPECT_THAT(holding(numbers, "annananx"), IsEmpty());
    EXPECT_THAT(holding(numbers, "ae"), IsEmpty()) << "of anna and emma";
    EXPECT_THAT(holding(numbers, "maan"), IsEmpty()) << "of emma and an";
    EXPECT_THAT(beginning(numbers, "an"), ElementsAre(0, 3, 5));
    EXPECT_THAT(beginning(numbers, "n"), ElementsAre(4));
    EXPECT_THAT(beginning(numbers, "ann"), ElementsAre(0, 5));
    EXPECT_THAT(beginning(numbers, "emmaan"), IsEmpty());
}

TEST(TextNumbers, aPartIsFoundWhereverItStandsInTextsOfTwoLetters) {
    TextNumbers numbers;
    std::vector<std::string> texts;
    for (unsigned length = 1; length <= 8; ++length) {
        for (unsigned bits = 0; bits < 1U << length; ++bits) {
            std::string text;
            for (unsigned i = 0; i < length; ++i) text += (bits >> i & 1U) != 0 ? 'a' : '\xC3';
            numbers.numberOf(text);
            texts.push_back(text);
        }
    }
    for (std::size_t part = 0; part < 126; ++part) {
        std::vector<std::uint32_t> expected;
        for (std::uint32_t i = 0; i < texts.size(); ++i) {
            if (texts[i].find(texts[part]) != std::string::npos) expected.push_back(i);
        }
        ASSERT_EQ(holding(numbers, texts[part]), expected) << texts[part];
    }
}
