// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The eight questions as imports of the module. Lists and texts come back by exports that JavaScript calls
// while it answers, so that neither side looks into the other's memory for more than bytes.

#include "HostImports.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <string>

#define OLVANE_IMPORT(name) __attribute__((import_module("olvane"), import_name(name)))
#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

extern "C" {
// Not-a-number says that the host failed, and infinity that it knows no such person.
OLVANE_IMPORT("father_of") double olvaneJsFatherOf(double person);
OLVANE_IMPORT("mother_of") double olvaneJsMotherOf(double person);
// The others give 0, or another number if the host failed.
OLVANE_IMPORT("spouses_of") int olvaneJsSpousesOf(double person, olvane_person_list* spouses);
OLVANE_IMPORT("children_of") int olvaneJsChildrenOf(double person, olvane_person_list* children);
OLVANE_IMPORT("is_preferred_spouse")
int olvaneJsIsPreferredSpouse(double person, double spouse, int* preferred);
OLVANE_IMPORT("is_dead") int olvaneJsIsDead(double person, int* dead);
OLVANE_IMPORT("date_of") int olvaneJsDateOf(double person, int isBirth, olvane_date* date);
OLVANE_IMPORT("sex_of") int olvaneJsSexOf(double person, int* sex);
}

OLVANE_EXPORT("append_person") int appendPerson(olvane_person_list* list, double id) {
    const auto whole = static_cast<std::int64_t>(id);
    return olvane_person_list_append(list, &whole, 1);
}

// The first character of a date, which is all that the engine looks at, as its number in Unicode.
OLVANE_EXPORT("set_date") int setDate(olvane_date* date, std::uint32_t character) {
    const std::uint32_t code =
        character >= 0xD800 && character < 0xE000 ? 0xFFFD : character;  // no half of a pair
    char text[5] = {};
    char* end = text;
    if (code < 0x80) {
        *end++ = static_cast<char>(code);
    } else if (code < 0x800) {
        *end++ = static_cast<char>(0xC0 | code >> 6);
    } else if (code < 0x10000) {
        *end++ = static_cast<char>(0xE0 | code >> 12);
        *end++ = static_cast<char>(0x80 | (code >> 6 & 0x3F));
    } else {
        *end++ = static_cast<char>(0xF0 | code >> 18);
        *end++ = static_cast<char>(0x80 | (code >> 12 & 0x3F));
        *end++ = static_cast<char>(0x80 | (code >> 6 & 0x3F));
    }
    if (code >= 0x80) *end = static_cast<char>(0x80 | (code & 0x3F));
    return olvane_date_set(date, text);
}

namespace olvane::js {
namespace {

constexpr int kFailed = 1;

double asDouble(std::int64_t id) {
    return static_cast<double>(id);
}

int parentFrom(double answer, std::int64_t* parent) {
    if (std::isnan(answer)) return kFailed;
    if (!std::isinf(answer)) *parent = static_cast<std::int64_t>(answer);
    return 0;
}

int fatherOf(void*, std::int64_t person, std::int64_t* parent) {
    return parentFrom(olvaneJsFatherOf(asDouble(person)), parent);
}

int motherOf(void*, std::int64_t person, std::int64_t* parent) {
    return parentFrom(olvaneJsMotherOf(asDouble(person)), parent);
}

int spousesOf(void*, std::int64_t person, olvane_person_list* spouses) {
    return olvaneJsSpousesOf(asDouble(person), spouses);
}

int childrenOf(void*, std::int64_t person, olvane_person_list* children) {
    return olvaneJsChildrenOf(asDouble(person), children);
}

int isPreferredSpouse(void*, std::int64_t person, std::int64_t spouse, int* preferred) {
    return olvaneJsIsPreferredSpouse(asDouble(person), asDouble(spouse), preferred);
}

int isDead(void*, std::int64_t person, int* dead) {
    return olvaneJsIsDead(asDouble(person), dead);
}

int dateOf(void*, std::int64_t person, int isBirth, olvane_date* date) {
    return olvaneJsDateOf(asDouble(person), isBirth, date);
}

int sexOf(void*, std::int64_t person, std::int32_t* sex) {
    int answer = 0;
    const int failure = olvaneJsSexOf(asDouble(person), &answer);
    *sex = answer;
    return failure;
}

}  // namespace

olvane_host hostOfJavaScript() {
    return {sizeof(olvane_host), nullptr,           fatherOf, motherOf, spousesOf,
            childrenOf,          isPreferredSpouse, isDead,   dateOf,   sexOf};
}

}  // namespace olvane::js
