// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From the first sheet to the last, each takes as much as it may. Where a number of sheets is given, scales from the
// largest downward are tried, until no box is cut or the picture would become much smaller.

#include <olvane/draw/SheetPlan.h>

#include <algorithm>
#include <cmath>
#include <optional>
#include <stdexcept>
#include <utility>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::draw {

namespace {

// A seam may lie so far before the end of its sheet.
constexpr double kSearchedShare = 1.0 / 7;

struct Interval {
    double from;
    double to;
};

// Counts what a cut does to intervals, in logarithmic time.
class CutCosts {
public:
    // Intervals no longer than strip are whole on one of two neighbours, wherever the seam is.
    CutCosts(const std::vector<Interval>& intervals, double strip) {
        for (const Interval& interval : intervals) {
            from_.push_back(interval.from);
            to_.push_back(interval.to);
            if (interval.to - interval.from <= strip) continue;
            longFrom_.push_back(interval.from + strip / 2);
            longTo_.push_back(interval.to - strip / 2);
        }
        for (auto* list : {&from_, &to_, &longFrom_, &longTo_}) kin::mergeSort(list->begin(), list->end());
    }

    std::size_t crossed(double cut) const { return inside(from_, to_, cut); }
    std::size_t nowhereWhole(double cut) const { return inside(longFrom_, longTo_, cut); }

    // The best seam between two places.
    double best(double low, double high) const {
        double best = high;
        const auto consider = [&](double cut) {
            if (cut < low || cut > high) return;
            const auto cost = std::pair(nowhereWhole(cut), crossed(cut));
            const auto least = std::pair(nowhereWhole(best), crossed(best));
            if (cost < least || (cost == least && cut > best)) best = cut;
        };
        for (const auto* edges : {&from_, &to_, &longFrom_, &longTo_}) {
            for (auto it = std::lower_bound(edges->begin(), edges->end(), low);
                 it != edges->end() && *it <= high; ++it) {
                consider(*it);
            }
        }
        return middleOfGap(best, low, high);
    }

private:
    static std::size_t inside(const std::vector<double>& from, const std::vector<double>& to, double cut) {
        const auto begun = std::lower_bound(from.begin(), from.end(), cut) - from.begin();
        const auto ended = std::upper_bound(to.begin(), to.end(), cut) - to.begin();
        return begun > ended ? static_cast<std::size_t>(begun - ended) : 0;
    }

    // The last place without a cut is the edge of the next box: half of the way back to the box before.
    double middleOfGap(double cut, double low, double high) const {
        if (crossed(cut) > 0 || cut >= high) return cut;
        const auto end = std::upper_bound(to_.begin(), to_.end(), cut);
        const double left = end == to_.begin() ? low : std::max(low, *(end - 1));
        return nowhereWhole(left) == nowhereWhole(cut) ? (left + cut) / 2 : cut;
    }

    std::vector<double> from_;
    std::vector<double> to_;
    std::vector<double> longFrom_;
    std::vector<double> longTo_;
};

struct Cut {
    std::vector<double> starts;  // of the windows
    std::size_t nowhereWhole = 0;
    bool crossesBoxes = false;
};

// Windows of that room that cover a length from first on, no more than most of them; none where they do not suffice.
Cut cutLength(double first, double length, double room, double strip, const std::vector<Interval>& intervals,
              double most) {
    Cut cut;
    cut.starts.push_back(first);
    const double reached = length * (1 - 1e-12);  // what fits exactly may miss the last bit
    if (first + room >= reached) return cut;
    const CutCosts costs(intervals, strip);
    while (cut.starts.back() + room < reached) {
        if (static_cast<double>(cut.starts.size()) >= most) return {};
        const double high = cut.starts.back() + room - strip / 2;
        const double low = std::max(high - room * kSearchedShare, cut.starts.back() + strip);
        const double seam = costs.best(std::min(low, high), high);
        cut.nowhereWhole += costs.nowhereWhole(seam);
        cut.crossesBoxes = cut.crossesBoxes || costs.crossed(seam) > 0;
        cut.starts.push_back(seam - strip / 2);
    }
    return cut;
}

bool meets(const PictureArea& window, const PictureArea& area) {
    return area.x <= window.x + window.width && area.x + area.width >= window.x &&
           area.y <= window.y + window.height && area.y + area.height >= window.y;
}

class Planner {
public:
    Planner(const SheetSubject& subject, const SheetRequest& request, const Paper& paper)
        : subject_(subject), request_(request) {
        plan_.paper = paper;
        plan_.margin = request.margin;
        plan_.strip = request.strip;
    }

    // False where that many sheets do not suffice at that scale.
    bool tryScale(double scale, double mostRows, double mostColumns) {
        scale_ = scale;
        const double room = plan_.roomHeight() / scale;
        const double head = request_.headRoom / scale;
        rows_ = cutLength(-head, subject_.height, room, request_.strip / scale, verticals(), mostRows);
        columns_.clear();
        for (const double top : rows_.starts) {
            columns_.push_back(cutLength(0, subject_.width, plan_.roomWidth() / scale, request_.strip / scale,
                                         horizontals(top, top + room), mostColumns));
            if (columns_.back().starts.empty()) return false;
        }
        return !rows_.starts.empty();
    }

    // The scale that the room of all sheets would allow if seams could be anywhere.
    double mostScale() const {
        const double width = request_.columns * plan_.roomWidth() - (request_.columns - 1) * plan_.strip;
        const double height = request_.rows * plan_.roomHeight() - (request_.rows - 1) * plan_.strip;
        return std::min(width / std::max(subject_.width, 1e-9),
                        std::max(height - request_.headRoom, height / 4) / std::max(subject_.height, 1e-9));
    }

    // Of scales a little below the most, the one that leaves the fewest boxes cut; best of all one at which seams cross
    // no box at all.
    void fit() {
        constexpr int kScales = 40;
        constexpr double kStep = 0.004;
        const double most = mostScale();
        double best = 0;
        std::size_t least = 0;
        for (int i = 0; i < kScales && (best == 0 || least > 0); ++i) {
            const double scale = most * (1 - i * kStep);
            if (!tryScale(scale, request_.rows, request_.columns)) continue;
            if (best > 0 && cost() >= least) continue;
            best = scale;
            least = cost();
        }
        while (best == 0) {
            best = scale_ * 0.9;
            if (!tryScale(best, request_.rows, request_.columns)) best = 0;
        }
        tryScale(best, request_.rows, request_.columns);
    }

    SheetPlan plan() {
        plan_.scale = scale_;
        plan_.rows = static_cast<int>(rows_.starts.size());
        plan_.columns = 1;
        plan_.cutBoxes = boxesCut();
        for (int row = 0; row < plan_.rows; ++row) addRow(row);
        return plan_;
    }

private:
    std::vector<Interval> verticals() const {
        std::vector<Interval> intervals;
        for (const PictureArea& box : subject_.boxes) intervals.push_back({box.y, box.y + box.height});
        return intervals;
    }

    std::vector<Interval> horizontals(double top, double bottom) const {
        std::vector<Interval> intervals;
        for (const PictureArea& box : subject_.boxes) {
            if (box.y < bottom && box.y + box.height > top) intervals.push_back({box.x, box.x + box.width});
        }
        return intervals;
    }

    std::size_t boxesCut() const {
        std::size_t count = rows_.nowhereWhole;
        for (const Cut& columns : columns_) count += columns.nowhereWhole;
        return count;
    }

    std::size_t cost() const {
        bool crosses = rows_.crossesBoxes;
        for (const Cut& columns : columns_) crosses = crosses || columns.crossesBoxes;
        return 2 * boxesCut() + (crosses ? 1 : 0);
    }

    void addRow(int row) {
        const Cut& columns = columns_[static_cast<std::size_t>(row)];
        plan_.tops.push_back(rows_.starts[static_cast<std::size_t>(row)]);
        plan_.starts.push_back(columns.starts);
        plan_.columnsOfRow.push_back(static_cast<int>(columns.starts.size()));
        plan_.columns = std::max(plan_.columns, plan_.columnsOfRow.back());
        for (int column = 0; column < plan_.columnsOfRow.back(); ++column) {
            SheetWindow sheet{row, column, {}};
            sheet.window = {columns.starts[static_cast<std::size_t>(column)],
                            rows_.starts[static_cast<std::size_t>(row)], plan_.roomWidth() / scale_,
                            plan_.roomHeight() / scale_};
            const bool isFirst = row == 0 && column == 0;  // a headline would stand here
            if (isFirst || showsAnything(sheet.window)) plan_.sheets.push_back(sheet);
        }
    }

    bool showsAnything(const PictureArea& window) const {
        const auto isShown = [&window](const PictureArea& area) { return meets(window, area); };
        return std::any_of(subject_.boxes.begin(), subject_.boxes.end(), isShown) ||
               std::any_of(subject_.others.begin(), subject_.others.end(), isShown);
    }

    const SheetSubject& subject_;
    const SheetRequest& request_;
    SheetPlan plan_;
    double scale_ = 1;
    Cut rows_;
    std::vector<Cut> columns_;
};

void check(const SheetSubject& subject, const SheetRequest& request) {
    const Paper& paper = request.paper;
    for (const double length :
         {subject.width, subject.height, request.scale, request.margin, request.strip, request.headRoom}) {
        if (!std::isfinite(length) || length < 0) throw std::invalid_argument("a length that is none");
    }
    const double room = std::min(paper.width, paper.height) - 2 * request.margin;
    if (!std::isfinite(room) || !(room > 2 * request.strip) || request.rows < 1 || request.columns < 1) {
        throw std::invalid_argument("sheets without room");
    }
}

// Without strips; the rest is found when they are made.
double leastSheets(const SheetSubject& subject, const SheetRequest& request, const Paper& paper) {
    const double width = paper.width - 2 * request.margin;
    const double height = paper.height - 2 * request.margin;
    return std::max(1.0, std::ceil(subject.width * request.scale / width)) *
           std::max(1.0, std::ceil(subject.height * request.scale / height));
}

// Nothing where that is more than most.
std::optional<SheetPlan> planOn(const Paper& paper, const SheetSubject& subject, const SheetRequest& request,
                                double most) {
    Planner planner(subject, request, paper);
    if (request.scale <= 0) {
        planner.fit();
    } else if (leastSheets(subject, request, paper) > most || !planner.tryScale(request.scale, most, most)) {
        return std::nullopt;
    }
    return planner.plan();
}

bool isBetter(const SheetPlan& one, const SheetPlan& other, bool scaleGiven) {
    return scaleGiven ? one.sheets.size() < other.sheets.size() : one.scale > other.scale;
}

}  // namespace

SheetPlan planSheets(const SheetSubject& subject, const SheetRequest& request, double mostSheets) {
    check(subject, request);
    std::optional<SheetPlan> best = planOn(request.paper, subject, request, mostSheets);
    if (request.paper.mayTurn) {
        std::optional<SheetPlan> turned = planOn(request.paper.turned(), subject, request, mostSheets);
        if (turned && (!best || isBetter(*turned, *best, request.scale > 0))) best = std::move(turned);
    }
    if (!best || static_cast<double>(best->sheets.size()) > mostSheets) {
        throw std::length_error("too many sheets");
    }
    return *std::move(best);
}

double aspectOf(const SheetRequest& request) {
    const double width =
        request.columns * (request.paper.width - 2 * request.margin) - (request.columns - 1) * request.strip;
    const double height =
        request.rows * (request.paper.height - 2 * request.margin) - (request.rows - 1) * request.strip;
    return width / height;
}

}  // namespace olvane::draw
