// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Coordinates come from picture::onCircle, which gives the same bits on every machine.

#include <olvane/charts/FanInternal.h>

#include <algorithm>
#include <cmath>
#include <utility>

#include <olvane/charts/Charts.h>
#include <olvane/picture/shared/Circle.h>

namespace olvane::charts {

namespace {

using picture::onCircle;
using Point = picture::CirclePoint;

constexpr int kBroadRings = 3;  // wide cells, whose text follows the ring

class FanPicture {
public:
    FanPicture(const kin::KinGraph& graph, const ChartRequest& request)
        : graph_(graph), request_(request), fan_(graph, request) {}

    picture::Picture make() {
        picture_.view = nameOf(request_.view);
        picture_.focus = 0;
        setRings();
        addBoxes();
        addFamilies();
        moveToCorner();
        return std::move(picture_);
    }

private:
    const std::vector<Fan::Cell>& cells() const { return fan_.cells(); }
    Index boxOf(kin::Place person) const {
        const Index cell = fan_.cellOf(person);
        return cell == kNone ? kNone : box_[at(cell)];
    }

    void setRings() {
        std::int32_t last = 0;
        for (const Fan::Cell& cell : cells()) last = std::max(last, cell.ring);
        const double broad = request_.sizes.boxWidth;
        const double narrow = request_.sizes.boxHeight;
        picture_.ringRadii = {0, std::max(broad, narrow) / 2};
        for (std::int32_t ring = 1; ring <= last; ++ring) {
            picture_.ringRadii.push_back(picture_.ringRadii.back() + (ring <= kBroadRings ? broad : narrow));
        }
    }

    void addBoxes() {
        box_.assign(cells().size(), kNone);
        for (std::size_t i = 0; i < cells().size(); ++i) {
            if (cells()[i].person == kin::kNobody) continue;
            box_[i] = static_cast<Index>(picture_.boxes.size());
            addBox(cells()[i]);
        }
        for (std::size_t i = 0; i < cells().size(); ++i) {
            if (box_[i] == kNone || cells()[i].line == kNone) continue;
            picture_.arcs[at(box_[i])].line = box_[at(cells()[i].line)];
        }
    }

    void addBox(const Fan::Cell& cell) {
        picture::Box& box = picture_.boxes.emplace_back();
        box.id = graph_.id(cell.person);
        box.sex = graph_.sex(cell.person);
        countHidden(cell.person, box);
        picture::Arc& arc = picture_.arcs.emplace_back();
        arc.ring = cell.ring;
        arc.from = cell.ring == 0 ? 0 : cell.from;
        arc.to = cell.ring == 0 ? 360 : cell.to;
        const double inner = picture_.ringRadii[at(cell.ring)];
        const double outer = picture_.ringRadii[at(cell.ring) + 1];
        const picture::CircleBounds bounds = picture::boundsOnCircle(arc.from, arc.to, inner, outer);
        box.x = bounds.left;
        box.y = bounds.top;
        box.width = static_cast<float>(bounds.right - bounds.left);
        box.height = static_cast<float>(bounds.bottom - bounds.top);
    }

    void countHidden(kin::Place person, picture::Box& box) const {
        for (const kin::UnionPlace u : graph_.unionsAsChild(person)) {
            for (const kin::Place parent : graph_.partners(u)) {
                if (parent != kin::kNobody && boxOfAnybody(parent) == kNone) ++box.hiddenParents;
            }
        }
        for (const kin::UnionPlace u : graph_.unionsAsPartner(person)) {
            const kin::Place other = graph_.otherPartner(u, person);
            if (other != kin::kNobody && boxOfAnybody(other) == kNone) ++box.hiddenPartners;
            for (const kin::Place child : graph_.children(u)) {
                if (boxOfAnybody(child) == kNone) ++box.hiddenChildren;
            }
        }
    }
    Index boxOfAnybody(kin::Place person) const { return fan_.cellOf(person); }

    // Every union with two persons of the fan, the partner's with the first cell leading.
    void addFamilies() {
        for (const Fan::Cell& cell : cells()) {
            if (cell.person == kin::kNobody) continue;
            for (const kin::UnionPlace u : graph_.unionsAsPartner(cell.person)) {
                const Index own = fan_.cellOf(cell.person);
                const Index other = fan_.cellOf(graph_.otherPartner(u, cell.person));
                if (other == kNone || other >= own) addFamily(u);
            }
        }
    }

    void addFamily(kin::UnionPlace u) {
        const auto& two = graph_.partners(u);
        std::vector<Index>& members = picture_.members;
        const std::size_t first = members.size();
        for (std::size_t slot = 0; slot < 2; ++slot) {
            if (slot == 1 && two[1] == two[0]) continue;
            if (fan_.cellOf(two[slot]) != kNone) members.push_back(boxOf(two[slot]));
        }
        const std::size_t parents = members.size() - first;
        const auto children = graph_.children(u);
        picture_.childKinds.resize(members.size(), kin::ChildKind::unknown);
        for (std::size_t i = 0; i < children.size(); ++i) {
            if (fan_.cellOf(children[i]) == kNone) continue;
            members.push_back(boxOf(children[i]));
            picture_.childKinds.push_back(graph_.childKinds(u)[i]);
        }
        if (members.size() - first < 2) {
            members.resize(first);
            picture_.childKinds.resize(first);
            return;
        }
        picture::Family family;
        family.firstMember = static_cast<std::uint32_t>(first);
        family.firstLine = static_cast<std::uint32_t>(picture_.lines.size());
        family.parentCount = static_cast<std::uint8_t>(parents);
        family.childCount = static_cast<std::uint32_t>(members.size() - first - parents);
        family.number = graph_.family(u);
        family.style = graph_.state(u);
        addLinks(u);
        family.lineCount = static_cast<std::uint32_t>(picture_.lines.size()) - family.firstLine;
        picture_.families.push_back(family);
        addMarks(u, parents == 2);
    }

    // Over the free ring under a parent alone.
    void addLinks(kin::UnionPlace u) {
        for (const kin::Place child : graph_.children(u)) {
            const Index found = fan_.cellOf(child);
            if (found == kNone || cells()[at(found)].u != u) continue;
            const Fan::Cell& cell = cells()[at(found)];
            const Fan::Cell& under = cells()[at(cell.parent)];
            if (under.person != kin::kNobody) continue;
            const double middle = (cell.from + cell.to) / 2;
            const Point from = onCircle(middle, picture_.ringRadii[at(under.ring)]);
            const Point to = onCircle(middle, picture_.ringRadii[at(cell.ring)]);
            picture::Line& line = picture_.lines.emplace_back();
            line.x1 = from.x;
            line.y1 = from.y;
            line.x2 = to.x;
            line.y2 = to.y;
            line.child = box_[at(found)];
        }
    }

    // Whether somebody's cell hangs from this one's over that union.
    bool borders(Index outer, Index inner, kin::UnionPlace u) const {
        return outer != kNone && cells()[at(outer)].u == u && cells()[at(outer)].holder == inner;
    }

    void addMarks(kin::UnionPlace u, bool isCouple) {
        const auto& two = graph_.partners(u);
        const Index cellOfFirst = fan_.cellOf(two[0]);
        const Index cellOfSecond = fan_.cellOf(two[1]);
        const std::size_t before = picture_.marks.size();
        const std::int32_t number = lastNumber_ + 1;
        const bool coupleBorders = !isCouple || partnersBorder(cellOfFirst, cellOfSecond, u);
        bool coupleShown = coupleBorders;
        for (const kin::Place child : graph_.children(u)) {
            const Index cell = fan_.cellOf(child);
            if (cell == kNone) continue;
            // A child of two of whom one has a cell elsewhere has a mark as well.
            const bool below = cells()[at(cell)].u == u && !cells()[at(cell)].isPartner && cell != 0 &&
                               coupleBorders && request_.fanOf == FanOf::descendants;
            const bool above = request_.fanOf == FanOf::ancestors &&
                               (cellOfFirst == kNone || borders(cellOfFirst, cell, u)) &&
                               (cellOfSecond == kNone || borders(cellOfSecond, cell, u));
            coupleShown = coupleShown || above;
            if (below || above) continue;
            const Index first = cellOfFirst == kNone ? boxOf(two[1]) : boxOf(two[0]);
            const Index second = isCouple ? boxOf(two[1]) : kNone;
            picture_.marks.push_back(
                {{box_[at(cell)], first, second}, number, picture::MarkKind::parentsElsewhere});
        }
        if (!coupleShown) {
            picture_.marks.push_back(
                {{boxOf(two[0]), boxOf(two[1]), kNone}, number, picture::MarkKind::partnersElsewhere});
        }
        if (picture_.marks.size() != before) lastNumber_ = number;
    }

    // A spouse whose cell lies under the other's; one of a spouse's lies beside it.
    bool partnersBorder(Index first, Index second, kin::UnionPlace u) const {
        const auto isUnder = [this, u](Index outer, Index inner) {
            const Fan::Cell& cell = cells()[at(outer)];
            return cell.u == u && cell.isPartner && cell.parent == inner;
        };
        return isUnder(first, second) || isUnder(second, first);
    }

    void moveToCorner() {
        double left = 0;
        double top = 0;
        for (const picture::Box& box : picture_.boxes) {
            left = std::min(left, box.x);
            top = std::min(top, box.y);
        }
        picture_.middleX = -left;
        picture_.middleY = -top;
        for (picture::Box& box : picture_.boxes) {
            box.x -= left;
            box.y -= top;
        }
        for (picture::Line& line : picture_.lines) {
            line.x1 -= left;
            line.x2 -= left;
            line.y1 -= top;
            line.y2 -= top;
        }
    }

    const kin::KinGraph& graph_;
    const ChartRequest& request_;
    Fan fan_;
    picture::Picture picture_;
    std::vector<Index> box_;  // by cell
    std::int32_t lastNumber_ = 0;
};

}  // namespace

picture::Picture fanChart(const kin::KinGraph& graph, const ChartRequest& request) {
    return FanPicture(graph, request).make();
}

}  // namespace olvane::charts
