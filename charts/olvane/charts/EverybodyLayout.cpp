// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One part of the family, from its couples to its lines. Couples come first, since who stands side by side is in one row.
// Then rows, which need the couples; then the order in the rows, which decides over crossings; then places, which keep the
// order; lines last.

#include <olvane/charts/EverybodyLayoutInternal.h>

#include <cmath>

#include <olvane/charts/EverybodyCollisionsInternal.h>
#include <olvane/charts/EverybodyLevelsInternal.h>
#include <olvane/charts/EverybodyMarksInternal.h>
#include <olvane/charts/PartLayouterInternal.h>

namespace olvane::charts {

namespace {

constexpr TrackSizes kUsualTracks;
constexpr TrackSizes kCompactTracks{6, 3, 1};

constexpr int kSweeps = 24;  // over the places

}  // namespace

PartLayouter::PartLayouter(PartLayout& layout, const BoxSizes& boxes, const EverybodyOptions& options,
                           const EarlierPicture* earlier)
    : layout_(layout),
      boxes_(boxes),
      options_(options),
      earlier_(earlier),
      tracks_(options.compact ? kCompactTracks : kUsualTracks) {
    layout_.trackGap = tracks_.gap;
}

// Where lines of two families have no room beside one another after all, one of them becomes a mark, and lines are routed
// again. Every round has fewer lines, so this ends.
void PartLayouter::layOut() {
    layout_.chains = weldCouples(layout_.part);
    measureChains();
    if (earlier_ == nullptr || !placeAsBefore()) place();
    makePlacesExact(layout_.rows, layout_.order, layout_.sizes, layout_.left);
    report(ChartStep::lines);
    layout_.lines = routeGaps(layout_.rows, endRanges());
    for (auto ends = endsInTheWay(layout_.rows, layout_.lines); !ends.empty();
         ends = endsInTheWay(layout_.rows, layout_.lines)) {
        for (const std::int32_t end : ends)
            markLinkOfEnd(layout_.part, layout_.chains, layout_.rows, end, layout_.marked);
        rebuildRows();
        measureEnds();
        layout_.lines = routeGaps(layout_.rows, endRanges());
    }
    stackRows();
}

// Of a part that is large enough to take a while.
void PartLayouter::report(ChartStep step, double share) const {
    constexpr std::int32_t kFewPersons = 1000;
    if (options_.progress == nullptr || layout_.part.personCount() < kFewPersons) return;
    (*options_.progress)(step, share);
}

void PartLayouter::measureChains() {
    layout_.sizes.gap = boxes_.gapX;
    layout_.sizes.passRoom = boxes_.gapX / 2;
    if (boxes_.each.empty()) layout_.sizes.grid = (boxes_.boxWidth + boxes_.gapX) / 4;
    for (std::int32_t chain = 0; chain < layout_.chains.count(); ++chain) {
        double width = -layout_.sizes.gap;
        for (const std::int32_t person : layout_.chains.persons[chain])
            width += boxes_.width(layout_.part, person) + layout_.sizes.gap;
        layout_.sizes.width.push_back(width);
    }
}

void PartLayouter::place() {
    report(ChartStep::rows);
    const std::vector<std::int32_t> rows = chooseRows(layout_.part, layout_.chains, levelEffort());
    layout_.marked = marksForWantOfRoom(layout_.part, layout_.chains, roomForLines());
    if (options_.marks < 0) markAllSecondLinks(layout_.part, layout_.chains, rows, layout_.marked);
    orderRows(rows);
    measureEnds();
    report(ChartStep::places);
    layout_.left = placeNodes(layout_.rows, layout_.order, layout_.sizes, 0, kSweeps);
}

// False where that is another family, or where lines would cross in spite of all marks.
bool PartLayouter::placeAsBefore() {
    const std::vector<double> widths = boxWidths();
    const EarlierRows kept = rowsAsBefore(layout_.part, layout_.chains, *earlier_, widths);
    if (kept.rowOfChain.empty()) return false;
    layout_.marked = marksForWantOfRoom(layout_.part, layout_.chains, roomForLines());
    if (options_.marks < 0) {
        markAllSecondLinks(layout_.part, layout_.chains, kept.rowOfChain, layout_.marked);
    } else if (options_.marks > 0) {
        markAsBefore(layout_.part, *earlier_, layout_.marked);
    }
    const std::vector<double> chainWidths = layout_.sizes.width;
    layout_.rows = makeRows(layout_.part, layout_.chains, kept.rowOfChain, layout_.marked);
    layout_.sizes.width.resize(at(layout_.rows.nodeCount()), 0);
    std::vector<double> wanted =
        placesAsBefore(layout_.part, layout_.chains, layout_.rows, kept, *earlier_, layout_.sizes, widths);
    std::vector<std::uint8_t> isNew(wanted.size());
    for (std::size_t node = 0; node < wanted.size(); ++node) isNew[node] = std::isnan(wanted[node]) ? 1 : 0;
    layout_.order =
        orderAsBefore(layout_.part, layout_.chains, layout_.rows, *earlier_, layout_.sizes, wanted);
    if (options_.marks < 0 && countCrossings(layout_.rows, layout_.order) > 0) {
        layout_.sizes.width = chainWidths;
        return false;
    }
    measureEnds();
    report(ChartStep::places);
    layout_.left = placesNear(layout_.rows, layout_.order, layout_.sizes, wanted, isNew);
    middleBefore_ = kept.middle;
    return true;
}

std::vector<double> PartLayouter::boxWidths() const {
    std::vector<double> widths;
    widths.reserve(layout_.part.persons.size());
    for (std::int32_t person = 0; person < layout_.part.personCount(); ++person) {
        widths.push_back(boxes_.width(layout_.part, person));
    }
    return widths;
}

// As many lines as leave kLeastStep between their ends.
LineRoom PartLayouter::roomForLines() const {
    constexpr double kLeastStep = 4;
    const auto linesIn = [](double points, double step, std::int32_t most) {
        return static_cast<std::int32_t>(std::clamp(points / step + 1, 1.0, static_cast<double>(most)));
    };
    LineRoom room(layout_.part.persons.size());
    room.ofCouple = linesIn(2 * coupleEndRoom(), kLeastStep, LineRoom::kMostOfCouple);
    for (std::int32_t person = 0; person < layout_.part.personCount(); ++person) {
        room.atBox[at(person)] = linesIn(2 * boxEndRoom(person), kLeastStep, LineRoom::kMostAtBox);
        const double up = boxes_.height(layout_.part, person) / 2 - kMarriageMargin;
        room.marriages[at(person)] = linesIn(up, kMarriageGap, LineRoom::kMostOfCouple);
    }
    return room;
}

// How far from the middle a line may end at a box, and between two partners.
double PartLayouter::boxEndRoom(std::int32_t person) const {
    return std::max(0.0, boxes_.width(layout_.part, person) / 2 - kBoxMargin);
}

double PartLayouter::coupleEndRoom() const {
    constexpr double kCoupleMargin = 4;
    return std::max(0.0, layout_.sizes.gap / 2 - kCoupleMargin);
}

namespace {

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
