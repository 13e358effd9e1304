// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyMarksInternal.h>

#include <algorithm>
#include <limits>

#include <olvane/charts/EverybodyReachInternal.h>
#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

// A mark that may be a line again: to a child, or to partner 1 of a union. It would be an end of a piece; see DrawnMarks.
struct MarkedLink {
    std::int32_t unionPlace;
    std::int32_t person;
    std::size_t link;
    bool isPartner;
    std::int32_t piece;
    std::int64_t cost = 0;  // in crossings
};

// What each union draws in one gap, as the reach of a strand: by union, right below its partners; behind those, by strand,
// what runs on past a row.
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
          reach_(part.unions.size() + rows.strands.size()),
          drawn_(reach_.size(), 0),
          gapOf_(reach_.size(), 0),
          firstStrand_(part.unions.size() + 1, rows.strands.size()),
          inGap_(at(rows.rowCount + 1)) {
        for (std::int32_t u = 0; u < part.unionCount(); ++u) {
            reach_[at(u)] = ofParents(u);
            gapOf_[at(u)] = rowOf(u);
        }
        for (std::size_t s = rows.strands.size(); s-- > 0;) firstStrand_[at(rows.strands[s].unionPlace)] = s;
        for (std::size_t s = 0; s < rows.strands.size(); ++s) {
            const std::int32_t piece = pieceOf(s);
            reach_[at(piece)] = places_.reach(static_cast<std::int32_t>(s));
            gapOf_[at(piece)] = rows.strands[s].gap;
            drawPiece(piece);
        }
    }

    // Up to count links, in the order of their crossings; those with more than the most are left marks. throughPasses:
    // those from further up as well, along lines that run there already.
    std::int32_t draw(std::int32_t count, std::int64_t mostCrossings, bool throughPasses) {
        std::vector<MarkedLink> links = candidates(throughPasses);
        std::int32_t done = 0;
        while (done < count && !links.empty()) {
            for (MarkedLink& link : links) link.cost = costOf(link);
            kin::mergeSort(links.begin(), links.end(),
                           [](const MarkedLink& a, const MarkedLink& b) { return a.cost < b.cost; });
            if (links[0].cost > mostCrossings) break;
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
    std::int32_t pieceOf(std::size_t strand) const {
        const Rows::Strand& one = rows_.strands[strand];
        return one.gap == rowOf(one.unionPlace) ? one.unionPlace
                                                : part_.unionCount() + static_cast<std::int32_t>(strand);
    }
    // The piece in which a union's link would end at the row below a gap; -1 where nothing of it runs there.
    std::int32_t pieceIn(std::int32_t u, std::int32_t gap) const {
        if (gap == rowOf(u)) return u;
        for (std::size_t s = firstStrand_[at(u)]; s < rows_.strands.size(); ++s) {
            if (rows_.strands[s].unionPlace != u) break;
            if (rows_.strands[s].gap == gap) return pieceOf(s);
        }
        return -1;
    }

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

    void drawPiece(std::int32_t piece) {
        if (drawn_[at(piece)] != 0) return;
        drawn_[at(piece)] = 1;
        inGap_[at(gapOf_[at(piece)] + 1)].push_back(piece);
    }

    std::vector<MarkedLink> candidates(bool throughPasses) const {
        std::vector<MarkedLink> links;
        for (std::int32_t u = 0; u < part_.unionCount(); ++u) {
            const auto& two = part_.partners[at(u)];
            const std::int32_t row = rowOf(u);
            const auto isInRow = [&](std::int32_t person, std::int32_t other) {
                return rows_.row[at(chains_.chain[at(person)])] == other;
            };
            const bool isApart = two[0] >= 0 && two[1] >= 0 && !chains_.areNeighbours(two[0], two[1]);
            if (isApart && marked_.partner[at(u)] == 2 && forced_.partner[at(u)] == 0 && isInRow(two[1], row))
                links.push_back({u, two[1], 0, true, u});
            const std::size_t first = part_.children.countBefore(u);
            for (std::size_t i = 0; i < part_.children[u].size(); ++i) {
                const std::int32_t child = part_.children[u][i];
                if (marked_.child[first + i] == 0 || forced_.child[first + i] != 0) continue;
                const std::int32_t gap = rows_.row[at(chains_.chain[at(child)])] - 1;
                const std::int32_t piece = gap == row || throughPasses ? pieceIn(u, gap) : -1;
                if (piece >= 0) links.push_back({u, child, first + i, false, piece});
            }
        }
        return links;
    }

    Reach with(const MarkedLink& link) const {
        Reach reach = reach_[at(link.piece)];
        const std::int32_t place = placeOf(link.person, 0);
        (link.isPartner ? reach.aboveLow : reach.belowLow) =
            std::min(link.isPartner ? reach.aboveLow : reach.belowLow, place);
        (link.isPartner ? reach.aboveHigh : reach.belowHigh) =
            std::max(link.isPartner ? reach.aboveHigh : reach.belowHigh, place);
        return reach;
    }

    std::int64_t costOf(const MarkedLink& link) const {
        const Reach after = with(link);
        const Reach& before = reach_[at(link.piece)];
        const bool wasDrawn = drawn_[at(link.piece)] != 0;
        std::int64_t cost = 0;
        const auto add = [&](const Reach& other) {
            cost += cross(after, other) - (wasDrawn ? cross(before, other) : 0);
        };
        for (const std::int32_t other : inGap_[at(gapOf_[at(link.piece)] + 1)]) {
            if (other != link.piece) add(reach_[at(other)]);
        }
        return cost;
    }

    void take(const MarkedLink& link) {
        reach_[at(link.piece)] = with(link);
        drawPiece(link.piece);
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
    std::vector<Reach> reach_;                      // by piece
    std::vector<std::uint8_t> drawn_;               // by piece
    std::vector<std::int32_t> gapOf_;               // by piece
    std::vector<std::size_t> firstStrand_;          // by union
    std::vector<std::vector<std::int32_t>> inGap_;  // by gap + 1: pieces that are drawn
};

}  // namespace

std::int32_t drawBestLinks(const Component& part, const Chains& chains, const Rows& rows,
                           const RowOrder& order, std::int32_t count, const MarkedLinks& forced,
                           MarkedLinks& marked) {
    constexpr std::int64_t kAny = std::numeric_limits<std::int64_t>::max();
    return DrawnMarks(part, chains, rows, order, forced, marked).draw(count, kAny, false);
}

std::int32_t drawFreeLinks(const Component& part, const Chains& chains, const Rows& rows,
                           const RowOrder& order, const MarkedLinks& forced, MarkedLinks& marked) {
    constexpr std::int32_t kAll = std::numeric_limits<std::int32_t>::max();
    return DrawnMarks(part, chains, rows, order, forced, marked).draw(kAll, 0, true);
}

}  // namespace olvane::charts
