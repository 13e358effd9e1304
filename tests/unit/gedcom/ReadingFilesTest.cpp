// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Files and archives on disk, and paths that are neither.

#include <filesystem>
#include <fstream>
#include <string>

#include <unistd.h>

#include <gtest/gtest.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

const std::string kData = GEDCOM_TEST_DATA;

std::string refusalOfFile(const std::string& path) {
    try {
        readGedcomFile(path);
    } catch (const GedcomError& error) {
        EXPECT_EQ(error.file(), path);
        EXPECT_EQ(std::string(error.what()), std::string(path).append(": ").append(error.text()));
        return error.text();
    }
    return {};
}

TEST(ReadingFiles, aFileIsReadUnderItsName) {
    const GedcomData data = readGedcomFile(std::string(kData).append("/small.ged"));
    EXPECT_EQ(namesOf(data), "Anna Roe|Bertil Roe");
    EXPECT_EQ(data.file(), std::string(kData).append("/small.ged"));
    EXPECT_EQ(data.version(), "5.5.1");
}

TEST(ReadingFiles, pathsThatAreNoFileAreRefused) {
    EXPECT_EQ(refusalOfFile(std::string(kData).append("/nowhere.ged")), "does not exist");
    EXPECT_EQ(refusalOfFile(kData), "is a directory");
    EXPECT_EQ(refusalOfFile("/dev/null"), "is a device, not a file");
    EXPECT_EQ(refusalOfFile(""), "does not exist");
}

TEST(ReadingFiles, anEmptyFileIsRefused) {
    // Of this process alone: the tests of several builds may run at once.
    const std::string name = "olvane-test-empty-" + std::to_string(::getpid()) + ".ged";
    const std::string path = std::filesystem::temp_directory_path() / name;
    std::ofstream(path).close();
    EXPECT_EQ(refusalOfFile(path), "is empty");
    std::filesystem::remove(path);
}

TEST(ReadingFiles, dataStayValidWhenMoved) {
    GedcomData first = readGedcomFile(std::string(kData).append("/small.ged"));
    const GedcomData second = std::move(first);
    EXPECT_EQ(namesOf(second), "Anna Roe|Bertil Roe");
    EXPECT_EQ(second.personByXref("I2"), 2U);
}

#ifdef OLVANE_GEDCOM_ZIP

TEST(ReadingFiles, anArchiveIsReadByItsStandardMember) {
    const GedcomData data = readGedcomFile(std::string(kData).append("/small.gdz"));
    EXPECT_EQ(namesOf(data), "Anna Roe|Bertil Roe");
    EXPECT_TRUE(data.diagnostics().empty());
}

TEST(ReadingFiles, anArchiveWithAnotherMemberIsReadAndReported) {
    const GedcomData data = readGedcomFile(std::string(kData).append("/renamed.gdz"));
    EXPECT_EQ(namesOf(data), "Anna Roe|Bertil Roe");
    ASSERT_EQ(reported(data, DiagnosticKind::archiveMember).size(), 1U);
    EXPECT_EQ(reported(data, DiagnosticKind::archiveMember)[0],
              "0: the archive has no gedcom.ged (family/My Tree.GED); another member is read");
}

TEST(ReadingFiles, anArchiveWithoutGedcomIsRefused) {
    EXPECT_EQ(refusalOfFile(std::string(kData).append("/picture.gdz")),
              "is an archive without a GEDCOM file in it");
}

TEST(ReadingFiles, anArchiveCutOffIsRefused) {
    const std::string bytes = bytesOfFile(std::string(kData).append("/small.gdz"));
    ASSERT_GT(bytes.size(), 100U);
    EXPECT_TRUE(
        refusal(bytes.substr(0, bytes.size() / 2)).starts_with("is an archive that cannot be opened: "));
    std::string damaged = bytes;
    for (std::size_t at = 60; at < 80; ++at) damaged[at] = static_cast<char>(damaged[at] ^ 0x55);
    EXPECT_NE(refusal(damaged), "");
}

TEST(ReadingFiles, anArchiveThatUnpacksWithoutEndIsRefused) {
    EXPECT_EQ(refusalOfFile(std::string(kData).append("/swelling.gdz")),
              "unpacks to more than such an archive may hold");
}

#else

TEST(ReadingFiles, withoutZipAnArchiveIsRefused) {
    EXPECT_EQ(refusalOfFile(std::string(kData).append("/small.gdz")),
              "is an archive, and this program was built without zip");
}

#endif

}  // namespace
}  // namespace olvane::gedcom::test
