// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>

#include <olvane/draw/PaperDrawing.h>

#include <cli/LayoutRun.h>
#include <cli/PaperOptions.h>

namespace olvane::cli {

using ContentOf = std::function<draw::DrawingContent(const LayoutRequest& request)>;
using DrawingOptionsOf = std::function<draw::DrawingOptions(const draw::DrawingContent& content)>;

// As draw::drawOnPaper; the view everybody is folded for the paper.
//
// Fails: throws UsageError for more than 1,000 sheets; passes on what contentOf throws.
draw::PaperDrawing drawOnPaper(const PaperOptions& paper, const LayoutRequest& request,
                               const ContentOf& contentOf, const DrawingOptionsOf& optionsOf);

// "2 sheets of 297 x 420 mm, scale 0.64; names of at least 6.1 points, smallest text 5.0 points".
std::string sentenceOf(const draw::PaperDrawing& drawing);

}  // namespace olvane::cli
