// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyFoldInternal.h>

#include <algorithm>

#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

constexpr int kMostRows = 3;

int rowsFor(double width, double limit) {
    return width <= limit ? 1 : width <= 2 * limit ? 2 : kMostRows;
}

// The width of a row that makes the picture as wide as it should be for its height; found by halving, since a
// smaller limit only makes the picture narrower and higher.
double limitFor(const std::vector<double>& widths, const FoldSizes& sizes) {
    double low = 0;
    double high = *std::max_element(widths.begin(), widths.end());
    for (int i = 0; i < 40; ++i) {
        const double limit = (low + high) / 2;
        double widest = 0;
        double height = 0;
        for (const double width : widths) {
            const int count = rowsFor(width, limit);
            widest = std::max(widest, width / count);
            height += sizes.rowPitch * count;
        }
        (widest > sizes.aspect * height ? high : low) = limit;
    }
    return high;
}

// The union that a chain hangs from first; -1 for a chain without known parents.
std::int32_t unionAbove(const Rows& rows, std::int32_t chain) {
    const auto strands = rows.strandsAbove[chain];
    return strands.empty() ? -1 : rows.strands[at(strands[0])].unionPlace;
}

// The chains of one row in their order, dealt out to the rows that it is folded into.
class FoldedRow {
public:
    FoldedRow(const Rows& rows, const std::vector<std::int32_t>& nodes) : rows_(rows) {
        for (const std::int32_t node : nodes) {
            if (!rows.isPass(node)) chains_.push_back(node);
        }
    }

    // visit(chain, place): place is 0 to count - 1. The children of a union stay together unless they are wider than
    // the limit and may be split.
    template <class Visit>
    void deal(int count, const FoldSizes& sizes, double limit, const Visit& visit) const {
        int turn = count - 1;
        for (std::size_t first = 0, end = 0; first < chains_.size(); first = end) {
            double width = 0;
            end = first;
            do {
                width += sizes.width[at(chains_[end])];
            } while (++end < chains_.size() && areSiblings(chains_[first], chains_[end]));
            const bool isSplit = sizes.splitSiblings && width > limit;
            turn = (turn + 1) % count;
            for (std::size_t i = first; i < end; ++i) {
                if (isSplit && i > first) turn = (turn + 1) % count;
                visit(chains_[i], turn);
            }
        }
    }

private:
    bool areSiblings(std::int32_t one, std::int32_t other) const {
        const std::int32_t above = unionAbove(rows_, one);
        return above >= 0 && above == unionAbove(rows_, other);
    }

    const Rows& rows_;
    std::vector<std::int32_t> chains_;
};

}  // namespace

std::vector<std::int32_t> foldRows(const Rows& rows, const RowOrder& order, const FoldSizes& sizes) {
    std::vector<double> widths(at(rows.rowCount), 0);
    for (std::int32_t chain = 0; chain < rows.chainCount; ++chain) {
        widths[at(rows.row[at(chain)])] += sizes.width[at(chain)];
    }
    const double limit = limitFor(widths, sizes);
    std::vector<std::int32_t> folded(at(rows.chainCount));
    std::int32_t first = 0;
    for (std::int32_t row = 0; row < rows.rowCount; ++row) {
        const int count = rowsFor(widths[at(row)], limit);
        FoldedRow(rows, order.nodes[at(row)]).deal(count, sizes, limit, [&](std::int32_t chain, int place) {
            folded[at(chain)] = first + place;
        });
        first += count;
    }
    return folded;
}

}  // namespace olvane::charts
