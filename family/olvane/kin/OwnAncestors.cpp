// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finds the circles in the parent links: Tarjan's strongly connected components ("Depth-first search and
// linear graph algorithms", 1972), with a stack of its own in place of recursion, since a line of ancestors
// can be any length.

#include <olvane/kin/DataCheck.h>

#include <algorithm>
#include <array>
#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::kin {

namespace {

class CircleFinder {
public:
    explicit CircleFinder(const KinGraph& graph)
        : graph_(graph), order_(at(graph.personCount()), 0), low_(order_), onPath_(order_.size(), false) {}

    std::vector<Place> find() {
        for (Place person = 0; person < graph_.personCount(); ++person) {
            if (order_[at(person)] == 0) walkFrom(person);
        }
        mergeSort(found_.begin(), found_.end());
        return std::move(found_);
    }

private:
    struct Visit {
        Place person;
        std::size_t nextParent;
    };

    std::array<Place, 2> parentsOf(Place person) const {
        const auto unions = graph_.unionsAsChild(person);
        return unions.empty() ? std::array<Place, 2>{kNobody, kNobody} : graph_.partners(unions.front());
    }

    void enter(Place person) {
        order_[at(person)] = low_[at(person)] = ++count_;
        path_.push_back(person);
        onPath_[at(person)] = true;
        visits_.push_back({person, 0});
    }

    void walkFrom(Place start) {
        enter(start);
        while (!visits_.empty()) {
            Visit& visit = visits_.back();
            if (visit.nextParent < 2) {
                lookAtParent(visit.person, parentsOf(visit.person)[visit.nextParent++]);
            } else {
                leave(visit.person);
            }
        }
    }

    void lookAtParent(Place person, Place parent) {
        if (parent == kNobody) return;
        if (order_[at(parent)] == 0) {
            enter(parent);
        } else if (onPath_[at(parent)]) {
            low_[at(person)] = std::min(low_[at(person)], order_[at(parent)]);
        }
    }

    void leave(Place person) {
        visits_.pop_back();
        if (!visits_.empty())
            low_[at(visits_.back().person)] = std::min(low_[at(visits_.back().person)], low_[at(person)]);
        if (low_[at(person)] == order_[at(person)]) takeComponent(person);
    }

    // A component of one is a circle only for a person who is their own parent.
    void takeComponent(Place root) {
        const auto parents = parentsOf(root);
        const bool isCircle = path_.back() != root || parents[0] == root || parents[1] == root;
        for (bool done = false; !done;) {
            const Place person = path_.back();
            path_.pop_back();
            onPath_[at(person)] = false;
            if (isCircle) found_.push_back(person);
            done = person == root;
        }
    }

    const KinGraph& graph_;
    std::vector<std::int32_t> order_;  // of the first visit, from 1; 0 for nobody met yet
    std::vector<std::int32_t> low_;    // the earliest on the path that is reached
    std::vector<bool> onPath_;
    std::vector<Place> path_;
    std::vector<Visit> visits_;
    std::vector<Place> found_;
    std::int32_t count_ = 0;
};

}  // namespace

std::vector<Place> ownAncestors(const KinGraph& graph) {
    return CircleFinder(graph).find();
}

}  // namespace olvane::kin
