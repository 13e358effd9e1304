// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Writes a picture down as numbers, list after list. Doubles hold every index and every id that JavaScript can name.

#include "PictureAnswer.h"

#include <cmath>
#include <cstddef>
#include <exception>
#include <initializer_list>
#include <memory>
#include <stdexcept>
#include <utility>
#include <vector>

#include <olvane/picture/KinshipPlates.h>

#include "JsonText.h"
#include "OpenFile.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

constexpr std::size_t kBoxNumbers = 14;
constexpr std::size_t kLineNumbers = 8;

void append(std::vector<double>& numbers, std::initializer_list<double> values) {
    numbers.insert(numbers.end(), values);
}

void appendBox(std::vector<double>& numbers, const picture::Box& box) {
    const int flag = box.hasFlag ? (box.flag ? 1 : 0) : -1;
    append(numbers, {static_cast<double>(box.id), box.x, box.y, box.width, box.height,
                     static_cast<double>(box.childOf), static_cast<double>(box.repeat),
                     static_cast<double>(box.hiddenParents), static_cast<double>(box.hiddenPartners),
                     static_cast<double>(box.hiddenChildren), static_cast<double>(box.kind),
                     static_cast<double>(box.sex), static_cast<double>(flag),
                     static_cast<double>(box.furtherParents)});
}

void appendFamily(std::vector<double>& numbers, const picture::Family& family) {
    append(numbers, {static_cast<double>(family.firstMember), static_cast<double>(family.firstLine),
                     static_cast<double>(family.childCount), static_cast<double>(family.lineCount),
                     static_cast<double>(family.number), static_cast<double>(family.parentCount),
                     static_cast<double>(family.style)});
}

void appendLine(std::vector<double>& numbers, const picture::Line& line) {
    append(numbers, {line.x1, line.y1, line.x2, line.y2, static_cast<double>(line.child),
                     static_cast<double>(line.firstBridge), static_cast<double>(line.bridgeCount),
                     static_cast<double>(line.role)});
}

void appendMark(std::vector<double>& numbers, const picture::Mark& mark) {
    append(numbers, {static_cast<double>(mark.kind), static_cast<double>(mark.number),
                     static_cast<double>(mark.boxes[0]), static_cast<double>(mark.boxes[1]),
                     static_cast<double>(mark.boxes[2])});
}

void appendFolded(std::vector<double>& numbers, const picture::FoldedBranch& folded) {
    append(numbers, {static_cast<double>(folded.box), static_cast<double>(folded.count),
                     static_cast<double>(folded.branch), static_cast<double>(folded.side)});
}

void appendWay(std::vector<double>& numbers, const picture::Way& way) {
    append(numbers, {static_cast<double>(way.firstBox), static_cast<double>(way.boxCount),
                     static_cast<double>(way.ancestorCount), static_cast<double>(way.firstPiece),
                     static_cast<double>(way.pieceCount), static_cast<double>(way.kind)});
}

// Letters and marks as screens have them that show one px for each point.
picture::PlateStyle screenPlates() {
    picture::PlateStyle style;
    style.letters = 10.5;
    style.pitch = 13;
    style.inset = 8;
    style.frame = 6;
    style.onBorder = 2;
    style.marks = 14;
    style.frames = 8;
    return style;
}

bool hasHidden(const picture::Box& box) {
    return box.hasFlag ? box.flag : box.hiddenParents + box.hiddenPartners + box.hiddenChildren > 0;
}

// Counts of hidden relatives stand on top of boxes, and all marks below.
std::vector<picture::MarkedEdges> edgesOf(const picture::Picture& picture) {
    std::vector<picture::MarkedEdges> edges(picture.boxes.size());
    for (std::size_t i = 0; i < edges.size(); ++i) edges[i].top = hasHidden(picture.boxes[i]);
    for (const picture::Mark& mark : picture.marks) {
        for (const picture::Index box : mark.boxes) {
            if (box != picture::kNone) edges[static_cast<std::size_t>(box)].bottom = true;
        }
    }
    return edges;
}

// Of each plate its box, its place in hundredths of a point, and its lines.
void writePlates(JsonText& json, const picture::Picture& picture) {
    json.begin();
    if (picture.other != picture::kNone) {
        for (const picture::KinshipPlate& plate :
             picture::kinshipPlates(picture, screenPlates(), edgesOf(picture))) {
            json.begin();
            json.number(plate.box);
            for (const double value : {plate.x, plate.y, plate.width, plate.height})
                json.number(std::llround(100 * value));
            json.begin();
            for (const std::string& line : plate.lines) json.string(line);
            json.end();
            json.end();
        }
    }
    json.end();
}

}  // namespace

std::string textsOf(const picture::Picture& picture) {
    JsonText json;
    json.begin();
    json.string(picture.focusIs);
    json.string(picture.otherIs);
    writePlates(json, picture);
    for (const picture::Way& way : picture.ways) json.string(way.words);
    json.end();
    return std::move(json).take();
}

std::vector<double> numbersOf(const picture::Picture& picture) {
    std::vector<double> numbers;
    numbers.reserve(16 + kBoxNumbers * picture.boxes.size() + 2 * picture.members.size() +
                    kLineNumbers * picture.lines.size());
    append(numbers,
           {static_cast<double>(picture.boxes.size()), static_cast<double>(picture.arcs.size()),
            static_cast<double>(picture.families.size()), static_cast<double>(picture.members.size()),
            static_cast<double>(picture.lines.size()), static_cast<double>(picture.bridges.size()),
            static_cast<double>(picture.marks.size()), static_cast<double>(picture.focus),
            static_cast<double>(picture.ringRadii.size()), picture.middleX, picture.middleY,
            static_cast<double>(picture.other), static_cast<double>(picture.ways.size()),
            static_cast<double>(picture.wayBoxes.size()), static_cast<double>(picture.wayPieces.size()),
            static_cast<double>(picture.folded.size())});
    for (const picture::Box& box : picture.boxes) appendBox(numbers, box);
    for (const picture::Arc& arc : picture.arcs) {
        append(numbers, {static_cast<double>(arc.ring), arc.from, arc.to, static_cast<double>(arc.line)});
    }
    numbers.insert(numbers.end(), picture.ringRadii.begin(), picture.ringRadii.end());
    for (const picture::Family& family : picture.families) appendFamily(numbers, family);
    for (std::size_t i = 0; i < picture.members.size(); ++i) {
        append(numbers,
               {static_cast<double>(picture.members[i]), static_cast<double>(picture.childKinds[i])});
    }
    for (const picture::Line& line : picture.lines) appendLine(numbers, line);
    numbers.insert(numbers.end(), picture.bridges.begin(), picture.bridges.end());
    for (const picture::Mark& mark : picture.marks) appendMark(numbers, mark);
    for (const picture::Way& way : picture.ways) appendWay(numbers, way);
    numbers.insert(numbers.end(), picture.wayBoxes.begin(), picture.wayBoxes.end());
    for (const picture::WayPiece& piece : picture.wayPieces) {
        append(numbers, {piece.x1, piece.y1, piece.x2, piece.y2});
    }
    for (const picture::FoldedBranch& folded : picture.folded) appendFolded(numbers, folded);
    return numbers;
}

std::vector<double>* pictureAnswer(const std::function<picture::Picture()>& make,
                                   const std::function<void(std::vector<double>& numbers)>& addMore) {
    try {
        const picture::Picture picture = make();
        auto numbers = std::make_unique<std::vector<double>>(numbersOf(picture));
        if (addMore) addMore(*numbers);
        lastText = textsOf(picture);
        return numbers.release();
    } catch (const std::length_error&) {
        lastText = "too large";
    } catch (const std::exception& error) {
        lastText = error.what();
    }
    return nullptr;
}

}  // namespace olvane::js

OLVANE_EXPORT("picture_numbers") const double* pictureNumbers(const std::vector<double>* answer) {
    return answer->data();
}

OLVANE_EXPORT("picture_count") std::size_t pictureCount(const std::vector<double>* answer) {
    return answer->size();
}

OLVANE_EXPORT("picture_free") void pictureFree(std::vector<double>* answer) {
    delete answer;
}
