// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One walk around the tree, with a stack of tasks: everything to the left of a household's link downwards, then
// what hangs from it, then everything to the right. The siblings of one household are split twice, for its left
// and for its right; the second time nothing changes.

#include <olvane/charts/EmbeddingInternal.h>

#include <algorithm>
#include <limits>

namespace olvane::charts {

namespace {

constexpr std::int32_t kOpen = std::numeric_limits<std::int32_t>::max();

}  // namespace

std::vector<Index> Embedding::orderTree(Index root) {
    if (lowestRow_.empty()) findLowestRows();
    order_.clear();
    tasks_.push_back({Step::around, root, {kOpen, kOpen}});
    while (!tasks_.empty()) {
        const Task task = tasks_.back();
        tasks_.pop_back();
        switch (task.step) {
            case Step::around:
                pushAround(task.node, task.limits);
                break;
            case Step::leftOf:
                pushLeftOf(task.node, task.limits);
                break;
            case Step::rightOf:
                pushRightOf(task.node, task.limits);
                break;
            case Step::household:
                order_.push_back(task.node);
                break;
            case Step::subtree:
                emitSubtree(task.node);
                break;
        }
    }
    return order_;
}

void Embedding::findLowestRows() {
    lowestRow_.resize(plan_.households.size());
    for (std::size_t h = 0; h < lowestRow_.size(); ++h) lowestRow_[h] = plan_.households[h].row;
    for (std::size_t h = lowestRow_.size(); h-- > 0;) {
        const Household& household = plan_.households[h];
        if (household.treeParent == kNone || household.isAbove) continue;
        std::int32_t& parents = lowestRow_[at(household.treeParent)];
        parents = std::max(parents, lowestRow_[h]);
    }
}

void Embedding::gatherAbove(Index node) {
    const Household& household = plan_.households[at(node)];
    above_.clear();
    for (Index above = household.upFirst; above < household.upEnd; ++above) {
        if (plan_.households[at(above)].treeParent == node) above_.push_back(above);
    }
}

// Between the ancestors of two members of a household, its own row is closed.
Embedding::Limits Embedding::limitsOf(std::size_t place, Index node, Limits limits) const {
    const std::int32_t row = plan_.households[at(node)].row;
    return {place == 0 ? limits.left : row, place + 1 == above_.size() ? limits.right : row};
}

// Tasks are pushed in reverse, as the last one is done first.
void Embedding::pushAround(Index node, Limits limits) {
    gatherAbove(node);
    for (std::size_t i = above_.size(); i-- > 0;) {
        tasks_.push_back({Step::rightOf, above_[i], limitsOf(i, node, limits)});
        if (i > 0) tasks_.push_back({Step::leftOf, above_[i], limitsOf(i, node, limits)});
    }
    tasks_.push_back({Step::subtree, node, limits});
    if (!above_.empty()) tasks_.push_back({Step::leftOf, above_[0], limitsOf(0, node, limits)});
}

// To the left of a child in the line: what is to the left of its grandparents, its own siblings, its parents.
void Embedding::pushLeftOf(Index parents, Limits limits) {
    splitSiblings(parents, limits);
    tasks_.push_back({Step::household, parents, limits});
    for (std::size_t i = leftSiblings_.size(); i-- > 0;) {
        tasks_.push_back({Step::subtree, leftSiblings_[i], limits});
    }
    gatherAbove(parents);
    if (!above_.empty()) tasks_.push_back({Step::leftOf, above_[0], limitsOf(0, parents, limits)});
}

void Embedding::pushRightOf(Index parents, Limits limits) {
    gatherAbove(parents);
    for (std::size_t i = above_.size(); i-- > 0;) {
        tasks_.push_back({Step::rightOf, above_[i], limitsOf(i, parents, limits)});
        if (i > 0) tasks_.push_back({Step::leftOf, above_[i], limitsOf(i, parents, limits)});
    }
    splitSiblings(parents, limits);
    for (std::size_t i = rightSiblings_.size(); i-- > 0;) {
        tasks_.push_back({Step::subtree, rightSiblings_[i], limits});
    }
}

// On which side of the child in the line each of its siblings stands: its own, if that is open down to the lowest
// row that it needs, else the other one, else none. Half siblings cannot change sides, for their line would cross.
void Embedding::splitSiblings(Index parents, Limits limits) {
    const Household& household = plan_.households[at(parents)];
    leftSiblings_.clear();
    rightSiblings_.clear();
    for (Index child = household.downFirst; child < household.downEnd; ++child) {
        Household& sibling = plan_.households[at(child)];
        if (sibling.treeParent != parents) continue;
        const bool fitsLeft = lowestRow_[at(child)] < limits.left;
        const bool fitsRight = lowestRow_[at(child)] < limits.right;
        const bool isEarlier = sibling.treeLink < household.treeLink;
        const bool isHalf = sibling.treeFamily != household.treeFamily;
        if (fitsLeft && (isEarlier || (!fitsRight && !isHalf))) {
            leftSiblings_.push_back(child);
        } else if (fitsRight && !(isEarlier && isHalf)) {
            rightSiblings_.push_back(child);
        } else {
            sibling.treeParent = kNone;
            plan_.links[at(sibling.treeLink)].drawn = false;
        }
    }
}

void Embedding::emitSubtree(Index root) {
    stack_.assign(1, root);
    while (!stack_.empty()) {
        const Index node = stack_.back();
        stack_.pop_back();
        order_.push_back(node);
        const Household& household = plan_.households[at(node)];
        for (Index child = household.downEnd; child-- > household.downFirst;) {
            if (plan_.households[at(child)].treeParent == node) stack_.push_back(child);
        }
    }
}

}  // namespace olvane::charts
