// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of an earlier chart: who is new stands near the middle of their kin, where the fewest lines cross.

#include <olvane/charts/EverybodyEarlierInternal.h>

#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

class InsertedOrder {
public:
    InsertedOrder(const Rows& rows, const RowSizes& sizes, std::vector<double>& wanted)
        : rows_(rows), sizes_(sizes), wanted_(wanted) {}

    RowOrder keep(std::vector<std::uint8_t> flipped) {
        order_.flipped = std::move(flipped);
        order_.nodes.resize(at(rows_.rowCount));
        std::vector<std::int32_t> fresh;
        for (std::int32_t node = 0; node < rows_.nodeCount(); ++node) {
            if (!isKnown(wanted_[at(node)])) fresh.push_back(node);
        }
        for (std::size_t round = 0; round < fresh.size() + 1 && wantPlaces(fresh); ++round) {
        }
        for (std::int32_t node = 0; node < rows_.nodeCount(); ++node) {
            if (!isKnown(wanted_[at(node)])) wanted_[at(node)] = 0;
            order_.nodes[at(rows_.row[at(node)])].push_back(node);
        }
        for (auto& nodes : order_.nodes) {
            kin::mergeSort(nodes.begin(), nodes.end(),
                           [this](std::int32_t a, std::int32_t b) { return middle(a) < middle(b); });
        }
        return std::move(order_);
    }

private:
    double middle(std::int32_t node) const { return wanted_[at(node)] + sizes_.width[at(node)] / 2; }

    // The middle of what the strands of a new node lead to. False where nothing was found any more.
    bool wantPlaces(const std::vector<std::int32_t>& fresh) {
        bool found = false;
        for (const std::int32_t node : fresh) {
            if (isKnown(wanted_[at(node)])) continue;
            double sum = 0;
            double count = 0;
            for (const std::int32_t e : rows_.endsAt[node]) {
                const Rows::Strand& strand = rows_.strands[at(rows_.strandOfEnd[at(e)])];
                for (std::uint32_t i = 0; i < strand.aboveCount + strand.belowCount; ++i) {
                    const std::int32_t other = rows_.ends[strand.firstEnd + i].node;
                    if (other == node || !isKnown(wanted_[at(other)])) continue;
                    sum += middle(other);
                    count += 1;
                }
            }
            if (count == 0) continue;
            wanted_[at(node)] = sum / count - sizes_.width[at(node)] / 2;
            found = true;
        }
        return found;
    }

    const Rows& rows_;
    const RowSizes& sizes_;
    std::vector<double>& wanted_;
    RowOrder order_;
};

}  // namespace

RowOrder orderAsBefore(const Component& part, const Chains& chains, const Rows& rows,
                       const EarlierPicture& earlier, const RowSizes& sizes, std::vector<double>& wanted) {
    std::vector<std::int32_t> fresh;
    for (std::int32_t node = 0; node < rows.nodeCount(); ++node) {
        if (!isKnown(wanted[at(node)])) fresh.push_back(node);
    }
    std::vector<std::uint8_t> flipped(at(rows.chainCount), 0);
    for (std::int32_t chain = 0; chain < rows.chainCount; ++chain) {
        flipped[at(chain)] = stoodFlipped(part, chains, chain, earlier) ? 1 : 0;
    }
    RowOrder order = InsertedOrder(rows, sizes, wanted).keep(std::move(flipped));
    siftNodes(rows, order, fresh);
    return order;
}

}  // namespace olvane::charts
