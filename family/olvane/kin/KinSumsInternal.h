// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <vector>

#include <olvane/kin/AncestryInternal.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::kin {

// The largest count that a double holds exactly; larger ones are reported as unknown.
constexpr std::uint64_t kLargestCount = std::uint64_t{1} << 53U;

// A sum of products of whole numbers, kept exactly in 128 bits.
class WholeSum {
public:
    void add(std::uint64_t one, std::uint64_t other, std::uint64_t factor, bool isNegative);
    // The sum might not fit.
    bool hasOverflow() const { return overflow_; }
    // Empty above kLargestCount, and on overflow.
    std::optional<std::uint64_t> value() const;

private:
    unsigned __int128 plus_ = 0;
    unsigned __int128 minus_ = 0;
    double magnitude_ = 0;
    bool overflow_ = false;
};

// The kinship coefficient of the two persons of an ancestry by blood, and the number of their ways, without listing
// any way.
//
// The coefficient is the sum of T(a, c) T(b, c) D(c) / 2 over the common ancestors c, where T sums the chances that a
// gene of the ancestor comes down, and D is the share of the gene that is not explained by the parents (Henderson,
// "A simple method for computing the inverse of a numerator relationship matrix", 1976; Quaas, 1976). The count has
// the same form with whole numbers: chains of links in place of chances, a correction of -1 for each couple, since a
// pair of chains over the couple is one way and not two, and of -2 W for a child of a couple whose partners are
// related in W ways.
//
// Holds: the count is exact or not reported; the coefficient adds positive numbers only.
// Time: the number of ancestors, and for each couple among the common ancestors the number of ancestors up to where
//       those of one partner end.
class KinSums {
public:
    // The ancestry is one by blood, without a loop.
    explicit KinSums(const Ancestry& ancestry);

    double phi() const { return phi_; }
    // Empty above kLargestCount, and where countNeedsPairs().
    std::optional<std::uint64_t> count() const { return count_; }
    // A number on the way to the count did not fit; countByPairs knows a way around it.
    bool countNeedsPairs() const { return needsPairs_; }

private:
    struct PairSums {
        double phi = 0;
        std::uint64_t ways = 0;  // 2^62 where nobody can say
    };
    // By spot: what has come up from one person.
    struct Masses {
        std::vector<double> gene;
        std::vector<std::uint64_t> chains;
    };

    void findShares();
    void setPersonShare(Spot person);
    PairSums sumsOfPartners(Spot one, Spot other, std::size_t below);
    void pushUp(Spot from, Masses& masses, std::int64_t& pending);
    double geneShare(Spot child, const SpotLink& link) const;
    void addTerms(Spot spot, double& phi, WholeSum& ways) const;
    void sumOverCommon();

    const Ancestry& ancestry_;
    // By spot, for common ancestors: of a person the inbreeding and D, of a couple the sums of its partners.
    std::vector<double> inbreeding_;
    std::vector<double> ownShare_;
    std::vector<PairSums> ofPartners_;
    Masses first_;
    Masses second_;
    std::vector<Spot> touched_;
    double phi_ = 0;
    bool needsPairs_ = false;
    std::optional<std::uint64_t> count_ = 0;
};

// How many ways there are, from pairs of chains that climb in step and meet at their tops alone. Sums of positive
// numbers only, and for links of all bonds.
//
// onlyOtherBonds: count the ways with a link that is not by blood, in place of all.
// Empty above kLargestCount, or where there are too many pairs to look at.
std::optional<std::uint64_t> countByPairs(const Ancestry& ancestry, bool onlyOtherBonds);

}  // namespace olvane::kin
