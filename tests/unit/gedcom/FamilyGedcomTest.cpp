// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A program's table as a GEDCOM file, which is read again: the same persons with the same relatives, names and dates.

#include <algorithm>
#include <array>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomReader.h>
#include <olvane/source/GedcomFamily.h>
#include <olvane/source/GedcomKin.h>

#include "GedcomText.h"
#include "RealFiles.h"

namespace olvane::gedcom::test {
namespace {

using testing::ElementsAre;

PersonRow personOf(std::int64_t id, kin::Sex sex, std::int64_t father = 0, std::int64_t mother = 0) {
    PersonRow row;
    row.id = id;
    row.sex = sex;
    row.father = father;
    row.mother = mother;
    return row;
}

// 17 with his wife 42, their daughter 5, and 9, whom he alone has.
olvane::Family smallTable() {
    olvane::Family table;
    table.addPerson(personOf(17, kin::Sex::male));
    table.addPerson(personOf(42, kin::Sex::female));
    table.addPerson(personOf(5, kin::Sex::female, 17, 42));
    table.addPerson(personOf(9, kin::Sex::unknown, 17));
    return table;
}

TEST(FamilyGedcom, writesFamiliesThatAreKnownByListsAlone) {
    const GedcomData data = read(gedcomTextOf(smallTable()));
    ASSERT_EQ(data.personCount(), 4U);
    EXPECT_EQ(data.person(1).xref, "17");
    EXPECT_EQ(data.person(3).father, 1U);
    EXPECT_EQ(data.person(3).mother, 2U);
    EXPECT_EQ(data.person(4).father, 1U);
    EXPECT_EQ(data.person(4).mother, 0U);
    EXPECT_THAT(idsOf(data.children(1)), "3 4");
    EXPECT_TRUE(data.diagnostics().empty());
}

TEST(FamilyGedcom, writesNamesOfAllKinds) {
    olvane::Family table = smallTable();
    const std::array parts = {NamePart{NameKind::given, "Anna Maria"}, NamePart{NameKind::surname, "Berg"},
                              NamePart{NameKind::nickname, "Anni"},
                              NamePart{NameKind::married, "Anna /Holm/"},
                              NamePart{NameKind::full, "Ann of the @ Hill"}};
    table.setNames(42, parts);
    const GedcomData data = read(gedcomTextOf(table));
    EXPECT_EQ(data.firstName(2).surname, "Berg");
    std::vector<std::string> names;
    for (const PersonName& name : data.names(2)) names.push_back(displayName(name));
    EXPECT_THAT(names, testing::UnorderedElementsAre("Anna Maria Berg", "Anna Holm", "Ann of the @ Hill"));
}

TEST(FamilyGedcom, turnsSortingDatesIntoWrittenOnes) {
    olvane::Family table = smallTable();
    PersonRow row = personOf(17, kin::Sex::male);
    row.birth = "1850-05-03";
    row.death = "1901-12";
    table.setPerson(row);
    row = personOf(42, kin::Sex::female);
    row.birth = "1852";
    row.death = "1900-13-01";
    row.deathWritten = "ABT 1900";
    table.setPerson(row);
    const GedcomData data = read(gedcomTextOf(table));
    EXPECT_EQ(data.person(1).birth.written, "3 MAY 1850");
    EXPECT_EQ(data.person(1).death.written, "DEC 1901");
    EXPECT_EQ(data.person(2).birth.written, "1852");
    EXPECT_EQ(data.person(2).death.written, "ABT 1900");
}

TEST(FamilyGedcom, writesFieldsAsFactsAndLinesOfNotes) {
    olvane::Family table = smallTable();
    table.setField(5, "occupation", "smith");
    table.setField(5, "birthPlace", "Bath");
    table.setField(5, "hat size", "7");
    table.setField(5, "note", "first\nsecond @home");
    ReadOptions options;
    options.facts = true;
    const GedcomData data = readGedcomBytes(gedcomTextOf(table), "test.ged", options);
    const auto facts = data.factsOfPerson(3);
    ASSERT_EQ(facts.size(), 3U);
    EXPECT_EQ(facts[0].tag, "BIRT");
    EXPECT_EQ(facts[0].place, "Bath");
    EXPECT_EQ(facts[1].value, "smith");
    EXPECT_EQ(facts[2].tag, "FACT");
    EXPECT_EQ(facts[2].value, "7");
    EXPECT_THAT(gedcomTextOf(table), testing::HasSubstr("1 NOTE first\n2 CONT second @@home\n"));
}

TEST(FamilyGedcom, writesThePreferredSpouseFirstAndHowCouplesStand) {
    olvane::Family table = smallTable();
    table.addPerson(personOf(43, kin::Sex::female));
    FamilyRow divorced;
    divorced.number = 7;
    divorced.partner0 = 17;
    divorced.partner1 = 42;
    divorced.state = kin::UnionState::divorced;
    divorced.marriage = "1870";
    table.addFamily(divorced, {});
    FamilyRow unmarried;
    unmarried.number = 3;
    unmarried.partner0 = 17;
    unmarried.partner1 = 43;
    unmarried.state = kin::UnionState::unmarried;
    const std::array children = {FamilyChild{9, kin::ChildKind::adopted}};
    table.addFamily(unmarried, children);
    table.setPreferredSpouse(17, 43);
    const olvane::Family again = familyOf(read(gedcomTextOf(table)));
    EXPECT_THAT(again.spouses(1), ElementsAre(5, 2));
    EXPECT_EQ(again.preferredSpouse(1), 5U);
    EXPECT_EQ(again.family(1).state, kin::UnionState::divorced);
    EXPECT_EQ(again.family(1).marriageWritten, "1870");
    EXPECT_EQ(again.family(2).state, kin::UnionState::unmarried);
    EXPECT_THAT(again.familyChildren(2), ElementsAre(FamilyChild{4, kin::ChildKind::adopted}));
}

// Who is related to whom, in the order of the table.
void expectSameFamily(const olvane::Family& table, const olvane::Family& again) {
    ASSERT_EQ(again.personCount(), table.personCount());
    const kin::KinGraph before = olvane::kinGraphOf(table);
    const kin::KinGraph after = olvane::kinGraphOf(again);
    ASSERT_EQ(after.unionCount(), before.unionCount());
    for (kin::UnionPlace u = 0; u < static_cast<kin::UnionPlace>(before.unionCount()); ++u) {
        ASSERT_EQ(after.partners(u), before.partners(u)) << u;
        ASSERT_TRUE(std::ranges::equal(after.children(u), before.children(u))) << u;
    }
    for (kin::Place place = 0; place < static_cast<kin::Place>(before.personCount()); ++place) {
        const std::int64_t id = before.id(place);
        ASSERT_EQ(again.sex(after.id(place)), table.sex(id)) << id;
        ASSERT_EQ(again.name(after.id(place), NameKind::surname), table.name(id, NameKind::surname)) << id;
    }
}

TEST(FamilyGedcom, givesEveryRealFileBack) {
    const std::filesystem::path folder = realGedcomFolder();
    if (folder.empty()) GTEST_SKIP() << "OLVANE_GEDCOM_DIR names no folder of GEDCOM files";
    const std::vector<std::filesystem::path> files = gedcomFilesBelow(folder);
    ASSERT_FALSE(files.empty());
    for (const std::filesystem::path& path : files) {
        SCOPED_TRACE(path.string());
        try {
            const olvane::Family table = familyOf(readGedcomFile(path.string()));
            expectSameFamily(table, familyOf(read(gedcomTextOf(table))));
        } catch (const GedcomError&) {
            continue;  // no GEDCOM, as other tests say
        }
    }
}

}  // namespace
}  // namespace olvane::gedcom::test
