// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/RowsInternal.h>

#include <algorithm>
#include <numeric>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::picture {

namespace {

constexpr double kRowOverlap = 0.5;  // points; boxes that overlap by less stand in two rows

void addBlocks(Rows& rows, std::vector<Index>& members, Index rowIndex) {
    kin::mergeSort(members.begin(), members.end(), [&rows](Index a, Index b) {
        return std::pair(rows.rect(a).x1, a) < std::pair(rows.rect(b).x1, b);
    });
    Row row;
    row.top = std::numeric_limits<double>::infinity();
    row.bottom = -row.top;
    row.gaps.emplace_back();
    double right = -std::numeric_limits<double>::infinity();
    for (const Index box : members) {
        const Rect& rect = rows.rect(box);
        if (rect.x1 >= right) {
            row.gaps.back().hi = rect.x1;
            row.gaps.emplace_back();
        }
        right = std::max(right, rect.x2);
        row.gaps.back().lo = right;
        row.top = std::min(row.top, rect.y1);
        row.bottom = std::max(row.bottom, rect.y2);
        rows.rowOf[static_cast<std::size_t>(box)] = rowIndex;
        rows.blockOf[static_cast<std::size_t>(box)] = static_cast<Index>(row.gaps.size()) - 2;
    }
    rows.firstGap.push_back(rows.rows.empty() ? 0 : rows.firstGap.back() + rows.rows.back().gaps.size());
    rows.rows.push_back(std::move(row));
}

}  // namespace

Rect RouteFrame::rectOf(const Box& box) const {
    const double right = box.x + static_cast<double>(box.width);
    const double bottom = box.y + static_cast<double>(box.height);
    switch (direction_) {
        case Direction::up:
            return {box.x, -bottom, right, -box.y};
        case Direction::right:
            return {box.y, box.x, bottom, right};
        case Direction::left:
            return {box.y, -right, bottom, -box.x};
        case Direction::down:
            break;
    }
    return {box.x, box.y, right, bottom};
}

std::pair<double, double> RouteFrame::turned(double x, double y) const {
    switch (direction_) {
        case Direction::up:
            return {x, -y};
        case Direction::right:
            return {y, x};
        case Direction::left:
            return {-y, x};
        case Direction::down:
            break;
    }
    return {x, y};
}

void RouteFrame::moveAlong(Box& box, double distance) const {
    switch (direction_) {
        case Direction::down:
            box.y += distance;
            break;
        case Direction::up:
            box.y -= distance;
            break;
        case Direction::right:
            box.x += distance;
            break;
        case Direction::left:
            box.x -= distance;
            break;
    }
}

std::size_t Row::gapAt(double x) const {
    const auto after = std::upper_bound(gaps.begin(), gaps.end(), x,
                                        [](double place, const RowGap& gap) { return place < gap.lo; });
    const auto i = static_cast<std::size_t>(after - gaps.begin()) - 1;
    if (x <= gaps[i].hi || i + 1 == gaps.size()) return i;
    return x - gaps[i].hi <= gaps[i + 1].lo - x ? i : i + 1;
}

Rows rowsOf(const Picture& picture, const RouteFrame& frame) {
    Rows rows;
    const std::size_t count = picture.boxes.size();
    rows.boxes.reserve(count);
    for (const Box& box : picture.boxes) rows.boxes.push_back(frame.rectOf(box));
    rows.rowOf.resize(count);
    rows.blockOf.resize(count);
    std::vector<Index> order(count);
    std::iota(order.begin(), order.end(), 0);
    kin::mergeSort(order.begin(), order.end(), [&rows](Index a, Index b) {
        return std::pair(rows.rect(a).y1, a) < std::pair(rows.rect(b).y1, b);
    });
    std::vector<Index> members;
    double bottom = 0;
    for (const Index box : order) {
        if (!members.empty() && rows.rect(box).y1 > bottom - kRowOverlap) {
            addBlocks(rows, members, static_cast<Index>(rows.rows.size()));
            members.clear();
        }
        bottom = members.empty() ? rows.rect(box).y2 : std::max(bottom, rows.rect(box).y2);
        members.push_back(box);
    }
    if (!members.empty()) addBlocks(rows, members, static_cast<Index>(rows.rows.size()));
    return rows;
}

}  // namespace olvane::picture
