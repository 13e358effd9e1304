// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The typed layout and the result text are two writings of one layout: for every family, however odd, they say
// the same, and what a line is said to be for is what its place and the edges of the graph say too.

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <support/CaseRun.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/TypedLayout.h>
#include <olvane/host/LayoutText.h>
#include <olvane/layouter/TreeViewLayouter.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <set>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "RandomFamily.h"

namespace {

using olvane::LineRole;
using olvane::TypedLayout;
using support::CaseFile;
using support::TypedRun;
typedef TypedLayout::Index Index;

constexpr int kMostPersons = 24;

CaseFile drawCase(const rc::Gen<CaseFile>& generator) {
    const CaseFile drawn = *generator;
    RC_LOG() << support::formatCase(drawn);
    return drawn;
}

const TypedLayout::Box& boxAt(const TypedLayout& layout, Index place) {
    return layout.boxes.at(static_cast<std::size_t>(place));
}

bool isParent(const TypedLayout& layout, const TypedLayout::Family& family, Index box) {
    const auto parents = layout.parentsOf(family);
    return std::find(parents.begin(), parents.end(), box) != parents.end();
}

// Who is joined: couples by the ids of the two, and for each child's box the ids of its parents. Not by the
// parents' boxes: a spouse that the host lists twice has two boxes and, in the graph, one edge.
struct Relations {
    typedef std::pair<std::int64_t, std::int64_t> Pair;

    std::set<Pair> couples;
    std::set<Pair> parentsAndChildren;

    bool operator==(const Relations&) const = default;
};

Relations relationsOf(const TypedLayout& layout) {
    Relations relations;
    for (const TypedLayout::Family& family : layout.families) {
        const auto parents = layout.parentsOf(family);
        if (parents.size() == 2) {
            relations.couples.insert(std::minmax(boxAt(layout, parents[0]).id, boxAt(layout, parents[1]).id));
        }
        for (const Index parent : parents) {
            for (const Index child : layout.childrenOf(family)) {
                relations.parentsAndChildren.emplace(boxAt(layout, parent).id, child);
            }
        }
    }
    return relations;
}

// The edges of the graph, as places of boxes and keys of persons.
struct Edges {
    struct Child {
        int box;
        std::vector<int> parents;
    };
    std::vector<std::pair<int, int>> couples;
    std::vector<Child> children;

    // The edge of a half sibling hangs on the couple although its lines begin under one parent, so of such a
    // couple the other parent is left out.
    void addChild(const TreeViewGenerationEdge& edge) {
        if (edge.hasSingleParent()) {
            children.push_back({edge.child->walkNumber(), {edge.singleParent->walkNumber()}});
            return;
        }
        Child child{edge.child->walkNumber(), {}};
        const int shared = edge.child->getParentId();
        for (const TreeViewPerson* parent : {edge.parentsEdge->person, edge.parentsEdge->spouse}) {
            if (shared == TreeViewPerson::kNoKey || shared == parent->personId) {
                child.parents.push_back(parent->walkNumber());
            }
        }
        children.push_back(child);
    }

    void addPerson(TreeViewPerson& person) {
        person.generationEdgeIterator([&](TreeViewGenerationEdge* edge) { addChild(*edge); });
        person.spouseEdgeIterator([&](TreeViewSpouseEdge* edge) {
            couples.emplace_back(edge->person->walkNumber(), edge->spouse->walkNumber());
            for (const auto& child : edge->childEdges) addChild(*child);
        });
    }

    Relations relations(const TypedLayout& layout) const {
        Relations relations;
        for (const auto& [one, other] : couples) {
            relations.couples.insert(std::minmax(boxAt(layout, one).id, boxAt(layout, other).id));
        }
        for (const Child& child : children) {
            for (const int parent : child.parents) {
                relations.parentsAndChildren.emplace(boxAt(layout, parent).id, child.box);
            }
        }
        return relations;
    }
};

// --- Where lines run, for boxes of the usual sizes. Ends are cut to whole points, so a point is let pass.

constexpr int kWidth = 55;
constexpr int kHeight = 80;

bool touches(const TypedLayout::Box& box, int x, int y) {
    return x >= box.x - 1 && x <= box.x + kWidth + 1 && y >= box.y - 1 && y <= box.y + kHeight + 1;
}

bool endsOn(const TypedLayout::Line& line, const TypedLayout::Box& box) {
    return touches(box, line.x1, line.y1) || touches(box, line.x2, line.y2);
}

bool meet(const TypedLayout::Line& a, const TypedLayout::Line& b) {
    const auto near = [](int ax, int ay, int bx, int by) {
        return std::abs(ax - bx) <= 1 && std::abs(ay - by) <= 1;
    };
    return near(a.x1, a.y1, b.x1, b.y1) || near(a.x1, a.y1, b.x2, b.y2) || near(a.x2, a.y2, b.x1, b.y1) ||
           near(a.x2, a.y2, b.x2, b.y2);
}

const TypedLayout::Line* lineOfChild(const TypedLayout& layout, const TypedLayout::Line& sibling,
                                     LineRole role) {
    for (const TypedLayout::Line& line : layout.lines) {
        if (line.role == role && line.family == sibling.family && line.child == sibling.child) return &line;
    }
    return nullptr;
}

}  // namespace

RC_GTEST_PROP(TypedProperties, typedLayoutWrittenAsTextIsTheTextToTheByte, ()) {
    const CaseFile request = drawCase(property::anyRequest(kMostPersons));
    const TypedRun run = support::runTypedCase(request);
    const std::string written = olvane::writeLayoutText(olvane::recordsOf(run.layout));
    RC_ASSERT(run.layout.text == support::layoutText(request));
    if (run.failed) {
        RC_ASSERT(run.layout.text.starts_with(written));
    } else {
        RC_ASSERT(run.layout.text == written);
    }
}

RC_GTEST_PROP(TypedProperties, recordingLinesAsksTheHostNothingMore, ()) {
    const CaseFile request = drawCase(property::anyRequest(kMostPersons));
    std::vector<std::string> lines = support::runCase(request, false, true);
    lines.erase(lines.begin());
    RC_ASSERT(support::runTypedCase(request).trace == lines);
}

RC_GTEST_PROP(TypedProperties, oneCallGivesTheTextOfTheEntryCall, ()) {
    const CaseFile request = drawCase(property::anyFamily(kMostPersons));
    const auto manager = std::make_shared<support::CaseManager>(request);
    const TypedLayout layout = olvane::familyLayout(request.focus, manager);
    RC_ASSERT(layout.text == FamilyViewLayout(std::to_string(request.focus), manager));
    RC_ASSERT(olvane::writeLayoutText(olvane::recordsOf(layout)) == layout.text);
}

RC_GTEST_PROP(TypedProperties, everyPlaceNamesSomethingThatIsThere, ()) {
    const TypedRun run = support::runTypedCase(drawCase(property::anyRequest(kMostPersons)));
    RC_PRE(!run.failed);
    const TypedLayout& layout = run.layout;
    for (const TypedLayout::Line& line : layout.lines) {
        const TypedLayout::Family& family = layout.families.at(static_cast<std::size_t>(line.family));
        const auto lines = layout.linesOf(boxAt(layout, line.holder));
        RC_ASSERT(&line >= lines.data() && &line < lines.data() + lines.size());
        RC_ASSERT((line.child == TypedLayout::kNone) == (line.role == LineRole::marriage));
        if (line.role == LineRole::marriage) continue;
        const auto children = layout.childrenOf(family);
        RC_ASSERT(std::count(children.begin(), children.end(), line.child) == 1);
    }
    for (const TypedLayout::Box& box : layout.boxes) {
        if (box.repeatOf == TypedLayout::kNone) continue;
        const TypedLayout::Box& first = boxAt(layout, box.repeatOf);
        RC_ASSERT(&first < &box);
        RC_ASSERT((std::tie(first.id, first.x, first.y, first.lineCount, first.repeatOf) ==
                   std::make_tuple(box.id, box.x, box.y, box.lineCount, TypedLayout::kNone)));
    }
}

// The holder of a line follows from its role: a rule that the recording does not know.
RC_GTEST_PROP(TypedProperties, everyLineIsHeldByWhomItsRoleSays, ()) {
    const CaseFile request = drawCase(property::anyRequest(kMostPersons));
    const TypedRun run = support::runTypedCase(request);
    RC_PRE(!run.failed);
    const TypedLayout& layout = run.layout;
    for (const TypedLayout::Line& line : layout.lines) {
        const TypedLayout::Box& holder = boxAt(layout, line.holder);
        const Index holding = holder.repeatOf == TypedLayout::kNone ? line.holder : holder.repeatOf;
        const TypedLayout::Family& family = layout.families.at(static_cast<std::size_t>(line.family));
        const bool heldByChild = line.role == LineRole::bar || line.role == LineRole::stem;
        if (heldByChild) {
            RC_ASSERT(holding == line.child);
        } else if (line.role == LineRole::drop && holding == line.child) {
            RC_ASSERT(request.view == support::CaseView::pedigree);
        } else {
            RC_ASSERT(isParent(layout, family, holding));
        }
    }
}

RC_GTEST_PROP(TypedProperties, everyUnknownParentNamesTheBoxOfItsChild, ()) {
    const TypedRun run = support::runTypedCase(drawCase(property::anyFamily(kMostPersons)));
    RC_PRE(!run.failed);
    for (const TypedLayout::Box& box : run.layout.boxes) {
        RC_ASSERT((box.kind == TypedLayout::BoxKind::person) == (box.id > 0));
        if (box.kind == TypedLayout::BoxKind::person) {
            RC_ASSERT(box.childOf == TypedLayout::kNone);
        } else {
            RC_ASSERT(boxAt(run.layout, box.childOf).id == box.childId);
            RC_ASSERT(box.male == (box.kind == TypedLayout::BoxKind::unknownFather));
        }
    }
}

RC_GTEST_PROP(TypedProperties, familiesAreThoseOfTheEdgesOfTheGraph, ()) {
    Edges edges;
    const TypedRun run = support::runTypedCase(
        drawCase(property::anyRequest(kMostPersons)), [&](SharedTreeViewer::TreeViewLayouter& layouter) {
            layouter.graphIterator([&](TreeViewPerson& person) { edges.addPerson(person); });
        });
    RC_PRE(!run.failed);
    RC_ASSERT(relationsOf(run.layout) == edges.relations(run.layout));
}

RC_GTEST_PROP(TypedProperties, linesJoinWhomTheirRoleAndFamilySay, ()) {
    CaseFile request = drawCase(property::anyFamily(kMostPersons));
    if (*rc::gen::arbitrary<bool>()) {
        request.view = support::CaseView::pedigree;
        request.maxGenerations = 5;
    }
    const TypedRun run = support::runTypedCase(request);
    RC_PRE(!run.failed);
    const TypedLayout& layout = run.layout;
    for (const TypedLayout::Line& line : layout.lines) {
        const TypedLayout::Family& family = layout.families.at(static_cast<std::size_t>(line.family));
        if (line.role == LineRole::marriage) {
            for (const Index parent : layout.parentsOf(family)) {
                RC_ASSERT(endsOn(line, boxAt(layout, parent)));
            }
        } else if (line.role == LineRole::stem) {
            RC_ASSERT(endsOn(line, boxAt(layout, line.child)));
        } else if (line.role == LineRole::drop && family.parents[1] == TypedLayout::kNone) {
            RC_ASSERT(endsOn(line, boxAt(layout, family.parents[0])));
        } else if (line.role == LineRole::bar) {
            const TypedLayout::Line* const drop = lineOfChild(layout, line, LineRole::drop);
            const TypedLayout::Line* const stem = lineOfChild(layout, line, LineRole::stem);
            RC_ASSERT(drop != nullptr && stem != nullptr);
            RC_ASSERT(meet(*drop, line) && meet(line, *stem));
        }
    }
}
