// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Fitting names into the width of a box.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include <olvane/picture/TextFit.h>

namespace olvane::picture {
namespace {

using testing::ElementsAre;

const Font kFont{12, true};
const std::string kEllipsis = "\xE2\x80\xA6";

TEST(TextFit, shortNameStaysOnOneLine) {
    const FittedText fitted = fitText("Anna Maria", kFont, 200, 2);
    EXPECT_THAT(fitted.lines, ElementsAre("Anna Maria"));
    EXPECT_FALSE(fitted.shortened);
}

TEST(TextFit, textAsWideAsItsRoomIsWhole) {
    const FittedText fitted = fitText("Anna", kFont, textWidth("Anna", kFont), 1);
    EXPECT_THAT(fitted.lines, ElementsAre("Anna"));
    EXPECT_FALSE(fitted.shortened);
    EXPECT_EQ(fitLine("Anna", kFont, textWidth("Anna", kFont)), "Anna");
}

TEST(TextFit, piecesOfALongWordFillTheirRoom) {
    EXPECT_THAT(fitText("mmmm", kFont, 2 * textWidth("m", kFont), 2).lines, ElementsAre("mm", "mm"));
}

TEST(TextFit, nameBreaksBetweenWords) {
    EXPECT_THAT(fitText("Anna Maria", kFont, 60, 2).lines, ElementsAre("Anna", "Maria"));
}

TEST(TextFit, doubleNameBreaksBehindItsHyphen) {
    EXPECT_THAT(fitText("Cavendish-Bentinck", kFont, 100, 2).lines, ElementsAre("Cavendish-", "Bentinck"));
}

TEST(TextFit, leadingHyphenStaysWithItsWord) {
    EXPECT_THAT(fitText("-x", kFont, 100, 1).lines, ElementsAre("-x"));
}

TEST(TextFit, tooManyWordsEndInAnEllipsis) {
    const FittedText fitted = fitText("Anna Maria Louisa Josepha", kFont, 60, 2);
    EXPECT_THAT(fitted.lines, ElementsAre("Anna", "Maria" + kEllipsis));
    EXPECT_TRUE(fitted.shortened);
}

TEST(TextFit, longWordIsBrokenAndSaysSo) {
    const FittedText fitted = fitText("Wolfeschlegelsteinhausen", kFont, 60, 5);
    EXPECT_TRUE(fitted.wordBroken);
    std::string joined;
    for (const std::string& line : fitted.lines) joined += line;
    EXPECT_EQ(joined, "Wolfeschlegelsteinhausen");
}

TEST(TextFit, noTextGivesNoLines) {
    EXPECT_TRUE(fitText("", kFont, 60, 2).lines.empty());
    EXPECT_TRUE(fitText("   ", kFont, 60, 2).lines.empty());
}

TEST(TextFit, noLinesAllowedLeavesNothing) {
    EXPECT_TRUE(fitText("Anna", kFont, 60, 0).lines.empty());
}

TEST(TextFit, lettersAreNeverTornFromTheirMarks) {
    std::string name;
    for (int i = 0; i < 40; ++i) name += "e\xCC\x81";
    for (const std::string& line : fitText(name, kFont, 50, 3).lines) {
        const std::string letters = line.ends_with(kEllipsis) ? line.substr(0, line.size() - 3) : line;
        ASSERT_EQ(letters.size() % 3, 0u) << line;
        EXPECT_TRUE(letters.starts_with('e'));
    }
}

TEST(TextFit, everyLineFitsWhateverTheName) {
    const std::vector<std::string> names = {
        "Augusta Marie Luise Katharina",  "Schleswig-Holstein-Sonderburg-Glücksburg",
        "毛泽东毛泽东毛泽东毛泽东毛泽东", "محمد بن عبد الله بن عبد المطلب",
        "MMMMMMMMMMMMMMMMMMMMMMMMMMMMMM", "a b c d e f g h i j k l m n o p q r s t"};
    for (const std::string& name : names) {
        for (double width = 20; width < 200; width += 7) {
            for (const std::string& line : fitText(name, kFont, width, 3).lines) {
                EXPECT_LE(textWidth(line, kFont), width) << line;
            }
            EXPECT_LE(textWidth(fitLine(name, kFont, width), kFont), width);
        }
    }
}

TEST(TextFit, lineTooNarrowForAnEllipsisIsEmpty) {
    EXPECT_EQ(fitLine("Anna", kFont, 5), "");
}

TEST(TextFit, linesEndWhereUax14AllowsThem) {
    EXPECT_THAT(fitText("Berg/Tal 12,500 Kronen", kFont, 50, 9).lines,
                ElementsAre("Berg/", "Tal", "12,500", "Kronen"));
    EXPECT_THAT(fitText("no\u00A0break", kFont, 45, 1).lines.size(), 1u);
    EXPECT_TRUE(fitText("no\u00A0break", kFont, 45, 2).wordBroken);
}

TEST(TextFit, closingBracketStaysWithItsWord) {
    EXPECT_THAT(fitText("毛泽东(毛泽东)", kFont, 42, 9).lines, ElementsAre("毛泽东", "(毛泽", "东)"));
}

TEST(TextFit, thaiBreaksBetweenGraphemeClusters) {
    // Consonants with a vowel or a tone above, which stay on their consonants.
    const std::string syllable = "\u0E19\u0E35\u0E49";
    std::string name;
    for (int i = 0; i < 12; ++i) name += syllable;
    const FittedText fitted = fitText(name, kFont, 40, 9);
    ASSERT_GT(fitted.lines.size(), 2u);
    for (const std::string& line : fitted.lines) EXPECT_EQ(line.size() % syllable.size(), 0u) << line;
    EXPECT_THAT(fitText(syllable + syllable, kFont, 40, 9).lines, ElementsAre(syllable + syllable));
}

TEST(TextFit, spacesCountOnce) {
    EXPECT_THAT(fitText("  Anna   Maria ", kFont, 200, 2).lines, ElementsAre("Anna Maria"));
}

TEST(TextFit, oneLineKeepsItsSpaces) {
    EXPECT_EQ(fitLine("* 1850  \u2020 1900", kFont, 200), "* 1850  \u2020 1900");
}

TEST(TextFit, veryLongTextIsReadNoFurtherThanItsLines) {
    const FittedText fitted = fitText(std::string(200000, 'a') + "\u0301", kFont, 60, 3);
    EXPECT_EQ(fitted.lines.size(), 3u);
    EXPECT_TRUE(fitted.shortened);
}

TEST(NameFit, namesStandOnLinesOfTheirOwn) {
    const FittedName name = fitName("Anna Maria", "Berg", false, {200, 50});
    EXPECT_THAT(name.lines, ElementsAre("Anna Maria", "Berg"));
    EXPECT_EQ(name.size, 13);
}

TEST(NameFit, surnameStandsFirstWhereItIsReadFirst) {
    EXPECT_THAT(fitName("Anna", "Berg", true, {200, 50}).lines, ElementsAre("Berg", "Anna"));
}

TEST(NameFit, nameStandsOnOneLineWhereThereIsRoomForOne) {
    EXPECT_THAT(fitName("Anna", "Berg", false, {200, 16}).lines, ElementsAre("Anna Berg"));
}

TEST(NameFit, lettersGetSmallerBeforeNamesGetShorter) {
    const FittedName name = fitName("Anna", "Wilhelmsdottir", false, {100, 50});
    EXPECT_THAT(name.lines, ElementsAre("Anna", "Wilhelmsdottir"));
    EXPECT_LT(name.size, 13);
}

TEST(NameFit, furtherGivenNamesBecomeInitialsBeforeAnythingIsCut) {
    const FittedName name = fitName("Maximilian Ferdinand von Karl", "Berg", false, {90, 32});
    EXPECT_THAT(name.lines, ElementsAre("Maximilian F.", "von K. Berg"));
}

TEST(NameFit, scriptsWithoutCapitalsHaveNoInitials) {
    for (const std::string& line : fitName("محمد بن عبد الله", "عبد المطلب", false, {40, 26}).lines) {
        EXPECT_EQ(line.find('.'), std::string::npos) << line;
    }
}

TEST(NameFit, whatIsTooLongIsCutInTheSmallestSize) {
    const FittedName name = fitName(std::string(60, 'm'), std::string(60, 'w'), false, {90, 26});
    ASSERT_EQ(name.lines.size(), 2u);
    EXPECT_EQ(name.size, 10);
    for (const std::string& line : name.lines) EXPECT_TRUE(line.ends_with(kEllipsis)) << line;
}

TEST(NameFit, everyLineFitsAndNoneIsTooMany) {
    const std::vector<std::string> names = {"",
                                            "Augusta Marie Luise",
                                            "毛泽东毛泽东毛泽东",
                                            "สมชายสมชายสมชายสมชาย",
                                            "MMMMMMMMMMMMMMMMMMMMMMM",
                                            "a b c d e f g"};
    for (const std::string& given : names) {
        for (const std::string& surname : names) {
            for (double width = 30; width < 180; width += 13) {
                const NameRoom room{width, 40, 2, 3};
                const FittedName name = fitName(given, surname, width > 90, room);
                EXPECT_LE(static_cast<double>(name.lines.size()) * (name.size + room.gap), room.height);
                EXPECT_LE(name.lines.size(), room.mostLines);
                for (const std::string& line : name.lines)
                    EXPECT_LE(textWidth(line, {name.size, true}), width);
            }
        }
    }
}

}  // namespace
}  // namespace olvane::picture
