// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Everything is made as it stands in a chart that runs down, and turned at the end.

#include <olvane/charts/PlanPictureInternal.h>

#include <olvane/charts/Charts.h>
#include <olvane/charts/HiddenRelativesInternal.h>

#include <algorithm>
#include <limits>
#include <utility>

namespace olvane::charts {

using picture::LineRole;

PlanPicture::PlanPicture(const kin::KinGraph& graph, const ChartRequest& request, const PlanSizes& sizes,
                         const std::vector<bool>& shown, const Plan& plan, const GapTracks& gaps)
    : graph_(graph), request_(request), sizes_(sizes), shown_(shown), plan_(plan), gaps_(gaps) {}

picture::Picture PlanPicture::make() {
    picture_.view = nameOf(request_.view);
    picture_.focus = plan_.boxOf[at(request_.focus)];
    measureRows();
    reserve();
    addBoxes();
    addFamilies();
    turn();
    return std::move(picture_);
}

// Rows are as high as their highest box; gaps grow where many lines run in them.
void PlanPicture::measureRows() {
    const std::size_t rows = gaps_.bars().size();
    std::vector<double> height(rows, 0);
    left_ = std::numeric_limits<double>::infinity();
    double right = -left_;
    for (const Household& household : plan_.households) {
        left_ = std::min(left_, household.x);
        right = std::max(right, household.x + household.width);
    }
    for (Index box = 0; box < static_cast<Index>(plan_.persons.size()); ++box) {
        const double boxHeight = sizes_.height(plan_.persons[at(box)]);
        height[rowOf(box)] = std::max(height[rowOf(box)], boxHeight);
    }
    top_.resize(rows);
    bottom_.resize(rows);
    step_.resize(rows);
    double y = 0;
    for (std::size_t row = 0; row < rows; ++row) {
        const int tracks = (row > 0 ? gaps_.bars()[row - 1] : 0) + gaps_.overLines()[row];
        const double gap = std::max<double>(sizes_.gapY(), kTrackStep * (tracks + 1));
        step_[row] = gap / (tracks + 1);
        if (row > 0) y += gap;
        top_[row] = y;
        y += height[row];
        bottom_[row] = y;
    }
    width_ = right - left_;
    height_ = y;
}

void PlanPicture::reserve() {
    std::size_t lines = 0;
    for (Index f = 0; f < static_cast<Index>(plan_.families.size()); ++f) {
        const PlannedFamily& family = plan_.families[at(f)];
        lines += family.coupleLine == CoupleLine::over ? 4 : family.coupleLine == CoupleLine::direct ? 1 : 0;
        std::size_t drawn = 0;
        for (std::uint32_t link = family.firstLink; link < plan_.linkEnd(f); ++link) {
            drawn += plan_.links[link].drawn ? 1 : 0;
        }
        lines += drawn == 0 ? 0 : drawn + 2;
    }
    picture_.boxes.reserve(plan_.persons.size());
    picture_.families.reserve(plan_.families.size());
    picture_.members.reserve(plan_.links.size() + 2 * plan_.families.size());
    picture_.childKinds.reserve(plan_.links.size() + 2 * plan_.families.size());
    picture_.lines.reserve(lines);
}

void PlanPicture::addBoxes() {
    for (Index b = 0; b < static_cast<Index>(plan_.persons.size()); ++b) {
        const kin::Place person = plan_.persons[at(b)];
        picture::Box& box = picture_.boxes.emplace_back();
        box.id = graph_.id(person);
        box.sex = graph_.sex(person);
        box.x = xOf(b);
        box.y = top_[rowOf(b)];
        box.width = sizes_.width(person);
        box.height = sizes_.height(person);
        countHiddenRelatives(graph_, person, shown_, box);
    }
}

void PlanPicture::addFamilies() {
    for (Index f = 0; f < static_cast<Index>(plan_.families.size()); ++f) addFamily(f);
}

void PlanPicture::addFamily(Index f) {
    const PlannedFamily& planned = plan_.families[at(f)];
    picture::Family& family = picture_.families.emplace_back();
    family.firstMember = static_cast<std::uint32_t>(picture_.members.size());
    family.firstLine = static_cast<std::uint32_t>(picture_.lines.size());
    family.number = graph_.family(planned.u);
    family.style = graph_.state(planned.u);
    for (const Index parent : planned.parents) {
        if (parent == kNone) continue;
        ++family.parentCount;
        picture_.members.push_back(parent);
        picture_.childKinds.push_back(kin::ChildKind::unknown);
    }
    for (std::uint32_t link = planned.firstLink; link < plan_.linkEnd(f); ++link) {
        picture_.members.push_back(plan_.childBox(link));
        picture_.childKinds.push_back(plan_.links[link].kind);
    }
    family.childCount = plan_.linkEnd(f) - planned.firstLink;

    const std::size_t row = rowOf(planned.holder);
    Start start{};
    start.dropX = GapTracks::dropOf(plan_, planned) - left_;
    start.dropY = addPartnersLine(planned, row);
    if (row + 1 < top_.size()) start.barY = bottom_[row] + step_[row + 1] * (planned.track + 1);
    addChildrenLines(f, start);
    picture_.families.back().lineCount =
        static_cast<std::uint32_t>(picture_.lines.size()) - picture_.families.back().firstLine;
    addMarks(f);
}

// Returns where the line to the children starts.
double PlanPicture::addPartnersLine(const PlannedFamily& family, std::size_t row) {
    if (family.coupleLine == CoupleLine::alone) {
        return top_[row] + sizes_.height(plan_.persons[at(family.holder)]);
    }
    const Index left = std::min(family.parents[0], family.parents[1]);
    const Index right = std::max(family.parents[0], family.parents[1]);
    if (family.coupleLine == CoupleLine::over) {
        return addOverLine(family, row, top_[row] + sizes_.height(plan_.persons[at(family.holder)]) / 2);
    }
    const double middle =
        top_[row] +
        std::min(sizes_.height(plan_.persons[at(left)]), sizes_.height(plan_.persons[at(right)])) / 2;
    addLine(LineRole::marriage, xOf(left) + plan_.boxWidth[at(left)], middle, xOf(right), middle, kNone);
    return middle;
}

double PlanPicture::addOverLine(const PlannedFamily& family, std::size_t row, double middle) {
    const Index inner = family.parents[0] == family.holder ? family.parents[1] : family.parents[0];
    const double from = xOf(inner) + plan_.boxWidth[at(inner)] / 2 + family.departX;
    const double down = GapTracks::dropOf(plan_, family) - left_;
    const double over = top_[row] - step_[row] * family.overHeight;
    const bool isRight = family.holder > inner;
    const double edge = xOf(family.holder) + (isRight ? 0 : plan_.boxWidth[at(family.holder)]);
    addLine(LineRole::marriage, from, top_[row], from, over, kNone);
    addLine(LineRole::marriage, from, over, down, over, kNone);
    addLine(LineRole::marriage, down, over, down, middle, kNone);
    addLine(LineRole::marriage, down, middle, edge, middle, kNone);
    return middle;
}

void PlanPicture::addChildrenLines(Index f, const Start& start) {
    const PlannedFamily& family = plan_.families[at(f)];
    double from = start.dropX;
    double to = start.dropX;
    bool drawn = false;
    for (std::uint32_t link = family.firstLink; link < plan_.linkEnd(f); ++link) {
        if (!plan_.links[link].drawn) continue;
        const double stem = GapTracks::stemOf(plan_, plan_.links[link]) - left_;
        from = std::min(from, stem);
        to = std::max(to, stem);
        drawn = true;
    }
    if (!drawn) return;
    addLine(LineRole::drop, start.dropX, start.dropY, start.dropX, start.barY, kNone);
    if (from < to) addLine(LineRole::bar, from, start.barY, to, start.barY, kNone);
    for (std::uint32_t link = family.firstLink; link < plan_.linkEnd(f); ++link) {
        if (!plan_.links[link].drawn) continue;
        const Index box = plan_.childBox(link);
        const double stem = GapTracks::stemOf(plan_, plan_.links[link]) - left_;
        addLine(LineRole::stem, stem, start.barY, stem, top_[rowOf(box)], box);
    }
}

// All marks of a family have one number.
void PlanPicture::addMarks(Index f) {
    const PlannedFamily& family = plan_.families[at(f)];
    const std::size_t before = picture_.marks.size();
    const std::int32_t number = lastNumber_ + 1;
    if (family.partnersMarked) {
        picture_.marks.push_back(
            {{family.parents[0], family.parents[1], kNone}, number, picture::MarkKind::partnersElsewhere});
    }
    for (std::uint32_t link = family.firstLink; link < plan_.linkEnd(f); ++link) {
        if (plan_.links[link].drawn) continue;
        picture_.marks.push_back({{plan_.childBox(link), family.parents[0], family.parents[1]},
                                  number,
                                  picture::MarkKind::parentsElsewhere});
    }
    if (picture_.marks.size() != before) lastNumber_ = number;
}

void PlanPicture::addLine(LineRole role, double x1, double y1, double x2, double y2, Index child) {
    picture::Line& line = picture_.lines.emplace_back();
    line.role = role;
    line.x1 = x1;
    line.y1 = y1;
    line.x2 = x2;
    line.y2 = y2;
    line.child = child;
}

// Up and left are down and right seen in a mirror; sideways, x and y change places.
void PlanPicture::turn() {
    const Direction direction = request_.direction;
    if (direction == Direction::down) return;
    const bool mirrored = direction == Direction::up || direction == Direction::left;
    const bool sideways = direction == Direction::left || direction == Direction::right;
    for (picture::Box& box : picture_.boxes) {
        if (mirrored) box.y = height_ - box.y - static_cast<double>(box.height);
        if (sideways) std::swap(box.x, box.y);
        if (sideways) std::swap(box.width, box.height);
    }
    for (picture::Line& line : picture_.lines) {
        if (mirrored) line.y1 = height_ - line.y1;
        if (mirrored) line.y2 = height_ - line.y2;
        if (sideways) std::swap(line.x1, line.y1);
        if (sideways) std::swap(line.x2, line.y2);
    }
}

}  // namespace olvane::charts
