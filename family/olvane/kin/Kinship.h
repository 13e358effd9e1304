// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <vector>

#include <olvane/kin/KinGraph.h>

namespace olvane::kin {

// What joins the generations of a way. A way has the bond of its weakest link, blood being the strongest.
enum class Bond : std::uint8_t { blood, adopted, foster, step, other };

// A way up over parents from A to a common ancestor, then down over children to B, in which nobody occurs twice.
struct KinWay {
    int up = 0;    // generations from A to the ancestor; 0 if A is the ancestor
    int down = 0;  // generations from there to B; 0 if B is the ancestor
    // The common ancestor, or both of a couple that shares the two children on the way: a full relation.
    std::vector<Place> ancestors;
    // From A to B over the first ancestor.
    std::vector<Place> persons;
    Bond bond = Bond::blood;
    // One ancestor alone is shared, and both children on the way have another known parent.
    bool half = false;

    int length() const { return up + down; }
};

// A part of a way over marriages: up to an ancestor and down again, or from one partner to the other.
struct KinStep {
    bool isCouple = false;
    UnionState state = UnionState::unknown;  // of a couple
    int up = 0;
    int down = 0;
    bool half = false;
    Bond bond = Bond::blood;
    Place to = kNobody;  // whom the step leads to
};

// A way over partners, parents and children that is no KinWay.
struct MarriageWay {
    std::vector<Place> persons;  // from A to B
    std::vector<KinStep> steps;  // as few as the way can be expressed in

    int links() const { return static_cast<int>(persons.size()) - 1; }
};

// How two persons are related.
//
// Holds: ways stand nearest first, then by the ids of their persons. The counts are of all ways, listed or not, and
//        empty where nobody can say: in data in which one of the two has an ancestor who is their own ancestor, or
//        above 2^53.
struct Kinship {
    Place a = kNobody;
    Place b = kNobody;

    // The kinship coefficient: the chance that an allele drawn from A and one drawn from B are identical by descent.
    // Founders are unrelated, and so are unknown parents. Of a person with themself it is (1 + F) / 2. Empty where
    // somebody among the ancestors by blood is their own ancestor.
    std::optional<double> phi;
    // up + down of the nearest way by blood.
    std::optional<int> degree;
    // Somebody among the ancestors by blood, or among all ancestors, is their own ancestor.
    bool bloodLoop = false;
    bool legalLoop = false;

    std::vector<KinWay> blood;
    std::optional<std::uint64_t> bloodCount;
    // Ways with a link that is not by blood.
    std::vector<KinWay> legal;
    std::optional<std::uint64_t> legalCount;
    // The shortest of their kind, all of one length.
    std::vector<MarriageWay> marriage;
    // Empty where the search was given up.
    std::optional<std::uint64_t> marriageCount;

    bool isRelated() const { return a == b || !blood.empty() || !legal.empty() || !marriage.empty(); }
};

struct KinshipLimits {
    std::size_t ways = 50;  // of each sort, at least 1
    // Lists the nearest ways alone, with no count and no coefficient: several times as fast. Where the two are related by
    // blood or law, a way over marriages is listed only if it is nearer.
    bool nearestAlone = false;
};

class KinshipSearch;

// Finds how persons are related.
//
// Lifetime: the graph must outlive the finder.
// Threads: one call at a time; each thread has a finder of its own.
// Fails: std::out_of_range for a place that is not in the graph.
class OLVANE_API KinshipFinder {
public:
    // Time and memory grow with the graph.
    explicit KinshipFinder(const KinGraph& graph);
    ~KinshipFinder();
    KinshipFinder(KinshipFinder&&) noexcept;
    KinshipFinder& operator=(KinshipFinder&&) noexcept;

    Kinship between(Place a, Place b, const KinshipLimits& limits = {});
    // Kinship::phi alone.
    std::optional<double> coefficient(Place a, Place b);

private:
    void check(Place person) const;

    std::unique_ptr<KinshipSearch> search_;
};

}  // namespace olvane::kin
