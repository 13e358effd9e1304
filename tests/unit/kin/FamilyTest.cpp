// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A table filled in one go: what it answers, what follows from what, and what it refuses.

#include <olvane/kin/Family.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace {

using olvane::Family;
using olvane::FamilyColumns;
using olvane::FamilyError;
using olvane::NameKind;
using testing::ElementsAre;
using testing::IsEmpty;

typedef std::vector<std::int64_t> Ids;
typedef std::vector<std::string_view> Texts;

// A couple 1 and 2 with the children 3 and 4.
struct Couple {
    Ids ids{1, 2, 3, 4};
    Ids fathers{0, 0, 1, 1};
    Ids mothers{0, 0, 2, 2};
    Ids sexes{0, 1, 0, 1};

    FamilyColumns columns() const {
        FamilyColumns columns;
        columns.persons.id = std::span(ids);
        columns.persons.father = std::span(fathers);
        columns.persons.mother = std::span(mothers);
        columns.persons.sex = std::span(sexes);
        return columns;
    }
};

std::string refusalOf(const FamilyColumns& columns) {
    try {
        const Family family(columns);
    } catch (const FamilyError& error) {
        return error.what();
    }
    return "nothing is refused";
}

TEST(Family, isEmptyBeforeAnythingIsAdded) {
    const Family family;
    EXPECT_EQ(family.personCount(), 0U);
    EXPECT_FALSE(family.hasPerson(1));
    EXPECT_THROW(family.father(1), std::out_of_range);
}

TEST(Family, answersAsItsColumnsSay) {
    const Couple couple;
    const Texts births{"1880", "1882-02", "", "1911"};
    const Texts written{"", "FEB 1882", "", ""};
    const std::vector<std::uint8_t> dead{1, 1, 0, 0};
    FamilyColumns columns = couple.columns();
    columns.persons.birth = std::span(births);
    columns.persons.birthWritten = std::span(written);
    columns.persons.dead = std::span(dead);
    const Family family(columns);
    EXPECT_EQ(family.father(3), 1U);
    EXPECT_EQ(family.mother(3), 2U);
    EXPECT_EQ(family.father(1), 0U);
    EXPECT_EQ(family.sex(4), olvane::kin::Sex::female);
    EXPECT_TRUE(family.isDead(2));
    EXPECT_FALSE(family.isDead(3));
    EXPECT_EQ(family.birth(2), "1882-02");
    EXPECT_EQ(family.person(2).birthWritten, "FEB 1882");
    EXPECT_EQ(family.person(1).birthWritten, "1880");
    EXPECT_EQ(family.birth(3), "");
}

TEST(Family, listsOfChildrenFollowFromParentsWhereNoneAreGiven) {
    const Couple couple;
    const Family family(couple.columns());
    EXPECT_THAT(family.children(1), ElementsAre(3, 4));
    EXPECT_THAT(family.children(2), ElementsAre(3, 4));
    EXPECT_THAT(family.spouses(1), IsEmpty());
}

TEST(Family, listsFollowFromFamiliesFirst) {
    const Couple couple;
    const Ids numbers{7, 8}, partners0{1, 1}, partners1{2, 2};
    const Ids inFamily{7}, child{4};
    FamilyColumns columns = couple.columns();
    columns.families.number = std::span(numbers);
    columns.families.partner0 = std::span(partners0);
    columns.families.partner1 = std::span(partners1);
    columns.familyChildren.family = std::span(inFamily);
    columns.familyChildren.child = std::span(child);
    const Family family(columns);
    EXPECT_THAT(family.spouses(1), ElementsAre(2));
    EXPECT_THAT(family.spouses(2), ElementsAre(1));
    EXPECT_EQ(family.preferredSpouse(1), 2U);
    EXPECT_THAT(family.children(1), ElementsAre(4, 3));
}

TEST(Family, listsThatAreGivenStayAsTheyAre) {
    const Couple couple;
    const Ids persons{1, 1}, spouses{4, 2}, preferred{0, 1};
    const Ids none;
    FamilyColumns columns = couple.columns();
    columns.spouses.person = std::span(persons);
    columns.spouses.spouse = std::span(spouses);
    columns.spouses.preferred = std::span(preferred);
    columns.children.parent = std::span(none);
    columns.children.child = std::span(none);
    const Family family(columns);
    EXPECT_THAT(family.spouses(1), ElementsAre(4, 2));
    EXPECT_EQ(family.preferredSpouse(1), 2U);
    EXPECT_THAT(family.spouses(2), IsEmpty());
    EXPECT_THAT(family.children(1), IsEmpty());
}

TEST(Family, familiesKeepKindsStateAndMarriage) {
    const Couple couple;
    const Ids numbers{2147483647}, partner{1}, states{1};
    const Ids inFamily{2147483647, 2147483647}, children{4, 3}, kinds{0, 1};
    const Texts date{"1901-05"}, written{"MAY 1901"}, place{"Ulm"};
    FamilyColumns columns = couple.columns();
    columns.families.number = std::span(numbers);
    columns.families.partner1 = std::span(partner);
    columns.families.state = std::span(states);
    columns.families.marriage = std::span(date);
    columns.families.marriageWritten = std::span(written);
    columns.families.marriagePlace = std::span(place);
    columns.familyChildren.family = std::span(inFamily);
    columns.familyChildren.child = std::span(children);
    columns.familyChildren.kind = std::span(kinds);
    const Family family(columns);
    const olvane::FamilyRow row = family.family(2147483647);
    EXPECT_EQ(row.partner0, 0);
    EXPECT_EQ(row.partner1, 1);
    EXPECT_EQ(row.state, olvane::kin::UnionState::divorced);
    EXPECT_EQ(row.marriage, "1901-05");
    EXPECT_EQ(row.marriageWritten, "MAY 1901");
    EXPECT_EQ(row.marriagePlace, "Ulm");
    const std::vector<olvane::FamilyChild> expected{{4, olvane::kin::ChildKind::birth},
                                                    {3, olvane::kin::ChildKind::adopted}};
    EXPECT_EQ(family.familyChildren(2147483647), expected);
    EXPECT_THROW(family.family(1), std::out_of_range);
}

TEST(Family, keepsNamesAndFieldsOfEachPerson) {
    const Couple couple;
    const Ids named{2, 1, 2}, kinds{0, 0, 7};
    const Texts names{"Åsa Öhman", "Karl", "Ö."};
    const Ids fielded{2, 2};
    const Texts keys{"job", "note"};
    const std::string longNote(70000, 'n');
    const Texts texts{"smith", longNote};
    FamilyColumns columns = couple.columns();
    columns.names.person = std::span(named);
    columns.names.kind = std::span(kinds);
    columns.names.text = std::span(names);
    columns.fields.person = std::span(fielded);
    columns.fields.key = std::span(keys);
    columns.fields.text = std::span(texts);
    const Family family(columns);
    EXPECT_THAT(family.names(2), ElementsAre(olvane::NamePart{NameKind::full, "Åsa Öhman"},
                                             olvane::NamePart{NameKind::other, "Ö."}));
    EXPECT_EQ(family.name(1, NameKind::full), "Karl");
    EXPECT_EQ(family.name(1, NameKind::surname), "");
    EXPECT_EQ(family.field(2, "note"), longNote);
    EXPECT_EQ(family.field(1, "note"), "");
    EXPECT_EQ(family.fields(2).size(), 2U);
}

TEST(Family, idsMayComeInAnyOrderAndFarApart) {
    const Ids ids{2147483647, 5, 1000000, 1};
    const Ids fathers{5, 0, 2147483647, 1000000};
    FamilyColumns columns;
    columns.persons.id = std::span(ids);
    columns.persons.father = std::span(fathers);
    const Family family(columns);
    EXPECT_THAT(family.personIds(), ElementsAre(2147483647U, 5U, 1000000U, 1U));
    EXPECT_EQ(family.father(1), 1000000U);
    EXPECT_EQ(family.father(2147483647), 5U);
    EXPECT_FALSE(family.hasPerson(2));
    EXPECT_FALSE(family.hasPerson(4294967297 + 4));
    EXPECT_FALSE(family.hasPerson(-5));
}

TEST(Family, columnsOfEveryTypeAreRead) {
    const std::vector<double> ids{1, 2};
    const std::vector<std::int32_t> fathers{2, 0};
    const std::vector<std::uint32_t> mothers{0, 0};
    const std::vector<std::int8_t> dead{1, 0};
    const char bytes[] = "1880x";
    const std::vector<std::uint32_t> starts{0, 4, 5};
    const char* const deaths[] = {nullptr, "1950"};
    FamilyColumns columns;
    columns.persons.id = std::span(ids);
    columns.persons.father = std::span(fathers);
    columns.persons.mother = std::span(mothers);
    columns.persons.dead = std::span(dead);
    columns.persons.birth = olvane::TextColumn(bytes, 5, starts);
    columns.persons.death = std::span<const char* const>(deaths);
    const Family family(columns);
    EXPECT_EQ(family.father(1), 2U);
    EXPECT_EQ(family.birth(1), "1880");
    EXPECT_EQ(family.birth(2), "x");
    EXPECT_EQ(family.death(1), "");
    EXPECT_EQ(family.death(2), "1950");
}

TEST(FamilyRefuses, idsOutOfTheirRange) {
    for (const std::int64_t id : {std::int64_t{0}, std::int64_t{-1}, std::int64_t{2147483648},
                                  (std::int64_t{1} << 32) + 4, (std::int64_t{1} << 53) + 1}) {
        Couple couple;
        couple.ids[3] = id;
        EXPECT_EQ(refusalOf(couple.columns()), "persons row 3, field id: " + std::to_string(id) +
                                                   " is not a whole number of 1 to 2147483647");
    }
}

TEST(FamilyRefuses, numbersThatAreNotWhole) {
    const std::vector<double> ids{1, 1.5};
    FamilyColumns columns;
    columns.persons.id = std::span(ids);
    EXPECT_EQ(refusalOf(columns), "persons row 1, field id: the number is not whole");
}

TEST(FamilyRefuses, anIdThatStandsTwice) {
    Couple couple;
    couple.ids[3] = 2;
    EXPECT_EQ(refusalOf(couple.columns()), "persons row 3, field id: 2 is the id of another row");
}

TEST(FamilyRefuses, parentsWhoAreNotThere) {
    Couple couple;
    couple.mothers[2] = 9;
    EXPECT_EQ(refusalOf(couple.columns()), "persons row 2, field mother: 9 is not the id of a person");
}

TEST(FamilyRefuses, columnsOfAnotherLengthAndWithoutIds) {
    Couple couple;
    couple.fathers.pop_back();
    EXPECT_EQ(refusalOf(couple.columns()), "persons, field father: the column has 3 rows, and id has 4");
    FamilyColumns columns;
    columns.persons.sex = std::span(couple.sexes);
    EXPECT_EQ(refusalOf(columns), "persons, field id: the column is missing");
}

TEST(FamilyRefuses, choicesThatDoNotExist) {
    Couple couple;
    couple.sexes[1] = 3;
    EXPECT_EQ(refusalOf(couple.columns()), "persons row 1, field sex: 3 is not a whole number of 0 to 2");
}

TEST(FamilyRefuses, textsThatAreNotUtf8) {
    const Couple couple;
    const Texts births{"1880", "18\xff", "", ""};
    FamilyColumns columns = couple.columns();
    columns.persons.birth = std::span(births);
    EXPECT_EQ(refusalOf(columns), "persons row 1, field birth: the text is not valid UTF-8 at byte 2");
}

TEST(FamilyRefuses, spousesListedTwiceAndTwoPreferredOnes) {
    const Couple couple;
    const Ids persons{1, 2, 1};
    Ids spouses{2, 1, 2};
    const Ids preferred{1, 1, 1};
    FamilyColumns columns = couple.columns();
    columns.spouses.person = std::span(persons);
    columns.spouses.spouse = std::span(spouses);
    columns.spouses.preferred = std::span(preferred);
    EXPECT_EQ(refusalOf(columns), "spouses row 2, field spouse: 2 is in the list of person 1 already");
    spouses[2] = 4;
    EXPECT_EQ(refusalOf(columns),
              "spouses row 2, field preferred: 2 is the preferred spouse of person 1 already");
}

TEST(FamilyRefuses, familiesOfPersonsWhoAreNotThere) {
    const Couple couple;
    const Ids numbers{1}, partner{5};
    FamilyColumns columns = couple.columns();
    columns.families.number = std::span(numbers);
    columns.families.partner0 = std::span(partner);
    EXPECT_EQ(refusalOf(columns), "families row 0, field partner0: 5 is not the id of a person");
}

TEST(FamilyRefuses, childrenOfFamiliesThatAreNotThere) {
    const Couple couple;
    const Ids family{1}, child{3};
    FamilyColumns columns = couple.columns();
    columns.familyChildren.family = std::span(family);
    columns.familyChildren.child = std::span(child);
    EXPECT_EQ(refusalOf(columns), "family children row 0, field family: 1 is not the number of a family");
}

TEST(FamilyRefuses, aNumberThatTwoFamiliesHave) {
    const Couple couple;
    const Ids numbers{7, 8, 7}, partner{1, 2, 3};
    FamilyColumns columns = couple.columns();
    columns.families.number = std::span(numbers);
    columns.families.partner0 = std::span(partner);
    EXPECT_EQ(refusalOf(columns), "families row 2, field number: 7 is the number of another row");
}

// Lists of up to sixteen are looked through, longer ones sorted: the row is that of the first repeat in their own order.
TEST(FamilyRefuses, aChildWhoStandsTwiceInOneFamilyInShortListsAndLongOnes) {
    for (const std::int64_t size : {2, 16, 17, 40}) {
        Ids ids, family, children;
        for (std::int64_t id = 1; id <= size; ++id) {
            ids.push_back(id);
            family.push_back(1);
            children.push_back(size + 1 - id);
        }
        children.back() = 2;  // the child at the place before, again
        const Ids numbers{1};
        FamilyColumns columns;
        columns.persons.id = std::span(ids);
        columns.families.number = std::span(numbers);
        columns.familyChildren.family = std::span(family);
        columns.familyChildren.child = std::span(children);
        EXPECT_EQ(refusalOf(columns), "family children row " + std::to_string(size - 1) +
                                          ", field child: 2 is in this family already");
        children.back() = 1;
        EXPECT_EQ(refusalOf(columns), "nothing is refused") << size;
    }
}

TEST(FamilyRefuses, aFieldThatAPersonHasTwiceAndOneWithoutAKey) {
    const Couple couple;
    const Ids persons{2, 1, 2};
    Texts keys{"job", "job", "job"};
    const Texts texts{"smith", "smith", "baker"};
    FamilyColumns columns = couple.columns();
    columns.fields.person = std::span(persons);
    columns.fields.key = std::span(keys);
    columns.fields.text = std::span(texts);
    EXPECT_EQ(refusalOf(columns), "fields row 2, field key: person 2 has this field already");
    keys[2] = "";
    EXPECT_EQ(refusalOf(columns), "fields row 2, field key: the key is empty");
    keys[2] = "trade";
    EXPECT_EQ(refusalOf(columns), "nothing is refused");
}

TEST(FamilyRefuses, moreDifferentKeysThanATableHolds) {
    const Couple couple;
    const std::size_t most = Family::kMostFieldKeys;
    std::vector<std::string> names;
    for (std::size_t i = 0; i <= most; ++i) names.push_back("key " + std::to_string(i));
    const Ids persons(most + 1, 3);
    Texts keys(names.begin(), names.end());
    const Texts texts(most + 1, "x");
    FamilyColumns columns = couple.columns();
    columns.fields.person = std::span(persons);
    columns.fields.key = std::span(keys);
    columns.fields.text = std::span(texts);
    EXPECT_EQ(refusalOf(columns),
              "fields row " + std::to_string(most) + ", field key: there are too many different keys");
}

TEST(FamilyKin, familiesBecomeUnionsAndParentsWithoutOneToo) {
    Couple couple;
    couple.ids = {1, 2, 3, 4, 5};
    couple.fathers = {0, 0, 1, 1, 1};
    couple.mothers = {0, 0, 2, 2, 0};
    couple.sexes = {0, 1, 0, 1, 0};
    const Ids numbers{9}, partners0{1}, partners1{2}, inFamily{9}, child{3}, kinds{2};
    FamilyColumns columns = couple.columns();
    columns.families.number = std::span(numbers);
    columns.families.partner0 = std::span(partners0);
    columns.families.partner1 = std::span(partners1);
    columns.familyChildren.family = std::span(inFamily);
    columns.familyChildren.child = std::span(child);
    columns.familyChildren.kind = std::span(kinds);
    const olvane::kin::KinGraph graph = olvane::kinGraphOf(Family(columns));
    ASSERT_EQ(graph.unionCount(), 2);
    EXPECT_EQ(graph.family(0), 9U);
    EXPECT_THAT(graph.children(0), ElementsAre(2, 3));
    EXPECT_THAT(graph.childKinds(0),
                ElementsAre(olvane::kin::ChildKind::foster, olvane::kin::ChildKind::birth));
    EXPECT_THAT(graph.partners(1), ElementsAre(0, olvane::kin::kNobody));
    EXPECT_THAT(graph.children(1), ElementsAre(4));
    EXPECT_EQ(graph.family(1), 0U);
}

}  // namespace
