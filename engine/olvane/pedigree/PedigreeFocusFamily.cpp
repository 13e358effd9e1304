// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The focus's own family: spouses under the focus in its column, the preferred one right below it, and all
// children in one stack to the left, grouped by the other parent, children of an unknown other parent on top.
//
//      [unknown]
//      [with 1st]   [focus]
//      [with 1st]   [1st]
//      [with 2nd]   [2nd]       each further spouse level with the middle of its own children where they
//      reach lower
//
// Children by a key that is no spouse's keep their place at (0, 0): they are admitted, but nothing here
// places them.

#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include <vector>

namespace SharedTreeViewer {

// The column of the focus's children: where it stands, how far down it has grown, and how many are in it.
class TreeViewPedigreeLayouter::ChildrenStack {
public:
    ChildrenStack(float x, float top, float step) : x_(x), top_(top), nextY_(top), step_(step) {}

    void startAt(float top) {
        top_ = top;
        nextY_ = top;
    }
    void push(TreeViewPerson& child) {
        child.getNodeCenter() = TreePoint{x_, nextY_};
        nextY_ += step_;
        ++count_;
    }
    int count() const { return count_; }
    float top() const { return top_; }  // of the preferred spouse's first child
    float step() const { return step_; }

private:
    float x_;
    float top_;
    float nextY_;
    float step_;
    int count_ = 0;
};

struct TreeViewPedigreeLayouter::SpouseWithChildren {
    TreeViewPerson* spouse;
    std::vector<TreeViewPerson*> children;
};

void TreeViewPedigreeLayouter::addAndLayoutChildrenAndSpousesOfFocusPerson(TreeViewPerson& focus) {
    addSpousesToPerson(focus);
    addAllChildrenToPerson(focus);
    collectShown(focus.getAllChildrenIterator(true));  // for the record alone: also those whom nobody places

    const float topWithoutChildren = focus.getNodeCenter().y + treeSize.vertPadding;
    ChildrenStack stack(childrenX(focus), topWithoutChildren, rowStep());
    if (focus.getSpouseCount() >= 1) {
        placePreferredFamily(focus, stack);
        placeOtherFamilies(focus, stack);
        if (stack.count() == 0) stack.startAt(topWithoutChildren);
    }
    placeChildrenWithoutSecondParent(focus, stack);
}

float TreeViewPedigreeLayouter::childrenX(const TreeViewPerson& focus) const {
    return focus.getNodeCenter().x - treeSize.nodeWidth - treeSize.horzPadding;
}

std::vector<TreeViewPerson*> TreeViewPedigreeLayouter::collectShown(const Iterator& walk) {
    std::vector<TreeViewPerson*> persons;
    walk([&](TreeViewPerson& person) {
        admit(person.personId);
        persons.push_back(&person);
    });
    return persons;
}

// The children's block is centred on the gap between the focus and the spouse.
void TreeViewPedigreeLayouter::placePreferredFamily(TreeViewPerson& focus, ChildrenStack& stack) {
    const TreePoint at = focus.getNodeCenter();
    TreeViewPerson& preferred = focus.getPreferredSpouse();
    preferred.getNodeCenter() = TreePoint{at.x, at.y + treeSize.nodeHeight + treeSize.vertPadding};
    const std::vector<TreeViewPerson*> children = collectShown(focus.getChildrenIterator(preferred.personId));
    const float blockHeight = heightForNodeCount(static_cast<int>(children.size()));
    stack.startAt(at.y + treeSize.nodeHeight + treeSize.vertPadding * 0.5f - blockHeight * 0.5f);
    for (TreeViewPerson* child : children) stack.push(*child);
}

std::vector<TreeViewPedigreeLayouter::SpouseWithChildren> TreeViewPedigreeLayouter::collectOtherFamilies(
    TreeViewPerson& focus) {
    const int preferredKey = focus.getPreferredSpouse().personId;
    std::vector<SpouseWithChildren> families;
    focus.spouseIterator([&](TreeViewPerson& spouse) {
        if (spouse.personId == preferredKey) return;
        families.push_back({&spouse, collectShown(focus.getChildrenIterator(spouse.personId))});
    });
    return families;
}

void TreeViewPedigreeLayouter::placeOtherFamilies(TreeViewPerson& focus, ChildrenStack& stack) {
    const std::vector<SpouseWithChildren> families = collectOtherFamilies(focus);
    for (const SpouseWithChildren& family : families) {
        for (TreeViewPerson* child : family.children) stack.push(*child);
    }
    const TreePoint preferredAt = focus.getPreferredSpouse().getNodeCenter();
    float spouseY = preferredAt.y;
    for (const SpouseWithChildren& family : families) {
        spouseY += stack.step();
        if (!family.children.empty()) {
            float sum = 0.0f;
            for (const TreeViewPerson* child : family.children) sum += child->getNodeCenter().y;
            const float mean = sum / static_cast<float>(family.children.size());
            spouseY = spouseY < mean ? mean : spouseY;
        }
        family.spouse->getNodeCenter() = TreePoint{preferredAt.x, spouseY};
    }
}

// The block goes upward from the stack without a break: its last child stands one step above the top.
void TreeViewPedigreeLayouter::placeChildrenWithoutSecondParent(TreeViewPerson& focus,
                                                                const ChildrenStack& stack) {
    const std::vector<TreeViewPerson*> unknown =
        collectShown(focus.getChildrenIterator(TreeViewPerson::kNoKey));
    const float blockHeight = heightForNodeCount(static_cast<int>(unknown.size()));
    ChildrenStack upper(childrenX(focus), stack.top() - blockHeight - treeSize.vertPadding, stack.step());
    for (TreeViewPerson* child : unknown) upper.push(*child);
}

}  // namespace SharedTreeViewer
