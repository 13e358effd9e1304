// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Marks, badges and captions cover no text, and not one another, whatever chart of whatever family is drawn. Read from
// the SVG itself.

#include <gtest/gtest.h>

#include <regex>
#include <string>
#include <vector>

#include <olvane/charts/Charts.h>
#include <olvane/charts/LaterSide.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/picture/TextMetrics.h>

#include "AnyKin.h"
#include "Chooser.h"

namespace olvane::draw {
namespace {

// In px of the page.
struct Area {
    double left = 0;
    double top = 0;
    double right = 0;
    double bottom = 0;
    std::string what;

    bool meets(const Area& other) const {
        constexpr double kSlack = 0.2;  // coordinates have one decimal
        return left + kSlack < other.right && other.left + kSlack < right && top + kSlack < other.bottom &&
               other.top + kSlack < bottom;
    }
};

struct Areas {
    std::vector<Area> texts;   // names, years and details
    std::vector<Area> plates;  // badges, marks and captions
};

std::string attribute(const std::string& element, const std::string& name) {
    const std::string key = " " + name + "=\"";
    const std::size_t start = element.find(key);
    if (start == std::string::npos) return "";
    const std::size_t from = start + key.size();
    return element.substr(from, element.find('"', from) - from);
}

double numberOf(const std::string& element, const std::string& name) {
    const std::string text = attribute(element, name);
    return text.empty() ? 0 : std::stod(text);
}

// From the top of the letters to below the line.
Area areaOfText(const std::string& element, const std::string& content, double x, double y) {
    const double size = numberOf(element, "font-size");
    const double width = picture::textWidth(content, {size, !attribute(element, "font-weight").empty()});
    const std::string anchor = attribute(element, "text-anchor");
    const double left = x + numberOf(element, "x") - (anchor == "middle" ? width / 2 : 0);
    const double baseline = y + numberOf(element, "y");
    return {left, baseline - 0.73 * size, left + width, baseline + 0.2 * size, "'" + content + "'"};
}

Area areaOfPlate(const std::string& element, double x, double y) {
    const double left = x + numberOf(element, "x");
    const double top = y + numberOf(element, "y");
    return {left, top, left + numberOf(element, "width"), top + numberOf(element, "height"), "a plate"};
}

// Within a box, a group is a badge or a mark, and the one rectangle with corners of 6 a caption, which comes last.
void readBox(const std::string& svg, Areas& areas) {
    static const std::regex kElement(R"(<(/?g|rect|text)\b([^>]*)>([^<]*))");
    std::smatch place;
    static const std::regex kPlace(R"(translate\(([-\d.]+) ([-\d.]+)\))");
    ASSERT_TRUE(std::regex_search(svg, place, kPlace));
    const double x = std::stod(place[1]);
    const double y = std::stod(place[2]);
    int depth = 0;
    bool isCaption = false;
    for (std::sregex_iterator one(svg.begin(), svg.end(), kElement), end; one != end; ++one) {
        const std::string name = (*one)[1];
        const std::string element = (*one)[2];
        if (name == "g") ++depth;
        if (name == "/g") --depth;
        if (name == "rect" && attribute(element, "rx") == "6") isCaption = true;
        const bool isPlate = depth > 1 || isCaption;
        if (name == "rect" && isPlate) areas.plates.push_back(areaOfPlate(element, x, y));
        if (name == "text" && !isPlate) areas.texts.push_back(areaOfText(element, (*one)[3], x, y));
        if (name == "text" && isPlate) areas.plates.back().what += " '" + (*one)[3].str() + "'";
    }
}

Areas areasOf(const SvgPicture& picture) {
    Areas areas;
    for (const PictureBox& box : picture.boxes) readBox(picture.svg.substr(box.start, box.length), areas);
    return areas;
}

// Long and short names, years, dates and details, by the person.
kin::PersonLabel labelOf(std::int64_t id) {
    kin::PersonLabel label;
    label.sex = static_cast<kin::Sex>(id % 3);
    label.given = id % 5 == 0 ? "Maximiliane Wilhelmine Charlotte" : "Ada";
    label.surname = id % 7 == 0 ? "von Schleswig-Holstein-Sonderburg" : "Berg";
    if (id % 4 != 0) label.birth = id % 2 == 0 ? "1819" : "24 May 1819";
    if (id % 3 != 0) label.death = id % 2 == 0 ? "1901" : "22 January 1901";
    if (id % 6 == 0) label.details = {"Osborne House, Isle of Wight", "Queen of the United Kingdom"};
    return label;
}

DrawingContent contentOf(const Chooser& choose, charts::View view) {
    const int persons = 2 + choose(40);
    const int unions = choose(persons);
    const bool isOrderly = choose(3) != 0;
    const kin::KinGraph graph = AnyKin::make(persons, unions, isOrderly, choose).graph();
    charts::ChartRequest request;
    request.view = view;
    request.focus = choose(persons);
    request.to = choose(persons);
    request.direction = static_cast<charts::Direction>(choose(4));
    request.compact = choose(3) == 0;
    if (choose(2) == 0) {
        request.sizes.boxWidth = 105;
        request.sizes.boxHeight = 40;
    }
    DrawingContent content;
    content.picture = charts::chartOf(graph, request);
    for (picture::Box& box : content.picture.boxes) {
        if (choose(4) == 0) box.furtherParents = 1;
    }
    content.countsHidden = true;
    content.laterSide = charts::laterSideOf(request);
    content.labelOf = labelOf;
    return content;
}

TEST(Marks, badgesAndCaptionsCoverNoTextInAnyChart) {
    std::size_t plates = 0;
    for (unsigned seed = 1; seed <= 25; ++seed) {
        for (const charts::View view :
             {charts::View::near, charts::View::ancestors, charts::View::descendants, charts::View::hourglass,
              charts::View::relatives, charts::View::kinship, charts::View::everybody}) {
            const Chooser choose(seed * 100 + static_cast<unsigned>(view));
            const DrawingContent content = contentOf(choose, view);
            DrawingOptions options;
            if (choose(3) == 0) options.leastNameSize = 12;
            const Areas areas = areasOf(drawSvg(content, options));
            plates += areas.plates.size();
            for (std::size_t i = 0; i < areas.plates.size(); ++i) {
                const Area& plate = areas.plates[i];
                for (const Area& text : areas.texts) {
                    ASSERT_FALSE(plate.meets(text)) << charts::nameOf(view) << " " << seed << ": "
                                                    << plate.what << " covers " << text.what;
                }
                for (std::size_t j = 0; j < i; ++j) {
                    ASSERT_FALSE(plate.meets(areas.plates[j]))
                        << charts::nameOf(view) << " " << seed << ": " << plate.what << " and "
                        << areas.plates[j].what;
                }
            }
        }
    }
    EXPECT_GT(plates, 2000U);
}

}  // namespace
}  // namespace olvane::draw
