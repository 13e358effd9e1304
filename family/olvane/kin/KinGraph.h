// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <unordered_map>
#include <vector>

#include <olvane/Export.h>

namespace olvane::kin {

// A person by place: 0 to personCount() - 1. kNobody where nobody is known.
using Place = std::int32_t;
constexpr Place kNobody = -1;

// A union by place: 0 to unionCount() - 1.
using UnionPlace = std::int32_t;

enum class Sex : std::uint8_t { male = 0, female = 1, unknown = 2 };

// How a child came to a union.
enum class ChildKind : std::uint8_t { birth, adopted, foster, step, sealing, unknown };

// What is known of the partners of a union. A lone parent's union is unknown.
enum class UnionState : std::uint8_t { married, divorced, unmarried, unknown };

// Who is whose parent and partner, as arrays: what charts, kinship and data checks work on.
//
// A union is one or two partners with the children they have together; a couple without children is a union,
// and so is a lone parent with children. Partner 0 is the father or husband, partner 1 the mother or wife; of
// a same-sex couple they stand in the data's own order.
//
// Holds: immutable once built, so any number of threads may read it. Every list is in the order in which it
//        was added: unionsAsPartner in the order of the spouses, children in the order of birth that the data
//        gives, unionsAsChild with the parents to be drawn first. A person occurs at most once in each list
//        of children, and at most once in each list of unions. Data may contradict itself: somebody may be
//        their own ancestor or their own partner.
// Memory: about 40 bytes a person in ordinary families.
class OLVANE_API KinGraph {
public:
    Place personCount() const { return static_cast<Place>(ids_.size()); }
    UnionPlace unionCount() const { return static_cast<UnionPlace>(partners_.size()); }

    // The host's number of the person.
    std::int64_t id(Place person) const { return ids_[at(person)]; }
    // kNobody for an id that is not here.
    Place placeOf(std::int64_t id) const;
    Sex sex(Place person) const { return sexes_[at(person)]; }

    // kNobody in a slot without a partner. At least one slot is taken.
    const std::array<Place, 2>& partners(UnionPlace u) const { return partners_[at(u)]; }
    UnionState state(UnionPlace u) const { return states_[at(u)]; }
    // The number of the union in the data that it came from; 0 where the data have no families of their own.
    std::uint32_t family(UnionPlace u) const { return families_[at(u)]; }
    std::span<const Place> children(UnionPlace u) const { return slice(children_, childStart_, u); }
    // As many as children, in the same order.
    std::span<const ChildKind> childKinds(UnionPlace u) const { return slice(childKinds_, childStart_, u); }

    std::span<const UnionPlace> unionsAsPartner(Place person) const {
        return slice(asPartner_, partnerStart_, person);
    }
    std::span<const UnionPlace> unionsAsChild(Place person) const {
        return slice(asChild_, parentStart_, person);
    }
    // The other partner of a union that the person is in; kNobody for a lone parent.
    Place otherPartner(UnionPlace u, Place person) const {
        const std::array<Place, 2>& two = partners(u);
        return two[0] == person ? two[1] : two[0];
    }

private:
    friend class KinGraphBuilder;

    static std::size_t at(std::int32_t place) { return static_cast<std::size_t>(place); }

    template <class Value>
    static std::span<const Value> slice(const std::vector<Value>& values,
                                        const std::vector<std::uint32_t>& start, std::int32_t place) {
        const std::uint32_t first = start[at(place)];
        return {values.data() + first, start[at(place) + 1] - first};
    }

    std::vector<std::int64_t> ids_;
    std::vector<Sex> sexes_;
    std::unordered_map<std::int64_t, Place> placeOfId_;  // empty where id is place + 1 for everybody
    std::vector<std::array<Place, 2>> partners_;
    std::vector<UnionState> states_;
    std::vector<std::uint32_t> families_;
    std::vector<std::uint32_t> childStart_;
    std::vector<Place> children_;
    std::vector<ChildKind> childKinds_;
    std::vector<std::uint32_t> partnerStart_;
    std::vector<UnionPlace> asPartner_;
    std::vector<std::uint32_t> parentStart_;
    std::vector<UnionPlace> asChild_;
};

// Makes a KinGraph, persons first, then unions in the order of the data.
class OLVANE_API KinGraphBuilder {
public:
    void reserve(std::size_t persons, std::size_t unions);

    // Fails: std::invalid_argument for an id that was added before.
    Place addPerson(std::int64_t id, Sex sex);

    // At least one partner is somebody; a person who is both partners is married to themself.
    // Fails: std::out_of_range for a place that was never added, std::invalid_argument for no partner at all.
    UnionPlace addUnion(Place partner0, Place partner1, UnionState state, std::uint32_t family = 0);

    // Behind the children that the union has. A child that is in it already is left as it is.
    // Fails: std::out_of_range for a place that was never added.
    void addChild(UnionPlace u, Place child, ChildKind kind);

    // The graph; the builder is empty afterwards. A person's unions come in the order in which the unions were
    // added, unless an order was given.
    KinGraph build();

    // The order of a person's unions as partner, or as child: the ones named come first, in that order.
    // Unions that the person is not in are ignored.
    void orderUnionsAsPartner(Place person, std::vector<UnionPlace> order);
    void orderUnionsAsChild(Place person, std::vector<UnionPlace> order);

private:
    struct Child {
        UnionPlace u;
        Place child;
        ChildKind kind;
    };

    void checkPerson(Place person) const;
    void listChildren();
    void listUnions();
    void orderUnions();

    KinGraph graph_;
    bool plainIds_ = true;
    std::vector<Child> children_;
    std::unordered_map<Place, std::vector<UnionPlace>> partnerOrder_;
    std::unordered_map<Place, std::vector<UnionPlace>> childOrder_;
};

}  // namespace olvane::kin
