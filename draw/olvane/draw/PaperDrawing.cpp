// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/draw/PaperDrawing.h>

#include <optional>
#include <utility>
#include <vector>

namespace olvane::draw {

namespace {

constexpr double kMostSheets = 1000;       // sixty square metres of A4; more is of no use to anybody
constexpr double kReadable = 6;            // points; names that would be smaller take the whole box
constexpr double kSmallestUsualName = 10;  // px
constexpr double kPointsOfPx = 72.0 / 96;

// A chart and how it lies on its paper.
struct Trial {
    DrawingContent content;
    DrawingOptions options;
    SheetRequest request;
    double scale = 0;  // by the size at 96 px an inch
};

std::vector<SheetRequest> requestsFor(const SheetRequest& request, bool folded) {
    if (!folded || !request.paper.mayTurn) return {request};
    SheetRequest upright = request;
    upright.paper.mayTurn = false;
    SheetRequest turned = upright;
    turned.paper = upright.paper.turned();
    return {upright, turned};
}

SheetPlan planOf(const SvgPicture& picture, const SheetRequest& request) {
    try {
        return planSheets(subjectOf(picture), request, kMostSheets);
    } catch (const std::length_error& error) {
        throw TooManySheets(error.what());
    }
}

Trial tryOn(const SheetRequest& request, const PaperSubject& subject, bool folded) {
    Trial trial;
    trial.content = subject.contentOf(folded ? aspectOf(request) : 0);
    trial.options = subject.optionsOf(trial.content);
    trial.request = request;
    trial.scale = planOf(drawSvg(trial.content, trial.options), request).scale / kMillimetresOfPx;
    return trial;
}

}  // namespace

PaperDrawing drawOnPaper(const SheetRequest& request, const PaperSubject& subject) {
    const bool folded = subject.folded && request.scale <= 0;
    std::optional<Trial> best;
    for (const SheetRequest& sheets : requestsFor(request, folded)) {
        Trial trial = tryOn(sheets, subject, folded);
        if (!best || trial.scale > best->scale) best = std::move(trial);
    }
    const double wanted = kReadable / kPointsOfPx / best->scale;
    if (wanted > kSmallestUsualName) best->options.leastNameSize = wanted;
    PaperDrawing drawn;
    drawn.title = best->options.title;
    const SvgPicture picture = drawSvg(best->content, best->options);
    drawn.drawing = drawSheets(picture, best->request, drawn.title, best->options.language);
    drawn.scale = drawn.drawing.plan.scale / kMillimetresOfPx;
    drawn.points.smallestName = picture.text.smallestName * kPointsOfPx * drawn.scale;
    drawn.points.smallest = picture.text.smallest * kPointsOfPx * drawn.scale;
    return drawn;
}

}  // namespace olvane::draw
