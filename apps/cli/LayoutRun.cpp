// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One layout through the engine's pieces, with the options and the view that the user chose. Failures are not
// swallowed here as the engine's entry does: a user is told.

#include <cli/LayoutRun.h>

#include <cstddef>
#include <memory>

#include <olvane/boundary/LayoutPieces.h>
#include <olvane/family/FamilyOptions.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/LimitedDataSource.h>

namespace olvane::cli {

namespace {

constexpr int kPedigreeStackDepth = 4;  // as the family view's own

// A thousand times what charts of real families ask for. A layout at the limit takes about a gigabyte, and up to a
// quarter of a minute where one person has a hundred thousand children, which are looked up in a set that large.
constexpr std::size_t kMostRelatives = 5000000;

SharedTreeViewer::OptionMap optionsOf(const LayoutRequest& request) {
    SharedTreeViewer::OptionMap options;
    options[SharedTreeViewer::IndicateNonDisplayedRelationships] = true;
    for (const std::string& key : request.keysOff) options[key] = false;
    return options;
}

template <class Layouter>
std::string writeLayout(Layouter& layouter, ViewerGlue& glue) {
    std::string text;
    ResultBounds bounds;
    layouter.layoutForFocusNID();
    layouter.graphIterator(resultWriter(glue, bounds, text));
    return text;
}

}  // namespace

TreeSize sizeOf(BoxForm boxes) {
    TreeSize size = familyTreeSize();
    if (boxes == BoxForm::wide) {
        size.nodeWidth = 105.0f;
        size.nodeHeight = 40.0f;
        size.horzPadding = 30.0f;
        size.vertPadding = 14.0f;
        size.lineInset = 15.0f;
    }
    return size;
}

std::string layoutText(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request) {
    ViewerGlue glue;
    gedcom::GedcomDataSource people(data);
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> source =
        std::make_shared<gedcom::LimitedDataSource>(people, kMostRelatives);
    const HostCallbacks callbacks(glue, source);
    resetAddParentId();
    DataAdapter adapter = callbacks.dataAdapter();
    const int focusKey = glue.getKeyFromPerson(std::to_string(focus));
    const int isMale = adapter.isMale(focusKey) ? 1 : 0;
    const SharedTreeViewer::OptionMap options = optionsOf(request);
    const TreeSize size = sizeOf(request.boxes);
    if (request.view == View::pedigree) {
        SharedTreeViewer::TreeViewPedigreeLayouter layouter(&adapter, focusKey, isMale, options, size,
                                                            request.generations, kPedigreeStackDepth);
        return writeLayout(layouter, glue);
    }
    SharedTreeViewer::TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale, options, size);
    return writeLayout(layouter, glue);
}

}  // namespace olvane::cli
