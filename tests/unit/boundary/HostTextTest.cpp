// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The three conversions between host values and the engine's text: numbers both ways, and dates on the way
// in.

#include <limits>
#include <string>

#include <gtest/gtest.h>

#include <olvane/boundary/HostText.h>

namespace {

TEST(NumberToText, isPlainDecimalWithALeadingMinusAlone) {
    EXPECT_EQ("-1", intToString(-1));
    EXPECT_EQ("0", intToString(0));
    EXPECT_EQ("7", intToString(7));
    EXPECT_EQ("1234567", intToString(1234567));
    EXPECT_EQ("2147483647", intToString(std::numeric_limits<int>::max()));
    EXPECT_EQ("-2147483648", intToString(std::numeric_limits<int>::min()));
}

TEST(NumberToText, writesEveryNumberOfUpToFiveDigitsPlainly) {
    for (int number = -100001; number <= 100001; ++number) {
        ASSERT_EQ(std::to_string(number), intToString(number));
    }
}

struct TextAndNumber {
    const char* text;
    int number;
};

void expectNumbers(std::initializer_list<TextAndNumber> rows) {
    for (const TextAndNumber& row : rows) EXPECT_EQ(row.number, stringToInt(row.text)) << row.text;
}

TEST(TextToNumber, stopsAtTheFirstCharacterThatIsNoDigit) {
    expectNumbers({{"17abc", 17}, {"17 18", 17}, {"5-3", 5}, {"3.9", 3}, {"0x10", 0}, {"007", 7}});
}

TEST(TextToNumber, textWithoutANumberGivesZero) {
    expectNumbers({{"", 0}, {"abc", 0}, {" ", 0}, {"-", 0}, {"+", 0}, {"--5", 0}, {"+-5", 0}, {"- 5", 0}});
}

TEST(TextToNumber, skipsWhiteSpaceAndReadsOneSign) {
    expectNumbers({{"  42", 42}, {" \t\n\v\f\r7", 7}, {"+5", 5}, {"-5x", -5}, {" -12", -12}});
}

TEST(TextToNumber, numberTooLargeForAnIntKeepsItsLow32Bits) {
    expectNumbers({{"2147483647", 2147483647},
                   {"2147483648", std::numeric_limits<int>::min()},
                   {"4294967295", -1},
                   {"4294967296", 0},
                   {"4294967313", 17},
                   {"-4294967279", 17}});
}

// The 64-bit reading stops at its largest (all low bits set) and its least number (none of them set).
TEST(TextToNumber, numberTooLargeFor64BitsKeepsTheLowBitsOfTheNearestOne) {
    expectNumbers({{"9223372036854775807", -1},
                   {"99999999999999999999", -1},
                   {"-9223372036854775808", 0},
                   {"-99999999999999999999", 0}});
}

TEST(TextToNumber, endsAtAZeroByte) {
    EXPECT_EQ(17, stringToInt(std::string("17\0"
                                          "99",
                                          5)));
}

TEST(DateToText, asciiDateKeepsItsFirstCharacter) {
    EXPECT_EQ("1", stringToString("1850"));
    EXPECT_EQ("A", stringToString("ABT 1850"));
    EXPECT_EQ(" ", stringToString(" 1850"));
}

TEST(DateToText, emptyDateStaysEmpty) {
    EXPECT_EQ("", stringToString(""));
}

TEST(DateToText, dateThatBeginsWithAZeroByteIsEmpty) {
    EXPECT_EQ("", stringToString(std::string("\0"
                                             "1850",
                                             5)));
}

TEST(DateToText, zeroByteBehindTheFirstCharacterIsNoPartOfIt) {
    EXPECT_EQ("1", stringToString(std::string("1\0"
                                              "850",
                                              5)));
}

TEST(DateToText, utf8DateKeepsItsFirstCharacterWhole) {
    EXPECT_EQ("\xC3\xA9", stringToString("\xC3\xA9t\xC3\xA9 1850"));
    EXPECT_EQ("\xE5\xB9\xB4", stringToString("\xE5\xB9\xB4"
                                             "1850"));
    EXPECT_EQ("\xF0\x9D\x9F\x8F", stringToString("\xF0\x9D\x9F\x8F"
                                                 "850"));
    EXPECT_EQ("\xED\x9F\xBF", stringToString("\xED\x9F\xBF"
                                             "1"));
    EXPECT_EQ("\xF4\x8F\xBF\xBF", stringToString("\xF4\x8F\xBF\xBF"
                                                 "1"));
}

// Of a number that Unicode has, in as few bytes as it takes.
std::string utf8Of(unsigned number) {
    const auto byte = [](unsigned value) { return static_cast<char>(static_cast<unsigned char>(value)); };
    const auto low = [byte, number](unsigned shift) { return byte(0x80 | (number >> shift & 0x3F)); };
    if (number < 0x80) return {byte(number)};
    if (number < 0x800) return {byte(0xC0 | number >> 6), low(0)};
    if (number < 0x10000) return {byte(0xE0 | number >> 12), low(6), low(0)};
    return {byte(0xF0 | number >> 18), low(12), low(6), low(0)};
}

TEST(DateToText, everyCharacterOfUnicodeIsKeptWhole) {
    constexpr unsigned kEnd = 0x110000;
    constexpr unsigned kLastByteValues = 0x40;  // the first and the last of each are tried
    for (unsigned first = kLastByteValues; first < kEnd; first += kLastByteValues) {
        if (first >= 0xD800 && first < 0xE000) continue;  // halves of pairs
        for (const unsigned number : {first, first + kLastByteValues - 1}) {
            const std::string character = utf8Of(number);
            ASSERT_EQ(character, stringToString(character + "1")) << number;
        }
    }
}

TEST(DateToText, datesOfOneFirstCharacterAreTheSameAndOthersAreNot) {
    EXPECT_EQ(stringToString("1850"), stringToString("1911"));
    EXPECT_EQ(stringToString("\xC3\xA9"
                             "1"),
              stringToString("\xC3\xA9"
                             "2"));
    EXPECT_NE(stringToString("\xC3\xA9"), stringToString("\xC3\xA8"));  // they share the first byte only
}

TEST(DateToText, malformedUtf8GivesItsFirstByte) {
    EXPECT_EQ("\xFF", stringToString("\xFF"
                                     "12"));        // no lead byte at all
    EXPECT_EQ("\x80", stringToString("\x80\x80"));  // a lone continuation
    EXPECT_EQ("\xE5", stringToString("\xE5\xB9"));  // cut short
    EXPECT_EQ("\xC3", stringToString("\xC3"
                                     "1"));  // continued by ASCII
    EXPECT_EQ("\xE5", stringToString("\xE5\xB9"
                                     "1"));                 // the third byte is missing
    EXPECT_EQ("\xC0", stringToString("\xC0\xAF"));          // overlong
    EXPECT_EQ("\xE0", stringToString("\xE0\x80\xAF"));      // overlong
    EXPECT_EQ("\xF0", stringToString("\xF0\x80\x80\xAF"));  // overlong
    EXPECT_EQ("\xED", stringToString("\xED\xA0\x80"));      // half of a surrogate pair
    EXPECT_EQ("\xF4", stringToString("\xF4\x90\x80\x80"));  // beyond the last code point
}

}  // namespace
