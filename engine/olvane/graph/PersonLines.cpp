// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A person's lines: the segments that reach the host, and the marriage lines once more by the spouse's key,
// so that a drop to a child can hang from the line of its own couple.

#include <olvane/graph/TreeViewPerson.h>

void TreeViewPerson::addSpouseLine(int spouseKey, float x1, float y1, float x2, float y2) {
    linesTo(spouseKey).push_back(TreeLineSegment{x1, y1, x2, y2, true});
}

TreeViewPerson::Segments& TreeViewPerson::linesTo(int spouseKey) {
    return spouseLines.try_emplace(spouseKey, arena()).first->second;
}

TreeLineSegment& TreeViewPerson::getSpouseLine(int spouseKey) {
    return linesTo(spouseKey).at(0);
}

void TreeViewPerson::lineSegmentIterator(const SegmentVisitor& visitor) {
    for (TreeLineSegment& segment : lineSegments) visitor(segment);
}
