// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lays a small family out in both views. The family view is one call; the pedigree view is built from the
// pieces that this call is made of, with sizes and a depth of the host's choosing.

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/LayoutPieces.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include <iostream>
#include <memory>
#include <string>

#include "SmallFamily.h"

namespace {

std::string pedigreeViewLayout(const std::string& personText,
                               const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager) {
    constexpr int kGenerations = 4;  // columns, the focus's own included
    constexpr int kStackDepth = 4;
    ViewerGlue glue;
    const olvane::HostCallbacks callbacks(glue, manager);
    std::string text;
    olvane::resetAddParentId();
    olvane::guarded([&] {
        DataAdapter adapter = callbacks.dataAdapter();
        const int focusKey = glue.getKeyFromPerson(personText);
        const int isMale = adapter.isMale(focusKey) ? 1 : 0;
        SharedTreeViewer::TreeViewPedigreeLayouter layouter(
            &adapter, focusKey, isMale, SharedTreeViewer::OptionMap(), olvane::familyTreeSize(), kGenerations,
            kStackDepth);
        layouter.layoutForFocusNID();
        olvane::ResultBounds bounds;
        layouter.graphIterator(olvane::resultWriter(glue, bounds, text));
    });
    return text;
}

}  // namespace

int main() {
    const auto family = std::make_shared<SmallFamily>();
    std::cout << "family   " << FamilyViewLayout("1", family) << "\n";
    std::cout << "pedigree " << pedigreeViewLayout("1", family) << "\n";
}
