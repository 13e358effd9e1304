// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/charts/Views.h>
#include <olvane/gedcom/GedcomData.h>
#include <olvane/gedcom/HiddenNames.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/picture/Picture.h>
#include <olvane/picture/PictureJson.h>

#include <cli/LayoutRun.h>

namespace olvane::cli {

// Pictures of one file in one view.
//
// Holds: refers to the data, which must outlive it. Safe to ask on several threads.
// Fails: passes on what limitedSource and charts::pictureOf throw.
class PictureRun {
public:
    // hidden: of whom nothing is stated, an entry for each person; empty for nobody.
    PictureRun(const gedcom::GedcomData& data, const LayoutRequest& request, std::vector<bool> hidden);

    // Of hidden persons as picture::hidePersons leaves it.
    picture::Picture pictureOf(gedcom::PersonId focus) const;

    // What the file adds in JSON; of a hidden person {"living": true}. Valid as long as this lives.
    picture::PictureFacts facts() const;

    // A picture of this run as olvane layout prints it.
    void writeJson(const picture::Picture& picture, const picture::TextSink& write) const;

private:
    const gedcom::GedcomData& data_;
    charts::ViewRequest view_;
    std::vector<charts::Fold> folds_;
    std::vector<bool> hidden_;
    gedcom::HiddenNames hiddenNames_;
    gedcom::ParentChoice parents_;
    kin::KinGraph graph_;
};

}  // namespace olvane::cli
