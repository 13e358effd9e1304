// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The table of a family in the module's memory: what is read goes out as JSON, in the order that family.mjs reads.

#include <cstddef>
#include <cstdint>
#include <exception>
#include <memory>
#include <new>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/kin/Family.h>
#include <olvane/source/GedcomFamily.h>

#include "FamilyOutcome.h"
#include "HeldFamily.h"
#include "JsonText.h"
#include "LayoutAnswer.h"
#include "SearchJson.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

// Ids that were asked for last.
std::vector<FamilyId> lastIds;

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
        lastFamilyText = std::move(json).take();
        return lastFamilyText.c_str();
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
using js::HeldFamily;

OLVANE_EXPORT("family_copy") HeldFamily* familyCopy(const HeldFamily* family) {
    return new (std::nothrow) HeldFamily{family->table};
}

OLVANE_EXPORT("family_free") void familyFree(HeldFamily* family) {
    delete family;
}

OLVANE_EXPORT("last_family_text") const char* lastFamilyText() {
    return js::lastFamilyText.c_str();
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
        js::lastFamilyText = js::searchJson(family->index(), texts, text, limit);
        return js::lastFamilyText.c_str();
    } catch (const std::exception&) {
        return nullptr;
    }
}

// The table as a GEDCOM file. Null where memory is short.
OLVANE_EXPORT("family_gedcom") const char* familyGedcom(const HeldFamily* family) {
    try {
        js::lastFamilyText = gedcom::gedcomTextOf(family->table);
        return js::lastFamilyText.c_str();
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
