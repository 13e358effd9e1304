// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The table of a family in the module's memory: columns are filled one after the other and handed over in one call;
// edits come as one run of numbers and one of texts; what is read goes out as JSON, in the order that family.mjs reads.

#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <exception>
#include <memory>
#include <new>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/kin/Family.h>
#include <olvane/source/FamilyGedcom.h>

#include "HeldFamily.h"
#include "JsonText.h"
#include "LayoutAnswer.h"
#include "SearchJson.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

// Columns on their way in. JavaScript gives each a place to be written to, which lives as long as this object.
struct ColumnsInMaking {
    FamilyColumns columns;
    std::vector<std::unique_ptr<char[]>> places;
    std::vector<std::unique_ptr<std::vector<std::string_view>>> texts;
};

std::array<NumberColumn*, 20> numberColumns(FamilyColumns& to) {
    return {&to.persons.id,           &to.persons.father,      &to.persons.mother,
            &to.persons.sex,          &to.persons.dead,        &to.spouses.person,
            &to.spouses.spouse,       &to.spouses.preferred,   &to.children.parent,
            &to.children.child,       &to.families.number,     &to.families.partner0,
            &to.families.partner1,    &to.families.state,      &to.familyChildren.family,
            &to.familyChildren.child, &to.familyChildren.kind, &to.names.person,
            &to.names.kind,           &to.fields.person};
}

std::array<TextColumn*, 10> textColumns(FamilyColumns& to) {
    return {&to.persons.birth,
            &to.persons.death,
            &to.persons.birthWritten,
            &to.persons.deathWritten,
            &to.families.marriage,
            &to.families.marriageWritten,
            &to.families.marriagePlace,
            &to.names.text,
            &to.fields.key,
            &to.fields.text};
}

// What the last call had to say: JSON that was asked for, or why something was refused.
std::string lastFamilyJson;
// Ids that were asked for last.
std::vector<FamilyId> lastIds;

// 0, or the number of what went wrong: 1 for rows that were refused, with the error as JSON, 2 where memory is short.
constexpr int kRefused = 1;
constexpr int kLacksMemory = 2;

void writeRefusal(const FamilyError& error) {
    JsonText json;
    json.begin();
    json.string(error.what());
    json.string(familyTableName(error.table()));
    json.number(error.row() == FamilyError::kNoRow ? -1 : static_cast<long long>(error.row()));
    json.number(error.id());
    json.string(error.field());
    json.end();
    lastFamilyJson = std::move(json).take();
}

template <class Work>
int outcomeOf(const Work& work) {
    try {
        work();
        return 0;
    } catch (const FamilyError& error) {
        writeRefusal(error);
        return kRefused;
    } catch (const std::exception&) {
        return kLacksMemory;
    }
}

// An edit's numbers and texts, each taken in turn. JavaScript hands over whole numbers.
class Values {
public:
    Values(const double* numbers, std::size_t count, const char* texts)
        : numbers_(numbers, count), texts_(texts) {}

    bool hasNumber() const { return next_ < numbers_.size(); }
    std::int64_t number() { return static_cast<std::int64_t>(numbers_[next_++]); }
    template <class Choice>
    Choice choice() {
        const std::int64_t number_ = number();
        return static_cast<Choice>(number_ >= 0 && number_ < 255 ? number_ : 255);
    }
    std::vector<std::int64_t> numbers() {
        std::vector<std::int64_t> rest;
        while (hasNumber()) rest.push_back(number());
        return rest;
    }
    // Each ends with a zero byte.
    std::string_view text() {
        const std::string_view text_(texts_);
        texts_ += text_.size() + 1;
        return text_;
    }

private:
    std::span<const double> numbers_;
    std::size_t next_ = 0;
    const char* texts_;
};

PersonRow personFrom(Values& values) {
    PersonRow row;
    row.id = values.number();
    row.father = values.number();
    row.mother = values.number();
    row.sex = values.choice<kin::Sex>();
    row.dead = values.number() != 0;
    row.birth = values.text();
    row.death = values.text();
    row.birthWritten = values.text();
    row.deathWritten = values.text();
    return row;
}

FamilyRow familyFrom(Values& values) {
    FamilyRow row;
    row.number = values.number();
    row.partner0 = values.number();
    row.partner1 = values.number();
    row.state = values.choice<kin::UnionState>();
    row.marriage = values.text();
    row.marriageWritten = values.text();
    row.marriagePlace = values.text();
    return row;
}

std::vector<FamilyChild> childrenFrom(Values& values) {
    std::vector<FamilyChild> children;
    while (values.hasNumber()) {
        const std::int64_t child = values.number();
        children.push_back({child, values.choice<kin::ChildKind>()});
    }
    return children;
}

void setNames(Family& table, Values& values) {
    const std::int64_t id = values.number();
    std::vector<NamePart> names;
    while (values.hasNumber()) {
        const auto kind = values.choice<NameKind>();
        names.push_back({kind, values.text()});
    }
    table.setNames(id, names);
}

enum class Edit {
    addPerson,
    setPerson,
    removePerson,
    setSpouses,
    setChildren,
    setNames,
    setField,
    addFamily,
    setFamily,
    removeFamily
};

void change(Family& table, Edit edit, Values& values) {
    switch (edit) {
        case Edit::addPerson:
            return table.addPerson(personFrom(values));
        case Edit::setPerson:
            return table.setPerson(personFrom(values));
        case Edit::removePerson:
            return table.removePerson(values.number());
        case Edit::setSpouses: {
            const std::int64_t id = values.number();
            const std::int64_t preferred = values.number();
            return table.setSpouses(id, values.numbers(), preferred);
        }
        case Edit::setChildren: {
            const std::int64_t id = values.number();
            return table.setChildren(id, values.numbers());
        }
        case Edit::setNames:
            return setNames(table, values);
        case Edit::setField: {
            const std::string_view key = values.text();
            return table.setField(values.number(), key, values.text());
        }
        case Edit::addFamily: {
            const FamilyRow row = familyFrom(values);
            return table.addFamily(row, childrenFrom(values));
        }
        case Edit::setFamily: {
            const FamilyRow row = familyFrom(values);
            return table.setFamily(row, childrenFrom(values));
        }
        case Edit::removeFamily:
            return table.removeFamily(values.number());
    }
}

template <class Ids>
void writeIds(JsonText& json, const Ids& ids) {
    json.begin();
    for (const auto id : ids) json.number(id);
    json.end();
}

void writePerson(JsonText& json, const Family& table, std::int64_t id) {
    const PersonRow row = table.person(id);
    json.number(row.father);
    json.number(row.mother);
    json.number(static_cast<int>(row.sex));
    json.number(row.dead ? 1 : 0);
    json.string(row.birth);
    json.string(row.death);
    json.string(row.birthWritten);
    json.string(row.deathWritten);
    writeIds(json, table.spouses(id));
    json.number(table.preferredSpouse(id));
    writeIds(json, table.children(id));
    json.begin();
    for (const NamePart& part : table.names(id)) {
        json.number(static_cast<int>(part.kind));
        json.string(part.text);
    }
    json.end();
    json.begin();
    for (const LabelField& field : table.fields(id)) {
        json.string(field.key);
        json.string(field.text);
    }
    json.end();
}

void writeFamily(JsonText& json, const Family& table, std::int64_t number) {
    const FamilyRow row = table.family(number);
    json.number(row.partner0);
    json.number(row.partner1);
    json.number(static_cast<int>(row.state));
    json.string(row.marriage);
    json.string(row.marriageWritten);
    json.string(row.marriagePlace);
    json.begin();
    for (const FamilyChild& child : table.familyChildren(number)) {
        json.number(child.child);
        json.number(static_cast<int>(child.kind));
    }
    json.end();
}

// The JSON that write gives; null where there is no such person or family, or no memory.
template <class Write>
const char* jsonOrNull(const Write& write) {
    try {
        JsonText json;
        json.begin();
        write(json);
        json.end();
        lastFamilyJson = std::move(json).take();
        return lastFamilyJson.c_str();
    } catch (const std::exception&) {
        return nullptr;
    }
}

void layOutFamily(HeldFamily& family, View view, double focus, bool withText, LayoutAnswer& answer) {
    if (family.table.hasPerson(static_cast<std::int64_t>(focus)))
        layOutSource([&family] { return family.asSource(); }, view, focus, withText, answer);
    else
        answer.status = OLVANE_INVALID_PERSON;
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;
using js::ColumnsInMaking;
using js::HeldFamily;

OLVANE_EXPORT("family_columns") ColumnsInMaking* familyColumns() {
    return new (std::nothrow) ColumnsInMaking;
}

OLVANE_EXPORT("family_columns_free") void familyColumnsFree(ColumnsInMaking* columns) {
    delete columns;
}

// Where JavaScript writes the bytes of a column; null where memory is short.
OLVANE_EXPORT("family_place") char* familyPlace(ColumnsInMaking* columns, std::size_t bytes) {
    try {
        // Zeros behind the bytes align the next place and end the last text.
        return columns->places.emplace_back(new char[bytes + 8]).get();
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}

// The column of that number is what was written to place.
OLVANE_EXPORT("family_numbers")
void familyNumbers(ColumnsInMaking* columns, std::size_t column, int type, const char* place,
                   std::size_t count) {
    *js::numberColumns(columns->columns)[column] =
        NumberColumn(static_cast<NumberColumn::Type>(type), place, count);
}

// The texts at place, each ended by a zero byte. 0, or 2 where memory is short.
OLVANE_EXPORT("family_texts")
int familyTexts(ColumnsInMaking* columns, std::size_t column, const char* place, std::size_t count) {
    return js::outcomeOf([&] {
        auto texts = std::make_unique<std::vector<std::string_view>>();
        texts->reserve(count);
        for (const char* at = place; texts->size() < count; at += texts->back().size() + 1)
            texts->emplace_back(at);
        *js::textColumns(columns->columns)[column] = std::span<const std::string_view>(*texts);
        columns->texts.push_back(std::move(texts));
    });
}

// 0 with the family in *family; 1 with an error in last_family_text; 2 where memory is short.
OLVANE_EXPORT("family_create") int familyCreate(const ColumnsInMaking* columns, HeldFamily** family) {
    *family = nullptr;
    return js::outcomeOf([&] { *family = new HeldFamily{Family(columns->columns)}; });
}

OLVANE_EXPORT("family_copy") HeldFamily* familyCopy(const HeldFamily* family) {
    return new (std::nothrow) HeldFamily{family->table};
}

OLVANE_EXPORT("family_free") void familyFree(HeldFamily* family) {
    delete family;
}

OLVANE_EXPORT("last_family_text") const char* lastFamilyText() {
    return js::lastFamilyJson.c_str();
}

OLVANE_EXPORT("family_edit")
int familyEdit(HeldFamily* family, int edit, const double* numbers, std::size_t count, const char* texts) {
    family->forgetWhatWasMade();
    return js::outcomeOf([&] {
        js::Values values(numbers, count, texts);
        js::change(family->table, static_cast<js::Edit>(edit), values);
    });
}

OLVANE_EXPORT("family_size") std::size_t familySize(const HeldFamily* family) {
    return family->table.personCount();
}

OLVANE_EXPORT("family_memory") std::size_t familyMemory(const HeldFamily* family) {
    return family->table.memoryBytes();
}

OLVANE_EXPORT("family_has") int familyHas(const HeldFamily* family, double id) {
    return family->table.hasPerson(static_cast<std::int64_t>(id)) ? 1 : 0;
}

// Null where memory is short.
OLVANE_EXPORT("family_ids") const std::uint32_t* familyIds(const HeldFamily* family, int ofFamilies) {
    static const std::uint32_t none = 0;
    try {
        js::lastIds = ofFamilies != 0 ? family->table.familyNumbers() : family->table.personIds();
        return js::lastIds.empty() ? &none : js::lastIds.data();
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}

OLVANE_EXPORT("family_ids_count") std::size_t familyIdsCount() {
    return js::lastIds.size();
}

OLVANE_EXPORT("family_person") const char* familyPerson(const HeldFamily* family, double id) {
    return js::jsonOrNull(
        [&](js::JsonText& json) { js::writePerson(json, family->table, static_cast<std::int64_t>(id)); });
}

OLVANE_EXPORT("family_family") const char* familyFamily(const HeldFamily* family, double number) {
    return js::jsonOrNull(
        [&](js::JsonText& json) { js::writeFamily(json, family->table, static_cast<std::int64_t>(number)); });
}

// The first search after an edit makes the index. Null where memory is short.
OLVANE_EXPORT("family_search")
const char* familySearch(HeldFamily* family, const char* text, std::size_t limit) {
    try {
        const kin::FamilySearchTexts texts(family->table);
        js::lastFamilyJson = js::searchJson(family->index(), texts, text, limit);
        return js::lastFamilyJson.c_str();
    } catch (const std::exception&) {
        return nullptr;
    }
}

// The table as a GEDCOM file. Null where memory is short.
OLVANE_EXPORT("family_gedcom") const char* familyGedcom(const HeldFamily* family) {
    try {
        js::lastFamilyJson = gedcom::gedcomTextOf(family->table);
        return js::lastFamilyJson.c_str();
    } catch (const std::exception&) {
        return nullptr;
    }
}

OLVANE_EXPORT("family_layout")
js::LayoutAnswer* familyLayout(HeldFamily* family, int view, double focus, int withText) {
    try {
        auto answer = std::make_unique<js::LayoutAnswer>();
        js::layOutFamily(*family, static_cast<js::View>(view), focus, withText != 0, *answer);
        return answer.release();
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}
