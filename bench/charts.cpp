// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_charts: what is wrong in the charts of every person of a real GEDCOM file, and how long they take.
//
//     bench_charts [VIEW...]      judges and times these views, or all that have rows, of every person
//     bench_charts --step N       the times alone, of every N-th person: those that peers/royal.mjs has
//
// Of each person the least of three times is kept, typed picture included. The file is named by
// OLVANE_BENCH_GEDCOM, or is history/royal92.ged below the folder that OLVANE_GEDCOM_DIR names.

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/charts/Charts.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/host/LayoutText.h>
#include <olvane/picture/Judge.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomKin.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <iostream>
#include <limits>
#include <memory>
#include <string>
#include <vector>

#include "FreedMemory.h"

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

// The least of a few rounds, in milliseconds.
double timeOf(const olvane::kin::KinGraph& graph, const ChartRequest& request, Picture& picture) {
    double least = std::numeric_limits<double>::infinity();
    for (int round = 0; round < kRounds; ++round) {
        const auto start = std::chrono::steady_clock::now();
        picture = olvane::charts::chartOf(graph, request);
        const std::chrono::duration<double, std::milli> taken = std::chrono::steady_clock::now() - start;
        least = std::min(least, taken.count());
    }
    return least;
}

void printTimes(const olvane::kin::KinGraph& graph, olvane::kin::Place step) {
    for (const View view : {View::ancestors, View::descendants, View::relatives}) {
        std::vector<double> times;
        std::size_t most = 0;
        for (olvane::kin::Place person = 0; person < graph.personCount(); person += step) {
            Picture picture;
            times.push_back(timeOf(graph, requestFor(view, person), picture));
            most = std::max(most, picture.boxes.size());
        }
        const double slowest = *std::max_element(times.begin(), times.end());
        std::printf("| Olvane, %s | %zu | %.4f | %.2f | %zu |\n", olvane::charts::nameOf(view), times.size(),
                    middleOf(times), slowest, most);
    }
}

Totals measure(const olvane::kin::KinGraph& graph, View view) {
    Totals totals;
    for (olvane::kin::Place person = 0; person < graph.personCount(); ++person) {
        const ChartRequest request = requestFor(view, person);
        Picture picture;
        totals.times.push_back(timeOf(graph, request, picture));
        totals.add(olvane::picture::judge(picture, &graph));
    }
    return totals;
}

void print(View view, Totals totals) {
    const double slowest = *std::max_element(totals.times.begin(), totals.times.end());
    std::printf(
        "| %s | %zu | %zu | %zu | %zu | %zu | %zu | %zu | %zu | %zu | %zu | %zu of %zu | %zu | %.1f | "
        "%.4f | %.2f |\n",
        olvane::charts::nameOf(view), totals.boxes, totals.most, totals.overlaps, totals.hits, totals.tracks,
        totals.touches, totals.unjoined, totals.untold, totals.unmarked, totals.crossings, totals.sideBySide,
        totals.couples, totals.marks, middleOf(totals.areas), middleOf(totals.times), slowest);
    std::fflush(stdout);
}

// The area of the engine's family view of somebody, boxes for unknown parents included. Its coordinates are cut to
// whole points, so it may be a point wider and higher than they say.
double familyViewArea(const std::shared_ptr<olvane::gedcom::GedcomDataSource>& source,
                      olvane::kin::Place person) {
    constexpr int kWidth = 55;
    constexpr int kHeight = 80;
    int left = 0, top = 0, right = 0, bottom = 0;
    for (const auto& record : olvane::readLayoutText(FamilyViewLayout(std::to_string(person + 1), source))) {
        left = std::min(left, record.x);
        top = std::min(top, record.y);
        right = std::max(right, record.x + kWidth);
        bottom = std::max(bottom, record.y + kHeight);
    }
    return static_cast<double>(right - left + 1) * static_cast<double>(bottom - top + 1);
}

void compareNearWithFamilyView(const olvane::kin::KinGraph& graph,
                               const std::shared_ptr<olvane::gedcom::GedcomDataSource>& source) {
    std::vector<double> shares;
    for (olvane::kin::Place person = 0; person < graph.personCount(); ++person) {
        double right = 0;
        double bottom = 0;
        for (const auto& box : olvane::charts::chartOf(graph, requestFor(View::near, person)).boxes) {
            right = std::max(right, box.x + static_cast<double>(box.width));
            bottom = std::max(bottom, box.y + static_cast<double>(box.height));
        }
        shares.push_back(right * bottom / familyViewArea(source, person));
    }
    const double middle = middleOf(shares);
    const auto larger = std::count_if(shares.begin(), shares.end(), [](double share) { return share > 1; });
    std::printf(
        "\nArea of near beside the family view's: %.3f at the median, %.3f at most; larger %td times.\n",
        middle, shares.back(), larger);
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
        const olvane::gedcom::GedcomData data = olvane::gedcom::readGedcomFile(path);
        const auto graph = olvane::gedcom::kinGraphOf(data);
        if (argc == 3 && std::string(argv[1]) == "--step") {
            printTimes(graph, std::max(1, std::atoi(argv[2])));
            return 0;
        }
        std::printf(
            "| view | boxes | most | overlaps | hits | tracks | touches | unjoined | untold | unmarked | "
            "crossings | side by side | marks | area | median ms | slowest ms |\n"
            "| --- | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | "
            "---: | ---: | ---: |\n");
        for (const View view :
             {View::near, View::ancestors, View::descendants, View::hourglass, View::relatives, View::fan}) {
            const auto isNamed = [view](const char* name) {
                return std::string(name) == olvane::charts::nameOf(view);
            };
            if (argc == 1 || std::any_of(argv + 1, argv + argc, isNamed)) print(view, measure(graph, view));
        }
        compareNearWithFamilyView(graph, std::make_shared<olvane::gedcom::GedcomDataSource>(data));
    } catch (const std::exception& error) {
        std::cerr << error.what() << "\n";
        return 1;
    }
    return 0;
}
