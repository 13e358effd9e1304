// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <span>
#include <vector>

#include <olvane/kin/KinGraph.h>
#include <olvane/kin/Kinship.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::kin {

// A person, or a couple of parents: persons keep their places, couples follow.
using Node = std::int32_t;

// From a child to its parents, or from a couple to one of the two.
struct UpLink {
    Node to;
    Bond bond;  // Bond::blood from a couple to its partners
};

// Ways in which two persons who are directly linked are linked, as bits.
constexpr std::uint8_t kIsParent = 1;
constexpr std::uint8_t kIsChild = 2;
constexpr std::uint8_t kIsPartner = 4;

struct Neighbor {
    Place person;
    std::uint8_t kinds;  // of the neighbor, seen from the person whose list it is in
};

// Who is whose parent by blood and otherwise, and who is linked with whom, for searching.
//
// A child with two parents is linked to the couple that they form, and the couple to both; a child with one known
// parent is linked to that parent. A person's parents by blood are, slot by slot, the first known partners of the
// unions that they are a child of by birth or in an unknown manner; where there is no such union, of those that they
// were sealed to. The partners of all their other unions are parents by another bond.
//
// Holds: immutable. The link by blood, if any, comes first. Nobody has two links to one parent.
class KinLinks {
public:
    explicit KinLinks(const KinGraph& graph);

    Node nodeCount() const { return personCount_ + static_cast<Node>(couples_.size()); }
    bool isCouple(Node node) const { return node >= personCount_; }
    // A man, then a woman; otherwise the lower id, then the higher one.
    const std::array<Place, 2>& partnersOf(Node couple) const { return couples_[at(couple - personCount_)]; }

    std::span<const UpLink> up(Node node) const { return slice(up_, upStart_, node); }
    // Of a person: none or one; of a couple: both.
    std::span<const UpLink> upByBlood(Node node) const;

    // Both parents by blood are one and the same person.
    bool hasOneParentTwice(Place person) const { return oneParentTwice_[at(person)]; }
    // Both parents by blood are known.
    bool hasTwoParents(Place person) const;

    // By rising id.
    std::span<const Neighbor> neighbors(Place person) const {
        return slice(neighbors_, neighborStart_, person);
    }
    // 0 where the two are not linked.
    std::uint8_t kindsBetween(Place person, Place neighbor) const;

    const KinGraph& graph() const { return graph_; }

private:
    void addUpLinks();
    void addNeighbors();

    const KinGraph& graph_;
    Place personCount_;
    std::vector<std::array<Place, 2>> couples_;
    std::vector<std::uint32_t> upStart_;
    std::vector<UpLink> up_;
    std::vector<bool> oneParentTwice_;
    std::vector<std::uint32_t> neighborStart_;
    std::vector<Neighbor> neighbors_;
};

}  // namespace olvane::kin
