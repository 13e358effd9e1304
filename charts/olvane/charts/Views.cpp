// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/Views.h>

#include <limits>
#include <stdexcept>

#include <olvane/kin/FamilyAround.h>
#include <olvane/kin/FamilyDataSource.h>
#include <olvane/picture/LayoutPicture.h>
#include <olvane/picture/shared/Mirror.h>

namespace olvane::charts {

namespace {

LayoutOptions layoutOptionsOf(const ViewRequest& request) {
    LayoutOptions options = request.chart.layout;
    const ChartSizes& sizes = request.chart.sizes;
    options.sizes.nodeWidth = sizes.boxWidth;
    options.sizes.nodeHeight = sizes.boxHeight;
    options.sizes.horzPadding = sizes.gapX;
    options.sizes.vertPadding = sizes.gapY;
    options.withText = false;
    return options;
}

bool isOfEngine(View view) {
    return view == View::family || view == View::pedigree;
}

picture::Picture enginePictureOf(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                                 const kin::KinGraph* known, std::int64_t focus, const ViewRequest& request) {
    const LayoutOptions options = layoutOptionsOf(request);
    const TreeSize& sizes = options.sizes;
    for (const float size : {sizes.nodeWidth, sizes.nodeHeight, sizes.horzPadding, sizes.vertPadding}) {
        if (isSize(size)) continue;
        throw std::invalid_argument("sizes of boxes and gaps must be between 0 and a million points");
    }
    const TypedLayout layout = request.chart.view == View::family ? familyLayout(focus, source, options)
                                                                  : pedigreeLayout(focus, source, options);
    picture::LayoutPictureOptions drawn;
    drawn.known = known;
    drawn.unknownParents = request.unknownParents;
    picture::Picture picture = picture::pictureOf(layout, drawn);
    if (request.chart.mirrored) picture::mirror(picture);
    return picture;
}

// One generation more than is shown, so that those without a box are counted. The family view reaches three
// generations up and down, and cousins and their children beside.
ReachAround reachOf(const ChartRequest& chart) {
    constexpr int kAll = std::numeric_limits<int>::max();
    const auto oneMore = [](int generations) {
        return generations == 0 || generations == kAll ? kAll : generations + 1;
    };
    const bool fanOfDescendants = chart.view == View::fan && chart.fanOf == FanOf::descendants;
    ReachAround reach;
    reach.up = 1;
    reach.down = 1;
    switch (chart.view) {
        case View::near:
            reach.up = 5;
            reach.down = 5;
            reach.downBeside = 4;
            break;
        case View::descendants:
            reach.down = oneMore(chart.down);
            break;
        case View::fan:
            (fanOfDescendants ? reach.down : reach.up) = oneMore(fanOfDescendants ? chart.down : chart.up);
            break;
        case View::ancestors:
        case View::hourglass:
            reach.up = oneMore(chart.up);
            if (chart.view == View::hourglass) reach.down = oneMore(chart.down);
            reach.downBeside = 1;
            break;
        default:  // descendants of every ancestor, or all links
            reach.everybody = true;
            break;
    }
    return reach;
}

picture::Picture pictureOf(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                           const kin::KinGraph& graph, ViewRequest request, std::int64_t focus,
                           std::int64_t other) {
    request.chart.focus = graph.placeOf(focus);
    request.chart.to = graph.placeOf(other);
    return charts::pictureOf(source, graph, request);
}

}  // namespace

picture::Picture pictureOf(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                           const kin::KinGraph& graph, const ViewRequest& request) {
    const ChartRequest& chart = request.chart;
    if (!isOfEngine(chart.view)) return chartOf(graph, chart);
    if (chart.focus < 0 || chart.focus >= graph.personCount()) throw std::out_of_range("no such person");
    return enginePictureOf(source, &graph, graph.id(chart.focus), request);
}

picture::Picture pictureOf(const Family& family, std::int64_t focus, const ViewRequest& request,
                           std::int64_t other) {
    return pictureOf(std::make_shared<FamilyDataSource>(family), kinGraphOf(family), request, focus, other);
}

picture::Picture pictureOfHost(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& host,
                               std::int64_t focus, const ViewRequest& request, std::int64_t other) {
    if (isOfEngine(request.chart.view)) return enginePictureOf(host, nullptr, focus, request);
    if (!host) throw std::invalid_argument("no host");
    return pictureOf(host, kinGraphOf(familyAround(*host, focus, reachOf(request.chart))), request, focus,
                     other);
}

}  // namespace olvane::charts
