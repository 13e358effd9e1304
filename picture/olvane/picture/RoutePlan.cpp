// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Decides, family by family, what leads where. Stems take the middles of the children's upper edges first,
// since those are seen most; drops and lines between partners follow; what has to pass through rows comes
// last and takes what is left.

#include <olvane/picture/RoutePlannerInternal.h>

#include <cmath>
#include <tuple>
#include <utility>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::picture {

RoutePlanner::RoutePlanner(const Picture& picture, const Rows& rows)
    : picture_(picture),
      rows_(rows),
      taken_(picture.members.size() * 3),
      takenSides_(picture.families.size()) {
    countFamilies();
    listMarks();
}

RoutePlan RoutePlanner::plan() {
    placeStems();
    const auto count = static_cast<Index>(picture_.families.size());
    std::vector<Index> together;
    std::vector<Index> apart;
    for (Index f = 0; f < count; ++f) (standTogether(f) ? together : apart).push_back(f);
    orderByDistance(apart);
    countLegs(apart);
    for (const Index f : together) planFamily(f);
    for (const Index f : apart) planFamily(f);
    return std::move(plan_);
}

// How many families a box is a parent of: the one with fewer has the drop of a couple that stands apart.
void RoutePlanner::countFamilies() {
    parentOf_.resize(picture_.boxes.size());
    for (const Family& f : picture_.families) {
        for (const Index parent : picture_.parents(f)) ++parentOf_[at(parent)];
    }
}

// What the picture has marks for already.
void RoutePlanner::listMarks() {
    for (const Mark& mark : picture_.marks) {
        if (mark.kind != MarkKind::samePerson) marks_.push_back(mark);
    }
    kin::mergeSort(marks_.begin(), marks_.end(),
                   [](const Mark& a, const Mark& b) { return a.boxes[0] < b.boxes[0]; });
}

bool RoutePlanner::hasParentsMark(const Family& f, Index child) const {
    const auto parents = picture_.parents(f);
    const auto isParent = [&parents](Index box) {
        return box == kNone || std::find(parents.begin(), parents.end(), box) != parents.end();
    };
    return anyMarkOf(child, MarkKind::parentsElsewhere,
                     [&](const Mark& mark) { return isParent(mark.boxes[1]) && isParent(mark.boxes[2]); });
}

bool RoutePlanner::hasPartnersMark(Index a, Index b) const {
    const auto names = [](Index other) {
        return [other](const Mark& mark) { return mark.boxes[1] == other; };
    };
    return anyMarkOf(a, MarkKind::partnersElsewhere, names(b)) ||
           anyMarkOf(b, MarkKind::partnersElsewhere, names(a));
}

bool RoutePlanner::standTogether(Index f) const {
    if (family(f).parentCount < 2) return true;
    const auto parents = picture_.parents(family(f));
    return areNeighbours(parents[0], parents[1]);
}

bool RoutePlanner::areNeighbours(Index a, Index b) const {
    if (a == b || rows_.row(a) != rows_.row(b)) return a == b;
    return rows_.blockOf[at(a)] - rows_.blockOf[at(b)] == 1 ||
           rows_.blockOf[at(b)] - rows_.blockOf[at(a)] == 1;
}

// Nearer couples first, so that farther ones lead around them.
void RoutePlanner::orderByDistance(std::vector<Index>& families) const {
    const auto distance = [this](Index f) {
        const auto parents = picture_.parents(family(f));
        return std::tuple(std::abs(rows_.rowOf[at(parents[0])] - rows_.rowOf[at(parents[1])]),
                          std::abs(rows_.centre(parents[0]) - rows_.centre(parents[1])), f);
    };
    kin::mergeSort(families.begin(), families.end(),
                   [&](Index a, Index b) { return distance(a) < distance(b); });
}

void RoutePlanner::countLegs(const std::vector<Index>& families) {
    legs_.resize(rows_.rows.empty() ? 0 : rows_.firstGap.back() + rows_.rows.back().gaps.size());
    for (const Index f : families) {
        const auto parents = picture_.parents(family(f));
        if (rows_.row(parents[0]) != rows_.row(parents[1])) continue;
        const Index leg = fewerFamilies(parents[0], parents[1]) == parents[0] ? parents[1] : parents[0];
        const Index other = leg == parents[0] ? parents[1] : parents[0];
        const bool toTheRight = rows_.centre(other) > rows_.centre(leg);
        Legs& legs = legs_[sideLane(rows_.row(leg), rows_.block(leg) + (toTheRight ? 1 : 0))];
        ++(toTheRight ? legs.left : legs.right);
    }
}

void RoutePlanner::planFamily(Index f) {
    const auto parents = picture_.parents(family(f));
    if (parents.empty()) return;
    FamilyNet net;
    net.family = f;
    const bool isCouple = parents.size() == 2 && parents[0] != parents[1];
    const bool isMarked = isCouple && hasPartnersMark(parents[0], parents[1]);
    const bool joined = !isCouple  ? planLoneParent(net, parents[0])
                        : isMarked ? false
                                   : planCouple(net, parents[0], parents[1]);
    if (!joined && isCouple) {
        if (!isMarked) addMark(MarkKind::partnersElsewhere, parents[0], parents[1], kNone);
        if (!planLoneParent(net, fewerFamilies(parents[0], parents[1]))) net.bars.clear();
    }
    planChildren(net);
}

Index RoutePlanner::addBar(FamilyNet& net, std::size_t channel, LineRole role) {
    Bar bar;
    bar.family = net.family;
    bar.channel = static_cast<Index>(channel);
    bar.role = role;
    const auto place = static_cast<Index>(plan_.bars.size());
    plan_.bars.push_back(bar);
    if (net.isEmpty()) net.firstChannel = channel;
    if (channel < net.firstChannel) {
        net.bars.insert(net.bars.begin(), place);
        net.firstChannel = channel;
    } else {
        net.bars.push_back(place);
    }
    return place;
}

void RoutePlanner::addVertical(const Vertical& vertical) {
    for (const VerticalEnd& end : {vertical.top, vertical.bottom}) {
        if (end.bar == kNone) continue;
        Bar& bar = plan_.bars[at(end.bar)];
        bar.lo = std::min(bar.lo, vertical.x);
        bar.hi = std::max(bar.hi, vertical.x);
    }
    plan_.verticals.push_back(vertical);
}

// Takes back what a family has drawn so far; the places stay taken.
void RoutePlanner::dropNet(FamilyNet& net) {
    const auto isOurs = [&net](const auto& piece) { return piece.family == net.family; };
    while (!plan_.verticals.empty() && isOurs(plan_.verticals.back())) plan_.verticals.pop_back();
    while (!plan_.rowPieces.empty() && isOurs(plan_.rowPieces.back())) plan_.rowPieces.pop_back();
    while (!plan_.bars.empty() && isOurs(plan_.bars.back())) plan_.bars.pop_back();
    net.bars.clear();
}

RoutePlan planRoutes(const Picture& picture, const Rows& rows) {
    return RoutePlanner(picture, rows).plan();
}

}  // namespace olvane::picture
