// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Every node wants to stand in the middle of its strands, and every strand in the middle of its ends. In turns,
// strands move to where their ends are and nodes to where their strands are; each row is then put right by
// isotonic regression: of all places with the right order and gaps, the ones with the least squares of
// distance to what was wanted (pool adjacent violators: Ayer, Brunk, Ewing, Reid and Silverman 1955).

#include <olvane/charts/EverybodyPlacesInternal.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

class Placement {
public:
    Placement(const Rows& rows, const RowOrder& order, const RowSizes& sizes, double leastWidth)
        : rows_(rows), order_(order), sizes_(sizes), width_(leastWidth), left_(at(rows.nodeCount())) {
        for (const auto& nodes : order.nodes) width_ = std::max(width_, pack(nodes));
        for (const auto& nodes : order.nodes) {
            if (nodes.empty()) continue;
            const double spare = width_ - left_[at(nodes.back())] - sizes_.width[at(nodes.back())];
            const double step = spare / static_cast<double>(nodes.size() + 1);
            double move = step;
            for (const std::int32_t node : nodes) {
                left_[at(node)] += move;
                move += step;
            }
        }
    }

    std::vector<double> run(int sweeps) {
        for (auto& middles : middles_) middles.assign(rows_.strands.size(), 0);
        for (std::int32_t gap = -1; gap < rows_.rowCount; ++gap) {
            measureGap(gap, false);
            measureGap(gap, true);
        }
        for (int i = 0; i < sweeps; ++i) {
            const bool down = i % 2 == 0;
            for (std::int32_t step = 0; step < rows_.rowCount; ++step) {
                const std::int32_t row = down ? step : rows_.rowCount - 1 - step;
                placeRow(row, down, i + 2 >= sweeps);
            }
        }
        if (sizes_.grid > 0) {
            for (const auto& nodes : order_.nodes) snapToGrid(nodes);
        }
        return std::move(left_);
    }

private:
    // As far left as they go; the width that they take.
    double pack(const std::vector<std::int32_t>& nodes) {
        double next = 0;
        for (std::size_t i = 0; i < nodes.size(); ++i) {
            if (i > 0) next += sizes_.between(rows_, nodes[i - 1], nodes[i]);
            left_[at(nodes[i])] = next;
            next += sizes_.width[at(nodes[i])];
        }
        return next;
    }

    double endX(std::uint32_t e) const { return left_[at(rows_.ends[e].node)] + sizes_.endPlace[e]; }

    // The middle of the ends of the strands of a gap at the row above it, or at the row below it.
    void measureGap(std::int32_t gap, bool below) {
        if (gap < -1 || gap >= rows_.rowCount) return;
        for (const std::int32_t s : rows_.strandsInGap[gap + 1]) {
            const Rows::Strand& strand = rows_.strands[at(s)];
            const std::uint32_t first = strand.firstEnd + (below ? strand.aboveCount : 0);
            const std::uint32_t count = below ? strand.belowCount : strand.aboveCount;
            double sum = 0;
            for (std::uint32_t e = first; e < first + count; ++e) sum += endX(e);
            middles_[below ? 1 : 0][at(s)] = count > 0 ? sum / count : 0;
        }
    }

    void placeRow(std::int32_t row, bool down, bool last) {
        const auto& nodes = order_.nodes[at(row)];
        wanted_.resize(nodes.size());
        weight_.resize(nodes.size());
        for (std::size_t i = 0; i < nodes.size(); ++i)
            wantPlace(nodes[i], down, last, wanted_[i], weight_[i]);
        settle(nodes);
        measureGap(row - 1, true);
        measureGap(row, false);
    }

    // An end wants to be where the other side of its strand is: for three quarters together with all ends of its
    // own side, for a quarter alone.
    void wantPlace(std::int32_t node, bool down, bool last, double& wanted, double& weight) const {
        double sum = 0;
        weight = 0;
        const double strong = rows_.isPass(node) ? 3 : 1;
        const double weak = last ? 0.5 : 0.25;
        for (const std::int32_t e : rows_.endsAt[node]) {
            const std::int32_t s = rows_.strandOfEnd[at(e)];
            const Rows::Strand& strand = rows_.strands[at(s)];
            const bool below = rows_.isBelow(e);
            if ((below ? strand.aboveCount : strand.belowCount) == 0) continue;
            const double here = middles_[below ? 1 : 0][at(s)];
            const double there = middles_[below ? 0 : 1][at(s)];
            const double by = (below == down ? 1 : weak) * strong;
            sum += by * (0.75 * (left_[at(node)] + (there - here)) + 0.25 * (there - sizes_.endPlace[at(e)]));
            weight += by;
        }
        if (weight == 0) {
            weight = 0.01;
            sum = weight * left_[at(node)];
        }
        wanted = sum / weight;
    }

    // Chains on whole steps of the grid: a change far away, which reaches here as a hundredth of a point, then moves
    // nothing. What stands too near to its left neighbour is put one step further.
    void snapToGrid(const std::vector<std::int32_t>& nodes) {
        double end = 0;
        std::int32_t before = -1;
        for (const std::int32_t node : nodes) {
            double& left = left_[at(node)];
            const double least = before < 0 ? left : end + sizes_.between(rows_, before, node);
            if (!rows_.isPass(node)) left = std::floor(left / sizes_.grid + 0.5) * sizes_.grid;
            if (before >= 0 && left < least) {
                left = rows_.isPass(node) ? least : std::ceil(least / sizes_.grid) * sizes_.grid;
            }
            end = left + sizes_.width[at(node)];
            before = node;
        }
    }

    struct Pool {
        double weight;
        double place;  // of its first node, less what lies left of it when packed
        std::size_t count;
    };

    void settle(const std::vector<std::int32_t>& nodes) {
        pools_.clear();
        offset_.resize(nodes.size());
        double offset = 0;
        for (std::size_t i = 0; i < nodes.size(); ++i) {
            if (i > 0) {
                offset += sizes_.width[at(nodes[i - 1])] + sizes_.between(rows_, nodes[i - 1], nodes[i]);
            }
            offset_[i] = offset;
            Pool pool{weight_[i], wanted_[i] - offset, 1};
            while (!pools_.empty() && pools_.back().place > pool.place) {
                const Pool& before = pools_.back();
                const double weight = before.weight + pool.weight;
                pool.place = (before.place * before.weight + pool.place * pool.weight) / weight;
                pool.weight = weight;
                pool.count += before.count;
                pools_.pop_back();
            }
            pools_.push_back(pool);
        }
        if (nodes.empty()) return;
        const double most = width_ - offset - sizes_.width[at(nodes.back())];
        std::size_t i = 0;
        for (const Pool& pool : pools_) {
            const double place = std::clamp(pool.place, 0.0, std::max(0.0, most));
            for (std::size_t k = 0; k < pool.count; ++k, ++i) left_[at(nodes[i])] = place + offset_[i];
        }
    }

    const Rows& rows_;
    const RowOrder& order_;
    const RowSizes& sizes_;
    double width_;
    std::vector<double> left_;
    std::array<std::vector<double>, 2> middles_;  // by strand: of its ends above, and below
    std::vector<double> wanted_;
    std::vector<double> weight_;
    std::vector<double> offset_;
    std::vector<Pool> pools_;
};

}  // namespace

std::vector<double> placeNodes(const Rows& rows, const RowOrder& order, const RowSizes& sizes,
                               double leastWidth, int sweeps) {
    return Placement(rows, order, sizes, leastWidth).run(sweeps);
}

void makePlacesExact(const Rows& rows, const RowOrder& order, const RowSizes& sizes,
                     std::vector<double>& left) {
    constexpr double kStepsOfAPoint = 1024;
    for (const auto& nodes : order.nodes) {
        double end = -std::numeric_limits<double>::infinity();
        double gap = 0;
        for (const std::int32_t node : nodes) {
            if (rows.isPass(node)) {
                gap = 0;  // the pass stands in it
                continue;
            }
            double& place = left[at(node)];
            place = std::floor(place * kStepsOfAPoint + 0.5) / kStepsOfAPoint;
            if (place < end + gap) place = std::ceil((end + gap) * kStepsOfAPoint) / kStepsOfAPoint;
            end = place + sizes.width[at(node)];
            gap = sizes.gap;
        }
    }
}

}  // namespace olvane::charts
