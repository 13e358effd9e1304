// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One path for each style, so that a screen and a file draw a family by as few elements as can be. What lies flat jumps over
// another family's line with a small arc.

#include <olvane/draw/LinePathsInternal.h>

#include <algorithm>
#include <array>
#include <utility>

#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::draw {

namespace {

using picture::Family;
using picture::Line;
using picture::LineRole;
using picture::Picture;

constexpr double kBridge = 4;  // px, the radius of a jump

LineStyle styleOf(kin::UnionState state) {
    switch (state) {
        case kin::UnionState::divorced:
            return LineStyle::divorced;
        case kin::UnionState::unmarried:
            return LineStyle::unmarried;
        case kin::UnionState::married:
        case kin::UnionState::unknown:
            break;
    }
    return LineStyle::plain;
}

LineStyle styleOf(kin::ChildKind kind) {
    switch (kind) {
        case kin::ChildKind::adopted:
            return LineStyle::adopted;
        case kin::ChildKind::foster:
            return LineStyle::foster;
        case kin::ChildKind::step:
            return LineStyle::step;
        case kin::ChildKind::sealing:
            return LineStyle::sealing;
        case kin::ChildKind::birth:
        case kin::ChildKind::unknown:
            break;
    }
    return LineStyle::plain;
}

LineStyle styleOfPiece(const Picture& picture, const Family& family, const Line& line) {
    if (line.role == LineRole::marriage) return styleOf(family.style);
    if (line.child == picture::kNone) return LineStyle::plain;
    const auto children = picture.children(family);
    const auto found = std::find(children.begin(), children.end(), line.child);
    if (found == children.end()) return LineStyle::plain;
    return styleOf(picture.kinds(family)[static_cast<std::size_t>(found - children.begin())]);
}

// Up in a quarter of a circle, over one line or several that are close, and down again.
void appendJumps(std::string& path, const Picture& picture, const Line& line, const Frame& frame) {
    std::vector<double> places;
    for (const double place : picture.bridgesOf(line)) places.push_back(frame.x(place));
    kin::mergeSort(places.begin(), places.end());
    const Number r = number(kBridge);
    for (std::size_t i = 0, next = 0; i < places.size(); i = next) {
        while (next < places.size() && places[next] - places[i == next ? i : next - 1] <= 2 * kBridge) ++next;
        put(path, "H", number(places[i] - kBridge), "a", r, " ", r, " 0 0 1 ", r, " -", r);
        if (next - i > 1) put(path, "H", number(places[next - 1]));
        put(path, "a", r, " ", r, " 0 0 1 ", r, " ", r);
    }
}

std::string pathOf(const Picture& picture, const Line& line, const Frame& frame) {
    const double x1 = frame.x(std::min(line.x1, line.x2));
    const double x2 = frame.x(std::max(line.x1, line.x2));
    if (line.x1 == line.x2) {
        return joined("M", number(x1), " ", number(frame.y(std::min(line.y1, line.y2))), "V",
                      number(frame.y(std::max(line.y1, line.y2))));
    }
    if (line.y1 != line.y2) {
        return joined("M", number(frame.x(line.x1)), " ", number(frame.y(line.y1)), "L",
                      number(frame.x(line.x2)), " ", number(frame.y(line.y2)));
    }
    std::string path = joined("M", number(x1), " ", number(frame.y(line.y1)));
    appendJumps(path, picture, line, frame);
    put(path, "H", number(x2));
    return path;
}

}  // namespace

std::string_view dashesOf(LineStyle style) {
    constexpr auto kDashes =
        std::to_array<std::string_view>({"", "7 5", "3 3", "2 4", "9 3 2 3", "12 3", "1 3"});
    return kDashes[static_cast<std::size_t>(style)];
}

std::string_view meaningOf(LineStyle style, kin::Language language) {
    constexpr auto kMeanings = std::to_array<Phrase>({Phrase::divorced, Phrase::unmarried, Phrase::adopted,
                                                      Phrase::foster, Phrase::step, Phrase::sealing});
    if (style == LineStyle::plain) return {};
    return wordsOf(kMeanings[static_cast<std::size_t>(style) - 1], language);
}

std::vector<LinePath> linePathsOf(const Picture& picture, const Family& family, const Frame& frame) {
    std::array<std::string, kLineStyles> data;
    for (const Line& line : picture.linesOf(family)) {
        data[static_cast<std::size_t>(styleOfPiece(picture, family, line))] += pathOf(picture, line, frame);
    }
    std::vector<LinePath> paths;
    for (std::size_t style = 0; style < kLineStyles; ++style) {
        if (!data[style].empty()) paths.push_back({static_cast<LineStyle>(style), std::move(data[style])});
    }
    return paths;
}

std::vector<LinePath> linePathsOf(const Picture& picture, const Family& family) {
    return linePathsOf(picture, family, kScreenFrame);
}

}  // namespace olvane::draw
