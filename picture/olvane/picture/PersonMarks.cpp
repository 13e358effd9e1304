// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/PersonMarksInternal.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <set>
#include <span>
#include <tuple>
#include <utility>
#include <vector>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::picture {

namespace {

using kin::at;

// kNobody for an unknown parent, and for who is not in the graph.
kin::Place personOf(const kin::KinGraph& graph, const Box& box) {
    return box.kind == BoxKind::person ? graph.placeOf(box.id) : kin::kNobody;
}

double distanceFromFocus(const Picture& picture, Index box) {
    const Box& focus = picture.boxes[at(picture.focus)];
    const double dx = picture.boxes[at(box)].x - focus.x;
    const double dy = picture.boxes[at(box)].y - focus.y;
    return dx * dx + dy * dy;
}

void markRepeats(std::span<const Index> boxes, std::int32_t number, Picture& picture) {
    for (std::size_t i = 0; i < boxes.size(); ++i) {
        picture.boxes[at(boxes[i])].repeat = static_cast<std::int32_t>(i) + 1;
        if (i > 0) picture.marks.push_back({{boxes[0], boxes[i], kNone}, number, MarkKind::samePerson});
    }
}

// Everybody once, in however many families.
void countHiddenOf(const kin::KinGraph& graph, kin::Place person, const std::vector<bool>& shown, Box& box) {
    std::vector<kin::Place> parents;
    std::vector<kin::Place> partners;
    std::vector<kin::Place> children;
    for (const kin::UnionPlace u : graph.unionsAsChild(person)) {
        const auto& two = graph.partners(u);
        parents.insert(parents.end(), two.begin(), two.end());
    }
    for (const kin::UnionPlace u : graph.unionsAsPartner(person)) {
        partners.push_back(graph.otherPartner(u, person));
        const auto all = graph.children(u);
        children.insert(children.end(), all.begin(), all.end());
    }
    const auto countOf = [&shown](std::vector<kin::Place>& persons) {
        std::erase_if(persons, [&](kin::Place p) { return p == kin::kNobody || shown[at(p)]; });
        kin::mergeSort(persons.begin(), persons.end());
        return static_cast<std::int32_t>(std::unique(persons.begin(), persons.end()) - persons.begin());
    };
    box.hiddenParents = countOf(parents);
    box.hiddenPartners = countOf(partners);
    box.hiddenChildren = countOf(children);
}

class ElsewhereMarker {
public:
    ElsewhereMarker(const kin::KinGraph& graph, Picture& picture) : graph_(graph), picture_(picture) {}

    void mark() {
        firstBox_.assign(at(graph_.personCount()), kNone);
        std::set<kin::UnionPlace> unions;
        for (std::size_t i = 0; i < picture_.boxes.size(); ++i) {
            const kin::Place person = personOf(graph_, picture_.boxes[i]);
            if (person == kin::kNobody || picture_.boxes[i].repeat > 1) continue;
            firstBox_[at(person)] = static_cast<Index>(i);
            for (const kin::UnionPlace u : graph_.unionsAsPartner(person)) unions.insert(u);
        }
        listExpressed();
        for (const kin::UnionPlace u : unions) markUnion(u);
    }

private:
    using Relation = std::pair<kin::Place, kin::Place>;

    kin::Place personOfBox(Index box) const { return personOf(graph_, picture_.boxes[at(box)]); }

    // The person's first box; kNone for who is not shown.
    Index firstBox(kin::Place person) const { return person == kin::kNobody ? kNone : firstBox_[at(person)]; }

    void listExpressed() {
        for (const Family& family : picture_.families) {
            const auto parents = picture_.parents(family);
            if (parents.size() == 2)
                addBothWays(expressedPartners_, personOfBox(parents[0]), personOfBox(parents[1]));
            for (const Index child : picture_.children(family)) {
                for (const Index parent : parents)
                    expressedParents_.emplace(personOfBox(child), personOfBox(parent));
            }
        }
    }

    static void addBothWays(std::set<Relation>& expressed, kin::Place a, kin::Place b) {
        expressed.emplace(a, b);
        expressed.emplace(b, a);
    }

    void markUnion(kin::UnionPlace u) {
        const auto& partners = graph_.partners(u);
        const Index one = firstBox(partners[0]);
        const Index other = firstBox(partners[1]);
        const bool areExpressed =
            partners[0] == partners[1] || expressedPartners_.contains({partners[0], partners[1]});
        if (one != kNone && other != kNone && !areExpressed) {
            addMark(one, other, kNone, MarkKind::partnersElsewhere);
            addBothWays(expressedPartners_, partners[0], partners[1]);
        }
        for (const kin::Place child : graph_.children(u)) {
            if (firstBox(child) == kNone) continue;
            std::vector<Index> unmarked;
            for (const kin::Place parent : partners) {
                if (firstBox(parent) != kNone && expressedParents_.emplace(child, parent).second) {
                    unmarked.push_back(firstBox(parent));
                }
            }
            if (unmarked.empty()) continue;
            addMark(firstBox(child), unmarked[0], unmarked.size() > 1 ? unmarked[1] : kNone,
                    MarkKind::parentsElsewhere);
        }
    }

    void addMark(Index a, Index b, Index c, MarkKind kind) {
        const std::int32_t number = picture_.marks.empty() ? 1 : picture_.marks.back().number + 1;
        picture_.marks.push_back({{a, b, c}, number, kind});
    }

    const kin::KinGraph& graph_;
    Picture& picture_;
    std::vector<Index> firstBox_;  // by person
    std::set<Relation> expressedParents_;
    std::set<Relation> expressedPartners_;
};

}  // namespace

void numberRepeats(Picture& picture) {
    std::vector<Index> order;
    for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
        if (picture.boxes[i].kind == BoxKind::person) order.push_back(static_cast<Index>(i));
    }
    const auto key = [&picture](Index i) {
        return std::tuple(picture.boxes[at(i)].id, distanceFromFocus(picture, i), i);
    };
    kin::mergeSort(order.begin(), order.end(), [&](Index a, Index b) { return key(a) < key(b); });
    std::vector<std::span<const Index>> repeated;
    for (std::size_t i = 0, next = 0; i < order.size(); i = next) {
        while (next < order.size() && picture.boxes[at(order[next])].id == picture.boxes[at(order[i])].id)
            ++next;
        if (next - i > 1) repeated.push_back(std::span(order).subspan(i, next - i));
    }
    // Numbers run in the order of the first boxes.
    kin::mergeSort(repeated.begin(), repeated.end(), [](const auto& a, const auto& b) {
        return *std::min_element(a.begin(), a.end()) < *std::min_element(b.begin(), b.end());
    });
    std::int32_t number = 0;
    for (const std::span<const Index> boxes : repeated) markRepeats(boxes, ++number, picture);
}

void countHidden(const kin::KinGraph& graph, Picture& picture) {
    std::vector<bool> shown(at(graph.personCount()));
    for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
        const kin::Place person = personOf(graph, picture.boxes[i]);
        if (person != kin::kNobody) shown[at(person)] = true;
    }
    for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
        const kin::Place person = personOf(graph, picture.boxes[i]);
        if (person != kin::kNobody) countHiddenOf(graph, person, shown, picture.boxes[i]);
    }
}

void markShownElsewhere(const kin::KinGraph& graph, Picture& picture) {
    ElsewhereMarker(graph, picture).mark();
}

}  // namespace olvane::picture
