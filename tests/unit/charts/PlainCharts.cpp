// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "PlainCharts.h"

#include <algorithm>

namespace plain {

using namespace olvane::kin;
using olvane::charts::ChartRequest;
using olvane::charts::View;
using olvane::picture::Branch;

namespace {

constexpr int kFar = 1000000;

std::set<Place> parentsOf(const KinGraph& graph, Place person) {
    std::set<Place> parents;
    for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
        const auto children = graph.children(u);
        if (std::find(children.begin(), children.end(), person) == children.end()) continue;
        for (const Place parent : graph.partners(u)) {
            if (parent != kNobody) parents.insert(parent);
        }
    }
    return parents;
}

std::set<Place> childrenOf(const KinGraph& graph, Place person) {
    std::set<Place> children;
    for (Place child = 0; child < graph.personCount(); ++child) {
        if (parentsOf(graph, child).contains(person)) children.insert(child);
    }
    return children;
}

std::set<Place> spousesOf(const KinGraph& graph, Place person) {
    std::set<Place> spouses;
    for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
        const auto& two = graph.partners(u);
        if (two[0] == person && two[1] != kNobody) spouses.insert(two[1]);
        if (two[1] == person && two[0] != kNobody) spouses.insert(two[0]);
    }
    return spouses;
}

// The least number of steps to everybody within reach, by a rule that says who is one step away.
template <class Step>
std::map<Place, int> stepsFrom(std::map<Place, int> steps, int most, const Step& step) {
    for (bool grown = true; grown;) {
        grown = false;
        const std::map<Place, int> before = steps;
        for (const auto& [person, distance] : before) {
            if (distance >= most) continue;
            for (const Place next : step(person)) {
                const auto [found, isNew] = steps.emplace(next, distance + 1);
                if (!isNew && found->second <= distance + 1) continue;
                found->second = distance + 1;
                grown = true;
            }
        }
    }
    return steps;
}

int limitOf(int generations) {
    return generations == 0 ? kFar : generations;
}

}  // namespace

std::set<Place> personsOf(const KinGraph& graph, const ChartRequest& request) {
    std::map<Place, int> ancestors{{request.focus, 0}};
    const auto isFolded = [&](Place person, Branch branch) {
        return std::any_of(request.folded.begin(), request.folded.end(),
                           [&](const olvane::charts::Fold& fold) {
                               return graph.placeOf(fold.person) == person && fold.branch == branch;
                           });
    };
    const auto up = [&](Place person) {
        return isFolded(person, Branch::up) ? std::set<Place>() : parentsOf(graph, person);
    };
    // Not to the children of a couple of whom one has them folded, nor to those whose brother or sister in the line
    // has siblings folded.
    const auto isClosed = [&](UnionPlace u) {
        const auto children = graph.children(u);
        return std::any_of(graph.partners(u).begin(), graph.partners(u).end(),
                           [&](Place partner) { return isFolded(partner, Branch::down); }) ||
               std::any_of(children.begin(), children.end(), [&](Place child) {
                   return ancestors.contains(child) && isFolded(child, Branch::beside);
               });
    };
    const auto down = [&](Place person) {
        std::set<Place> children;
        for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
            const auto& two = graph.partners(u);
            if ((two[0] != person && two[1] != person) || isClosed(u)) continue;
            children.insert(graph.children(u).begin(), graph.children(u).end());
        }
        return children;
    };
    if (request.view != View::descendants) ancestors = stepsFrom(ancestors, limitOf(request.up), up);
    std::map<Place, int> descendants{{request.focus, 0}};
    if (request.view == View::relatives) {
        // From an ancestor of n generations one has n generations more to go down.
        for (const auto& [person, distance] : ancestors) descendants[person] = -distance;
    }
    if (request.view != View::ancestors) {
        descendants = stepsFrom(descendants, limitOf(request.down), down);
    }
    std::set<Place> persons;
    for (const auto& [person, distance] : ancestors) persons.insert(person);
    for (const auto& [person, distance] : descendants) persons.insert(person);
    if (request.spouses && request.view != View::ancestors) {
        for (const Place person : std::set<Place>(persons)) {
            if (!isFolded(person, Branch::beside)) persons.merge(spousesOf(graph, person));
        }
    }
    if (request.siblings && request.view != View::relatives) {
        const std::set<Place> before = persons;
        for (const auto& [person, distance] : ancestors) {
            for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
                const auto children = graph.children(u);
                const bool isChild = std::find(children.begin(), children.end(), person) != children.end();
                const auto& two = graph.partners(u);
                if (isChild && (before.contains(two[0]) || before.contains(two[1]))) {
                    persons.insert(children.begin(), children.end());
                }
            }
        }
    }
    return persons;
}

std::set<Place> fanPersonsOf(const KinGraph& graph, const ChartRequest& request) {
    if (request.fanOf == olvane::charts::FanOf::descendants) {
        ChartRequest descendants = request;
        descendants.view = View::descendants;
        descendants.siblings = false;  // which a fan has no place for
        return personsOf(graph, descendants);
    }
    const auto firstParents = [&graph](Place person) {
        std::set<Place> parents;
        if (graph.unionsAsChild(person).empty()) return parents;
        for (const Place parent : graph.partners(graph.unionsAsChild(person)[0])) {
            if (parent != kNobody) parents.insert(parent);
        }
        return parents;
    };
    constexpr int kMostRings = 25;
    const int most = std::min(limitOf(request.up), kMostRings);
    std::set<Place> persons;
    for (const auto& [person, distance] : stepsFrom({{request.focus, 0}}, most, firstParents)) {
        persons.insert(person);
    }
    return persons;
}

std::set<Place> connectedWith(const KinGraph& graph, Place focus) {
    std::set<Place> persons{focus};
    for (bool grown = true; grown;) {
        const std::size_t before = persons.size();
        for (const Place person : std::set<Place>(persons)) {
            persons.merge(parentsOf(graph, person));
            persons.merge(childrenOf(graph, person));
            persons.merge(spousesOf(graph, person));
        }
        grown = persons.size() > before;
    }
    return persons;
}

std::map<Place, int> generationsOf(const KinGraph& graph, const ChartRequest& request) {
    const std::set<Place> persons = personsOf(graph, request);
    const bool downwards = request.view == View::descendants;
    // Everybody of one couple after another.
    std::map<Place, std::set<Place>> group;
    for (const Place person : persons) {
        std::set<Place> joined{person};
        for (bool grown = true; grown;) {
            grown = false;
            for (const Place one : std::set<Place>(joined)) {
                for (const Place spouse : spousesOf(graph, one)) {
                    if (persons.contains(spouse)) grown = joined.insert(spouse).second || grown;
                }
            }
        }
        group[person] = joined;
    }
    std::map<Place, int> generations;
    for (const Place person : group.at(request.focus)) generations[person] = 0;
    for (int generation = 0; generation < graph.personCount(); ++generation) {
        const std::map<Place, int> before = generations;
        for (const auto& [person, own] : before) {
            if (own != (downwards ? generation : -generation)) continue;
            for (const Place next : downwards ? childrenOf(graph, person) : parentsOf(graph, person)) {
                if (!persons.contains(next) || before.contains(next)) continue;
                for (const Place joined : group.at(next)) {
                    generations.emplace(joined, downwards ? generation + 1 : -generation - 1);
                }
            }
        }
    }
    return generations;
}

}  // namespace plain
