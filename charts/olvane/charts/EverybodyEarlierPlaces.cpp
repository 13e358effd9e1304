// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The places of an earlier chart: where everybody stood, and where they stand when others need room beside them.

#include <olvane/charts/EverybodyEarlierInternal.h>

#include <algorithm>
#include <map>
#include <utility>

#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

namespace {

using kin::at;
using picture::Index;
using picture::kNone;

// Boxes stay before lines do, and all that was there before what is new.
constexpr double kPassWeight = 0.02;
constexpr double kNewWeight = 0.001;

// The lines of a union in the earlier picture.
class EarlierFamilies {
public:
    EarlierFamilies(const Component& part, const EarlierPicture& earlier) : part_(part), earlier_(earlier) {
        for (std::size_t f = 0; f < earlier.picture.families.size(); ++f) {
            const picture::Family& family = earlier.picture.families[f];
            const auto parents = earlier.picture.parents(family);
            const Index first = parents.empty() ? kNone : parents[0];
            const Index second = parents.size() < 2 ? kNone : parents[1];
            ofParents_[std::minmax(first, second)].push_back(f);
        }
    }

    // Of several families of the same parents, the one that has a child of the union; nullptr for a new one.
    const picture::Family* of(std::int32_t u) const {
        const auto& two = part_.partners[at(u)];
        const auto found = ofParents_.find(std::minmax(box(two[0]), box(two[1])));
        if (found == ofParents_.end()) return nullptr;
        for (const std::size_t f : found->second) {
            const picture::Family& family = earlier_.picture.families[f];
            const auto children = earlier_.picture.children(family);
            for (const std::int32_t child : part_.children[u]) {
                if (box(child) == kNone) continue;
                if (std::find(children.begin(), children.end(), box(child)) != children.end()) return &family;
            }
        }
        return found->second.size() == 1 ? &earlier_.picture.families[found->second.front()] : nullptr;
    }

private:
    Index box(std::int32_t person) const {
        return person < 0 ? kNone : earlier_.boxOf[at(part_.persons[at(person)])];
    }

    const Component& part_;
    const EarlierPicture& earlier_;
    std::map<std::pair<Index, Index>, std::vector<std::size_t>> ofParents_;
};

// Where each person begins in their chain.
double offsetOf(const Chains& chains, std::int32_t chain, std::size_t slot, bool flipped,
                const RowSizes& sizes, const std::vector<double>& widthOf) {
    const auto persons = chains.persons[chain];
    double left = 0;
    for (std::size_t i = flipped ? persons.size() - 1 : 0; i != slot; flipped ? --i : ++i) {
        left += widthOf[at(persons[i])] + sizes.gap;
    }
    return left;
}

// Nodes that move together: their places, sorted, each with its weight.
struct Pool {
    std::vector<std::pair<double, double>> places;
    double weight = 0;
    double median = 0;
    std::size_t count = 0;

    void findMedian() {
        double below = 0;
        for (const auto& [place, own] : places) {
            below += own;
            median = place;
            if (2 * below >= weight) return;
        }
    }
};

void settleNear(const std::vector<std::int32_t>& nodes, const Rows& rows, const RowSizes& sizes,
                const std::vector<double>& wanted, const std::vector<std::uint8_t>& isNew,
                std::vector<double>& left) {
    std::vector<Pool> pools;
    std::vector<double> offset(nodes.size(), 0);
    for (std::size_t i = 0; i < nodes.size(); ++i) {
        const std::int32_t node = nodes[i];
        if (i > 0) {
            offset[i] =
                offset[i - 1] + sizes.width[at(nodes[i - 1])] + sizes.between(rows, nodes[i - 1], node);
        }
        const double weight = isNew[at(node)] != 0 ? kNewWeight
                              : rows.isPass(node)  ? kPassWeight
                                                   : rows.size[at(node)];
        Pool pool;
        pool.places = {{wanted[at(node)] - offset[i], weight}};
        pool.weight = weight;
        pool.median = pool.places[0].first;
        pool.count = 1;
        while (!pools.empty() && pools.back().median > pool.median) {
            Pool& before = pools.back();
            const auto middle = static_cast<std::ptrdiff_t>(before.places.size());
            before.places.insert(before.places.end(), pool.places.begin(), pool.places.end());
            std::inplace_merge(before.places.begin(), before.places.begin() + middle, before.places.end());
            before.weight += pool.weight;
            before.count += pool.count;
            before.findMedian();
            pool = std::move(before);
            pools.pop_back();
        }
        pools.push_back(std::move(pool));
    }
    std::size_t i = 0;
    for (const Pool& pool : pools) {
        for (std::size_t k = 0; k < pool.count; ++k, ++i) left[at(nodes[i])] = pool.median + offset[i];
    }
}

}  // namespace

std::vector<double> placesAsBefore(const Component& part, const Chains& chains, const Rows& rows,
                                   const EarlierRows& earlierRows, const EarlierPicture& earlier,
                                   const RowSizes& sizes, const std::vector<double>& widthOf) {
    std::vector<double> places(at(rows.nodeCount()), kUnknown);
    for (std::int32_t chain = 0; chain < rows.chainCount; ++chain) {
        const bool flipped = stoodFlipped(part, chains, chain, earlier);
        const auto persons = chains.persons[chain];
        for (std::size_t slot = 0; slot < persons.size() && !isKnown(places[at(chain)]); ++slot) {
            const picture::Box* box = boxOf(part, earlier, persons[slot]);
            if (box == nullptr) continue;
            places[at(chain)] = box->x - offsetOf(chains, chain, slot, flipped, sizes, widthOf);
        }
    }
    const EarlierFamilies families(part, earlier);
    for (std::int32_t pass = rows.chainCount; pass < rows.nodeCount(); ++pass) {
        const double middle = earlierRows.middle[at(rows.row[at(pass)])];
        const picture::Family* family = families.of(rows.passUnion[at(pass - rows.chainCount)]);
        if (family == nullptr || !isKnown(middle)) continue;
        for (const picture::Line& line : earlier.picture.linesOf(*family)) {
            const bool crosses = line.x1 == line.x2 && std::min(line.y1, line.y2) < middle - 1 &&
                                 std::max(line.y1, line.y2) > middle + 1;
            if (crosses) places[at(pass)] = line.x1;
        }
    }
    return places;
}

std::vector<double> placesNear(const Rows& rows, const RowOrder& order, const RowSizes& sizes,
                               const std::vector<double>& wanted, const std::vector<std::uint8_t>& isNew) {
    std::vector<double> left(wanted.size(), 0);
    for (const auto& nodes : order.nodes) settleNear(nodes, rows, sizes, wanted, isNew, left);
    const double first = left.empty() ? 0 : *std::min_element(left.begin(), left.end());
    for (double& place : left) place -= first;
    return left;
}

}  // namespace olvane::charts
