// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A case laid out by the engine: the frame of a request with the layouter, the options, the sizes and the
// parents' callback that the case asks for, and the finished graph written out line by line.

#include <support/CaseRun.h>

#include <support/GraphText.h>

#include <olvane/boundary/HostText.h>
#include <olvane/boundary/TypedLayoutWriterInternal.h>
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

// Runs the layouter that the case asks for.
template <class Run>
void withLayouter(const CaseFile& request, DataAdapter& adapter, int focusKey, const Run& run) {
    const int isMale = adapter.isMale(focusKey) ? 1 : 0;
    const OptionMap options = optionsOf(request);
    const TreeSize size = treeSizeOf(request);
    if (request.view == CaseView::pedigree) {
        TreeViewPedigreeLayouter layouter(&adapter, focusKey, isMale, options, size, request.maxGenerations,
                                          request.maxStackDepth);
        run(layouter);
    } else {
        TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale, options, size);
        run(layouter);
    }
}

// The frame of a request. Whatever fails is swallowed, and the answer is whether nothing did.
template <class Run>
bool inRequest(const CaseFile& request, const std::shared_ptr<CaseManager>& manager, const Run& run) {
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> source = manager;
    ViewerGlue glue;
    olvane::HostCallbacks callbacks(glue, source);
    if (request.adapter == CaseAdapter::bare) callbacks.getParents = bareParents(glue, *manager);
    bool completed = false;
    olvane::resetAddParentId();
    olvane::guarded([&] {
        DataAdapter adapter = callbacks.dataAdapter();
        const int focusKey = glue.getKeyFromPerson(intToString(static_cast<int>(request.focus)));
        withLayouter(request, adapter, focusKey, [&](auto& layouter) { run(layouter, glue); });
        completed = true;
    });
    return completed;
}

Outcome layOut(const CaseFile& request, const std::shared_ptr<CaseManager>& manager, bool graph) {
    Outcome outcome;
    inRequest(request, manager, [&](TreeViewLayouter& layouter, ViewerGlue& glue) {
        layouter.layoutForFocusNID();
        if (graph) outcome.graphLines = graphLines(layouter, glue);
        olvane::ResultBounds bounds;
        layouter.graphIterator(olvane::resultWriter(glue, bounds, outcome.text));
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

TypedRun runTypedCase(const CaseFile& request, const std::function<void(TreeViewLayouter&)>& look) {
    const auto manager = std::make_shared<CaseManager>(borrowed(request), true);
    TypedRun result;
    const bool completed = inRequest(request, manager, [&](TreeViewLayouter& layouter, ViewerGlue& glue) {
        SharedTreeViewer::LineRecord record;
        layouter.recordLinesIn(record);
        layouter.layoutForFocusNID();
        if (look) look(layouter);
        olvane::writeTypedLayout(glue, record, true, result.layout);
    });
    result.failed = !completed;
    result.trace = manager->host.trace();
    return result;
}

std::string joinLines(const std::vector<std::string>& lines) {
    std::string joined;
    for (const std::string& line : lines) joined += line + "\n";
    return joined;
}

}  // namespace support
