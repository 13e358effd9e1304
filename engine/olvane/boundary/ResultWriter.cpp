// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The result text: one record for each person, in the order of the walk.
//
//     PERSON:X:Y:FLAG:SEGMENTS;                 a real person
//     PERSON:X:Y:FLAG:SEGMENTS:SEX:CHILD;       an add-node; SEX is M or F, CHILD the person that it stands
//     above
//
// SEGMENTS is X1,Y1,X2,Y2| for each segment, with nothing between them. All numbers are whole, cut toward
// zero.

#include <olvane/boundary/LayoutPieces.h>

#include <olvane/graph/WholePoint.h>

#include <charconv>
#include <cstddef>

namespace olvane {

namespace {

// 0 means unset, also when a bound has come to stand there.
void updateBounds(ResultBounds& bounds, int x, int y) {
    if (bounds.minX > x || bounds.minX == 0) bounds.minX = x;
    if (bounds.minY > y || bounds.minY == 0) bounds.minY = y;
    if (bounds.maxX < x || bounds.maxX == 0) bounds.maxX = x;
    if (bounds.maxY < y || bounds.maxY == 0) bounds.maxY = y;
}

// Four numbers and what stands behind them, put together here and appended at once.
class Piece {
public:
    void add(int value, char separator) {
        char* const place = room_ + length_;
        char* const end = std::to_chars(place, place + kLongestNumber, value).ptr;
        *end = separator;
        length_ = static_cast<std::size_t>(end - room_) + 1;
    }
    void clear() { length_ = 0; }
    void appendTo(std::string& text) const { text.append(room_, length_); }

private:
    static constexpr std::size_t kLongestNumber = 11;

    char room_[4 * (kLongestNumber + 1)];
    std::size_t length_ = 0;
};

void appendPlaceAndFlag(std::string& text, const std::string& personText, int x, int y, bool flag) {
    text += personText;
    text += ':';
    Piece piece;
    piece.add(x, ':');
    piece.add(y, ':');
    piece.add(flag ? 1 : 0, ':');
    piece.appendTo(text);
}

void rewrite(Piece& piece, const TreeLineSegment& segment) {
    piece.clear();
    piece.add(wholePoint(segment.x1), ',');
    piece.add(wholePoint(segment.y1), ',');
    piece.add(wholePoint(segment.x2), ',');
    piece.add(wholePoint(segment.y2), '|');
}

// Each child of a couple leaves the same drop, one behind the other, so the last piece often serves again.
void appendSegments(std::string& text, const TreeViewPerson& person) {
    const TreeLineSegment* last = nullptr;
    Piece piece;
    for (const TreeLineSegment& segment : person.lineSegments) {
        const bool isRepeated = last != nullptr && last->firstEnd() == segment.firstEnd() &&
                                last->secondEnd() == segment.secondEnd();
        if (!isRepeated) rewrite(piece, segment);
        piece.appendTo(text);
        last = &segment;
    }
}

void appendSexAndChild(std::string& text, const ViewerGlue& glue, int key) {
    text += ':';
    text += glue.addNodeIsMale(key) ? 'M' : 'F';
    text += ':';
    text += glue.childTextOfAddNode(key);
}

void writeRecord(const ViewerGlue& glue, ResultBounds& bounds, std::string& text, TreeViewPerson& person) {
    const std::string personText = glue.personOfKey(person.personId);
    const int x = wholePoint(person.getNodeCenter().x);
    const int y = wholePoint(person.getNodeCenter().y);
    updateBounds(bounds, x, y);
    appendPlaceAndFlag(text, personText, x, y, person.hasNonDisplayedRelationships);
    appendSegments(text, person);
    if (glue.numberOfKey(person.personId) < 0) appendSexAndChild(text, glue, person.personId);
    text += ';';
}

}  // namespace

TreeViewPerson::Visitor resultWriter(ViewerGlue& glue, ResultBounds& bounds, std::string& text) {
    return [&glue, &bounds, &text](TreeViewPerson& person) { writeRecord(glue, bounds, text, person); };
}

}  // namespace olvane
