// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Tries places around a box for every form of a text, from one long line to four short ones, and takes the one with the
// least penalty. Penalties are ours: covering a box counts more than anything else, then each line that is covered, then
// how far the place is from the usual one, below the middle of the box.

#include <olvane/picture/KinshipPlates.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>

#include <olvane/picture/RectSweepInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::picture {

namespace {

constexpr std::size_t kMostLines = 4;
constexpr int kHalvings = 24;          // of a width, to find the least one for a number of lines
constexpr int kShifts = 6;             // places to each side of the middle of an edge
constexpr double kContact = 0.3;       // of a box's edge, that its plate has in common with it at least
constexpr double kWiderThanBox = 1.2;  // up to which a plate looks as if it belonged to its box

constexpr double kOnBox = 1e6;
constexpr double kOnLine = 100;
constexpr double kAbove = 8;
constexpr double kBeside = 30;
constexpr double kPerLine = 6;
constexpr double kPerShift = 40;   // by the width or height of the box
constexpr double kPerExcess = 30;  // of width, by that of the box

bool meet(const Rect& a, const Rect& b) {
    return a.x1 < b.x2 && b.x1 < a.x2 && a.y1 < b.y2 && b.y1 < a.y2;
}

double sharedArea(const Rect& a, const Rect& b) {
    return (std::min(a.x2, b.x2) - std::max(a.x1, b.x1)) * (std::min(a.y2, b.y2) - std::max(a.y1, b.y1));
}

Rect areaOf(const Box& box) {
    return {box.x, box.y, box.x + static_cast<double>(box.width), box.y + static_cast<double>(box.height)};
}

Rect areaOf(const KinshipPlate& plate) {
    return {plate.x, plate.y, plate.right(), plate.bottom()};
}

// A text in a number of lines, no wider than it has to be.
struct Form {
    std::vector<std::string> lines;
    double width = 0;
};

class FormMaker {
public:
    FormMaker(const std::string& text, double letters)
        : text_(cleanText(cutText(text))), font_{letters, true} {}

    std::vector<Form> make() const {
        std::vector<Form> forms;
        // A text is fitted letter by letter, whose widths add up to its own but for rounding.
        const double whole = textWidth(text_, font_) * (1 + 1e-6);
        for (std::size_t lines = 1; lines <= kMostLines; ++lines) {
            double most = whole;
            double least = 0;
            for (int i = 0; i < kHalvings; ++i) {
                const double middle = (least + most) / 2;
                (fits(middle, lines) ? most : least) = middle;
            }
            Form form{fitText(text_, font_, most, lines).lines, 0};
            if (form.lines.empty() || (!forms.empty() && form.lines.size() <= forms.back().lines.size()))
                break;
            for (const std::string& line : form.lines)
                form.width = std::max(form.width, textWidth(line, font_));
            forms.push_back(std::move(form));
        }
        return forms;
    }

private:
    bool fits(double width, std::size_t lines) const {
        const FittedText fitted = fitText(text_, font_, width, lines);
        return !fitted.shortened && !fitted.wordBroken;
    }

    std::string text_;
    Font font_;
};

class PlatePlacer {
public:
    PlatePlacer(const Picture& picture, const PlateStyle& style, std::span<const MarkedEdges> marked)
        : picture_(picture), style_(style), marked_(marked) {}

    void place(Index box, const std::string& text) {
        std::vector<Form> forms = FormMaker(text, style_.letters).make();
        if (forms.empty()) return;
        own_ = box;
        leastPenalty_ = -1;
        collectNeighbours(forms.front().width);
        for (Form& form : forms) tryForm(form);
        plates_.push_back(
            {box, best_.x1, best_.y1, best_.x2 - best_.x1, best_.y2 - best_.y1, std::move(bestForm_->lines)});
    }

    std::vector<KinshipPlate> take() { return std::move(plates_); }

private:
    Rect withMarks(std::size_t i) const {
        Rect area = areaOf(picture_.boxes[i]);
        area.y1 -= marked_[i].top ? style_.marks : style_.frames;
        area.y2 += marked_[i].bottom ? style_.marks : style_.frames;
        area.x1 -= style_.frames;
        area.x2 += style_.frames;
        return area;
    }

    // What any place of the plate might cover.
    void collectNeighbours(double widest) {
        const double across = widest + 2 * style_.inset;
        const double height = style_.pitch * static_cast<double>(kMostLines) + style_.frame + style_.marks;
        Rect reach = areaOf(ownBox());
        reach.x1 -= across;
        reach.x2 += across;
        reach.y1 -= height;
        reach.y2 += height;
        neighbours_.clear();
        for (std::size_t i = 0; i < picture_.boxes.size(); ++i) {
            const Rect area = withMarks(i);
            if (static_cast<Index>(i) != own_ && meet(area, reach)) neighbours_.push_back(area);
        }
        for (const KinshipPlate& plate : plates_) neighbours_.push_back(areaOf(plate));
        lines_.clear();
        for (const Line& line : picture_.lines) addLine(line.x1, line.y1, line.x2, line.y2, reach);
        for (const WayPiece& piece : picture_.wayPieces)
            addLine(piece.x1, piece.y1, piece.x2, piece.y2, reach);
    }

    void addLine(double x1, double y1, double x2, double y2, const Rect& reach) {
        const double halfStroke = style_.letters / 5;
        const Rect line{std::min(x1, x2) - halfStroke, std::min(y1, y2) - halfStroke,
                        std::max(x1, x2) + halfStroke, std::max(y1, y2) + halfStroke};
        if (meet(line, reach)) lines_.push_back(line);
    }

    const Box& ownBox() const { return picture_.boxes[static_cast<std::size_t>(own_)]; }

    void tryForm(Form& form) {
        const Rect box = areaOf(ownBox());
        const double boxWidth = box.x2 - box.x1;
        const double boxHeight = box.y2 - box.y1;
        const double width = form.width + 2 * style_.inset;
        const double height = style_.pitch * static_cast<double>(form.lines.size()) + style_.frame;
        const auto own = static_cast<std::size_t>(own_);
        const double above = box.y1 - height - (marked_[own].top ? style_.marks : -style_.onBorder);
        const double below = box.y2 + (marked_[own].bottom ? style_.marks : -style_.onBorder);
        const double penalty = kPerLine * static_cast<double>(form.lines.size() - 1) +
                               kPerExcess * std::max(0.0, width / boxWidth - kWiderThanBox);
        for (int i = -kShifts; i <= kShifts; ++i) {
            const double share = static_cast<double>(i) / kShifts;
            const double right = share * std::max(0.0, (boxWidth + width) / 2 - kContact * boxWidth);
            const double x = (box.x1 + box.x2 - width) / 2 + right;
            const double down = share * std::max(0.0, (boxHeight - height) / 2);
            const double y = (box.y1 + box.y2 - height) / 2 + down;
            const double shifted = kPerShift * std::abs(right) / boxWidth;
            const double moved = kBeside + kPerShift * std::abs(down) / boxHeight;
            const std::array<double, 3> places[] = {{x, below, shifted},
                                                    {x, above, kAbove + shifted},
                                                    {box.x2 - style_.onBorder, y, moved},
                                                    {box.x1 + style_.onBorder - width, y, moved}};
            for (const auto& [left, top, more] : places)
                tryArea({left, top, left + width, top + height}, penalty + more, form);
        }
    }

    void tryArea(const Rect& area, double penalty, Form& form) {
        for (const Rect& neighbour : neighbours_) {
            if (meet(area, neighbour)) penalty += kOnBox * (1 + sharedArea(area, neighbour));
        }
        for (const Rect& line : lines_) {
            if (meet(area, line)) penalty += kOnLine;
        }
        if (leastPenalty_ >= 0 && penalty >= leastPenalty_) return;
        leastPenalty_ = penalty;
        best_ = area;
        bestForm_ = &form;
    }

    const Picture& picture_;
    const PlateStyle& style_;
    std::span<const MarkedEdges> marked_;
    std::vector<KinshipPlate> plates_;
    Index own_ = kNone;
    std::vector<Rect> neighbours_;
    std::vector<Rect> lines_;
    Rect best_;
    Form* bestForm_ = nullptr;
    double leastPenalty_ = -1;
};

}  // namespace

std::vector<KinshipPlate> kinshipPlates(const Picture& picture, const PlateStyle& style,
                                        std::span<const MarkedEdges> marked) {
    PlatePlacer placer(picture, style, marked);
    if (picture.other == kNone) return placer.take();
    if (!picture.otherIs.empty()) placer.place(picture.other, picture.otherIs);
    if (!picture.focusIs.empty() && picture.focus != kNone && picture.focus != picture.other)
        placer.place(picture.focus, picture.focusIs);
    return placer.take();
}

}  // namespace olvane::picture
