// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Relations that are known of the persons in a picture, and that nothing in it states: two partners, or a child and a
// parent, whom neither a family nor a mark joins.

#include <olvane/picture/PictureJudgeInternal.h>

#include <algorithm>
#include <cstdint>
#include <span>
#include <utility>
#include <vector>

#include <olvane/kin/shared/Index.h>

namespace olvane::picture {

using kin::at;

namespace {

using Relation = std::pair<std::int64_t, std::int64_t>;

// Pairs of ids: children with parents, and partners with the lesser id first.
struct Relations {
    std::vector<Relation> parents;
    std::vector<Relation> partners;

    void addParent(std::int64_t child, std::int64_t parent) { parents.emplace_back(child, parent); }
    void addPartners(std::int64_t a, std::int64_t b) {
        if (a != b) partners.emplace_back(std::min(a, b), std::max(a, b));
    }
    void sort() {
        keepEachOnce(parents);
        keepEachOnce(partners);
    }
};

bool isPerson(const Picture& picture, Index box) {
    return box != kNone && picture.boxes[at(box)].kind == BoxKind::person;
}

// What the families and marks of a picture state.
class StatedRelations {
public:
    explicit StatedRelations(const Picture& picture) : picture_(picture) {}

    Relations all() const {
        Relations stated;
        for (const Family& family : picture_.families) {
            const auto parents = picture_.parents(family);
            if (parents.size() == 2 && isPerson(parents[0]) && isPerson(parents[1])) {
                stated.addPartners(idAt(parents[0]), idAt(parents[1]));
            }
            for (const Index child : picture_.children(family)) addParents(stated, child, parents);
        }
        for (const Mark& mark : picture_.marks) {
            if (mark.kind == MarkKind::partnersElsewhere && isPerson(mark.boxes[0]) &&
                isPerson(mark.boxes[1])) {
                stated.addPartners(idAt(mark.boxes[0]), idAt(mark.boxes[1]));
            }
            if (mark.kind == MarkKind::parentsElsewhere) {
                addParents(stated, mark.boxes[0], {mark.boxes + 1, 2});
            }
        }
        stated.sort();
        return stated;
    }

private:
    void addParents(Relations& stated, Index child, std::span<const Index> parents) const {
        for (const Index parent : parents) {
            if (isPerson(parent) && isPerson(child)) stated.addParent(idAt(child), idAt(parent));
        }
    }
    std::int64_t idAt(Index box) const { return picture_.boxes[at(box)].id; }
    bool isPerson(Index box) const { return picture::isPerson(picture_, box); }

    const Picture& picture_;
};

// What is known of the persons who are shown.
Relations knownRelations(const Picture& picture, const kin::KinGraph& known) {
    std::vector<bool> isShown(static_cast<std::size_t>(known.personCount()));
    for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
        const kin::Place place =
            isPerson(picture, static_cast<Index>(i)) ? known.placeOf(picture.boxes[i].id) : kin::kNobody;
        if (place != kin::kNobody) isShown[at(place)] = true;
    }
    const auto shown = [&isShown](kin::Place p) { return p != kin::kNobody && isShown[at(p)]; };
    Relations relations;
    for (kin::UnionPlace u = 0; u < known.unionCount(); ++u) {
        const auto& partners = known.partners(u);
        if (shown(partners[0]) && shown(partners[1])) {
            relations.addPartners(known.id(partners[0]), known.id(partners[1]));
        }
        for (const kin::Place parent : partners) {
            if (!shown(parent)) continue;
            for (const kin::Place child : known.children(u)) {
                if (shown(child)) relations.addParent(known.id(child), known.id(parent));
            }
        }
    }
    relations.sort();
    return relations;
}

}  // namespace

std::size_t countUntold(const Picture& picture, const kin::KinGraph& known) {
    const Relations expected = knownRelations(picture, known);
    const Relations stated = StatedRelations(picture).all();
    const auto missing = [](const std::vector<Relation>& all, const std::vector<Relation>& some) {
        return static_cast<std::size_t>(
            std::count_if(all.begin(), all.end(), [&some](const Relation& relation) {
                return !std::binary_search(some.begin(), some.end(), relation);
            }));
    };
    return missing(expected.parents, stated.parents) + missing(expected.partners, stated.partners);
}

}  // namespace olvane::picture
