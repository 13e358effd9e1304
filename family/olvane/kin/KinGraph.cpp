// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Builds the arrays by counting: first how long each list is, then where it starts, then its entries. So each
// list lies in one block, and nothing is sorted but the few lists whose order was given.

#include <olvane/kin/KinGraph.h>

#include <algorithm>
#include <stdexcept>
#include <string>
#include <utility>

#include <olvane/kin/shared/Index.h>

namespace olvane::kin {

namespace {

// Lists by place, from (place, value) pairs in the order in which each list shall have them.
template <class Pairs>
void fillLists(std::size_t places, const Pairs& forEachPair, std::vector<std::uint32_t>& start,
               std::vector<std::int32_t>& values) {
    start.assign(places + 1, 0);
    forEachPair([&start](std::int32_t place, std::int32_t) { ++start[at(place) + 1]; });
    for (std::size_t i = 0; i < places; ++i) start[i + 1] += start[i];
    values.resize(start[places]);
    std::vector<std::uint32_t> next(start.begin(), start.end() - 1);
    forEachPair(
        [&next, &values](std::int32_t place, std::int32_t value) { values[next[at(place)]++] = value; });
}

void putFirst(std::int32_t* first, std::int32_t* last, const std::vector<UnionPlace>& order) {
    for (const UnionPlace u : order) {
        std::int32_t* const found = std::find(first, last, u);
        if (found == last) continue;
        std::rotate(first, found, found + 1);
        ++first;
    }
}

}  // namespace

Place KinGraph::placeOf(std::int64_t id) const {
    if (!placeOfId_.empty()) {
        const auto found = placeOfId_.find(id);
        return found == placeOfId_.end() ? kNobody : found->second;
    }
    return id >= 1 && id <= personCount() ? static_cast<Place>(id - 1) : kNobody;
}

void KinGraphBuilder::reserve(std::size_t persons, std::size_t unions) {
    graph_.ids_.reserve(persons);
    graph_.sexes_.reserve(persons);
    graph_.partners_.reserve(unions);
    graph_.states_.reserve(unions);
    graph_.families_.reserve(unions);
    children_.reserve(persons);
}

// While ids run 1, 2, 3 they need no look-up; the first that does not makes one for all.
Place KinGraphBuilder::addPerson(std::int64_t id, Sex sex) {
    const Place place = graph_.personCount();
    if (plainIds_ && id != std::int64_t{place} + 1) {
        plainIds_ = false;
        for (Place p = 0; p < place; ++p) graph_.placeOfId_.emplace(graph_.ids_[at(p)], p);
    }
    if (!plainIds_ && !graph_.placeOfId_.emplace(id, place).second) {
        throw std::invalid_argument("person " + std::to_string(id) + " was added before");
    }
    graph_.ids_.push_back(id);
    graph_.sexes_.push_back(sex);
    return place;
}

UnionPlace KinGraphBuilder::addUnion(Place partner0, Place partner1, UnionState state, std::uint32_t family) {
    if (partner0 == kNobody && partner1 == kNobody) {
        throw std::invalid_argument("a union needs a partner");
    }
    if (partner0 != kNobody) checkPerson(partner0);
    if (partner1 != kNobody) checkPerson(partner1);
    graph_.partners_.push_back({partner0, partner1});
    graph_.states_.push_back(state);
    graph_.families_.push_back(family);
    return graph_.unionCount() - 1;
}

void KinGraphBuilder::addChild(UnionPlace u, Place child, ChildKind kind) {
    if (u < 0 || u >= graph_.unionCount()) throw std::out_of_range("no such union");
    checkPerson(child);
    children_.push_back({u, child, kind});
}

void KinGraphBuilder::orderUnionsAsPartner(Place person, std::vector<UnionPlace> order) {
    checkPerson(person);
    partnerOrder_[person] = std::move(order);
}

void KinGraphBuilder::orderUnionsAsChild(Place person, std::vector<UnionPlace> order) {
    checkPerson(person);
    childOrder_[person] = std::move(order);
}

void KinGraphBuilder::checkPerson(Place person) const {
    if (person < 0 || person >= graph_.personCount()) throw std::out_of_range("no such person");
}

KinGraph KinGraphBuilder::build() {
    listChildren();
    listUnions();
    orderUnions();
    plainIds_ = true;
    return std::exchange(graph_, KinGraph());
}

// Children by union, each child once.
void KinGraphBuilder::listChildren() {
    const std::vector<Child> children = std::exchange(children_, {});
    const std::size_t unions = graph_.partners_.size();
    std::vector<std::int32_t> entries;
    fillLists(
        unions,
        [&children](auto&& add) {
            for (std::size_t i = 0; i < children.size(); ++i) {
                add(children[i].u, static_cast<std::int32_t>(i));
            }
        },
        graph_.childStart_, entries);
    std::vector<UnionPlace> lastUnionOf(graph_.ids_.size(), -1);
    std::vector<std::uint32_t> start{0};
    start.reserve(unions + 1);
    for (std::size_t u = 0; u < unions; ++u) {
        for (std::uint32_t i = graph_.childStart_[u]; i < graph_.childStart_[u + 1]; ++i) {
            const Child& entry = children[at(entries[i])];
            if (std::exchange(lastUnionOf[at(entry.child)], entry.u) == entry.u) continue;
            graph_.children_.push_back(entry.child);
            graph_.childKinds_.push_back(entry.kind);
        }
        start.push_back(static_cast<std::uint32_t>(graph_.children_.size()));
    }
    graph_.childStart_ = std::move(start);
}

// Unions by partner and by child, in the order in which they were added.
void KinGraphBuilder::listUnions() {
    const KinGraph& graph = graph_;
    fillLists(
        graph.ids_.size(),
        [&graph](auto&& add) {
            for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
                const auto& two = graph.partners(u);
                if (two[0] != kNobody) add(two[0], u);
                if (two[1] != kNobody && two[1] != two[0]) add(two[1], u);
            }
        },
        graph_.partnerStart_, graph_.asPartner_);
    fillLists(
        graph.ids_.size(),
        [&graph](auto&& add) {
            for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
                for (const Place child : graph.children(u)) add(child, u);
            }
        },
        graph_.parentStart_, graph_.asChild_);
}

void KinGraphBuilder::orderUnions() {
    for (const auto& [person, order] : std::exchange(partnerOrder_, {})) {
        putFirst(graph_.asPartner_.data() + graph_.partnerStart_[at(person)],
                 graph_.asPartner_.data() + graph_.partnerStart_[at(person) + 1], order);
    }
    for (const auto& [person, order] : std::exchange(childOrder_, {})) {
        putFirst(graph_.asChild_.data() + graph_.parentStart_[at(person)],
                 graph_.asChild_.data() + graph_.parentStart_[at(person) + 1], order);
    }
}

}  // namespace olvane::kin
