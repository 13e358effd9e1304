// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <stdexcept>
#include <string>

#include <olvane/draw/Sheets.h>

namespace olvane::draw {

// Thrown where a scale would take more than 1,000 sheets.
struct TooManySheets : std::length_error {
    using std::length_error::length_error;
};

// What is drawn on paper.
struct PaperSubject {
    // Lays out for an aspect, width by height, with wide generations folded; as usual for 0.
    std::function<DrawingContent(double aspect)> contentOf;
    std::function<DrawingOptions(const DrawingContent& content)> optionsOf;
    // Whether the layout depends on how the paper lies.
    bool folded = false;
};

// A picture on paper: the layout for that paper, names as large as their boxes allow where they would be too small to
// read, and the sheets.
//
// Holds: contentOf is asked once, and twice where the layout is folded and the paper may turn. A request with a scale
//        folds nothing.
// Fails: TooManySheets; otherwise as planSheets. Passes on what contentOf throws.
struct PaperDrawing {
    SheetDrawing drawing;
    std::string title;
    double scale = 1;  // by the size at 96 px an inch
    TextSizes points;  // on paper
};

PaperDrawing drawOnPaper(const SheetRequest& request, const PaperSubject& subject);

}  // namespace olvane::draw
