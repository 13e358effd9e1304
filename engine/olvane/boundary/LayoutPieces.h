// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/function.hpp>

#include <memory>
#include <string>

#include <olvane/Export.h>
#include <olvane/adapters/DataAdapter.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/boundary/TypedLayout.h>
#include <olvane/boundary/ViewerGlue.h>
#include <olvane/graph/TreeViewPerson.h>
#include <olvane/layouter/TreeViewLayouter.h>

namespace olvane {

// The pieces of a layout request, for a host that builds a layouter of its own, with its own options and
// sizes or for the pedigree view. FamilyViewLayout is made of the same pieces:
//
//     ViewerGlue glue;
//     HostCallbacks callbacks(glue, manager);
//     std::string text;
//     resetAddParentId();
//     guarded([&] {
//         DataAdapter adapter = callbacks.dataAdapter();
//         const int focusKey = glue.getKeyFromPerson(personText);
//         const int isMale = adapter.isMale(focusKey) ? 1 : 0;
//         SharedTreeViewer::TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale, options, treeSize);
//         layouter.layoutForFocusNID();
//         ResultBounds bounds;
//         layouter.graphIterator(resultWriter(glue, bounds, text));
//     });

// The six callbacks around one data source, in the order of their building. They hold references to the glue
// and to the data source, which must outlive them and every copy. A field may be replaced before dataAdapter
// is called.
//
// Fails: a null data source throws std::invalid_argument at the first question to it.
class OLVANE_API HostCallbacks {
public:
    HostCallbacks(ViewerGlue& glue, const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager);

    // Each person's slots are always filled: a parent whom the host does not know is an unknown parent with a
    // new negative id, at every single call.
    DataAdapter::ParentsCallback getParents;
    DataAdapter::SpousesCallback getSpouses;
    DataAdapter::ChildrenCallback getChildren;
    DataAdapter::KeyTest isMale;
    DataAdapter::KeyTest isAddNode;
    DataAdapter::KeyTouch touchPerson;

    DataAdapter dataAdapter() const;
};

// Starts the negative ids of this thread at -1 again. First thing in every request: the ids that unknown parents
// get would otherwise go on from the request before. There is one count for each thread.
OLVANE_API void resetAddParentId();

// Starts them at -1 for as long as it lives, and then goes on where they were: for a layout that may run within
// an operation of another one.
class OLVANE_API NegativeIds {
public:
    NegativeIds();
    ~NegativeIds();
    NegativeIds(const NegativeIds&) = delete;
    NegativeIds& operator=(const NegativeIds&) = delete;

private:
    int before_;
};

// Whole-number bounds of the records written. A bound of 0 stands for one not yet set, so one that has truly
// reached 0 is set again by the next person. Nothing reads them.
struct ResultBounds {
    int minX = 0;
    int minY = 0;
    int maxX = 0;
    int maxY = 0;
};

// A visitor for graphIterator that appends one record for each person to the text. It refers to all three.
// Fails: std::out_of_range for a person of an unknown key, before anything is written, and for a person of
//        negative id without a record of an unknown parent, behind its segments.
OLVANE_API TreeViewPerson::Visitor resultWriter(ViewerGlue& glue, ResultBounds& bounds, std::string& text);

// Does the work and swallows whatever it throws: the caller is left with what was written so far.
template <class Work>
void guarded(Work work) {
    try {
        work();
    } catch (...) {
        // A host sees a short or empty text, never an exception.
    }
}

}  // namespace olvane
