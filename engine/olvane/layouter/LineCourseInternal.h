// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/graph/TreeLine.h>
#include <olvane/graph/TreeViewPerson.h>

namespace SharedTreeViewer {

// The course of one line, drawn piece by piece. Every piece goes to two readers: to the segments of the person
// who holds it, which reach the host, and to the course that an edge keeps. Pieces are not deduplicated.
class LineCourse {
public:
    explicit LineCourse(TreeLine& line) : line_(line) {}

    void draw(TreeViewPerson& holder, float x1, float y1, float x2, float y2) {
        holder.addLineSegment(x1, y1, x2, y2, false);
        line_.addLineSegmentBack(TreeLineSegment{x1, y1, x2, y2, false});
    }

private:
    TreeLine& line_;
};

}  // namespace SharedTreeViewer
