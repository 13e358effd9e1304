// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/PaperDrawing.h>

#include <cstdio>
#include <optional>
#include <stdexcept>
#include <utility>
#include <vector>

#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

constexpr double kMostSheets = 1000;       // sixty square metres of A4; more is of no use to anybody
constexpr double kReadable = 6;            // points; names that would be smaller take the whole box
constexpr double kSmallestUsualName = 10;  // px
constexpr double kPointsOfPx = 72.0 / 96;

// A chart and how it lies on its paper.
struct Trial {
    draw::DrawingContent content;
    draw::DrawingOptions options;
    draw::SheetRequest request;
    double scale = 0;  // by the size at 96 px an inch
};

// Everybody is folded for the paper; how other views lie does not depend on it.
bool isFolded(const LayoutRequest& request, const PaperOptions& paper) {
    return request.view() == View::everybody && paper.scale <= 0;
}

std::vector<draw::SheetRequest> requestsFor(const PaperOptions& paper, bool folded) {
    draw::SheetRequest request = sheetRequestOf(paper);
    if (!folded || !request.paper.mayTurn) return {request};
    request.paper.mayTurn = false;
    draw::SheetRequest turned = request;
    turned.paper = request.paper.turned();
    return {request, turned};
}

draw::SheetPlan planOf(const draw::SvgPicture& picture, const draw::SheetRequest& request) {
    try {
        return draw::planSheets(draw::subjectOf(picture), request, kMostSheets);
    } catch (const std::length_error&) {
        throw UsageError(
            "the picture would take more than 1000 sheets; take larger paper or a smaller --scale, leave "
            "relatives or generations out, or draw it whole, without --fit");
    }
}

Trial tryOn(const draw::SheetRequest& request, LayoutRequest layout, bool folded, const ContentOf& contentOf,
            const DrawingOptionsOf& optionsOf) {
    if (folded) {
        layout.chart.aspect = draw::aspectOf(request);
        layout.chart.compact = true;
    }
    Trial trial;
    trial.content = contentOf(layout);
    trial.options = optionsOf(trial.content);
    trial.request = request;
    trial.scale = planOf(draw::drawSvg(trial.content, trial.options), request).scale / draw::kMillimetresOfPx;
    return trial;
}

}  // namespace

PaperDrawing drawOnPaper(const PaperOptions& paper, const LayoutRequest& request, const ContentOf& contentOf,
                         const DrawingOptionsOf& optionsOf) {
    const bool folded = isFolded(request, paper);
    std::optional<Trial> best;
    for (const draw::SheetRequest& sheets : requestsFor(paper, folded)) {
        Trial trial = tryOn(sheets, request, folded, contentOf, optionsOf);
        if (!best || trial.scale > best->scale) best = std::move(trial);
    }
    const double wanted = kReadable / kPointsOfPx / best->scale;
    if (wanted > kSmallestUsualName) best->options.leastNameSize = wanted;
    PaperDrawing drawn;
    drawn.title = best->options.title;
    const draw::SvgPicture picture = draw::drawSvg(best->content, best->options);
    drawn.drawing = draw::drawSheets(picture, best->request, drawn.title);
    drawn.scale = drawn.drawing.plan.scale / draw::kMillimetresOfPx;
    drawn.points.smallestName = picture.text.smallestName * kPointsOfPx * drawn.scale;
    drawn.points.smallest = picture.text.smallest * kPointsOfPx * drawn.scale;
    return drawn;
}

std::string sentenceOf(const PaperDrawing& drawing) {
    const draw::SheetPlan& plan = drawing.drawing.plan;
    const std::size_t count = plan.sheets.size();
    char text[200];
    std::snprintf(
        text, sizeof text,
        "%zu %s of %.0f x %.0f mm, scale %.3f; names of at least %.1f points, smallest text %.1f points",
        count, count == 1 ? "sheet" : "sheets", plan.paper.width, plan.paper.height, drawing.scale,
        drawing.points.smallestName, drawing.points.smallest);
    std::string sentence = text;
    if (plan.cutBoxes > 0) sentence += "; " + std::to_string(plan.cutBoxes) + " boxes are on no sheet whole";
    return sentence;
}

}  // namespace olvane::cli
