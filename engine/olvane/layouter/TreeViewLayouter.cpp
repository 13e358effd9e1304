// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What both views do with a layouter before any view's own rules: setting it up, reading an option, and the
// three placements that every row is made of.

#include <olvane/layouter/TreeViewLayouter.h>

#include <utility>

#ifdef __FAST_MATH__
#error "Results are exact to the last bit: the engine must not be compiled with -ffast-math."
#endif

namespace SharedTreeViewer {

TreeViewLayouter::TreeViewLayouter(DataAdapter* data, int focusKey, int isMale, OptionMap optionValues,
                                   const TreeSize& sizes)
    : focusPerson(focusKey, &memory),
      options(std::move(optionValues)),
      dataAdapter(data),
      treeSize(sizes),
      shownPersons(&memory) {
    focusPerson.setGender(isMale != 0);
}

bool TreeViewLayouter::boolOptionForKey(const std::string& key, bool defaultValue) const {
    const OptionMap::const_iterator option = options.find(key);
    return option == options.end() ? defaultValue : option->second;
}

float TreeViewLayouter::rowStep() const {
    return treeSize.nodeHeight + treeSize.vertPadding;
}

void TreeViewLayouter::centerPerson(TreeViewPerson& person, float width, float left, float y) const {
    person.getNodeCenter() = TreePoint{width * 0.5f + left, y};
}

void TreeViewLayouter::centerHusbandAndWife(TreeViewPerson& husband, TreeViewPerson& wife, float width,
                                            float left, float y) const {
    const float middle = width * 0.5f + left;
    const float halfDistance = 0.5f * treeSize.nodeWidth + treeSize.horzPadding * 0.5f;
    husband.getNodeCenter() = TreePoint{middle - halfDistance, y};
    wife.getNodeCenter() = TreePoint{middle + halfDistance, y};
}

void TreeViewLayouter::initializeParentsXAndYCenteredAboveChild(const Iterator& iterator, float y,
                                                                float centerX, int count) const {
    if (count == 0) return;
    const float stride = treeSize.nodeWidth + treeSize.horzPadding;
    float x = 0.0f;
    int visited = 0;
    iterator([&](TreeViewPerson& person) {
        person.getNodeCenter() = TreePoint{x, y};
        ++visited;
        if (visited != count) x += stride;
    });
    const float shift = centerX + x * -0.5f;
    iterator([shift](TreeViewPerson& person) { person.getNodeCenter().x += shift; });
}

}  // namespace SharedTreeViewer
