// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Years at marriage lines. A few places along the lines of each family are tried in turn, the longest line first; what
// could be in the way is looked for in the rows that they lie in.

#include <olvane/picture/MarriageLabels.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <span>
#include <utility>

#include <olvane/picture/RectSweepInternal.h>  // for Rect

namespace olvane::picture {

namespace {

// Parts of a line's length, in the order in which they are tried.
constexpr auto kParts = std::to_array<double>(
    {0.5, 0.25, 0.75, 0.375, 0.625, 0.125, 0.875, 0.0625, 0.9375, 0.1875, 0.8125, 0.3125, 0.6875});
constexpr double kRowHeight = 40;  // points
// What is least to be covered counts most.
constexpr int kLabelCovered = 10000;
constexpr int kBoxCovered = 100;

bool isLevel(const Line& line) {
    return line.y1 == line.y2 && line.x1 != line.x2;
}

double lengthOf(const Line& line) {
    return std::abs(line.x2 - line.x1) + std::abs(line.y2 - line.y1);
}

// Level ones first, the longest of them first; then the others as they stand.
std::vector<Line> marriageLines(const Picture& picture, const Family& family) {
    std::vector<Line> lines;
    for (const Line& line : picture.linesOf(family)) {
        if (line.role != LineRole::marriage) continue;
        const double length = isLevel(line) ? lengthOf(line) : 0;
        std::size_t place = lines.size();
        while (place > 0 && length > (isLevel(lines[place - 1]) ? lengthOf(lines[place - 1]) : 0)) --place;
        lines.insert(lines.begin() + static_cast<std::ptrdiff_t>(place), line);
    }
    return lines;
}

Rect rectOf(const Line& line) {
    return {std::min(line.x1, line.x2), std::min(line.y1, line.y2), std::max(line.x1, line.x2),
            std::max(line.y1, line.y2)};
}

Rect rectOf(const Box& box) {
    return {box.x, box.y, box.x + static_cast<double>(box.width), box.y + static_cast<double>(box.height)};
}

// What only touches does not meet, whatever was rounded.
bool meet(const Rect& a, const Rect& b) {
    constexpr double kTouch = 0.001;
    return a.x1 + kTouch < b.x2 && b.x1 + kTouch < a.x2 && a.y1 + kTouch < b.y2 && b.y1 + kTouch < a.y2;
}

class LabelPlacing {
public:
    LabelPlacing(const Picture& picture, double size)
        : picture_(picture), size_(size), lines_(picture.families.size()), places_(picture.families.size()) {}

    std::vector<LabelPlace> place() {
        for (std::size_t f = 0; f < lines_.size(); ++f) {
            lines_[f] = marriageLines(picture_, picture_.families[f]);
            if (!lines_[f].empty()) places_[f] = usualPlace(lines_[f].front());
        }
        findCrowded();
        findObstacles();
        for (std::size_t i = 0; i < crowded_.size(); ++i) placeAmongOthers(i);
        return std::move(places_);
    }

private:
    static LabelPlace usualPlace(const Line& line) {
        return {(line.x1 + line.x2) / 2, (line.y1 + line.y2) / 2,
                isLevel(line) ? LabelSide::above : LabelSide::right};
    }

    // Families with a marriage line, of somebody who has another such family.
    void findCrowded() {
        std::vector<int> marriages(picture_.boxes.size(), 0);
        const auto isDrawn = [this](std::size_t f) { return !lines_[f].empty() && !picture_.isRound(); };
        for (std::size_t f = 0; f < lines_.size(); ++f) {
            if (!isDrawn(f)) continue;
            for (const Index box : picture_.parents(picture_.families[f]))
                ++marriages[static_cast<std::size_t>(box)];
        }
        for (std::size_t f = 0; f < lines_.size(); ++f) {
            const auto parents = picture_.parents(picture_.families[f]);
            const bool isOneOfSeveral = std::any_of(parents.begin(), parents.end(), [&](Index box) {
                return marriages[static_cast<std::size_t>(box)] > 1;
            });
            if (isDrawn(f) && isOneOfSeveral) crowded_.push_back(f);
        }
    }

    // All that may lie under a text at the lines of each crowded family.
    void findObstacles() {
        if (crowded_.empty()) return;
        obstacles_.resize(crowded_.size());
        for (const std::size_t f : crowded_) reaches_.push_back(reachOf(lines_[f]));
        makeRows();
        for (const Box& box : picture_.boxes) addObstacle(rectOf(box), &Obstacles::boxes);
        for (const Line& line : picture_.lines) addObstacle(rectOf(line), &Obstacles::lines);
    }

    // Each crowded family in every row that its reach touches, so that a box or line is held against few of them.
    void makeRows() {
        constexpr double kMostRows = 4096;
        double last = reaches_.front().y2;
        top_ = reaches_.front().y1;
        for (const Rect& reach : reaches_) {
            top_ = std::min(top_, reach.y1);
            last = std::max(last, reach.y2);
        }
        rowHeight_ = std::max((last - top_) / kMostRows, kRowHeight);
        const double count = (last - top_) / rowHeight_;
        rows_.resize(static_cast<std::size_t>(count < kMostRows ? count : kMostRows) + 1);
        for (std::size_t i = 0; i < reaches_.size(); ++i) {
            for (std::size_t row = rowOf(reaches_[i].y1); row <= rowOf(reaches_[i].y2); ++row) {
                rows_[row].push_back(i);
            }
        }
    }

    std::size_t rowOf(double y) const {
        const double row = (y - top_) / rowHeight_;
        if (!(row > 0)) return 0;
        return row < static_cast<double>(rows_.size()) ? static_cast<std::size_t>(row) : rows_.size() - 1;
    }

    // Where both are in several rows, they meet in the first of them.
    template <class List>
    void addObstacle(const Rect& rect, List list) {
        const std::size_t first = rowOf(rect.y1);
        for (std::size_t row = first; row <= rowOf(rect.y2); ++row) {
            for (const std::size_t i : rows_[row]) {
                if (row != std::max(first, rowOf(reaches_[i].y1)) || !meet(rect, reaches_[i])) continue;
                (obstacles_[i].*list).push_back(rect);
            }
        }
    }

    Rect reachOf(std::span<const Line> lines) const {
        Rect reach = rectOf(lines.front());
        for (const Line& line : lines) {
            const Rect rect = rectOf(line);
            reach = {std::min(reach.x1, rect.x1), std::min(reach.y1, rect.y1), std::max(reach.x2, rect.x2),
                     std::max(reach.y2, rect.y2)};
        }
        const double width = (kLabelWidth + kLabelGap) * size_;
        // Twice a text, so that two texts that meet are in the row of either one's line.
        const double height = 2 * (kLabelHeight + kLabelGap) * size_;
        return {reach.x1 - width, reach.y1 - height, reach.x2 + width, reach.y2 + height};
    }

    Rect textRect(const LabelPlace& place) const {
        const double width = kLabelWidth * size_;
        const double height = kLabelHeight * size_;
        const double gap = kLabelGap * size_;
        if (place.side == LabelSide::right) {
            return {place.x + gap, place.y - height / 2, place.x + gap + width, place.y + height / 2};
        }
        const double top = place.side == LabelSide::above ? place.y - gap - height : place.y + gap;
        return {place.x - width / 2, top, place.x + width / 2, top + height};
    }

    void placeAmongOthers(std::size_t i) {
        LabelPlace& best = places_[crowded_[i]];
        int least = coveredBy(i, best);
        for (const Line& line : lines_[crowded_[i]]) {
            for (const double part : kParts) {
                if (least == 0) return;
                for (const LabelPlace& place : placesAt(line, part)) {
                    const int covered = coveredBy(i, place);
                    if (covered >= least) continue;
                    best = place;
                    least = covered;
                }
            }
        }
    }

    std::vector<LabelPlace> placesAt(const Line& line, double part) const {
        const double x = line.x1 + (line.x2 - line.x1) * part;
        const double y = line.y1 + (line.y2 - line.y1) * part;
        if (!isLevel(line)) return {{x, y, LabelSide::right}};
        // A text reaches no farther than its line, or as far on both sides of one that is short.
        const double most = std::max(0.0, (lengthOf(line) - kLabelWidth * size_) / 2);
        const double middle = (line.x1 + line.x2) / 2;
        const double within = std::clamp(x, middle - most, middle + most);
        return {{within, y, LabelSide::above}, {within, y, LabelSide::below}};
    }

    int coveredBy(std::size_t i, const LabelPlace& place) const {
        const Rect text = textRect(place);
        const Obstacles& near = obstacles_[i];
        int covered = 0;
        for (const std::size_t other : rows_[rowOf(place.y)]) {
            if (other < i && meet(text, textRect(places_[crowded_[other]]))) covered += kLabelCovered;
        }
        for (const Rect& box : near.boxes) covered += meet(text, box) ? kBoxCovered : 0;
        for (const Rect& line : near.lines) covered += meet(text, line) ? 1 : 0;
        return covered;
    }

    struct Obstacles {
        std::vector<Rect> boxes;
        std::vector<Rect> lines;
    };

    const Picture& picture_;
    double size_;
    std::vector<std::vector<Line>> lines_;  // of marriage, for each family
    std::vector<LabelPlace> places_;
    std::vector<std::size_t> crowded_;
    std::vector<Rect> reaches_;  // beside crowded_, as obstacles_
    std::vector<Obstacles> obstacles_;
    std::vector<std::vector<std::size_t>> rows_;  // of places in crowded_, from the top down
    double top_ = 0;
    double rowHeight_ = kRowHeight;
};

}  // namespace

std::vector<LabelPlace> marriageLabelPlaces(const Picture& picture, double size) {
    return LabelPlacing(picture, size).place();
}

LabelOffset labelOffsetOf(LabelSide side, double size) {
    const double gap = kLabelGap * size;
    switch (side) {
        case LabelSide::above:
            return {0, -gap};
        case LabelSide::below:
            return {0, gap + kLabelHeight * size};
        case LabelSide::right:
            return {gap, size / 3};
        case LabelSide::none:
            break;
    }
    return {};
}

}  // namespace olvane::picture
