// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A file as a table: it answers the engine as the file itself does, and keeps names, dates and families.

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/kin/FamilyDataSource.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomFamily.h>
#include <olvane/source/GedcomKin.h>

#include "GedcomText.h"
#include "RealFiles.h"

namespace olvane::gedcom::test {
namespace {

using testing::ElementsAre;

void expectSameAnswers(const GedcomData& data) {
    FamilyDataSource table(familyOf(data));
    GedcomDataSource file(data);
    for (std::int64_t id = 1; id <= static_cast<std::int64_t>(data.personCount()); ++id) {
        ASSERT_EQ(table.fatherForPersonWithID(id), file.fatherForPersonWithID(id));
        ASSERT_EQ(table.motherForPersonWithID(id), file.motherForPersonWithID(id));
        ASSERT_EQ(table.spousesForPersonWithID(id), file.spousesForPersonWithID(id));
        ASSERT_EQ(table.childrenForPersonWithID(id), file.childrenForPersonWithID(id));
        for (const std::int64_t spouse : file.spousesForPersonWithID(id)) {
            ASSERT_EQ(table.isPreferredSpouse(id, spouse), file.isPreferredSpouse(id, spouse));
        }
        ASSERT_EQ(table.isPersonDead(id), file.isPersonDead(id));
        ASSERT_EQ(table.dateForPersonWithID(id, true), file.dateForPersonWithID(id, true));
        ASSERT_EQ(table.dateForPersonWithID(id, false), file.dateForPersonWithID(id, false));
        ASSERT_EQ(table.sexOfPersonWithID(id), file.sexOfPersonWithID(id));
    }
}

// Every union of the file, with its children and their kinds, as the table's unions.
void expectSameUnions(const GedcomData& data) {
    const kin::KinGraph ofFile = kinGraphOf(data);
    const kin::KinGraph ofTable = olvane::kinGraphOf(familyOf(data));
    ASSERT_EQ(ofTable.personCount(), ofFile.personCount());
    ASSERT_GE(ofTable.unionCount(), ofFile.unionCount());
    for (kin::UnionPlace u = 0; u < ofFile.unionCount(); ++u) {
        ASSERT_EQ(ofTable.partners(u), ofFile.partners(u));
        ASSERT_EQ(ofTable.family(u), ofFile.family(u));
        ASSERT_LE(ofFile.children(u).size(), ofTable.children(u).size());
        for (std::size_t i = 0; i < ofFile.children(u).size(); ++i) {
            ASSERT_EQ(ofTable.children(u)[i], ofFile.children(u)[i]);
            ASSERT_EQ(ofTable.childKinds(u)[i], ofFile.childKinds(u)[i]);
        }
    }
}

TEST(GedcomFamily, keepsNamesDatesAndFamilies) {
    const olvane::Family table = familyOf(
        read(document("0 @I1@ INDI\n1 NAME Anna Maria /Berg/\n2 NICK Anni\n1 NAME Anna /Holm/\n1 SEX F\n"
                      "1 BIRT\n2 DATE ABT 1880\n0 @I2@ INDI\n1 FAMC @F1@\n2 PEDI adopted\n"
                      "0 @F1@ FAM\n1 WIFE @I1@\n1 CHIL @I2@\n1 MARR\n2 DATE 3 MAY 1901\n"
                      "0 @F2@ FAM\n1 CHIL @I1@\n1 CHIL @I1@\n")));
    EXPECT_EQ(table.name(1, NameKind::full), "Anna Maria Berg");
    EXPECT_EQ(table.name(1, NameKind::nickname), "Anni");
    EXPECT_EQ(table.names(1).at(4), (NamePart{NameKind::full, "Anna Holm"}));
    EXPECT_EQ(table.birth(1), "1880");
    EXPECT_EQ(table.person(1).birthWritten, "ABT 1880");
    EXPECT_EQ(table.field(2, "xref"), "I2");
    EXPECT_EQ(table.family(1).state, kin::UnionState::married);
    EXPECT_EQ(table.family(1).partner1, 1);
    EXPECT_EQ(table.family(1).marriage, "1901-05-03");
    EXPECT_EQ(table.family(1).marriageWritten, "3 MAY 1901");
    EXPECT_THAT(table.familyChildren(1), ElementsAre(FamilyChild{2, kin::ChildKind::adopted}));
    EXPECT_THAT(table.familyChildren(2), ElementsAre(FamilyChild{1, kin::ChildKind::birth}));
}

TEST(GedcomFamily, keepsThatACoupleNeverMarried) {
    const olvane::Family table = familyOf(
        read(document("0 @I1@ INDI\n0 @I2@ INDI\n0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 MARR N\n")));
    EXPECT_EQ(table.family(1).state, kin::UnionState::unmarried);
}

TEST(GedcomFamily, answersAsTheFileDoesWhereRecordsContradictEachOther) {
    expectSameAnswers(read(document(
        "0 @I1@ INDI\n1 FAMS @F1@\n1 FAMC @F1@\n0 @I2@ INDI\n1 FAMC @F2@\n0 @I3@ INDI\n1 FAMS @F1@\n"
        "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I3@\n1 CHIL @I2@\n1 CHIL @I2@\n0 @F2@ FAM\n1 WIFE @I2@\n")));
}

TEST(GedcomFamily, answersAsEveryRealFileDoes) {
    const std::filesystem::path folder = realGedcomFolder();
    if (folder.empty()) GTEST_SKIP() << "OLVANE_GEDCOM_DIR names no folder of GEDCOM files";
    const std::vector<std::filesystem::path> files = gedcomFilesBelow(folder);
    ASSERT_FALSE(files.empty());
    for (const std::filesystem::path& path : files) {
        SCOPED_TRACE(path.string());
        try {
            const GedcomData data = readGedcomFile(path.string());
            expectSameAnswers(data);
            expectSameUnions(data);
        } catch (const GedcomError&) {
            continue;  // no GEDCOM, as other tests say
        }
        if (testing::Test::HasFatalFailure()) return;
    }
}

}  // namespace
}  // namespace olvane::gedcom::test
