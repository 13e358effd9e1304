// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/kin/Language.h>
#include <olvane/kin/Lives.h>

namespace olvane::kin {

// What may be odd in the data of a family. New kinds are added at the end.
enum class RemarkKind : std::uint8_t {
    childNotListed,        // a person names a family as parents, which does not list the child
    parentsNotNamed,       // a family lists a child who does not name the family
    partnerNotNamed,       // a person names a marriage, which does not name the partner
    marriageNotNamed,      // a family names a partner who does not name the family
    severalBirthFamilies,  // a child by birth in two families; family is the second
    diedBeforeBirth,
    livedTooLong,      // years is kLongestLife
    bornBeforeParent,  // other is the parent, here and below
    parentTooYoung,    // years is kYoungestParent
    parentTooOld,      // years is kOldestMother or kOldestFather
    bornAfterParentsDeath,
    marriedBeforeBirth,
    marriedAfterDeath,
    ownAncestor,
};

constexpr std::size_t kRemarkKinds = static_cast<std::size_t>(RemarkKind::ownAncestor) + 1;

// "childNotListed" and so on, for programs.
OLVANE_API const char* nameOf(RemarkKind kind);

// Something odd, without words.
struct Remark {
    RemarkKind kind = RemarkKind::childNotListed;
    Place person = kNobody;
    Place other = kNobody;
    std::uint32_t family = 0;  // the number of the family in the data; 0 where the remark is about none
    int years = 0;

    bool operator==(const Remark&) const = default;
};

// Everything odd in a graph and its years: of each person the life, the families by birth and the parents' ages, then
// of each union the marriage, then persons who are their own ancestors. Only what cannot be is remarked: dates are compared
// as all the years that they may stand for. Ages are compared with parents by birth alone. The first four kinds are
// those of records that name each other, which a graph does not know.
// Fails: std::invalid_argument where the lives are not as many as the persons, or the marriages as the unions.
OLVANE_API std::vector<Remark> checkData(const KinGraph& graph, const Lives& lives);

// Everybody who comes back to themself over the parents that are drawn, in the order of places. Time grows with the
// number of persons alone, whatever circles they form.
OLVANE_API std::vector<Place> ownAncestors(const KinGraph& graph);

// How a remark names persons and families.
struct RemarkNames {
    std::function<std::string(Place)> person;
    std::function<std::string(std::uint32_t)> family;
};

// "@I1@ Odd One died before being born"
OLVANE_API std::string remarkText(const Remark& remark, const RemarkNames& names, Language language);

}  // namespace olvane::kin
