// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The callbacks of a host as a data source for the length of a call. A failure that one of them reports travels through the
// engine as an exception, which the entry of the call makes a status.

#include "HostSource.h"

#include <cstdint>
#include <new>
#include <string>
#include <utility>
#include <vector>

// The opaque answers are what the engine takes, so nothing is copied twice. An append that found no memory is
// remembered: a callback that does not look at its status must not hand in a shorter list unnoticed.
struct olvane_person_list {
    std::vector<std::int64_t> ids;
    bool lacksMemory = false;
};

struct olvane_date {
    std::string text;
    bool lacksMemory = false;
};

namespace {

using olvane::c::HostFailure;
using olvane::c::WrongId;

constexpr int kThrownCode = -1;

// The operation and the person that a failure is about: "spouses_of(17)".
struct Question {
    const char* operation;
    std::int64_t person;

    std::string text() const { return std::string(operation) + "(" + std::to_string(person) + ")"; }
};

// A data source that asks C callbacks.
class CallbackManager final : public OlvaneViewerManagerWrapProtocol {
public:
    explicit CallbackManager(const olvane_host& host) : host_(host) {}

    std::int64_t fatherForPersonWithID(std::int64_t personId) override {
        return parentFrom(host_.father_of, {"father_of", personId});
    }

    std::int64_t motherForPersonWithID(std::int64_t personId) override {
        return parentFrom(host_.mother_of, {"mother_of", personId});
    }

    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override {
        return listFrom(host_.spouses_of, {"spouses_of", personId});
    }

    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override {
        return listFrom(host_.children_of, {"children_of", personId});
    }

    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override {
        int preferred = 0;
        ask({"is_preferred_spouse", personId},
            [&] { return host_.is_preferred_spouse(host_.context, personId, spouseId, &preferred); });
        return preferred != 0;
    }

    bool isPersonDead(std::int64_t personId) override {
        int dead = 0;
        ask({"is_dead", personId}, [&] { return host_.is_dead(host_.context, personId, &dead); });
        return dead != 0;
    }

    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override {
        olvane_date date;
        askInto(date, {"date_of", personId},
                [&] { return host_.date_of(host_.context, personId, isBirth ? 1 : 0, &date); });
        return std::move(date.text);
    }

    std::int32_t sexOfPersonWithID(std::int64_t personId) override {
        std::int32_t sex = 0;
        ask({"sex_of", personId}, [&] { return host_.sex_of(host_.context, personId, &sex); });
        return sex;
    }

private:
    typedef int (*ParentCallback)(void*, std::int64_t, std::int64_t*);
    typedef int (*ListCallback)(void*, std::int64_t, olvane_person_list*);

    // A callback in C++ may throw in spite of the rule.
    template <class Call>
    static void ask(const Question& question, const Call& call) {
        int code = kThrownCode;
        bool hasThrown = false;
        try {
            code = call();
        } catch (...) {
            hasThrown = true;
        }
        if (hasThrown) throw HostFailure{kThrownCode, question.text() + " threw an exception"};
        if (code != 0) throw HostFailure{code, question.text() + " returned " + std::to_string(code)};
    }

    // For the opaque answers. One that found no memory is why the callback failed, if it did.
    template <class OpaqueAnswer, class Call>
    static void askInto(const OpaqueAnswer& answer, const Question& question, const Call& call) {
        try {
            ask(question, call);
        } catch (const HostFailure&) {
            if (!answer.lacksMemory) throw;
        }
        if (answer.lacksMemory) throw std::bad_alloc();
    }

    // The engine would cut any other number to 32 bits, and draw another person.
    static void checkId(const Question& question, std::int64_t id) {
        if (olvane::c::isPersonId(id)) return;
        throw WrongId{question.text() + " answered " + std::to_string(id) +
                      ", which is no id: ids are 1 to 2147483647"};
    }

    std::int64_t parentFrom(ParentCallback callback, const Question& question) const {
        std::int64_t parent = kPersonNotFound;
        ask(question, [&] { return callback(host_.context, question.person, &parent); });
        if (parent != kPersonNotFound) checkId(question, parent);
        return parent;
    }

    std::vector<std::int64_t> listFrom(ListCallback callback, const Question& question) const {
        olvane_person_list list;
        askInto(list, question, [&] { return callback(host_.context, question.person, &list); });
        for (const std::int64_t id : list.ids) checkId(question, id);
        return std::move(list.ids);
    }

    const olvane_host& host_;
};

}  // namespace

bool olvane::c::isComplete(const olvane_host& host) {
    return host.struct_size == sizeof(olvane_host) && host.father_of && host.mother_of && host.spouses_of &&
           host.children_of && host.is_preferred_spouse && host.is_dead && host.date_of && host.sex_of;
}

std::shared_ptr<OlvaneViewerManagerWrapProtocol> olvane::c::sourceOf(const olvane_host& host) {
    return std::make_shared<CallbackManager>(host);
}

olvane_status olvane_person_list_append(olvane_person_list* list, const int64_t* ids, size_t count) {
    if (!list || (!ids && count > 0)) return OLVANE_INVALID_ARGUMENT;
    try {
        list->ids.insert(list->ids.end(), ids, ids + count);
    } catch (...) {
        list->lacksMemory = true;
        return OLVANE_OUT_OF_MEMORY;
    }
    return OLVANE_OK;
}

olvane_status olvane_date_set(olvane_date* date, const char* text) {
    if (!date) return OLVANE_INVALID_ARGUMENT;
    try {
        date->text = text ? text : "";
    } catch (...) {
        date->lacksMemory = true;
        return OLVANE_OUT_OF_MEMORY;
    }
    return OLVANE_OK;
}
