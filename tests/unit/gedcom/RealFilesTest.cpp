// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Files of other programs and makers, which are not kept with the source: their folder is named by
// OLVANE_GEDCOM_DIR.

#include <cstdlib>
#include <filesystem>
#include <map>
#include <string>

#include <gtest/gtest.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

class RealFiles : public testing::Test {
protected:
    void SetUp() override {
        const char* folder = std::getenv("OLVANE_GEDCOM_DIR");
        if (folder == nullptr || *folder == '\0')
            GTEST_SKIP() << "OLVANE_GEDCOM_DIR names no folder of GEDCOM files";
        folder_ = folder;
    }

    GedcomData file(const std::string& name) const {
        return readGedcomFile(std::string(folder_).append("/").append(name));
    }

    std::string folder_;
};

// INDI lines by plain search in a file of one byte a character.
std::size_t countPersonLines(const std::string& bytes) {
    std::size_t count = 0;
    for (std::size_t at = bytes.find(" INDI"); at != std::string::npos; at = bytes.find(" INDI", at + 1)) {
        const std::size_t lineStart = bytes.find_last_of("\r\n", at) + 1;
        if (bytes.compare(lineStart, 2, "0 ") == 0 || bytes.compare(lineStart, 5,
                                                                    "\xEF\xBB\xBF"
                                                                    "0 ") == 0)
            ++count;
    }
    return count;
}

TEST_F(RealFiles, eachHasAsManyPersonsAsRecords) {
    std::size_t files = 0;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder_)) {
        if (entry.path().extension() != ".ged") continue;
        const GedcomData data = readGedcomFile(entry.path().string());
        EXPECT_EQ(data.personCount(), countPersonLines(bytesOfFile(entry.path().string()))) << entry.path();
        ++files;
    }
    EXPECT_GT(files, 60U);
}

TEST_F(RealFiles, copiesInSeveralEncodingsGiveEqualNames) {
    EXPECT_EQ(namesOf(file("encoding/utf8_cr_nobom.ged")), namesOf(file("encoding/utf8_crlf_bom.ged")));
    EXPECT_EQ(
        namesOf(file("encoding/utf8_crlf_bom.ged")),
        "John Grüber|Mary Hægermann|Abraham Smîth|Betsy Großmann|Cleo Nôrden|Elizabeth Jåckson|Daniel Ćuarón|"
        "Michael Garçon|Ellen Łowenstėin|Fred Ûlrich");
    for (const char* name : {"age-valid", "atsign", "char_ascii_1", "char_utf16be-1", "char_utf16le-1",
                             "char_utf8-1", "enum-ext", "notes-1", "pedi-1", "tiny-1", "xref-case"}) {
        const GedcomData five = file(std::string("encoding/v5-").append(name).append(".ged"));
        const GedcomData seven = file(std::string("encoding/v7-").append(name).append(".ged"));
        EXPECT_EQ(namesOf(five), namesOf(seven)) << name;
        EXPECT_EQ(five.familyCount(), seven.familyCount()) << name;
    }
    EXPECT_EQ(file("encoding/v5-char_utf16be-1.ged").encoding(), "UTF-16BE");
    EXPECT_EQ(file("encoding/v5-char_utf16le-1.ged").encoding(), "UTF-16LE");
}

TEST_F(RealFiles, archivesGiveWhatTheirFilesGive) {
#ifdef OLVANE_GEDCOM_ZIP
    EXPECT_EQ(namesOf(file("gedcom7/maximal70.gdz")), namesOf(file("gedcom7/maximal70.ged")));
    EXPECT_EQ(file("gedcom7/minimal70.gdz").personCount(), 0U);
#else
    GTEST_SKIP() << "built without zip";
#endif
}

TEST_F(RealFiles, aLargeRoyalFamilyIsWhole) {
    const GedcomData data = file("history/royal92.ged");
    EXPECT_EQ(data.personCount(), 3010U);
    EXPECT_EQ(data.familyCount(), 1422U);
    EXPECT_EQ(data.encoding(), "ANSEL");
    EXPECT_EQ(displayName(data.firstName(1)), "Victoria Hanover");
    EXPECT_EQ(idsOf(data.spouses(1)), "2");
    EXPECT_EQ(idsOf(data.children(1)), "3 4 5 6 7 8 9 10 11");
    EXPECT_EQ(data.personByXref("@I52@"), 52U);
    EXPECT_EQ(displayYear(data.person(52).birth), "1926");
    EXPECT_FALSE(data.person(52).dead);
    EXPECT_EQ(linesReported(data, DiagnosticKind::unreadableDate), "6436 27126");
}

TEST_F(RealFiles, relationsAreTheirOwn) {
    const GedcomData torture = file("torture55/allged.ged");
    EXPECT_EQ(idsOf(torture.spouses(1)), "2 8");
    EXPECT_EQ(idsOf(torture.children(1)), "3 4 7");
    EXPECT_EQ(torture.person(1).father, 5U);
    EXPECT_EQ(torture.person(1).mother, 0U);
    EXPECT_EQ(torture.parentLinks(1)[1].pedigree, Pedigree::adopted);
    const GedcomData remarried = file("gedcom7/remarriage1.ged");
    EXPECT_EQ(idsOf(remarried.spouses(1)), "2 3");
    EXPECT_FALSE(remarried.family(1).divorced);
}

TEST_F(RealFiles, everyStandardDateIsReadToAYear) {
    const GedcomData data = file("encoding/calendar-dates.ged");
    EXPECT_EQ(displayYear(data.person(1).birth), "100 BC");
    EXPECT_EQ(sortText(data.person(3).birth), "1732-02-22");
    EXPECT_EQ(displayYear(data.person(4).death), "1105");
    for (const char* name : {"gedcom7/date.ged", "encoding/calendar-dates.ged"}) {
        EXPECT_EQ(linesReported(file(name), DiagnosticKind::unreadableDate), "") << name;
    }
}

TEST_F(RealFiles, brokenOnesAreReportedByLine) {
    EXPECT_EQ(linesReported(file("malformed/duplicate-xref.ged"), DiagnosticKind::duplicateXref), "8 11 16");
    EXPECT_EQ(linesReported(file("malformed/invalid-level.ged"), DiagnosticKind::levelJump), "6");
    EXPECT_EQ(linesReported(file("malformed/level-jump-skip.ged"), DiagnosticKind::levelJump), "8");
    EXPECT_EQ(linesReported(file("malformed/missing-header.ged"), DiagnosticKind::missingHeader), "1");
    EXPECT_TRUE(file("malformed/deep-nesting-levels.ged").diagnostics().empty());
    EXPECT_EQ(linesReported(file("malformed/circular-reference.ged"), DiagnosticKind::contradictingLink),
              "31");
}

TEST_F(RealFiles, filesOfOtherSortsAreRefused) {
    for (const auto& entry :
         std::filesystem::directory_iterator(std::string(folder_).append("/peers-json"))) {
        EXPECT_THROW(readGedcomFile(entry.path().string()), GedcomError) << entry.path();
    }
}

}  // namespace
}  // namespace olvane::gedcom::test
