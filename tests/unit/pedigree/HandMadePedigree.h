// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <vector>

#include <olvane/pedigree/TreeViewPedigreeLayouter.h>
#include <unit/family/Drawing.h>
#include <unit/family/KeyFamily.h>

namespace views {

// A pedigree layouter around a focus of key 0, a man unless the test says otherwise, in front of a data
// source that knows nobody until the test adds somebody. The focus stands where the layouter would set it.
class HandMadePedigree : public testing::Test {
protected:
    KeyFamily data;
    DataAdapter adapter = data.adapter();
    SharedTreeViewer::TreeViewPedigreeLayouter layouter{&adapter, 0, 1, SharedTreeViewer::OptionMap(),
                                                        kSizes,   3, 4};
    TreeViewPerson& focus = layouter.focusPerson;

    HandMadePedigree() { place(focus, 27.5f, 0.0f); }

    void layOut(int generations) {
        layouter.maxGenerations = generations;
        layouter.layoutForFocusNID();
    }
    // Sets the data of the focus's spouses and of their shared children, of 0 and of the wife.
    void addWifeWithChildren(int wife, const std::vector<int>& childrenWithHer) {
        data.spouses[0].push_back(wife);
        data.spouses[wife] = {0};
        for (const int child : childrenWithHer) {
            data.children[0].push_back(child);
            data.children[wife].push_back(child);
            data.parents[child] = {0, wife};
        }
    }
    void setChildrenWithoutSecondParent(const std::vector<int>& unknown) {
        for (const int child : unknown) {
            data.children[0].push_back(child);
            data.parents[child] = {0, -1};
        }
    }
    std::vector<int> everybody() {
        return keysOf([this](const TreeViewPerson::Visitor& visit) { layouter.graphIterator(visit); });
    }
    TreeViewPerson& childUnder(int otherParent, std::size_t index = 0) {
        return focus.children[otherParent].at(index);
    }
    TreeViewPerson& unknownChild(std::size_t index = 0) { return childUnder(TreeViewPerson::kNoKey, index); }
    TreeViewPerson& spouse(std::size_t index = 0) { return focus.spouses.at(index); }
    TreeViewPerson& father() { return focus.getPreferredFather(); }
    TreeViewPerson& mother() { return focus.getPreferredMother(); }
};

constexpr bool kMale = true;
constexpr bool kFemale = false;

}  // namespace views
