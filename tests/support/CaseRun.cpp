// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A case laid out by the engine: the frame of a request with the layouter, the options, the sizes and the
// parents' callback that the case asks for, and the finished graph written out line by line.

#include <support/CaseRun.h>

#include <support/GraphText.h>

#include <olvane/boundary/HostText.h>
#include <olvane/family/FamilyOptions.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include <memory>
#include <utility>

namespace support {

using SharedTreeViewer::OptionMap;
using SharedTreeViewer::TreeViewFamilyLayouter;
using SharedTreeViewer::TreeViewLayouter;
using SharedTreeViewer::TreeViewPedigreeLayouter;

CaseManager::CaseManager(CaseFile family, bool recordTrace) : host(std::move(family), recordTrace) {}

CaseManager::CaseManager(std::shared_ptr<const CaseFile> family, bool recordTrace)
    : host(std::move(family), recordTrace) {}

std::int64_t CaseManager::fatherForPersonWithID(std::int64_t personId) {
    return host.fatherForPersonWithID(personId);
}

std::int64_t CaseManager::motherForPersonWithID(std::int64_t personId) {
    return host.motherForPersonWithID(personId);
}

std::vector<std::int64_t> CaseManager::spousesForPersonWithID(std::int64_t personId) {
    return host.spousesForPersonWithID(personId);
}

std::vector<std::int64_t> CaseManager::childrenForPersonWithID(std::int64_t personId) {
    return host.childrenForPersonWithID(personId);
}

bool CaseManager::isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) {
    return host.isPreferredSpouse(personId, spouseId);
}

bool CaseManager::isPersonDead(std::int64_t personId) {
    return host.isPersonDead(personId);
}

std::string CaseManager::dateForPersonWithID(std::int64_t personId, bool isBirth) {
    return host.dateForPersonWithID(personId, isBirth);
}

std::int32_t CaseManager::sexOfPersonWithID(std::int64_t personId) {
    return host.sexOfPersonWithID(personId);
}

DataAdapter::ParentsCallback bareParents(ViewerGlue& glue, OlvaneViewerManagerWrapProtocol& manager) {
    return [&glue, &manager](int key, int& father, int& mother) {
        const int id = stringToInt(glue.personOfKey(key));
        if (id < 1) return;
        const auto fillIfKnown = [&glue](std::int64_t answer, int& slot) {
            if (answer == OlvaneViewerManagerWrapProtocol::kPersonNotFound) return;
            slot = glue.getKeyFromPerson(intToString(static_cast<int>(answer)));
        };
        fillIfKnown(manager.fatherForPersonWithID(id), father);
        fillIfKnown(manager.motherForPersonWithID(id), mother);
    };
}

TreeSize treeSizeOf(const CaseFile& request) {
    TreeSize size;
    size.nodeWidth = request.size.nodeWidth;
    size.nodeHeight = request.size.nodeHeight;
    size.horzPadding = request.size.horzPadding;
    size.vertPadding = request.size.vertPadding;
    size.spouseLineStep = request.size.spouseLineStep;
    size.lineInset = request.size.lineInset;
    return size;
}

namespace {

OptionMap optionsOf(const CaseFile& request) {
    OptionMap options;
    options[SharedTreeViewer::IndicateNonDisplayedRelationships] = true;
    for (const auto& [key, value] : request.options) options[key] = value;
    return options;
}

// What one request has gathered when it ends, in whatever way.
struct Outcome {
    std::string text;
    std::vector<std::string> graphLines;
};

template <class Layouter>
void layOutAndWrite(Layouter& layouter, ViewerGlue& glue, bool graph, Outcome& outcome) {
    layouter.layoutForFocusNID();
    if (graph) outcome.graphLines = graphLines(layouter, glue);
    olvane::ResultBounds bounds;
    layouter.graphIterator(olvane::resultWriter(glue, bounds, outcome.text));
}

void runLayouter(const CaseFile& request, DataAdapter& adapter, ViewerGlue& glue, int focusKey, bool graph,
                 Outcome& outcome) {
    const int isMale = adapter.isMale(focusKey) ? 1 : 0;
    const OptionMap options = optionsOf(request);
    const TreeSize size = treeSizeOf(request);
    if (request.view == CaseView::pedigree) {
        TreeViewPedigreeLayouter layouter(&adapter, focusKey, isMale, options, size, request.maxGenerations,
                                          request.maxStackDepth);
        layOutAndWrite(layouter, glue, graph, outcome);
    } else {
        TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale, options, size);
        layOutAndWrite(layouter, glue, graph, outcome);
    }
}

Outcome layOut(const CaseFile& request, const std::shared_ptr<CaseManager>& manager, bool graph) {
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> source = manager;
    ViewerGlue glue;
    olvane::HostCallbacks callbacks(glue, source);
    if (request.adapter == CaseAdapter::bare) callbacks.getParents = bareParents(glue, *manager);
    Outcome outcome;
    olvane::resetAddParentId();
    olvane::guarded([&] {
        DataAdapter adapter = callbacks.dataAdapter();
        const int focusKey = glue.getKeyFromPerson(intToString(static_cast<int>(request.focus)));
        runLayouter(request, adapter, glue, focusKey, graph, outcome);
    });
    outcome.text = std::string(outcome.text.c_str());
    return outcome;
}

}  // namespace

std::vector<std::string> runCase(const CaseFile& request, bool graph, bool trace) {
    const auto manager = std::make_shared<CaseManager>(borrowed(request), trace);
    const Outcome outcome = layOut(request, manager, graph);
    std::vector<std::string> lines{"text " + outcome.text};
    lines.insert(lines.end(), outcome.graphLines.begin(), outcome.graphLines.end());
    lines.insert(lines.end(), manager->host.trace().begin(), manager->host.trace().end());
    return lines;
}

std::string layoutText(const CaseFile& request) {
    return layOut(request, std::make_shared<CaseManager>(borrowed(request)), false).text;
}

std::string joinLines(const std::vector<std::string>& lines) {
    std::string joined;
    for (const std::string& line : lines) joined += line + "\n";
    return joined;
}

}  // namespace support
