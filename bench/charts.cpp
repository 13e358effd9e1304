// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_charts: what is wrong in the charts of every person of a real GEDCOM file, and how long they take.
//
//     bench_charts [VIEW...]      judges and times these views, or all that have rows, of every person
//
// Of each person the least of three times is kept, typed picture included. The file is named by
// OLVANE_BENCH_GEDCOM, or is history/royal92.ged below the folder that OLVANE_GEDCOM_DIR names.

#include <olvane/charts/Charts.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/picture/Judge.h>
#include <olvane/source/GedcomKin.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <iostream>
#include <limits>
#include <string>
#include <vector>

#include "KeptMemory.h"

namespace {

using olvane::charts::ChartRequest;
using olvane::charts::View;
using olvane::picture::Judgement;
using olvane::picture::Picture;

constexpr int kRounds = 3;

std::string gedcomPath() {
    if (const char* file = std::getenv("OLVANE_BENCH_GEDCOM")) return file;
    if (const char* folder = std::getenv("OLVANE_GEDCOM_DIR"))
        return std::string(folder) + "/history/royal92.ged";
    return std::string();
}

double middleOf(std::vector<double>& values) {
    std::sort(values.begin(), values.end());
    return values.empty() ? 0 : values[values.size() / 2];
}

// What is counted over all persons of a file.
struct Totals {
    std::size_t boxes = 0, most = 0;
    std::size_t overlaps = 0, hits = 0, crossings = 0, tracks = 0, touches = 0, unjoined = 0, untold = 0;
    std::size_t unmarked = 0, slanted = 0, couples = 0, sideBySide = 0, marks = 0;
    std::vector<double> times, areas;

    void add(const Judgement& judged) {
        boxes += judged.boxes;
        most = std::max(most, judged.boxes);
        overlaps += judged.overlaps;
        hits += judged.hits;
        crossings += judged.crossings;
        tracks += judged.tracks;
        touches += judged.touches;
        unjoined += judged.unjoined;
        untold += judged.untold.value_or(0);
        unmarked += judged.unmarked;
        slanted += judged.slanted;
        couples += judged.couples;
        sideBySide += judged.sideBySide;
        marks += judged.parentsElsewhereMarks + judged.partnersElsewhereMarks;
        areas.push_back(judged.areaPerPerson);
    }
};

ChartRequest requestFor(View view, olvane::kin::Place focus) {
    ChartRequest request;
    request.view = view;
    request.focus = focus;
    if (view == View::relatives) request.up = request.down = 3;
    return request;
}

Totals measure(const olvane::kin::KinGraph& graph, View view) {
    Totals totals;
    for (olvane::kin::Place person = 0; person < graph.personCount(); ++person) {
        const ChartRequest request = requestFor(view, person);
        double least = std::numeric_limits<double>::infinity();
        Picture picture;
        for (int round = 0; round < kRounds; ++round) {
            const auto start = std::chrono::steady_clock::now();
            picture = olvane::charts::chartOf(graph, request);
            const std::chrono::duration<double, std::milli> taken = std::chrono::steady_clock::now() - start;
            least = std::min(least, taken.count());
        }
        totals.times.push_back(least);
        totals.add(olvane::picture::judge(picture, &graph));
    }
    return totals;
}

void print(View view, Totals totals) {
    const double slowest = *std::max_element(totals.times.begin(), totals.times.end());
    std::printf(
        "| %s | %zu | %zu | %zu | %zu | %zu | %zu | %zu | %zu | %zu | %zu | %zu of %zu | %zu | %.1f | "
        "%.3f | %.2f |\n",
        olvane::charts::nameOf(view), totals.boxes, totals.most, totals.overlaps, totals.hits, totals.tracks,
        totals.touches, totals.unjoined, totals.untold, totals.unmarked, totals.crossings, totals.sideBySide,
        totals.couples, totals.marks, middleOf(totals.areas), middleOf(totals.times), slowest);
    std::fflush(stdout);
}

}  // namespace

int main(int argc, char** argv) {
    bench::keepFreedMemory();
    try {
        const std::string path = gedcomPath();
        if (path.empty()) {
            std::cerr << "neither OLVANE_BENCH_GEDCOM nor OLVANE_GEDCOM_DIR is set\n";
            return 1;
        }
        const auto graph = olvane::gedcom::kinGraphOf(olvane::gedcom::readGedcomFile(path));
        std::printf(
            "| view | boxes | most | overlaps | hits | tracks | touches | unjoined | untold | unmarked | "
            "crossings | side by side | marks | area | median ms | slowest ms |\n"
            "| --- | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | "
            "---: | ---: | ---: |\n");
        for (const View view :
             {View::near, View::ancestors, View::descendants, View::hourglass, View::relatives}) {
            const auto isNamed = [view](const char* name) {
                return std::string(name) == olvane::charts::nameOf(view);
            };
            if (argc == 1 || std::any_of(argv + 1, argv + argc, isNamed)) print(view, measure(graph, view));
        }
    } catch (const std::exception& error) {
        std::cerr << error.what() << "\n";
        return 1;
    }
    return 0;
}
