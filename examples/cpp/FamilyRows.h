// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/kin/Family.h>

// The rows of two queries, kept as columns until the family is made of them: one run of bytes for each column of
// texts, so that nothing is allocated for a row.
class FamilyRows {
public:
    void addPerson(std::int64_t id, std::int64_t father, std::int64_t mother, std::string_view sex, bool dead,
                   std::string_view birth, std::string_view death, std::string_view name) {
        ids_.push_back(id);
        fathers_.push_back(father);
        mothers_.push_back(mother);
        sexes_.push_back(sex == "M" ? 0 : sex == "F" ? 1 : 2);
        dead_.push_back(dead ? 1 : 0);
        births_.add(birth);
        deaths_.add(death);
        names_.add(name);
    }

    void addCouple(std::int64_t number, std::int64_t husband, std::int64_t wife, std::string_view state,
                   std::string_view day) {
        numbers_.push_back(number);
        husbands_.push_back(husband);
        wives_.push_back(wife);
        states_.push_back(state == "married" ? 0 : state == "divorced" ? 1 : state == "unmarried" ? 2 : 3);
        days_.add(day);
    }

    // Fails: olvane::FamilyError, which names the row and the field that are wrong.
    olvane::Family family() const {
        olvane::FamilyColumns columns;
        columns.persons.id = std::span(ids_);
        columns.persons.father = std::span(fathers_);
        columns.persons.mother = std::span(mothers_);
        columns.persons.sex = std::span(sexes_);
        columns.persons.dead = std::span(dead_);
        columns.persons.birth = births_.column();
        columns.persons.death = deaths_.column();
        columns.families.number = std::span(numbers_);
        columns.families.partner0 = std::span(husbands_);
        columns.families.partner1 = std::span(wives_);
        columns.families.state = std::span(states_);
        columns.families.marriage = days_.column();
        columns.names.person = std::span(ids_);
        columns.names.text = names_.column();
        return olvane::Family(columns);
    }

private:
    class Texts {
    public:
        void add(std::string_view text) {
            bytes_ += text;
            starts_.push_back(static_cast<std::uint32_t>(bytes_.size()));
        }
        olvane::TextColumn column() const { return {bytes_.data(), bytes_.size(), starts_}; }

    private:
        std::string bytes_;
        std::vector<std::uint32_t> starts_{0};
    };

    std::vector<std::int64_t> ids_, fathers_, mothers_, numbers_, husbands_, wives_;
    std::vector<std::uint8_t> sexes_, dead_, states_;
    Texts births_, deaths_, names_, days_;
};
