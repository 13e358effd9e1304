// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A chart of everybody that keeps the places of an earlier one: rows and order are taken over, new chains and passes
// are inserted, and what then has no room is moved aside by as little as can be.

#include <olvane/charts/EverybodyKeptInternal.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <map>
#include <queue>
#include <utility>

#include <olvane/kin/Index.h>
#include <olvane/kin/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

using picture::Index;
using picture::kNone;

constexpr double kUnknown = std::numeric_limits<double>::quiet_NaN();
// Boxes stay before lines do, and all that was there before what is new.
constexpr double kPassWeight = 0.02;
constexpr double kNewWeight = 0.001;

bool isKnown(double place) {
    return place == place;
}

// The box of a person of a part; nullptr for who is new.
const picture::Box* boxOf(const Component& part, const EarlierPicture& earlier, std::int32_t person) {
    const Index box = earlier.boxOf[at(part.persons[at(person)])];
    return box == kNone ? nullptr : &earlier.picture.boxes[at(box)];
}

double middleOf(const picture::Box& box) {
    return box.y + double{box.height} / 2;
}

}  // namespace

EarlierPicture earlierPictureOf(const kin::KinGraph& graph, const picture::Picture& picture, bool sideways,
                                bool mirrored) {
    EarlierPicture earlier;
    earlier.picture = picture;
    earlier.boxOf.assign(at(graph.personCount()), kNone);
    double bottom = 0;
    for (picture::Box& box : earlier.picture.boxes) {
        if (sideways) {
            std::swap(box.x, box.y);
            std::swap(box.width, box.height);
        }
        bottom = std::max(bottom, box.y + double{box.height});
    }
    for (std::size_t i = 0; i < earlier.picture.boxes.size(); ++i) {
        picture::Box& box = earlier.picture.boxes[i];
        if (mirrored) box.y = bottom - box.y - double{box.height};
        const kin::Place place = graph.placeOf(box.id);
        const bool isPlaced = std::isfinite(box.x) && std::isfinite(box.y);
        if (place != kin::kNobody && isPlaced) earlier.boxOf[at(place)] = static_cast<Index>(i);
    }
    for (picture::Line& line : earlier.picture.lines) {
        if (sideways) {
            std::swap(line.x1, line.y1);
            std::swap(line.x2, line.y2);
        }
        if (!mirrored) continue;
        line.y1 = bottom - line.y1;
        line.y2 = bottom - line.y2;
    }
    return earlier;
}

namespace {

class RowsAsBefore {
public:
    RowsAsBefore(const Component& part, const Chains& chains, const EarlierPicture& earlier)
        : part_(part), chains_(chains), earlier_(earlier) {
        kept_.rowOfChain.assign(at(chains.count()), kUnset);
    }

    KeptRows keep(const std::vector<double>& widthOf) {
        if (!findMiddles(widthOf)) return {};
        for (std::int32_t chain = 0; chain < chains_.count(); ++chain) takeRow(chain);
        findRowsOfNew();
        countFromZero();
        return std::move(kept_);
    }

private:
    static constexpr std::int32_t kUnset = std::numeric_limits<std::int32_t>::min();
    static constexpr double kSameRow = 0.01;

    // The middles of all rows. False where the part is another one.
    bool findMiddles(const std::vector<double>& widthOf) {
        std::int32_t known = 0;
        for (std::int32_t person = 0; person < part_.personCount(); ++person) {
            const picture::Box* box = boxOf(part_, earlier_, person);
            if (box == nullptr || std::abs(double{box->width} - widthOf[at(person)]) > kSameRow) continue;
            ++known;
            middles_.push_back(middleOf(*box));
        }
        if (2 * known < part_.personCount()) return false;
        kin::mergeSort(middles_.begin(), middles_.end());
        const auto end = std::unique(middles_.begin(), middles_.end(),
                                     [](double a, double b) { return b - a <= kSameRow; });
        middles_.erase(end, middles_.end());
        return true;
    }

    std::int32_t rowOf(const picture::Box& box) const {
        const auto found = std::lower_bound(middles_.begin(), middles_.end(), middleOf(box) - kSameRow);
        return static_cast<std::int32_t>(found - middles_.begin());
    }

    // The row of most of its persons, the lowest of equally many.
    void takeRow(std::int32_t chain) {
        std::vector<std::int32_t> rows;
        for (const std::int32_t person : chains_.persons[chain]) {
            if (const picture::Box* box = boxOf(part_, earlier_, person)) rows.push_back(rowOf(*box));
        }
        kin::mergeSort(rows.begin(), rows.end());
        std::size_t most = 0;
        for (std::size_t first = 0, end = 0; first < rows.size(); first = end) {
            while (end < rows.size() && rows[end] == rows[first]) ++end;
            if (end - first < most) continue;
            most = end - first;
            kept_.rowOfChain[at(chain)] = rows[first];
        }
    }

    std::int32_t rowOfPerson(std::int32_t person) const {
        return kept_.rowOfChain[at(chains_.chain[at(person)])];
    }

    // Chains that are new, those beside known ones first.
    void findRowsOfNew() {
        std::vector<std::int32_t> queue;
        std::vector<std::uint8_t> queued(at(chains_.count()), 0);
        const auto enqueueAround = [&](std::int32_t chain) {
            forKin(chain, [&](std::int32_t person, int) {
                const std::int32_t other = chains_.chain[at(person)];
                if (kept_.rowOfChain[at(other)] != kUnset || queued[at(other)] != 0) return;
                queued[at(other)] = 1;
                queue.push_back(other);
            });
        };
        for (std::int32_t chain = 0; chain < chains_.count(); ++chain) {
            if (kept_.rowOfChain[at(chain)] != kUnset) enqueueAround(chain);
        }
        for (std::size_t next = 0; next < queue.size(); ++next) {
            kept_.rowOfChain[at(queue[next])] = rowBesideKin(queue[next]);
            enqueueAround(queue[next]);
        }
    }

    // visit(person, where): -1 for parents, 1 for children, 0 for siblings and partners.
    template <class Visit>
    void forKin(std::int32_t chain, const Visit& visit) const {
        for (const std::int32_t person : chains_.persons[chain]) {
            for (const std::int32_t u : part_.asChild[person]) {
                for (const std::int32_t parent : part_.partners[at(u)]) {
                    if (parent >= 0) visit(parent, -1);
                }
                for (const std::int32_t sibling : part_.children[u]) visit(sibling, 0);
            }
            for (const std::int32_t u : part_.asPartner[person]) {
                for (const std::int32_t partner : part_.partners[at(u)]) {
                    if (partner >= 0) visit(partner, 0);
                }
                for (const std::int32_t child : part_.children[u]) visit(child, 1);
            }
        }
    }

    // Beside siblings or partners where that is below all parents and above all children; else as near as can be.
    std::int32_t rowBesideKin(std::int32_t chain) const {
        std::int32_t above = kUnset;
        std::int32_t below = std::numeric_limits<std::int32_t>::max();
        std::int32_t beside = kUnset;
        forKin(chain, [&](std::int32_t person, int where) {
            const std::int32_t row = rowOfPerson(person);
            if (row == kUnset) return;
            if (where < 0) above = std::max(above, row);
            if (where > 0) below = std::min(below, row);
            if (where == 0) beside = std::max(beside, row);
        });
        if (beside != kUnset && beside > above && beside < below) return beside;
        if (above != kUnset) return above + 1;
        if (below != std::numeric_limits<std::int32_t>::max()) return below - 1;
        return beside;
    }

    // Rows that nobody is in any more are left out.
    void countFromZero() {
        std::map<std::int32_t, std::int32_t> used;
        for (const std::int32_t row : kept_.rowOfChain) used[row] = 0;
        std::int32_t next = 0;
        for (auto& [row, number] : used) {
            number = next++;
            const bool wasThere = row >= 0 && at(row) < middles_.size();
            kept_.middle.push_back(wasThere ? middles_[at(row)] : kUnknown);
        }
        for (std::int32_t& row : kept_.rowOfChain) row = used[row];
    }

    const Component& part_;
    const Chains& chains_;
    const EarlierPicture& earlier_;
    std::vector<double> middles_;
    KeptRows kept_;
};

}  // namespace

KeptRows rowsAsBefore(const Component& part, const Chains& chains, const EarlierPicture& earlier,
                      const std::vector<double>& widthOf) {
    return RowsAsBefore(part, chains, earlier).keep(widthOf);
}

void markAsBefore(const Component& part, const EarlierPicture& earlier, MarkedLinks& marked) {
    std::vector<std::array<Index, 3>> marks;
    for (const picture::Mark& mark : earlier.picture.marks) {
        if (mark.kind == picture::MarkKind::samePerson) continue;
        marks.push_back({mark.boxes[0], mark.boxes[1], mark.boxes[2]});
    }
    kin::mergeSort(marks.begin(), marks.end());
    const auto had = [&](Index a, Index b, Index c) {
        return a != kNone && std::binary_search(marks.begin(), marks.end(), std::array{a, b, c});
    };
    const auto box = [&](std::int32_t person) {
        return person < 0 ? kNone : earlier.boxOf[at(part.persons[at(person)])];
    };
    std::size_t link = 0;
    for (std::int32_t u = 0; u < part.unionCount(); ++u) {
        const auto& two = part.partners[at(u)];
        const Index first = two[0] >= 0 ? box(two[0]) : box(two[1]);
        const Index second = two[0] >= 0 ? box(two[1]) : kNone;
        for (const std::int32_t child : part.children[u]) {
            if (had(box(child), first, second)) marked.child[link] = 1;
            ++link;
        }
        if (marked.partner[at(u)] == 0 && two[0] >= 0 && two[1] >= 0 &&
            had(box(two[0]), box(two[1]), kNone)) {
            marked.partner[at(u)] = 2;
        }
    }
}

namespace {

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

// Whether the persons of a chain stood from right to left.
bool stoodFlipped(const Component& part, const Chains& chains, std::int32_t chain,
                  const EarlierPicture& earlier) {
    const picture::Box* before = nullptr;
    for (const std::int32_t person : chains.persons[chain]) {
        const picture::Box* box = boxOf(part, earlier, person);
        if (box == nullptr) continue;
        if (before != nullptr) return box->x < before->x;
        before = box;
    }
    return false;
}

}  // namespace

std::vector<double> placesAsBefore(const Component& part, const Chains& chains, const Rows& rows,
                                   const KeptRows& kept, const EarlierPicture& earlier, const RowSizes& sizes,
                                   const std::vector<double>& widthOf) {
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
        const double middle = kept.middle[at(rows.row[at(pass)])];
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

namespace {

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

namespace {

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

std::vector<double> placesNear(const Rows& rows, const RowOrder& order, const RowSizes& sizes,
                               const std::vector<double>& wanted, const std::vector<std::uint8_t>& isNew) {
    std::vector<double> left(wanted.size(), 0);
    for (const auto& nodes : order.nodes) settleNear(nodes, rows, sizes, wanted, isNew, left);
    const double first = left.empty() ? 0 : *std::min_element(left.begin(), left.end());
    for (double& place : left) place -= first;
    return left;
}

}  // namespace olvane::charts
