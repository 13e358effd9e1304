// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/SelectionInternal.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <span>
#include <utility>
#include <vector>

#include <olvane/charts/NearPersonsInternal.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

constexpr int kAllGenerations = 0;
const auto kAdmitAll = [](kin::Place) { return true; };

// Where a walk from the focus outwards must not go on.
class ClosedBranches {
public:
    ClosedBranches(const kin::KinGraph& graph, std::span<const Fold> folded) : graph_(graph) {
        for (const Fold& fold : folded) {
            const kin::Place person = graph.placeOf(fold.person);
            if (person == kin::kNobody) continue;
            if (fold.branch == picture::Branch::up) up_.push_back(person);
            if (fold.branch == picture::Branch::beside) beside_.push_back(person);
            if (fold.branch == picture::Branch::down) close(graph.unionsAsPartner(person));
        }
        kin::mergeSort(up_.begin(), up_.end());
        kin::mergeSort(beside_.begin(), beside_.end());
        kin::mergeSort(unions_.begin(), unions_.end());
    }

    // Of the focus and its ancestors, siblings are beside as well; of others they are their parents' descendants.
    void closeSiblings(const std::vector<bool>& isLine) {
        for (const kin::Place person : beside_) {
            if (isLine[at(person)]) close(graph_.unionsAsChild(person));
        }
        kin::mergeSort(unions_.begin(), unions_.end());
    }

    bool toParents(kin::Place person) const { return has(up_, person); }
    bool toPartners(kin::Place person) const { return has(beside_, person); }
    bool toChildren(kin::UnionPlace u) const { return has(unions_, u); }

private:
    static bool has(const std::vector<std::int32_t>& places, std::int32_t place) {
        return !places.empty() && std::binary_search(places.begin(), places.end(), place);
    }
    void close(std::span<const kin::UnionPlace> unions) {
        unions_.insert(unions_.end(), unions.begin(), unions.end());
    }

    const kin::KinGraph& graph_;
    std::vector<std::int32_t> up_, beside_, unions_;
};

class Selector {
public:
    Selector(const kin::KinGraph& graph, kin::Place focus, std::span<const Fold> folded = {})
        : graph_(graph), closed_(graph, folded) {
        chosen_.shown.assign(at(graph.personCount()), false);
        chosen_.isLine.assign(at(graph.personCount()), false);
        addToLine(focus);
        lineLevels_.push_back(1);
    }

    // Ancestors as far as `generations` go; nobody is reached over somebody whom `admit` refuses.
    template <class Admit>
    void addAncestors(int generations, const Admit& admit) {
        for (std::size_t i = 0; i < chosen_.line.size(); ++i) {
            if (i == lineLevels_.back()) lineLevels_.push_back(chosen_.line.size());
            if (generations != kAllGenerations && lineLevels_.size() > at(generations)) break;
            if (closed_.toParents(chosen_.line[i])) continue;
            for (const kin::UnionPlace u : graph_.unionsAsChild(chosen_.line[i])) {
                for (const kin::Place parent : graph_.partners(u)) {
                    if (parent == kin::kNobody || chosen_.isLine[at(parent)] || !admit(parent)) continue;
                    addToLine(parent);
                }
            }
        }
        if (lineLevels_.back() != chosen_.line.size()) lineLevels_.push_back(chosen_.line.size());
        closed_.closeSiblings(chosen_.isLine);
    }

    // The descendants of the focus, as far as `generations` go.
    void addDescendants(int generations) { descend({chosen_.line[0]}, {1}, generations, kAdmitAll); }

    // The descendants of the focus and of every ancestor, up to that many generations below the focus's own. The
    // earliest generation comes first, so that everybody is met over the most generous way, though not over somebody
    // whom `admit` refuses.
    template <class Admit>
    void addRelatives(int generations, const Admit& admit) {
        std::vector<kin::Place> roots;
        std::vector<std::size_t> ends;
        for (std::size_t level = lineLevels_.size(); level-- > 0;) {
            const std::size_t first = level == 0 ? 0 : lineLevels_[level - 1];
            roots.insert(roots.end(), chosen_.line.begin() + static_cast<std::ptrdiff_t>(first),
                         chosen_.line.begin() + static_cast<std::ptrdiff_t>(lineLevels_[level]));
            ends.push_back(roots.size());
        }
        const int above = static_cast<int>(lineLevels_.size()) - 1;
        const bool all =
            generations == kAllGenerations || generations > std::numeric_limits<int>::max() - above;
        descend(roots, ends, all ? kAllGenerations : generations + above, admit);
    }

    // The children of the families that somebody of the line is a child of. A parent who is there as a sibling alone, as
    // in families that run in a circle, does not count, so that the order of the line has no say.
    void addSiblings() {
        std::vector<kin::Place> siblings;
        for (const kin::Place person : chosen_.line) {
            for (const kin::UnionPlace u : graph_.unionsAsChild(person)) {
                const auto& two = graph_.partners(u);
                if (closed_.toChildren(u) || (!isShown(two[0]) && !isShown(two[1]))) continue;
                const auto children = graph_.children(u);
                siblings.insert(siblings.end(), children.begin(), children.end());
            }
        }
        addPersons(siblings);
    }

    void addSpouses() {
        const std::size_t end = chosen_.persons.size();
        for (std::size_t i = 0; i < end; ++i) {
            if (closed_.toPartners(chosen_.persons[i])) continue;
            for (const kin::UnionPlace u : graph_.unionsAsPartner(chosen_.persons[i])) {
                const kin::Place other = graph_.otherPartner(u, chosen_.persons[i]);
                if (other != kin::kNobody) show(other);
            }
        }
    }

    void addPersons(const std::vector<kin::Place>& persons) {
        for (const kin::Place person : persons) show(person);
    }

    bool isShown(kin::Place person) const { return person != kin::kNobody && chosen_.shown[at(person)]; }
    Selection take() { return std::move(chosen_); }

private:
    void show(kin::Place person) {
        if (chosen_.shown[at(person)]) return;
        chosen_.shown[at(person)] = true;
        chosen_.persons.push_back(person);
    }

    void addToLine(kin::Place person) {
        show(person);
        chosen_.isLine[at(person)] = true;
        chosen_.line.push_back(person);
    }

    // Roots by generation: those up to ends[i] stand in generation i, and their children in generation i + 1.
    template <class Admit>
    void descend(const std::vector<kin::Place>& roots, const std::vector<std::size_t>& ends, int generations,
                 const Admit& admit) {
        std::vector<bool> met(at(graph_.personCount()), false);
        std::vector<kin::Place> level;
        std::vector<kin::Place> next;
        std::size_t root = 0;
        for (std::size_t generation = 0; generation < ends.size() || !level.empty(); ++generation) {
            for (; generation < ends.size() && root < ends[generation]; ++root) {
                if (met[at(roots[root])]) continue;
                met[at(roots[root])] = true;
                level.push_back(roots[root]);
            }
            if (generations != kAllGenerations && generation >= at(generations)) break;
            next.clear();
            for (const kin::Place person : level) {
                for (const kin::UnionPlace u : graph_.unionsAsPartner(person)) {
                    if (closed_.toChildren(u)) continue;
                    for (const kin::Place child : graph_.children(u)) {
                        if (met[at(child)] || !admit(child)) continue;
                        met[at(child)] = true;
                        show(child);
                        next.push_back(child);
                    }
                }
            }
            level.swap(next);
        }
    }

    const kin::KinGraph& graph_;
    ClosedBranches closed_;
    Selection chosen_;
    std::vector<std::size_t> lineLevels_;  // where each generation of the line ends
};

// Everybody whom a walk finds that keeps to those persons and turns around at the folded branches.
std::vector<bool> foundAmong(const std::vector<kin::Place>& persons, const kin::KinGraph& graph,
                             kin::Place focus, std::span<const Fold> folded) {
    const auto isAmong = [&persons](kin::Place person) {
        return std::binary_search(persons.begin(), persons.end(), person);
    };
    Selector selector(graph, focus, folded);
    selector.addAncestors(kAllGenerations, isAmong);
    selector.addRelatives(kAllGenerations, isAmong);
    selector.addSpouses();
    return selector.take().shown;
}

// The engine chooses them, and folds nothing: those whom only a folded branch leads to are left out afterwards.
Selection selectNear(const kin::KinGraph& graph, const ChartRequest& request) {
    std::vector<kin::Place> persons = nearPersons(graph, request.focus, request.layout);
    if (!request.folded.empty()) {
        const std::vector<bool> all = foundAmong(persons, graph, request.focus, {});
        const std::vector<bool> left = foundAmong(persons, graph, request.focus, request.folded);
        std::erase_if(persons, [&](kin::Place person) { return all[at(person)] && !left[at(person)]; });
    }
    return selectionOf(graph, request.focus, persons);
}

}  // namespace

Selection selectPersons(const kin::KinGraph& graph, const ChartRequest& request) {
    if (request.view == View::near) return selectNear(graph, request);
    Selector selector(graph, request.focus, request.folded);
    if (request.view != View::descendants) selector.addAncestors(request.up, kAdmitAll);
    if (request.view == View::relatives) {
        selector.addRelatives(request.down, kAdmitAll);
    } else if (request.view != View::ancestors) {
        selector.addDescendants(request.down);
    }
    if (request.spouses && request.view != View::ancestors) selector.addSpouses();
    if (request.siblings && request.view != View::relatives) selector.addSiblings();
    return selector.take();
}

Selection selectionOf(const kin::KinGraph& graph, kin::Place focus, const std::vector<kin::Place>& persons) {
    Selector selector(graph, focus);
    selector.addPersons(persons);
    selector.addAncestors(0, [&selector](kin::Place person) { return selector.isShown(person); });
    return selector.take();
}

}  // namespace olvane::charts
