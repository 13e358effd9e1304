// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/BoxForm.h>

#include <algorithm>

#include <olvane/charts/Folding.h>

namespace olvane::charts {

namespace {

// As close as lines allow, where all must go on one paper.
constexpr float kPaperGapX = 8;
constexpr float kPaperGapY = 14;
constexpr float kGapOfWideRows = 45;  // room for names of children over one another

}  // namespace

BoxForm usualBoxForm(View view, Direction direction) {
    if (view == View::pedigree) return BoxForm::wide;
    if (view == View::family || view == View::fan) return BoxForm::tall;
    return direction == Direction::left || direction == Direction::right ? BoxForm::wide : BoxForm::tall;
}

BoxForm usualBoxFormOnPaper(View view, Direction direction) {
    return view == View::everybody ? BoxForm::wide : usualBoxForm(view, direction);
}

TreeSize treeSizeOf(BoxForm form) {
    TreeSize size = familyTreeSize();
    if (form == BoxForm::wide) {
        size.nodeWidth = 105.0f;
        size.nodeHeight = 40.0f;
        size.horzPadding = 30.0f;
        size.vertPadding = 14.0f;
        size.lineInset = 15.0f;
    }
    return size;
}

void setBoxForm(ChartRequest& request, BoxForm form) {
    const TreeSize size = treeSizeOf(form);
    request.layout.sizes = size;
    request.sizes = ChartSizes();
    request.sizes.boxWidth = size.nodeWidth;
    request.sizes.boxHeight = size.nodeHeight;
    if (request.view == View::family || request.view == View::pedigree) {
        request.sizes.gapX = size.horzPadding;
        request.sizes.gapY = size.vertPadding;
    } else if (request.view == View::everybody && request.aspect > 0) {
        request.sizes.gapX = kPaperGapX;
        request.sizes.gapY = kPaperGapY;
    } else if (form == BoxForm::wide) {
        request.sizes.gapY = kGapOfWideRows;
    }
}

bool foldsForPaper(View view) {
    return view == View::everybody || canFold(view);
}

void foldForPaper(ChartRequest& request, double aspect) {
    request.aspect = aspect;
    if (request.view == View::everybody) request.compact = true;
}

void flagBeyondGenerations(ChartRequest& request) {
    request.layout.flagDepth = std::max(1, request.layout.generations - 1);
}

}  // namespace olvane::charts
