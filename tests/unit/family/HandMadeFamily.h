// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <gtest/gtest.h>

#include <olvane/family/TreeViewFamilyLayouter.h>

#include "Drawing.h"
#include "KeyFamily.h"

namespace views {

// A family layouter around a focus of key 0, a man unless the test says otherwise, in front of a data source
// that knows nobody until the test adds somebody. Tests hang relatives on the focus and run one act alone.
class HandMadeFamily : public testing::Test {
protected:
    KeyFamily data;
    DataAdapter adapter = data.adapter();
    SharedTreeViewer::TreeViewFamilyLayouter layouter{&adapter, 0, 1, SharedTreeViewer::OptionMap(), kSizes};
    TreeViewPerson& focus = layouter.focusPerson;

    void measure(TreeViewPerson& person) {
        layouter.calculateLayoutWidthForDescendantsOfProximalPerson(person);
    }
    void measureAndPlace(TreeViewPerson& person, float x, float y) {
        measure(person);
        layouter.layoutFamilyUnitOfProximalPerson(person, x, y);
    }
    // Both line passes over the whole graph, in their order.
    void drawLines() {
        layouter.graphIterator([this](TreeViewPerson& person) { layouter.addSpouseLinesToPerson(person); });
        layouter.graphIterator([this](TreeViewPerson& person) { layouter.addLinesToPerson(person); });
    }
    TreeViewPerson& childUnder(TreeViewPerson& person, int otherParent, std::size_t index = 0) {
        return person.children[otherParent].at(index);
    }
    TreeViewPerson& unknownChild(TreeViewPerson& person, std::size_t index = 0) {
        return childUnder(person, TreeViewPerson::kNoKey, index);
    }
};

constexpr bool kMale = true;
constexpr bool kFemale = false;

}  // namespace views
