// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A table as unions: its families, then what lists of spouses, parents and lists of children say beyond them.

#include <olvane/kin/Family.h>

#include <algorithm>
#include <array>
#include <cstdint>
#include <unordered_map>
#include <utility>
#include <vector>

namespace olvane {

namespace {

using kin::ChildKind;
using kin::kNobody;
using kin::Place;
using kin::UnionPlace;
using kin::UnionState;

class KinOfFamily {
public:
    explicit KinOfFamily(const Family& family) : family_(family), ids_(family.personIds()) {}

    kin::KinGraph build();

private:
    void addPersons();
    void addFamilies();
    void addCouples();
    void addParents();
    void addListedChildren();
    void order();

    // Two persons in either order; nobody is 0 there.
    static std::uint64_t pairKey(Place a, Place b) {
        const auto low = static_cast<std::uint32_t>(std::min(a, b) + 1);
        const auto high = static_cast<std::uint32_t>(std::max(a, b) + 1);
        return std::uint64_t{high} << 32U | low;
    }
    static std::uint64_t childKey(UnionPlace u, Place child) {
        return std::uint64_t{static_cast<std::uint32_t>(u)} << 32U | static_cast<std::uint32_t>(child);
    }
    Place placeOf(FamilyId id) const { return id == 0 ? kNobody : places_.at(id); }
    UnionPlace unionOf(Place a, Place b);
    void addChild(UnionPlace u, Place child, ChildKind kind);
    bool isChildOf(Place child, Place parent) const;

    const Family& family_;
    std::vector<FamilyId> ids_;
    kin::KinGraphBuilder builder_;
    std::unordered_map<FamilyId, Place> places_;
    std::unordered_map<std::uint64_t, UnionPlace> unionOfPair_;  // the first one of each pair
    std::unordered_map<std::uint64_t, bool> isInUnion_;          // by childKey
    std::vector<std::array<Place, 2>> partners_;                 // of each union
    std::vector<std::vector<UnionPlace>> asChild_;               // of each person
};

void KinOfFamily::addPersons() {
    builder_.reserve(ids_.size(), family_.familyCount());
    places_.reserve(ids_.size());
    for (const FamilyId id : ids_) places_.emplace(id, builder_.addPerson(id, family_.sex(id)));
    asChild_.resize(ids_.size());
}

void KinOfFamily::addChild(UnionPlace u, Place child, ChildKind kind) {
    if (!isInUnion_.emplace(childKey(u, child), true).second) return;
    builder_.addChild(u, child, kind);
    asChild_[static_cast<std::size_t>(child)].push_back(u);
}

void KinOfFamily::addFamilies() {
    for (const FamilyId number : family_.familyNumbers()) {
        const FamilyRow row = family_.family(number);
        const Place a = placeOf(static_cast<FamilyId>(row.partner0));
        const Place b = placeOf(static_cast<FamilyId>(row.partner1));
        if (a == kNobody && b == kNobody) continue;
        const UnionPlace u = builder_.addUnion(a, b, row.state, number);
        partners_.push_back({a, b});
        unionOfPair_.try_emplace(pairKey(a, b), u);
        for (const FamilyChild& child : family_.familyChildren(number)) {
            addChild(u, placeOf(static_cast<FamilyId>(child.child)), child.kind);
        }
    }
}

// The union of two, one of whom may be nobody; a new one, with the first as partner 0, where they have none.
UnionPlace KinOfFamily::unionOf(Place a, Place b) {
    const auto [entry, isNew] = unionOfPair_.try_emplace(pairKey(a, b), 0);
    if (isNew) {
        entry->second = builder_.addUnion(a, b, UnionState::unknown);
        partners_.push_back({a, b});
    }
    return entry->second;
}

void KinOfFamily::addCouples() {
    for (const FamilyId id : ids_) {
        for (const FamilyId spouse : family_.spouses(id)) {
            const bool isSecond =
                family_.sex(id) == kin::Sex::female && family_.sex(spouse) != kin::Sex::female;
            unionOf(placeOf(isSecond ? spouse : id), placeOf(isSecond ? id : spouse));
        }
    }
}

// A child who is in a family of both parents already stays in that one alone.
void KinOfFamily::addParents() {
    for (const FamilyId id : ids_) {
        const Place father = placeOf(family_.father(id));
        const Place mother = placeOf(family_.mother(id));
        if (father == kNobody && mother == kNobody) continue;
        const Place child = placeOf(id);
        const std::uint64_t pair = pairKey(father, mother);
        bool isThere = false;
        for (const UnionPlace u : asChild_[static_cast<std::size_t>(child)]) {
            const auto& two = partners_[static_cast<std::size_t>(u)];
            isThere = isThere || pairKey(two[0], two[1]) == pair;
        }
        if (!isThere) addChild(unionOf(father, mother), child, ChildKind::birth);
    }
}

bool KinOfFamily::isChildOf(Place child, Place parent) const {
    const auto& unions = asChild_[static_cast<std::size_t>(child)];
    return std::any_of(unions.begin(), unions.end(), [&](UnionPlace u) {
        const auto& two = partners_[static_cast<std::size_t>(u)];
        return two[0] == parent || two[1] == parent;
    });
}

// Children whom somebody lists who name other parents.
void KinOfFamily::addListedChildren() {
    for (const FamilyId id : ids_) {
        const Place parent = placeOf(id);
        const bool isMother = family_.sex(id) == kin::Sex::female;
        for (const FamilyId listed : family_.children(id)) {
            const Place child = placeOf(listed);
            if (isChildOf(child, parent)) continue;
            addChild(isMother ? unionOf(kNobody, parent) : unionOf(parent, kNobody), child,
                     ChildKind::unknown);
        }
    }
}

void KinOfFamily::order() {
    for (const FamilyId id : ids_) {
        const Place person = placeOf(id);
        std::vector<UnionPlace> asPartner;
        for (const FamilyId spouse : family_.spouses(id)) {
            asPartner.push_back(unionOfPair_.at(pairKey(person, placeOf(spouse))));
        }
        if (asPartner.size() > 1) builder_.orderUnionsAsPartner(person, std::move(asPartner));
        const Place father = placeOf(family_.father(id));
        const Place mother = placeOf(family_.mother(id));
        const auto& asChild = asChild_[static_cast<std::size_t>(person)];
        if (asChild.size() < 2) continue;
        const auto first = std::find_if(asChild.begin(), asChild.end(), [&](UnionPlace u) {
            const auto& two = partners_[static_cast<std::size_t>(u)];
            return pairKey(two[0], two[1]) == pairKey(father, mother);
        });
        if (first != asChild.end()) builder_.orderUnionsAsChild(person, {*first});
    }
}

kin::KinGraph KinOfFamily::build() {
    addPersons();
    addFamilies();
    addCouples();
    addParents();
    addListedChildren();
    order();
    return builder_.build();
}

}  // namespace

kin::KinGraph kinGraphOf(const Family& family) {
    return KinOfFamily(family).build();
}

}  // namespace olvane
