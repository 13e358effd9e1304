// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "PictureArt.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/draw/DescentColours.h>
#include <olvane/draw/FanCell.h>
#include <olvane/draw/LinePaths.h>
#include <olvane/picture/TextFit.h>

#include "JsonText.h"
#include "OpenFile.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

std::string styleRow(kin::Language language) {
    std::string row;
    for (std::size_t i = 0; i < draw::kLineStyles; ++i) {
        const auto style = static_cast<draw::LineStyle>(i);
        row.append(i == 0 ? "" : ";").append(draw::dashesOf(style)).append("\t");
        row.append(draw::meaningOf(style, language));
    }
    return row + "\n";
}

void appendFamily(std::string& art, const picture::Picture& picture, const picture::Family& family) {
    const char* between = "";
    for (const draw::LinePath& path : draw::linePathsOf(picture, family)) {
        art += between;
        art += static_cast<char>('0' + static_cast<int>(path.style));
        art += path.data;
        between = ";";
    }
    art += '\n';
}

void appendCell(std::string& art, const picture::Picture& fan, std::size_t box,
                const draw::DescentColours& colours) {
    draw::FanCell cell = draw::FanCell::of(fan, box);
    cell.middleX = fan.middleX;
    cell.middleY = fan.middleY;
    art += std::to_string(colours.of(box)) + " " + draw::outlineOf(cell) + "\n";
}

std::string readable(std::string_view text) {
    return picture::cleanText(picture::cutText(text));
}

draw::FanText fanTextOf(const char* given, const char* surname, int surnameFirst, std::string_view facts) {
    draw::FanText text{readable(given), readable(surname), surnameFirst != 0, {}};
    while (!facts.empty()) {
        const std::size_t end = std::min(facts.find('\n'), facts.size());
        text.facts.push_back(readable(facts.substr(0, end)));
        facts.remove_prefix(std::min(end + 1, facts.size()));
    }
    return text;
}

long long hundredths(double value) {
    return std::llround(100 * value);
}

std::string placedJson(const std::vector<draw::PlacedFanLine>& lines) {
    JsonText json;
    json.begin();
    for (const draw::PlacedFanLine& line : lines) {
        json.begin();
        json.string(line.text);
        json.number(line.isName ? 1 : 0);
        json.number(picture::runsRightToLeft(line.text) ? 1 : 0);
        for (const double value : {line.size, line.x, line.y, line.turn, line.size * draw::kFanBaseline})
            json.number(hundredths(value));
        json.end();
    }
    json.end();
    return std::move(json).take();
}

}  // namespace

std::string artOf(const picture::Picture& picture, kin::Language language) {
    std::string art = styleRow(language);
    for (const picture::Family& family : picture.families) appendFamily(art, picture, family);
    if (!picture.isRound()) return art;
    const draw::DescentColours colours(picture);
    for (std::size_t box = 0; box < picture.arcs.size(); ++box) appendCell(art, picture, box, colours);
    return art;
}

}  // namespace olvane::js

using namespace olvane;

// The lines of text in a cell of which the centre of the chart is (0, 0), facts on lines of their own: of each its text, 1 for
// a name, 1 for letters from right to left; then in hundredths the size of its letters, its middle,
// the degrees by which it is turned around that, and how far its baseline is below it. Null where there is no memory.
OLVANE_EXPORT("fan_text")
const char* fanText(const char* given, const char* surname, int surnameFirst, const char* facts, double from,
                    double to, double inner, double outer, int isCentre) {
    return js::textOrRefusal([&] {
        const draw::FanCell cell{from, to, inner, outer, 0, 0, isCentre != 0};
        return js::placedJson(draw::placedTextOf(cell, js::fanTextOf(given, surname, surnameFirst, facts)));
    });
}
