// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A frame is the coordinates in which the contour of a subtree is written: that of its deepest leaf's. Nothing is
// moved when subtrees are joined; each keeps its frame's distance to that of its parent, and one walk from the
// root adds these up.

#include <olvane/charts/TidyTreeInternal.h>

#include <algorithm>

namespace olvane::charts {

TidyTree::TidyTree(Plan& plan, double gap)
    : plan_(plan),
      gap_(gap),
      rows_(plan.households.size()),
      base_(plan.households.size()),
      position_(plan.households.size()),
      frame_(plan.households.size()) {}

void TidyTree::place(std::span<const Index> nodes, bool above) {
    above_ = above;
    measure(nodes);
    for (std::size_t i = nodes.size(); i-- > 0;) joinChildren(nodes[i]);
    const Index root = nodes[0];
    frame_[at(root)] = -position_[at(root)];
    plan_.households[at(root)].x = 0;
    for (const Index node : nodes.subspan(1)) {
        frame_[at(node)] += frame_[at(plan_.households[at(node)].treeParent)];
        plan_.households[at(node)].x = frame_[at(node)] + position_[at(node)];
    }
}

// How many rows each subtree has, and where its contour lies: in that of its parent's, if it is the first of its
// deepest children, else in a new block.
void TidyTree::measure(std::span<const Index> nodes) {
    for (const Index node : nodes) rows_[at(node)] = 1;
    for (std::size_t i = nodes.size() - 1; i > 0; --i) {
        std::int32_t& parent = rows_[at(plan_.households[at(nodes[i])].treeParent)];
        parent = std::max(parent, rows_[at(nodes[i])] + 1);
    }
    constexpr std::uint32_t kNoBase = ~std::uint32_t{0};
    for (const Index node : nodes) base_[at(node)] = kNoBase;
    std::uint32_t used = 0;
    for (const Index node : nodes) {
        if (base_[at(node)] == kNoBase) {
            base_[at(node)] = used;
            used += static_cast<std::uint32_t>(rows_[at(node)]);
        }
        gatherChildren(node);
        for (const Index child : children_) {
            if (rows_[at(child)] + 1 != rows_[at(node)]) continue;
            base_[at(child)] = base_[at(node)];
            break;
        }
    }
    left_.resize(used);
    right_.resize(used);
}

void TidyTree::gatherChildren(Index node) {
    const Household& household = plan_.households[at(node)];
    children_.clear();
    const Index end = above_ ? household.upEnd : household.downEnd;
    for (Index child = above_ ? household.upFirst : household.downFirst; child < end; ++child) {
        if (plan_.households[at(child)].treeParent == node) children_.push_back(child);
    }
}

void TidyTree::joinChildren(Index node) {
    gatherChildren(node);
    if (children_.size() > 1) {
        shift_.assign(children_.size(), 0);
        acceleration_.assign(children_.size(), 0);
        change_.assign(children_.size(), 0);
        owners_.assign(1, {rows_[at(children_[0])], 0});
        deepest_ = children_[0];
        deepestShift_ = 0;
        for (std::size_t i = 1; i < children_.size(); ++i) {
            const std::int32_t rows = std::min(rows_[at(children_[i])], rows_[at(deepest_)]);
            shift_[i] = separate(i, rows, deepestShift_);
        }
        spreadEvenly();
        for (std::size_t i = 0; i < children_.size(); ++i)
            frame_[at(children_[i])] = shift_[i] - deepestShift_;
    } else if (children_.size() == 1) {
        frame_[at(children_[0])] = 0;
    }
    setOverChildren(node);
}

// Puts a child beside its earlier siblings, writes the contour of all of them, and returns where the child's frame
// stands in that of the first sibling's.
double TidyTree::separate(std::size_t child, std::int32_t rows, double groupShift) {
    const Index node = children_[child];
    double* const accLeft = leftOf(deepest_) + rows_[at(deepest_)] - 1;
    double* const accRight = rightOf(deepest_) + rows_[at(deepest_)] - 1;
    double* const newLeft = leftOf(node) + rows_[at(node)] - 1;
    double* const newRight = rightOf(node) + rows_[at(node)] - 1;
    double shift = accRight[0] - newLeft[0];
    std::size_t owner = owners_.size() - 1;
    for (std::int32_t row = 1; row < rows; ++row) {
        while (owners_[owner].rows <= row) --owner;
        const double more = accRight[-row] - newLeft[-row] - shift;
        if (more <= 0) continue;
        shift += more;
        // The siblings between are given a share each of what the two that meet are moved apart.
        const std::size_t with = at(owners_[owner].child);
        const double parts = static_cast<double>(child - with);
        if (parts < 2) continue;
        acceleration_[with + 1] += more / parts;
        acceleration_[child] -= more / parts;
        change_[child] -= more - more / parts;
    }
    const double inGroup = groupShift + shift;
    if (rows_[at(node)] > rows_[at(deepest_)]) {
        for (std::int32_t row = 0; row < rows; ++row) newLeft[-row] = accLeft[-row] - shift;
        deepest_ = node;
        deepestShift_ = inGroup;
    } else {
        for (std::int32_t row = 0; row < rows; ++row) accRight[-row] = newRight[-row] + shift;
    }
    while (!owners_.empty() && owners_.back().rows <= rows_[at(node)]) owners_.pop_back();
    owners_.push_back({rows_[at(node)], static_cast<std::int32_t>(child)});
    return inGroup;
}

void TidyTree::spreadEvenly() {
    double step = 0;
    double moved = 0;
    for (std::size_t i = 0; i < children_.size(); ++i) {
        step += acceleration_[i];
        moved += step + change_[i];
        shift_[i] += moved;
    }
}

// In the middle between its first and its last child, seen from where its lines leave.
void TidyTree::setOverChildren(Index node) {
    const Household& household = plan_.households[at(node)];
    double x = 0;
    if (!children_.empty()) {
        double from = 0;
        double to = 0;
        for (const Index end : {children_.front(), children_.back()}) {
            const Household& child = plan_.households[at(end)];
            const double drop = plan_.families[at(child.treeFamily)].dropX;
            const double stem = plan_.stemX(static_cast<std::uint32_t>(child.treeLink));
            to += frame_[at(end)] + position_[at(end)] + (above_ ? drop : stem);
            from += above_ ? stem : drop;
        }
        x = (to - from) / 2;
    }
    position_[at(node)] = x;
    leftOf(node)[rows_[at(node)] - 1] = x;
    rightOf(node)[rows_[at(node)] - 1] = x + household.width + gap_;
}

}  // namespace olvane::charts
