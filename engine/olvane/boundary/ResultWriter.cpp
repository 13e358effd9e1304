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

void appendNumber(std::string& text, int value, char separator) {
    char digits[13];
    char* const end = std::to_chars(digits, digits + sizeof digits - 1, value).ptr;
    *end = separator;
    text.append(digits, static_cast<std::size_t>(end - digits) + 1);
}

void appendPlaceAndFlag(std::string& text, const std::string& personText, int x, int y, bool flag) {
    text += personText;
    text += ':';
    appendNumber(text, x, ':');
    appendNumber(text, y, ':');
    appendNumber(text, flag ? 1 : 0, ':');
}

void appendSegments(std::string& text, TreeViewPerson& person) {
    person.lineSegmentIterator([&text](TreeLineSegment& segment) {
        appendNumber(text, wholePoint(segment.x1), ',');
        appendNumber(text, wholePoint(segment.y1), ',');
        appendNumber(text, wholePoint(segment.x2), ',');
        appendNumber(text, wholePoint(segment.y2), '|');
    });
}

void appendSexAndChild(std::string& text, const ViewerGlue& glue, const std::string& personText) {
    text += ':';
    text += glue.addNode(personText).male ? 'M' : 'F';
    text += ':';
    text += glue.addNode(personText).childText;
}

void writeRecord(const ViewerGlue& glue, ResultBounds& bounds, std::string& text, TreeViewPerson& person) {
    const std::string& personText = glue.personOfKey(person.personId);
    const int x = wholePoint(person.getNodeCenter().x);
    const int y = wholePoint(person.getNodeCenter().y);
    updateBounds(bounds, x, y);
    appendPlaceAndFlag(text, personText, x, y, person.hasNonDisplayedRelationships);
    appendSegments(text, person);
    if (glue.numberOfKey(person.personId) < 0) appendSexAndChild(text, glue, personText);
    text += ';';
}

}  // namespace

TreeViewPerson::Visitor resultWriter(ViewerGlue& glue, ResultBounds& bounds, std::string& text) {
    return [&glue, &bounds, &text](TreeViewPerson& person) { writeRecord(glue, bounds, text, person); };
}

}  // namespace olvane
