// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/graph/TreeViewPerson.h>
#include <olvane/layouter/TreeViewLayouter.h>

namespace SharedTreeViewer {

// The steps of the walk along direct lines that both views take: up to each parent, down to each child, who
// receives the persons above it. Layouter is the view's own class; its directLineIterator carries the walk on.
template <class Layouter>
void walkParentsAndChildrenOnDirectLine(Layouter& layouter, TreeViewPerson& person,
                                        const DirectLineVisitor& visitor) {
    person.parentsIterator([&](TreeViewPerson& parent) {
        layouter.directLineIterator(parent, visitor, false, TreeViewPerson::Iterator());
    });
    person.allChildrenIterator(false, [&](TreeViewPerson& child) {
        layouter.directLineIterator(child, visitor, true, person.getSelfAndSpousesIterator());
    });
}

}  // namespace SharedTreeViewer
