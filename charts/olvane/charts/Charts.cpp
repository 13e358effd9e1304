// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/Charts.h>

#include <olvane/charts/Everybody.h>
#include <olvane/charts/FanInternal.h>
#include <olvane/charts/FoldedTreeInternal.h>
#include <olvane/charts/FoldingInternal.h>
#include <olvane/charts/SelectionInternal.h>
#include <olvane/charts/TreeChartInternal.h>
#include <olvane/picture/shared/FurtherParents.h>
#include <olvane/picture/shared/Mirror.h>

#include <cmath>
#include <stdexcept>
#include <string>
#include <vector>

namespace olvane::charts {

namespace {

void checkPerson(const kin::KinGraph& graph, kin::Place person) {
    if (person < 0 || person >= graph.personCount()) throw std::out_of_range("no such person");
}

void checkSizes(const kin::KinGraph& graph, const ChartRequest& request) {
    const ChartSizes& sizes = request.sizes;
    bool good = isSize(sizes.boxWidth) && isSize(sizes.boxHeight) && isSize(sizes.gapX) && isSize(sizes.gapY);
    for (const BoxSize& size : request.boxSizes) good = good && isSize(size.width) && isSize(size.height);
    if (!good) throw std::invalid_argument("sizes of boxes and gaps must be between 0 and a million points");
    if (!request.boxSizes.empty() &&
        request.boxSizes.size() != static_cast<std::size_t>(graph.personCount())) {
        throw std::invalid_argument("there must be one box size for each person");
    }
}

// The size of each person's box by place, where some have their own; empty where all are of the usual size.
std::vector<BoxSize> sizesByPlace(const kin::KinGraph& graph, const ChartRequest& request) {
    if (request.sizedBoxes.empty()) return {};
    if (!request.boxSizes.empty()) throw std::invalid_argument("there are sizes both by place and by id");
    std::vector<BoxSize> sizes(static_cast<std::size_t>(graph.personCount()),
                               {request.sizes.boxWidth, request.sizes.boxHeight});
    for (const SizedBox& box : request.sizedBoxes) {
        const kin::Place person = graph.placeOf(box.person);
        if (person != kin::kNobody) sizes[static_cast<std::size_t>(person)] = box.size;
    }
    return sizes;
}

EverybodyOptions everybodyOptions(const ChartRequest& request) {
    EverybodyOptions options;
    options.focus = request.focus;
    options.marks = request.marks;
    options.effort = request.effort;
    options.onePart = request.onePart;
    options.aspect = request.aspect;
    options.earlier = request.earlier;
    options.compact = request.compact;
    options.direction = request.direction;
    options.sizes = request.sizes;
    options.boxSizes = request.boxSizes;
    options.progress = request.progress;
    return options;
}

// The earlier picture is mirrored as well, so that places are compared as they are laid out.
picture::Picture everybodyPicture(const kin::KinGraph& graph, const ChartRequest& request) {
    EverybodyOptions options = everybodyOptions(request);
    picture::Picture earlier;
    if (request.mirrored && request.earlier != nullptr) {
        earlier = *request.earlier;
        picture::mirror(earlier);
        options.earlier = &earlier;
    }
    return everybodyChart(graph, options);
}

picture::Picture rowChart(const kin::KinGraph& graph, const ChartRequest& request) {
    const Selection selection = selectPersons(graph, request);
    return request.aspect > 0 ? treeChartOnPaper(graph, request, selection)
                              : treeChart(graph, request, selection);
}

picture::Picture chartWithoutCounts(const kin::KinGraph& graph, const ChartRequest& request) {
    switch (request.view) {
        case View::near:
        case View::ancestors:
        case View::descendants:
        case View::hourglass:
        case View::relatives:
            return rowChart(graph, request);
        case View::fan:
            return fanChart(graph, request);
        case View::everybody:
            return everybodyPicture(graph, request);
        case View::kinship:
            checkPerson(graph, request.to);
            return kinshipChart(graph, request);
        default:
            break;
    }
    throw std::invalid_argument(std::string("no chart is made of the view ") + nameOf(request.view));
}

}  // namespace

void checkRequest(const ChartRequest& request) {
    if (request.up < 0 || request.down < 0 || request.mostWays < 0) {
        throw std::invalid_argument("numbers of generations and of ways must not be negative");
    }
    if (!std::isfinite(request.aspect) || request.aspect < 0) {
        throw std::invalid_argument("an aspect must be finite and not negative");
    }
    if (!std::isfinite(request.fanAngle)) throw std::invalid_argument("the angle of a fan must be finite");
}

picture::Picture chartOf(const kin::KinGraph& graph, const ChartRequest& asked) {
    checkPerson(graph, asked.focus);
    checkRequest(asked);
    const std::vector<BoxSize> sizes = sizesByPlace(graph, asked);
    ChartRequest request = asked;
    if (!sizes.empty()) request.boxSizes = sizes;
    checkSizes(graph, request);
    picture::Picture picture = chartWithoutCounts(graph, request);
    picture::countFurtherParents(picture, graph);
    if (request.mirrored) picture::mirror(picture);
    if (canFold(request.view)) addFolded(picture, graph, request);
    return picture;
}

}  // namespace olvane::charts
