// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <span>
#include <vector>

#include <olvane/kin/KinLinksInternal.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::kin {

// Which links are followed upwards.
enum class Links : std::uint8_t { blood, all };

// Places in an Ancestry. They rise upwards: a child comes before its parents.
using Spot = std::int32_t;
constexpr Spot kNowhere = -1;

struct SpotLink {
    Spot to;
    Bond bond;
    // Generations that the link goes up: 1 from a person, 0 from a couple to one of the two.
    std::int8_t length;
};

// The ancestors of two persons, the two included: persons and couples in an order in which an ancestor
// comes after all descendants. The order is by generations as far as the links allow (Kahn, "Topological sorting of
// large networks", 1962), so founders stand close to their children and searches upwards end early.
//
// Holds: immutable once gathered, until the next call of gather.
class Ancestry {
public:
    explicit Ancestry(const KinLinks& links);

    // Time grows with the number of ancestors. After it hasLoop() says whether there is an order at all; without
    // one, nothing else is defined.
    void gather(Place a, Place b, Links which);

    bool hasLoop() const { return hasLoop_; }
    bool hasCommon() const { return !common_.empty(); }
    bool hasOtherBonds() const { return hasOtherBonds_; }

    Spot size() const { return static_cast<Spot>(nodes_.size()); }
    Spot spotOfA() const { return spotOfA_; }
    Spot spotOfB() const { return spotOfB_; }
    Node node(Spot spot) const { return nodes_[at(spot)]; }
    bool isCouple(Spot spot) const { return links_.isCouple(node(spot)); }
    std::span<const SpotLink> up(Spot spot) const { return slice(up_, upStart_, spot); }

    // Ancestors of both, or one of the two who is an ancestor of the other. All ancestors of these are common too.
    bool isCommon(Spot spot) const { return sides_[at(spot)] == kBothSides; }
    std::span<const Spot> common() const { return common_; }
    // Common, or with an ancestor who is.
    bool isRelevant(Spot spot) const { return relevant_[at(spot)] != 0; }

    const KinLinks& links() const { return links_; }

private:
    static constexpr std::uint8_t kBothSides = 3;

    std::span<const UpLink> linksUp(Node node) const {
        return which_ == Links::blood ? links_.upByBlood(node) : links_.up(node);
    }
    void reach(Node node);
    void reachAll();
    void putInOrder();
    void addLinks();
    void findCommon();

    const KinLinks& links_;
    Links which_ = Links::blood;
    bool hasLoop_ = false;
    bool hasOtherBonds_ = false;
    Spot spotOfA_ = kNowhere;
    Spot spotOfB_ = kNowhere;
    std::vector<Node> nodes_;
    std::vector<std::uint32_t> upStart_;
    std::vector<SpotLink> up_;
    std::vector<std::uint8_t> sides_;
    std::vector<std::uint8_t> relevant_;
    std::vector<Spot> common_;

    // By node of the whole graph: valid where the stamp is that of this gathering.
    std::uint32_t stamp_ = 0;
    std::vector<std::uint32_t> stamps_;
    std::vector<Spot> spots_;
    std::vector<Node> found_;
    std::vector<std::int32_t> waitsFor_;
};

}  // namespace olvane::kin
