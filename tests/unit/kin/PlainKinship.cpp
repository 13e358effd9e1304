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
    for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
        const auto [one, other] = graph.partners(u);
        if (one == kNobody || other == kNobody || one == other) continue;
        partners_[static_cast<std::size_t>(one)].insert(other);
        partners_[static_cast<std::size_t>(other)].insert(one);
    }
}

void Kinship::addChains(Chain& chain, bool byBlood, std::vector<Chain>& chains) const {
    chains.push_back(chain);
    for (const Parent& parent : parentsOf(chain.back().person)) {
        if (byBlood && parent.bond != Bond::blood) continue;
        const bool isOn = std::any_of(chain.begin(), chain.end(),
                                      [&parent](const Parent& each) { return each.person == parent.person; });
        if (isOn) continue;
        chain.push_back(parent);
        addChains(chain, byBlood, chains);
        chain.pop_back();
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

std::vector<KinWay> Kinship::ways(Place a, Place b, bool byBlood) const {
    std::vector<Chain> fromA;
    std::vector<Chain> fromB;
    Chain chain{{a, Bond::blood, -1}};
    addChains(chain, byBlood, fromA);
    chain = {{b, Bond::blood, -1}};
    addChains(chain, byBlood, fromB);
    std::map<Place, std::vector<const Chain*>> byTop;
    for (const Chain& each : fromB) byTop[each.back().person].push_back(&each);
    std::vector<KinWay> ways;
    std::vector<bool> isOnUp(parents_.size(), false);
    const auto mark = [&isOnUp](const Chain& up, bool value) {
        for (const Parent& each : up) isOnUp[static_cast<std::size_t>(each.person)] = value;
    };
    for (const Chain& up : fromA) {
        if (a == b) break;
        mark(up, true);
        for (const Chain* down : byTop[up.back().person]) {
            const bool meetsBelow = std::any_of(
                down->rbegin() + 1, down->rend(),
                [&isOnUp](const Parent& each) { return isOnUp[static_cast<std::size_t>(each.person)]; });
            if (meetsBelow) continue;
            std::set<Place> seen;
            for (const Parent& each : up) seen.insert(each.person);
            for (const Parent& each : *down) seen.insert(each.person);
            KinWay way;
            way.up = static_cast<int>(up.size()) - 1;
            way.down = static_cast<int>(down->size()) - 1;
            for (const Parent& each : up) way.bond = std::max(way.bond, each.bond);
            for (const Parent& each : *down) way.bond = std::max(way.bond, each.bond);
            if (!byBlood && way.bond == Bond::blood) continue;
            for (const Parent& each : up) way.persons.push_back(each.person);
            for (auto each = down->rbegin() + 1; each != down->rend(); ++each)
                way.persons.push_back(each->person);
            way.ancestors = {up.back().person};
            bool isSecond = false;
            if (way.up > 0 && way.down > 0 && up.back().family >= 0 &&
                up.back().family == down->back().family) {
                Place partner = kNobody;
                for (const Parent& each : parentsOf(up[up.size() - 2].person)) {
                    if (each.family == up.back().family && each.person != up.back().person)
                        partner = each.person;
                }
                isSecond = isListedFirst(partner, up.back().person) && seen.count(partner) == 0;
                if (seen.count(partner) == 0) way.ancestors.push_back(partner);
            }
            if (!isSecond) ways.push_back(way);
        }
        mark(up, false);
    }
    std::sort(ways.begin(), ways.end(), [this](const KinWay& one, const KinWay& other) {
        if (one.length() != other.length()) return one.length() < other.length();
        std::vector<std::int64_t> ids[2];
        for (const Place person : one.persons) ids[0].push_back(graph_.id(person));
        for (const Place person : other.persons) ids[1].push_back(graph_.id(person));
        return ids[0] != ids[1] ? ids[0] < ids[1] : one.up < other.up;
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
