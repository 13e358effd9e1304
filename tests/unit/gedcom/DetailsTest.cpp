// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a file knows beyond names and facts: notes, sources, media, addresses, ages and links; and that of the hidden
// nothing of it is written.

#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomDetails.h>
#include <olvane/gedcom/GedcomMedia.h>
#include <olvane/gedcom/GedcomWriter.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

GedcomData readDetails(const std::string& bytes) {
    ReadOptions options;
    options.details = true;
    return readGedcomBytes(bytes, "test.ged", options);
}

std::string joined(const std::vector<std::string_view>& texts) {
    std::string all;
    for (const std::string_view text : texts) all.append(all.empty() ? "" : "|").append(text);
    return all;
}

TEST(Details, notesKeepTheirLinesAndMayBeShared) {
    const GedcomData data =
        readDetails(document("0 @I1@ INDI\n1 NOTE first line\n2 CONT   second\n2 CONC  line\n2 CONT\n2 CONT "
                             "last\n1 NOTE @N1@\n1 NOTE @N9@\n"
                             "1 BIRT\n2 NOTE of the birth\n0 @N1@ NOTE shared,\n1 CONT of two lines\n"));
    EXPECT_EQ(joined(personDetails(data, 1).notes),
              "first line\n  second line\n\nlast|shared,\nof two lines");
    EXPECT_EQ(joined(factDetails(data, data.factsOfPerson(1)[0]).notes), "of the birth");
}

TEST(Details, sourcesHavePageAndQuality) {
    const GedcomData data =
        readDetails(document("0 @I1@ INDI\n1 SOUR @S1@\n1 BIRT\n2 SOUR @S1@\n3 PAGE 12\n3 QUAY 2\n3 DATA\n4 "
                             "TEXT born here\n2 SOUR a letter\n"
                             "1 DEAT\n2 SOUR @S2@\n3 QUAY 9\n2 SOUR @S9@\n0 @S1@ SOUR\n1 TITL Parish book\n2 "
                             "CONC  of Berg\n1 AUTH Priest\n1 PUBL Berg 1801\n"
                             "0 @S2@ SOUR\n1 ABBR Book\n"));
    const Details own = personDetails(data, 1);
    ASSERT_EQ(own.citations.size(), 1U);
    EXPECT_EQ(own.citations[0].title, "Parish book of Berg");
    EXPECT_EQ(own.citations[0].page, "") << "the page of the birth's source is not the person's";
    const Details birth = factDetails(data, data.factsOfPerson(1)[0]);
    ASSERT_EQ(birth.citations.size(), 2U);
    EXPECT_EQ(birth.citations[0].page, "12");
    EXPECT_EQ(birth.citations[0].quality, 2);
    EXPECT_EQ(birth.citations[0].text, "born here");
    EXPECT_EQ(birth.citations[0].author, "Priest");
    EXPECT_EQ(birth.citations[0].publication, "Berg 1801");
    EXPECT_EQ(birth.citations[0].line, 9U);
    EXPECT_EQ(birth.citations[1].title, "a letter");
    const Details death = factDetails(data, data.factsOfPerson(1)[1]);
    ASSERT_EQ(death.citations.size(), 1U);
    EXPECT_EQ(death.citations[0].title, "Book");
    EXPECT_FALSE(death.citations[0].quality.has_value());
}

TEST(Details, eventsHaveTypeAddressCauseAndAges) {
    const GedcomData data = readDetails(
        document("0 @I1@ INDI\n1 RESI\n2 ADDR Hill 1\n3 CONT Berg\n3 CITY Berg\n2 AGNC Town hall\n1 DEAT\n2 "
                 "CAUS fever\n2 AGE 70y\n2 TYPE sudden\n"
                 "1 OCCU Smith\n2 TYPE trade\n1 EMIG\n2 ADDR\n3 ADR1 Pier 2\n3 CITY Bremen\n3 CTRY Germany\n"
                 "0 @F1@ FAM\n1 MARR\n2 HUSB\n3 AGE 30\n2 WIFE\n3 AGE 25\n1 NOTE of both\n"));
    const auto facts = data.factsOfPerson(1);
    ASSERT_EQ(facts.size(), 4U);
    EXPECT_EQ(factDetails(data, facts[0]).address, "Hill 1\nBerg");
    EXPECT_EQ(factDetails(data, facts[0]).agency, "Town hall");
    EXPECT_EQ(factDetails(data, facts[1]).cause, "fever");
    EXPECT_EQ(factDetails(data, facts[1]).age, "70y");
    EXPECT_EQ(facts[1].value, "sudden");
    EXPECT_EQ(facts[2].value, "Smith");
    EXPECT_EQ(factDetails(data, facts[2]).type, "trade");
    EXPECT_EQ(factDetails(data, facts[3]).address, "Pier 2\nBremen\nGermany");
    const Details marriage = factDetails(data, data.factsOfFamily(1)[0]);
    EXPECT_EQ(marriage.husbandAge, "30");
    EXPECT_EQ(marriage.wifeAge, "25");
    EXPECT_EQ(joined(familyDetails(data, 1).notes), "of both");
}

TEST(Details, namesHaveTypesAndFurtherNames) {
    const GedcomData data = readDetails(document(
        "0 @I1@ INDI\n1 NAME Anna /Berg/\n2 TYPE birth\n2 _MARNM Tal\n2 _AKA Anni /B./\n2 NOTE a name\n"
        "1 NAME Anna /Hof/\n2 TYPE married\n1 ALIA Annchen\n1 ALIA @I1@\n0 @I2@ INDI\n1 _MARNM Eva /Tal/\n"));
    std::string names;
    for (const PersonName& name : data.names(1))
        names.append(displayName(name)).append("=").append(name.type).append("|");
    EXPECT_EQ(names, "Anna Berg=birth|Anna Tal=married|Anni B.=aka|Anna Hof=married|Annchen=aka|");
    EXPECT_EQ(data.names(1)[1].given, "Anna");
    EXPECT_EQ(data.names(1)[1].surname, "Tal");
    EXPECT_EQ(joined(nameDetails(data, data.names(1)[0]).notes), "a name");
    EXPECT_TRUE(nameDetails(data, data.names(1)[1]).isEmpty());
    EXPECT_EQ(displayName(data.firstName(2)), "Eva Tal");
}

TEST(Details, mediaAreFilesWithTitlesAndFormats) {
    const GedcomData data =
        readDetails(document("0 @I1@ INDI\n1 OBJE @M1@\n1 OBJE\n2 FILE anna.png\n3 FORM png\n2 TITL Anna\n1 "
                             "OBJE\n2 FORM jpeg\n2 FILE old.jpg\n1 OBJE @M9@\n"
                             "1 SOUR a book\n2 OBJE\n3 FILE page.pdf\n0 @M1@ OBJE\n1 FILE one.jpg\n2 FORM "
                             "jpeg\n2 TITL First\n1 FILE two.jpg\n1 TITL Both\n"));
    const Details details = personDetails(data, 1);
    std::string media;
    for (const MediaFile& file : details.media) {
        media.append(file.title).append(":").append(file.file).append(":").append(file.format).append("|");
    }
    EXPECT_EQ(media, "First:one.jpg:jpeg|Both:two.jpg:|Anna:anna.png:png|:old.jpg:jpeg|:page.pdf:|");
}

TEST(Details, linksAreThoseOfTheFile) {
    const GedcomData data =
        readDetails(document("0 @I1@ INDI\n1 WWW http://a.example/x?y=1\n1 _WEBTAG\n2 NAME Page\n2 URL "
                             "https://b.example\n1 _URL javascript:alert(1)\n"));
    EXPECT_EQ(joined(personDetails(data, 1).links),
              "http://a.example/x?y=1|https://b.example|javascript:alert(1)");
    EXPECT_TRUE(isWebAddress("HTTPS://a.example"));
    for (const char* address : {"javascript:alert(1)", "http://", "file:///etc/passwd", "data:text/html,x",
                                "", " http://a.example"}) {
        EXPECT_FALSE(isWebAddress(address)) << address;
    }
}

TEST(Details, noPathLeavesAnArchive) {
    EXPECT_EQ(memberOfArchive("media/a%20b.jpg"), "media/a b.jpg");
    EXPECT_EQ(memberOfArchive("100%.jpg"), "100%.jpg");
    for (const char* file :
         {"../a.jpg", "media/../../a.jpg", "media/%2E%2E/a.jpg", "/etc/passwd", "file:///etc/passwd",
          "http://a.example/a.jpg", "C:\\a.jpg", "media\\a.jpg", "", "media//a.jpg", "./a.jpg", "a%00.jpg"}) {
        EXPECT_FALSE(memberOfArchive(file).has_value()) << file;
    }
}

#ifdef OLVANE_GEDCOM_ZIP
TEST(Details, mediaComeOutOfAnArchiveUpToALimit) {
    const std::string archive = bytesOfFile(GEDCOM_TEST_DATA "/small.gdz");
    EXPECT_EQ(readFromArchive(archive, "small.gdz", "media/a.txt", 1).value_or("").size(), 1U);
    EXPECT_FALSE(readFromArchive(archive, "small.gdz", "media/a.txt", 0).has_value());
    EXPECT_FALSE(readFromArchive(archive, "small.gdz", "media/b.txt", 100).has_value());
    EXPECT_FALSE(readFromArchive(archive, "small.gdz", "../media/a.txt", 100).has_value());
    EXPECT_THROW(readFromArchive("PK\x03\x04", "bad.gdz", "a", 100), GedcomError);
    const std::string swelling = bytesOfFile(GEDCOM_TEST_DATA "/swelling.gdz");
    EXPECT_FALSE(readFromArchive(swelling, "swelling.gdz", "gedcom.ged", 1000).has_value());
}
#endif

TEST(Details, nothingIsKeptUnlessAskedFor) {
    const std::string text = document("0 @I1@ INDI\n1 NOTE a\n1 OCCU b\n2 NOTE c\n0 @N1@ NOTE d\n");
    const GedcomData plain = read(text);
    EXPECT_TRUE(personDetails(plain, 1).isEmpty());
    EXPECT_TRUE(plain.sharedRecords().empty());
    EXPECT_TRUE(plain.factsOfPerson(1).empty());
    EXPECT_THROW(personDetails(plain, 2), std::out_of_range);
    EXPECT_THROW(factDetails(plain, Fact()), std::out_of_range);
}

TEST(Details, whatIsNobodysBusinessIsLeftOut) {
    const GedcomData data =
        readDetails(document("0 @I1@ INDI\n1 SSN 123\n1 CHAN\n2 DATE 1 JAN 2000\n2 NOTE changed\n1 _UID "
                             "77\n1 FAMC @F1@\n2 NOTE link\n1 RIN 5\n"));
    EXPECT_TRUE(data.detailsOfPerson(1).empty());
}

const char* const kTwoPersons =
    "0 @I1@ INDI\n1 NAME Anna /Berg/\n1 NOTE @N1@\n1 NOTE @N2@\n1 SOUR @S1@\n2 PAGE 9\n1 OBJE @M1@\n1 _URL "
    "http://anna.example\n"
    "1 BIRT\n2 CAUS secret\n2 PLAC Hidden Town\n"
    "0 @I2@ INDI\n1 NAME Otto /Tal/\n1 NOTE @N2@\n1 NOTE Father of Anna Berg\n1 NOTE plain @ text\n1 SOUR "
    "@S1@\n1 OBJE\n2 FILE anna.jpg\n"
    "1 DEAT\n2 CAUS fever\n2 SOUR @S2@\n3 PAGE 3\n3 NOTE Grab von Anna\n"
    "0 @N1@ NOTE only hers\n0 @N2@ NOTE for both\n1 SOUR @S3@\n0 @S1@ SOUR\n1 TITL Anna's diary\n1 AUTH "
    "Somebody\n"
    "0 @S2@ SOUR\n1 TITL Book\n1 REPO @R1@\n0 @S3@ SOUR\n1 TITL Third\n0 @R1@ REPO\n1 NAME Archive\n0 @M1@ "
    "OBJE\n1 FILE me.jpg\n";

TEST(Details, writtenAndReadAgainTheyAreTheSame) {
    const GedcomData data = readDetails(document(kTwoPersons));
    const std::string text = writeGedcom(data);
    const GedcomData again = readDetails(text);
    EXPECT_EQ(writeGedcom(again), text);
    EXPECT_EQ(joined(personDetails(again, 2).notes), "for both|Father of Anna Berg|plain @ text");
    EXPECT_EQ(personDetails(again, 1).media[0].file, "me.jpg");
    EXPECT_EQ(factDetails(again, again.factsOfPerson(2)[0]).citations[0].page, "3");
    EXPECT_NE(text.find("1 NAME Archive"), std::string::npos);
}

TEST(Details, ofTheHiddenNothingIsWritten) {
    const GedcomData data = readDetails(document(kTwoPersons));
    WriteOptions options;
    options.hidden = {true, false};
    const std::string text = writeGedcom(data, options);
    for (const char* secret :
         {"Anna", "anna", "only hers", "N1", "M1", "me.jpg", "secret", "Hidden Town", "PAGE 9", "diary"}) {
        EXPECT_EQ(text.find(secret), std::string::npos) << secret << "\n" << text;
    }
    const GedcomData again = readDetails(text);
    EXPECT_TRUE(again.detailsOfPerson(1).empty());
    EXPECT_EQ(joined(personDetails(again, 2).notes), "for both|plain @ text");
    EXPECT_EQ(personDetails(again, 2).citations[0].author, "Somebody");
    EXPECT_EQ(factDetails(again, again.factsOfPerson(2)[0]).citations[0].page, "3");
}

TEST(Details, notesSourcesAndMediaCanBeLeftOut) {
    const GedcomData data = readDetails(document(kTwoPersons));
    WriteOptions options;
    options.notes = options.sources = options.media = false;
    const std::string text = writeGedcom(data, options);
    for (const char* tag : {"NOTE", "SOUR @", "OBJE", "PAGE", "FILE", "REPO"})
        EXPECT_EQ(text.find(tag), std::string::npos) << tag;
    EXPECT_NE(text.find("2 CAUS fever"), std::string::npos);
}

TEST(Details, recordsThatPointAtEachOtherEnd) {
    const GedcomData data =
        readDetails(document("0 @I1@ INDI\n1 NOTE @N1@\n0 @N1@ NOTE a\n1 NOTE @N2@\n1 SOUR @S1@\n0 @N2@ NOTE "
                             "b\n1 NOTE @N1@\n0 @S1@ SOUR\n1 TITL t\n1 NOTE @N1@\n"));
    EXPECT_EQ(joined(personDetails(data, 1).notes), "a");
    EXPECT_EQ(readDetails(writeGedcom(data)).sharedRecords().size(), 3U);
}

}  // namespace
}  // namespace olvane::gedcom::test
