// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/NearRelatives.h>

#include <algorithm>
#include <array>
#include <cstddef>

namespace olvane::kin {

namespace {

constexpr int kParentWeight = 3;
constexpr int kGrandparentWeight = 2;
constexpr int kMostCounted = 6;  // siblings, and children
constexpr int kGrandchildrenWeight = 2;
constexpr int kMostSpouses = 2;
constexpr int kUnnamedWeight = -10;

std::array<Place, 2> firstParents(const KinGraph& graph, Place person) {
    const auto unions = graph.unionsAsChild(person);
    return unions.empty() ? std::array<Place, 2>{kNobody, kNobody} : graph.partners(unions[0]);
}

int parentCount(const KinGraph& graph, Place person) {
    const auto parents = firstParents(graph, person);
    return static_cast<int>(
        std::count_if(parents.begin(), parents.end(), [](Place p) { return p != kNobody; }));
}

int childCount(const KinGraph& graph, Place person) {
    std::size_t count = 0;
    for (const UnionPlace u : graph.unionsAsPartner(person)) count += graph.children(u).size();
    return static_cast<int>(std::min<std::size_t>(count, kMostCounted));
}

bool hasGrandchildren(const KinGraph& graph, Place person) {
    for (const UnionPlace u : graph.unionsAsPartner(person)) {
        for (const Place child : graph.children(u)) {
            if (childCount(graph, child) > 0) return true;
        }
    }
    return false;
}

int nearness(const KinGraph& graph, Place person) {
    int near = 0;
    int siblings = 0;
    for (const Place parent : firstParents(graph, person)) {
        if (parent == kNobody) continue;
        if (near == 0) siblings = childCount(graph, parent);
        near += kParentWeight + kGrandparentWeight * parentCount(graph, parent);
    }
    int spouses = 0;
    for (const UnionPlace u : graph.unionsAsPartner(person)) {
        if (graph.otherPartner(u, person) != kNobody && spouses < kMostSpouses) ++spouses;
    }
    const int grandchildren = hasGrandchildren(graph, person) ? kGrandchildrenWeight : 0;
    return near + siblings + childCount(graph, person) + grandchildren + spouses;
}

}  // namespace

std::vector<Place> siblingsOf(const KinGraph& graph, Place person) {
    std::vector<Place> siblings;
    const auto add = [&](Place child) {
        const bool isNew = std::find(siblings.begin(), siblings.end(), child) == siblings.end();
        if (child != person && isNew) siblings.push_back(child);
    };
    for (const Place parent : firstParents(graph, person)) {
        if (parent == kNobody) continue;
        for (const UnionPlace u : graph.unionsAsPartner(parent)) {
            for (const Place child : graph.children(u)) add(child);
        }
    }
    return siblings;
}

Place bestFocus(const KinGraph& graph, const std::function<bool(Place)>& isNamed) {
    Place best = kNobody;
    int most = 0;
    for (Place person = 0; person < graph.personCount(); ++person) {
        const int near = nearness(graph, person) + (isNamed(person) ? 0 : kUnnamedWeight);
        if (best == kNobody || near > most) {
            best = person;
            most = near;
        }
    }
    return best;
}

}  // namespace olvane::kin
