// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <algorithm>

#include <olvane/kin/KinWaysInternal.h>
#include <olvane/kin/MarriageWaysInternal.h>

namespace olvane::kin {

namespace {

// Of several marriages of one couple, one that holds says more than one that ended.
UnionState stateOfCouple(const KinGraph& graph, Place one, Place other) {
    constexpr UnionState kByWeight[] = {UnionState::married, UnionState::unknown, UnionState::unmarried,
                                        UnionState::divorced};
    std::size_t best = std::size(kByWeight) - 1;
    for (const UnionPlace u : graph.unionsAsPartner(one)) {
        if (graph.otherPartner(u, one) != other) continue;
        const auto* const found = std::find(std::begin(kByWeight), std::end(kByWeight), graph.state(u));
        best = std::min(best, static_cast<std::size_t>(found - std::begin(kByWeight)));
    }
    return kByWeight[best];
}

Bond bondBetween(const KinLinks& links, Place child, Place parent) {
    for (const UpLink& link : links.up(child)) {
        if (link.to == parent) return link.bond;
        if (!links.isCouple(link.to)) continue;
        const auto& partners = links.partnersOf(link.to);
        if (partners[0] == parent || partners[1] == parent) return link.bond;
    }
    return Bond::other;
}

// Half where the two children below the turn do not share their couple of parents.
bool turnsHalf(const KinLinks& links, Place child, Place top, Place otherChild) {
    KinWay turn;
    turn.up = turn.down = 1;
    turn.ancestors = {top};
    turn.persons = {child, top, otherChild};
    const auto one = links.upByBlood(child);
    const auto other = links.upByBlood(otherChild);
    return !one.empty() && !other.empty() && one.front().to != other.front().to && isHalfWay(links, turn);
}

}  // namespace

std::vector<KinStep> stepsOf(const KinLinks& links, const std::vector<Place>& persons) {
    std::vector<KinStep> steps;
    for (std::size_t i = 0; i + 1 < persons.size(); ++i) {
        const Place here = persons[i];
        const Place next = persons[i + 1];
        const std::uint8_t kinds = links.kindsBetween(here, next);
        const bool opensStep = steps.empty() || steps.back().isCouple;
        if ((kinds & kIsPartner) != 0) {
            steps.push_back({true, stateOfCouple(links.graph(), here, next), 0, 0, false, Bond::blood, next});
            continue;
        }
        const bool goesUp = (kinds & kIsParent) != 0;
        if (opensStep || (goesUp && steps.back().down > 0)) steps.emplace_back();
        KinStep& step = steps.back();
        if (!goesUp && step.down == 0 && step.up > 0)
            step.half = turnsHalf(links, persons[i - 1], here, next);
        (goesUp ? step.up : step.down) += 1;
        step.bond =
            std::max(step.bond, goesUp ? bondBetween(links, here, next) : bondBetween(links, next, here));
        step.to = next;
    }
    return steps;
}

}  // namespace olvane::kin
