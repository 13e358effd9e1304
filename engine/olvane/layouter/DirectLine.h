// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/function.hpp>

#include <olvane/graph/TreeViewPerson.h>

namespace SharedTreeViewer {

// Called with each person on a line of descent: the person, whether it has neighbours to hang from, and a walk
// over those neighbours. With false the walk is empty and must not be called.
typedef boost::function<void(TreeViewPerson&, bool, const TreeViewPerson::Iterator&)> DirectLineVisitor;

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
