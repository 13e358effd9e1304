// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures of small families that somebody has looked at, in the form of boxes and lines as text, one a line. With
// OLVANE_RECORD_CHARTS set, what comes out now is written beside each as NAME.new instead.

#include <gtest/gtest.h>

#include <olvane/charts/Charts.h>

#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "KinFamily.h"

using namespace olvane::kin;
using namespace olvane::charts;
using olvane::picture::Box;
using olvane::picture::Index;
using olvane::picture::Picture;

namespace {

struct Golden {
    std::string name;
    KinFamily family;
    std::string focus;
    ChartRequest request;
    std::string to = {};
};

ChartRequest viewOf(View view, int up = 0, int down = 0) {
    ChartRequest request;
    request.view = view;
    request.up = up;
    request.down = down;
    return request;
}

const KinFamily& threeGenerations() {
    static const KinFamily family{"Opa + Oma: Onkel.m Vater.m Tante.f",
                                  "Opi + Omi: Mutter.f Muhme.f",
                                  "Vater + Mutter: Alt.m Ich.f Jung.m",
                                  "Onkel + Olga: Vetter.m Base.f",
                                  "Mann + Ich: Kind.m",
                                  "Mann + Erste: Stief.f"};
    return family;
}

std::vector<Golden> goldens() {
    ChartRequest sideways = viewOf(View::descendants);
    sideways.direction = Direction::right;
    ChartRequest half = viewOf(View::fan);
    half.fanAngle = 180;
    return {
        {"descendants", threeGenerations(), "Opa", viewOf(View::descendants)},
        {"descendants-right", threeGenerations(), "Opa", sideways},
        {"ancestors", threeGenerations(), "Kind", viewOf(View::ancestors)},
        {"hourglass", threeGenerations(), "Ich", viewOf(View::hourglass)},
        {"relatives", threeGenerations(), "Ich", viewOf(View::relatives, 2, 1)},
        {"near", threeGenerations(), "Ich", viewOf(View::near)},
        {"fan", threeGenerations(), "Kind", half},
        {"kinship", threeGenerations(), "Base", viewOf(View::kinship), "Kind"},
        {"kinship-two-ways",
         {"Opa + Oma: A.m B.m", "Opi + Omi: C.f D.f", "A + C: a.m", "B + D: b.f"},
         "a",
         viewOf(View::kinship),
         "b"},
        {"four-wives",
         {"Ein + A: a.m", "Ein + B: b.m", "Ein + C: c.m", "Ein + D: d.m"},
         "Ein",
         viewOf(View::descendants)},
    };
}

std::string textOf(const Picture& picture, const KinFamily& family, const std::vector<std::string>& names) {
    std::ostringstream text;
    const auto nameOfBox = [&](Index box) {
        const Place person = family.graph().placeOf(picture.boxes[static_cast<std::size_t>(box)].id);
        for (const std::string& name : names) {
            if (family[name] == person) return name;
        }
        return std::string("?");
    };
    for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
        const Box& box = picture.boxes[i];
        text << nameOfBox(static_cast<Index>(i));
        if (picture.isRound()) {
            const auto& arc = picture.arcs[i];
            text << " ring " << arc.ring << " from " << arc.from << " to " << arc.to << '\n';
        } else {
            text << " " << box.x << ' ' << box.y << '\n';
        }
    }
    for (const auto& one : picture.families) {
        text << "family";
        for (const Index parent : picture.parents(one)) text << ' ' << nameOfBox(parent);
        text << ':';
        for (const Index child : picture.children(one)) text << ' ' << nameOfBox(child);
        text << '\n';
        for (const auto& line : picture.linesOf(one)) {
            text << "    " << line.x1 << ' ' << line.y1 << " - " << line.x2 << ' ' << line.y2 << '\n';
        }
    }
    for (const auto& mark : picture.marks) {
        text << "mark " << mark.number << ':';
        for (const Index box : mark.boxes) text << (box < 0 ? "" : " " + nameOfBox(box));
        text << '\n';
    }
    for (const auto& way : picture.ways) {
        text << "way: " << way.words << ':';
        for (const Index box : picture.boxesOf(way)) text << ' ' << nameOfBox(box);
        text << '\n';
        for (const auto& piece : picture.piecesOf(way)) {
            text << "    " << piece.x1 << ' ' << piece.y1 << " - " << piece.x2 << ' ' << piece.y2 << '\n';
        }
    }
    if (picture.other >= 0) {
        text << nameOfBox(picture.focus) << " is the " << picture.focusIs << ", " << nameOfBox(picture.other)
             << " the " << picture.otherIs << '\n';
    }
    return text.str();
}

std::vector<std::string> namesOf(const Golden& golden) {
    std::vector<std::string> names;
    for (const char* name :
         {"Opa", "Oma",  "Onkel", "Vater",  "Tante", "Opi",  "Omi",  "Mutter", "Muhme", "Alt",
          "Ich", "Jung", "Olga",  "Vetter", "Base",  "Mann", "Kind", "Erste",  "Stief", "Ein",
          "A",   "B",    "C",     "D",      "a",     "b",    "c",    "d"}) {
        try {
            (void)golden.family[name];
            names.emplace_back(name);
        } catch (const std::out_of_range&) {
        }
    }
    return names;
}

}  // namespace

TEST(GoldenCharts, areAsTheyWereLookedAt) {
    for (Golden& golden : goldens()) {
        golden.request.focus = golden.family[golden.focus];
        if (!golden.to.empty()) golden.request.to = golden.family[golden.to];
        const Picture picture = chartOf(golden.family.graph(), golden.request);
        const std::string text = textOf(picture, golden.family, namesOf(golden));
        const std::string path = std::string(OLVANE_CHARTS) + "/" + golden.name + ".txt";
        if (std::getenv("OLVANE_RECORD_CHARTS") != nullptr) {
            std::ofstream(path + ".new") << text;
            continue;
        }
        std::ostringstream expected;
        expected << std::ifstream(path).rdbuf();
        EXPECT_EQ(text, expected.str()) << golden.name;
    }
}
