// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "PlainKinship.h"

#include <algorithm>
#include <map>

namespace plain {

using olvane::kin::ChildKind;
using olvane::kin::kNobody;
using olvane::kin::UnionPlace;

namespace {

ChildKind kindIn(const KinGraph& graph, UnionPlace u, Place child) {
    for (std::size_t i = 0; i < graph.children(u).size(); ++i) {
        if (graph.children(u)[i] == child) return graph.childKinds(u)[i];
    }
    return ChildKind::unknown;
}

Bond bondOf(ChildKind kind) {
    if (kind == ChildKind::adopted) return Bond::adopted;
    if (kind == ChildKind::foster) return Bond::foster;
    if (kind == ChildKind::step) return Bond::step;
    return Bond::other;
}

}  // namespace

Kinship::Kinship(const KinGraph& graph)
    : graph_(graph),
      parents_(static_cast<std::size_t>(graph.personCount())),
      partners_(static_cast<std::size_t>(graph.personCount())) {
    std::map<std::set<Place>, int> families;
    const auto familyOf = [&families](Place one, Place other) {
        return families.emplace(std::set<Place>{one, other}, static_cast<int>(families.size())).first->second;
    };
    for (Place person = 0; person < graph.personCount(); ++person) {
        auto& parents = parents_[static_cast<std::size_t>(person)];
        Place slots[2] = {kNobody, kNobody};
        for (const bool sealed : {false, true}) {
            if (slots[0] != kNobody || slots[1] != kNobody) break;
            for (const UnionPlace u : graph.unionsAsChild(person)) {
                const ChildKind kind = kindIn(graph, u, person);
                const bool counts = sealed ? kind == ChildKind::sealing
                                           : kind == ChildKind::birth || kind == ChildKind::unknown;
                for (const int slot : {0, 1}) {
                    const Place parent = graph.partners(u)[static_cast<std::size_t>(slot)];
                    if (counts && slots[slot] == kNobody) slots[slot] = parent;
                }
            }
        }
        const auto add = [&parents, &familyOf](Place one, Place other, Bond bond) {
            if (one == other) other = kNobody;
            const int family = one != kNobody && other != kNobody ? familyOf(one, other) : -1;
            if (one != kNobody) parents.push_back({one, bond, family});
            if (other != kNobody) parents.push_back({other, bond, family});
        };
        add(slots[0], slots[1], Bond::blood);
        oneParentTwice_.push_back(slots[0] != kNobody && slots[0] == slots[1]);
        for (const UnionPlace u : graph.unionsAsChild(person)) {
            const auto fresh = [&parents](Place parent) {
                const bool isKnown =
                    std::any_of(parents.begin(), parents.end(),
                                [parent](const Parent& each) { return each.person == parent; });
                return isKnown ? kNobody : parent;
            };
            add(fresh(graph.partners(u)[0]), fresh(graph.partners(u)[1]), bondOf(kindIn(graph, u, person)));
        }
    }
    children_.resize(parents_.size());
    for (Place person = 0; person < graph.personCount(); ++person) {
        for (const Parent& parent : parentsOf(person)) {
            children_[static_cast<std::size_t>(parent.person)].push_back(
                {person, parent.bond, parent.family});
        }
    }
    for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
        const auto [one, other] = graph.partners(u);
        if (one == kNobody || other == kNobody || one == other) continue;
        partners_[static_cast<std::size_t>(one)].insert(other);
        partners_[static_cast<std::size_t>(other)].insert(one);
    }
}

// Of a couple, over whom the way leads.
bool Kinship::isListedFirst(Place one, Place other) const {
    const auto rank = [this](Place person) {
        const auto sex = graph_.sex(person);
        return std::make_pair(sex == olvane::kin::Sex::male      ? 0
                              : sex == olvane::kin::Sex::unknown ? 1
                                                                 : 2,
                              graph_.id(person));
    };
    return rank(one) < rank(other);
}

// One way, if it is no second reading of another: of a couple at the top, the partner who is listed first has it.
void Kinship::addWay(const Chain& up, const Chain& down, bool byBlood, std::vector<KinWay>& ways) const {
    KinWay way;
    way.up = static_cast<int>(up.size()) - 1;
    way.down = static_cast<int>(down.size()) - 1;
    for (const Chain* chain : {&up, &down}) {
        for (const Parent& each : *chain) way.bond = std::max(way.bond, each.bond);
    }
    if (!byBlood && way.bond == Bond::blood) return;
    for (const Parent& each : up) way.persons.push_back(each.person);
    for (auto each = down.begin() + 1; each < down.end(); ++each) way.persons.push_back(each->person);
    way.ancestors = {up.back().person};
    const int family = up.back().family;
    if (way.up > 0 && way.down > 0 && family >= 0 && family == down.front().family) {
        Place partner = kNobody;
        for (const Parent& each : parentsOf(up[up.size() - 2].person)) {
            if (each.family == family && each.person != up.back().person) partner = each.person;
        }
        if (std::count(way.persons.begin(), way.persons.end(), partner) == 0) {
            if (isListedFirst(partner, up.back().person)) return;
            way.ancestors.push_back(partner);
        }
    }
    ways.push_back(std::move(way));
}

// Every chain from its last person down to b in which nobody occurs who is met already.
void Kinship::addWaysDown(Chain& down, const Chain& up, Place b, bool byBlood, Persons& met,
                          const Persons& leadsToB, std::vector<KinWay>& ways) const {
    const Place last = down.back().person;
    if (last == b) return addWay(up, down, byBlood, ways);
    for (const Child& child : children_[static_cast<std::size_t>(last)]) {
        const auto place = static_cast<std::size_t>(child.person);
        if (met[place] || !leadsToB[place] || (byBlood && child.bond != Bond::blood)) continue;
        met[place] = true;
        // How the parent was reached is written at the parent, as in a chain that runs up.
        const Parent before = down.back();
        down.back() = {last, child.bond, child.family};
        down.push_back({child.person, Bond::blood, -1});
        addWaysDown(down, up, b, byBlood, met, leadsToB, ways);
        down.pop_back();
        down.back() = before;
        met[place] = false;
    }
}

Kinship::Persons Kinship::withAncestors(Place person, bool byBlood) const {
    Persons found(parents_.size(), false);
    std::vector<Place> open{person};
    while (!open.empty()) {
        const Place next = open.back();
        open.pop_back();
        if (found[static_cast<std::size_t>(next)]) continue;
        found[static_cast<std::size_t>(next)] = true;
        for (const Parent& parent : parentsOf(next)) {
            if (!byBlood || parent.bond == Bond::blood) open.push_back(parent.person);
        }
    }
    return found;
}

// From the last person of a chain that runs up, all ways down, and then those over each parent who is not met yet.
void Kinship::addWaysUp(Chain& up, Place b, bool byBlood, Persons& met, const Persons& leadsToB,
                        std::vector<KinWay>& ways) const {
    const Place last = up.back().person;
    met[static_cast<std::size_t>(last)] = true;
    if (leadsToB[static_cast<std::size_t>(last)]) {
        Chain down{{last, Bond::blood, -1}};
        addWaysDown(down, up, b, byBlood, met, leadsToB, ways);
    }
    for (const Parent& parent : parentsOf(last)) {
        if (met[static_cast<std::size_t>(parent.person)] || (byBlood && parent.bond != Bond::blood)) continue;
        up.push_back(parent);
        addWaysUp(up, b, byBlood, met, leadsToB, ways);
        up.pop_back();
    }
    met[static_cast<std::size_t>(last)] = false;
}

std::vector<KinWay> Kinship::ways(Place a, Place b, bool byBlood) const {
    std::vector<KinWay> ways;
    if (a == b) return ways;
    Persons met(parents_.size(), false);
    Chain up{{a, Bond::blood, -1}};
    addWaysUp(up, b, byBlood, met, withAncestors(b, byBlood), ways);
    std::sort(ways.begin(), ways.end(), [this](const KinWay& one, const KinWay& other) {
        if (one.length() != other.length()) return one.length() < other.length();
        for (std::size_t i = 0; i < one.persons.size(); ++i) {
            if (one.persons[i] != other.persons[i])
                return graph_.id(one.persons[i]) < graph_.id(other.persons[i]);
        }
        return one.up < other.up;
    });
    return ways;
}

std::optional<std::vector<std::vector<double>>> Kinship::coefficients() const {
    const std::size_t count = parents_.size();
    std::vector<Place> order;
    std::vector<bool> done(count, false);
    for (bool moved = true; moved;) {
        moved = false;
        for (std::size_t i = 0; i < count; ++i) {
            const bool isReady =
                std::all_of(parents_[i].begin(), parents_[i].end(), [&done](const Parent& parent) {
                    return parent.bond != Bond::blood || done[static_cast<std::size_t>(parent.person)];
                });
            if (done[i] || !isReady) continue;
            done[i] = moved = true;
            order.push_back(static_cast<Place>(i));
        }
    }
    if (order.size() < count) return std::nullopt;
    std::vector<std::vector<double>> phi(count, std::vector<double>(count, 0));
    for (std::size_t n = 0; n < count; ++n) {
        const auto person = static_cast<std::size_t>(order[n]);
        std::vector<std::size_t> parents;
        for (const Parent& parent : parents_[person]) {
            if (parent.bond == Bond::blood) parents.push_back(static_cast<std::size_t>(parent.person));
        }
        if (oneParentTwice_[person]) parents.push_back(parents[0]);
        for (std::size_t k = 0; k < n; ++k) {
            const auto other = static_cast<std::size_t>(order[k]);
            double sum = 0;
            for (const std::size_t parent : parents) sum += phi[parent][other] / 2;
            phi[person][other] = phi[other][person] = sum;
        }
        phi[person][person] = parents.size() == 2 ? 0.5 + phi[parents[0]][parents[1]] / 2 : 0.5;
    }
    return phi;
}

bool Kinship::linked(Place one, Place other) const {
    const auto isParent = [this](Place child, Place parent) {
        const auto& list = parentsOf(child);
        return std::any_of(list.begin(), list.end(),
                           [parent](const Parent& each) { return each.person == parent; });
    };
    return isParent(one, other) || isParent(other, one) ||
           partners_[static_cast<std::size_t>(one)].count(other) > 0;
}

// Tries every reading of every link.
bool Kinship::isMore(const std::vector<Place>& path) const {
    std::set<int> phases{0};
    for (std::size_t i = 0; i + 1 < path.size(); ++i) {
        const auto& up = parentsOf(path[i]);
        const auto& down = parentsOf(path[i + 1]);
        const auto names = [](const std::vector<Parent>& list, Place person) {
            return std::any_of(list.begin(), list.end(),
                               [person](const Parent& each) { return each.person == person; });
        };
        std::set<int> next;
        for (const int phase : phases) {
            if (names(up, path[i + 1])) next.insert(phase == 0 ? 0 : 2);
            if (names(down, path[i])) next.insert(phase == 2 ? 2 : 1);
            if (partners_[static_cast<std::size_t>(path[i])].count(path[i + 1]) > 0) next.insert(2);
        }
        phases = next;
    }
    return phases.count(2) > 0;
}

int Kinship::distance(Place a, Place b) const {
    std::map<Place, int> distances{{a, 0}};
    std::vector<Place> found{a};
    for (std::size_t next = 0; next < found.size(); ++next) {
        for (Place other = 0; other < graph_.personCount(); ++other) {
            if (!linked(found[next], other)) continue;
            if (distances.emplace(other, distances[found[next]] + 1).second) found.push_back(other);
        }
    }
    return distances.count(b) > 0 ? distances[b] : -1;
}

std::set<std::vector<Place>> Kinship::marriageWays(Place a, Place b, bool onlyLean) const {
    std::vector<std::vector<Place>> paths{{a}};
    std::set<std::vector<Place>> found;
    while (!paths.empty() && found.empty()) {
        std::vector<std::vector<Place>> longer;
        for (const auto& path : paths) {
            for (Place next = 0; next < graph_.personCount(); ++next) {
                if (!linked(path.back(), next) || std::count(path.begin(), path.end(), next) > 0) continue;
                if (onlyLean && path.size() > 1 && linked(path[path.size() - 2], next)) continue;
                longer.push_back(path);
                longer.back().push_back(next);
                if (next != b) continue;
                if (isMore(longer.back())) found.insert(longer.back());
                longer.pop_back();
            }
        }
        paths = std::move(longer);
    }
    return found;
}

}  // namespace plain
