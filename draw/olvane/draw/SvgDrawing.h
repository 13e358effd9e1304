// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include <olvane/draw/DrawingShape.h>
#include <olvane/draw/DrawingTheme.h>
#include <olvane/draw/PersonLabel.h>
#include <olvane/host/LayoutText.h>

namespace olvane::draw {

// What a picture shows: a layout, and what its host knows of the persons in it.
//
// Holds: the questions are asked for persons of the records and for the children of add-nodes, never for an
//        add-node, and must give the same answer to the same question. labelOf is required.
// Fails: whatever a question throws passes on.
struct DrawingContent {
    std::vector<LayoutRecord> records;
    std::int64_t focusId = 0;
    std::function<PersonLabel(std::int64_t id)> labelOf;
    // How the person came to its parents; by birth where not set.
    std::function<ParentLink(std::int64_t id)> parentLinkOf;
    // The marriage of the two ended by divorce; none did where not set.
    std::function<bool(std::int64_t id, std::int64_t spouseId)> isDivorced;
};

struct DrawingOptions {
    LineDirection direction = LineDirection::downward;
    BoxSize box;
    const DrawingTheme* theme = &lightTheme();
    // What the picture is called, for a screen reader. UTF-8, data like every other text.
    std::string title = "Family tree";
    // Sets the title above the picture as well.
    bool headline = false;
};

// A place in a picture, in px.
struct PictureArea {
    double x = 0;
    double y = 0;
    double width = 0;
    double height = 0;
};

// A box or stroke of a picture: where it is to be seen, and which bytes of the text draw it.
struct PictureBox {
    PictureArea area;
    std::size_t start = 0;
    std::size_t length = 0;
};

// A finished picture.
//
// Units: px, two for each point of the layout.
// Holds: strokes and boxes come in the order of the text, all strokes before the first box; without the bytes
//        of some of them the rest is still a picture.
struct SvgPicture {
    std::string svg;
    int width = 0;
    int height = 0;
    std::vector<PictureBox> boxes;
    std::vector<PictureBox> strokes;
    std::vector<PictureArea> lines;  // every stroke of a line; those have no width or no height
    PictureArea legend;              // of no size where there is none
};

// A person's name for a sentence; "Living" or "Name not known" where there is none to tell.
std::string fullName(const PersonLabel& label);

// Draws a layout as SVG: lines below, boxes with names above, a legend where lines of a special kind are
// used.
//
// Holds: the same content gives the same bytes. Texts stay texts; they are measured and fit into their boxes.
//        Nothing in a label or title becomes markup. A picture without records is a page that says so.
SvgPicture drawSvg(const DrawingContent& content, const DrawingOptions& options);

}  // namespace olvane::draw
