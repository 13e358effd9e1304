// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The chosen persons become a family of their own, which is laid out as the chart of everybody, whose rows can be
// folded: first with siblings in the order of the data, and where that takes more marks than the tree has, with everybody
// where the fewest lines cross. Neither is taken if lines cross.

#include <olvane/charts/FoldedTreeInternal.h>

#include <algorithm>
#include <vector>

#include <olvane/charts/Charts.h>
#include <olvane/charts/Everybody.h>
#include <olvane/charts/HiddenRelativesInternal.h>
#include <olvane/charts/TreeChartInternal.h>
#include <olvane/kin/shared/Index.h>
#include <olvane/picture/Extent.h>

namespace olvane::charts {

namespace {

using kin::at;

// Rows that are not folded are easier to read, so folding must gain as much in the size of the text.
constexpr double kWorthFolding = 1.1;
// For each multiple of this many links, one more may be a mark.
constexpr std::size_t kLinksForOneMark = 20;
// No more than these are tried with all links as lines, which takes ten times as long.
constexpr std::size_t kFewPersons = 300;
// Of more, all second links are marks, whether their lines would cross others or not.
constexpr std::size_t kManyPersons = 20'000;

// The chosen persons with their ids, in the order in which they were found, and the unions that two of them are in.
class ChosenFamily {
public:
    ChosenFamily(const kin::KinGraph& whole, const Selection& selection)
        : whole_(whole), placeOf_(at(whole.personCount()), kin::kNobody) {
        builder_.reserve(selection.persons.size(), selection.persons.size());
        for (const kin::Place person : selection.persons) {
            placeOf_[at(person)] = builder_.addPerson(whole.id(person), whole.sex(person));
        }
        std::vector<kin::UnionPlace> copies(at(whole.unionCount()), kNone);
        for (kin::UnionPlace u = 0; u < whole.unionCount(); ++u) copies[at(u)] = copyOf(u);
        for (const kin::Place person : selection.persons) {
            builder_.orderUnionsAsPartner(placeOf_[at(person)],
                                          copied(whole.unionsAsPartner(person), copies));
            builder_.orderUnionsAsChild(placeOf_[at(person)], copied(whole.unionsAsChild(person), copies));
        }
    }

    kin::KinGraph graph() { return builder_.build(); }
    kin::Place placeOf(kin::Place person) const { return placeOf_[at(person)]; }

private:
    static constexpr kin::UnionPlace kNone = -1;

    // kNone for a union without a chosen partner, or with nobody else who is chosen.
    kin::UnionPlace copyOf(kin::UnionPlace u) {
        const auto place = [this](kin::Place p) { return p == kin::kNobody ? p : placeOf(p); };
        const kin::Place one = place(whole_.partners(u)[0]);
        const kin::Place other = place(whole_.partners(u)[1]);
        const auto children = whole_.children(u);
        const auto isChosen = [&](kin::Place child) { return placeOf(child) != kin::kNobody; };
        const bool both = one != kin::kNobody && other != kin::kNobody;
        if (one == kin::kNobody && other == kin::kNobody) return kNone;
        if (!both && std::none_of(children.begin(), children.end(), isChosen)) return kNone;
        const kin::UnionPlace copy = builder_.addUnion(one, other, whole_.state(u), whole_.family(u));
        for (std::size_t i = 0; i < children.size(); ++i) {
            if (isChosen(children[i])) builder_.addChild(copy, placeOf(children[i]), whole_.childKinds(u)[i]);
        }
        return copy;
    }

    static std::vector<kin::UnionPlace> copied(std::span<const kin::UnionPlace> unions,
                                               const std::vector<kin::UnionPlace>& copies) {
        std::vector<kin::UnionPlace> order;
        for (const kin::UnionPlace u : unions) {
            if (copies[at(u)] != kNone) order.push_back(copies[at(u)]);
        }
        return order;
    }

    const kin::KinGraph& whole_;
    std::vector<kin::Place> placeOf_;  // by person of the whole family
    kin::KinGraphBuilder builder_;
};

// How high a sheet of that aspect is that the picture just fits on.
double sheetHeight(const picture::Picture& picture, double aspect) {
    const picture::Extent extent = picture::extentOf(picture);
    return std::max(extent.height(), extent.width() / aspect);
}

// An upright piece of a family's lines.
struct Upright {
    double x;
    double low;
    double high;
    std::size_t family;
};

std::vector<Upright> uprightsIn(const picture::Picture& picture) {
    std::vector<Upright> uprights;
    for (std::size_t family = 0; family < picture.families.size(); ++family) {
        for (const picture::Line& line : picture.linesOf(picture.families[family])) {
            if (line.x1 != line.x2) continue;
            uprights.push_back({line.x1, std::min(line.y1, line.y2), std::max(line.y1, line.y2), family});
        }
    }
    std::sort(uprights.begin(), uprights.end(), [](const Upright& a, const Upright& b) { return a.x < b.x; });
    return uprights;
}

// Whether lines of two families cross. The judge counts them all, which is more than a page has room for.
bool hasCrossings(const picture::Picture& picture) {
    const std::vector<Upright> uprights = uprightsIn(picture);
    for (std::size_t family = 0; family < picture.families.size(); ++family) {
        for (const picture::Line& line : picture.linesOf(picture.families[family])) {
            const double right = std::max(line.x1, line.x2);
            auto next = std::upper_bound(uprights.begin(), uprights.end(), std::min(line.x1, line.x2),
                                         [](double x, const Upright& one) { return x < one.x; });
            for (; next != uprights.end() && next->x < right; ++next) {
                if (next->family != family && next->low < line.y1 && line.y1 < next->high) return true;
            }
        }
    }
    return false;
}

// How many relations the picture expresses, by lines or marks.
std::size_t linksIn(const picture::Picture& picture) {
    std::size_t links = 0;
    for (const picture::Family& family : picture.families) {
        links += family.childCount + (family.parentCount == 2 ? 1U : 0U);
    }
    return links;
}

class FoldedTree {
public:
    FoldedTree(const kin::KinGraph& graph, const ChartRequest& request, const Selection& selection)
        : graph_(graph), selection_(selection), view_(request.view) {
        ChosenFamily family(graph, selection);
        chosen_ = family.graph();
        for (const kin::Place person : selection.persons) {
            if (!request.boxSizes.empty()) boxSizes_.push_back(request.boxSizes[at(person)]);
        }
        options_.focus = family.placeOf(request.focus);
        options_.onePart = false;
        options_.aspect = request.aspect;
        options_.compact = request.compact;
        options_.direction = request.direction;
        options_.sizes = request.sizes;
    }

    // Siblings in the order of the data, and links that would cross others as marks.
    picture::Picture inOrder() const {
        if (selection_.persons.size() > kManyPersons) return made(-1, false);
        picture::Picture free = made(-1, true);
        return hasCrossings(free) ? made(-1, false) : free;
    }
    // Everybody where the fewest lines cross, and all links as lines.
    picture::Picture withAllLines() const { return made(0, false); }

private:
    picture::Picture made(std::int32_t marks, bool drawFree) const {
        EverybodyOptions options = options_;
        options.marks = marks;
        options.drawFree = drawFree;
        options.boxSizes = boxSizes_;
        picture::Picture picture = everybodyChart(chosen_, options);
        picture.view = nameOf(view_);
        for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
            countHiddenRelatives(graph_, selection_.persons[i], selection_.shown, picture.boxes[i]);
        }
        return picture;
    }

    const kin::KinGraph& graph_;
    const Selection& selection_;
    View view_;
    kin::KinGraph chosen_;
    std::vector<BoxSize> boxSizes_;
    EverybodyOptions options_;
};

}  // namespace

picture::Picture treeChartOnPaper(const kin::KinGraph& graph, const ChartRequest& request,
                                  const Selection& selection) {
    picture::Picture tree = treeChart(graph, request, selection);
    const FoldedTree folds(graph, request, selection);
    const double worth = sheetHeight(tree, request.aspect) / kWorthFolding;
    const auto isLargerWith = [&](const picture::Picture& folded, std::size_t marks) {
        return sheetHeight(folded, request.aspect) <= worth && folded.marks.size() <= marks;
    };
    const std::size_t most = tree.marks.size() + linksIn(tree) / kLinksForOneMark;
    picture::Picture inOrder = folds.inOrder();
    if (isLargerWith(inOrder, tree.marks.size())) return inOrder;
    if (selection.persons.size() <= kFewPersons) {
        picture::Picture withLines = folds.withAllLines();
        if (isLargerWith(withLines, tree.marks.size()) && !hasCrossings(withLines)) return withLines;
    }
    return isLargerWith(inOrder, most) ? inOrder : tree;
}

}  // namespace olvane::charts
