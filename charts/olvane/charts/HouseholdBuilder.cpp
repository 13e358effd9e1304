// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The row is found from the lead outwards, each side as a depth-first walk over couples with a stack of its own.
// Then come the couples, whose lines are direct or over the boxes between, and last the places where families
// drop their lines.

#include <olvane/charts/HouseholdBuilderInternal.h>

#include <algorithm>
#include <cstdlib>
#include <utility>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

constexpr kin::UnionPlace kNoUnion = -1;
constexpr float kAloneStep = 8;  // between lines to the children of several families of one parent

// Tracks for lines over the boxes of one row.
constexpr std::uint16_t kMostOverHeight = 12;

// How many lines fit side by side on a piece of a box's edge.
int linesThatFit(float length) {
    return static_cast<int>(std::min(length / kLeastLineGap, 10000.0F)) - 1;
}

}  // namespace

Index HouseholdBuilder::add(kin::Place lead, std::int32_t row, kin::Place beside) {
    const Index household = static_cast<Index>(plan_.households.size());
    firstBox_ = static_cast<Index>(plan_.persons.size());
    Household& added = plan_.households.emplace_back();
    added.row = row;
    added.firstBox = firstBox_;
    added.firstFamily = static_cast<Index>(plan_.families.size());

    left_.clear();
    right_.clear();
    leadSpouses_.clear();
    plan_.boxOf[at(lead)] = firstBox_;
    gatherSpouses(lead, leadSpouses_);
    if (leadSpouses_.empty()) {
        addAlone(lead);
    } else {
        const std::size_t onTheLeft = splitSpouses(lead, beside);
        spouses_.assign(leadSpouses_.begin(), leadSpouses_.begin() + static_cast<std::ptrdiff_t>(onTheLeft));
        followOutwards(spouses_, true, left_);
        spouses_.assign(leadSpouses_.begin() + static_cast<std::ptrdiff_t>(onTheLeft), leadSpouses_.end());
        followOutwards(spouses_, false, right_);
        placeBoxes(lead);
    }
    families_.clear();
    joinCouples(left_);
    joinCouples(right_);
    for (Index box = firstBox_; box < static_cast<Index>(plan_.persons.size()); ++box) addFamiliesAlone(box);
    placeDrops();
    commitFamilies(household);
    return household;
}

void HouseholdBuilder::addAlone(kin::Place person) {
    const float width = sizes_.width(person);
    plan_.households.back().width = width;
    plan_.persons.push_back(person);
    plan_.householdOf.push_back(static_cast<Index>(plan_.households.size()) - 1);
    plan_.boxX.push_back(0);
    plan_.boxWidth.push_back(width);
    plan_.isCovered.push_back(false);
    joinedBy_.assign(1, kNoUnion);
}

// Shown partners who are in no household so far, in the order of the data. From now on they are in this one.
void HouseholdBuilder::gatherSpouses(kin::Place person, std::vector<Joined>& spouses) {
    for (const kin::UnionPlace u : graph_.unionsAsPartner(person)) {
        const kin::Place other = graph_.otherPartner(u, person);
        if (other == kin::kNobody || plan_.boxOf[at(other)] != kAwaitsBox) continue;
        plan_.boxOf[at(other)] = firstBox_;
        spouses.push_back({other, person, u});
    }
}

// The row on one side, from the inside outwards. Read from left to right, everybody's spouses are in the order of
// the data on both sides: so leftwards the last of them comes first.
void HouseholdBuilder::followOutwards(std::vector<Joined>& spouses, bool leftwards,
                                      std::vector<Joined>& side) {
    const auto push = [this, leftwards](std::vector<Joined>& some) {
        if (!leftwards) std::reverse(some.begin(), some.end());
        stack_.insert(stack_.end(), some.begin(), some.end());
    };
    stack_.clear();
    push(spouses);
    while (!stack_.empty()) {
        const Joined next = stack_.back();
        stack_.pop_back();
        side.push_back(next);
        spouses.clear();
        gatherSpouses(next.person, spouses);
        push(spouses);
    }
}

// How many of the spouses of the lead stand on its left; the list is in their order from left to right.
std::size_t HouseholdBuilder::splitSpouses(kin::Place lead, kin::Place beside) {
    const auto isHusbandOf = [this, lead](const Joined& one) { return graph_.partners(one.u)[1] == lead; };
    if (leadSpouses_.size() == 1) return isHusbandOf(leadSpouses_[0]) ? 1 : 0;
    const auto found = std::find_if(leadSpouses_.begin(), leadSpouses_.end(),
                                    [beside](const Joined& one) { return one.person == beside; });
    if (found == leadSpouses_.end()) return leadSpouses_.size() / 2;
    if (isHusbandOf(*found)) {
        std::rotate(leadSpouses_.begin(), found, found + 1);
        return 1;
    }
    std::rotate(found, found + 1, leadSpouses_.end());
    return leadSpouses_.size() - 1;
}

void HouseholdBuilder::placeBoxes(kin::Place lead) {
    const Index household = static_cast<Index>(plan_.households.size()) - 1;
    const float gap = std::max(sizes_.gapX(), 2 * kLeastLineGap);
    float x = 0;
    joinedBy_.clear();
    const auto place = [&](kin::Place person, kin::UnionPlace u) {
        plan_.boxOf[at(person)] = static_cast<Index>(plan_.persons.size());
        plan_.persons.push_back(person);
        plan_.householdOf.push_back(household);
        plan_.boxX.push_back(x);
        plan_.boxWidth.push_back(sizes_.width(person));
        plan_.isCovered.push_back(false);
        joinedBy_.push_back(u);
        x += plan_.boxWidth.back() + gap;
    };
    for (auto one = left_.rbegin(); one != left_.rend(); ++one) place(one->person, one->u);
    place(lead, kNoUnion);
    for (const Joined& one : right_) place(one.person, one.u);
    plan_.households.back().width = x - gap;
}

// One family for each couple on a side: direct where nobody stands between.
void HouseholdBuilder::joinCouples(const std::vector<Joined>& side) {
    for (const Joined& one : side) {
        const auto& two = graph_.partners(one.u);
        PlannedFamily family;
        family.u = one.u;
        family.parents[0] = plan_.boxOf[at(two[0])];
        family.parents[1] = plan_.boxOf[at(two[1])];
        family.holder = plan_.boxOf[at(one.person)];
        const Index between = std::abs(family.parents[0] - family.parents[1]) - 1;
        family.coupleLine = between == 0 ? CoupleLine::direct : CoupleLine::over;
        families_.push_back(family);
    }
    chooseOverLines(side);
}

// Lines over the boxes leave the top of the inner partner side by side, the farthest nearest to its centre. The
// farthest of too many get a mark instead.
void HouseholdBuilder::chooseOverLines(const std::vector<Joined>& side) {
    PlannedFamily* const own = families_.data() + (families_.size() - side.size());
    counts_.assign(plan_.persons.size() - at(firstBox_), 0);
    for (std::size_t i = 0; i < side.size(); ++i) {
        if (own[i].coupleLine != CoupleLine::over) continue;
        const Index from = plan_.boxOf[at(side[i].from)];
        int& lines = counts_[at(from - firstBox_)];
        if (lines < linesThatFit(widthOf(from) / 2 - kLeastLineGap)) {
            own[i].overHeight = static_cast<std::uint16_t>(++lines);
        } else {
            standAlone(own[i]);
        }
    }
    covered_.clear();
    for (std::size_t i = 0; i < side.size(); ++i) {
        if (own[i].coupleLine == CoupleLine::over) placeOverLine(own[i], plan_.boxOf[at(side[i].from)]);
    }
}

void HouseholdBuilder::standAlone(PlannedFamily& family) {
    family.coupleLine = CoupleLine::alone;
    family.partnersMarked = true;
}

// A line lies one track above all those that it passes over: these begin at the same box or farther out, and end
// before it does.
void HouseholdBuilder::placeOverLine(PlannedFamily& family, Index from) {
    const bool leftwards = family.holder < from;
    const float room = widthOf(from) / 2 - kLeastLineGap;
    const int lines = counts_[at(from - firstBox_)] + 1;
    const float depart =
        kLeastLineGap + room * static_cast<float>(lines - family.overHeight) / static_cast<float>(lines);
    family.departX = leftwards ? -depart : depart;
    std::uint16_t below = 0;
    while (!covered_.empty() && (leftwards ? covered_.back().first <= from : covered_.back().first >= from)) {
        below = std::max(below, covered_.back().second);
        covered_.pop_back();
    }
    if (below == kMostOverHeight) {
        standAlone(family);
        covered_.emplace_back(from, below);
        return;
    }
    family.overHeight = static_cast<std::uint16_t>(below + 1);
    covered_.emplace_back(from, family.overHeight);
    for (Index box = std::min(from, family.holder) + 1; box < std::max(from, family.holder); ++box) {
        plan_.isCovered[at(box)] = true;
    }
}

bool HouseholdBuilder::isJoinedBy(Index box, kin::UnionPlace u) const {
    return joinedBy_[at(box - firstBox_)] == u;
}

// The families of a person that hang from that box alone: the other parent is not shown or not known, or is the
// same person, or the two have a line already that goes another way.
void HouseholdBuilder::addFamiliesAlone(Index box) {
    const kin::Place person = plan_.persons[at(box)];
    for (const kin::UnionPlace u : graph_.unionsAsPartner(person)) {
        const kin::Place other = graph_.otherPartner(u, person);
        const bool isCouple = other != kin::kNobody && other != person && plan_.boxOf[at(other)] != kNone;
        PlannedFamily family;
        family.u = u;
        family.holder = box;
        if (isCouple) {
            const Index otherBox = plan_.boxOf[at(other)];
            if (otherBox < box || isJoinedBy(box, u) || isJoinedBy(otherBox, u)) continue;
            family.parents[0] = plan_.boxOf[at(graph_.partners(u)[0])];
            family.parents[1] = plan_.boxOf[at(graph_.partners(u)[1])];
            family.partnersMarked = true;
        } else {
            family.parents[0] = box;
            const auto children = graph_.children(u);
            if (std::none_of(children.begin(), children.end(),
                             [this](kin::Place child) { return plan_.boxOf[at(child)] != kNone; })) {
                continue;
            }
        }
        families_.push_back(family);
    }
}

// Couples drop their line between the boxes, parents alone from the bottom of the box, side by side.
void HouseholdBuilder::placeDrops() {
    counts_.assign(plan_.persons.size() - at(firstBox_), 0);
    for (const PlannedFamily& family : families_) {
        if (family.coupleLine == CoupleLine::alone) ++counts_[at(family.holder - firstBox_)];
    }
    dropped_.assign(counts_.size(), 0);
    for (PlannedFamily& family : families_) {
        if (family.coupleLine == CoupleLine::alone) {
            placeDropAlone(family, counts_[at(family.holder - firstBox_)],
                           dropped_[at(family.holder - firstBox_)]++);
            continue;
        }
        // The holder is the outer of the two, and the gap is on its inner side.
        const Index other = family.parents[0] == family.holder ? family.parents[1] : family.parents[0];
        const Index leftOfGap = family.holder < other ? family.holder : family.holder - 1;
        const float leftEdge = plan_.boxX[at(leftOfGap)] + widthOf(leftOfGap);
        family.dropX = (leftEdge + plan_.boxX[at(leftOfGap + 1)]) / 2;
    }
    const auto isLeft = [](const PlannedFamily& a, const PlannedFamily& b) { return a.dropX < b.dropX; };
    if (!std::is_sorted(families_.begin(), families_.end(), isLeft)) {
        kin::mergeSort(families_.begin(), families_.end(), isLeft);
    }
}

void HouseholdBuilder::placeDropAlone(PlannedFamily& family, int count, int order) const {
    const float width = widthOf(family.holder);
    const int fits = std::max(1, linesThatFit(width));
    const int drops = std::min(count, fits);
    const float step = std::min(kAloneStep, width / static_cast<float>(drops + 1));
    family.hasDrop = order < fits;
    const float place = static_cast<float>(std::min(order, drops - 1)) - static_cast<float>(drops - 1) / 2;
    family.dropX = plan_.centreOf(family.holder) + step * place;
}

void HouseholdBuilder::commitFamilies(Index household) {
    for (PlannedFamily& family : families_) {
        family.household = household;
        family.firstLink = static_cast<std::uint32_t>(plan_.links.size());
        const auto children = graph_.children(family.u);
        const auto kinds = graph_.childKinds(family.u);
        for (std::size_t i = 0; i < children.size(); ++i) {
            if (plan_.boxOf[at(children[i])] == kNone) continue;
            plan_.links.push_back({children[i], false, 0, kinds[i]});
        }
        plan_.families.push_back(family);
    }
}

}  // namespace olvane::charts
