// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One request, from a person's id to the text of its picture. Every object of it lives in this frame and is
// destroyed in the reverse order; nothing survives but the count of negative ids, which the next request
// resets.

#include <olvane/boundary/FamilyViewLayout.h>

#include <olvane/boundary/LayoutPieces.h>
#include <olvane/family/FamilyOptions.h>
#include <olvane/family/TreeViewFamilyLayouter.h>

namespace olvane {

TreeSize familyTreeSize() {
    TreeSize size;
    size.nodeWidth = 55.0f;
    size.nodeHeight = 80.0f;
    size.horzPadding = 25.0f;
    size.vertPadding = 30.0f;
    size.spouseLineStep = 10.0f;
    size.lineInset = 0.0f;
    return size;
}

}  // namespace olvane

namespace {

// The one entry changes nothing, since no layouter reads it; hosts that look at a layouter's options find it
// there.
SharedTreeViewer::OptionMap familyOptions() {
    SharedTreeViewer::OptionMap options(11);
    options.max_load_factor(1.0f);
    options[SharedTreeViewer::IndicateNonDisplayedRelationships] = true;
    return options;
}

}  // namespace

std::string FamilyViewLayout(std::string personText,
                             std::shared_ptr<OlvaneViewerManagerWrapProtocol> manager) {
    ViewerGlue glue;
    const olvane::HostCallbacks callbacks(glue, manager);
    std::string text;
    olvane::resetAddParentId();
    olvane::guarded([&] {
        DataAdapter adapter = callbacks.dataAdapter();
        const int focusKey = glue.getKeyFromPerson(personText);
        const int isMale = adapter.isMale(focusKey) ? 1 : 0;
        const TreeSize treeSize = olvane::familyTreeSize();
        SharedTreeViewer::TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale, familyOptions(),
                                                          treeSize);
        layouter.layoutForFocusNID();
        olvane::ResultBounds bounds;
        layouter.graphIterator(olvane::resultWriter(glue, bounds, text));
    });
    return std::string(text.c_str());  // up to the first zero byte, which an odd focus text can bring in
}
