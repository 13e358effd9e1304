// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Families become unions one after another. The kind of a child stands in the child's own record, so these links are
// sorted by family first: nothing is looked up in a list, however many families claim one child.

#include <olvane/source/GedcomKin.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <utility>
#include <vector>

namespace olvane::gedcom {

namespace {

using kin::ChildKind;
using kin::Place;
using kin::UnionPlace;
using kin::UnionState;

constexpr UnionPlace kNoUnion = -1;

Place placeOf(PersonId id) {
    return id == 0 ? kin::kNobody : static_cast<Place>(id - 1);
}

kin::Sex sexOf(const Person& person) {
    if (person.sex == Sex::male) return kin::Sex::male;
    return person.sex == Sex::female ? kin::Sex::female : kin::Sex::unknown;
}

ChildKind kindOf(Pedigree pedigree) {
    switch (pedigree) {
        case Pedigree::notGiven:
        case Pedigree::birth:
            return ChildKind::birth;
        case Pedigree::adopted:
            return ChildKind::adopted;
        case Pedigree::foster:
            return ChildKind::foster;
        case Pedigree::sealing:
            return ChildKind::sealing;
        case Pedigree::step:
            return ChildKind::step;
        case Pedigree::other:
            break;
    }
    return ChildKind::unknown;
}

UnionState stateOf(const Family& family) {
    if (family.husband == 0 || family.wife == 0) return UnionState::unknown;
    if (family.divorced) return UnionState::divorced;
    if (family.married) return UnionState::married;
    return family.notMarried ? UnionState::unmarried : UnionState::unknown;
}

// A person's link to a family of parents.
struct ChildClaim {
    PersonId child = 0;
    ChildKind kind = ChildKind::birth;
};

class KinMaker {
public:
    KinMaker(const GedcomData& data, const ParentChoice& parents) : data_(data), parents_(parents) {}

    kin::KinGraph make() {
        builder_.reserve(data_.personCount(), data_.familyCount());
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            builder_.addPerson(std::int64_t{id}, sexOf(data_.person(id)));
        }
        addUnions();
        sortClaims();
        addChildren();
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            orderAsPartner(id);
            orderAsChild(id);
        }
        return builder_.build();
    }

private:
    void addUnions() {
        unionOf_.assign(data_.familyCount() + 1, kNoUnion);
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) {
            const Family& family = data_.family(id);
            if (family.husband == 0 && family.wife == 0) continue;
            unionOf_[id] =
                builder_.addUnion(placeOf(family.husband), placeOf(family.wife), stateOf(family), id);
        }
    }

    // By family, and in a family by person.
    void sortClaims() {
        claimStart_.assign(data_.familyCount() + 2, 0);
        const auto forEachClaim = [this](auto&& visit) {
            for (PersonId id = 1; id <= data_.personCount(); ++id) {
                for (const FamilyLink& link : data_.parentLinks(id)) {
                    if (unionOf_[link.family] != kNoUnion) visit(link.family, id, link.pedigree);
                }
            }
        };
        forEachClaim([this](FamilyId family, PersonId, Pedigree) { ++claimStart_[family + 1]; });
        for (std::size_t i = 1; i < claimStart_.size(); ++i) claimStart_[i] += claimStart_[i - 1];
        claims_.resize(claimStart_.back());
        std::vector<std::size_t> next = claimStart_;
        forEachClaim([this, &next](FamilyId family, PersonId child, Pedigree pedigree) {
            claims_[next[family]++] = {child, kindOf(pedigree)};
        });
    }

    // Every child of a family has a link to it. The first of several to one family gives the kind.
    void addChildren() {
        std::vector<FamilyId> claimed(data_.personCount() + 1, 0);
        std::vector<ChildKind> kinds(data_.personCount() + 1, ChildKind::birth);
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) {
            if (unionOf_[id] == kNoUnion) continue;
            for (std::size_t i = claimStart_[id]; i < claimStart_[id + 1]; ++i) {
                if (std::exchange(claimed[claims_[i].child], id) != id) {
                    kinds[claims_[i].child] = claims_[i].kind;
                }
            }
            for (const ChildLink& link : data_.childLinks(id)) {
                if (link.child != 0) builder_.addChild(unionOf_[id], placeOf(link.child), kinds[link.child]);
            }
        }
    }

    // An order is only given where it differs from that of the families, which the graph has by itself.
    void orderAsPartner(PersonId id) {
        std::vector<UnionPlace> order;
        for (const FamilyLink& link : data_.coupleLinks(id)) addUnion(order, link.family);
        if (!std::is_sorted(order.begin(), order.end())) {
            builder_.orderUnionsAsPartner(placeOf(id), std::move(order));
        }
    }

    void orderAsChild(PersonId id) {
        std::vector<UnionPlace> order;
        addUnion(order, parentFamilyOf(data_, id, parents_));
        for (const FamilyLink& link : data_.parentLinks(id)) addUnion(order, link.family);
        if (!std::is_sorted(order.begin(), order.end())) {
            builder_.orderUnionsAsChild(placeOf(id), std::move(order));
        }
    }

    void addUnion(std::vector<UnionPlace>& order, FamilyId family) const {
        if (unionOf_[family] != kNoUnion) order.push_back(unionOf_[family]);
    }

    const GedcomData& data_;
    const ParentChoice& parents_;
    kin::KinGraphBuilder builder_;
    std::vector<UnionPlace> unionOf_;      // by family
    std::vector<std::size_t> claimStart_;  // by family
    std::vector<ChildClaim> claims_;
};

}  // namespace

kin::KinGraph kinGraphOf(const GedcomData& data, const ParentChoice& parents) {
    return KinMaker(data, parents).make();
}

}  // namespace olvane::gedcom
