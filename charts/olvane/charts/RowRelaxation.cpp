// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/RowRelaxationInternal.h>

#include <algorithm>
#include <cmath>
#include <limits>

namespace olvane::charts {

namespace {

constexpr double kWeightOfUnlinked = 1e-3;
constexpr double kSlightBend = 4;  // points
constexpr double kEndless = std::numeric_limits<double>::infinity();

std::size_t turnsFor(std::size_t households) {
    if (households <= 1000) return 120;
    return households <= 20000 ? 10 : 4;
}

}  // namespace

void RowRelaxation::sortIntoRows(const std::vector<Index>& order) {
    const auto rowOf = [this](Index h) { return plan_.households[at(h)].row; };
    std::int32_t first = rowOf(order[0]);
    std::int32_t last = first;
    for (const Index h : order) {
        first = std::min(first, rowOf(h));
        last = std::max(last, rowOf(h));
    }
    rowStart_.assign(at(last - first) + 2, 0);
    for (const Index h : order) ++rowStart_[at(rowOf(h) - first) + 1];
    for (std::size_t row = 1; row < rowStart_.size(); ++row) rowStart_[row] += rowStart_[row - 1];
    std::vector<std::size_t> next(rowStart_.begin(), rowStart_.end() - 1);
    byRow_.resize(order.size());
    for (const Index h : order) byRow_[next[at(rowOf(h) - first)]++] = h;
}

void RowRelaxation::measureLinks() {
    for (const Index h : byRow_) {
        const Household& household = plan_.households[at(h)];
        if (household.treeParent == kNone) continue;
        const double stem = plan_.stemX(static_cast<std::uint32_t>(household.treeLink));
        const double drop = plan_.families[at(household.treeFamily)].dropX;
        toParent_[at(h)] = household.isAbove ? stem - drop : drop - stem;
    }
}

// The first turns carry whole subtrees to where they belong, down and up; the others settle the details.
void RowRelaxation::place(const std::vector<Index>& order) {
    sortIntoRows(order);
    measureLinks();
    least_ = -kEndless;
    most_ = kEndless;
    const std::size_t rows = rowStart_.size() - 1;
    const std::size_t turns = turnsFor(byRow_.size());
    for (const Index h : byRow_) plan_.households[at(h)].x = 0;
    for (std::size_t row = rows; row-- > 0;) placeRow(row, Pull::fromBelow);
    for (std::size_t turn = 0; turn < turns; ++turn) {
        const bool coarse = turn * 3 < turns;
        for (std::size_t row = 0; row < rows; ++row) placeRow(row, coarse ? Pull::fromAbove : Pull::fromBoth);
        for (std::size_t row = rows; row-- > 0;) placeRow(row, coarse ? Pull::fromBelow : Pull::fromBoth);
        if (share_ < 1 && turn * 2 >= turns && least_ == -kEndless) setBounds();
    }
    snap();
    for (std::size_t row = 0; row < rows; ++row) straighten(row, false);
    for (std::size_t row = rows; row-- > 0;) straighten(row, true);
}

void RowRelaxation::placeRow(std::size_t row, Pull pull) {
    blocks_.clear();
    double offset = 0;  // of the household from the first of its row, if all stood side by side
    for (std::size_t i = rowStart_[row]; i < rowStart_[row + 1]; ++i) {
        Block block = blockOf(byRow_[i], pull);
        block.weighted -= offset * block.weight;
        addBlock(block);
        offset += plan_.households[at(byRow_[i])].width + gap_;
    }
    placeBlocks(row, offset - gap_);
}

// A household alone, where its neighbours draw it.
RowRelaxation::Block RowRelaxation::blockOf(Index h, Pull pull) const {
    const Household& household = plan_.households[at(h)];
    double sum = 0;
    double weight = 0;
    if (household.treeParent != kNone && pull != (household.isAbove ? Pull::fromAbove : Pull::fromBelow)) {
        sum += plan_.households[at(household.treeParent)].x + toParent_[at(h)];
        weight += 1;
    }
    const auto pullFrom = [&](Index first, Index end) {
        for (Index child = first; child < end; ++child) {
            if (plan_.households[at(child)].treeParent != h) continue;
            sum += plan_.households[at(child)].x - toParent_[at(child)];
            weight += 1;
        }
    };
    if (pull != Pull::fromAbove) pullFrom(household.downFirst, household.downEnd);
    if (pull != Pull::fromBelow) pullFrom(household.upFirst, household.upEnd);
    if (weight == 0) {
        weight = kWeightOfUnlinked;
        sum = household.x * weight;
    }
    return {sum, weight, 1};
}

// At the end of the row; blocks that would overlap become one.
void RowRelaxation::addBlock(const Block& block) {
    blocks_.push_back(block);
    while (blocks_.size() > 1) {
        const Block last = blocks_.back();
        Block& before = blocks_[blocks_.size() - 2];
        if (before.weighted * last.weight <= last.weighted * before.weight) break;
        before.weighted += last.weighted;
        before.weight += last.weight;
        before.count += last.count;
        blocks_.pop_back();
    }
}

void RowRelaxation::placeBlocks(std::size_t row, double rowWidth) {
    std::size_t i = rowStart_[row];
    double offset = 0;
    for (const Block& block : blocks_) {
        const double x = std::max(std::min(block.weighted / block.weight, most_ - rowWidth), least_);
        for (std::size_t k = 0; k < block.count; ++k, ++i) {
            Household& household = plan_.households[at(byRow_[i])];
            household.x = x + offset;
            offset += household.width + gap_;
        }
    }
}

// From here on, all rows stay inside a share of the width that they have taken, around the widest of them, which
// keeps what it needs.
void RowRelaxation::setBounds() {
    double from = kEndless;
    double to = -kEndless;
    double widest = -1;
    double middle = 0;
    for (std::size_t row = 0; row + 1 < rowStart_.size(); ++row) {
        double width = -gap_;
        for (std::size_t i = rowStart_[row]; i < rowStart_[row + 1]; ++i) {
            width += plan_.households[at(byRow_[i])].width + gap_;
        }
        const double left = plan_.households[at(byRow_[rowStart_[row]])].x;
        const Household& last = plan_.households[at(byRow_[rowStart_[row + 1] - 1])];
        from = std::min(from, left);
        to = std::max(to, last.x + last.width);
        if (width <= widest) continue;
        widest = width;
        middle = (left + last.x + last.width) / 2;
    }
    const double room = std::max(widest, (to - from) * share_);
    least_ = std::floor(middle - room / 2);
    most_ = least_ + room;
}

// To half points, and no nearer than the gap for all that was rounded.
void RowRelaxation::snap() {
    for (std::size_t row = 0; row + 1 < rowStart_.size(); ++row) {
        for (std::size_t i = rowStart_[row]; i < rowStart_[row + 1]; ++i) {
            Household& household = plan_.households[at(byRow_[i])];
            household.x = std::floor(household.x * 2 + 0.5) / 2;
            if (i == rowStart_[row]) continue;
            const Household& before = plan_.households[at(byRow_[i - 1])];
            household.x = std::max(household.x, before.x + before.width + gap_);
        }
    }
}

// A line that is straight but for a few points is made straight, where the gaps allow.
void RowRelaxation::straighten(std::size_t row, bool above) {
    for (std::size_t i = rowStart_[row]; i < rowStart_[row + 1]; ++i) {
        Household& household = plan_.households[at(byRow_[i])];
        if (household.treeParent == kNone || household.isAbove != above) continue;
        const double x = plan_.households[at(household.treeParent)].x + toParent_[at(byRow_[i])];
        if (x == household.x || std::abs(x - household.x) > kSlightBend) continue;
        if (x < least_ || x + household.width > most_) continue;
        if (i > rowStart_[row]) {
            const Household& before = plan_.households[at(byRow_[i - 1])];
            if (x < before.x + before.width + gap_) continue;
        }
        if (i + 1 < rowStart_[row + 1] &&
            x + household.width + gap_ > plan_.households[at(byRow_[i + 1])].x) {
            continue;
        }
        household.x = x;
    }
}

}  // namespace olvane::charts
