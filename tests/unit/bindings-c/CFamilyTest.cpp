// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family handed over in C: columns in, the same text as from callbacks out, and errors that name row and field.

#include <algorithm>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane_family.h>

#include <support/FamilyText.h>
#include <unit/bindings-c/CallbackHost.h>

namespace {

struct FamilyDeleter {
    void operator()(olvane_family* family) const { olvane_family_free(family); }
};
typedef std::unique_ptr<olvane_family, FamilyDeleter> FamilyPointer;

olvane_numbers column(const std::vector<std::int64_t>& numbers) {
    return {numbers.data(), numbers.size(), OLVANE_INT64};
}

// A couple 1 and 2 with the children 3 and 4; 5 is the son of 1 alone.
struct Couple {
    std::vector<std::int64_t> ids{1, 2, 3, 4, 5};
    std::vector<std::int64_t> fathers{0, 0, 1, 1, 1};
    std::vector<std::int64_t> mothers{0, OLVANE_PERSON_NOT_FOUND, 2, 2, 0};
    std::vector<std::int64_t> sexes{0, 1, 0, 1, 0};
    std::vector<std::int64_t> numbers{1}, partners0{1}, partners1{2};

    olvane_family_columns columns() const {
        olvane_family_columns columns = {};
        columns.persons.id = column(ids);
        columns.persons.father = column(fathers);
        columns.persons.mother = column(mothers);
        columns.persons.sex = column(sexes);
        columns.families.number = column(numbers);
        columns.families.partner0 = column(partners0);
        columns.families.partner1 = column(partners1);
        return columns;
    }
};

FamilyPointer familyOf(const olvane_family_columns& columns, olvane_status expected = OLVANE_OK) {
    olvane_family* family = nullptr;
    EXPECT_EQ(olvane_family_create(&columns, &family, nullptr), expected);
    return FamilyPointer(family);
}

olvane_family_error refusalOf(const olvane_family_columns& columns) {
    olvane_family* family = nullptr;
    olvane_family_error error = {};
    EXPECT_EQ(olvane_family_create(&columns, &family, &error), OLVANE_REFUSED);
    EXPECT_EQ(family, nullptr);
    return error;
}

std::string viewOf(const olvane_family* family, std::int32_t view, std::int64_t focus,
                   olvane_status expected = OLVANE_OK) {
    olvane_layout* layout = nullptr;
    EXPECT_EQ(olvane_view(family, view, focus, nullptr, &layout), expected);
    const unit::LayoutPointer owner(layout);
    const char* text = "";
    if (layout) olvane_layout_text(layout, &text, nullptr);
    return text;
}

std::vector<std::uint32_t> childrenOf(const olvane_family* family, std::int64_t id) {
    olvane_person person = {};
    EXPECT_EQ(olvane_family_person(family, id, &person), OLVANE_OK);
    return {person.children, person.children + person.child_count};
}

TEST(CFamily, hasTheTextOfAHostWithTheSameAnswers) {
    const support::CaseFile input = support::family("1+2: 3 4f; 1: 5");
    const Couple couple;
    const FamilyPointer family = familyOf(couple.columns());
    for (std::int64_t focus = 1; focus <= 5; ++focus) {
        support::CaseFile request = input;
        request.focus = focus;
        unit::CallbackHost host(request);
        const olvane_host callbacks = host.callbacks();
        const unit::Answer asFamily = unit::familyOf(callbacks, focus);
        const unit::Answer asPedigree = unit::pedigreeOf(callbacks, focus);
        EXPECT_NE(asFamily.text(), "");
        EXPECT_EQ(viewOf(family.get(), OLVANE_VIEW_FAMILY, focus), asFamily.text());
        EXPECT_EQ(viewOf(family.get(), OLVANE_VIEW_PEDIGREE, focus), asPedigree.text());
    }
}

TEST(CFamily, anErrorNamesTableRowAndField) {
    Couple couple;
    couple.mothers[3] = 99;
    const olvane_family_error error = refusalOf(couple.columns());
    EXPECT_EQ(error.table, OLVANE_TABLE_PERSONS);
    EXPECT_EQ(error.row, 3U);
    EXPECT_STREQ(error.field, "mother");
    EXPECT_STREQ(error.message, "persons row 3, field mother: 99 is not the id of a person");
}

TEST(CFamily, idsThatDoNotFitAreRefused) {
    for (const std::int64_t id :
         {(std::int64_t{1} << 32) + 4, (std::int64_t{1} << 53) + 1, std::int64_t{0}}) {
        Couple couple;
        couple.ids[0] = id;
        EXPECT_EQ(refusalOf(couple.columns()).row, 0U);
    }
}

TEST(CFamily, aFocusWhoIsNotThereIsRefused) {
    const Couple couple;
    const FamilyPointer family = familyOf(couple.columns());
    EXPECT_EQ(viewOf(family.get(), OLVANE_VIEW_FAMILY, (std::int64_t{1} << 32) + 1, OLVANE_INVALID_PERSON),
              "");
    EXPECT_EQ(viewOf(family.get(), OLVANE_VIEW_FAMILY, 6, OLVANE_INVALID_PERSON), "");
    EXPECT_EQ(viewOf(family.get(), 2, 1, OLVANE_INVALID_ARGUMENT), "");
}

TEST(CFamily, textsComeInThreeForms) {
    const Couple couple;
    olvane_family_columns columns = couple.columns();
    const char* const births[] = {"1880", nullptr, "1901", "", "1905"};
    const char ended[] = "x\0\0yy\0\0z";  // the last one is ended by the literal
    const char run[] = "abcd";
    const std::uint32_t starts[] = {0, 1, 1, 3, 3, 4};
    columns.persons.birth = {births, nullptr, nullptr, 0, 5};
    columns.persons.death = {nullptr, ended, nullptr, sizeof ended, 5};
    columns.persons.death_written = {nullptr, run, starts, 4, 5};
    const FamilyPointer family = familyOf(columns);
    olvane_person person = {};
    ASSERT_EQ(olvane_family_person(family.get(), 3, &person), OLVANE_OK);
    EXPECT_EQ(std::string(person.birth.bytes, person.birth.length), "1901");
    EXPECT_EQ(std::string(person.death.bytes, person.death.length), "yy");
    EXPECT_EQ(std::string(person.death_written.bytes, person.death_written.length), "bc");
    columns.persons.death.length = 3;
    EXPECT_STREQ(refusalOf(columns).message, "persons, field death: the column has 2 rows, and id has 5");
}

TEST(CFamily, editsChangeOneCopyAlone) {
    const Couple couple;
    const FamilyPointer family = familyOf(couple.columns());
    olvane_family* copy = nullptr;
    ASSERT_EQ(olvane_family_copy(family.get(), &copy), OLVANE_OK);
    const FamilyPointer before(copy);
    const olvane_person_row row = {6, 3, 0, 1, 0, "1930", nullptr, nullptr, nullptr};
    olvane_family_error error = {};
    EXPECT_EQ(olvane_family_add_person(family.get(), &row, &error), OLVANE_OK);
    EXPECT_EQ(childrenOf(family.get(), 3), std::vector<std::uint32_t>{6});
    EXPECT_EQ(childrenOf(before.get(), 3), std::vector<std::uint32_t>());
    EXPECT_EQ(olvane_family_person_count(before.get()), 5U);
    EXPECT_EQ(olvane_family_add_person(family.get(), &row, &error), OLVANE_REFUSED);
    EXPECT_STREQ(error.message, "person 6, field id: 6 is the id of another person");
    EXPECT_EQ(olvane_family_remove_person(family.get(), 1, &error), OLVANE_OK);
    EXPECT_EQ(viewOf(family.get(), OLVANE_VIEW_FAMILY, 1, OLVANE_INVALID_PERSON), "");
    EXPECT_NE(viewOf(before.get(), OLVANE_VIEW_FAMILY, 1), "");
}

TEST(CFamily, namesFieldsAndFamiliesAreReadBack) {
    const Couple couple;
    const FamilyPointer family = familyOf(couple.columns());
    const olvane_name_part names[] = {{0, "Anna Berg"}, {2, "Berg"}};
    EXPECT_EQ(olvane_family_set_names(family.get(), 2, names, 2, nullptr), OLVANE_OK);
    EXPECT_EQ(olvane_family_set_field(family.get(), 2, "job", "smith", nullptr), OLVANE_OK);
    std::int32_t kind = 0;
    olvane_text key = {};
    olvane_text text = {};
    EXPECT_EQ(olvane_family_name_at(family.get(), 2, 1, &kind, &text), OLVANE_OK);
    EXPECT_EQ(kind, 2);
    EXPECT_EQ(std::string(text.bytes, text.length), "Berg");
    EXPECT_EQ(olvane_family_name_at(family.get(), 2, 2, &kind, &text), OLVANE_INVALID_ARGUMENT);
    EXPECT_EQ(olvane_family_field_at(family.get(), 2, 0, &key, &text), OLVANE_OK);
    EXPECT_EQ(std::string(key.bytes, key.length), "job");
    const olvane_family_row row = {7, 1, 2, 1, "1900", nullptr, "Ulm"};
    const olvane_family_child child = {4, 1};
    EXPECT_EQ(olvane_family_add_family(family.get(), &row, &child, 1, nullptr), OLVANE_OK);
    std::int32_t state = 0;
    EXPECT_EQ(olvane_family_family(family.get(), 7, nullptr, nullptr, &state, nullptr, nullptr, &text),
              OLVANE_OK);
    EXPECT_EQ(state, 1);
    EXPECT_EQ(std::string(text.bytes, text.length), "Ulm");
    olvane_family_child read = {};
    std::size_t count = 0;
    EXPECT_EQ(olvane_family_family_children(family.get(), 7, &read, 1, &count), OLVANE_OK);
    EXPECT_EQ(count, 1U);
    EXPECT_EQ(read.child, 4);
    EXPECT_EQ(read.kind, 1);
}

TEST(CFamily, nullPointersAreRefused) {
    EXPECT_EQ(olvane_family_create(nullptr, nullptr, nullptr), OLVANE_INVALID_ARGUMENT);
    EXPECT_EQ(olvane_family_remove_person(nullptr, 1, nullptr), OLVANE_INVALID_ARGUMENT);
    EXPECT_EQ(olvane_view(nullptr, OLVANE_VIEW_FAMILY, 1, nullptr, nullptr), OLVANE_INVALID_ARGUMENT);
    EXPECT_EQ(olvane_family_person_count(nullptr), 0U);
    olvane_family_free(nullptr);
    const FamilyPointer empty([] {
        olvane_family* family = nullptr;
        olvane_family_create(nullptr, &family, nullptr);
        return family;
    }());
    EXPECT_EQ(olvane_family_person_count(empty.get()), 0U);
}

}  // namespace
