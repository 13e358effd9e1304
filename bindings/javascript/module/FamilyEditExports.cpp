// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Edits of a table: each comes as one run of numbers and one of texts, in the order in which family.mjs writes them.

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include <olvane/kin/Family.h>

#include "FamilyOutcome.h"
#include "HeldFamily.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

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

}  // namespace
}  // namespace olvane::js

using namespace olvane;

OLVANE_EXPORT("family_edit")
int familyEdit(js::HeldFamily* family, int edit, const double* numbers, std::size_t count,
               const char* texts) {
    family->forgetWhatWasMade();
    return js::outcomeOf([&] {
        js::Values values(numbers, count, texts);
        js::change(family->table, static_cast<js::Edit>(edit), values);
    });
}
