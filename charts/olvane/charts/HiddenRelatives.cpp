// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/HiddenRelativesInternal.h>

#include <algorithm>
#include <span>

#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

constexpr std::size_t kMostCompared = 64;  // unions of one person that are compared with one another

class HiddenRelatives {
public:
    HiddenRelatives(const kin::KinGraph& graph, kin::Place person, const std::vector<bool>& shown)
        : graph_(graph), person_(person), shown_(shown) {}

    void countParents(picture::Box& box) const {
        const auto asChild = graph_.unionsAsChild(person_);
        for (std::size_t i = 0; i < asChild.size(); ++i) {
            const auto& two = graph_.partners(asChild[i]);
            for (std::size_t slot = 0; slot < 2; ++slot) {
                if (!isHidden(two[slot]) || (slot == 1 && two[0] == two[1])) continue;
                if (!metBefore(two[slot], asChild, i)) ++box.hiddenParents;
            }
        }
    }

    void countPartnersAndChildren(picture::Box& box) const {
        const auto asPartner = graph_.unionsAsPartner(person_);
        for (std::size_t i = 0; i < asPartner.size(); ++i) {
            const kin::Place other = graph_.otherPartner(asPartner[i], person_);
            if (isHidden(other) && !metBefore(other, asPartner, i)) ++box.hiddenPartners;
            for (const kin::Place child : graph_.children(asPartner[i])) {
                if (isHidden(child) && firstUnionWith(child) == asPartner[i]) ++box.hiddenChildren;
            }
        }
    }

private:
    bool isHidden(kin::Place one) const { return one != kin::kNobody && !shown_[at(one)]; }
    bool isIn(kin::Place one, kin::UnionPlace u) const {
        return graph_.partners(u)[0] == one || graph_.partners(u)[1] == one;
    }
    bool metBefore(kin::Place one, std::span<const kin::UnionPlace> unions, std::size_t end) const {
        for (std::size_t i = 0; i < std::min(end, kMostCompared); ++i) {
            if (isIn(one, unions[i])) return true;
        }
        return false;
    }
    // Of a child's unions, the first that the person is a parent in.
    kin::UnionPlace firstUnionWith(kin::Place child) const {
        const auto parents = graph_.unionsAsChild(child);
        return *std::find_if(parents.begin(), parents.end(),
                             [this](kin::UnionPlace u) { return isIn(person_, u); });
    }

    const kin::KinGraph& graph_;
    kin::Place person_;
    const std::vector<bool>& shown_;
};

}  // namespace

void countHiddenRelatives(const kin::KinGraph& graph, kin::Place person, const std::vector<bool>& shown,
                          picture::Box& box) {
    const HiddenRelatives hidden(graph, person, shown);
    hidden.countParents(box);
    hidden.countPartnersAndChildren(box);
}

}  // namespace olvane::charts
