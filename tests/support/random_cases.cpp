// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// random-cases COUNT FOLDER: writes that many made-up families as case files, the same ones on every machine.

#include <support/CaseFile.h>
#include <support/FamilyMaker.h>

#include <cstdint>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <string>

namespace {

constexpr int kMostPersons = 30;

support::CaseFile makeCase(std::uint64_t number) {
    support::FamilyMaker maker(number, 1 + static_cast<int>(number % kMostPersons));
    if (number % 10 == 9) maker.strewOddIds();
    support::CaseFile request = maker.any();
    if (number % 3 != 0) maker.setRequest(request);
    return request;
}

}  // namespace

int main(int argc, char** argv) {
    const long count = argc == 3 ? std::strtol(argv[1], nullptr, 10) : 0;
    if (count < 1) {
        std::cerr << "usage: random-cases COUNT FOLDER\n";
        return 2;
    }
    for (long number = 0; number < count; ++number) {
        const std::string path = std::string(argv[2]) + "/random-" + std::to_string(number) + ".case";
        std::ofstream out(path, std::ios::binary);
        out << support::formatCase(makeCase(static_cast<std::uint64_t>(number)));
        if (!out.flush()) {
            std::cerr << "random-cases: " << path << ": cannot be written\n";
            return 2;
        }
    }
    return 0;
}
