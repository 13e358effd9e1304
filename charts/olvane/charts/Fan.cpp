// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/FanInternal.h>

#include <algorithm>

namespace olvane::charts {

namespace {

constexpr int kMostRingsOfAncestors = 25;

}  // namespace

Fan::Fan(const kin::KinGraph& graph, const ChartRequest& request)
    : graph_(graph), request_(request), cellOf_(at(graph.personCount()), kNone) {
    Cell middle;
    middle.person = request.focus;
    add(middle);
    const double angle = std::min(std::max(request.fanAngle, 90.0), 360.0);
    if (request.fanOf == FanOf::ancestors) {
        growAncestors();
        spreadHalves(angle);
    } else {
        growDescendants();
        spreadByWeight(angle);
    }
}

Index Fan::add(const Cell& cell) {
    const Index added = static_cast<Index>(cells_.size());
    cells_.push_back(cell);
    if (cell.person != kin::kNobody) cellOf_[at(cell.person)] = added;
    return added;
}

// Ring by ring, the parents that the data name first. The lines of descent are those of the grandparents.
void Fan::growAncestors() {
    const int asked = request_.up == 0 ? kMostRingsOfAncestors : std::min(request_.up, kMostRingsOfAncestors);
    for (Index i = 0; i < static_cast<Index>(cells_.size()); ++i) {
        const Cell child = cells_[at(i)];
        const auto unions = graph_.unionsAsChild(child.person);
        if (child.ring == asked || unions.empty()) continue;
        for (const kin::Place parent : graph_.partners(unions[0])) {
            if (parent == kin::kNobody || cellOf_[at(parent)] != kNone) continue;
            Cell cell;
            cell.person = parent;
            cell.ring = child.ring + 1;
            cell.parent = cell.holder = i;
            cell.u = unions[0];
            cell.line = cell.ring == 2 ? static_cast<Index>(cells_.size()) : child.line;
            add(cell);
        }
    }
}

// A father has the left half of his child's cell and a mother the right one, even where the other parent is not known.
void Fan::spreadHalves(double angle) {
    cells_[0].from = -angle / 2;
    cells_[0].to = angle / 2;
    for (std::size_t i = 1; i < cells_.size(); ++i) {
        Cell& cell = cells_[i];
        const Cell& child = cells_[at(cell.parent)];
        const double middle = (child.from + child.to) / 2;
        const bool isFirst = graph_.partners(cell.u)[0] == cell.person;
        cell.from = isFirst ? child.from : middle;
        cell.to = isFirst ? middle : child.to;
    }
}

// Generation by generation. With spouses, each generation has two rings: its persons, and outside of them their
// spouses, under whom the children of both stand.
void Fan::growDescendants() {
    isBlood_.assign(at(graph_.personCount()), false);
    isExpanded_.assign(at(graph_.unionCount()), false);
    std::vector<kin::Place> level{request_.focus};
    std::vector<kin::Place> next;
    isBlood_[at(request_.focus)] = true;
    for (int generation = 0; !level.empty() && (request_.down == 0 || generation < request_.down);
         ++generation) {
        next.clear();
        for (const kin::Place person : level) {
            for (const kin::UnionPlace u : graph_.unionsAsPartner(person)) {
                for (const kin::Place child : graph_.children(u)) {
                    if (isBlood_[at(child)]) continue;
                    isBlood_[at(child)] = true;
                    next.push_back(child);
                }
            }
        }
        level.swap(next);
    }
    for (Index i = 0; i < static_cast<Index>(cells_.size()); ++i) {
        if (cells_[at(i)].person != kin::kNobody && !cells_[at(i)].isPartner) growBelow(i);
    }
}

// The unions of a person of the blood, and those of each new spouse who is of the blood as well.
void Fan::growBelow(Index cell) {
    const std::size_t first = cells_.size();
    addUnionsOf(cell, cell);
    if (!request_.spouses) return;
    for (std::size_t i = first; i < cells_.size(); ++i) {
        const Cell& spouse = cells_[i];
        if (!spouse.isPartner || spouse.person == kin::kNobody || !isBlood_[at(spouse.person)]) continue;
        addUnionsOf(static_cast<Index>(i), cell);
    }
}

void Fan::addUnionsOf(Index holder, Index lead) {
    const std::int32_t generationRing = cells_[at(lead)].ring;
    for (const kin::UnionPlace u : graph_.unionsAsPartner(cells_[at(holder)].person)) {
        if (isExpanded_[at(u)]) continue;
        isExpanded_[at(u)] = true;
        const kin::Place other = graph_.otherPartner(u, cells_[at(holder)].person);
        const bool isNew = other != kin::kNobody && cellOf_[at(other)] == kNone;
        Cell partner;
        partner.ring = generationRing + 1;
        partner.parent = lead;
        partner.u = u;
        partner.holder = holder;
        partner.isPartner = true;
        partner.line = cells_[at(lead)].line;
        Index under = holder;
        if (request_.spouses && isNew) {
            partner.person = other;
            under = add(partner);
        }
        for (const kin::Place child : graph_.children(u)) {
            if (!isBlood_[at(child)] || cellOf_[at(child)] != kNone) continue;
            // A parent alone keeps the ring of the spouses free under it.
            if (request_.spouses && under == lead) under = add(partner);
            Cell cell;
            cell.person = child;
            cell.ring = generationRing + (request_.spouses ? 2 : 1);
            cell.parent = under;
            cell.u = u;
            cell.holder = holder;
            const Index added = static_cast<Index>(cells_.size());
            cell.line = cells_[at(lead)].line == kNone ? added : cells_[at(lead)].line;
            add(cell);
        }
    }
}

// As much of the circle for everybody as there are cells without others outside of them.
void Fan::spreadByWeight(double angle) {
    for (std::size_t i = cells_.size(); i-- > 0;) {
        Cell& cell = cells_[i];
        if (cell.weight == 0) cell.weight = 1;
        if (cell.parent != kNone) cells_[at(cell.parent)].weight += cell.weight;
    }
    std::vector<double> used(cells_.size(), 0);
    cells_[0].from = -angle / 2;
    cells_[0].to = angle / 2;
    for (std::size_t i = 1; i < cells_.size(); ++i) {
        Cell& cell = cells_[i];
        const Cell& parent = cells_[at(cell.parent)];
        const double before = used[at(cell.parent)];
        used[at(cell.parent)] += cell.weight;
        const double degrees = parent.to - parent.from;
        cell.from = parent.from + degrees * (before / parent.weight);
        cell.to = parent.from + degrees * (used[at(cell.parent)] / parent.weight);
    }
}

}  // namespace olvane::charts
