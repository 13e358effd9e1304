// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Any family, laid out in either view with any options, depth and sizes. Contradictions, cycles, duplicates,
// ids from the edges of the numbers and a host that throws are all part of it. What is looked for: memory
// errors, undefined behaviour, an exception that gets out, a text that its own reader cannot read back.

#include <array>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/boundary/HostText.h>
#include <olvane/boundary/LayoutPieces.h>
#include <olvane/boundary/OlvaneViewerBridge.h>
#include <olvane/family/FamilyOptions.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/graph/TreeLine.h>
#include <olvane/graph/TreeViewGenerationEdge.h>
#include <olvane/graph/TreeViewPerson.h>
#include <olvane/graph/TreeViewSpouseEdge.h>
#include <olvane/host/LayoutText.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include "Holds.h"
#include "MadeUpHost.h"

namespace {

using SharedTreeViewer::OptionMap;
using Host = std::shared_ptr<OlvaneViewerManagerWrapProtocol>;

constexpr std::size_t kMostGenerations = 8;
constexpr std::size_t kDeepestStack = 6;

// All that an input says.
struct Request {
    bool isPedigree = false;
    bool hasBareParents = false;
    bool hasOwnSizes = false;
    OptionMap options;
    int generations = 0;
    int stackDepth = 0;
    TreeSize size{};
    std::int64_t focus = 0;
    Mischief mischief;
    std::vector<MadeUpPerson> family;
};

OptionMap nextOptions(ByteSource& bytes) {
    const std::array<std::string, 8> keys = {SharedTreeViewer::kTreeViewFamShowAuntsUnclesKey,
                                             SharedTreeViewer::kTreeViewFamShowCousinsKey,
                                             SharedTreeViewer::kTreeViewFamShowSiblingsKey,
                                             SharedTreeViewer::kTreeViewFamShowSiblingSpousesKey,
                                             SharedTreeViewer::kTreeViewFamShowNeicesNephewsKey,
                                             SharedTreeViewer::kTreeViewFamShowGrandchildrenKey,
                                             SharedTreeViewer::kTreeViewFamShowGreatGrandparentsKey,
                                             SharedTreeViewer::kTreeViewFamShowSpousesOfChildrenKey};
    const unsigned given = bytes.next();
    const unsigned values = bytes.next();
    OptionMap options;
    for (std::size_t i = 0; i < keys.size(); ++i) {
        if ((given >> i & 1U) != 0) options[keys[i]] = (values >> i & 1U) != 0;
    }
    return options;
}

float nextSize(ByteSource& bytes) {
    constexpr std::array<float, 12> kSizes = {55.0F,
                                              80.0F,
                                              0.0F,
                                              25.5F,
                                              -30.0F,
                                              0.1F,
                                              1e9F,
                                              -1e9F,
                                              3e38F,
                                              std::numeric_limits<float>::denorm_min(),
                                              std::numeric_limits<float>::infinity(),
                                              std::numeric_limits<float>::quiet_NaN()};
    return kSizes[bytes.nextBelow(kSizes.size())];
}

TreeSize nextTreeSize(ByteSource& bytes) {
    TreeSize size{};
    for (float* const field : {&size.nodeWidth, &size.nodeHeight, &size.horzPadding, &size.vertPadding,
                               &size.spouseLineStep, &size.lineInset}) {
        *field = nextSize(bytes);
    }
    return size;
}

Mischief nextMischief(ByteSource& bytes) {
    Mischief mischief;
    mischief.isFickle = bytes.nextBit();
    const unsigned high = bytes.next();
    mischief.throwsAtCall = high << 8U | bytes.next();
    mischief.kindOfThrow = bytes.next();
    return mischief;
}

// Small numbers are persons of the family; the rest are ids that it may not have.
std::int64_t nextFocus(ByteSource& bytes) {
    const std::uint8_t byte = bytes.next();
    if (byte < 250) return 1 + byte % 20;
    return static_cast<std::int64_t>(byte - 253) * (std::int64_t{1} << 31);
}

Request readRequest(ByteSource& bytes) {
    Request request;
    request.isPedigree = bytes.nextBit();
    request.hasBareParents = bytes.nextBit();
    request.options = nextOptions(bytes);
    request.generations = static_cast<int>(bytes.nextBelow(kMostGenerations + 1));
    request.stackDepth = static_cast<int>(bytes.nextBelow(kDeepestStack + 1));
    request.hasOwnSizes = bytes.nextBit();
    request.size = request.hasOwnSizes ? nextTreeSize(bytes) : olvane::familyTreeSize();
    request.mischief = nextMischief(bytes);
    request.focus = nextFocus(bytes);
    request.family = makeUpFamily(bytes);
    return request;
}

int lowBits(std::int64_t id) {
    return static_cast<int>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(id)));
}

// As the built-in parents' callback, but a parent who is not known stays away.
DataAdapter::ParentsCallback bareParents(ViewerGlue& glue, OlvaneViewerManagerWrapProtocol& host) {
    return [&glue, &host](int key, int& father, int& mother) {
        const int id = glue.numberOfKey(key);
        if (id < 1) return;
        const auto fillIfKnown = [&glue](std::int64_t answer, int& slot) {
            if (answer == OlvaneViewerManagerWrapProtocol::kPersonNotFound) return;
            slot = glue.keyOfNumber(lowBits(answer));
        };
        fillIfKnown(host.fatherForPersonWithID(id), father);
        fillIfKnown(host.motherForPersonWithID(id), mother);
    };
}

bool isKnown(const ViewerGlue& glue, const TreeViewPerson& person) {
    return glue.keyToPerson.count(person.personId) == 1;
}

void followSpouseEdges(const ViewerGlue& glue, TreeViewPerson& person) {
    person.spouseEdgeIterator([&](TreeViewSpouseEdge* edge) {
        HOLDS(isKnown(glue, *edge->person) && isKnown(glue, *edge->spouse));
        const auto first = edge->begin();
        for (auto child = first; child != edge->end(); ++child) {
            HOLDS(isKnown(glue, *(*child)->child));
            HOLDS((*child)->hasSingleParent() || (*child)->parentsEdge == edge);
            (*child)->line().length();
        }
        edge->line().length();
    });
}

void followGenerationEdges(const ViewerGlue& glue, TreeViewPerson& person) {
    person.generationEdgeIterator([&](TreeViewGenerationEdge* edge) {
        HOLDS(isKnown(glue, *edge->child));
        HOLDS(edge->hasMultipleParents() || isKnown(glue, *edge->singleParent));
        edge->line().length();
    });
}

// Chaining looks at every pair of segments, so it is tried on short lists alone.
void chainSegments(const TreeViewPerson& person) {
    constexpr std::size_t kMostChained = 40;
    if (person.lineSegments.size() > kMostChained) return;
    const std::vector<TreeLineSegment> segments(person.lineSegments.begin(), person.lineSegments.end());
    for (TreeLine& line : TreeLine::TreeLinesFromLineSegments(segments)) {
        HOLDS(line.points().size() >= 2);
        line.length();
    }
}

// What a host does that draws from the graph. It asks the data source nothing, so nothing may throw, and what
// does ends the program. Sizes of no sense make segments that cannot be chained.
template <class Layouter>
void lookAtGraph(const Request& request, Layouter& layouter, const ViewerGlue& glue) noexcept {
    layouter.graphIterator([&](TreeViewPerson& person) {
        followSpouseEdges(glue, person);
        followGenerationEdges(glue, person);
        if (!request.hasOwnSizes) chainSegments(person);
    });
    layouter.iterateDirectLineFromFocusPerson(
        [&glue](TreeViewPerson& person, bool hasNeighbours, const TreeViewPerson::Iterator& neighbours) {
            HOLDS(isKnown(glue, person));
            const auto look = [&glue](TreeViewPerson& neighbour) { HOLDS(isKnown(glue, neighbour)); };
            if (hasNeighbours) neighbours(look);
        });
}

template <class Layouter>
void layOutAndWrite(const Request& request, Layouter& layouter, ViewerGlue& glue, std::string& text) {
    layouter.layoutForFocusNID();
    lookAtGraph(request, layouter, glue);
    olvane::ResultBounds bounds;
    layouter.graphIterator(olvane::resultWriter(glue, bounds, text));
}

void runLayouter(const Request& request, DataAdapter& adapter, ViewerGlue& glue, std::string& text) {
    const int focusKey = glue.getKeyFromPerson(intToString(lowBits(request.focus)));
    const int isMale = adapter.isMale(focusKey) ? 1 : 0;
    if (request.isPedigree) {
        SharedTreeViewer::TreeViewPedigreeLayouter layouter(&adapter, focusKey, isMale, request.options,
                                                            request.size, request.generations,
                                                            request.stackDepth);
        layOutAndWrite(request, layouter, glue, text);
    } else {
        SharedTreeViewer::TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale, request.options,
                                                          request.size);
        layouter.maxStackDepth = request.stackDepth;
        layOutAndWrite(request, layouter, glue, text);
    }
}

struct Outcome {
    std::string text;
    bool isWhole = false;  // no exception cut it
};

Outcome layOut(const Request& request) {
    const Host host = std::make_shared<MadeUpHost>(request.family, request.mischief);
    ViewerGlue glue;
    olvane::HostCallbacks callbacks(glue, host);
    if (request.hasBareParents) callbacks.getParents = bareParents(glue, *host);
    Outcome outcome;
    olvane::resetAddParentId();
    olvane::guarded([&] {
        DataAdapter adapter = callbacks.dataAdapter();
        runLayouter(request, adapter, glue, outcome.text);
        outcome.isWhole = true;
    });
    return outcome;
}

void readBack(const Outcome& outcome) {
    const olvane::LayoutReading reading = olvane::readWholeRecords(outcome.text);
    HOLDS(olvane::writeLayoutText(reading.records) == outcome.text.substr(0, reading.wholeBytes));
    if (!outcome.isWhole) return;
    HOLDS(!reading.cut);
    HOLDS(!reading.records.empty());
    HOLDS(olvane::readLayoutText(outcome.text) == reading.records);
}

// What the bridge fixes: the view, the sizes, no option given.
bool isBridgesOwn(const Request& request) {
    return !request.isPedigree && !request.hasBareParents && !request.hasOwnSizes && request.options.empty();
}

void compareWithBridge(const Request& request, const std::string& text) {
    const Host host = std::make_shared<MadeUpHost>(request.family, request.mischief);
    HOLDS(OlvaneViewerBridge::initWithManagerWrap(host).valuesForPersonId(request.focus) == text);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    ByteSource bytes({data, size});
    Request request = readRequest(bytes);
    constexpr int kBridgesStackDepth = 4;
    if (isBridgesOwn(request)) request.stackDepth = kBridgesStackDepth;
    const Outcome outcome = layOut(request);
    readBack(outcome);
    if (isBridgesOwn(request)) compareWithBridge(request, outcome.text);
    return 0;
}
