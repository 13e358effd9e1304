// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/PaperDrawing.h>

#include <cstddef>
#include <cstdio>

#include <olvane/charts/BoxForm.h>

#include <cli/UsageError.h>

namespace olvane::cli {

draw::PaperDrawing drawOnPaper(const PaperOptions& paper, const LayoutRequest& request,
                               const ContentOf& contentOf, const DrawingOptionsOf& optionsOf) {
    draw::PaperSubject subject;
    subject.folded = charts::foldsForPaper(request.view());
    subject.optionsOf = optionsOf;
    subject.contentOf = [&](double aspect) {
        if (aspect <= 0) return contentOf(request);
        LayoutRequest folded = request;
        charts::foldForPaper(folded.chart, aspect);
        return contentOf(folded);
    };
    try {
        return draw::drawOnPaper(sheetRequestOf(paper), subject);
    } catch (const draw::TooManySheets&) {
        throw UsageError(
            "the picture would take more than 1000 sheets; take larger paper or a smaller --scale, leave "
            "relatives or generations out, or draw it whole, without --fit");
    }
}

std::string sentenceOf(const draw::PaperDrawing& drawing) {
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
