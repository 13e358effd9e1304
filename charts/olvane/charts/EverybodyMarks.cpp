// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyMarksInternal.h>

#include <algorithm>

#include <olvane/charts/EverybodyReachInternal.h>
#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

bool standApart(const Component& part, const Chains& chains, std::int32_t u) {
    const auto& two = part.partners[at(u)];
    return two[0] >= 0 && two[1] >= 0 && !chains.areNeighbours(two[0], two[1]);
}

// Whether the couple of a union has children of an earlier union as well: the line from the one would cross that
// between the partners of the other.
bool isSecondOfCouple(const Component& part, std::int32_t u) {
    const auto& two = part.partners[at(u)];
    if (two[0] < 0 || two[1] < 0 || part.children[u].empty()) return false;
    for (const std::int32_t other : part.asPartner[two[0]]) {
        if (other == u) return false;
        const auto& pair = part.partners[at(other)];
        if (part.children[other].empty() || (pair[0] != two[1] && pair[1] != two[1])) continue;
        return true;
    }
    return false;
}

// Calls visit(u, child, place of the link) for all links to children.
template <class Visit>
void forEachChildLink(const Component& part, const Visit& visit) {
    std::size_t link = 0;
    for (std::int32_t u = 0; u < part.unionCount(); ++u) {
        for (const std::int32_t child : part.children[u]) visit(u, child, link++);
    }
}

}  // namespace

MarkedLinks marksForWantOfRoom(const Component& part, const Chains& chains, const LineRoom& room) {
    MarkedLinks marked;
    std::vector<std::int32_t> above(part.persons.size(), 0);
    std::vector<std::int32_t> below(part.persons.size(), 0);
    std::vector<std::int32_t> between(part.persons.size(), 0);  // by the left one of a couple side by side
    std::vector<std::uint8_t> full(part.unions.size(), 0);
    marked.partner.assign(part.unions.size(), 0);
    for (std::int32_t u = 0; u < part.unionCount(); ++u) {
        const auto& two = part.partners[at(u)];
        if (two[0] >= 0 && two[1] >= 0 && !standApart(part, chains, u)) {
            const bool zeroFirst = chains.slot[at(two[0])] < chains.slot[at(two[1])];
            const std::int32_t most =
                std::min({room.ofCouple, room.marriages[at(two[0])], room.marriages[at(two[1])]});
            if (between[at(two[zeroFirst ? 0 : 1])]++ < most) continue;
            full[at(u)] = 1;
            marked.partner[at(u)] = 2;
            continue;
        }
        std::uint8_t fullSides = 0;
        for (std::uint8_t side = 0; side < 2; ++side) {
            if (two[side] < 0 || below[at(two[side])]++ < room.atBox[at(two[side])]) continue;
            marked.partner[at(u)] = static_cast<std::uint8_t>(side + 1);
            ++fullSides;
        }
        if (fullSides == (two[0] >= 0 ? 1 : 0) + (two[1] >= 0 ? 1 : 0)) full[at(u)] = 1;
    }
    forEachChildLink(part, [&](std::int32_t u, std::int32_t child, std::size_t) {
        const bool noRoom = full[at(u)] != 0 || above[at(child)]++ >= room.atBox[at(child)];
        marked.child.push_back(noRoom ? 1 : 0);
    });
    return marked;
}

void markLinkOfEnd(const Component& part, const Chains& chains, const Rows& rows, std::int32_t end,
                   MarkedLinks& marked) {
    const Rows::End& where = rows.ends[at(end)];
    const std::int32_t u = rows.strands[at(rows.strandOfEnd[at(end)])].unionPlace;
    const bool oneBox = !rows.isPass(where.node) && where.sub % 2 == 0;
    const std::int32_t person = oneBox ? chains.persons[where.node][at(where.sub / 2)] : -1;
    const auto& two = part.partners[at(u)];
    const std::size_t link = part.children.countBefore(u);
    bool found = false;
    if (oneBox && rows.isBelow(end)) {
        for (std::size_t i = 0; i < part.children[u].size(); ++i) {
            if (part.children[u][i] != person) continue;
            marked.child[link + i] = 1;
            found = true;
        }
    } else if (oneBox && two[0] >= 0 && two[1] >= 0 && marked.partner[at(u)] == 0) {
        marked.partner[at(u)] = two[0] == person ? 1 : 2;
        found = true;
    }
    if (found) return;
    if (two[0] >= 0 && two[1] >= 0 && marked.partner[at(u)] == 0) marked.partner[at(u)] = 2;
    for (std::size_t i = 0; i < part.children[u].size(); ++i) marked.child[link + i] = 1;
}

void markAllSecondLinks(const Component& part, const Chains& chains,
                        const std::vector<std::int32_t>& rowOfChain, MarkedLinks& marked) {
    std::vector<std::int32_t> kept(at(chains.count()), -1);
    const auto rowAbove = [&](std::int32_t u) {
        const auto& two = part.partners[at(u)];
        const bool zeroHasLine = two[1] < 0 || (two[0] >= 0 && marked.partner[at(u)] != 1);
        return rowOfChain[at(chains.chain[at(zeroHasLine ? two[0] : two[1])])];
    };
    for (std::int32_t u = 0; u < part.unionCount(); ++u) {
        if (marked.partner[at(u)] != 0) continue;
        if (standApart(part, chains, u) || isSecondOfCouple(part, u)) marked.partner[at(u)] = 2;
    }
    forEachChildLink(part, [&](std::int32_t u, std::int32_t child, std::size_t link) {
        const std::int32_t chain = chains.chain[at(child)];
        if (marked.child[link] != 0) return;
        const bool mayStay = rowAbove(u) < rowOfChain[at(chain)];
        if (mayStay && kept[at(chain)] < 0) kept[at(chain)] = u;
        if (!mayStay || kept[at(chain)] != u) marked.child[link] = 1;
    });
}

namespace {

// A link that may become a mark, and how many crossings go with it.
struct Candidate {
    std::int64_t gain;
    std::int32_t unionPlace;
    std::int32_t chain;
    std::size_t link;
    bool isPartner;
};

class MarkSearch {
public:
    MarkSearch(const Component& part, const Chains& chains, const Rows& rows, const RowOrder& order,
               MarkedLinks& marked)
        : part_(part), chains_(chains), rows_(rows), places_(rows, order), marked_(marked) {
        for (std::size_t s = 0; s < rows.strands.size(); ++s) {
            reaches_.push_back(places_.reach(static_cast<std::int32_t>(s)));
        }
        firstStrand_.assign(at(part.unionCount()) + 1, 0);
        for (const Rows::Strand& strand : rows.strands) ++firstStrand_[at(strand.unionPlace) + 1];
        for (std::size_t u = 1; u < firstStrand_.size(); ++u) firstStrand_[u] += firstStrand_[u - 1];
    }

    std::int32_t mark(std::int32_t count) {
        std::vector<std::int32_t> links(at(chains_.count()), 0);
        forEachChildLink(part_, [&](std::int32_t, std::int32_t child, std::size_t link) {
            if (marked_.child[link] == 0) ++links[at(chains_.chain[at(child)])];
        });
        std::vector<Candidate> candidates = collect(links);
        kin::mergeSort(candidates.begin(), candidates.end(),
                       [](const Candidate& a, const Candidate& b) { return a.gain > b.gain; });
        std::int32_t done = 0;
        for (const Candidate& candidate : candidates) {
            if (done == count) break;
            if (candidate.isPartner) {
                marked_.partner[at(candidate.unionPlace)] = 2;
            } else {
                if (links[at(candidate.chain)] < 2) continue;
                --links[at(candidate.chain)];
                marked_.child[candidate.link] = 1;
            }
            ++done;
        }
        return done;
    }

private:
    std::vector<Candidate> collect(const std::vector<std::int32_t>& links) const {
        std::vector<Candidate> candidates;
        forEachChildLink(part_, [&](std::int32_t u, std::int32_t child, std::size_t link) {
            const std::int32_t chain = chains_.chain[at(child)];
            if (marked_.child[link] != 0 || links[at(chain)] < 2) return;
            candidates.push_back({gainWithout(u, child, true), u, chain, link, false});
        });
        for (std::int32_t u = 0; u < part_.unionCount(); ++u) {
            if (!standApart(part_, chains_, u) || marked_.partner[at(u)] != 0) continue;
            candidates.push_back({gainWithout(u, part_.partners[at(u)][1], false), u, -1, 0, true});
        }
        return candidates;
    }

    // The crossings of a union with everybody's line, less those that are left without the end at this person.
    std::int64_t gainWithout(std::int32_t u, std::int32_t person, bool isChild) const {
        const std::int32_t chain = chains_.chain[at(person)];
        const std::int32_t sub = 2 * chains_.slot[at(person)];
        const std::int32_t last = lastStrandNeeded(u, chain, sub, isChild);
        std::int64_t gain = 0;
        for (std::int32_t s = firstStrand_[at(u)]; s < firstStrand_[at(u) + 1]; ++s) {
            const Reach without = s > last ? Reach() : reachWithout(s, chain, sub, isChild);
            for (const std::int32_t other : rows_.strandsInGap[rows_.strands[at(s)].gap + 1]) {
                if (other == s) continue;
                gain += cross(reaches_[at(s)], reaches_[at(other)]) -
                        (s > last ? 0 : cross(without, reaches_[at(other)]));
            }
        }
        return gain;
    }

    bool isTheEnd(std::uint32_t e, std::int32_t chain, std::int32_t sub, bool isChild) const {
        const Rows::End& end = rows_.ends[e];
        return end.node == chain && end.sub == sub && rows_.isBelow(static_cast<std::int32_t>(e)) == isChild;
    }

    // The last strand of the union that still has an end at a box without this one.
    std::int32_t lastStrandNeeded(std::int32_t u, std::int32_t chain, std::int32_t sub, bool isChild) const {
        std::int32_t last = firstStrand_[at(u)] - 1;
        for (std::int32_t s = firstStrand_[at(u)]; s < firstStrand_[at(u) + 1]; ++s) {
            const Rows::Strand& strand = rows_.strands[at(s)];
            for (std::uint32_t e = strand.firstEnd;
                 e < strand.firstEnd + strand.aboveCount + strand.belowCount; ++e) {
                if (!rows_.isPass(rows_.ends[e].node) && !isTheEnd(e, chain, sub, isChild)) last = s;
            }
        }
        return last;
    }

    Reach reachWithout(std::int32_t s, std::int32_t chain, std::int32_t sub, bool isChild) const {
        Reach reach;
        const Rows::Strand& strand = rows_.strands[at(s)];
        for (std::uint32_t e = strand.firstEnd; e < strand.firstEnd + strand.aboveCount + strand.belowCount;
             ++e) {
            if (isTheEnd(e, chain, sub, isChild)) continue;
            const std::int32_t place = places_.of(rows_.ends[e]);
            const bool below = e >= strand.firstEnd + strand.aboveCount;
            (below ? reach.belowLow : reach.aboveLow) =
                std::min(below ? reach.belowLow : reach.aboveLow, place);
            (below ? reach.belowHigh : reach.aboveHigh) =
                std::max(below ? reach.belowHigh : reach.aboveHigh, place);
        }
        return reach;
    }

    const Component& part_;
    const Chains& chains_;
    const Rows& rows_;
    Places places_;
    MarkedLinks& marked_;
    std::vector<Reach> reaches_;
    std::vector<std::int32_t> firstStrand_;
};

}  // namespace

std::int32_t markWorstLinks(const Component& part, const Chains& chains, const Rows& rows,
                            const RowOrder& order, std::int32_t count, MarkedLinks& marked) {
    return MarkSearch(part, chains, rows, order, marked).mark(count);
}

}  // namespace olvane::charts
