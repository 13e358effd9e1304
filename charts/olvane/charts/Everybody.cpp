// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/Everybody.h>

#include <algorithm>
#include <optional>
#include <stdexcept>
#include <utility>

#include <olvane/charts/EverybodyLayoutInternal.h>
#include <olvane/charts/EverybodyPictureInternal.h>

namespace olvane::charts {

namespace {

bool runsSideways(Direction direction) {
    return direction == Direction::left || direction == Direction::right;
}

bool isMirrored(Direction direction) {
    return direction == Direction::up || direction == Direction::left;
}

// From a chart that runs down to one that runs the way that was asked for.
void turn(picture::Picture& picture, Direction direction) {
    double bottom = 0;
    for (const picture::Box& box : picture.boxes) bottom = std::max(bottom, box.y + double{box.height});
    const bool mirror = isMirrored(direction);
    const bool sideways = runsSideways(direction);
    for (picture::Box& box : picture.boxes) {
        if (mirror) box.y = bottom - box.y - double{box.height};
        if (!sideways) continue;
        std::swap(box.x, box.y);
        std::swap(box.width, box.height);
    }
    for (picture::Line& line : picture.lines) {
        if (mirror) {
            line.y1 = bottom - line.y1;
            line.y2 = bottom - line.y2;
        }
        if (!sideways) continue;
        std::swap(line.x1, line.y1);
        std::swap(line.x2, line.y2);
    }
}

}  // namespace

picture::Picture everybodyChart(const kin::KinGraph& graph, const EverybodyOptions& options) {
    if (options.focus < 0 || options.focus >= graph.personCount()) {
        throw std::out_of_range("the focus of a chart is not in the family");
    }
    BoxSizes boxes;
    boxes.each = options.boxSizes;
    boxes.turned = runsSideways(options.direction);
    boxes.boxWidth = double{boxes.turned ? options.sizes.boxHeight : options.sizes.boxWidth};
    boxes.boxHeight = double{boxes.turned ? options.sizes.boxWidth : options.sizes.boxHeight};
    boxes.gapX = double{options.sizes.gapX};
    boxes.gapY = double{options.sizes.gapY};
    std::vector<PartLayout> parts;
    EverybodyOptions left = options;
    std::optional<EarlierPicture> earlier;
    if (options.earlier != nullptr && !options.earlier->isRound()) {
        earlier = earlierPictureOf(graph, *options.earlier, boxes.turned, isMirrored(options.direction));
    }
    if (boxes.turned && options.aspect > 0) left.aspect = 1 / options.aspect;
    for (const Component& part : componentsOf(graph)) {
        const bool hasFocus = std::binary_search(part.persons.begin(), part.persons.end(), options.focus);
        if (options.onePart && !hasFocus) continue;
        parts.push_back(layOutPart(part, boxes, left, earlier ? &*earlier : nullptr));
        if (left.marks > 0) left.marks = std::max(0, left.marks - parts.back().marksMade);
    }
    picture::Picture picture = pictureOfParts(graph, parts, boxes, options.focus);
    turn(picture, options.direction);
    return picture;
}

}  // namespace olvane::charts
