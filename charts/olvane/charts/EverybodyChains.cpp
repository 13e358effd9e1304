// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Couples side by side: nobody has three neighbours, so what is welded is a set of paths in the graph of
// couples. In a tree the most edges that paths can hold are found from the leaves up: each person takes up to
// two partners below who still have a free side (Moran, Newman and Wolfstahl 1990, for covers by paths).
// Rings of couples are rare; an edge that closes one is tried at the end.

#include <olvane/charts/EverybodyChainsInternal.h>

#include <algorithm>
#include <array>
#include <numeric>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

struct Couple {
    std::int32_t other;
    std::int32_t children;
};

class Welding {
public:
    explicit Welding(const Component& part)
        : part_(part), beside_(part.persons.size(), {-1, -1}), met_(part.persons.size(), 0) {}

    // Persons with a partner are walked as trees of couples, and welded from the last met back to the first.
    Chains weld() {
        std::vector<std::int32_t> order;
        std::vector<std::int32_t> above(part_.persons.size(), -1);
        for (std::int32_t person = 0; person < part_.personCount(); ++person) {
            if (met_[at(person)] == 0) walkFrom(person, order, above);
        }
        for (auto it = order.rbegin(); it != order.rend(); ++it) takePartnersBelow(*it, above);
        for (const auto& [a, b] : ringEdges_) tryToJoin(a, b);
        return chains();
    }

private:
    // The partners of a person, each once, the ones with the most children first.
    void couplesOf(std::int32_t person, std::vector<Couple>& couples) const {
        couples.clear();
        for (const std::int32_t u : part_.asPartner[person]) {
            const auto& two = part_.partners[at(u)];
            const std::int32_t other = two[0] == person ? two[1] : two[0];
            if (other < 0) continue;
            const auto children = static_cast<std::int32_t>(part_.children[u].size());
            couples.push_back({other, children});
        }
        kin::mergeSort(couples.begin(), couples.end(),
                       [](const Couple& a, const Couple& b) { return a.other < b.other; });
        std::size_t kept = 0;
        for (const Couple& couple : couples) {
            if (kept > 0 && couples[kept - 1].other == couple.other) {
                couples[kept - 1].children += couple.children;
            } else {
                couples[kept++] = couple;
            }
        }
        couples.resize(kept);
        kin::mergeSort(couples.begin(), couples.end(),
                       [](const Couple& a, const Couple& b) { return a.children > b.children; });
    }

    void walkFrom(std::int32_t first, std::vector<std::int32_t>& order, std::vector<std::int32_t>& above) {
        met_[at(first)] = 1;
        std::size_t next = order.size();
        order.push_back(first);
        std::vector<Couple> couples;
        for (; next < order.size(); ++next) {
            const std::int32_t person = order[next];
            couplesOf(person, couples);
            for (const Couple& couple : couples) {
                if (couple.other == above[at(person)]) continue;
                if (met_[at(couple.other)] != 0) {
                    if (person < couple.other) ringEdges_.push_back({person, couple.other});
                    continue;
                }
                met_[at(couple.other)] = 1;
                above[at(couple.other)] = person;
                order.push_back(couple.other);
            }
        }
    }

    void takePartnersBelow(std::int32_t person, const std::vector<std::int32_t>& above) {
        couplesOf(person, couples_);
        for (const Couple& couple : couples_) {
            if (above[at(couple.other)] != person) continue;
            if (hasFreeSide(person) && hasFreeSide(couple.other)) join(person, couple.other);
        }
    }

    bool hasFreeSide(std::int32_t person) const { return beside_[at(person)][1] < 0; }

    void join(std::int32_t a, std::int32_t b) {
        for (const auto& [one, other] : {std::array{a, b}, std::array{b, a}}) {
            auto& two = beside_[at(one)];
            two[two[0] < 0 ? 0 : 1] = other;
        }
    }

    // The end of a's path, walking away from a; a has at most one neighbour.
    std::int32_t farEnd(std::int32_t a) const {
        std::int32_t before = -1;
        while (true) {
            const auto& two = beside_[at(a)];
            const std::int32_t next = two[0] != before ? two[0] : two[1];
            if (next < 0) return a;
            before = a;
            a = next;
        }
    }

    void tryToJoin(std::int32_t a, std::int32_t b) {
        if (hasFreeSide(a) && hasFreeSide(b) && farEnd(a) != b) join(a, b);
    }

    // From each path's end with the smaller number; a man is put left of his first welded wife.
    Chains chains() const {
        Chains chains;
        chains.chain.assign(part_.persons.size(), -1);
        chains.slot.assign(part_.persons.size(), 0);
        std::int32_t count = 0;
        std::vector<std::int32_t> order;
        order.reserve(part_.persons.size());
        for (std::int32_t person = 0; person < part_.personCount(); ++person) {
            if (chains.chain[at(person)] >= 0 || !hasFreeSide(person)) continue;
            const std::size_t first = order.size();
            for (std::int32_t before = -1, now = person; now >= 0;) {
                chains.chain[at(now)] = count;
                order.push_back(now);
                const auto& two = beside_[at(now)];
                const std::int32_t next = two[0] != before ? two[0] : two[1];
                before = now;
                now = next;
            }
            if (isWrongWayRound(order[first], order.size() - first > 1 ? order[first + 1] : -1)) {
                std::reverse(order.begin() + static_cast<std::ptrdiff_t>(first), order.end());
            }
            for (std::size_t i = first; i < order.size(); ++i) {
                chains.slot[at(order[i])] = static_cast<std::int32_t>(i - first);
            }
            ++count;
        }
        chains.persons.fill(at(count), [&](const auto& visit) {
            for (const std::int32_t person : order) visit(chains.chain[at(person)], person);
        });
        return chains;
    }

    // Whether the first of a chain is partner 1 of the couple that it makes with the second.
    bool isWrongWayRound(std::int32_t first, std::int32_t second) const {
        if (second < 0) return false;
        for (const std::int32_t u : part_.asPartner[first]) {
            const auto& two = part_.partners[at(u)];
            if (two[0] == second && two[1] == first) return true;
            if (two[0] == first && two[1] == second) return false;
        }
        return false;
    }

    const Component& part_;
    std::vector<std::array<std::int32_t, 2>> beside_;
    std::vector<std::uint8_t> met_;
    std::vector<std::array<std::int32_t, 2>> ringEdges_;
    std::vector<Couple> couples_;
};

}  // namespace

Chains weldCouples(const Component& part) {
    return Welding(part).weld();
}

}  // namespace olvane::charts
