// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How well the chart of everybody does, beside placements that others made.
//
//   bench_everybody FILE.ged                 our chart of the file's largest family, with no, 60 and all marks
//   bench_everybody FILE.ged --graph         that family as JSON, for others to place
//   bench_everybody FILE.ged --place NAME    judges a placement: lines "id x y" of the corners of boxes on the standard
//                                            input, lines drawn by our router in the same style
//   bench_everybody FILE.ged --moved N       how many boxes stay where they are when one person is added, N times, and with
//                                            the places of the picture before kept
//   bench_everybody FILE.ged --grown N       area and crossings after N more persons, places kept each time
//   bench_everybody --made PERSONS           time and memory for a made population

#include <olvane/charts/Everybody.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/LineRouter.h>
#include <olvane/source/GedcomKin.h>

#include <sys/resource.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <exception>
#include <numeric>
#include <string>
#include <vector>

#include "MadePopulation.h"

namespace {

using olvane::charts::everybodyChart;
using olvane::charts::EverybodyOptions;
using olvane::kin::KinGraph;
using olvane::kin::kNobody;
using olvane::kin::Place;
using olvane::kin::UnionPlace;
using olvane::picture::Picture;

std::vector<Place> membersOf(const KinGraph& graph, UnionPlace u) {
    std::vector<Place> members(graph.children(u).begin(), graph.children(u).end());
    for (const Place partner : graph.partners(u)) {
        if (partner != kNobody) members.push_back(partner);
    }
    return members;
}

// Adds a graph's persons for whom keep is not 0, and their unions, to a builder; ids stay.
void copyTo(const KinGraph& graph, const std::vector<std::uint8_t>& keep,
            olvane::kin::KinGraphBuilder& builder) {
    std::vector<Place> place(static_cast<std::size_t>(graph.personCount()), kNobody);
    for (Place p = 0; p < graph.personCount(); ++p) {
        if (keep[static_cast<std::size_t>(p)] != 0) {
            place[static_cast<std::size_t>(p)] = builder.addPerson(graph.id(p), graph.sex(p));
        }
    }
    const auto newPlace = [&](Place p) {
        return p == kNobody ? kNobody : place[static_cast<std::size_t>(p)];
    };
    for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
        if (newPlace(membersOf(graph, u).back()) == kNobody) continue;
        const auto& two = graph.partners(u);
        const UnionPlace copy =
            builder.addUnion(newPlace(two[0]), newPlace(two[1]), graph.state(u), graph.family(u));
        for (std::size_t i = 0; i < graph.children(u).size(); ++i) {
            builder.addChild(copy, newPlace(graph.children(u)[i]), graph.childKinds(u)[i]);
        }
    }
}

// The connected part with the most persons.
KinGraph largestPart(const KinGraph& graph) {
    std::vector<Place> top(static_cast<std::size_t>(graph.personCount()));
    std::iota(top.begin(), top.end(), 0);
    const auto topOf = [&top](Place p) {
        while (top[static_cast<std::size_t>(p)] != p) p = top[static_cast<std::size_t>(p)];
        return p;
    };
    for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
        const std::vector<Place> members = membersOf(graph, u);
        for (const Place member : members) top[static_cast<std::size_t>(topOf(member))] = topOf(members[0]);
    }
    std::vector<int> count(top.size(), 0);
    for (Place p = 0; p < graph.personCount(); ++p) ++count[static_cast<std::size_t>(topOf(p))];
    const auto best = static_cast<Place>(std::max_element(count.begin(), count.end()) - count.begin());
    std::vector<std::uint8_t> keep(top.size());
    for (Place p = 0; p < graph.personCount(); ++p)
        keep[static_cast<std::size_t>(p)] = topOf(p) == best ? 1 : 0;
    olvane::kin::KinGraphBuilder builder;
    copyTo(graph, keep, builder);
    return builder.build();
}

void printHead() {
    std::printf(
        "| layout | ms | crossings | couples side by side | box areas a person | overlaps | hits | tracks | "
        "touches | "
        "unjoined | untold | marks |\n| --- | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: | "
        "---: | ---: |\n");
}

void printRow(const std::string& name, double ms, const Picture& picture, const KinGraph& graph) {
    const olvane::picture::Judgement j = olvane::picture::judge(picture, &graph);
    std::printf("| %s | %.0f | %zu | %zu | %.1f | %zu | %zu | %zu | %zu | %zu | %zu | %zu |\n", name.c_str(),
                ms, j.crossings, j.sideBySide, j.areaPerPerson, j.overlaps, j.hits, j.tracks, j.touches,
                j.unjoined, j.untold.value_or(0), picture.marks.size());
    std::fflush(stdout);
}

// Of processor time: what a layout on one thread takes where nobody else works.
double msSince(std::clock_t start) {
    return 1000.0 * static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
}

void measureOurs(const KinGraph& graph, std::int32_t marks, std::int32_t effort, const std::string& name) {
    EverybodyOptions options;
    options.marks = marks;
    options.effort = effort;
    std::vector<double> times;
    Picture picture;
    for (int i = 0; i < 5; ++i) {
        const std::clock_t start = std::clock();
        picture = everybodyChart(graph, options);
        times.push_back(msSince(start));
    }
    std::sort(times.begin(), times.end());
    printRow(name, times[2], picture, graph);
}

void printGraph(const KinGraph& graph) {
    std::printf("{\"persons\":[");
    for (Place p = 0; p < graph.personCount(); ++p)
        std::printf("%s%lld", p > 0 ? "," : "", static_cast<long long>(graph.id(p)));
    std::printf("],\"unions\":[");
    for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
        std::printf("%s{\"partners\":[", u > 0 ? "," : "");
        const char* comma = "";
        for (const Place partner : graph.partners(u)) {
            if (partner == kNobody) continue;
            std::printf("%s%lld", comma, static_cast<long long>(graph.id(partner)));
            comma = ",";
        }
        std::printf("],\"children\":[");
        comma = "";
        for (const Place child : graph.children(u)) {
            std::printf("%s%lld", comma, static_cast<long long>(graph.id(child)));
            comma = ",";
        }
        std::printf("]}");
    }
    std::printf("]}\n");
}

// Boxes where somebody else put them; families and lines are ours.
void judgePlacement(const KinGraph& graph, const std::string& name) {
    EverybodyOptions options;
    options.effort = 0;
    Picture picture = everybodyChart(graph, options);
    long long id = 0;
    double x = 0;
    double y = 0;
    double ms = 0;
    if (std::scanf("%lf", &ms) != 1) throw std::runtime_error("no time on the standard input");
    std::size_t placed = 0;
    while (std::scanf("%lld %lf %lf", &id, &x, &y) == 3) {
        const Place place = graph.placeOf(id);
        if (place == kNobody) continue;
        picture.boxes[static_cast<std::size_t>(place)].x = x;
        picture.boxes[static_cast<std::size_t>(place)].y = y;
        ++placed;
    }
    if (placed != picture.boxes.size()) throw std::runtime_error(name + " has not placed everybody");
    olvane::picture::RouteOptions route;
    route.growGaps = true;
    olvane::picture::routeLines(picture, route);
    printRow(name, ms, picture, graph);
}

// One more child of a union, or a first child of somebody, or a partner, in turns; whom, is spread over the family.
KinGraph withOneMore(const KinGraph& graph, int turn, std::uint64_t random, std::int64_t id = 1'000'000'000) {
    olvane::kin::KinGraphBuilder builder;
    copyTo(graph, std::vector<std::uint8_t>(static_cast<std::size_t>(graph.personCount()), 1), builder);
    const Place added = builder.addPerson(id, olvane::kin::Sex::female);
    const auto person = static_cast<Place>(random % static_cast<std::uint64_t>(graph.personCount()));
    if (turn % 3 == 0) {
        const auto u = static_cast<UnionPlace>(random % static_cast<std::uint64_t>(graph.unionCount()));
        builder.addChild(u, added, olvane::kin::ChildKind::birth);
    } else if (turn % 3 == 1) {
        builder.addChild(builder.addUnion(person, kNobody, olvane::kin::UnionState::unknown), added,
                         olvane::kin::ChildKind::birth);
    } else {
        builder.addUnion(person, added, olvane::kin::UnionState::married);
    }
    return builder.build();
}

// The share of persons whose row, and whose neighbours to the left and right, stay; rows are counted from the focus's.
struct Stability {
    double row = 0;
    double neighbours = 0;
};

Stability stabilityOf(const Picture& before, const Picture& after) {
    const auto neighbours = [](const Picture& picture, std::vector<std::int64_t>& rowOf) {
        std::vector<std::size_t> order(picture.boxes.size());
        std::iota(order.begin(), order.end(), std::size_t{0});
        std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
            const auto& one = picture.boxes[a];
            const auto& other = picture.boxes[b];
            return one.y != other.y ? one.y < other.y : one.x < other.x;
        });
        std::vector<std::int64_t> right(picture.boxes.size(), 0);
        rowOf.assign(picture.boxes.size(), 0);
        std::int64_t row = 0;
        for (std::size_t i = 0; i < order.size(); ++i) {
            const bool same =
                i + 1 < order.size() && picture.boxes[order[i + 1]].y == picture.boxes[order[i]].y;
            rowOf[order[i]] = row;
            if (same) right[order[i]] = picture.boxes[order[i + 1]].id;
            if (!same) ++row;
        }
        const std::int64_t focus = rowOf[static_cast<std::size_t>(picture.focus)];
        for (std::int64_t& r : rowOf) r -= focus;
        return right;
    };
    std::vector<std::int64_t> rowsBefore;
    std::vector<std::int64_t> rowsAfter;
    const auto rightBefore = neighbours(before, rowsBefore);
    const auto rightAfter = neighbours(after, rowsAfter);
    Stability stability;
    for (std::size_t i = 0; i < before.boxes.size(); ++i) {
        stability.row += rowsBefore[i] == rowsAfter[i] ? 1 : 0;
        stability.neighbours += rightBefore[i] == rightAfter[i] ? 1 : 0;
    }
    stability.row /= static_cast<double>(before.boxes.size());
    stability.neighbours /= static_cast<double>(before.boxes.size());
    return stability;
}

// After one more person, N times; from scratch, and with the places of the picture before.
void measureMoved(const KinGraph& graph, int times, bool keep) {
    for (const std::int32_t marks : {0, -1}) {
        EverybodyOptions options;
        options.marks = marks;
        options.focus = graph.personCount() / 2;
        const Picture before = everybodyChart(graph, options);
        if (keep) options.earlier = &before;
        double moved = 0;
        double ms = 0;
        double crossings = 0;
        Stability stability;
        std::uint64_t random = 1;
        for (int i = 0; i < times; ++i) {
            random = random * 6364136223846793005U + 1442695040888963407U;
            const KinGraph larger = withOneMore(graph, i, random >> 33U);
            const std::clock_t start = std::clock();
            const Picture after = everybodyChart(larger, options);
            ms += msSince(start) / times;
            moved += olvane::picture::movedShare(before, after) / times;
            crossings += static_cast<double>(olvane::picture::judge(after, &larger).crossings) / times;
            const Stability once = stabilityOf(before, after);
            stability.row += once.row / times;
            stability.neighbours += once.neighbours / times;
        }
        std::printf("| %s, marks %d | %.1f%% | %.2f%% | %.2f%% | %.0f | %.0f |\n",
                    keep ? "places kept" : "from scratch", marks, 100 * (1 - moved), 100 * stability.row,
                    100 * stability.neighbours, crossings, ms);
        std::fflush(stdout);
    }
}

// Persons added one after another, each time with the places of the picture before.
void measureGrowth(KinGraph graph, int persons) {
    EverybodyOptions options;
    options.focus = graph.personCount() / 2;
    Picture picture = everybodyChart(graph, options);
    std::printf(
        "| persons added | areas a person, kept | crossings, kept | areas a person, from scratch | "
        "crossings, from scratch |\n"
        "| ---: | ---: | ---: | ---: | ---: |\n");
    std::uint64_t random = 7;
    for (int i = 1; i <= persons; ++i) {
        random = random * 6364136223846793005U + 1442695040888963407U;
        graph = withOneMore(graph, i, random >> 33U, 1'000'000'000 + i);
        options.earlier = &picture;
        picture = everybodyChart(graph, options);
        if (i != 1 && i != 10 && i % 100 != 0) continue;
        options.earlier = nullptr;
        const auto kept = olvane::picture::judge(picture, &graph);
        const auto again = olvane::picture::judge(everybodyChart(graph, options), &graph);
        std::printf("| %d | %.1f | %zu | %.1f | %zu |\n", i, kept.areaPerPerson, kept.crossings,
                    again.areaPerPerson, again.crossings);
        std::fflush(stdout);
    }
}

void measureMade(int persons) {
    constexpr int kMostJudged = 100'000;  // the judge takes as long as the layout, and more memory
    const KinGraph graph = bench::madePopulation(persons);
    for (const std::int32_t marks : {0, -1}) {
        EverybodyOptions options;
        options.onePart = false;
        options.marks = marks;
        const std::clock_t start = std::clock();
        const Picture picture = everybodyChart(graph, options);
        const double ms = msSince(start);
        rusage usage{};
        getrusage(RUSAGE_SELF, &usage);
        std::printf("%zu persons, marks %d: %.0f ms, at most %ld MB with the family and the picture",
                    picture.boxes.size(), marks, ms, usage.ru_maxrss / 1024);
        if (persons <= kMostJudged) {
            const olvane::picture::Judgement j = olvane::picture::judge(picture, &graph);
            std::printf(
                "; %zu crossings, %zu overlaps, %zu hits, %zu tracks, %zu touches, %zu unjoined, %zu untold, "
                "%.1f areas a person, %zu marks",
                j.crossings, j.overlaps, j.hits, j.tracks, j.touches, j.unjoined, j.untold.value_or(0),
                j.areaPerPerson, picture.marks.size());
        }
        std::printf("\n");
        std::fflush(stdout);
    }
}

int run(const std::vector<std::string>& arguments) {
    if (arguments.size() == 2 && arguments[0] == "--made") {
        measureMade(std::stoi(arguments[1]));
        return 0;
    }
    if (arguments.empty()) throw std::runtime_error("which file?");
    const KinGraph graph =
        largestPart(olvane::gedcom::kinGraphOf(olvane::gedcom::readGedcomFile(arguments[0])));
    if (arguments.size() == 1) {
        printHead();
        measureOurs(graph, 0, 1, "Olvane");
        measureOurs(graph, 60, 1, "Olvane, 60 marks");
        measureOurs(graph, 343, 1, "Olvane, 343 marks");
        measureOurs(graph, -1, 1, "Olvane, all second links marks");
        measureOurs(graph, 0, 4, "Olvane, effort 4");
    } else if (arguments[1] == "--graph") {
        printGraph(graph);
    } else if (arguments.size() == 3 && arguments[1] == "--place") {
        judgePlacement(graph, arguments[2]);
    } else if (arguments.size() == 3 && arguments[1] == "--moved") {
        std::printf(
            "| after one more person, %s times | keep their place relative to the focus | their row | their "
            "right neighbour | crossings | ms |\n"
            "| --- | ---: | ---: | ---: | ---: | ---: |\n",
            arguments[2].c_str());
        for (const bool keep : {false, true}) measureMoved(graph, std::stoi(arguments[2]), keep);
    } else if (arguments.size() == 3 && arguments[1] == "--grown") {
        measureGrowth(graph, std::stoi(arguments[2]));
    } else {
        throw std::runtime_error("what?");
    }
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        return run(std::vector<std::string>(argv + 1, argv + argc));
    } catch (const std::exception& error) {
        std::fprintf(stderr, "bench_everybody: %s\n", error.what());
        return 1;
    }
}
