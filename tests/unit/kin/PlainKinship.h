// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <set>
#include <vector>

#include <olvane/kin/KinGraph.h>
#include <olvane/kin/Kinship.h>

// A second kinship, slow and plain: every chain of parents is written down, and from its top every chain of children that
// ends at the other person.
namespace plain {

using olvane::kin::Bond;
using olvane::kin::KinGraph;
using olvane::kin::KinWay;
using olvane::kin::Place;

struct Parent {
    Place person;
    Bond bond;
    // Parents of one family share a number, by which they are a couple.
    int family;
};

// The same link, seen from the parent.
typedef Parent Child;

class Kinship {
public:
    explicit Kinship(const KinGraph& graph);

    const std::vector<Parent>& parentsOf(Place person) const {
        return parents_[static_cast<std::size_t>(person)];
    }

    // All ways by blood, or all with another bond, nearest first and then by ids. Ends only if chains are few.
    std::vector<KinWay> ways(Place a, Place b, bool byBlood) const;

    // phi of everybody with everybody, by the table that begins with the oldest (Emik and Terrill, 1949); empty in
    // data with a loop.
    std::optional<std::vector<std::vector<double>>> coefficients() const;

    // The shortest paths, as persons, that need a partner link or a second climb. Every path is tried.
    // onlyLean: no two persons with one between them are linked.
    std::set<std::vector<Place>> marriageWays(Place a, Place b, bool onlyLean) const;
    int distance(Place a, Place b) const;

private:
    using Chain =
        std::vector<Parent>;  // from a person to an ancestor, with the bond by which each was reached

    using Persons = std::vector<bool>;  // by place

    void addWay(const Chain& up, const Chain& down, bool byBlood, std::vector<KinWay>& ways) const;
    void addWaysDown(Chain& down, const Chain& up, Place b, bool byBlood, Persons& met,
                     const Persons& leadsToB, std::vector<KinWay>& ways) const;
    Persons withAncestors(Place person, bool byBlood) const;
    void addWaysUp(Chain& up, Place b, bool byBlood, Persons& met, const Persons& leadsToB,
                   std::vector<KinWay>& ways) const;
    bool isListedFirst(Place one, Place other) const;
    bool linked(Place one, Place other) const;
    bool isMore(const std::vector<Place>& path) const;

    const KinGraph& graph_;
    std::vector<std::vector<Parent>> parents_;
    std::vector<std::vector<Child>> children_;
    std::vector<bool> oneParentTwice_;  // one person in both slots gives both genes
    std::vector<std::set<Place>> partners_;
};

}  // namespace plain
