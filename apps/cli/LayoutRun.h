// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include <olvane/boundary/TypedLayout.h>
#include <olvane/charts/Charts.h>
#include <olvane/gedcom/GedcomData.h>
#include <olvane/layouter/TreeSize.h>

namespace olvane::cli {

// Family and pedigree are the engine's own; the others are charts.
using charts::View;

// The form of the boxes: tall ones as hosts draw them, or wide ones, which keep a sideways chart low.
enum class BoxForm : std::uint8_t { tall, wide };

struct LayoutRequest {
    View view = View::family;
    int generations = 5;           // columns of a pedigree, the focus's own included
    std::string to;                // of the kinship view, as the user names the person; checked by PictureRun
    charts::ChartRequest chart{};  // of the other views; view, focus and sizes are filled in by PictureRun
    BoxForm boxes = BoxForm::tall;
    // Which relatives a family view shows; sizes and generations are filled in by typedLayout.
    olvane::LayoutOptions engine{};
    bool unknownParents = false;  // a picture of a view of the engine has boxes for parents who are not known
};

// Whether the engine makes the view, so that it has a result text.
inline bool isEngineView(View view) {
    return view == View::family || view == View::pedigree;
}

TreeSize sizeOf(BoxForm boxes);

// One layout of a view of the engine, as values and as text. Safe to call on several threads with the same data.
// Fails: std::length_error, with a sentence for the user, where the layout asks for more than 5 million relatives;
//        passes on what the engine throws; an id that is no person throws std::out_of_range.
TypedLayout typedLayout(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request);

// Its text alone. Fails as typedLayout does.
std::string layoutText(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request);

}  // namespace olvane::cli
