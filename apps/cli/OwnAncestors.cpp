// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finds the circles in the parent links: Tarjan's strongly connected components ("Depth-first search and
// linear graph algorithms", 1972), with a stack of its own in place of recursion, since a line of ancestors
// can be any length.

#include <cli/OwnAncestors.h>

#include <algorithm>
#include <array>

namespace olvane::cli {

namespace {

using gedcom::PersonId;

class CircleFinder {
public:
    explicit CircleFinder(const gedcom::GedcomData& data)
        : data_(data), order_(data.personCount() + 1, 0), low_(order_), onPath_(order_.size(), false) {}

    std::vector<PersonId> find() {
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            if (order_[id] == 0) walkFrom(id);
        }
        std::sort(found_.begin(), found_.end());
        return std::move(found_);
    }

private:
    struct Visit {
        PersonId id;
        std::size_t nextParent;
    };

    std::array<PersonId, 2> parentsOf(PersonId id) const {
        return {data_.person(id).father, data_.person(id).mother};
    }

    void enter(PersonId id) {
        order_[id] = low_[id] = ++count_;
        path_.push_back(id);
        onPath_[id] = true;
        visits_.push_back({id, 0});
    }

    void walkFrom(PersonId start) {
        enter(start);
        while (!visits_.empty()) {
            Visit& visit = visits_.back();
            if (visit.nextParent < 2) {
                lookAtParent(visit.id, parentsOf(visit.id)[visit.nextParent++]);
            } else {
                leave(visit.id);
            }
        }
    }

    void lookAtParent(PersonId id, PersonId parent) {
        if (parent == 0) return;
        if (order_[parent] == 0) {
            enter(parent);
        } else if (onPath_[parent]) {
            low_[id] = std::min(low_[id], order_[parent]);
        }
    }

    void leave(PersonId id) {
        visits_.pop_back();
        if (!visits_.empty()) low_[visits_.back().id] = std::min(low_[visits_.back().id], low_[id]);
        if (low_[id] == order_[id]) takeComponent(id);
    }

    // A component of one is a circle only for a person who is their own parent.
    void takeComponent(PersonId root) {
        const auto parents = parentsOf(root);
        const bool isCircle = path_.back() != root || parents[0] == root || parents[1] == root;
        for (bool done = false; !done;) {
            const PersonId id = path_.back();
            path_.pop_back();
            onPath_[id] = false;
            if (isCircle) found_.push_back(id);
            done = id == root;
        }
    }

    const gedcom::GedcomData& data_;
    std::vector<PersonId> order_;  // of the first visit, from 1; 0 for nobody met yet
    std::vector<PersonId> low_;    // the earliest on the path that is reached
    std::vector<bool> onPath_;
    std::vector<PersonId> path_;
    std::vector<Visit> visits_;
    std::vector<PersonId> found_;
    PersonId count_ = 0;
};

}  // namespace

std::vector<PersonId> ownAncestors(const gedcom::GedcomData& data) {
    return CircleFinder(data).find();
}

}  // namespace olvane::cli
