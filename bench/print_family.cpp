// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// print_family SHAPE SIZE: a made family, a line for each person:
//
//     ID SEX FATHER MOTHER YEAR [SPOUSES] [CHILDREN]
//
// peers/families.mjs prints the same lines, or the peers lay out other families than we do.

#include <cstdint>
#include <cstdlib>
#include <exception>
#include <iostream>
#include <string>
#include <vector>

#include "MadeLayout.h"

namespace {

std::string listed(const std::vector<std::int64_t>& ids) {
    std::string text = "[";
    for (const std::int64_t id : ids) {
        if (text.size() > 1) text += ' ';
        text += std::to_string(id);
    }
    return text + "]";
}

void print(const bench::MadeFamily& family) {
    for (std::size_t id = 1; id <= family.size(); ++id) {
        const bench::MadeFamily::Person& person = family.person(static_cast<std::int64_t>(id));
        std::cout << id << ' ' << (person.sex == 0 ? 'M' : 'F') << ' ' << person.father << ' '
                  << person.mother << ' ' << person.year << ' ' << listed(person.spouses) << ' '
                  << listed(person.children) << '\n';
    }
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::cerr << "usage: print_family desc|ego|ped SIZE\n";
        return 2;
    }
    try {
        print(bench::madeFamily(argv[1], std::atoi(argv[2])));
    } catch (const std::exception& error) {
        std::cerr << "print_family: " << error.what() << "\n";
        return 1;
    }
    return std::cout.flush() ? 0 : 1;
}
