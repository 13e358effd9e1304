// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Any bytes as edits of a family's table, right and wrong ones, beside plain maps that are edited alike. The table refuses
// just what its header says, is left as it was where it refuses, equals the maps after every edit, and copies stay what they were.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <iterator>
#include <string>
#include <string_view>
#include <tuple>
#include <utility>
#include <vector>

#include <olvane/kin/Family.h>
#include <support/PlainFamily.h>

#include "Holds.h"

namespace {

using namespace olvane;
using support::PlainFamily;

typedef std::vector<std::int64_t> Ids;

constexpr std::size_t kMostEdits = 300;
constexpr std::size_t kMostPersons = 40;

class Edits {
public:
    Edits(const std::uint8_t* data, std::size_t size) : data_(data), size_(size) {}

    void run() {
        for (std::size_t edit = 0; edit < kMostEdits && place_ < size_; ++edit) {
            editOnce();
            HOLDS(differenceOf(table_, plain_).empty());
            if (edit % 16 == 0) kept_.emplace_back(table_, plain_);
        }
        for (const auto& [table, plain] : kept_) HOLDS(differenceOf(table, plain).empty());
        HOLDS(kinGraphOf(table_).personCount() == static_cast<kin::Place>(plain_.persons.size()));
    }

private:
    std::size_t below(std::size_t most) { return place_ < size_ ? data_[place_++] % most : 0; }

    // A person's id in most cases; else nobody's, or a number that is no id.
    std::int64_t pick() {
        const std::size_t choice = below(16);
        if (choice == 0) return static_cast<std::int64_t>(below(60));
        if (choice == 1) return kMostId + static_cast<std::int64_t>(below(3)) - 1;
        if (choice == 2) return -static_cast<std::int64_t>(below(3));
        if (plain_.persons.empty()) return 1;
        auto at = plain_.persons.begin();
        std::advance(at, static_cast<std::ptrdiff_t>(below(plain_.persons.size())));
        return at->first;
    }
    std::int64_t pickOrNobody() { return below(3) == 0 ? 0 : pick(); }
    Ids some() {
        Ids ids;
        for (std::size_t count = below(5); count > 0; --count) ids.push_back(pick());
        return ids;
    }

    bool isPerson(std::int64_t id) const { return plain_.persons.count(id) != 0; }
    bool isPersonOrNobody(std::int64_t id) const { return id == 0 || isPerson(id); }
    bool isList(Ids ids) const {
        if (!std::all_of(ids.begin(), ids.end(), [this](std::int64_t id) { return isPerson(id); }))
            return false;
        std::sort(ids.begin(), ids.end());
        return std::adjacent_find(ids.begin(), ids.end()) == ids.end();
    }

    template <class Edit>
    bool isDone(bool isRight, const Edit& edit) {
        bool isRefused = false;
        try {
            edit();
        } catch (const FamilyError&) {
            isRefused = true;
        }
        HOLDS(isRefused != isRight);
        return isRight;
    }

    void editOnce() {
        switch (below(8)) {
            case 0:
            case 1:
                return addPerson();
            case 2:
                return setPerson();
            case 3:
                return removeSomething();
            case 4:
                return setLists();
            case 5:
                return putFamily();
            case 6:
                return setTexts();
            default:
                return undo();
        }
    }

    PersonRow rowOf(std::int64_t id) {
        static const std::string longText(300, 'b');
        constexpr std::string_view kBirths[] = {"", "1850", "18500101", "\xC3\xA9t\xC3\xA9"};
        PersonRow row;
        row.id = id;
        row.father = pickOrNobody();
        row.mother = below(4) == 0 ? id : pickOrNobody();
        row.sex = static_cast<kin::Sex>(below(3));
        row.dead = below(2) == 0;
        const std::size_t birth = below(5);
        row.birth = birth < 4 ? kBirths[birth] : std::string_view(longText);
        if (below(2) == 0) row.deathWritten = "im Mai";
        return row;
    }
    bool areParents(const PersonRow& row) const {
        return (row.father == row.id || isPersonOrNobody(row.father)) &&
               (row.mother == row.id || isPersonOrNobody(row.mother));
    }

    void addPerson() {
        if (plain_.persons.size() >= kMostPersons) return;
        const PersonRow row = rowOf(below(4) == 0 ? pick() : static_cast<std::int64_t>(1 + below(80)));
        const bool isId = row.id >= 1 && row.id <= kMostId;
        const bool isRight = isId && !isPerson(row.id) && areParents(row);
        if (isDone(isRight, [&] { table_.addPerson(row); })) plain_.putPerson(row);
    }

    void setPerson() {
        const PersonRow row = rowOf(pick());
        const bool isRight = isPerson(row.id) && areParents(row);
        if (isDone(isRight, [&] { table_.setPerson(row); })) plain_.putPerson(row);
    }

    void removeSomething() {
        if (below(2) == 0) {
            const std::int64_t id = pick();
            if (isDone(isPerson(id), [&] { table_.removePerson(id); })) plain_.removePerson(id);
            return;
        }
        const auto number = static_cast<std::int64_t>(below(14));
        const bool isThere = plain_.families.count(number) != 0;
        if (isDone(isThere, [&] { table_.removeFamily(number); })) plain_.removeFamily(number);
    }

    void setLists() {
        const std::int64_t id = pick();
        const Ids list = some();
        const bool isRight = isPerson(id) && isList(list);
        if (below(2) == 0) {
            if (isDone(isRight, [&] { table_.setChildren(id, list); })) plain_.persons.at(id).children = list;
            return;
        }
        const std::int64_t preferred = list.empty() || below(3) == 0 ? pickOrNobody() : list.back();
        const bool isOneOfThem =
            preferred == 0 || std::find(list.begin(), list.end(), preferred) != list.end();
        if (!isDone(isRight && isOneOfThem, [&] { table_.setSpouses(id, list, preferred); })) return;
        plain_.persons.at(id).spouses = list;
        plain_.persons.at(id).preferred = preferred;
    }

    void putFamily() {
        FamilyRow row;
        row.number = static_cast<std::int64_t>(below(14));
        row.partner0 = pickOrNobody();
        row.partner1 = pickOrNobody();
        row.state = static_cast<kin::UnionState>(below(4));
        const Ids ids = some();
        std::vector<FamilyChild> children;
        for (const std::int64_t id : ids) children.push_back({id, static_cast<kin::ChildKind>(below(6))});
        const bool isThere = plain_.families.count(row.number) != 0;
        const bool isRight = row.number != 0 && isPersonOrNobody(row.partner0) &&
                             isPersonOrNobody(row.partner1) && isList(ids);
        const bool isSet = below(8) == 0 ? !isThere : isThere;
        const bool isWanted = isRight && isSet == isThere;
        if (isDone(isWanted, [&] {
                if (isSet) table_.setFamily(row, children);
                if (!isSet) table_.addFamily(row, children);
            })) {
            plain_.putFamily(row, children);
        }
    }

    void setTexts() {
        const std::int64_t id = pick();
        const std::string key(below(3), 'k');
        constexpr std::string_view kTexts[] = {"", "x", "\xC3\xA9", "\xC3", std::string_view("a\0b", 3)};
        const std::size_t choice = below(6);
        const std::string text = choice < 5 ? std::string(kTexts[choice]) : std::string(below(256) * 16, 'y');
        const bool isRight = isPerson(id) && choice != 3 && choice != 4;
        if (isDone(isRight && !key.empty(), [&] { table_.setField(id, key, text); })) {
            plain_.persons.at(id).fields.erase(key);
            if (!text.empty()) plain_.persons.at(id).fields[key] = text;
        }
        const NamePart parts[] = {{NameKind::full, "Karl"}, {NameKind::nickname, text}};
        if (isDone(isRight, [&] { table_.setNames(id, parts); }))
            plain_.persons.at(id).names = {"Karl", text};
    }

    void undo() {
        if (!kept_.empty()) std::tie(table_, plain_) = kept_[below(kept_.size())];
    }

    const std::uint8_t* data_;
    std::size_t size_;
    std::size_t place_ = 0;
    Family table_;
    PlainFamily plain_;
    std::vector<std::pair<Family, PlainFamily>> kept_;
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Edits(data, size).run();
    return 0;
}
