// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/KinSumsInternal.h>

#include <algorithm>
#include <map>
#include <tuple>

namespace olvane::kin {

namespace {

// Beyond this, just below 2^126, a sum might not fit.
constexpr double kLargestMagnitude = 8.5e37;
// Sums of chains stop here.
constexpr std::uint64_t kTooMany = std::uint64_t{1} << 62U;
constexpr std::size_t kMostPairs = 1'000'000;

std::uint64_t boundedSum(std::uint64_t one, std::uint64_t other, std::uint64_t most) {
    return other >= most - std::min(one, most) ? most : one + other;
}

}  // namespace

void WholeSum::add(std::uint64_t one, std::uint64_t other, std::uint64_t factor, bool isNegative) {
    magnitude_ += static_cast<double>(one) * static_cast<double>(other) * static_cast<double>(factor);
    overflow_ = overflow_ || magnitude_ > kLargestMagnitude || std::max({one, other, factor}) >= kTooMany;
    unsigned __int128& sum = isNegative ? minus_ : plus_;
    sum += static_cast<unsigned __int128>(one) * other * factor;
}

std::optional<std::uint64_t> WholeSum::value() const {
    if (overflow_ || plus_ - minus_ > kLargestCount) return std::nullopt;
    return static_cast<std::uint64_t>(plus_ - minus_);
}

KinSums::KinSums(const Ancestry& ancestry) : ancestry_(ancestry) {
    if (!ancestry.hasCommon()) return;
    const std::size_t size = at(ancestry.size());
    for (Masses* masses : {&first_, &second_}) {
        masses->gene.assign(size, 0);
        masses->chains.assign(size, 0);
    }
    findShares();
    sumOverCommon();
}

// From the top down: what an ancestor shares is known before it is asked for below.
void KinSums::findShares() {
    const auto common = ancestry_.common();
    inbreeding_.assign(at(ancestry_.size()), 0);
    ownShare_.assign(at(ancestry_.size()), 0);
    ofPartners_.assign(at(ancestry_.size()), {});
    for (std::size_t i = common.size(); i-- > 0;) {
        const Spot spot = common[i];
        if (ancestry_.isCouple(spot)) {
            const auto partners = ancestry_.up(spot);
            ofPartners_[at(spot)] = sumsOfPartners(partners[0].to, partners[1].to, i);
        } else {
            setPersonShare(spot);
        }
    }
}

void KinSums::setPersonShare(Spot person) {
    const auto links = ancestry_.up(person);
    double& inbreeding = inbreeding_[at(person)];
    double& share = ownShare_[at(person)];
    if (links.empty()) {
        share = 1;
    } else if (ancestry_.isCouple(links.front().to)) {
        const auto partners = ancestry_.up(links.front().to);
        inbreeding = ofPartners_[at(links.front().to)].phi;
        share = 0.5 - 0.25 * (inbreeding_[at(partners[0].to)] + inbreeding_[at(partners[1].to)]);
    } else if (ancestry_.links().hasOneParentTwice(ancestry_.node(person))) {
        const double ofParent = inbreeding_[at(links.front().to)];
        inbreeding = 0.5 + 0.5 * ofParent;
        share = 0.5 - 0.5 * ofParent;
    } else {
        share = 0.75 - 0.25 * inbreeding_[at(links.front().to)];
    }
}

// Climbs from both partners at once, in order, until nothing of one of the two is left to climb.
// below: the position of their couple among the common ancestors.
KinSums::PairSums KinSums::sumsOfPartners(Spot one, Spot other, std::size_t below) {
    const auto common = ancestry_.common();
    std::int64_t ofOne = 1;
    std::int64_t ofOther = 1;
    first_.gene[at(one)] = second_.gene[at(other)] = 1;
    first_.chains[at(one)] = second_.chains[at(other)] = 1;
    touched_.assign({one, other});
    double phi = 0;
    WholeSum ways;
    for (std::size_t i = below + 1; i < common.size() && ofOne > 0 && ofOther > 0; ++i) {
        const Spot spot = common[i];
        addTerms(spot, phi, ways);
        if (first_.chains[at(spot)] > 0) {
            --ofOne;
            pushUp(spot, first_, ofOne);
        }
        if (second_.chains[at(spot)] > 0) {
            --ofOther;
            pushUp(spot, second_, ofOther);
        }
    }
    for (const Spot spot : touched_) {
        first_.gene[at(spot)] = second_.gene[at(spot)] = 0;
        first_.chains[at(spot)] = second_.chains[at(spot)] = 0;
    }
    return {phi, ways.value().value_or(kTooMany)};
}

void KinSums::pushUp(Spot from, Masses& masses, std::int64_t& pending) {
    const double gene = masses.gene[at(from)];
    const std::uint64_t chains = masses.chains[at(from)];
    for (const SpotLink& link : ancestry_.up(from)) {
        if (masses.chains[at(link.to)] == 0) {
            ++pending;
            touched_.push_back(link.to);
        }
        masses.gene[at(link.to)] += gene * geneShare(from, link);
        masses.chains[at(link.to)] = boundedSum(masses.chains[at(link.to)], chains, kTooMany);
    }
}

// A child hands all on to the couple of its parents, which hands a half to each.
double KinSums::geneShare(Spot child, const SpotLink& link) const {
    if (ancestry_.isCouple(child)) return 0.5;
    if (ancestry_.isCouple(link.to)) return 1;
    return ancestry_.links().hasOneParentTwice(ancestry_.node(child)) ? 1 : 0.5;
}

void KinSums::addTerms(Spot spot, double& phi, WholeSum& ways) const {
    const std::uint64_t one = first_.chains[at(spot)];
    const std::uint64_t other = second_.chains[at(spot)];
    if (one == 0 || other == 0) return;
    if (ancestry_.isCouple(spot)) {
        ways.add(one, other, 1, true);
        return;
    }
    phi += 0.5 * first_.gene[at(spot)] * second_.gene[at(spot)] * ownShare_[at(spot)];
    const auto links = ancestry_.up(spot);
    if (links.empty()) ways.add(one, other, 1, false);
    if (!links.empty() && ancestry_.isCouple(links.front().to)) {
        ways.add(one, other, 2 * ofPartners_[at(links.front().to)].ways, true);
    }
}

void KinSums::sumOverCommon() {
    std::int64_t ignored = 0;
    touched_.clear();
    first_.gene[at(ancestry_.spotOfA())] = second_.gene[at(ancestry_.spotOfB())] = 1;
    first_.chains[at(ancestry_.spotOfA())] = second_.chains[at(ancestry_.spotOfB())] = 1;
    WholeSum ways;
    for (Spot spot = 0; spot < ancestry_.size(); ++spot) {
        addTerms(spot, phi_, ways);
        if (first_.chains[at(spot)] > 0) pushUp(spot, first_, ignored);
        if (second_.chains[at(spot)] > 0) pushUp(spot, second_, ignored);
    }
    count_ = ways.value();
    needsPairs_ = ways.hasOverflow();
}

namespace {

// A pair of chains that have not met: where each ends, the lower end first, and whether a link was not by blood.
using PairOfEnds = std::tuple<Spot, Spot, bool>;

// Pairs by their lower end. Chains climb where they end lowest, so no pair comes again once it was looked at.
class PairCounter {
public:
    PairCounter(const Ancestry& ancestry, bool onlyOtherBonds)
        : ancestry_(ancestry), onlyOtherBonds_(onlyOtherBonds) {}

    std::optional<std::uint64_t> count() {
        reach(ancestry_.spotOfA(), ancestry_.spotOfB(), false, 1);
        for (std::size_t looks = 0; !pairs_.empty(); ++looks) {
            if (looks == kMostPairs || total_ > kLargestCount) return std::nullopt;
            const auto [ends, ways] = *pairs_.begin();
            pairs_.erase(pairs_.begin());
            const auto [low, high, isOther] = ends;
            climb(low, high, isOther, ways);
        }
        return total_ > kLargestCount ? std::nullopt : std::optional(total_);
    }

private:
    void reach(Spot one, Spot other, bool isOther, std::uint64_t ways) {
        if (!ancestry_.isRelevant(one) || !ancestry_.isRelevant(other)) return;
        std::uint64_t& known = pairs_[{std::min(one, other), std::max(one, other), isOther}];
        known = boundedSum(known, ways, kLargestCount + 1);
    }

    void climb(Spot low, Spot high, bool isOther, std::uint64_t ways) {
        if (low == high) {
            if (isOther || !onlyOtherBonds_) total_ = boundedSum(total_, ways, kLargestCount + 1);
            if (!ancestry_.isCouple(low)) return;
            const auto partners = ancestry_.up(low);
            reach(partners[0].to, partners[1].to, isOther, boundedSum(ways, ways, kLargestCount + 1));
            return;
        }
        for (const SpotLink& link : ancestry_.up(low)) {
            reach(link.to, high, isOther || link.bond != Bond::blood, ways);
        }
    }

    const Ancestry& ancestry_;
    bool onlyOtherBonds_;
    std::uint64_t total_ = 0;
    std::map<PairOfEnds, std::uint64_t> pairs_;
};

}  // namespace

std::optional<std::uint64_t> countByPairs(const Ancestry& ancestry, bool onlyOtherBonds) {
    return PairCounter(ancestry, onlyOtherBonds).count();
}

}  // namespace olvane::kin
