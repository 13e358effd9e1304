// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Names: pieces from their own lines or from the slashes, in scripts of every direction.

#include <algorithm>
#include <random>
#include <string>

#include <gtest/gtest.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

PersonName nameFrom(const GedcomData& data) {
    return data.firstName(1);
}

GedcomData readName(const std::string& lines) {
    return read(document(std::string("0 @I1@ INDI\n").append(lines).append("\n")));
}

TEST(Names, slashesPartGivenNameSurnameAndSuffix) {
    const GedcomData data = readName("1 NAME given name /surname/jr.");
    EXPECT_EQ(nameFrom(data).given, "given name");
    EXPECT_EQ(nameFrom(data).surname, "surname");
    EXPECT_EQ(nameFrom(data).suffix, "jr.");
    EXPECT_EQ(displayName(nameFrom(data)), "given name surname jr.");
}

TEST(Names, aSurnameInFrontIsFollowedByTheGivenName) {
    const GedcomData data = readName("1 NAME /Kovács/ János");
    EXPECT_EQ(nameFrom(data).given, "János");
    EXPECT_EQ(nameFrom(data).surname, "Kovács");
    EXPECT_EQ(nameFrom(data).suffix, "");
    EXPECT_EQ(displayName(nameFrom(data)), "Kovács János");
}

TEST(Names, aMissingSlashEndsWithTheName) {
    const GedcomData data = readName("1 NAME John /Smith");
    EXPECT_EQ(nameFrom(data).given, "John");
    EXPECT_EQ(nameFrom(data).surname, "Smith");
}

TEST(Names, emptySlashesGiveNoSurname) {
    const GedcomData data = readName("1 NAME Albert Augustus Charles//");
    EXPECT_EQ(nameFrom(data).given, "Albert Augustus Charles");
    EXPECT_EQ(nameFrom(data).surname, "");
    EXPECT_EQ(displayName(nameFrom(data)), "Albert Augustus Charles");
}

TEST(Names, piecesOfTheRecordGoBeforeTheSlashes) {
    const GedcomData data = readName(
        "1 NAME Lt. Cmndr. Joseph \"John\" /de Allen/ jr.\n2 NPFX Lt. Cmndr.\n2 GIVN Joseph\n2 NICK John\n"
        "2 SPFX de\n2 SURN Allen\n2 NSFX junior");
    EXPECT_EQ(nameFrom(data).prefix, "Lt. Cmndr.");
    EXPECT_EQ(nameFrom(data).given, "Joseph");
    EXPECT_EQ(nameFrom(data).surname, "de Allen");
    EXPECT_EQ(nameFrom(data).suffix, "junior");
    EXPECT_EQ(nameFrom(data).nickname, "John");
    EXPECT_EQ(displayName(nameFrom(data)), "Lt. Cmndr. Joseph \"John\" de Allen jr.");
}

TEST(Names, aPrefixOfItsOwnIsNotPartOfTheGivenName) {
    const GedcomData data = readName("1 NAME Dr. Anna /Roe/\n2 NPFX Dr.");
    EXPECT_EQ(nameFrom(data).given, "Anna");
}

TEST(Names, piecesThatComeSeveralTimesAreJoined) {
    const GedcomData data =
        readName("1 NAME x\n2 GIVN Anna\n2 GIVN Maria\n2 SURN Roe\n2 SURN Doe\n2 NICK A\n2 NICK B");
    EXPECT_EQ(nameFrom(data).given, "Anna Maria");
    EXPECT_EQ(nameFrom(data).surname, "Roe Doe");
    EXPECT_EQ(nameFrom(data).nickname, "A, B");
}

TEST(Names, piecesAloneMakeTheWholeName) {
    const GedcomData data = readName("1 NAME\n2 SURN Doe\n2 GIVN Jane\n2 NPFX Dr.");
    EXPECT_EQ(displayName(nameFrom(data)), "Dr. Jane Doe");
}

TEST(Names, theFirstOfSeveralIsShownAndAllAreKept) {
    const GedcomData data = readName("1 NAME Jane /Doe/\n1 NAME Jane /Roe/\n2 TYPE MARRIED\n1 NAME Aka");
    EXPECT_EQ(namesOf(data), "Jane Doe");
    ASSERT_EQ(data.names(1).size(), 3U);
    EXPECT_EQ(data.names(1)[1].surname, "Roe");
    EXPECT_EQ(data.names(1)[2].given, "Aka");
}

TEST(Names, piecesOfADeeperNameAreNotTheirs) {
    const GedcomData data = readName("1 NAME Jane /Doe/\n2 TRAN Ivana\n3 GIVN Ivana\n1 ASSO\n2 GIVN Peter");
    EXPECT_EQ(nameFrom(data).given, "Jane");
}

TEST(Names, aPersonWithoutNameHasAnEmptyOne) {
    const GedcomData data = readName("1 SEX F");
    EXPECT_TRUE(data.names(1).empty());
    EXPECT_EQ(displayName(data.firstName(1)), "");
}

TEST(Names, rightToLeftNamesStayInTheirOrder) {
    const GedcomData data = readName("1 NAME محمد /أحمد/\n1 NAME דוד /כהן/");
    EXPECT_EQ(nameFrom(data).given, "محمد");
    EXPECT_EQ(nameFrom(data).surname, "أحمد");
    EXPECT_EQ(displayName(data.names(1)[1]), "דוד כהן");
}

TEST(Names, eastAsianNamesAreWrittenWithoutSpaceUnlessTheyHaveOne) {
    EXPECT_EQ(namesOf(readName("1 NAME /毛/泽东")), "毛泽东");
    EXPECT_EQ(namesOf(readName("1 NAME 田中 /太郎/")), "田中 太郎");
    EXPECT_EQ(namesOf(readName("1 NAME /김/철수")), "김철수");
    EXPECT_EQ(namesOf(readName("1 NAME /Mao/Zedong")), "Mao Zedong");
    EXPECT_EQ(nameFrom(readName("1 NAME /毛/泽东")).given, "泽东");
}

TEST(Names, controlCharactersAreTakenOut) {
    const GedcomData data = readName("1 NAME Ja\x01ne\t\x1B[31m /Doe/");
    EXPECT_EQ(namesOf(data), "Jane [31m Doe");
    EXPECT_EQ(linesReported(data, DiagnosticKind::controlCharacter), "7");
}

TEST(Names, markupIsTextLikeAnyOther) {
    EXPECT_EQ(namesOf(readName("1 NAME <script>alert(1)<//script> /\"&amp;\"/")),
              "<script>alert(1)< script> \"&amp;\"");
}

TEST(Names, doubledAtsAreUndoneAsTheVersionHasThem) {
    EXPECT_EQ(namesOf(readName("1 NAME @@home a@@b @ c /Doe/")), "@home a@b @ c Doe");
    EXPECT_EQ(namesOf(read(document7("0 @I1@ INDI\n1 NAME @@home a@@b @ c /Doe/\n"))), "@home a@@b @ c Doe");
}

TEST(Names, aLongNameIsCutInWholeCharacters) {
    PersonName name;
    name.written = "Jürgen /Müller/";
    EXPECT_EQ(displayName(name, 100), "Jürgen Müller");
    EXPECT_EQ(displayName(name, 15), "Jürgen Müller");
    EXPECT_EQ(displayName(name, 10), "Jürgen M");
    EXPECT_EQ(displayName(name, 9), "Jürgen M");
    EXPECT_EQ(displayName(name, 2), "J");
    EXPECT_EQ(displayName(name, 0), "");
    name.written = {};
    name.given = "Jürgen";
    name.surname = "Müller";
    EXPECT_EQ(displayName(name, 10), "Jürgen M");
    name.given = name.surname = {};
    name.nickname = "ü";
    EXPECT_EQ(displayName(name, 1), "");
    const std::string longName(1000000, 'x');
    name.written = longName;
    EXPECT_EQ(displayName(name, 10), "xxxxxxxxxx");
    EXPECT_LT(displayName(name, 10).capacity(), 100U);
}

// Byte by byte: what is written gets a space where a space stood, or a slash between letters of alphabets.
std::string plainDisplayName(const std::string& written) {
    static const std::string kUnspaced = "小";
    std::string text;
    bool space = false;
    bool slash = false;
    for (std::size_t at = 0; at < written.size(); ++at) {
        if (written[at] == ' ' || written[at] == '/') {
            (written[at] == ' ' ? space : slash) = true;
            continue;
        }
        const bool unspaced = text.ends_with(kUnspaced) && written.substr(at).starts_with(kUnspaced);
        if (!text.empty() && (space || (slash && !unspaced))) text += ' ';
        text += written[at];
        space = slash = false;
    }
    return text;
}

TEST(Names, aNameInPiecesIsTheWholeName) {
    std::mt19937 random(11);
    for (int round = 0; round < 2000; ++round) {
        std::string written;
        for (auto i = random() % 12; i > 0; --i) {
            const char* const kParts[] = {" ", "/", "a", "ü", "小", "小小", "b c"};
            written += kParts[random() % 7];
            if (random() % 100 == 0) written += std::string(100'000, 'x') + "ü";
        }
        PersonName name;
        name.written = written;
        std::string text;
        std::size_t longest = 0;
        writeDisplayName(name, [&](std::string_view piece) {
            EXPECT_FALSE(!piece.empty() && (static_cast<unsigned char>(piece.front()) & 0xC0) == 0x80);
            longest = std::max(longest, piece.size());
            text += piece;
        });
        ASSERT_EQ(text, plainDisplayName(written)) << written;
        ASSERT_EQ(displayName(name), text) << written;
        EXPECT_LT(longest, 100'000U);
    }
}

TEST(Names, piecesOfARecordAreJoinedBySpaces) {
    PersonName name;
    name.written = "/ /";
    name.given = "Ada";
    name.suffix = "jr.";
    name.nickname = "A";
    std::string text;
    writeDisplayName(name, [&text](std::string_view piece) { text += piece; });
    EXPECT_EQ(text, "Ada jr.");
}

}  // namespace
}  // namespace olvane::gedcom::test
