// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/PlanBuilderInternal.h>

#include <utility>

namespace olvane::charts {

namespace {

constexpr std::int8_t kNoRoom = 127;

}  // namespace

PlanBuilder::PlanBuilder(const kin::KinGraph& graph, const PlanSizes& sizes, const Selection& selection)
    : graph_(graph), selection_(selection), builder_(graph, sizes, plan_) {
    plan_.boxOf.assign(at(graph.personCount()), kNone);
    for (const kin::Place person : selection.persons) plan_.boxOf[at(person)] = kAwaitsBox;
    const std::size_t persons = selection.persons.size();
    // The most there can be; a list that grows by doubling would take more than what stays unused here.
    plan_.households.reserve(persons);
    plan_.persons.reserve(persons);
    plan_.householdOf.reserve(persons);
    plan_.boxX.reserve(persons);
    plan_.boxWidth.reserve(persons);
}

Plan PlanBuilder::build(kin::Place focus) {
    builder_.add(focus, 0);
    for (Index h = 0; h < static_cast<Index>(plan_.households.size()); ++h) growUpFrom(h, false);
    aboveEnd_ = static_cast<Index>(plan_.households.size());
    growDownFrom(0);
    growAll(aboveEnd_);
    growAll(0);
    addLeftOver();
    return std::move(plan_);
}

// The parents of those who are in the line. A household is asked once.
void PlanBuilder::growUpFrom(Index household, bool fromEverybody) {
    const Index first = static_cast<Index>(plan_.households.size());
    firstParents_ = first;
    const Index end = plan_.boxEnd(household);
    for (Index box = plan_.households[at(household)].firstBox; box < end; ++box) {
        const kin::Place person = plan_.persons[at(box)];
        if (!fromEverybody && !selection_.isLine[at(person)]) continue;
        for (const kin::UnionPlace u : graph_.unionsAsChild(person)) {
            addParents(household, box, u, !fromEverybody);
        }
    }
    if (fromEverybody) return;
    plan_.households[at(household)].upFirst = first;
    plan_.households[at(household)].upEnd = static_cast<Index>(plan_.households.size());
}

// The household of a child's parents, unless they have boxes. Where the line to it would cross one that runs
// over the child's box, or cannot leave the parent, it starts a tree of its own.
void PlanBuilder::addParents(Index household, Index box, kin::UnionPlace u, bool joined) {
    kin::Place lead = kin::kNobody;
    kin::Place other = kin::kNobody;
    bool isInLine = false;
    for (const kin::Place parent : graph_.partners(u)) {
        if (parent == kin::kNobody || plan_.boxOf[at(parent)] == kNone) continue;
        if (plan_.boxOf[at(parent)] != kAwaitsBox) return;
        (lead == kin::kNobody ? lead : other) = parent;
        isInLine = isInLine || selection_.isLine[at(parent)];
    }
    if (lead == kin::kNobody || (joined && !isInLine)) return;
    const std::int32_t row = plan_.households[at(household)].row - 1;
    const Index added = builder_.add(lead, row, other);
    Household& above = plan_.households[at(added)];
    above.isAbove = true;
    if (!joined || plan_.isCovered[at(box)]) return;
    const std::int8_t shift = makeRoomFor(added, box);
    if (shift == kNoRoom) return;
    for (Index family = above.firstFamily; family < plan_.familyEnd(added); ++family) {
        if (plan_.families[at(family)].u != u || !plan_.families[at(family)].hasDrop) continue;
        const std::uint32_t link = linkOf(family, plan_.persons[at(box)]);
        plan_.links[link].drawn = true;
        plan_.links[link].shift = shift;
        above.treeParent = household;
        above.treeFamily = family;
        above.treeLink = static_cast<Index>(link);
    }
}

// Where a line from further parents may meet the top of a child's box: in the middle for the first, and for the
// second on the right of the first, which moves to the left.
std::int8_t PlanBuilder::makeRoomFor(Index added, Index box) {
    const Index household = plan_.householdOf[at(box)];
    std::uint32_t before = 0;
    int count = 0;
    for (Index other = firstParents_; other < added; ++other) {
        const Household& parents = plan_.households[at(other)];
        if (parents.treeParent != household) continue;
        const auto link = static_cast<std::uint32_t>(parents.treeLink);
        if (plan_.childBox(link) != box) continue;
        before = link;
        ++count;
    }
    if (count == 0) return 0;
    if (count > 1 || plan_.boxWidth[at(box)] < kLeastWidthForTwoStems || hasOverLine(box)) return kNoRoom;
    plan_.links[before].shift = -kStemShift;
    return kStemShift;
}

bool PlanBuilder::hasOverLine(Index box) const {
    const Index household = plan_.householdOf[at(box)];
    for (Index family = plan_.households[at(household)].firstFamily; family < plan_.familyEnd(household);
         ++family) {
        const PlannedFamily& one = plan_.families[at(family)];
        if (one.coupleLine == CoupleLine::over && (one.parents[0] == box || one.parents[1] == box))
            return true;
    }
    return false;
}

std::uint32_t PlanBuilder::linkOf(Index family, kin::Place child) const {
    std::uint32_t link = plan_.families[at(family)].firstLink;
    while (plan_.links[link].child != child) ++link;
    return link;
}

// The children of a household who have no box so far, each as the lead of a household.
void PlanBuilder::growDownFrom(Index household) {
    const Index first = static_cast<Index>(plan_.households.size());
    const Index end = plan_.familyEnd(household);
    for (Index family = plan_.households[at(household)].firstFamily; family < end; ++family) {
        const std::uint32_t linkEnd = plan_.linkEnd(family);
        for (std::uint32_t link = plan_.families[at(family)].firstLink; link < linkEnd; ++link) {
            const kin::Place child = plan_.links[link].child;
            if (plan_.boxOf[at(child)] != kAwaitsBox) continue;
            const Index added = builder_.add(child, plan_.households[at(household)].row + 1);
            if (!plan_.families[at(family)].hasDrop) continue;
            plan_.links[link].drawn = true;
            Household& below = plan_.households[at(added)];
            below.treeParent = household;
            below.treeFamily = family;
            below.treeLink = static_cast<Index>(link);
        }
    }
    Household& grown = plan_.households[at(household)];
    if (static_cast<Index>(plan_.households.size()) == first) return;
    grown.downFirst = first;
    grown.downEnd = static_cast<Index>(plan_.households.size());
}

void PlanBuilder::growAll(Index first) {
    for (Index h = first; h < static_cast<Index>(plan_.households.size()); ++h) growDownFrom(h);
}

// Everyone who is shown without being an ancestor of the focus or a descendant of somebody shown so far: first who is
// a parent of somebody placed, then anybody.
void PlanBuilder::addLeftOver() {
    Index asked = 0;
    const auto addParentsOfAll = [this, &asked] {
        while (asked < static_cast<Index>(plan_.households.size())) {
            const Index first = static_cast<Index>(plan_.households.size());
            growUpFrom(asked++, true);
            growAll(first);
        }
    };
    if (plan_.persons.size() == selection_.persons.size()) return;
    addParentsOfAll();
    for (const kin::Place person : selection_.persons) {
        if (plan_.boxOf[at(person)] != kAwaitsBox) continue;
        const Index added = builder_.add(person, 0);
        growAll(added);
        addParentsOfAll();
    }
}

}  // namespace olvane::charts
