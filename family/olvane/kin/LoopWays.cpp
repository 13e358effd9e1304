// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Ways in data with loops: partial ways from A, first up and then down, each with the length that it has at least
// when it comes to B. Persons that come twice are seen on each way by itself.

#include <algorithm>
#include <queue>
#include <tuple>
#include <unordered_map>

#include <olvane/kin/KinWaysInternal.h>

namespace olvane::kin {

namespace {

constexpr std::size_t kMostPartialWays = 100'000;
constexpr std::size_t kMostTies = 4096;

struct Parent {
    Place person;
    Bond bond;
};

class LoopSearch {
public:
    LoopSearch(const KinLinks& links, Place a, Place b, WaySort sort)
        : links_(links), a_(a), b_(b), sort_(sort) {}

    std::vector<KinWay> list(std::size_t limit, bool nearestAlone) {
        findDistances();
        std::vector<KinWay> ways;
        if (a_ == b_) return ways;
        open({a_, -1, 0, Bond::blood, false});
        int lastLength = -1;
        while (!open_.empty() && partial_.size() < kMostPartialWays) {
            const auto [length, index] = open_.top();
            open_.pop();
            if ((lastLength >= 0 && length > lastLength) || ways.size() >= limit + kMostTies) break;
            if (partial_[index].person == b_) {
                addWay(index, ways);
                if (!ways.empty() && (nearestAlone || ways.size() >= limit)) lastLength = length;
            } else {
                extend(index);
            }
        }
        sortWays(links_.graph(), ways, limit);
        return ways;
    }

private:
    struct Partial {
        Place person;
        std::int64_t before;
        int length;
        Bond bond;
        bool isDown;
    };
    using Entry = std::pair<int, std::size_t>;

    void parentsOf(Place child, std::vector<Parent>& parents) const {
        parents.clear();
        const auto up = sort_ == WaySort::blood ? links_.upByBlood(child) : links_.up(child);
        for (const UpLink& link : up) {
            if (!links_.isCouple(link.to)) {
                parents.push_back({link.to, link.bond});
            } else {
                for (const Place parent : links_.partnersOf(link.to)) parents.push_back({parent, link.bond});
            }
        }
    }

    // Down to B from all its ancestors; then up and down to B from all ancestors of A.
    void findDistances() {
        std::vector<Parent> parents;
        std::vector<Place> found{b_};
        downToB_.emplace(b_, 0);
        for (std::size_t next = 0; next < found.size(); ++next) {
            const Place child = found[next];
            const int distance = downToB_.at(child) + 1;
            parentsOf(child, parents);
            for (const Parent& parent : parents) {
                if (downToB_.emplace(parent.person, distance).second) found.push_back(parent.person);
                childrenToB_[parent.person].push_back({child, parent.bond});
            }
        }
        findClimbs();
    }

    void findClimbs() {
        std::vector<Parent> parents;
        std::vector<Place> found{a_};
        std::unordered_map<Place, std::vector<Place>> childrenToA;
        climbToB_.emplace(a_, -1);
        for (std::size_t next = 0; next < found.size(); ++next) {
            parentsOf(found[next], parents);
            for (const Parent& parent : parents) {
                childrenToA[parent.person].push_back(found[next]);
                if (climbToB_.emplace(parent.person, -1).second) found.push_back(parent.person);
            }
        }
        std::priority_queue<std::pair<int, Place>, std::vector<std::pair<int, Place>>, std::greater<>>
            nearest;
        for (const Place person : found) {
            const auto down = downToB_.find(person);
            if (down != downToB_.end()) nearest.push({down->second, person});
        }
        while (!nearest.empty()) {
            const auto [distance, person] = nearest.top();
            nearest.pop();
            int& known = climbToB_[person];
            if (known >= 0) continue;
            known = distance;
            for (const Place child : childrenToA[person]) nearest.push({distance + 1, child});
        }
    }

    bool isOn(std::size_t index, Place person) const {
        for (auto i = static_cast<std::int64_t>(index); i >= 0;
             i = partial_[static_cast<std::size_t>(i)].before) {
            if (partial_[static_cast<std::size_t>(i)].person == person) return true;
        }
        return false;
    }

    void open(const Partial& partial) {
        int left = -1;
        if (!partial.isDown) left = climbToB_.at(partial.person);
        if (partial.isDown) left = downToB_.at(partial.person);
        if (left < 0) return;
        partial_.push_back(partial);
        open_.push({partial.length + left, partial_.size() - 1});
    }

    void extend(std::size_t index) {
        const Partial here = partial_[index];
        const auto go = [this, index, &here](Place person, Bond bond, bool isDown) {
            if (isOn(index, person)) return;
            open({person, static_cast<std::int64_t>(index), here.length + 1, std::max(here.bond, bond),
                  isDown});
        };
        std::vector<Parent> parents;
        if (!here.isDown) {
            parentsOf(here.person, parents);
            for (const Parent& parent : parents) go(parent.person, parent.bond, false);
        }
        const auto children = childrenToB_.find(here.person);
        if (children == childrenToB_.end()) return;
        for (const Parent& child : children->second) go(child.person, child.bond, true);
    }

    void addWay(std::size_t index, std::vector<KinWay>& ways) const {
        KinWay way;
        way.bond = partial_[index].bond;
        if (sort_ == WaySort::otherBonds && way.bond == Bond::blood) return;
        for (auto i = static_cast<std::int64_t>(index); i >= 0;) {
            const Partial& partial = partial_[static_cast<std::size_t>(i)];
            way.persons.push_back(partial.person);
            (partial.isDown ? way.down : way.up) += 1;
            i = partial.before;
        }
        --way.up;  // A was counted among those who go up
        std::reverse(way.persons.begin(), way.persons.end());
        way.ancestors = {way.persons[static_cast<std::size_t>(way.up)]};
        if (way.up > 0 && way.down > 0 && !addPartner(way)) return;
        way.half = isHalfWay(links_, way);
        ways.push_back(std::move(way));
    }

    // The other of the couple that both children share. False where that one is the first of the couple, over whom
    // the way is listed.
    bool addPartner(KinWay& way) const {
        const auto top = static_cast<std::size_t>(way.up);
        for (const UpLink& link : linksOf(way.persons[top - 1])) {
            if (!links_.isCouple(link.to)) continue;
            const auto others = linksOf(way.persons[top + 1]);
            const bool isShared = std::any_of(others.begin(), others.end(),
                                              [&link](const UpLink& other) { return other.to == link.to; });
            const auto& partners = links_.partnersOf(link.to);
            const std::size_t slot = partners[0] == way.ancestors[0] ? 0 : 1;
            if (!isShared || partners[slot] != way.ancestors[0]) continue;
            const Place other = partners[1 - slot];
            if (std::find(way.persons.begin(), way.persons.end(), other) != way.persons.end()) return true;
            if (slot == 1) return false;
            way.ancestors.push_back(other);
            return true;
        }
        return true;
    }

    std::span<const UpLink> linksOf(Place person) const {
        return sort_ == WaySort::blood ? links_.upByBlood(person) : links_.up(person);
    }

    const KinLinks& links_;
    Place a_;
    Place b_;
    WaySort sort_;
    std::unordered_map<Place, int> downToB_;
    std::unordered_map<Place, std::vector<Parent>> childrenToB_;
    std::unordered_map<Place, int> climbToB_;
    std::vector<Partial> partial_;
    std::priority_queue<Entry, std::vector<Entry>, std::greater<>> open_;
};

}  // namespace

std::vector<KinWay> listWaysInLoops(const KinLinks& links, Place a, Place b, WaySort sort, std::size_t limit,
                                    bool nearestAlone) {
    return LoopSearch(links, a, b, sort).list(limit, nearestAlone);
}

}  // namespace olvane::kin
