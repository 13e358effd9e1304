// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_search FILE...: how long it takes to make the index of a GEDCOM file and to answer searches of each sort, the
// worst of all searches last. A search's time is the least of five.

#include <algorithm>
#include <chrono>
#include <iomanip>
#include <iostream>
#include <limits>
#include <string>

#include <olvane/gedcom/GedcomReader.h>
#include <olvane/kin/PersonIndex.h>
#include <olvane/source/GedcomSearchTexts.h>

namespace {

constexpr int kRounds = 5;
constexpr std::size_t kShown = 50;
constexpr const char* kSearches[] = {"a",     "surname1", "victoria",    "albert of",  "surname1 given2",
                                     "urnam", "victorai", "given20x",    "1819",       "1819-1825",
                                     "I17",   "17",       "nobodyatall", "of saxe co", "elisabeth 18"};

double millisecondsSince(std::chrono::steady_clock::time_point start) {
    return std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
}

void measure(const std::string& path) {
    olvane::gedcom::ReadOptions options;
    options.facts = true;
    const olvane::gedcom::GedcomData data = olvane::gedcom::readGedcomFile(path, options);
    const auto start = std::chrono::steady_clock::now();
    const olvane::kin::PersonIndex index{olvane::gedcom::GedcomSearchTexts(data)};
    std::cout << path << "\t" << data.personCount() << " persons\tindex " << millisecondsSince(start)
              << " ms\n";
    double worst = 0;
    for (const char* const text : kSearches) {
        double least = std::numeric_limits<double>::infinity();
        std::size_t found = 0;
        for (int round = 0; round < kRounds; ++round) {
            const auto began = std::chrono::steady_clock::now();
            found = index.find(text, kShown).size();
            least = std::min(least, millisecondsSince(began));
        }
        worst = std::max(worst, least);
        std::cout << "\t" << text << "\t" << found << " found\t" << least << " ms\n";
    }
    std::cout << "\tworst\t\t" << worst << " ms\n";
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        std::cerr << "usage: bench_search FILE...\n";
        return 2;
    }
    std::cout << std::fixed << std::setprecision(3);
    for (int i = 1; i < argc; ++i) measure(argv[i]);
    return 0;
}
