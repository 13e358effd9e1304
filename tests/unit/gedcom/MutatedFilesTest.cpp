// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Copies of files with bytes changed, cut out, doubled and moved: each is read with all its details or refused with a
// GedcomError, and what was read can be written, hidden and read again. The copies are the same in every run.
//
// OLVANE_GEDCOM_DIR names a folder of files to begin with, beside those of the tests. OLVANE_GEDCOM_MUTANTS says how many
// copies are made; a few hundred by default, 20000 for a thorough run.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <random>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomDetails.h>
#include <olvane/gedcom/GedcomWriter.h>
#include <olvane/source/GedcomKin.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

constexpr std::size_t kMutantsByDefault = 300;
// Large files are cut to this, so that a copy takes a moment.
constexpr std::size_t kMostBytes = 32768;

using Random = std::mt19937;

std::size_t below(Random& random, std::size_t limit) {
    return limit == 0 ? 0 : random() % limit;
}

void addFolder(const char* folder, std::vector<std::string>& files) {
    std::vector<std::string> paths;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
        const auto ending = entry.path().extension();
        if (ending == ".ged" || ending == ".gdz") paths.push_back(entry.path().string());
    }
    std::sort(paths.begin(), paths.end());
    for (const std::string& path : paths) files.push_back(bytesOfFile(path).substr(0, kMostBytes));
}

std::vector<std::string> seedFiles() {
    std::vector<std::string> files;
    addFolder(GEDCOM_TEST_DATA, files);
    const char* const folder = std::getenv("OLVANE_GEDCOM_DIR");
    if (folder != nullptr && *folder != '\0') addFolder(folder, files);
    return files;
}

std::size_t mutantsWanted() {
    const char* const wanted = std::getenv("OLVANE_GEDCOM_MUTANTS");
    return wanted == nullptr ? kMutantsByDefault : std::strtoul(wanted, nullptr, 10);
}

// One change of the sort that files suffer: by hands, by conversions, by transfers.
void changeOnce(std::string& bytes, const std::vector<std::string>& files, Random& random) {
    static const std::vector<std::string> kPieces = {
        "\n1 FAMC @F1@",  "\n1 FAMS @F1@", "\n1 CHIL @I1@",   "\n1 HUSB @I2@",    "\n2 CONT ",
        "\n2 CONC \xC3",  "\n1 NOTE @N1@", "\n2 SOUR @S1@",   "\n2 DATE 5/6/7",   "\n1 CHAR BIG5",
        "\n1 CHAR ANSEL", "\n0 @I1@ INDI", "\n99999999999 X", "\r\r\n",           "@",
        "\xEF\xBB\xBF",   "\xED\xA0\x80",  "\n1 OBJE @M1@",   "\n2 TYPE married", "\n0 @N1@ NOTE x"};
    const std::size_t at = below(random, bytes.size());
    const std::size_t length = below(random, std::min<std::size_t>(bytes.size() - at, 200)) + 1;
    switch (random() % 7) {
        case 0:
            if (!bytes.empty()) bytes[at] = static_cast<char>(random() & 0xFF);
            return;
        case 1:
            bytes.erase(at, length);
            return;
        case 2:
            bytes.insert(below(random, bytes.size()), bytes.substr(at, length));
            return;
        case 3:
            bytes.insert(at, kPieces[below(random, kPieces.size())]);
            return;
        case 4:
            bytes.resize(at);
            return;
        case 5: {
            const std::string& other = files[below(random, files.size())];
            bytes.insert(at, other.substr(below(random, other.size()), length * 4));
            return;
        }
        default:
            if (!bytes.empty()) bytes[at] = static_cast<char>(bytes[at] ^ (1 << random() % 8));
    }
}

void useAll(const GedcomData& data) {
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        personDetails(data, id);
        for (const Fact& fact : data.factsOfPerson(id)) factDetails(data, fact);
        for (const PersonName& name : data.names(id)) nameDetails(data, name);
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) familyDetails(data, id);
    EXPECT_EQ(kinGraphOf(data).personCount(), static_cast<kin::Place>(data.personCount()));
}

// False for a file that is refused.
bool readAndUse(const std::string& bytes, bool hidesSome) {
    ReadOptions options;
    options.details = true;
    try {
        const GedcomData data = readGedcomBytes(bytes, "mutant", options);
        useAll(data);
        WriteOptions writing;
        for (std::size_t i = 0; hidesSome && i < data.personCount(); ++i)
            writing.hidden.push_back(i % 3 == 0);
        const GedcomData again = readGedcomBytes(writeGedcom(data, writing), "again", options);
        EXPECT_EQ(again.personCount(), data.personCount());
        EXPECT_EQ(again.familyCount(), data.familyCount());
        return true;
    } catch (const GedcomError&) {
        return false;
    }
}

TEST(MutatedFiles, areReadOrRefused) {
    const std::vector<std::string> files = seedFiles();
    ASSERT_FALSE(files.empty());
    Random random(20240101);
    std::size_t read = 0;
    const std::size_t wanted = mutantsWanted();
    for (std::size_t mutant = 0; mutant < wanted; ++mutant) {
        std::string bytes = files[mutant % files.size()];
        const std::size_t changes = 1 + random() % 8;
        for (std::size_t change = 0; change < changes; ++change) changeOnce(bytes, files, random);
        if (readAndUse(bytes, mutant % 2 == 0)) ++read;
        ASSERT_FALSE(HasFailure()) << "mutant " << mutant;
    }
    EXPECT_GT(read, wanted / 8) << "many copies are still files";
}

}  // namespace
}  // namespace olvane::gedcom::test
