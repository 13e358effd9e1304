// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_search FILE...: how long it takes to make the index of a GEDCOM file and to answer searches of each sort, all for
// one woman in the middle of the file, and the median and the worst of all sorts. A search's time is the least of nine. kin.mjs
// asks the same of the module.

#include <algorithm>
#include <chrono>
#include <iomanip>
#include <iostream>
#include <limits>
#include <stdexcept>
#include <string>
#include <vector>

#include <olvane/gedcom/GedcomReader.h>
#include <olvane/kin/PersonIndex.h>
#include <olvane/source/GedcomSearchTexts.h>

namespace {

using olvane::gedcom::GedcomData;
using olvane::gedcom::PersonId;

constexpr int kRounds = 9;
constexpr std::size_t kShown = 31;

struct Search {
    const char* sort;
    std::string text;
};

std::string placeOf(const GedcomData& data, PersonId id) {
    for (const auto& fact : data.factsOfPerson(id)) {
        if (!fact.place.empty()) return std::string(fact.place);
    }
    return "";
}

bool hasEverything(const GedcomData& data, PersonId id) {
    return data.person(id).sex == olvane::gedcom::Sex::female && data.person(id).birth.isGiven() &&
           !data.spouses(id).empty() && !data.firstName(data.spouses(id)[0]).surname.empty() &&
           data.firstName(id).surname.size() > 4 && !data.firstName(id).given.empty() &&
           !placeOf(data, id).empty();
}

// Somebody with a name, a birth, a husband and a place, behind the middle of the file.
PersonId somebody(const GedcomData& data) {
    for (auto id = static_cast<PersonId>(data.personCount() / 2); data.hasPerson(id); ++id) {
        if (hasEverything(data, id)) return id;
    }
    throw std::runtime_error("nobody has a name, a birth, a husband and a place");
}

std::vector<Search> searchesFor(const GedcomData& data, PersonId id) {
    const std::string given(data.firstName(id).given);
    const std::string surname(data.firstName(id).surname);
    const std::string husband(data.firstName(data.spouses(id)[0]).surname);
    const std::string place = placeOf(data, id);
    const int year = data.person(id).birth.year;
    const std::string wrong = surname.substr(0, 2) + "q" + surname.substr(3);
    const std::string years = std::to_string(year - 5) + "-" + std::to_string(year + 5);
    return {{"whole name", given + " " + surname},
            {"surname", surname},
            {"one letter wrong", wrong},
            {"one letter missing, with a given name", given + " " + surname.substr(0, 2) + surname.substr(3)},
            {"words reversed", surname + " " + given},
            {"beginnings", given.substr(0, 2) + " " + surname.substr(0, 2)},
            {"middle of a word", surname.substr(1, 3)},
            {"married name", given + " " + husband},
            {"place", place},
            {"year", std::to_string(year)},
            {"range of years", years},
            {"name, place and year", given + " " + surname + " " + place + " " + std::to_string(year)},
            {"xref", std::string(data.person(id).xref)},
            {"one letter", surname.substr(0, 1)},
            {"five letters", "a e i o u"},
            {"nothing found", "qqzzqq"},
            {"nothing found of five words", "qqzz kxqw " + wrong + " wwxk " + place}};
}

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
    std::vector<double> times;
    for (const auto& [sort, text] : searchesFor(data, somebody(data))) {
        double least = std::numeric_limits<double>::infinity();
        std::size_t found = 0;
        for (int round = 0; round < kRounds; ++round) {
            const auto began = std::chrono::steady_clock::now();
            found = index.find(text, kShown).size();
            least = std::min(least, millisecondsSince(began));
        }
        times.push_back(least);
        std::cout << "\t" << sort << "\t" << text << "\t" << found << " found\t" << least << " ms\n";
    }
    std::sort(times.begin(), times.end());
    std::cout << "\tmedian, worst\t" << times[times.size() / 2] << ", " << times.back() << " ms\n";
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        std::cerr << "usage: bench_search FILE...\n";
        return 2;
    }
    std::cout << std::fixed << std::setprecision(3);
    try {
        for (int i = 1; i < argc; ++i) measure(argv[i]);
    } catch (const std::exception& error) {
        std::cerr << "bench_search: " << error.what() << "\n";
        return 1;
    }
    return 0;
}
