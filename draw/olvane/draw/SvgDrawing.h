// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/draw/DrawingTheme.h>
#include <olvane/draw/detail/PictureArea.h>
#include <olvane/kin/Language.h>
#include <olvane/kin/PersonLabel.h>
#include <olvane/picture/Picture.h>

namespace olvane::draw {

// What is drawn: a picture, and what its host knows of the persons and families in it.
//
// Holds: the questions are asked for persons and families of the picture, and must give the same answer to the
//        same question. labelOf is required.
// Fails: whatever a question throws passes on.
struct DrawingContent {
    picture::Picture picture;
    std::function<kin::PersonLabel(std::int64_t id)> labelOf;
    // What stands at the marriage line of a family that has a number, such as a year; nothing where not set.
    std::function<std::string(std::uint32_t family)> familyLabelOf;
    // The address of somebody's photograph, as of an image in SVG: it stands in the box in place of the silhouette. An
    // empty one for nobody's. Not asked for persons who may be living and are hidden, nor for cells of round charts.
    std::function<std::string(std::int64_t id)> photoOf;
    // Whether the picture's numbers of hidden relatives are known; else the boxes' flags are all there is.
    bool countsHidden = false;
    // Where children stand, seen from their parents; the signs of what is expressed without a line point there.
    picture::Side laterSide = picture::Side::bottom;
};

struct DrawingOptions {
    const DrawingTheme* theme = &lightTheme();
    // What the picture is called, for a screen reader. UTF-8, data like every other text.
    std::string title = "Family tree";
    // Sets the title above the picture as well.
    bool headline = false;
    // Names in boxes are set no smaller than this, in px, as far as the boxes allow; then they take the whole box, and
    // silhouettes are left out. 0 for the usual sizes. A round chart sets names as its cells allow, and where there may
    // be photographs all sizes are the usual ones.
    double leastNameSize = 0;
    // The size of the picture, by the size that it has at 96 px an inch.
    double scale = 1;
    // Of everything that the picture says beside its data: marks, legend, titles of boxes.
    kin::Language language = kin::Language::english;
};

// An element of a picture, a box or the lines of a family: where it is seen, and which bytes draw it.
struct PictureBox {
    PictureArea area;
    std::size_t start = 0;
    std::size_t length = 0;
};

// How large the letters of a picture are, in px; 0 where there are none.
struct TextSizes {
    double smallestName = 0;
    double smallest = 0;  // of names and all else

    void addName(double size) {
        if (smallestName == 0 || size < smallestName) smallestName = size;
        add(size);
    }
    void add(double size) {
        if (smallest == 0 || size < smallest) smallest = size;
    }
};

// A finished picture.
//
// Units: px, two for each point of the picture; the scale of the options is not counted in.
// Holds: strokes, one for each family with lines, and boxes come in the order of the text, all strokes before
//        the first box; without the bytes of some of them the rest is still a picture.
struct SvgPicture {
    std::string svg;
    int width = 0;
    int height = 0;
    std::vector<PictureBox> boxes;
    std::vector<PictureBox> strokes;
    std::vector<PictureArea> lines;  // every stroke of a line; those have no width or no height
    PictureArea legend;              // of no size where there is none
    double originX = 0;              // where the point (0, 0) of the layout lies
    double originY = 0;
    TextSizes text;
};

// What a picture is called that nobody gave a title: "Family of Ada Berg" for the view "family".
std::string titleOf(std::string_view view, const DrawingContent& content,
                    kin::Language language = kin::Language::english);

// Draws a picture as SVG: lines below, boxes with names above, marks at their edges, a legend where lines of a
// special kind are used. A round chart is drawn as rings of cells.
//
// Holds: the same content gives the same bytes. Texts stay texts; they are measured and fit into their boxes.
//        Nothing in a label or title becomes markup. A picture without boxes is a page that says so.
SvgPicture drawSvg(const DrawingContent& content, const DrawingOptions& options);

// Where some boxes of a picture stand, by their places in it, with half a gap around them; in points.
//
// Fails: std::out_of_range for a place of no box.
PictureArea areaAround(const picture::Picture& picture, std::span<const picture::Index> boxes);

// A part of a picture: the same elements, without the boxes and strokes that lie outside of it.
//
// Units: the part is in points of the layout, like the boxes of a picture::Picture, and is cut to the picture's edges.
// Holds: the picture was drawn with the scale 1.
// Fails: std::invalid_argument for a part that shows nothing of the picture, or is not finite.
SvgPicture partOf(const SvgPicture& picture, const PictureArea& part, const std::string& title);

}  // namespace olvane::draw
