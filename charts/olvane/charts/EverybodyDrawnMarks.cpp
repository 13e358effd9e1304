// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyMarksInternal.h>

#include <algorithm>
#include <limits>

#include <olvane/charts/EverybodyReachInternal.h>
#include <olvane/kin/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

// A mark that may be a line again: to a child, or to partner 1 of a union.
struct MarkedLink {
    std::int32_t unionPlace;
    std::int32_t person;
    std::size_t link;
    bool isPartner;
    std::int64_t cost = 0;  // in crossings
};

// What each union draws right below its partners, as the reach of a strand.
class DrawnMarks {
public:
    DrawnMarks(const Component& part, const Chains& chains, const Rows& rows, const RowOrder& order,
               const MarkedLinks& forced, MarkedLinks& marked)
        : part_(part),
          chains_(chains),
          rows_(rows),
          places_(rows, order),
          forced_(forced),
          marked_(marked),
          own_(part.unions.size()),
          drawn_(part.unions.size(), 0),
          inGap_(at(rows.rowCount + 1)),
          passing_(at(rows.rowCount + 1)) {
        for (std::int32_t u = 0; u < part.unionCount(); ++u) own_[at(u)] = ofParents(u);
        for (std::size_t s = 0; s < rows.strands.size(); ++s) {
            const Rows::Strand& strand = rows.strands[s];
            const Reach reach = places_.reach(static_cast<std::int32_t>(s));
            if (strand.gap == rowOf(strand.unionPlace)) {
                own_[at(strand.unionPlace)] = reach;
                drawOwn(strand.unionPlace);
            } else {
                passing_[at(strand.gap + 1)].push_back({strand.unionPlace, reach});
            }
        }
    }

    std::int32_t draw(std::int32_t count) {
        std::vector<MarkedLink> links = candidates();
        std::int32_t done = 0;
        while (done < count && !links.empty()) {
            for (MarkedLink& link : links) link.cost = costOf(link);
            std::stable_sort(links.begin(), links.end(),
                             [](const MarkedLink& a, const MarkedLink& b) { return a.cost < b.cost; });
            std::size_t kept = 0;
            for (std::size_t i = 0; i < links.size(); ++i) {
                // What has been drawn since may be in the way; then it waits for the next round.
                if (done < count && (i == 0 || costOf(links[i]) <= links[0].cost)) {
                    take(links[i]);
                    ++done;
                } else {
                    links[kept++] = links[i];
                }
            }
            links.resize(kept);
        }
        return done;
    }

private:
    struct Passing {
        std::int32_t unionPlace;
        Reach reach;
    };

    std::int32_t parentOf(std::int32_t u) const {
        const auto& two = part_.partners[at(u)];
        return two[1] < 0 || (two[0] >= 0 && marked_.partner[at(u)] != 1) ? two[0] : two[1];
    }
    std::int32_t rowOf(std::int32_t u) const { return rows_.row[at(chains_.chain[at(parentOf(u))])]; }
    std::int32_t placeOf(std::int32_t person, std::int32_t extra) const {
        return places_.of({chains_.chain[at(person)], 2 * chains_.slot[at(person)] + extra});
    }

    // Of a union that draws nothing else.
    Reach ofParents(std::int32_t u) const {
        const auto& two = part_.partners[at(u)];
        std::int32_t place = 0;
        if (marked_.partner[at(u)] == 0 && two[0] >= 0 && two[1] >= 0) {
            const bool zeroFirst = chains_.slot[at(two[0])] < chains_.slot[at(two[1])];
            place = placeOf(two[zeroFirst ? 0 : 1], 1);
        } else {
            place = placeOf(parentOf(u), 0);
        }
        Reach reach;
        reach.aboveLow = place;
        reach.aboveHigh = place;
        return reach;
    }

    void drawOwn(std::int32_t u) {
        if (drawn_[at(u)] != 0) return;
        drawn_[at(u)] = 1;
        inGap_[at(rowOf(u) + 1)].push_back(u);
    }

    std::vector<MarkedLink> candidates() const {
        std::vector<MarkedLink> links;
        for (std::int32_t u = 0; u < part_.unionCount(); ++u) {
            const auto& two = part_.partners[at(u)];
            const std::int32_t row = rowOf(u);
            const auto isInRow = [&](std::int32_t person, std::int32_t other) {
                return rows_.row[at(chains_.chain[at(person)])] == other;
            };
            const bool isApart = two[0] >= 0 && two[1] >= 0 && !chains_.areNeighbours(two[0], two[1]);
            if (isApart && marked_.partner[at(u)] == 2 && forced_.partner[at(u)] == 0 && isInRow(two[1], row))
                links.push_back({u, two[1], 0, true});
            const std::size_t first = part_.children.countBefore(u);
            for (std::size_t i = 0; i < part_.children[u].size(); ++i) {
                const std::int32_t child = part_.children[u][i];
                if (marked_.child[first + i] == 0 || forced_.child[first + i] != 0) continue;
                if (isInRow(child, row + 1)) links.push_back({u, child, first + i, false});
            }
        }
        return links;
    }

    Reach with(const MarkedLink& link) const {
        Reach reach = own_[at(link.unionPlace)];
        const std::int32_t place = placeOf(link.person, 0);
        (link.isPartner ? reach.aboveLow : reach.belowLow) =
            std::min(link.isPartner ? reach.aboveLow : reach.belowLow, place);
        (link.isPartner ? reach.aboveHigh : reach.belowHigh) =
            std::max(link.isPartner ? reach.aboveHigh : reach.belowHigh, place);
        return reach;
    }

    std::int64_t costOf(const MarkedLink& link) const {
        const Reach after = with(link);
        const Reach& before = own_[at(link.unionPlace)];
        const bool wasDrawn = drawn_[at(link.unionPlace)] != 0;
        std::int64_t cost = 0;
        const auto add = [&](const Reach& other) {
            cost += cross(after, other) - (wasDrawn ? cross(before, other) : 0);
        };
        const std::size_t gap = at(rowOf(link.unionPlace) + 1);
        for (const std::int32_t other : inGap_[gap]) {
            if (other != link.unionPlace) add(own_[at(other)]);
        }
        for (const Passing& other : passing_[gap]) add(other.reach);
        return cost;
    }

    void take(const MarkedLink& link) {
        own_[at(link.unionPlace)] = with(link);
        drawOwn(link.unionPlace);
        if (link.isPartner) {
            marked_.partner[at(link.unionPlace)] = 0;
        } else {
            marked_.child[link.link] = 0;
        }
    }

    const Component& part_;
    const Chains& chains_;
    const Rows& rows_;
    Places places_;
    const MarkedLinks& forced_;
    MarkedLinks& marked_;
    std::vector<Reach> own_;           // by union
    std::vector<std::uint8_t> drawn_;  // by union: whether it has a strand in the gap below its partners
    std::vector<std::vector<std::int32_t>> inGap_;  // by gap + 1
    std::vector<std::vector<Passing>> passing_;     // by gap + 1
};

}  // namespace

std::int32_t drawBestLinks(const Component& part, const Chains& chains, const Rows& rows,
                           const RowOrder& order, std::int32_t count, const MarkedLinks& forced,
                           MarkedLinks& marked) {
    return DrawnMarks(part, chains, rows, order, forced, marked).draw(count);
}

}  // namespace olvane::charts
