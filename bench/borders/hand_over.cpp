// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// hand_over PERSONS: how long a family takes on its way into the table from C, how much memory it takes there, and what
// a copy and an edit after it cost. Persons have parents, two dates, a spouse and two children; names are added apart.
//
// Prints one line for each: what, the figure, and its unit.

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include <olvane_family.h>

namespace {

constexpr int kRounds = 5;

typedef std::unique_ptr<olvane_family, void (*)(olvane_family*)> FamilyPointer;

// Couples of odd and even ids; each couple has two children, who marry in from further couples.
struct Columns {
    std::vector<std::int64_t> ids, fathers, mothers;
    std::vector<std::uint8_t> sexes, dead;
    std::vector<std::int64_t> numbers, husbands, wives;
    std::string births, deaths, names;

    explicit Columns(std::int64_t persons) {
        for (std::int64_t id = 1; id <= persons; ++id) {
            const std::int64_t couple = (id + 1) / 2;
            const std::int64_t father = couple > 1 ? (couple / 2) * 2 - 1 : 0;
            ids.push_back(id);
            fathers.push_back(father);
            mothers.push_back(father == 0 ? 0 : father + 1);
            sexes.push_back(id % 2 == 1 ? 0 : 1);
            dead.push_back(1);
            births += std::to_string(1000 + couple % 900) + "-01-" + std::to_string(10 + couple % 18) + '\0';
            deaths += std::to_string(1060 + couple % 900) + "-07-" + std::to_string(10 + couple % 18) + '\0';
            names += "Person " + std::to_string(id) + '\0';
        }
        for (std::int64_t number = 1; number <= persons / 2; ++number) {
            numbers.push_back(number);
            husbands.push_back(2 * number - 1);
            wives.push_back(2 * number);
        }
    }

    olvane_family_columns columns(bool withNames) const {
        const auto numbers_ = [](const std::vector<std::int64_t>& column) {
            return olvane_numbers{column.data(), column.size(), OLVANE_INT64};
        };
        const auto bytes = [](const std::vector<std::uint8_t>& column) {
            return olvane_numbers{column.data(), column.size(), OLVANE_UINT8};
        };
        const auto texts = [this](const std::string& column) {
            return olvane_texts{nullptr, column.data(), nullptr, column.size(), ids.size()};
        };
        olvane_family_columns all = {};
        all.persons.id = numbers_(ids);
        all.persons.father = numbers_(fathers);
        all.persons.mother = numbers_(mothers);
        all.persons.sex = bytes(sexes);
        all.persons.dead = bytes(dead);
        all.persons.birth = texts(births);
        all.persons.death = texts(deaths);
        all.families.number = numbers_(numbers);
        all.families.partner0 = numbers_(husbands);
        all.families.partner1 = numbers_(wives);
        if (withNames) {
            all.names.person = numbers_(ids);
            all.names.text = texts(names);
        }
        return all;
    }
};

FamilyPointer made(const olvane_family_columns& columns) {
    olvane_family* family = nullptr;
    olvane_family_error error = {};
    if (olvane_family_create(&columns, &family, &error) != OLVANE_OK) {
        std::fprintf(stderr, "hand_over: %s\n", error.message);
        std::exit(1);
    }
    return FamilyPointer(family, olvane_family_free);
}

template <class Work>
double leastSeconds(Work work) {
    double least = 1e9;
    for (int round = 0; round < kRounds; ++round) {
        const auto start = std::chrono::steady_clock::now();
        work();
        least =
            std::min(least, std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count());
    }
    return least;
}

void printFigures(std::int64_t persons) {
    const Columns columns(persons);
    const FamilyPointer family = made(columns.columns(false));
    const double perPerson =
        static_cast<double>(olvane_family_memory_bytes(family.get())) / static_cast<double>(persons);
    std::printf("%lld persons from C: %.3f s\n", static_cast<long long>(persons),
                leastSeconds([&] { made(columns.columns(false)); }));
    std::printf("the same with a name each: %.3f s\n", leastSeconds([&] { made(columns.columns(true)); }));
    std::printf("memory beside names: %.1f bytes a person\n", perPerson);
    std::printf("a copy: %.1f us\n", 1e6 * leastSeconds([&] {
                                         olvane_family* copy = nullptr;
                                         olvane_family_copy(family.get(), &copy);
                                         olvane_family_free(copy);
                                     }));
    std::printf("a copy and an edit of it: %.1f us\n", 1e6 * leastSeconds([&] {
                                                           olvane_family* copy = nullptr;
                                                           olvane_family_copy(family.get(), &copy);
                                                           olvane_family_set_field(copy, 7, "note", "x",
                                                                                   nullptr);
                                                           olvane_family_free(copy);
                                                       }));
    std::printf("an edit: %.2f us\n",
                1e6 * leastSeconds([&] { olvane_family_set_field(family.get(), 9, "note", "x", nullptr); }));
    std::printf("a person removed: %.1f ms\n", 1e3 * leastSeconds([&, id = persons]() mutable {
                                                   olvane_family_remove_person(family.get(), id--, nullptr);
                                               }));
}

}  // namespace

int main(int argc, char** argv) {
    const long long persons = argc == 2 ? std::atoll(argv[1]) : 0;
    if (persons < 1 || persons > 100000000) {
        std::fprintf(stderr, "usage: hand_over PERSONS\n");
        return 2;
    }
    printFigures(persons);
    return 0;
}
