// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the words stand that say what the ends of a kinship are to one another.

#include <gtest/gtest.h>

#include <olvane/charts/BoxForm.h>
#include <olvane/charts/Charts.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/picture/KinshipPlates.h>
#include <olvane/source/GedcomKin.h>

#include <algorithm>
#include <cstdlib>
#include <string>
#include <vector>

#include "AnyKin.h"
#include "Chooser.h"

using namespace olvane::kin;
using namespace olvane::charts;
using olvane::picture::Box;
using olvane::picture::KinshipPlate;
using olvane::picture::kinshipPlates;
using olvane::picture::Mark;
using olvane::picture::MarkedEdges;
using olvane::picture::Picture;
using olvane::picture::PlateStyle;

namespace {

// As drawings have them: 10.5 px at 2 px for a point.
PlateStyle smallPlates() {
    PlateStyle style;
    style.letters = 5.25;
    style.pitch = 6.5;
    style.inset = 3.5;
    style.frame = 2.5;
    style.onBorder = 0.5;
    style.marks = 6.5;
    style.frames = 3.5;
    return style;
}

// As a screen of 1 px for a point has them.
PlateStyle largePlates() {
    PlateStyle style;
    style.letters = 10.5;
    style.pitch = 13;
    style.inset = 8;
    style.frame = 6;
    style.onBorder = 2;
    style.marks = 14;
    style.frames = 8;
    return style;
}

std::vector<MarkedEdges> edgesOf(const Picture& picture, bool withCounts) {
    std::vector<MarkedEdges> edges(picture.boxes.size(), {withCounts, false});
    for (const Mark& mark : picture.marks) {
        for (const auto box : mark.boxes) {
            if (box >= 0) edges[static_cast<std::size_t>(box)] = {true, true};
        }
    }
    return edges;
}

bool overlap(double x1, double y1, double x2, double y2, const KinshipPlate& plate) {
    return x1 < plate.right() && plate.x < x2 && y1 < plate.bottom() && plate.y < y2;
}

std::string textOf(const KinshipPlate& plate) {
    std::string text;
    for (const std::string& line : plate.lines) text += line;
    std::erase(text, ' ');
    return text;
}

std::string withoutSpaces(std::string text) {
    std::erase(text, ' ');
    return text;
}

void expectFreePlates(const Picture& picture, const PlateStyle& style, bool withCounts) {
    const std::vector<MarkedEdges> edges = edgesOf(picture, withCounts);
    const std::vector<KinshipPlate> plates = kinshipPlates(picture, style, edges);
    for (const KinshipPlate& plate : plates) {
        EXPECT_EQ(textOf(plate),
                  withoutSpaces(plate.box == picture.other ? picture.otherIs : picture.focusIs));
        for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
            const Box& box = picture.boxes[i];
            const bool isOwn = static_cast<olvane::picture::Index>(i) == plate.box;
            const double top = box.y - (edges[i].top ? style.marks : 0) + (isOwn ? style.onBorder : 0);
            const double bottom = box.y + static_cast<double>(box.height) +
                                  (edges[i].bottom ? style.marks : 0) - (isOwn ? style.onBorder : 0);
            const double side = isOwn ? style.onBorder : 0;
            EXPECT_FALSE(
                overlap(box.x + side, top, box.x + static_cast<double>(box.width) - side, bottom, plate))
                << "box " << i << " at " << box.x << ' ' << box.y << ' ' << box.width << ' ' << box.height
                << ", the plate of box " << plate.box << " at " << plate.x << ' ' << plate.y << ' '
                << plate.width << ' ' << plate.height;
        }
    }
    if (plates.size() == 2) {
        EXPECT_FALSE(overlap(plates[0].x, plates[0].y, plates[0].right(), plates[0].bottom(), plates[1]));
    }
}

ChartRequest requestOf(Place focus, Place to, Direction direction) {
    ChartRequest request;
    request.view = View::kinship;
    request.focus = focus;
    request.to = to;
    request.direction = direction;
    setBoxForm(request, usualBoxForm(View::kinship, direction));
    return request;
}

// What the page asks for.
ChartRequest onScreen(ChartRequest request) {
    const bool isWide = usualBoxForm(View::kinship, request.direction) == BoxForm::wide;
    request.sizes = isWide ? ChartSizes{196, 58, 57, 36} : ChartSizes{118, 104, 22, 57};
    return request;
}

}  // namespace

TEST(KinshipPlates, coverNoBoxAndNoPlateInWhateverFamily) {
    for (unsigned seed = 1; seed <= 150; ++seed) {
        SCOPED_TRACE(seed);
        const Chooser choose(seed);
        const int persons = 2 + choose(40);
        const int unions = choose(persons);
        const bool isOrderly = choose(3) != 0;
        const AnyKin family = AnyKin::make(persons, unions, isOrderly, choose);
        const KinGraph graph = family.graph();
        const Place from = choose(graph.personCount());
        const Place to = choose(graph.personCount());
        ChartRequest request = requestOf(from, to, static_cast<Direction>(choose(4)));
        request.compact = choose(4) == 0;
        request.language = kLanguages[static_cast<std::size_t>(choose(3))];
        expectFreePlates(chartOf(graph, request), smallPlates(), false);
        expectFreePlates(chartOf(graph, onScreen(request)), largePlates(), true);
        if (HasFailure()) return;
    }
}

TEST(KinshipPlates, coverNoBoxAndNoPlateInARealFamily) {
    const char* folder = std::getenv("OLVANE_GEDCOM_DIR");
    if (folder == nullptr) GTEST_SKIP() << "OLVANE_GEDCOM_DIR is not set";
    const KinGraph graph = olvane::gedcom::kinGraphOf(
        olvane::gedcom::readGedcomFile(std::string(folder) + "/history/royal92.ged"));
    for (Place person = 0; person < graph.personCount(); person += 131) {
        SCOPED_TRACE(person);
        const Place to = (person * 7 + 500) % graph.personCount();
        const ChartRequest request = requestOf(person, to, static_cast<Direction>(person % 4));
        expectFreePlates(chartOf(graph, request), smallPlates(), false);
        expectFreePlates(chartOf(graph, onScreen(request)), largePlates(), true);
        if (HasFailure()) return;
    }
}

namespace {

// Two boxes of 55 by 80 below one another, 30 apart.
Picture twoBoxes() {
    Picture picture;
    for (const double y : {0.0, 110.0}) {
        Box box;
        box.id = static_cast<std::int64_t>(y) + 1;
        box.y = y;
        box.width = 55;
        box.height = 80;
        picture.boxes.push_back(box);
    }
    picture.focus = 0;
    picture.other = 1;
    return picture;
}

}  // namespace

TEST(KinshipPlates, standBelowTheMiddleOfTheirBoxes) {
    Picture picture = twoBoxes();
    picture.otherIs = "aunt";
    const std::vector<KinshipPlate> plates = kinshipPlates(picture, smallPlates(), edgesOf(picture, false));
    ASSERT_EQ(plates.size(), 1u);
    EXPECT_EQ(plates[0].box, 1);
    EXPECT_EQ(plates[0].lines, std::vector<std::string>{"aunt"});
    EXPECT_EQ(plates[0].y, 110 + 80 - 0.5);
    EXPECT_DOUBLE_EQ(plates[0].x + plates[0].width / 2, 27.5);
    EXPECT_EQ(plates[0].height, 6.5 + 2.5);
}

TEST(KinshipPlates, giveWayToLinesAndMarks) {
    Picture picture = twoBoxes();
    picture.otherIs = "aunt";
    picture.lines.push_back({});
    picture.lines.back().x1 = picture.lines.back().x2 = 27.5;
    picture.lines.back().y1 = 190;
    picture.lines.back().y2 = 230;
    const KinshipPlate beside = kinshipPlates(picture, smallPlates(), edgesOf(picture, false))[0];
    EXPECT_FALSE(overlap(27, 190, 28, 230, beside));
    picture.lines.clear();
    std::vector<MarkedEdges> edges = edgesOf(picture, false);
    edges[1] = {true, true};
    EXPECT_EQ(kinshipPlates(picture, smallPlates(), edges)[0].y, 110 + 80 + 6.5);
}

TEST(KinshipPlates, breakLongTextsSoThatNothingIsCut) {
    Picture picture = twoBoxes();
    picture.focusIs = "great-great-grandmother (father's side); related in 15 ways";
    const KinshipPlate plate = kinshipPlates(picture, smallPlates(), edgesOf(picture, false))[0];
    EXPECT_GT(plate.lines.size(), 1u);
    EXPECT_EQ(textOf(plate), withoutSpaces(picture.focusIs));
}
