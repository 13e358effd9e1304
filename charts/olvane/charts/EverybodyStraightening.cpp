// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Rows sorted so that all links lie as straight as they can: the start from which the fewest crossings are found.

#include <olvane/charts/EverybodyOrderInternal.h>

#include <algorithm>
#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

// Beyond this, straightening a walk takes too many rounds, and distances are a better start.
constexpr std::int32_t kMostNodesOfAWalk = 5'000;

// One-dimensional drawing by the second eigenvector of the Laplacian, by power iteration (Fiedler 1973; Carmel,
// Harel and Koren 2002, for graphs in rows). A strand is a hyperedge: a star around its middle.
class Straightening {
public:
    Straightening(const Rows& rows, const RowOrder& order)
        : rows_(rows), x_(at(rows.nodeCount())), next_(x_.size()), middle_(rows.strands.size()) {
        for (const auto& nodes : order.nodes) {
            double left = 0;
            for (const std::int32_t node : nodes) left -= rows.size[at(node)];
            for (const std::int32_t node : nodes) {
                x_[at(node)] = left + rows.size[at(node)];
                left += 2 * rows.size[at(node)];
            }
        }
    }

    // Everybody as far right as the number of strands from one end of the family to them. The end is the last
    // that a first such walk meets (George and Liu 1979).
    void startFromOneEnd() {
        std::vector<std::int32_t> met(x_.size(), -1);
        std::vector<std::int32_t> queue;
        walkInBreadth(0, met, queue);
        const std::int32_t end = queue.back();
        std::fill(met.begin(), met.end(), -1);
        queue.clear();
        walkInBreadth(end, met, queue);
        for (std::size_t i = 0; i < x_.size(); ++i) x_[i] = met[i];
    }

    const std::vector<double>& run(int rounds) {
        normalise();
        for (int i = 0; i < rounds; ++i) {
            for (std::size_t s = 0; s < middle_.size(); ++s) middle_[s] = middleOf(rows_.strands[s]);
            for (std::int32_t node = 0; node < rows_.nodeCount(); ++node) averageNode(node);
            x_.swap(next_);
            normalise();
        }
        return x_;
    }

private:
    void walkInBreadth(std::int32_t first, std::vector<std::int32_t>& met,
                       std::vector<std::int32_t>& queue) const {
        std::vector<std::uint8_t> strandMet(rows_.strands.size(), 0);
        met[at(first)] = 0;
        queue.push_back(first);
        for (std::size_t next = 0; next < queue.size(); ++next) {
            const std::int32_t node = queue[next];
            for (const std::int32_t e : rows_.endsAt[node]) {
                const std::int32_t s = rows_.strandOfEnd[at(e)];
                if (strandMet[at(s)] != 0) continue;
                strandMet[at(s)] = 1;
                const Rows::Strand& strand = rows_.strands[at(s)];
                const std::uint32_t count = strand.aboveCount + strand.belowCount;
                for (std::uint32_t i = strand.firstEnd; i < strand.firstEnd + count; ++i) {
                    const std::int32_t other = rows_.ends[i].node;
                    if (met[at(other)] >= 0) continue;
                    met[at(other)] = met[at(node)] + 1;
                    queue.push_back(other);
                }
            }
        }
    }

    double middleOf(const Rows::Strand& strand) const {
        const std::uint32_t count = strand.aboveCount + strand.belowCount;
        double sum = 0;
        for (std::uint32_t e = strand.firstEnd; e < strand.firstEnd + count; ++e)
            sum += x_[at(rows_.ends[e].node)];
        return sum / count;
    }

    void averageNode(std::int32_t node) {
        double sum = 0;
        for (const std::int32_t s : rows_.strandsAbove[node]) sum += middle_[at(s)];
        for (const std::int32_t s : rows_.strandsBelow[node]) sum += middle_[at(s)];
        const std::size_t count = rows_.strandsAbove[node].size() + rows_.strandsBelow[node].size();
        const double x = x_[at(node)];
        next_[at(node)] = count > 0 ? (x + sum / static_cast<double>(count)) / 2 : x;
    }

    // Mean 0 and greatest distance 1: without it everything ends in one point.
    void normalise() {
        double sum = 0;
        for (const double x : x_) sum += x;
        const double mean = sum / static_cast<double>(x_.size());
        double most = 0;
        for (double& x : x_) {
            x -= mean;
            most = std::max(most, x < 0 ? -x : x);
        }
        if (most == 0) return;
        for (double& x : x_) x /= most;
    }

    const Rows& rows_;
    std::vector<double> x_;
    std::vector<double> next_;
    std::vector<double> middle_;
};

}  // namespace

void straightenOrder(const Rows& rows, RowOrder& order, int rounds) {
    Straightening straightening(rows, order);
    if (rows.nodeCount() > kMostNodesOfAWalk) straightening.startFromOneEnd();
    const std::vector<double>& x = straightening.run(rounds);
    for (auto& nodes : order.nodes) {
        kin::mergeSort(nodes.begin(), nodes.end(),
                       [&x](std::int32_t a, std::int32_t b) { return x[at(a)] < x[at(b)]; });
    }
}

}  // namespace olvane::charts
