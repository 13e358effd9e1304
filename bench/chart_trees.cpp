// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_chart_trees: how long a chart of descendants without repeats takes, how wide it is and what memory it needs,
// typed picture included.
//
//     bench_chart_trees N...      one line for each number of persons: persons, milliseconds, width, bytes a person
//
// Everybody has one parent in the data. The tree is the one that peers/charts.mjs makes. The time is the processor's,
// which a busy machine spoils least: the median of five, or of three from 100,000 persons on.
//
//     bench_chart_trees line N    the ancestors of the last of a line, and the fan of a full ancestry of 12 generations

#include <olvane/charts/Charts.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <exception>
#include <iostream>
#include <string>
#include <vector>

#include "CountedMemory.h"
#include "FreedMemory.h"

namespace {

using olvane::charts::ChartRequest;
using olvane::charts::View;
using olvane::kin::ChildKind;
using olvane::kin::KinGraph;
using olvane::kin::KinGraphBuilder;
using olvane::kin::kNobody;
using olvane::kin::Place;
using olvane::kin::Sex;
using olvane::kin::UnionState;

// One to four children for each person in turn, until there are enough.
KinGraph treeOf(int persons) {
    KinGraphBuilder builder;
    builder.reserve(static_cast<std::size_t>(persons), static_cast<std::size_t>(persons));
    std::uint32_t random = 1;
    builder.addPerson(1, Sex::male);
    int known = 1;
    for (Place parent = 0; known < persons; ++parent) {
        random = random * 1664525U + 1013904223U;
        const int children = 1 + static_cast<int>((random >> 16) % 4);
        const auto u = builder.addUnion(parent, kNobody, UnionState::unknown);
        for (int i = 0; i < children && known < persons; ++i) {
            builder.addChild(u, builder.addPerson(++known, Sex::male), ChildKind::birth);
        }
    }
    return builder.build();
}

KinGraph lineOf(int persons) {
    KinGraphBuilder builder;
    builder.addPerson(1, Sex::male);
    for (Place parent = 0; parent + 1 < persons; ++parent) {
        const auto u = builder.addUnion(parent, kNobody, UnionState::unknown);
        builder.addChild(u, builder.addPerson(parent + 2, Sex::male), ChildKind::birth);
    }
    return builder.build();
}

// Person 2n and 2n + 1 are the parents of person n.
KinGraph ancestryOf(int generations) {
    KinGraphBuilder builder;
    const int persons = (2 << generations) - 1;
    for (int id = 1; id <= persons; ++id) builder.addPerson(id, id % 2 == 0 ? Sex::male : Sex::female);
    for (Place child = 0; 2 * child + 2 < persons; ++child) {
        builder.addChild(builder.addUnion(2 * child + 1, 2 * child + 2, UnionState::married), child,
                         ChildKind::birth);
    }
    return builder.build();
}

double middleTime(const KinGraph& graph, const ChartRequest& request, int rounds) {
    std::vector<double> times;
    for (int round = 0; round < rounds; ++round) {
        const std::clock_t start = std::clock();
        const auto picture = olvane::charts::chartOf(graph, request);
        times.push_back(static_cast<double>(std::clock() - start) * 1000 / CLOCKS_PER_SEC);
        if (picture.boxes.empty()) std::abort();
    }
    std::sort(times.begin(), times.end());
    return times[times.size() / 2];
}

void measureTree(int persons) {
    const KinGraph graph = treeOf(persons);
    ChartRequest request;
    request.view = View::descendants;
    const double time = middleTime(graph, request, persons >= 100000 ? 3 : 5);
    double width = 0;
    bench::startCounting();
    const auto picture = olvane::charts::chartOf(graph, request);
    const std::size_t bytes = bench::memoryCount().peakBytes;
    for (const auto& box : picture.boxes) width = std::max(width, box.x + static_cast<double>(box.width));
    std::printf("%d %.3f %.1f %.0f\n", persons, time, width, static_cast<double>(bytes) / persons);
}

void measureLine(int persons) {
    ChartRequest request;
    request.view = View::ancestors;
    request.focus = persons - 1;
    std::printf("ancestors of a line of %d: %.1f ms\n", persons, middleTime(lineOf(persons), request, 3));
    request.view = View::fan;
    request.focus = 0;
    std::printf("fan of 25 generations, 12 known in full: %.2f ms\n", middleTime(ancestryOf(12), request, 5));
}

}  // namespace

int main(int argc, char** argv) {
    bench::keepFreedMemory();
    try {
        if (argc == 3 && std::string(argv[1]) == "line") {
            measureLine(std::atoi(argv[2]));
        } else {
            for (int i = 1; i < argc; ++i) measureTree(std::atoi(argv[i]));
        }
    } catch (const std::exception& error) {
        std::cerr << error.what() << "\n";
        return 1;
    }
    return 0;
}
