// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One name in every encoding, and headers that say what is not so.

#include <string>

#include <gtest/gtest.h>

#include <olvane/gedcom/AnselInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>
#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

std::string person(std::string_view name, std::string_view encoding) {
    return document(std::string("0 @I1@ INDI\n1 NAME ").append(name).append("\n"), encoding);
}

struct Reading {
    std::string name;
    std::string encoding;
    std::string warnedLines;
};

Reading readingOf(std::string bytes) {
    const GedcomData data = read(std::move(bytes));
    return {namesOf(data), data.encoding(), linesTold(data, DiagnosticKind::encodingMismatch)};
}

void expectReading(std::string bytes, const char* name, const char* encoding, const char* warnedLines = "") {
    const Reading reading = readingOf(std::move(bytes));
    EXPECT_EQ(reading.name, name);
    EXPECT_EQ(reading.encoding, encoding);
    EXPECT_EQ(reading.warnedLines, warnedLines);
}

TEST(Encodings, everyDeclaredEncodingGivesTheSameName) {
    expectReading(person("J\xC3\xBCrgen", "UTF-8"), "Jürgen", "UTF-8");
    expectReading(person("J\xE8urgen", "ANSEL"), "Jürgen", "ANSEL");
    expectReading(person("J\xFCrgen", "ANSI"), "Jürgen", "windows-1252");
    expectReading(person("J\xFCrgen", "WINDOWS-1252"), "Jürgen", "windows-1252");
    expectReading(person("J\xFCrgen", "cp1252"), "Jürgen", "windows-1252");
    expectReading(person("J\x81rgen", "IBMPC"), "Jürgen", "IBM437");
    expectReading(person("J\x81rgen", "MSDOS"), "Jürgen", "IBM850");
    expectReading(person("J\x9Frgen", "MACINTOSH"), "Jürgen", "macintosh");
    expectReading(person("\xA3ukasz", "CP1250"), "Łukasz", "windows-1250");
    expectReading(person("\xC8\xE2\xE0\xED", "WINDOWS-1251"), "Иван", "windows-1251");
    expectReading(person("Jane", "ASCII"), "Jane", "ASCII");
}

TEST(Encodings, utf16IsReadBothWaysWithAndWithoutMark) {
    const std::string text = person("Jane /Doe/", "UNICODE");
    expectReading(utf16(text, false, true), "Jane Doe", "UTF-16LE");
    expectReading(utf16(text, true, true), "Jane Doe", "UTF-16BE");
    expectReading(utf16(text, false, false), "Jane Doe", "UTF-16LE");
    expectReading(utf16(text, true, false), "Jane Doe", "UTF-16BE");
}

TEST(Encodings, utf16HasCharactersOfEveryLength) {
    std::string bytes = utf16("0 HEAD\n1 CHAR UTF-16\n0 @I1@ INDI\n1 NAME A", false, true);
    bytes.append("\xFC\x00\x2E\x4E\x08\xD8\x45\xDF",
                 8);  // u diaeresis, a Han character, cuneiform in two halves
    bytes.append(utf16("\n0 TRLR\n", false, false));
    expectReading(bytes, "Aü丮𒍅", "UTF-16LE");
}

TEST(Encodings, surrogatesPartedByConcComeTogether) {
    std::string bytes = utf16("0 HEAD\n1 CHAR UTF-16\n0 @I1@ INDI\n1 NAME A", false, true);
    bytes.append("\x08\xD8", 2).append(utf16("\n2 CONC ", false, false)).append("\x45\xDF", 2);
    bytes.append(utf16("\n0 TRLR\n", false, false));
    expectReading(bytes, "A𒍅", "UTF-16LE");
}

TEST(Encodings, aLoneSurrogateAndAHalfUnitAreTold) {
    std::string bytes = utf16("0 HEAD\n1 CHAR UTF-16\n0 @I1@ INDI\n1 NAME A", false, true);
    bytes.append("\x08\xD8", 2).append(utf16(" B\n0 TRLR\n", false, false)).append("x");
    const GedcomData data = read(bytes);
    EXPECT_TRUE(isUtf8(namesOf(data)));
    EXPECT_EQ(linesTold(data, DiagnosticKind::badCharacter), "0 4");
}

TEST(Encodings, aUtf8MarkGoesBeforeTheHeader) {
    expectReading(std::string("\xEF\xBB\xBF").append(person("J\xC3\xBCrgen", "ANSEL")), "Jürgen", "UTF-8",
                  "5");
    expectReading(std::string("\xEF\xBB\xBF").append(person("J\xC3\xBCrgen", "UTF-8")), "Jürgen", "UTF-8");
    expectReading(std::string("\xEF\xBB\xBF").append(document7("0 @I1@ INDI\n1 NAME J\xC3\xBCrgen\n")),
                  "Jürgen", "UTF-8");
}

TEST(Encodings, bytesThatAreUtf8AreUtf8WhateverTheHeaderSays) {
    for (const char* claimed : {"ANSEL", "ANSI", "ASCII", "IBMPC", "UNICODE", "CP1250"}) {
        expectReading(person("J\xC3\xBCrgen", claimed), "Jürgen", "UTF-8", "5");
    }
}

TEST(Encodings, bytesThatCannotBeUtf8AreACodePage) {
    expectReading(person("J\xFCrgen M\xFCller", "UTF-8"), "Jürgen Müller", "windows-1252", "5");
    expectReading(person("J\xFCrgen M\xFCller", "ASCII"), "Jürgen Müller", "windows-1252", "5");
}

TEST(Encodings, anselIsDoubtedWhereItsMarksHaveNoLetters) {
    expectReading(person("J\xFCrgen Andr\xE9 /M\xFCller/", "ANSEL"), "Jürgen André Müller", "windows-1252",
                  "5");
    expectReading(person("J\xE8urgen Andr\xE2"
                         "e /M\xE8uller/",
                         "ANSEL"),
                  "Jürgen André Müller", "ANSEL");
}

TEST(Encodings, withoutAHeaderTheBytesDecide) {
    expectReading("0 @I1@ INDI\n1 NAME J\xC3\xBCrgen\n0 TRLR\n", "Jürgen", "UTF-8");
    expectReading("0 @I1@ INDI\n1 NAME J\xFCrgen\n0 TRLR\n", "Jürgen", "windows-1252");
    expectReading("0 @I1@ INDI\n1 NAME J\xE8urgen\n0 TRLR\n", "Jürgen", "ANSEL");
    expectReading("0 @I1@ INDI\n1 NAME Jane\n0 TRLR\n", "Jane", "ASCII");
}

TEST(Encodings, anUnknownEncodingIsTold) {
    const GedcomData data = read(person("J\xFCrgen", "KLINGON"));
    EXPECT_EQ(namesOf(data), "Jürgen");
    ASSERT_EQ(told(data, DiagnosticKind::encodingUnknown).size(), 1U);
    EXPECT_EQ(told(data, DiagnosticKind::encodingUnknown)[0],
              "5: the header names an encoding that is not known (KLINGON); read as windows-1252");
}

TEST(Encodings, namesOfSystemsAreTold) {
    EXPECT_EQ(linesTold(read(person("J\xFCrgen", "ANSI")), DiagnosticKind::encodingUnknown), "5");
    EXPECT_EQ(linesTold(read(person("J\xFCrgen", "CP1252")), DiagnosticKind::encodingUnknown), "");
}

TEST(Encodings, aCharacterCutByConcIsWhole) {
    const GedcomData data = read(person("J\xC3\n2 CONC \xBCrgen", "UTF-8"));
    EXPECT_EQ(namesOf(data), "Jürgen");
    EXPECT_EQ(data.encoding(), "UTF-8");
    EXPECT_TRUE(data.diagnostics().empty());
    EXPECT_EQ(namesOf(read(person("J\xE8\n2 CONC urgen", "ANSEL"))), "Jürgen");
    EXPECT_EQ(namesOf(read(person("A\xF0\x92\r\n2 CONC \x8D\x85", "UTF-8"))), "A𒍅");
}

TEST(Encodings, aFewBadBytesDoNotUndoUtf8) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 NAME J\xC3\xBCrgen \xC3\xA9\xC3\xA8\n0 @I2@ INDI\n1 NAME Andr\xE9 X\n"
                      "0 @I3@ INDI\n1 NAME cut \xE4\xB8\n"));
    EXPECT_EQ(data.encoding(), "UTF-8");
    EXPECT_EQ(namesOf(data), "Jürgen éè|André X|cut \xEF\xBF\xBD");
    EXPECT_EQ(linesTold(data, DiagnosticKind::badCharacter), "0 9 11");
}

TEST(Encodings, utf8IsCheckedAsTheStandardHasIt) {
    for (const char* bad : {"\xC0\xAF", "\xED\xA0\x80", "\xF4\x90\x80\x80", "\x80", "\xE4\xB8", "\xFF"}) {
        EXPECT_FALSE(isUtf8(bad)) << bad;
        EXPECT_TRUE(isUtf8(lossyUtf8(bad)));
    }
    for (const char* good : {"", "plain ASCII of some length", "ü", "丮", "𒍅", "a longer text, and then ü"}) {
        EXPECT_TRUE(isUtf8(good)) << good;
        EXPECT_EQ(lossyUtf8(good), good);
    }
}

struct AnselRow {
    const char* bytes;
    const char* text;
};

TEST(Ansel, marksStandBehindTheirLettersAndAreComposed) {
    const AnselRow rows[] = {
        {"\xE0"
         "a",
         "ả"},
        {"\xE1"
         "e",
         "è"},
        {"\xE2"
         "e",
         "é"},
        {"\xE3"
         "e",
         "ê"},
        {"\xE4n", "ñ"},
        {"\xE5"
         "a",
         "ā"},
        {"\xE6g", "ğ"},
        {"\xE7z", "ż"},
        {"\xE8o", "ö"},
        {"\xE9"
         "c",
         "č"},
        {"\xEA"
         "a",
         "å"},
        {"\xEEo", "ő"},
        {"\xF0"
         "c",
         "ç"},
        {"\xF1"
         "a",
         "ą"},
        {"\xF2"
         "d",
         "ḍ"},
        {"\xF4"
         "a",
         "ḁ"},
        {"\xF7s", "ș"},
        {"\xE5\xE8u", "\xC7\x96"},
        {"\xE3\xF2"
         "a",
         "ậ"},
    };
    for (const AnselRow& row : rows) {
        std::size_t faults = 0;
        const std::string text = composed(decodeAnsel(row.bytes, faults));
        if (std::string_view(row.bytes) == "\xE5\xE8u") {
            EXPECT_EQ(text, composed("u\xCC\x84\xCC\x88")) << "marks keep their order";
        } else {
            EXPECT_EQ(text, row.text);
        }
        EXPECT_EQ(faults, 0U);
    }
}

TEST(Ansel, signsAreLettersOfTheirOwn) {
    std::size_t faults = 0;
    EXPECT_EQ(decodeAnsel("\xA1\xA2\xA3\xA4\xA5\xA6\xB1\xB2\xB3\xB4\xB5\xB6\xBA\xC3\xC5\xC6\xCF\xC7\xB9\xB8",
                          faults),
              "ŁØĐÞÆŒłøđþæœð©¿¡ßß£ı");
    EXPECT_EQ(faults, 0U);
}

TEST(Ansel, whatIsNoCharacterIsReplacedAndCounted) {
    std::size_t faults = 0;
    EXPECT_EQ(decodeAnsel("a\x80"
                          "b\xFF"
                          "c",
                          faults),
              "a\xEF\xBF\xBD"
              "b\xEF\xBF\xBD"
              "c");
    EXPECT_EQ(faults, 2U);
}

}  // namespace
}  // namespace olvane::gedcom::test
