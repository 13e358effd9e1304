// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Ways over marriages between persons whom blood or law joins by a shorter way: ring by ring from A, link by link,
// since whom a way may go on to depends on the last link.

#include <algorithm>
#include <limits>
#include <unordered_map>

#include <olvane/kin/KinSumsInternal.h>
#include <olvane/kin/MarriageWaysInternal.h>
#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::kin {

namespace {

constexpr std::size_t kMostSteps = 40'000;
constexpr std::size_t kMostTries = 20'000;

// The last link of ways that can be read alike.
struct Step {
    Place from;
    Place to;
    Readings readings;
    std::int32_t length;
    std::int32_t firstBefore;  // in the list of predecessors
};

struct Before {
    std::int32_t step;
    std::int32_t next;
};

class FartherSearch {
public:
    FartherSearch(const KinLinks& links, Place a, Place b) : links_(links), a_(a), b_(b) {}

    MarriageWays find(std::size_t limit) {
        MarriageWays result;
        step(-1, {a_, a_, kReadsUp, 0, -1});
        for (std::size_t next = 0; next < steps_.size(); ++next) {
            if (steps_[next].length >= shortest_) break;
            if (steps_.size() > kMostSteps) {
                result.count = std::nullopt;
                return result;
            }
            goOn(static_cast<std::int32_t>(next));
        }
        if (goals_.empty()) return result;
        const bool areAll = listBackwards(result.ways);
        result.count =
            areAll && !result.ways.empty() ? std::optional(std::uint64_t{result.ways.size()}) : std::nullopt;
        order(result.ways, limit);
        return result;
    }

private:
    void goOn(std::int32_t index) {
        const Step here = steps_[at(index)];
        if (here.to == b_) return;
        for (const Neighbor& neighbor : links_.neighbors(here.to)) {
            if (neighbor.person == here.from || neighbor.person == a_) continue;
            if (here.from != here.to && links_.kindsBetween(here.from, neighbor.person) != 0) continue;
            const Readings readings = readingsAfter(here.readings, neighbor.kinds);
            step(index, {here.to, neighbor.person, readings, here.length + 1, -1});
        }
    }

    void step(std::int32_t before, const Step& made) {
        const std::uint64_t link =
            (static_cast<std::uint64_t>(made.from) << 32U) | static_cast<std::uint64_t>(made.to);
        const auto [found, isNew] =
            known_[made.readings].emplace(link, static_cast<std::int32_t>(steps_.size()));
        if (isNew) {
            steps_.push_back(made);
            if (made.to == b_ && (made.readings & kReadsMore) != 0) {
                shortest_ = made.length;
                goals_.push_back(found->second);
            }
        }
        Step& kept = steps_[at(found->second)];
        if (before < 0 || kept.length != made.length) return;
        befores_.push_back({before, kept.firstBefore});
        kept.firstBefore = static_cast<std::int32_t>(befores_.size()) - 1;
    }

    // Answers whether all ways were tried.
    bool listBackwards(std::vector<MarriageWay>& ways) const {
        struct Level {
            std::int32_t step;
            std::int32_t nextBefore;
        };
        std::size_t tries = 0;
        for (const std::int32_t goal : goals_) {
            std::vector<Level> path{{goal, steps_[at(goal)].firstBefore}};
            while (!path.empty()) {
                if (++tries > kMostTries) return false;
                Level& level = path.back();
                if (steps_[at(level.step)].length == 0) addIfSimple(path, ways);
                if (level.nextBefore < 0) {
                    path.pop_back();
                    continue;
                }
                const Before& before = befores_[at(level.nextBefore)];
                level.nextBefore = before.next;
                path.push_back({before.step, steps_[at(before.step)].firstBefore});
            }
        }
        return true;
    }

    template <class Path>
    void addIfSimple(const Path& path, std::vector<MarriageWay>& ways) const {
        MarriageWay way;
        for (auto level = path.rbegin(); level != path.rend(); ++level)
            way.persons.push_back(steps_[at(level->step)].to);
        std::vector<Place> sorted = way.persons;
        mergeSort(sorted.begin(), sorted.end());
        if (std::adjacent_find(sorted.begin(), sorted.end()) == sorted.end()) ways.push_back(std::move(way));
    }

    void order(std::vector<MarriageWay>& ways, std::size_t limit) const {
        const KinGraph& graph = links_.graph();
        const auto byId = [&graph](Place one, Place other) { return graph.id(one) < graph.id(other); };
        mergeSort(ways.begin(), ways.end(), [&byId](const MarriageWay& one, const MarriageWay& other) {
            return std::lexicographical_compare(one.persons.begin(), one.persons.end(), other.persons.begin(),
                                                other.persons.end(), byId);
        });
        if (ways.size() > limit) ways.resize(limit);
    }

    const KinLinks& links_;
    Place a_;
    Place b_;
    std::int32_t shortest_ = std::numeric_limits<std::int32_t>::max();
    std::vector<Step> steps_;
    std::vector<Before> befores_;
    std::vector<std::int32_t> goals_;
    std::array<std::unordered_map<std::uint64_t, std::int32_t>, 8> known_;
};

}  // namespace

MarriageWays findFartherMarriageWays(const KinLinks& links, Place a, Place b, std::size_t limit) {
    return FartherSearch(links, a, b).find(limit);
}

}  // namespace olvane::kin
