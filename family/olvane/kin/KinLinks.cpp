// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Collects every person's parents, by blood first, and welds two parents of one child into a couple, so that ways
// which differ only in the partner at their top are one way.

#include <olvane/kin/KinLinksInternal.h>

#include <algorithm>
#include <array>
#include <unordered_map>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::kin {

namespace {

struct ParentUnion {
    UnionPlace u;
    ChildKind kind;
};

// Everybody's unions as a child, each with the manner. Read from the unions, so that a union with very many
// children is read once.
class ParentUnions {
public:
    explicit ParentUnions(const KinGraph& graph) : graph_(graph) {
        start_.push_back(0);
        for (Place person = 0; person < graph.personCount(); ++person)
            start_.push_back(start_.back() + graph.unionsAsChild(person).size());
        all_.resize(start_.back());
        std::vector<std::size_t> next(start_.begin(), start_.end() - 1);
        for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
            const auto children = graph.children(u);
            for (std::size_t i = 0; i < children.size(); ++i)
                all_[next[static_cast<std::size_t>(children[i])]++] = {u, graph.childKinds(u)[i]};
        }
    }

    // In the person's own order.
    void listOf(Place person, std::vector<ParentUnion>& list) const {
        const auto place = static_cast<std::size_t>(person);
        list.clear();
        for (const UnionPlace u : graph_.unionsAsChild(person)) {
            for (std::size_t i = start_[place]; i < start_[place + 1]; ++i) {
                if (all_[i].u == u) list.push_back(all_[i]);
            }
        }
    }

private:
    const KinGraph& graph_;
    std::vector<std::size_t> start_;
    std::vector<ParentUnion> all_;
};

bool countsAsBirth(ChildKind kind) {
    return kind == ChildKind::birth || kind == ChildKind::unknown;
}

Bond bondOf(ChildKind kind) {
    switch (kind) {
        case ChildKind::adopted:
            return Bond::adopted;
        case ChildKind::foster:
            return Bond::foster;
        case ChildKind::step:
            return Bond::step;
        default:
            return Bond::other;
    }
}

using Parents = std::array<Place, 2>;

bool isIn(const Parents& parents, Place person) {
    return person != kNobody && (parents[0] == person || parents[1] == person);
}

// Slot by slot, the first known partner of the unions by birth, or else of those of a sealing.
Parents bloodParentsOf(const KinGraph& graph, const std::vector<ParentUnion>& unions) {
    Parents parents{kNobody, kNobody};
    const auto takeFrom = [&graph, &parents](UnionPlace u) {
        for (std::size_t slot = 0; slot < 2; ++slot) {
            if (parents[slot] == kNobody) parents[slot] = graph.partners(u)[slot];
        }
    };
    for (const ParentUnion& each : unions) {
        if (countsAsBirth(each.kind)) takeFrom(each.u);
    }
    if (parents[0] != kNobody || parents[1] != kNobody) return parents;
    for (const ParentUnion& each : unions) {
        if (each.kind == ChildKind::sealing) takeFrom(each.u);
    }
    return parents;
}

// Numbers for couples. A man stands first and a woman second, or else the lower id first, whatever record of the two
// comes first in the data.
class CoupleNumbers {
public:
    CoupleNumbers(const KinGraph& graph, std::vector<Parents>& couples) : graph_(graph), couples_(couples) {}

    Node nodeOf(Place one, Place other) {
        const auto low = static_cast<std::uint64_t>(std::min(one, other));
        const auto high = static_cast<std::uint64_t>(std::max(one, other));
        const Node next = graph_.personCount() + static_cast<Node>(couples_.size());
        const auto [found, isNew] = numbers_.emplace((low << 32U) | high, next);
        if (isNew) couples_.push_back(comesFirst(one, other) ? Parents{one, other} : Parents{other, one});
        return found->second;
    }

private:
    static int rank(Sex sex) { return sex == Sex::male ? 0 : sex == Sex::unknown ? 1 : 2; }

    bool comesFirst(Place one, Place other) const {
        const int ranks = rank(graph_.sex(one)) - rank(graph_.sex(other));
        return ranks != 0 ? ranks < 0 : graph_.id(one) < graph_.id(other);
    }

    const KinGraph& graph_;
    std::vector<Parents>& couples_;
    std::unordered_map<std::uint64_t, Node> numbers_;
};

}  // namespace

KinLinks::KinLinks(const KinGraph& graph) : graph_(graph), personCount_(graph.personCount()) {
    addUpLinks();
    addNeighbors();
}

void KinLinks::addUpLinks() {
    CoupleNumbers numbers(graph_, couples_);
    oneParentTwice_.assign(at(personCount_), false);
    upStart_.push_back(0);
    const ParentUnions parentUnions(graph_);
    std::vector<ParentUnion> unions;
    std::vector<Place> known;
    const auto link = [this, &numbers](Place one, Place other, Bond bond) {
        if (one == kNobody && other == kNobody) return;
        const bool isPair = one != kNobody && other != kNobody && one != other;
        up_.push_back({isPair ? numbers.nodeOf(one, other) : one != kNobody ? one : other, bond});
    };
    for (Place person = 0; person < personCount_; ++person) {
        parentUnions.listOf(person, unions);
        const Parents blood = bloodParentsOf(graph_, unions);
        link(blood[0], blood[1], Bond::blood);
        oneParentTwice_[at(person)] = blood[0] != kNobody && blood[0] == blood[1];
        known.assign(blood.begin(), blood.end());
        for (const ParentUnion& each : unions) {
            Parents others = graph_.partners(each.u);
            for (Place& parent : others) {
                if (std::find(known.begin(), known.end(), parent) != known.end()) parent = kNobody;
            }
            if (isIn(others, others[0]) && others[0] == others[1]) others[1] = kNobody;
            link(others[0], others[1], bondOf(each.kind));
            known.insert(known.end(), others.begin(), others.end());
        }
        upStart_.push_back(static_cast<std::uint32_t>(up_.size()));
    }
    for (const Parents& couple : couples_) {
        for (const Place partner : couple) up_.push_back({partner, Bond::blood});
        upStart_.push_back(static_cast<std::uint32_t>(up_.size()));
    }
}

std::span<const UpLink> KinLinks::upByBlood(Node node) const {
    const auto links = up(node);
    if (isCouple(node)) return links;
    return links.first(!links.empty() && links.front().bond == Bond::blood ? 1 : 0);
}

bool KinLinks::hasTwoParents(Place person) const {
    const auto links = upByBlood(person);
    return !links.empty() && isCouple(links.front().to);
}

void KinLinks::addNeighbors() {
    std::vector<std::vector<Neighbor>> lists(at(personCount_));
    const auto add = [&lists](Place person, Place neighbor, std::uint8_t kind) {
        if (person != neighbor) lists[at(person)].push_back({neighbor, kind});
    };
    const auto addParent = [&add](Place child, Place parent) {
        add(child, parent, kIsParent);
        add(parent, child, kIsChild);
    };
    for (Place person = 0; person < personCount_; ++person) {
        for (const UpLink& each : up(person)) {
            if (!isCouple(each.to)) addParent(person, each.to);
            if (isCouple(each.to)) {
                for (const Place partner : partnersOf(each.to)) addParent(person, partner);
            }
        }
    }
    for (UnionPlace u = 0; u < graph_.unionCount(); ++u) {
        const auto& [one, other] = graph_.partners(u);
        if (one == kNobody || other == kNobody) continue;
        add(one, other, kIsPartner);
        add(other, one, kIsPartner);
    }
    neighborStart_.push_back(0);
    for (std::vector<Neighbor>& list : lists) {
        mergeSort(list.begin(), list.end(), [this](const Neighbor& x, const Neighbor& y) {
            return graph_.id(x.person) < graph_.id(y.person);
        });
        for (const Neighbor& each : list) {
            const bool isKnown =
                neighbors_.size() > neighborStart_.back() && neighbors_.back().person == each.person;
            if (isKnown) neighbors_.back().kinds |= each.kinds;
            if (!isKnown) neighbors_.push_back(each);
        }
        neighborStart_.push_back(static_cast<std::uint32_t>(neighbors_.size()));
    }
}

std::uint8_t KinLinks::kindsBetween(Place person, Place neighbor) const {
    const auto list = neighbors(person);
    const auto found = std::lower_bound(
        list.begin(), list.end(), graph_.id(neighbor),
        [this](const Neighbor& each, std::int64_t id) { return graph_.id(each.person) < id; });
    return found != list.end() && found->person == neighbor ? found->kinds : std::uint8_t{0};
}

}  // namespace olvane::kin
