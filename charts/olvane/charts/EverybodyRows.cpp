// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyRowsInternal.h>

#include <algorithm>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

// An end that a union has at a box, and the gap that it lies in.
struct BoxEnd {
    std::int32_t gap;
    bool isBelow;  // a child: at the lower edge of the gap
    Rows::End end;
};

class RowsBuilder {
public:
    RowsBuilder(const Component& part, const Chains& chains, const std::vector<std::int32_t>& rowOfChain,
                const MarkedLinks& marked)
        : part_(part), chains_(chains), marked_(marked) {
        rows_.chainCount = chains.count();
        rows_.row = rowOfChain;
        for (std::int32_t c = 0; c < chains.count(); ++c) {
            rows_.size.push_back(2 * chains.length(c) - 1);
            rows_.rowCount = std::max(rows_.rowCount, rowOfChain[at(c)] + 1);
        }
    }

    Rows build() {
        rows_.firstPass.assign(at(part_.unionCount()), -1);
        rows_.passRow.assign(at(part_.unionCount()), -1);
        std::size_t firstChild = 0;
        for (std::int32_t u = 0; u < part_.unionCount(); ++u) {
            collectEnds(u, firstChild);
            firstChild += part_.children[u].size();
            if (boxEnds_.size() > 1) addStrands(u);
        }
        const auto forEach = [this](bool below, const auto& visit) {
            for (std::size_t s = 0; s < rows_.strands.size(); ++s) {
                const auto ends =
                    below ? rows_.endsBelow(rows_.strands[s]) : rows_.endsAbove(rows_.strands[s]);
                std::int32_t before = -1;
                for (const Rows::End& end : ends) {
                    if (end.node != before) visit(end.node, static_cast<std::int32_t>(s));
                    before = end.node;
                }
            }
        };
        rows_.strandsAbove.fill(rows_.row.size(), [&](const auto& visit) { forEach(true, visit); });
        rows_.strandsBelow.fill(rows_.row.size(), [&](const auto& visit) { forEach(false, visit); });
        rows_.endsAt.fill(rows_.row.size(), [this](const auto& visit) {
            for (std::size_t e = 0; e < rows_.ends.size(); ++e) {
                visit(rows_.ends[e].node, static_cast<std::int32_t>(e));
            }
        });
        rows_.strandsInGap.fill(at(rows_.rowCount + 1), [this](const auto& visit) {
            for (std::size_t s = 0; s < rows_.strands.size(); ++s) {
                visit(rows_.strands[s].gap + 1, static_cast<std::int32_t>(s));
            }
        });
        return std::move(rows_);
    }

private:
    void addBoxEnd(std::int32_t person, std::int32_t extra, bool isBelow) {
        const std::int32_t chain = chains_.chain[at(person)];
        const std::int32_t row = rows_.row[at(chain)];
        const std::int32_t sub = 2 * chains_.slot[at(person)] + extra;
        boxEnds_.push_back({isBelow ? row - 1 : row, isBelow, {chain, sub}});
    }

    void collectEnds(std::int32_t u, std::size_t firstChild) {
        boxEnds_.clear();
        const auto& two = part_.partners[at(u)];
        const auto children = part_.children[u];
        const bool both = two[0] >= 0 && two[1] >= 0;
        if (both && marked_.partner[at(u)] == 0 && chains_.areNeighbours(two[0], two[1])) {
            const bool zeroFirst = chains_.slot[at(two[0])] < chains_.slot[at(two[1])];
            addBoxEnd(zeroFirst ? two[0] : two[1], 1, false);
        } else {
            for (std::uint8_t side = 0; side < 2; ++side) {
                if (two[side] >= 0 && marked_.partner[at(u)] != side + 1) addBoxEnd(two[side], 0, false);
            }
        }
        for (std::size_t i = 0; i < children.size(); ++i) {
            if (marked_.child[firstChild + i] == 0) addBoxEnd(children[i], 0, true);
        }
        kin::mergeSort(boxEnds_.begin(), boxEnds_.end(), [](const BoxEnd& a, const BoxEnd& b) {
            return a.gap != b.gap ? a.gap < b.gap : a.isBelow < b.isBelow;
        });
    }

    void addStrands(std::int32_t u) {
        const std::int32_t firstGap = boxEnds_.front().gap;
        const std::int32_t lastGap = boxEnds_.back().gap;
        const std::int32_t firstPass = rows_.nodeCount();
        if (firstGap < lastGap) {
            rows_.firstPass[at(u)] = firstPass;
            rows_.passRow[at(u)] = firstGap + 1;
        }
        for (std::int32_t row = firstGap + 1; row <= lastGap; ++row) {
            rows_.row.push_back(row);
            rows_.size.push_back(1);
            rows_.passUnion.push_back(u);
        }
        auto next = boxEnds_.begin();
        for (std::int32_t gap = firstGap; gap <= lastGap; ++gap) {
            Rows::Strand strand{u, gap, static_cast<std::uint32_t>(rows_.ends.size()), 0, 0};
            const auto pass = firstPass + gap - firstGap;
            if (gap > firstGap) rows_.ends.push_back({pass - 1, 0});
            for (; next != boxEnds_.end() && next->gap == gap && !next->isBelow; ++next) {
                rows_.ends.push_back(next->end);
            }
            strand.aboveCount = static_cast<std::uint32_t>(rows_.ends.size()) - strand.firstEnd;
            for (; next != boxEnds_.end() && next->gap == gap; ++next) rows_.ends.push_back(next->end);
            if (gap < lastGap) rows_.ends.push_back({pass, 0});
            strand.belowCount =
                static_cast<std::uint32_t>(rows_.ends.size()) - strand.firstEnd - strand.aboveCount;
            rows_.strandOfEnd.resize(rows_.ends.size(), static_cast<std::int32_t>(rows_.strands.size()));
            rows_.strands.push_back(strand);
        }
    }

    const Component& part_;
    const Chains& chains_;
    const MarkedLinks& marked_;
    std::vector<BoxEnd> boxEnds_;
    Rows rows_;
};

}  // namespace

Rows makeRows(const Component& part, const Chains& chains, const std::vector<std::int32_t>& rowOfChain,
              const MarkedLinks& marked) {
    return RowsBuilder(part, chains, rowOfChain, marked).build();
}

}  // namespace olvane::charts
