// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Members whom neither the connected lines of their family nor a mark reaches.

#include <olvane/picture/PictureJudgeInternal.h>

#include <algorithm>
#include <limits>
#include <map>

#include <olvane/kin/shared/Index.h>

namespace olvane::picture {

using kin::at;

namespace {

constexpr std::size_t kNoGroup = std::numeric_limits<std::size_t>::max();

}  // namespace

// Reached is who is in the group of the family with most members; where no line is drawn, nobody,
// but for the one who is left when all others have marks.
void PictureJudge::listUnjoined() {
    const std::vector<Pair> marked = markedMembers();
    for (std::size_t f = 0; f < picture_.families.size(); ++f) {
        const auto members = members_.of(f);
        const std::size_t main = mainGroup(f);
        std::vector<Pair> lost;
        for (std::size_t i = 0; i < members.size(); ++i) {
            const std::size_t group = groups_.find(picture_.lines.size() + members_.firstOf(f) + i);
            if (main != kNoGroup && group == main) continue;
            const Pair member{static_cast<Index>(f), members[i]};
            if (!std::binary_search(marked.begin(), marked.end(), member)) lost.push_back(member);
        }
        if (main == kNoGroup && lost.size() == 1 && members.size() > 1) continue;
        if (members.size() > 1) unjoined_.insert(unjoined_.end(), lost.begin(), lost.end());
    }
}

// The group with most members, the first of them where several have as many; kNoGroup where each member
// is alone and no line is drawn.
std::size_t PictureJudge::mainGroup(std::size_t f) {
    std::map<std::size_t, std::size_t> sizes;
    std::size_t best = kNoGroup;
    const std::size_t count = members_.of(f).size();
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t group = groups_.find(picture_.lines.size() + members_.firstOf(f) + i);
        const std::size_t size = ++sizes[group];
        if (best == kNoGroup || size > sizes[best]) best = group;
    }
    const bool isDrawn = picture_.families[f].lineCount > 0 || (best != kNoGroup && sizes[best] > 1);
    return isDrawn ? best : kNoGroup;
}

// Whom a mark joins to a family: a child whose parents are all parents of it, and partners of it.
std::vector<PictureJudge::Pair> PictureJudge::markedMembers() const {
    const std::vector<std::vector<std::size_t>> marksOf = marksByFirstBox();
    std::vector<Pair> marked;
    for (std::size_t f = 0; f < picture_.families.size(); ++f) {
        const auto parents = picture_.parents(picture_.families[f]);
        for (const Index member : members_.of(f)) {
            for (const std::size_t m : marksOf[at(member)]) {
                if (isMarked(picture_.marks[m], picture_.families[f], parents, member)) {
                    marked.emplace_back(static_cast<Index>(f), member);
                }
            }
        }
    }
    keepEachOnce(marked);
    return marked;
}

std::vector<std::vector<std::size_t>> PictureJudge::marksByFirstBox() const {
    std::vector<std::vector<std::size_t>> marksOf(picture_.boxes.size());
    for (std::size_t m = 0; m < picture_.marks.size(); ++m) {
        const Mark& mark = picture_.marks[m];
        if (mark.kind == MarkKind::samePerson || mark.boxes[0] == kNone) continue;
        marksOf[at(mark.boxes[0])].push_back(m);
        if (mark.kind == MarkKind::partnersElsewhere && mark.boxes[1] != kNone) {
            marksOf[at(mark.boxes[1])].push_back(m);
        }
    }
    return marksOf;
}

bool PictureJudge::isMarked(const Mark& mark, const Family& family, std::span<const Index> parents,
                            Index member) const {
    const auto isParent = [&](Index box) {
        return box == kNone || std::find(parents.begin(), parents.end(), box) != parents.end();
    };
    if (mark.kind == MarkKind::partnersElsewhere) return isParent(mark.boxes[0]) && isParent(mark.boxes[1]);
    const auto children = picture_.children(family);
    return isParent(mark.boxes[1]) && isParent(mark.boxes[2]) &&
           std::find(children.begin(), children.end(), member) != children.end();
}

}  // namespace olvane::picture
