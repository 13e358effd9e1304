// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The chosen persons become a family of their own, which is laid out as the chart of everybody, whose rows can be
// folded. All second links are marks, as in the tree: so no two lines cross, and siblings stay in the order of the data.

#include <olvane/charts/FoldedTreeInternal.h>

#include <algorithm>
#include <limits>
#include <vector>

#include <olvane/charts/Charts.h>
#include <olvane/charts/Everybody.h>
#include <olvane/charts/HiddenRelativesInternal.h>
#include <olvane/charts/TreeChartInternal.h>
#include <olvane/kin/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

// Rows that are not folded are easier to read, so folding must gain as much in the size of the text.
constexpr double kWorthFolding = 1.1;

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
            if (isChosen(children[i]))
                builder_.addChild(copy, placeOf(children[i]), whole_.childKinds(u)[i]);
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
    constexpr double kFar = std::numeric_limits<double>::infinity();
    double left = kFar;
    double top = kFar;
    double right = -kFar;
    double bottom = -kFar;
    const auto cover = [&](double x, double y) {
        left = std::min(left, x);
        right = std::max(right, x);
        top = std::min(top, y);
        bottom = std::max(bottom, y);
    };
    for (const picture::Box& box : picture.boxes) {
        cover(box.x, box.y);
        cover(box.x + double{box.width}, box.y + double{box.height});
    }
    for (const picture::Line& line : picture.lines) {
        cover(line.x1, line.y1);
        cover(line.x2, line.y2);
    }
    return std::max(bottom - top, (right - left) / aspect);
}

picture::Picture foldedTree(const kin::KinGraph& graph, const ChartRequest& request,
                            const Selection& selection) {
    ChosenFamily chosen(graph, selection);
    std::vector<BoxSize> boxSizes;
    for (const kin::Place person : selection.persons) {
        if (!request.boxSizes.empty()) boxSizes.push_back(request.boxSizes[at(person)]);
    }
    EverybodyOptions options;
    options.focus = chosen.placeOf(request.focus);
    options.marks = -1;
    options.onePart = false;
    options.aspect = request.aspect;
    options.compact = request.compact;
    options.direction = request.direction;
    options.sizes = request.sizes;
    options.boxSizes = boxSizes;
    picture::Picture picture = everybodyChart(chosen.graph(), options);
    picture.view = nameOf(request.view);
    for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
        countHiddenRelatives(graph, selection.persons[i], selection.shown, picture.boxes[i]);
    }
    return picture;
}

}  // namespace

picture::Picture treeChartOnPaper(const kin::KinGraph& graph, const ChartRequest& request,
                                  const Selection& selection) {
    picture::Picture tree = treeChart(graph, request, selection);
    picture::Picture folded = foldedTree(graph, request, selection);
    const bool isWorthIt =
        sheetHeight(folded, request.aspect) * kWorthFolding <= sheetHeight(tree, request.aspect);
    return isWorthIt ? folded : tree;
}

}  // namespace olvane::charts
