// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/SelectionInternal.h>

#include <limits>
#include <utility>

#include <olvane/charts/NearPersonsInternal.h>

namespace olvane::charts {

namespace {

constexpr int kAllGenerations = 0;

class Selector {
public:
    Selector(const kin::KinGraph& graph, kin::Place focus) : graph_(graph) {
        chosen_.shown.assign(at(graph.personCount()), false);
        chosen_.isLine.assign(at(graph.personCount()), false);
        addToLine(focus);
        lineLevels_.push_back(1);
    }

    // Ancestors to so many generations; nobody is reached over somebody whom `admit` refuses.
    template <class Admit>
    void addAncestors(int generations, const Admit& admit) {
        for (std::size_t i = 0; i < chosen_.line.size(); ++i) {
            if (i == lineLevels_.back()) lineLevels_.push_back(chosen_.line.size());
            if (generations != kAllGenerations && lineLevels_.size() > at(generations)) break;
            for (const kin::UnionPlace u : graph_.unionsAsChild(chosen_.line[i])) {
                for (const kin::Place parent : graph_.partners(u)) {
                    if (parent == kin::kNobody || chosen_.isLine[at(parent)] || !admit(parent)) continue;
                    addToLine(parent);
                }
            }
        }
        if (lineLevels_.back() != chosen_.line.size()) lineLevels_.push_back(chosen_.line.size());
    }

    // The descendants of the focus to so many generations.
    void addDescendants(int generations) { descend({chosen_.line[0]}, {1}, generations); }

    // The descendants of the focus and of every ancestor, to so many generations below the focus's own. The
    // earliest generation comes first, so that everybody is met over the most generous way.
    void addRelatives(int generations) {
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
        descend(roots, ends, all ? kAllGenerations : generations + above);
    }

    // The children of the families that somebody of the line is a child of.
    void addSiblings() {
        for (const kin::Place person : chosen_.line) {
            for (const kin::UnionPlace u : graph_.unionsAsChild(person)) {
                const auto& two = graph_.partners(u);
                if (!isShown(two[0]) && !isShown(two[1])) continue;
                for (const kin::Place child : graph_.children(u)) show(child);
            }
        }
    }

    void addSpouses() {
        const std::size_t end = chosen_.persons.size();
        for (std::size_t i = 0; i < end; ++i) {
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
    void descend(const std::vector<kin::Place>& roots, const std::vector<std::size_t>& ends,
                 int generations) {
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
                    for (const kin::Place child : graph_.children(u)) {
                        if (met[at(child)]) continue;
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
    Selection chosen_;
    std::vector<std::size_t> lineLevels_;  // where each generation of the line ends
};

const auto kAdmitAll = [](kin::Place) { return true; };

}  // namespace

Selection selectPersons(const kin::KinGraph& graph, const ChartRequest& request) {
    if (request.view == View::near) {
        return selectionOf(graph, request.focus, nearPersons(graph, request.focus, request.layout));
    }
    Selector selector(graph, request.focus);
    if (request.view != View::descendants) selector.addAncestors(request.up, kAdmitAll);
    if (request.view == View::relatives) {
        selector.addRelatives(request.down);
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
