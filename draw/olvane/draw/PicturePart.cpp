// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A window of a finished picture, for sheets of paper and for what somebody sees of it.

#include <olvane/draw/PicturePartInternal.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <limits>
#include <stdexcept>

#include <olvane/draw/LineArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

constexpr double kStrokeRoom = 8;    // px; more than any stroke is wide
constexpr double kAroundBoxes = 12;  // points, less than half a gap between any two boxes

bool shows(const PictureArea& window, const PictureArea& area) {
    return area.x <= window.x + window.width && area.x + area.width >= window.x &&
           area.y <= window.y + window.height && area.y + area.height >= window.y;
}

// With the halves of its width beside it.
PictureArea inked(const PictureArea& stroke) {
    return {stroke.x - kStrokeRoom, stroke.y - kStrokeRoom, stroke.width + 2 * kStrokeRoom,
            stroke.height + 2 * kStrokeRoom};
}

}  // namespace

std::string elementsWithin(const SvgPicture& picture, const PictureArea& window) {
    std::size_t done = picture.svg.find("<svg");
    std::string elements;
    const auto leaveOut = [&](const PictureBox& piece) {
        elements.append(picture.svg, done, piece.start - done);
        done = piece.start + piece.length;
    };
    for (const PictureBox& stroke : picture.strokes) {
        if (!shows(window, inked(stroke.area))) leaveOut(stroke);
    }
    for (const PictureBox& box : picture.boxes) {
        if (!shows(window, box.area)) leaveOut(box);
    }
    return elements.append(picture.svg, done);
}

namespace {

// In px, cut to the picture.
PictureArea windowOf(const SvgPicture& picture, const PictureArea& part) {
    for (const double length : {part.x, part.y, part.width, part.height}) {
        if (!std::isfinite(length)) throw std::invalid_argument("a part that is not finite");
    }
    const auto cut = [](double at, int size) { return std::clamp(at, 0.0, static_cast<double>(size)); };
    const double left = cut(picture.originX + part.x * Frame::kScale, picture.width);
    const double top = cut(picture.originY + part.y * Frame::kScale, picture.height);
    const double right = cut(picture.originX + (part.x + part.width) * Frame::kScale, picture.width);
    const double bottom = cut(picture.originY + (part.y + part.height) * Frame::kScale, picture.height);
    if (right - left < 1 || bottom - top < 1)
        throw std::invalid_argument("a part without any of the picture");
    return {left, top, right - left, bottom - top};
}

}  // namespace

PictureArea areaAround(const picture::Picture& picture, std::span<const picture::Index> boxes) {
    if (boxes.empty()) return {};
    double left = std::numeric_limits<double>::infinity();
    double top = left;
    double right = -left;
    double bottom = -left;
    for (const picture::Index index : boxes) {
        if (index < 0) throw std::out_of_range("a place of no box");
        const picture::Box& box = picture.boxes.at(static_cast<std::size_t>(index));
        left = std::min(left, box.x);
        top = std::min(top, box.y);
        right = std::max(right, box.x + static_cast<double>(box.width));
        bottom = std::max(bottom, box.y + static_cast<double>(box.height));
    }
    return {left - kAroundBoxes, top - kAroundBoxes, right - left + 2 * kAroundBoxes,
            bottom - top + 2 * kAroundBoxes};
}

SvgPicture partOf(const SvgPicture& picture, const PictureArea& part, const std::string& title) {
    const PictureArea window = windowOf(picture, part);
    SvgPicture cut;
    cut.width = static_cast<int>(std::ceil(window.width));
    cut.height = static_cast<int>(std::ceil(window.height));
    cut.originX = picture.originX - window.x;
    cut.originY = picture.originY - window.y;
    cut.text = picture.text;
    put(cut.svg,
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"",
        whole(cut.width), "\" height=\"", whole(cut.height), "\" viewBox=\"", number(window.x), " ",
        number(window.y), " ", whole(cut.width), " ", whole(cut.height), "\">\n<title>",
        Escaped{picture::cutText(title)}, "</title>\n", elementsWithin(picture, window), "</svg>\n");
    return cut;
}

}  // namespace olvane::draw
