// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/boundary/LayoutPieces.h>
#include <olvane/layouter/TreeViewLayouter.h>
#include <unit/boundary/Request.h>

namespace unit {

// What layouters share, and nothing more: it lays nothing out.
class BareLayouter final : public SharedTreeViewer::TreeViewLayouter {
public:
    using TreeViewLayouter::TreeViewLayouter;
    void layoutForFocusNID() override {}
    void graphIterator(const Visitor& visitor) override { visitor(focusPerson); }
};

// A bare layouter over a family, the focus with key 0. adapter says what becomes of unknown parents.
class Population {
public:
    explicit Population(const support::CaseFile& input)
        : request(input),
          adapter(adapterOf(request, input)),
          layouter(&adapter, request.key(input.focus), adapter.isMale(request.key(input.focus)) ? 1 : 0, {},
                   olvane::familyTreeSize()),
          focus(layouter.focusPerson) {
        request.newCalls();
    }

    // The id texts of a list, in its order: persons as the host names them.
    std::vector<std::string> idTexts(const TreeViewPerson::Persons& list) const {
        std::vector<std::string> texts;
        for (const TreeViewPerson& person : list) texts.push_back(request.idText(person.personId));
        return texts;
    }

    bool isShown(support::PersonId id) { return layouter.shownPersons.count(request.key(id)) == 1; }
    void show(support::PersonId id) { layouter.shownPersons[request.key(id)] = true; }

    Request request;
    DataAdapter adapter;
    BareLayouter layouter;
    TreeViewPerson& focus;

private:
    static DataAdapter adapterOf(Request& frame, const support::CaseFile& input) {
        if (input.adapter == support::CaseAdapter::bare) {
            frame.callbacks.getParents = support::bareParents(frame.glue, *frame.manager);
        }
        return frame.callbacks.dataAdapter();
    }
};

}  // namespace unit
