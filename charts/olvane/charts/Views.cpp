// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/Views.h>

#include <stdexcept>

#include <olvane/picture/LayoutPicture.h>

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

}  // namespace

picture::Picture pictureOf(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                           const kin::KinGraph& graph, const ViewRequest& request) {
    const ChartRequest& chart = request.chart;
    if (chart.view != View::family && chart.view != View::pedigree) return chartOf(graph, chart);
    if (chart.focus < 0 || chart.focus >= graph.personCount()) throw std::out_of_range("no such person");
    const std::int64_t focus = graph.id(chart.focus);
    const LayoutOptions options = layoutOptionsOf(request);
    const TypedLayout layout = chart.view == View::family ? familyLayout(focus, source, options)
                                                          : pedigreeLayout(focus, source, options);
    picture::LayoutPictureOptions drawn;
    drawn.known = &graph;
    drawn.unknownParents = request.unknownParents;
    return picture::pictureOf(layout, drawn);
}

}  // namespace olvane::charts
