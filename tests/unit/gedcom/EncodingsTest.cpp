// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One name in every encoding, and headers that say what is not so.

#include <string>
#include <utility>

#include <gtest/gtest.h>

#include <olvane/gedcom/AnselInternal.h>
#include <olvane/gedcom/GedcomEncodings.h>
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
    return {namesOf(data), data.encoding(), linesReported(data, DiagnosticKind::encodingMismatch)};
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

TEST(Encodings, aLoneSurrogateIsOneReplacementCharacter) {
    std::string bytes = utf16("0 HEAD\n1 CHAR UTF-16\n0 @I1@ INDI\n1 NAME A", false, true);
    bytes.append("\x08\xD8", 2)
        .append(utf16(" B\n0 @I2@ INDI\n1 NAME C", false, false))
        .append("\x45\xDF", 2);
    bytes.append(utf16("\n0 TRLR\n", false, false));
    expectReading(bytes, "A\xEF\xBF\xBD B|C\xEF\xBF\xBD", "UTF-16LE");
    expectReading(person("J\xC3\xBC\xC3\xBC\xC3\xBC \xED\xA0\x88 B", "UTF-8"), "Jüüü \xEF\xBF\xBD B",
                  "UTF-8");
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

TEST(Encodings, aLoneSurrogateAndAHalfUnitAreReported) {
    std::string bytes = utf16("0 HEAD\n1 CHAR UTF-16\n0 @I1@ INDI\n1 NAME A", false, true);
    bytes.append("\x08\xD8", 2).append(utf16(" B\n0 TRLR\n", false, false)).append("x");
    const GedcomData data = read(bytes);
    EXPECT_TRUE(isUtf8(namesOf(data)));
    EXPECT_EQ(linesReported(data, DiagnosticKind::badCharacter), "0 4");
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

TEST(Encodings, anselMarksThatDoNotComposeAreKept) {
    // Romanised Russian with its ligatures; a table of all letters with a mark each; marks of rare sorts.
    expectReading(person("\xEBI\xECUri\xE6i /\xEBT\xECSoi/", "ANSEL"),
                  "I\uFE20U\uFE21ri\u012D T\uFE20S\uFE21oi", "ANSEL");
    expectReading(person("\xE1"
                         "a\xE1"
                         "b\xE1"
                         "c\xE1"
                         "d\xFC"
                         "a\xFC"
                         "b\xFE"
                         "a\xFE"
                         "b",
                         "ANSEL"),
                  "\u00E0b\u0300c\u0300d\u0300a\u0338b\u0338a\u0313b\u0313", "ANSEL");
    expectReading(person("\xF4r \xEF"
                         "m \xFA"
                         "n\xFBg",
                         "ANSEL"),
                  "r\u0325 m\u0310 n\uFE22g\uFE23", "ANSEL");
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

TEST(Encodings, anUnknownEncodingIsReported) {
    const GedcomData data = read(person("J\xFCrgen", "KLINGON"));
    EXPECT_EQ(namesOf(data), "Jürgen");
    ASSERT_EQ(reported(data, DiagnosticKind::encodingUnknown).size(), 1U);
    EXPECT_EQ(reported(data, DiagnosticKind::encodingUnknown)[0],
              "5: the header names an encoding that is not known (KLINGON); read as windows-1252; if letters "
              "are wrong, "
              "choose an encoding, such as windows-1250, windows-1251, IBM850 or macintosh");
    EXPECT_EQ(data.diagnostics()[0].severity, Severity::error);
}

TEST(Encodings, namesOfSystemsAreShown) {
    EXPECT_EQ(linesReported(read(person("J\xFCrgen", "ANSI")), DiagnosticKind::encodingUnknown), "5");
    EXPECT_EQ(linesReported(read(person("J\xFCrgen", "CP1252")), DiagnosticKind::encodingUnknown), "");
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
    EXPECT_EQ(linesReported(data, DiagnosticKind::badCharacter), "0 9 11");
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

GedcomData readAs(std::string bytes, std::string encoding) {
    ReadOptions options;
    options.encoding = std::move(encoding);
    return readGedcomBytes(std::move(bytes), "test.ged", options);
}

// A name in an encoding, as the header names it.
struct NamedBytes {
    const char* label;
    const char* bytes;
    const char* text;
};

// Of each, one name whose bytes were written down from the published table.
TEST(Encodings, platformEncodingsAreReadByTheirNames) {
    const NamedBytes rows[] = {
        {"ISO-8859-2",
         "Stanis\xB3"
         "aw",
         "Stanisław"},
        {"iso8859-3",
         "\xA1"
         "al",
         "Ħal"},
        {"ISO-8859-4", "\xA9iauliai", "Šiauliai"},
        {"ISO-8859-5", "\xB8\xD2\xD0\xDD", "Иван"},
        {"ISO-8859-6", "\xC7\xC8", "اب"},
        {"ISO-8859-7", "\xC1\xED\xED\xE1", "Αννα"},
        {"ISO-8859-8", "\xE0\xE1", "אב"},
        {"ISO-8859-9",
         "Ay\xFE"
         "e",
         "Ayşe"},
        {"ISO-8859-10",
         "\xAF"
         "ar",
         "Ŋar"},
        {"ISO-8859-11", "\xA1\xD2", "กา"},
        {"ISO-8859-13", "J\xFBrat\xEB", "Jūratė"},
        {"ISO-8859-14",
         "\xA1"
         "an",
         "Ḃan"},
        {"ISO-8859-15",
         "\xBC"
         "uf",
         "Œuf"},
        {"ISO-8859-16",
         "\xAA"
         "tefan",
         "Ștefan"},
        {"WINDOWS-1253", "\xC1\xED\xED\xE1", "Αννα"},
        {"cp1254",
         "Ay\xFE"
         "e",
         "Ayşe"},
        {"windows-1255", "\xE0\xE1", "אב"},
        {"windows-1256", "\xC7\xC8", "اب"},
        {"windows-1257", "J\xFBrat\xEB", "Jūratė"},
        {"windows-1258", "Nguy\xEA\xDEn", "Nguyễn"},
        {"KOI8-R", "\xE9\xD7\xC1\xCE", "Иван"},
        {"KOI8-U", "\xE6\xC5\xC4\xA6\xD2", "Федір"},
        {"GBK", "\xCD\xF5\xD0\xA1\xC3\xF7", "王小明"},
        {"GB18030", "\xCD\xF5\x81\x30\x84\x36", "王¥"},
        {"GB2312", "\xCD\xF5\xD0\xA1\xC3\xF7", "王小明"},
        {"BIG5", "\xA4\xFD\xA4\x70\xA9\xFA", "王小明"},
        {"Shift_JIS", "\x8E\x52\x93\x63 \xB1", "山田 ｱ"},
        {"EUC-JP", "\xBB\xB3\xC5\xC4", "山田"},
        {"EUC-KR", "\xB1\xE8", "김"},
        {"TIS-620", "\xA1\xD2", "กา"},
        {"IBM852",
         "Stanis\x88"
         "aw",
         "Stanisław"},
        {"cp866", "\x88\xA2\xA0\xAD", "Иван"},
        {"IBM737", "\x80\xA4\xA4\x98", "Αννα"},
    };
    for (const NamedBytes& row : rows) {
        const GedcomData data = read(person(row.bytes, row.label));
        EXPECT_EQ(namesOf(data), row.text) << row.label;
        EXPECT_TRUE(data.diagnostics().empty())
            << row.label << ": " << formatDiagnostic(data.diagnostics()[0]);
    }
}

TEST(Encodings, everyNameThatIsOfferedCanBeRead) {
    EXPECT_GE(encodingNames().size(), 45U);
    for (const std::string_view name : encodingNames()) {
        EXPECT_EQ(encodingLabelled(name), name);
        if (name.starts_with("UTF-16")) continue;
        EXPECT_EQ(namesOf(readAs(person("Jane", "ASCII"), std::string(name))), "Jane") << name;
    }
}

TEST(Encodings, labelsAreKnownHoweverTheyAreSpelt) {
    EXPECT_EQ(encodingLabelled("cp1252"), "windows-1252");
    EXPECT_EQ(encodingLabelled("Windows 1251"), "windows-1251");
    EXPECT_EQ(encodingLabelled("ANSI_1250"), "windows-1250");
    EXPECT_EQ(encodingLabelled("latin-2"), "ISO-8859-2");
    EXPECT_EQ(encodingLabelled("iso_8859-1"), "windows-1252");
    EXPECT_EQ(encodingLabelled("sjis"), "Shift_JIS");
    EXPECT_EQ(encodingLabelled("cp850"), "IBM850");
    EXPECT_EQ(encodingLabelled("koi8r"), "KOI8-R");
    EXPECT_EQ(encodingLabelled("KLINGON"), "");
    EXPECT_EQ(encodingLabelled("cp999"), "");
    EXPECT_EQ(encodingLabelled(""), "");
    EXPECT_EQ(encodingLabelled("--"), "");
}

TEST(Encodings, aChosenEncodingGoesBeforeTheHeader) {
    const GedcomData data = readAs(person("\xC8\xE2\xE0\xED", "ANSI"), "windows-1251");
    EXPECT_EQ(namesOf(data), "Иван");
    EXPECT_EQ(data.encoding(), "windows-1251");
    EXPECT_TRUE(data.diagnostics().empty());
    EXPECT_EQ(namesOf(readAs(person("J\xC3\xBC", "UTF-8"), "cp1252")), "JÃ¼");
    EXPECT_EQ(namesOf(readAs(person("J\xE8u", "ANSI"), "ansel")), "Jü");
    EXPECT_EQ(namesOf(readAs(utf16(person("Jane", "ASCII"), true, false), "UTF-16")), "Jane");
}

TEST(Encodings, aMarkGoesBeforeTheChoiceAndIsReported) {
    const GedcomData data = readAs("\xEF\xBB\xBF" + person("J\xC3\xBC", "UTF-8"), "windows-1252");
    EXPECT_EQ(namesOf(data), "Jü");
    EXPECT_EQ(linesReported(data, DiagnosticKind::encodingMismatch), "0");
}

TEST(Encodings, anUnknownChoiceIsRefused) {
    try {
        readAs(person("Jane", "ASCII"), "KLINGON");
        FAIL() << "KLINGON is read";
    } catch (const GedcomError& error) {
        EXPECT_NE(error.text().find("KLINGON"), std::string::npos);
        EXPECT_NE(error.text().find("windows-1252"), std::string::npos);
    }
}

std::string mismatchOf(std::string_view names, std::string_view encoding) {
    std::string records;
    for (int i = 0; i < 3; ++i) records.append("0 INDI\n1 NAME ").append(names).append("\n");
    const GedcomData data = read(document(records, encoding));
    for (const Diagnostic& diagnostic : data.diagnostics()) {
        if (diagnostic.severity == Severity::error) return doneText(diagnostic);
    }
    return {};
}

TEST(Encodings, textThatAnsiDoesNotExplainIsAnErrorWithASuggestion) {
    const std::string hint = "read as windows-1252; it looks like ";
    EXPECT_EQ(mismatchOf("\xC8\xE2\xE0\xED /\xCF\xE5\xF2\xF0\xEE\xE2/", "ANSI"),
              hint + "windows-1251: choose that encoding");
    EXPECT_EQ(mismatchOf("\xE9\xD7\xC1\xCE /\xF0\xC5\xD4\xD2\xCF\xD7/", "ANSI"),
              hint + "KOI8-R: choose that encoding");
    EXPECT_EQ(mismatchOf("\x88\xA2\xA0\xAD /\x8F\xA5\xE2\xE0\xAE\xA2/", "ANSI"),
              hint + "IBM866: choose that encoding");
    EXPECT_EQ(mismatchOf("\xC3\xE9\xFE\xF1\xE3\xEF\xF2 /\xCD\xDF\xEA\xEF\xF2/", "ANSI"),
              hint + "windows-1253: choose that encoding");
    EXPECT_EQ(mismatchOf("\xE0\xE1\xF8\xE4\xED /\xEB\xE4\xEF\xE0/", "ANSI"),
              hint + "windows-1255: choose that encoding");
    EXPECT_EQ(mismatchOf("Stanis\xB3"
                         "aw /W\xB9sik/",
                         "ANSI"),
              hint + "windows-1250: choose that encoding");
    EXPECT_EQ(mismatchOf("Ji\xF8\xED /N\xECmec/", "ANSI"), hint + "windows-1250: choose that encoding");
    // "Μαρία /Νικολάου/": accented vowels within words.
    EXPECT_EQ(mismatchOf("\xCC\xE1\xF1\xDF\xE1 /\xCD\xE9\xEA\xEF\xEB\xDC\xEF\xF5/", "ANSI"),
              hint + "windows-1253: choose that encoding");
    // "Győző /Fűzfa/", "Ivić /Perić/", "Muşat /Duşa/"
    for (const char* names : {"Gy\xF5z\xF5 /F\xFBzfa/", "Ivi\xE6 /Peri\xE6/",
                              "Mu\xBA"
                              "at /Du\xBA"
                              "a/"}) {
        EXPECT_EQ(mismatchOf(names, "ANSI"), hint + "windows-1250: choose that encoding") << names;
    }
}

// "ИВАНОВ /ПЁТР/" in capitals, of which nobody can say whether it is not KOI8-R; "王小 /李明/" in GBK.
TEST(Encodings, textThatNoGuessIsMadeOfIsAnErrorAllTheSame) {
    const std::string hint = "read as windows-1252; choose an encoding, such as windows-1251,";
    for (const char* names :
         {"\xC8\xC2\xC0\xCD\xCE\xC2 /\xCF\xC5\xD2\xD0/", "\xCD\xF5\xD0\xA1 /\xC0\xEE\xC3\xF7/"}) {
        EXPECT_EQ(mismatchOf(names, "ANSI").substr(0, hint.size()), hint) << names;
    }
}

TEST(Encodings, utf8WithAFewBadBytesIsUtf8WhateverTheHeaderSays) {
    const std::string name = "J\xC3\xBC\xC3\xBC\xC3\xBC\xC3\xBC\xC3\xBC\xC3\xBC\xC3\xBC\xC3\xBC\xC3\xBC";
    expectReading(person(name + " \xFC B", "ANSI"), "Jüüüüüüüüü ü B", "UTF-8", "5");
    expectReading(person("J\xC3\xBC \xFC B", "ANSI"), "JÃ¼ ü B", "windows-1252");
}

TEST(Encodings, halfASurrogatePairAloneIsUtf8) {
    expectReading(person("A\xED\xA0\x88 B", "UTF-8"), "A\xEF\xBF\xBD B", "UTF-8");
}

TEST(Encodings, westernTextUnderAnsiIsNoError) {
    for (const char* names : {"J\xFCrgen /M\xFCller-L\xFC"
                              "denscheid/",
                              "Andr\xE9 /Lef\xE8vre/", "S\xF8ren /\xC5s/",
                              "Jo\xE3o /Gon\xE7"
                              "alves/",
                              "\xDE\xF3r\xF0ur",
                              "\xA3"
                              "50 \xBFqu\xE9?",
                              "Niccol\xF2 \xC8", "2\xBD 3\xB0 \xB9"}) {
        EXPECT_EQ(mismatchOf(names, "ANSI"), "") << names;
    }
}

TEST(Encodings, textThatIsNotAnselIsAnError) {
    EXPECT_EQ(
        mismatchOf("J\xFCrgen Andr\xE9 /M\xFCller/", "ANSEL"),
        "read as windows-1252; if letters are wrong, choose an encoding, such as windows-1250, windows-1251, "
        "IBM850 or macintosh");
    EXPECT_EQ(mismatchOf("\xC8\xE2\xE0\xED /\xCF\xE5\xF2\xF0\xEE\xE2/", "ANSEL"),
              "read as windows-1252; it looks like windows-1251: choose that encoding");
    EXPECT_EQ(mismatchOf("J\xE8urgen", "ANSEL"), "");
}

TEST(Encodings, textOfNoNamedEncodingIsAGuess) {
    const GedcomData data = read("0 HEAD\n0 @I1@ INDI\n1 NAME J\xFCrgen\n0 TRLR\n");
    EXPECT_EQ(linesReported(data, DiagnosticKind::encodingUnknown), "0");
    EXPECT_EQ(data.diagnostics()[0].severity, Severity::warning);
}

TEST(Encodings, aCharacterOfTwoBytesCutByConcIsWhole) {
    EXPECT_EQ(namesOf(read(person("\xCD\xF5\xD0\n2 CONC \xA1\xC3\xF7", "GBK"))), "王小明");
    EXPECT_EQ(namesOf(read(person("\xCD\xF5\x81\x30\r\n2 CONC \x84\x36", "GB18030"))), "王¥");
    EXPECT_EQ(namesOf(read(person("\xBB\xB3\xC5\n1 SEX M", "EUC-JP"))), "山\uFFFD");
}

TEST(Encodings, bytesThatANamedEncodingLacksAreReported) {
    const GedcomData page = read(person("A\x81 B\xFC", "windows-1253"));
    EXPECT_EQ(namesOf(page), "A\uFFFD Bό");
    EXPECT_EQ(linesReported(page, DiagnosticKind::badCharacter), "7");
    const GedcomData multi = read(person("\xA4\xFD\xFF\xFF", "BIG5"));
    EXPECT_EQ(linesReported(multi, DiagnosticKind::badCharacter), "0");
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
