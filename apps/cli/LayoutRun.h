// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/charts/BoxForm.h>
#include <olvane/charts/Charts.h>
#include <olvane/charts/Views.h>
#include <olvane/gedcom/GedcomData.h>
#include <olvane/source/ParentChoice.h>

namespace olvane::cli {

// Family and pedigree are the engine's own; the others are charts.
using charts::View;

using charts::BoxForm;

// What to lay out. chart says which view and what it shows; focus and sizes are filled in by PictureRun.
struct LayoutRequest : charts::ViewRequest {
    BoxForm boxes = BoxForm::tall;
    std::string to;  // of the kinship view, as the user names the person; checked by PictureRun
    std::vector<std::string> folds;  // "I5:down", "I5"; checked by PictureRun
    gedcom::ParentChoice parents{};

    LayoutRequest() {
        chart.view = View::family;
        unknownParents = false;
    }
    View view() const { return chart.view; }
};

// Whether the engine makes the view, so that it has a result text.
inline bool isEngineView(View view) {
    return view == View::family || view == View::pedigree;
}

// The same answers, up to 5 million relatives.
// Holds: refers to people, which must outlive it; one for each layout.
// Fails: its operations throw std::length_error, with a sentence for the user, beyond the limit.
std::shared_ptr<OlvaneViewerManagerWrapProtocol> limitedSource(OlvaneViewerManagerWrapProtocol& people);

// The result text of a view of the engine. Safe to call on several threads with the same data.
// Fails: as limitedSource says; passes on what the engine throws; an id that is no person throws std::out_of_range.
std::string layoutText(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request);

}  // namespace olvane::cli
