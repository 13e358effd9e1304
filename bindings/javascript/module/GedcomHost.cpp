// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A data source's answers as callbacks. What the data source throws is caught where callbacks are called.

#include "GedcomHost.h"

#include <new>
#include <string>
#include <vector>

namespace olvane::js {
namespace {

OlvaneViewerManagerWrapProtocol& sourceOf(void* context) {
    return *static_cast<OlvaneViewerManagerWrapProtocol*>(context);
}

// For answers that take memory.
template <class Answer>
int answered(const Answer& answer) {
    try {
        return answer() == OLVANE_OK ? 0 : kLacksMemory;
    } catch (const std::bad_alloc&) {
        return kLacksMemory;
    }
}

int fatherOf(void* context, std::int64_t person, std::int64_t* parent) {
    *parent = sourceOf(context).fatherForPersonWithID(person);
    return 0;
}

int motherOf(void* context, std::int64_t person, std::int64_t* parent) {
    *parent = sourceOf(context).motherForPersonWithID(person);
    return 0;
}

int spousesOf(void* context, std::int64_t person, olvane_person_list* list) {
    return answered([&] {
        const std::vector<std::int64_t> ids = sourceOf(context).spousesForPersonWithID(person);
        return olvane_person_list_append(list, ids.data(), ids.size());
    });
}

int childrenOf(void* context, std::int64_t person, olvane_person_list* list) {
    return answered([&] {
        const std::vector<std::int64_t> ids = sourceOf(context).childrenForPersonWithID(person);
        return olvane_person_list_append(list, ids.data(), ids.size());
    });
}

int isPreferredSpouse(void* context, std::int64_t person, std::int64_t spouse, int* preferred) {
    *preferred = sourceOf(context).isPreferredSpouse(person, spouse) ? 1 : 0;
    return 0;
}

int isDead(void* context, std::int64_t person, int* dead) {
    *dead = sourceOf(context).isPersonDead(person) ? 1 : 0;
    return 0;
}

int dateOf(void* context, std::int64_t person, int isBirth, olvane_date* date) {
    return answered([&] {
        return olvane_date_set(date, sourceOf(context).dateForPersonWithID(person, isBirth != 0).c_str());
    });
}

int sexOf(void* context, std::int64_t person, std::int32_t* sex) {
    *sex = sourceOf(context).sexOfPersonWithID(person);
    return 0;
}

}  // namespace

olvane_host hostOfSource(OlvaneViewerManagerWrapProtocol& source) {
    return {sizeof(olvane_host), &source,           fatherOf, motherOf, spousesOf,
            childrenOf,          isPreferredSpouse, isDead,   dateOf,   sexOf};
}

}  // namespace olvane::js
