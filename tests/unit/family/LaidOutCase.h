// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <memory>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/boundary/LayoutPieces.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>
#include <support/CaseFile.h>
#include <support/CaseRun.h>

#include "Drawing.h"

namespace views {

// A family in the text of a case file, laid out, with its graph still standing: tests look at its persons by
// the host's id. Unknown parents have the ids -1, -2, ... in the order in which they were made.
//
// Fails: what the layout throws passes on, since a test wants to see it; person throws std::out_of_range when
//        nobody of that id is on the chart.
class LaidOutCase {
public:
    explicit LaidOutCase(std::string_view caseText);
    ~LaidOutCase();
    LaidOutCase(const LaidOutCase&) = delete;
    LaidOutCase& operator=(const LaidOutCase&) = delete;

    // The first node of that id in the order of the walk; all of them; whether there is one.
    TreeViewPerson& person(int id);
    std::vector<TreeViewPerson*> nodesOf(int id);
    bool shows(int id);

    // Ids in the order of the walk, and the distinct ids of real persons.
    std::vector<int> walk();
    std::set<int> realPersons();

    Point at(int id) { return placeOf(person(id)); }
    bool flag(int id) { return person(id).hasNonDisplayedRelationships; }
    int idOf(const TreeViewPerson& person) const;

    SharedTreeViewer::TreeViewLayouter& layouter() { return *base; }
    SharedTreeViewer::TreeViewFamilyLayouter& family() { return *familyLayouter; }
    SharedTreeViewer::TreeViewPedigreeLayouter& pedigree() { return *pedigreeLayouter; }
    support::CaseHost& host() { return manager->host; }

private:
    void lay(const support::CaseFile& request, int focusKey, int isMale);

    std::shared_ptr<support::CaseManager> manager;
    ViewerGlue glue;
    std::unique_ptr<DataAdapter> adapter;
    // Layouters have no virtual destructor: each is destroyed through its concrete type, here a final one.
    struct FamilyLayouter final : SharedTreeViewer::TreeViewFamilyLayouter {
        using TreeViewFamilyLayouter::TreeViewFamilyLayouter;
    };
    struct PedigreeLayouter final : SharedTreeViewer::TreeViewPedigreeLayouter {
        using TreeViewPedigreeLayouter::TreeViewPedigreeLayouter;
    };
    std::optional<FamilyLayouter> familyLayouter;
    std::optional<PedigreeLayouter> pedigreeLayouter;
    SharedTreeViewer::TreeViewLayouter* base = nullptr;
};

}  // namespace views
