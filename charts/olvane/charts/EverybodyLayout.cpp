// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyLayoutInternal.h>

#include <algorithm>
#include <cmath>
#include <utility>

#include <olvane/charts/EverybodyCollisionsInternal.h>
#include <olvane/charts/EverybodyFoldInternal.h>
#include <olvane/charts/EverybodyLevelsInternal.h>
#include <olvane/charts/EverybodyMarksInternal.h>
#include <olvane/kin/Index.h>
#include <olvane/kin/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

// What lies between a row and the first track under it, and between two tracks; and the steps in which gaps grow,
// so that one more bar more seldom moves all that lies below. Units: points.
struct TrackSizes {
    double margin = 9;
    double gap = 4;
    double step = 24;
};
constexpr double kLeastMargin = 5;
constexpr TrackSizes kUsualTracks;
constexpr TrackSizes kCompactTracks{6, 3, 1};
// How near to the side of its box a line may end.
constexpr double kBoxMargin = 5;
// How far a line that runs between boxes may be moved to keep it off others.
constexpr double kMostPassMove = 20;

class PartLayouter {
public:
    PartLayouter(PartLayout& layout, const BoxSizes& boxes, const EverybodyOptions& options,
                 const EarlierPicture* earlier)
        : l_(layout),
          boxes_(boxes),
          options_(options),
          earlier_(earlier),
          tracks_(options.compact ? kCompactTracks : kUsualTracks) {
        l_.trackGap = tracks_.gap;
    }

    // Couples first, since who stands side by side is in one row. Then rows, which need the couples; then the order
    // in the rows, which decides over crossings; then places, which keep the order; lines last. Where lines of two
    // families have no room beside one another after all, one becomes a mark: so this ends.
    void layOut() {
        l_.chains = weldCouples(l_.part);
        measureChains();
        if (earlier_ == nullptr || !placeAsBefore()) place();
        makePlacesExact(l_.rows, l_.order, l_.sizes, l_.left);
        report(ChartStep::lines);
        l_.lines = routeGaps(l_.rows, endRanges());
        for (auto ends = endsInTheWay(l_.rows, l_.lines); !ends.empty();
             ends = endsInTheWay(l_.rows, l_.lines)) {
            for (const std::int32_t end : ends) markLinkOfEnd(l_.part, l_.chains, l_.rows, end, l_.marked);
            rebuildRows();
            measureEnds();
            l_.lines = routeGaps(l_.rows, endRanges());
        }
        stackRows();
    }

private:
    // Of a part that is large enough to take a while.
    void report(ChartStep step, double share = 0) const {
        constexpr std::int32_t kFewPersons = 1000;
        if (options_.progress == nullptr || l_.part.personCount() < kFewPersons) return;
        (*options_.progress)(step, share);
    }

    void place() {
        report(ChartStep::rows);
        const std::vector<std::int32_t> rows = chooseRows(l_.part, l_.chains, levelEffort());
        l_.marked = marksForWantOfRoom(l_.part, l_.chains, roomForLines());
        if (options_.marks < 0) markAllSecondLinks(l_.part, l_.chains, rows, l_.marked);
        orderRows(rows);
        measureEnds();
        report(ChartStep::places);
        l_.left = placeNodes(l_.rows, l_.order, l_.sizes, 0, kSweeps);
    }

    // False where that is another family, or where lines would cross in spite of all marks.
    bool placeAsBefore() {
        std::vector<double> widths;
        widths.reserve(l_.part.persons.size());
        for (std::int32_t person = 0; person < l_.part.personCount(); ++person) {
            widths.push_back(boxes_.width(l_.part, person));
        }
        const EarlierRows kept = rowsAsBefore(l_.part, l_.chains, *earlier_, widths);
        if (kept.rowOfChain.empty()) return false;
        l_.marked = marksForWantOfRoom(l_.part, l_.chains, roomForLines());
        if (options_.marks < 0) {
            markAllSecondLinks(l_.part, l_.chains, kept.rowOfChain, l_.marked);
        } else if (options_.marks > 0) {
            markAsBefore(l_.part, *earlier_, l_.marked);
        }
        const std::vector<double> chainWidths = l_.sizes.width;
        l_.rows = makeRows(l_.part, l_.chains, kept.rowOfChain, l_.marked);
        l_.sizes.width.resize(at(l_.rows.nodeCount()), 0);
        std::vector<double> wanted =
            placesAsBefore(l_.part, l_.chains, l_.rows, kept, *earlier_, l_.sizes, widths);
        std::vector<std::uint8_t> isNew(wanted.size());
        for (std::size_t node = 0; node < wanted.size(); ++node)
            isNew[node] = std::isnan(wanted[node]) ? 1 : 0;
        l_.order = orderAsBefore(l_.part, l_.chains, l_.rows, *earlier_, l_.sizes, wanted);
        if (options_.marks < 0 && countCrossings(l_.rows, l_.order) > 0) {
            l_.sizes.width = chainWidths;
            return false;
        }
        measureEnds();
        report(ChartStep::places);
        l_.left = placesNear(l_.rows, l_.order, l_.sizes, wanted, isNew);
        middleBefore_ = kept.middle;
        return true;
    }

    static constexpr int kSweeps = 24;

    std::int64_t levelEffort() const { return 20'000'000 + 40 * std::int64_t{l_.part.personCount()}; }
    std::int64_t orderEffort() const {
        const std::int64_t once = 60'000'000 + 400 * std::int64_t{l_.part.personCount()};
        return options_.effort <= 0 ? 0 : once << std::min(options_.effort - 1, 16);
    }

    void measureChains() {
        l_.sizes.gap = boxes_.gapX;
        l_.sizes.passRoom = boxes_.gapX / 2;
        if (boxes_.each.empty()) l_.sizes.grid = (boxes_.boxWidth + boxes_.gapX) / 4;
        for (std::int32_t chain = 0; chain < l_.chains.count(); ++chain) {
            double width = -l_.sizes.gap;
            for (const std::int32_t person : l_.chains.persons[chain])
                width += boxes_.width(l_.part, person) + l_.sizes.gap;
            l_.sizes.width.push_back(width);
        }
    }

    // So many that ends stand kLeastStep apart.
    LineRoom roomForLines() const {
        constexpr double kLeastStep = 4;
        const auto linesIn = [](double points, double step, std::int32_t most) {
            return static_cast<std::int32_t>(std::clamp(points / step + 1, 1.0, static_cast<double>(most)));
        };
        LineRoom room(l_.part.persons.size());
        room.ofCouple = linesIn(2 * coupleEndRoom(), kLeastStep, LineRoom::kMostOfCouple);
        for (std::int32_t person = 0; person < l_.part.personCount(); ++person) {
            room.atBox[at(person)] = linesIn(2 * boxEndRoom(person), kLeastStep, LineRoom::kMostAtBox);
            const double up = boxes_.height(l_.part, person) / 2 - kMarriageMargin;
            room.marriages[at(person)] = linesIn(up, kMarriageGap, LineRoom::kMostOfCouple);
        }
        return room;
    }
    // How far from the middle a line may end at a box, and between two partners.
    double boxEndRoom(std::int32_t person) const {
        return std::max(0.0, boxes_.width(l_.part, person) / 2 - kBoxMargin);
    }
    double coupleEndRoom() const {
        constexpr double kCoupleMargin = 4;
        return std::max(0.0, l_.sizes.gap / 2 - kCoupleMargin);
    }

    void orderRows(const std::vector<std::int32_t>& unfolded) {
        l_.rows = makeRows(l_.part, l_.chains, unfolded, l_.marked);
        l_.order = walkOrder(l_.rows);
        fold();
        if (options_.marks < 0) {
            if (options_.drawFree) drawFree();
            return;
        }
        report(ChartStep::order);
        const MarkedLinks forced = l_.marked;
        l_.order = findOrder(l_.rows, orderEffort(), starts(),
                             [this](double share) { report(ChartStep::order, share); });
        for (std::int32_t left = options_.marks, batch = (left + 2) / 3; left > 0; left -= batch) {
            const std::int32_t count = std::min(left, batch);
            const std::int32_t made = markWorstLinks(l_.part, l_.chains, l_.rows, l_.order, count, l_.marked);
            if (made == 0) break;
            l_.marksMade += made;
            rebuildRows();
            reduceCrossings(l_.rows, l_.order, orderEffort() / 3);
        }
        constexpr std::int32_t kManyUnions = 10'000;
        if (options_.marks > 0 && l_.part.unionCount() <= kManyUnions) fromAllMarks(unfolded, forced);
    }

    void drawFree() {
        const MarkedLinks forced = marksForWantOfRoom(l_.part, l_.chains, roomForLines());
        if (drawFreeLinks(l_.part, l_.chains, l_.rows, l_.order, forced, l_.marked) > 0) rebuildRows();
    }

    // The other way to as many marks: all second links first, in an order without crossings, and then lines for those
    // that cross the fewest. It is taken where it ends in fewer crossings, which is where marks are many.
    void fromAllMarks(const std::vector<std::int32_t>& unfolded, const MarkedLinks& forced) {
        MarkedLinks allMarked = forced;
        markAllSecondLinks(l_.part, l_.chains, unfolded, allMarked);
        const std::int32_t all = marksIn(allMarked) - marksIn(forced);
        if (all / 3 > options_.marks) return;
        const Rows rows = std::move(l_.rows);
        const RowOrder order = std::move(l_.order);
        const MarkedLinks marked = std::move(l_.marked);
        l_.marked = std::move(allMarked);
        const std::int32_t lines = std::max(0, all - options_.marks);
        l_.rows = makeRows(l_.part, l_.chains, unfolded, l_.marked);
        l_.order = walkOrder(l_.rows);
        fold();
        const std::int32_t drawn =
            drawBestLinks(l_.part, l_.chains, l_.rows, l_.order, lines, forced, l_.marked);
        rebuildRows();
        if (lines > 0) reduceCrossings(l_.rows, l_.order, orderEffort() / 3);
        exchangeMarks(lines, forced);
        if (drawn == lines && countCrossings(l_.rows, l_.order) < countCrossings(rows, order)) {
            l_.marksMade = all - lines;
            return;
        }
        l_.rows = rows;
        l_.order = order;
        l_.marked = marked;
    }

    // Some of the worst lines become marks and as many marks lines, for as long as that removes crossings.
    void exchangeMarks(std::int32_t lines, const MarkedLinks& forced) {
        constexpr int kMostRounds = 6;
        std::int64_t crossings = countCrossings(l_.rows, l_.order);
        for (int round = 0; round < kMostRounds && crossings > 0; ++round) {
            const Rows rows = l_.rows;
            const RowOrder order = l_.order;
            const MarkedLinks marked = l_.marked;
            const std::int32_t wanted = std::min(lines, 2 + lines / 8);
            const std::int32_t made =
                markWorstLinks(l_.part, l_.chains, l_.rows, l_.order, wanted, l_.marked);
            rebuildRows();
            const std::int32_t drawn =
                drawBestLinks(l_.part, l_.chains, l_.rows, l_.order, made, forced, l_.marked);
            rebuildRows();
            reduceCrossings(l_.rows, l_.order, orderEffort() / 12);
            const std::int64_t after = countCrossings(l_.rows, l_.order);
            if (drawn == made && after < crossings) {
                crossings = after;
                continue;
            }
            l_.rows = rows;
            l_.order = order;
            l_.marked = marked;
            return;
        }
    }

    static std::int32_t marksIn(const MarkedLinks& marked) {
        const auto isMark = [](std::uint8_t mark) { return mark != 0; };
        return static_cast<std::int32_t>(std::count_if(marked.child.begin(), marked.child.end(), isMark) +
                                         std::count_if(marked.partner.begin(), marked.partner.end(), isMark));
    }

    int starts() const {
        constexpr std::int32_t kSmall = 200;
        return l_.rows.nodeCount() <= kSmall ? 4 : std::clamp(options_.effort, 1, 4);
    }

    void fold() {
        if (options_.foldAspect <= 0 || l_.rows.rowCount == 0) return;
        FoldSizes sizes;
        sizes.aspect = options_.foldAspect;
        for (const double width : l_.sizes.width) sizes.width.push_back(width + l_.sizes.gap);
        sizes.splitSiblings = options_.aspect > 0;
        sizes.rowPitch = 1.15 * (boxes_.mostHeight(l_.part) + boxes_.gapY);
        l_.rows = makeRows(l_.part, l_.chains, foldRows(l_.rows, l_.order, sizes), l_.marked);
        l_.order = walkOrder(l_.rows);
    }

    // With more marks there are fewer passes; all other nodes stay in their order.
    void rebuildRows() {
        const std::vector<std::int32_t> chainRows(l_.rows.row.begin(),
                                                  l_.rows.row.begin() + l_.rows.chainCount);
        Rows rows = makeRows(l_.part, l_.chains, chainRows, l_.marked);
        for (auto& nodes : l_.order.nodes) {
            std::size_t kept = 0;
            for (std::int32_t node : nodes) {
                if (l_.rows.isPass(node))
                    node = passAt(rows, l_.rows.passUnion[at(node - rows.chainCount)], l_.rows.row[at(node)]);
                if (node >= 0) nodes[kept++] = node;
            }
            nodes.resize(kept);
        }
        if (!l_.left.empty()) l_.left = placesIn(rows);
        l_.rows = std::move(rows);
    }

    // Of the nodes that are left in rows with fewer passes.
    std::vector<double> placesIn(const Rows& rows) const {
        std::vector<double> left(at(rows.nodeCount()), 0);
        std::copy_n(l_.left.begin(), rows.chainCount, left.begin());
        for (std::int32_t node = rows.chainCount; node < rows.nodeCount(); ++node) {
            const std::int32_t u = rows.passUnion[at(node - rows.chainCount)];
            left[at(node)] = l_.left[at(passAt(l_.rows, u, rows.row[at(node)]))];
        }
        return left;
    }

    static std::int32_t passAt(const Rows& rows, std::int32_t u, std::int32_t row) {
        if (rows.firstPass[at(u)] < 0 || row < rows.passRow[at(u)]) return -1;
        const std::int32_t node = rows.firstPass[at(u)] + row - rows.passRow[at(u)];
        if (node >= rows.nodeCount() || rows.passUnion[at(node - rows.chainCount)] != u) return -1;
        return node;
    }

    // Where ends lie in their nodes, now that it is known which chains are turned round.
    void measureEnds() {
        l_.sizes.width.resize(at(l_.rows.nodeCount()), 0);
        l_.sizes.endPlace.assign(l_.rows.ends.size(), 0);
        for (std::size_t e = 0; e < l_.rows.ends.size(); ++e) {
            const Rows::End& end = l_.rows.ends[e];
            if (l_.rows.isPass(end.node)) continue;
            const Box box = boxOf(l_.chains.persons[end.node][at(end.sub / 2)]);
            double place = (box.left + box.right) / 2;
            if (end.sub % 2 == 1) {
                place = l_.order.flipped[at(end.node)] != 0 ? box.left - l_.sizes.gap / 2
                                                            : box.right + l_.sizes.gap / 2;
            }
            l_.sizes.endPlace[e] = place;
        }
    }

    struct Box {
        double left;
        double right;
    };

    // In its chain.
    Box boxOf(std::int32_t person) const {
        const std::int32_t chain = l_.chains.chain[at(person)];
        const auto persons = l_.chains.persons[chain];
        const bool flipped = l_.order.flipped[at(chain)] != 0;
        const auto slot = at(l_.chains.slot[at(person)]);
        double left = 0;
        for (std::size_t i = flipped ? persons.size() - 1 : 0; i != slot; flipped ? --i : ++i) {
            left += boxes_.width(l_.part, persons[i]) + l_.sizes.gap;
        }
        return {left, left + boxes_.width(l_.part, person)};
    }

    std::vector<EndRange> endRanges() const {
        std::vector<EndRange> ranges;
        ranges.reserve(l_.rows.ends.size());
        for (std::size_t e = 0; e < l_.rows.ends.size(); ++e) {
            const Rows::End& end = l_.rows.ends[e];
            const double wanted = l_.left[at(end.node)] + l_.sizes.endPlace[e];
            double room = 0;
            if (!l_.rows.isPass(end.node)) {
                const std::int32_t person = l_.chains.persons[end.node][at(end.sub / 2)];
                room = end.sub % 2 == 1 ? coupleEndRoom() : boxEndRoom(person);
            }
            ranges.push_back({wanted, wanted - room, wanted + room});
        }
        for (std::int32_t chain = 0; chain < l_.rows.chainCount; ++chain) spreadEnds(chain, ranges);
        for (const auto& nodes : l_.order.nodes) givePassesRoom(nodes, ranges);
        return ranges;
    }

    // A pass may be moved between its neighbours, half of the way if that is another pass.
    void givePassesRoom(const std::vector<std::int32_t>& nodes, std::vector<EndRange>& ranges) const {
        const auto room = [this](std::int32_t beside, double apart) {
            return std::max(0.0,
                            l_.rows.isPass(beside) ? (apart - GapLines::kApart) / 2 : apart - kBoxMargin);
        };
        for (std::size_t i = 0; i < nodes.size(); ++i) {
            if (!l_.rows.isPass(nodes[i])) continue;
            const double x = l_.left[at(nodes[i])];
            double before = kMostPassMove;
            double behind = kMostPassMove;
            if (i > 0) {
                const double edge = l_.left[at(nodes[i - 1])] + l_.sizes.width[at(nodes[i - 1])];
                before = std::min(before, room(nodes[i - 1], x - edge));
            }
            if (i + 1 < nodes.size())
                behind = std::min(behind, room(nodes[i + 1], l_.left[at(nodes[i + 1])] - x));
            for (const std::int32_t e : l_.rows.endsAt[nodes[i]]) ranges[at(e)] = {x, x - before, x + behind};
        }
    }

    // Ends at one side of one box, or of one couple, stand beside one another in the order of where they lead to.
    void spreadEnds(std::int32_t chain, std::vector<EndRange>& ranges) const {
        std::vector<std::int32_t> ends(l_.rows.endsAt[chain].begin(), l_.rows.endsAt[chain].end());
        if (ends.size() < 2) return;
        const auto sameSide = [this](std::int32_t a, std::int32_t b) {
            return l_.rows.isBelow(a) == l_.rows.isBelow(b) &&
                   l_.rows.ends[at(a)].sub == l_.rows.ends[at(b)].sub;
        };
        kin::mergeSort(ends.begin(), ends.end(), [&](std::int32_t a, std::int32_t b) {
            if (l_.rows.isBelow(a) != l_.rows.isBelow(b)) return l_.rows.isBelow(a);
            if (l_.rows.ends[at(a)].sub != l_.rows.ends[at(b)].sub)
                return l_.rows.ends[at(a)].sub < l_.rows.ends[at(b)].sub;
            return otherSide(a, ranges) < otherSide(b, ranges);
        });
        for (std::size_t first = 0, last = 0; first < ends.size(); first = last) {
            for (last = first; last < ends.size() && sameSide(ends[first], ends[last]); ++last) {
            }
            const auto steps = static_cast<double>(last - first - 1);
            if (steps == 0) continue;
            const EndRange range = ranges[at(ends[first])];
            const double step = std::min(9.0, (range.high - range.low) / steps);
            for (std::size_t i = first; i < last; ++i) {
                ranges[at(ends[i])].wanted += step * (static_cast<double>(i - first) - steps / 2);
                ranges[at(ends[i])].low = ranges[at(ends[i])].wanted - (step - GapLines::kApart) / 2;
                ranges[at(ends[i])].high = ranges[at(ends[i])].wanted + (step - GapLines::kApart) / 2;
            }
        }
    }

    // The outermost places that the strand of an end has on the other side of its gap; far left where it has none.
    std::pair<double, double> otherSide(std::int32_t e, const std::vector<EndRange>& ranges) const {
        const Rows::Strand& strand = l_.rows.strands[at(l_.rows.strandOfEnd[at(e)])];
        const bool below = l_.rows.isBelow(e);
        const std::uint32_t first = strand.firstEnd + (below ? 0 : strand.aboveCount);
        const std::uint32_t count = below ? strand.aboveCount : strand.belowCount;
        if (count == 0) return {-1, -1};
        std::pair<double, double> places(ranges[first].wanted, ranges[first].wanted);
        for (std::uint32_t i = first; i < first + count; ++i) {
            places.first = std::min(places.first, ranges[i].wanted);
            places.second = std::max(places.second, ranges[i].wanted);
        }
        return places;
    }

    void stackRows() {
        l_.rowHeight.assign(at(l_.rows.rowCount), 0);
        for (std::int32_t person = 0; person < l_.part.personCount(); ++person) {
            double& height = l_.rowHeight[at(l_.rows.row[at(l_.chains.chain[at(person)])])];
            height = std::max(height, boxes_.height(l_.part, person));
        }
        l_.gapTop.assign(at(l_.rows.rowCount + 1), 0);
        double y = 0;
        for (std::int32_t gap = -1; gap < l_.rows.rowCount; ++gap) {
            if (gap >= 0) {
                l_.rowTop.push_back(y);
                y += l_.rowHeight[at(gap)];
            }
            const std::int32_t tracks = l_.lines.tracks[at(gap + 1)];
            const bool outside = gap < 0 || gap + 1 == l_.rows.rowCount;
            const double used = tracks > 0 ? (tracks - 1) * tracks_.gap : 0;
            const double height = outside ? (tracks > 0 ? used + tracks_.margin : 0) : gapHeight(gap, used);
            l_.gapTop[at(gap + 1)] = outside ? y + (gap < 0 ? 0 : tracks_.margin) : y + (height - used) / 2;
            y += height;
        }
        l_.height = y;
        for (std::int32_t node = 0; node < l_.rows.nodeCount(); ++node) {
            l_.width = std::max(l_.width, l_.left[at(node)] + l_.sizes.width[at(node)]);
        }
    }

    // As before where the tracks have room, if closer to the boxes; else in whole steps beyond the least.
    double gapHeight(std::int32_t gap, double used) const {
        const double before = heightBefore(gap);
        if (used + 2 * std::min(tracks_.margin, kLeastMargin) <= before) return before;
        const double least = boxes_.gapY;
        const double needed = used + 2 * tracks_.margin;
        return needed <= least ? least : least + std::ceil((needed - least) / tracks_.step) * tracks_.step;
    }

    // Of the gap below a row; less than 0 where there was none.
    double heightBefore(std::int32_t gap) const {
        if (at(gap) + 1 >= middleBefore_.size()) return -1;
        const double height = middleBefore_[at(gap) + 1] - middleBefore_[at(gap)] -
                              (l_.rowHeight[at(gap)] + l_.rowHeight[at(gap) + 1]) / 2;
        return height >= boxes_.gapY ? height : -1;  // not a number with a new row
    }

    PartLayout& l_;
    const BoxSizes& boxes_;
    const EverybodyOptions& options_;
    const EarlierPicture* earlier_;
    std::vector<double> middleBefore_;  // by row, in an earlier picture whose places are kept
    const TrackSizes& tracks_;
};

PartLayout layOutOnce(const Component& part, const BoxSizes& boxes, const EverybodyOptions& options,
                      const EarlierPicture* earlier) {
    PartLayout layout;
    layout.part = part;
    PartLayouter(layout, boxes, options, earlier).layOut();
    return layout;
}

// How high a sheet of that aspect is that the picture just fits on.
double sheetHeight(const PartLayout& layout, double aspect) {
    return std::max(layout.height, layout.width / aspect);
}

// Folding works with estimates of the height, so that some shares of the aspect about 1 are tried.
PartLayout layOutForPaper(const Component& part, const BoxSizes& boxes, EverybodyOptions options) {
    constexpr double kShares[] = {1, 0.93, 1.08, 0.86, 1.17, 0.75, 1.3, 0.6};
    constexpr std::int32_t kManyPersons = 20'000;
    PartLayout best;
    for (const double share : kShares) {
        options.foldAspect = options.aspect * share;
        PartLayout layout = layOutOnce(part, boxes, options, nullptr);
        const bool better =
            share == 1 || sheetHeight(layout, options.aspect) < sheetHeight(best, options.aspect);
        if (better) best = std::move(layout);
        if (part.personCount() > kManyPersons) break;
    }
    return best;
}

}  // namespace

PartLayout layOutPart(const Component& part, const BoxSizes& boxes, const EverybodyOptions& options,
                      const EarlierPicture* earlier) {
    const bool forPaper = options.aspect > 0 && earlier == nullptr;
    return forPaper ? layOutForPaper(part, boxes, options) : layOutOnce(part, boxes, options, earlier);
}

}  // namespace olvane::charts
