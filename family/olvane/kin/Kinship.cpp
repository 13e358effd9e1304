// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/Kinship.h>

#include <algorithm>
#include <stdexcept>

#include <olvane/kin/AncestryInternal.h>
#include <olvane/kin/KinLinksInternal.h>
#include <olvane/kin/KinSumsInternal.h>
#include <olvane/kin/KinWaysInternal.h>
#include <olvane/kin/MarriageWaysInternal.h>

namespace olvane::kin {

// By blood first; then what is not by blood, where there is any; then over marriages.
class KinshipSearch {
public:
    explicit KinshipSearch(const KinGraph& graph) : links_(graph), ancestry_(links_), marriages_(links_) {}

    const KinGraph& graph() const { return links_.graph(); }

    std::optional<double> coefficient(Place a, Place b) {
        ancestry_.gather(a, b, Links::blood);
        if (ancestry_.hasLoop()) return std::nullopt;
        return KinSums(ancestry_).phi();
    }

    Kinship between(Place a, Place b, const KinshipLimits& limits) {
        Kinship kinship;
        kinship.a = a;
        kinship.b = b;
        findBlood(kinship, limits);
        findOtherBonds(kinship, limits);
        findMarriages(kinship, limits);
        return kinship;
    }

private:
    void findBlood(Kinship& kinship, const KinshipLimits& limits) {
        ancestry_.gather(kinship.a, kinship.b, Links::blood);
        kinship.bloodLoop = ancestry_.hasLoop();
        if (kinship.bloodLoop) {
            kinship.blood = listWaysInLoops(links_, kinship.a, kinship.b, WaySort::blood, limits.ways,
                                            limits.nearestAlone);
        } else {
            if (!limits.nearestAlone) addSums(kinship);
            kinship.blood = KinWays(ancestry_, WaySort::blood).list(limits.ways, limits.nearestAlone);
        }
        if (!kinship.blood.empty()) kinship.degree = kinship.blood.front().length();
    }

    void addSums(Kinship& kinship) const {
        const KinSums sums(ancestry_);
        kinship.phi = sums.phi();
        kinship.bloodCount = kinship.a == kinship.b   ? std::optional(std::uint64_t{0})
                             : sums.countNeedsPairs() ? countByPairs(ancestry_, false)
                                                      : sums.count();
    }

    void findOtherBonds(Kinship& kinship, const KinshipLimits& limits) {
        ancestry_.gather(kinship.a, kinship.b, Links::all);
        kinship.legalLoop = ancestry_.hasLoop();
        if (kinship.legalLoop) {
            kinship.legal = listWaysInLoops(links_, kinship.a, kinship.b, WaySort::otherBonds, limits.ways,
                                            limits.nearestAlone);
            return;
        }
        if (!limits.nearestAlone) kinship.legalCount = 0;
        if (kinship.a == kinship.b || !ancestry_.hasCommon() || !ancestry_.hasOtherBonds()) return;
        if (!limits.nearestAlone) kinship.legalCount = countByPairs(ancestry_, true);
        kinship.legal = KinWays(ancestry_, WaySort::otherBonds).list(limits.ways, limits.nearestAlone);
    }

    void findMarriages(Kinship& kinship, const KinshipLimits& limits) {
        const bool isRelated = !kinship.blood.empty() || !kinship.legal.empty();
        const auto reach =
            limits.nearestAlone && isRelated ? MarriageReach::shortestWay : MarriageReach::anyWay;
        MarriageWays marriages =
            marriages_.find(kinship.a, kinship.b, limits.nearestAlone ? 1 : limits.ways, reach);
        kinship.marriage = std::move(marriages.ways);
        for (MarriageWay& way : kinship.marriage) way.steps = stepsOf(links_, way.persons);
        if (!limits.nearestAlone) kinship.marriageCount = marriages.count;
    }

    KinLinks links_;
    Ancestry ancestry_;
    MarriageSearch marriages_;
};

KinshipFinder::KinshipFinder(const KinGraph& graph) : search_(std::make_unique<KinshipSearch>(graph)) {}
KinshipFinder::~KinshipFinder() = default;
KinshipFinder::KinshipFinder(KinshipFinder&&) noexcept = default;
KinshipFinder& KinshipFinder::operator=(KinshipFinder&&) noexcept = default;

void KinshipFinder::check(Place person) const {
    if (person < 0 || person >= search_->graph().personCount()) throw std::out_of_range("no such person");
}

Kinship KinshipFinder::between(Place a, Place b, const KinshipLimits& limits) {
    check(a);
    check(b);
    return search_->between(a, b, {std::max<std::size_t>(limits.ways, 1), limits.nearestAlone});
}

std::optional<double> KinshipFinder::coefficient(Place a, Place b) {
    check(a);
    check(b);
    return search_->coefficient(a, b);
}

}  // namespace olvane::kin
