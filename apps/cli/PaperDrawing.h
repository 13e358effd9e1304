// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>

#include <olvane/draw/Sheets.h>

#include <cli/LayoutRun.h>
#include <cli/PaperOptions.h>

namespace olvane::cli {

// A picture on paper: the layout for that paper, names as large as their boxes allow where they would be too small to
// read, and the sheets.
//
// Holds: contentOf lays out a request; it is asked once, and twice where the layout depends on how the paper lies.
// Fails: throws UsageError for more than 1,000 sheets; passes on what contentOf throws.
struct PaperDrawing {
    draw::SheetDrawing drawing;
    std::string title;
    double scale = 1;  // by the size at 96 px an inch
    draw::TextSizes points;
};

using ContentOf = std::function<draw::DrawingContent(const LayoutRequest& request)>;
using DrawingOptionsOf = std::function<draw::DrawingOptions(const draw::DrawingContent& content)>;

PaperDrawing drawOnPaper(const PaperOptions& paper, const LayoutRequest& request, const ContentOf& contentOf,
                         const DrawingOptionsOf& optionsOf);

// "2 sheets of 297 x 420 mm, scale 0.64; names of at least 6.1 points, smallest text 5.0 points".
std::string sentenceOf(const PaperDrawing& drawing);

}  // namespace olvane::cli
