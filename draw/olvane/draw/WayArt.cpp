// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/draw/WayArtInternal.h>

#include <array>

#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/TextMetrics.h>

namespace olvane::draw {

namespace {

std::string pathOf(const picture::Picture& picture, const picture::Way& way, const Frame& frame) {
    std::string path;
    for (const picture::WayPiece& piece : picture.piecesOf(way)) {
        path += "M" + px(frame.x(piece.x1)) + " " + px(frame.y(piece.y1)) + "L" + px(frame.x(piece.x2)) +
                " " + px(frame.y(piece.y2));
    }
    return path;
}

}  // namespace

std::string_view wayColour(const DrawingTheme& theme, std::size_t way) {
    return theme.ways[way % theme.ways.size()];
}

std::string_view wayDashes(std::size_t way) {
    constexpr auto kDashes =
        std::to_array<std::string_view>({"", "9 4", "3 3", "12 3 3 3", "16 5", "6 3 2 3 2 3", "5 2", "2 5"});
    return kDashes[way % kDashes.size()];
}

void appendWays(std::string& svg, const picture::Picture& picture, const DrawingTheme& theme,
                const Frame& frame) {
    for (std::size_t i = picture.ways.size(); i-- > 0;) {
        const picture::Way& way = picture.ways[i];
        if (way.pieceCount == 0) continue;
        svg += "<g><title>" + escaped(picture::cleanText(way.words)) +
               "</title><path fill=\"none\" stroke=\"" + std::string(wayColour(theme, i)) +
               "\" stroke-width=\"" + px(kWayWidth) + "\"";
        if (!wayDashes(i).empty()) svg += " stroke-dasharray=\"" + std::string(wayDashes(i)) + "\"";
        svg += " stroke-linecap=\"" + std::string(wayDashes(i).empty() ? "square" : "butt") + "\" d=\"" +
               pathOf(picture, way, frame) + "\"/></g>\n";
    }
}

}  // namespace olvane::draw
