// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/graph/PersonWalksInternal.h>

namespace SharedTreeViewer {

// The person and all that hangs from it, in the order of the result. Skips a person's own entry among its
// siblings.
template <class Visit>
void visitGraph(TreeViewPerson& person, const Visit& visit) {
    visit(person);
    const auto goOn = [&visit](TreeViewPerson& relative) { visitGraph(relative, visit); };
    visitParentsSpousesAndChildren(person, goOn);
    for (TreeViewPerson& sibling : person.siblings) {
        if (sibling.personId != person.personId) goOn(sibling);
    }
}

}  // namespace SharedTreeViewer
