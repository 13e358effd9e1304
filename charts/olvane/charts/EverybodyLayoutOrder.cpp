// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of the rows of one part, and which of its links become marks: those that cross the most lines, or all but those
// that cross the fewest, whichever ends in fewer crossings.

#include <olvane/charts/PartLayouterInternal.h>

#include <olvane/charts/EverybodyFoldInternal.h>
#include <olvane/charts/EverybodyMarksInternal.h>

namespace olvane::charts {

void PartLayouter::orderRows(const std::vector<std::int32_t>& unfolded) {
    layout_.rows = makeRows(layout_.part, layout_.chains, unfolded, layout_.marked);
    layout_.order = walkOrder(layout_.rows);
    fold();
    if (options_.marks < 0) {
        if (options_.drawFree) drawFree();
        return;
    }
    report(ChartStep::order);
    const MarkedLinks forced = layout_.marked;
    layout_.order = findOrder(layout_.rows, orderEffort(), starts(),
                              [this](double share) { report(ChartStep::order, share); });
    for (std::int32_t left = options_.marks, batch = (left + 2) / 3; left > 0; left -= batch) {
        const std::int32_t count = std::min(left, batch);
        const std::int32_t made =
            markWorstLinks(layout_.part, layout_.chains, layout_.rows, layout_.order, count, layout_.marked);
        if (made == 0) break;
        layout_.marksMade += made;
        rebuildRows();
        reduceCrossings(layout_.rows, layout_.order, orderEffort() / 3);
    }
    constexpr std::int32_t kManyUnions = 10'000;
    if (options_.marks > 0 && layout_.part.unionCount() <= kManyUnions) fromAllMarks(unfolded, forced);
}

void PartLayouter::fold() {
    if (options_.foldAspect <= 0 || layout_.rows.rowCount == 0) return;
    FoldSizes sizes;
    sizes.aspect = options_.foldAspect;
    for (const double width : layout_.sizes.width) sizes.width.push_back(width + layout_.sizes.gap);
    sizes.splitSiblings = options_.aspect > 0;
    sizes.rowPitch = 1.15 * (boxes_.mostHeight(layout_.part) + boxes_.gapY);
    layout_.rows =
        makeRows(layout_.part, layout_.chains, foldRows(layout_.rows, layout_.order, sizes), layout_.marked);
    layout_.order = walkOrder(layout_.rows);
}

void PartLayouter::drawFree() {
    const MarkedLinks forced = marksForWantOfRoom(layout_.part, layout_.chains, roomForLines());
    if (drawFreeLinks(layout_.part, layout_.chains, layout_.rows, layout_.order, forced, layout_.marked) > 0)
        rebuildRows();
}

// The other way to as many marks: all second links first, in an order without crossings, and then lines for those
// that cross the fewest. It is taken where it ends in fewer crossings, which is where marks are many.
void PartLayouter::fromAllMarks(const std::vector<std::int32_t>& unfolded, const MarkedLinks& forced) {
    MarkedLinks allMarked = forced;
    markAllSecondLinks(layout_.part, layout_.chains, unfolded, allMarked);
    const std::int32_t all = marksIn(allMarked) - marksIn(forced);
    if (all / 3 > options_.marks) return;
    const Rows rows = std::move(layout_.rows);
    const RowOrder order = std::move(layout_.order);
    const MarkedLinks marked = std::move(layout_.marked);
    layout_.marked = std::move(allMarked);
    const std::int32_t lines = std::max(0, all - options_.marks);
    layout_.rows = makeRows(layout_.part, layout_.chains, unfolded, layout_.marked);
    layout_.order = walkOrder(layout_.rows);
    fold();
    const std::int32_t drawn = drawBestLinks(layout_.part, layout_.chains, layout_.rows, layout_.order, lines,
                                             forced, layout_.marked);
    rebuildRows();
    if (lines > 0) reduceCrossings(layout_.rows, layout_.order, orderEffort() / 3);
    exchangeMarks(lines, forced);
    if (drawn == lines && countCrossings(layout_.rows, layout_.order) < countCrossings(rows, order)) {
        layout_.marksMade = all - lines;
        return;
    }
    layout_.rows = rows;
    layout_.order = order;
    layout_.marked = marked;
}

// Some of the worst lines become marks and as many marks lines, for as long as that removes crossings.
void PartLayouter::exchangeMarks(std::int32_t lines, const MarkedLinks& forced) {
    constexpr int kMostRounds = 6;
    std::int64_t crossings = countCrossings(layout_.rows, layout_.order);
    for (int round = 0; round < kMostRounds && crossings > 0; ++round) {
        const Rows rows = layout_.rows;
        const RowOrder order = layout_.order;
        const MarkedLinks marked = layout_.marked;
        const std::int32_t wanted = std::min(lines, 2 + lines / 8);
        const std::int32_t made =
            markWorstLinks(layout_.part, layout_.chains, layout_.rows, layout_.order, wanted, layout_.marked);
        rebuildRows();
        const std::int32_t drawn = drawBestLinks(layout_.part, layout_.chains, layout_.rows, layout_.order,
                                                 made, forced, layout_.marked);
        rebuildRows();
        reduceCrossings(layout_.rows, layout_.order, orderEffort() / 12);
        const std::int64_t after = countCrossings(layout_.rows, layout_.order);
        if (drawn == made && after < crossings) {
            crossings = after;
            continue;
        }
        layout_.rows = rows;
        layout_.order = order;
        layout_.marked = marked;
        return;
    }
}

std::int32_t PartLayouter::marksIn(const MarkedLinks& marked) {
    const auto isMark = [](std::uint8_t mark) { return mark != 0; };
    return static_cast<std::int32_t>(std::count_if(marked.child.begin(), marked.child.end(), isMark) +
                                     std::count_if(marked.partner.begin(), marked.partner.end(), isMark));
}

// With more marks there are fewer passes; all other nodes stay in their order.
void PartLayouter::rebuildRows() {
    const std::vector<std::int32_t> chainRows(layout_.rows.row.begin(),
                                              layout_.rows.row.begin() + layout_.rows.chainCount);
    Rows rows = makeRows(layout_.part, layout_.chains, chainRows, layout_.marked);
    for (auto& nodes : layout_.order.nodes) {
        std::size_t kept = 0;
        for (std::int32_t node : nodes) {
            if (layout_.rows.isPass(node))
                node = passAt(rows, layout_.rows.passUnion[at(node - rows.chainCount)],
                              layout_.rows.row[at(node)]);
            if (node >= 0) nodes[kept++] = node;
        }
        nodes.resize(kept);
    }
    if (!layout_.left.empty()) layout_.left = placesIn(rows);
    layout_.rows = std::move(rows);
}

// Of the nodes that are left in rows with fewer passes.
std::vector<double> PartLayouter::placesIn(const Rows& rows) const {
    std::vector<double> left(at(rows.nodeCount()), 0);
    std::copy_n(layout_.left.begin(), rows.chainCount, left.begin());
    for (std::int32_t node = rows.chainCount; node < rows.nodeCount(); ++node) {
        const std::int32_t u = rows.passUnion[at(node - rows.chainCount)];
        left[at(node)] = layout_.left[at(passAt(layout_.rows, u, rows.row[at(node)]))];
    }
    return left;
}

std::int32_t PartLayouter::passAt(const Rows& rows, std::int32_t u, std::int32_t row) {
    if (rows.firstPass[at(u)] < 0 || row < rows.passRow[at(u)]) return -1;
    const std::int32_t node = rows.firstPass[at(u)] + row - rows.passRow[at(u)];
    if (node >= rows.nodeCount() || rows.passUnion[at(node - rows.chainCount)] != u) return -1;
    return node;
}

std::int64_t PartLayouter::orderEffort() const {
    const std::int64_t once = 60'000'000 + 400 * std::int64_t{layout_.part.personCount()};
    return options_.effort <= 0 ? 0 : once << std::min(options_.effort - 1, 16);
}

int PartLayouter::starts() const {
    constexpr std::int32_t kSmall = 200;
    return layout_.rows.nodeCount() <= kSmall ? 4 : std::clamp(options_.effort, 1, 4);
}

}  // namespace olvane::charts
