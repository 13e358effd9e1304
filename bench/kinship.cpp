// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_kinship: how long it takes to find how two persons are related, ways, counts, coefficient and all: the median
// and the worst of random pairs, the same in each run, in a real file and in a made family of 200,000 persons. Times are
// of the processor, the least of three for each pair, since a busy machine hits somebody in every round. The file is named by
// OLVANE_BENCH_GEDCOM, or is history/royal92.ged below the folder that OLVANE_GEDCOM_DIR names.

#include <algorithm>
#include <cstdlib>
#include <ctime>
#include <fstream>
#include <iomanip>
#include <iostream>
#include <limits>
#include <random>
#include <string>
#include <vector>

#include <olvane/gedcom/GedcomReader.h>
#include <olvane/kin/Kinship.h>
#include <olvane/source/GedcomKin.h>

namespace {

using olvane::kin::ChildKind;
using olvane::kin::KinGraph;
using olvane::kin::KinGraphBuilder;
using olvane::kin::Place;
using olvane::kin::Sex;
using olvane::kin::UnionState;

constexpr int kRounds = 3;

std::string gedcomPath() {
    if (const char* file = std::getenv("OLVANE_BENCH_GEDCOM")) return file;
    if (const char* folder = std::getenv("OLVANE_GEDCOM_DIR"))
        return std::string(folder) + "/history/royal92.ged";
    return std::string();
}

// Villages of equal generations. Everybody marries: mostly within the village, one in twenty far away; cousins marry
// often. Two to three children a couple keep the number.
KinGraph madeFamily(Place persons) {
    constexpr Place kGenerations = 10;
    const Place couples = persons / kGenerations / 2;
    std::mt19937 random(1848);
    const auto pick = [&random](Place count) {
        return static_cast<Place>(random() % static_cast<unsigned>(count));
    };
    KinGraphBuilder builder;
    for (Place i = 0; i < kGenerations * couples * 2; ++i)
        builder.addPerson(i + 1, i % 2 == 0 ? Sex::male : Sex::female);
    std::vector<Place> wives(static_cast<std::size_t>(couples));
    for (Place generation = 0; generation < kGenerations; ++generation) {
        const Place first = generation * couples * 2;
        for (Place i = 0; i < couples; ++i) wives[static_cast<std::size_t>(i)] = first + 2 * i + 1;
        for (Place i = 0; i < couples; ++i) {
            const Place other = pick(20) == 0 ? pick(couples) : std::min(couples - 1, i + pick(40));
            std::swap(wives[static_cast<std::size_t>(i)], wives[static_cast<std::size_t>(other)]);
        }
        for (Place i = 0; i < couples; ++i) {
            builder.addUnion(first + 2 * i, wives[static_cast<std::size_t>(i)], UnionState::married);
        }
        if (generation == 0) continue;
        for (Place child = first; child < first + 2 * couples; ++child) {
            const Place near = std::clamp((child - first) / 2 + pick(30) - 15, Place{0}, couples - 1);
            builder.addChild((generation - 1) * couples + near, child, ChildKind::birth);
        }
    }
    return builder.build();
}

double processorMilliseconds() {
    timespec time = {};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
    return static_cast<double>(time.tv_sec) * 1e3 + static_cast<double>(time.tv_nsec) / 1e6;
}

double millisecondsOf(olvane::kin::KinshipFinder& finder, Place a, Place b, bool& related) {
    double least = std::numeric_limits<double>::infinity();
    for (int round = 0; round < kRounds; ++round) {
        const double start = processorMilliseconds();
        const olvane::kin::Kinship kinship = finder.between(a, b);
        least = std::min(least, processorMilliseconds() - start);
        related = !kinship.blood.empty();
    }
    return least;
}

void measure(const char* name, const KinGraph& graph, int pairs) {
    const double start = processorMilliseconds();
    olvane::kin::KinshipFinder finder(graph);
    const double prepared = processorMilliseconds() - start;
    std::mt19937 random(92);
    std::vector<double> times;
    int relatedPairs = 0;
    std::pair<Place, Place> slowest;
    for (int i = 0; i < pairs; ++i) {
        const auto count = static_cast<unsigned>(graph.personCount());
        const auto a = static_cast<Place>(random() % count);
        const auto b = static_cast<Place>(random() % count);
        bool related = false;
        times.push_back(millisecondsOf(finder, a, b, related));
        if (related) ++relatedPairs;
        if (times.back() >= *std::max_element(times.begin(), times.end())) slowest = {a, b};
    }
    std::sort(times.begin(), times.end());
    std::cout << std::fixed << std::setprecision(3) << name << "\t" << graph.personCount() << "\t" << pairs
              << "\t" << relatedPairs << "\t" << times[times.size() / 2] << "\t"
              << times[times.size() * 99 / 100] << "\t" << times.back() << "\t" << graph.id(slowest.first)
              << " and " << graph.id(slowest.second) << "\t" << prepared << "\n";
}

}  // namespace

int main() {
    std::cout << "family\tpersons\tpairs\tby blood\tmedian ms\t99% ms\tworst ms\tworst pair\tpreparing ms\n";
    const std::string path = gedcomPath();
    if (!path.empty() && std::ifstream(path)) {
        measure("file", olvane::gedcom::kinGraphOf(olvane::gedcom::readGedcomFile(path)), 10'000);
    } else {
        std::cerr << "bench_kinship: name a file in OLVANE_BENCH_GEDCOM to measure it too\n";
    }
    measure("made", madeFamily(200'000), 2'000);
    return 0;
}
