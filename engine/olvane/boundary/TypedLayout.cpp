// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A typed layout is filled in the order of the walk: each visited person gives a box and the lines that it holds, joined one by one with
// what the layouter recorded of them. The text, where it is asked for, is written from the same numbers.

#include <olvane/boundary/TypedLayout.h>

#include <cmath>
#include <limits>
#include <stdexcept>
#include <string>

#include <olvane/boundary/LayoutPieces.h>
#include <olvane/boundary/ResultRecordInternal.h>
#include <olvane/boundary/TypedLayoutWriterInternal.h>
#include <olvane/family/FamilyOptions.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/graph/WholePointInternal.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

namespace olvane {

namespace {

using SharedTreeViewer::LineRecord;
using SharedTreeViewer::OptionMap;
typedef TypedLayout::Index Index;

// Fills the boxes and the lines, person by person.
class BoxWriter {
public:
    BoxWriter(const ViewerGlue& glue, const LineRecord& record, bool withText, TypedLayout& layout)
        : glue_(glue), record_(record), withText_(withText), layout_(layout) {
        layout.boxes.reserve(record.visits());
        layout.lines.reserve(record.segments());
    }

    // What fails leaves no line without its box.
    ~BoxWriter() {
        const std::size_t lines =
            layout_.boxes.empty() ? 0 : layout_.boxes.back().firstLine + layout_.boxes.back().lineCount;
        layout_.lines.resize(lines);
    }
    BoxWriter(const BoxWriter&) = delete;
    BoxWriter& operator=(const BoxWriter&) = delete;

    void add(const TreeViewPerson& person) {
        const Index place = static_cast<Index>(layout_.boxes.size());
        TypedLayout::Box box;
        box.firstLine = static_cast<std::uint32_t>(layout_.lines.size());
        box.id = glue_.numberOfKey(person.personId);
        box.x = wholePoint(person.getNodeCenter().x);
        box.y = wholePoint(person.getNodeCenter().y);
        box.male = person.gender;
        box.hasHiddenRelatives = person.hasNonDisplayedRelationships;
        if (person.walkNumber() != place) box.repeatOf = person.walkNumber();
        addLines(person, place);
        box.lineCount = static_cast<std::uint32_t>(layout_.lines.size()) - box.firstLine;
        if (withText_) appendRecord(glue_, person.personId, box, layout_.linesOf(box), layout_.text);
        if (box.id < 0) setUnknownParent(person.personId, box);
        hasUnknownParents_ = hasUnknownParents_ || box.id < 0;
        layout_.boxes.push_back(box);
    }

    bool hasUnknownParents() const { return hasUnknownParents_; }

private:
    void setUnknownParent(int key, TypedLayout::Box& box) const {
        box.kind = glue_.addNodeIsMale(key) ? TypedLayout::BoxKind::unknownFather
                                            : TypedLayout::BoxKind::unknownMother;
        box.childId = glue_.childNumberOfAddNode(key);
    }

    void addLines(const TreeViewPerson& person, Index holder) {
        const TreeLineSegment* segment = person.lineSegments.data();
        std::size_t left = person.lineSegments.size();
        const LineRecord::Entry* const entries = record_.entries().data();
        for (int place = record_.firstEntryOf(person); place != LineRecord::kNone;) {
            const LineRecord::Entry entry = entries[place];
            if (entry.segments > left) failForCount();
            for (std::uint8_t i = 0; i < entry.segments; ++i) addLine(*segment++, entry, i, holder);
            left -= entry.segments;
            place = entry.next;
        }
        if (left != 0) failForCount();
    }

    // Lines run along the axes, so the second end mostly shares a number with the first.
    void addLine(const TreeLineSegment& segment, const LineRecord::Entry& entry, std::uint8_t place,
                 Index holder) {
        const int x1 = wholePoint(segment.x1);
        const int y1 = wholePoint(segment.y1);
        const int x2 = segment.x2 == segment.x1 ? x1 : wholePoint(segment.x2);
        const int y2 = segment.y2 == segment.y1 ? y1 : wholePoint(segment.y2);
        const auto role = static_cast<LineRole>(static_cast<std::uint8_t>(entry.first) + place);
        layout_.lines.push_back({x1, y1, x2, y2, holder, entry.family, entry.child, role});
    }

    [[noreturn]] static void failForCount() {
        throw std::logic_error("a person's lines are not those that were recorded");
    }

    const ViewerGlue& glue_;
    const LineRecord& record_;
    const bool withText_;
    TypedLayout& layout_;
    bool hasUnknownParents_ = false;
};

// A family's children, each once. Only where the walk visits somebody twice may one have been recorded twice.
void addChildren(const LineRecord& record, const LineRecord::Family& family, std::vector<Index>& seenIn,
                 TypedLayout& layout) {
    const auto number = static_cast<Index>(layout.families.size());
    for (int place = family.firstChild; place != LineRecord::kNone;) {
        const LineRecord::Child& entry = record.children()[static_cast<std::size_t>(place)];
        place = entry.next;
        if (record.hasRepeatedVisits()) {
            Index& seen = seenIn[static_cast<std::size_t>(entry.child)];
            if (seen == number) continue;
            seen = number;
        }
        layout.children.push_back(entry.child);
    }
}

void addFamilies(const LineRecord& record, TypedLayout& layout) {
    std::vector<Index> seenIn(record.hasRepeatedVisits() ? record.visits() : 0, TypedLayout::kNone);
    layout.families.reserve(record.families().size());
    layout.children.reserve(record.children().size());
    for (const LineRecord::Family& family : record.families()) {
        const auto first = static_cast<std::uint32_t>(layout.children.size());
        addChildren(record, family, seenIn, layout);
        const auto count = static_cast<std::uint32_t>(layout.children.size()) - first;
        layout.families.push_back({{family.first, family.second}, first, count});
    }
}

// An unknown parent stands in a family with the child for whom it stands, and perhaps with that one's siblings.
void linkUnknownParents(TypedLayout& layout) {
    for (const TypedLayout::Family& family : layout.families) {
        for (const Index parent : layout.parentsOf(family)) {
            TypedLayout::Box& box = layout.boxes[static_cast<std::size_t>(parent)];
            if (box.kind == TypedLayout::BoxKind::person || box.childOf != TypedLayout::kNone) continue;
            for (const Index child : layout.childrenOf(family)) {
                if (layout.boxes[static_cast<std::size_t>(child)].id == box.childId) box.childOf = child;
            }
        }
    }
}

// Every option that is read stands at true when its key is absent.
OptionMap familyOptionsOf(const LayoutOptions& options) {
    using namespace SharedTreeViewer;
    OptionMap map;
    map[IndicateNonDisplayedRelationships] = true;
    const auto leaveOut = [&map](const std::string& key, bool isShown) {
        if (!isShown) map[key] = false;
    };
    leaveOut(kTreeViewFamShowAuntsUnclesKey, options.auntsUncles);
    leaveOut(kTreeViewFamShowCousinsKey, options.cousins);
    leaveOut(kTreeViewFamShowSiblingsKey, options.siblings);
    leaveOut(kTreeViewFamShowSiblingSpousesKey, options.siblingSpouses);
    leaveOut(kTreeViewFamShowNeicesNephewsKey, options.niecesNephews);
    leaveOut(kTreeViewFamShowGrandchildrenKey, options.grandchildren);
    leaveOut(kTreeViewFamShowGreatGrandparentsKey, options.greatGrandparents);
    leaveOut(kTreeViewFamShowSpousesOfChildrenKey, options.spousesOfChildren);
    return map;
}

void check(std::int64_t focusId, const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager,
           const LayoutOptions& options) {
    const TreeSize& sizes = options.sizes;
    if (focusId < 1 || focusId > std::numeric_limits<std::int32_t>::max()) {
        throw std::invalid_argument("the focus's id is not between 1 and 2147483647");
    }
    if (!manager) throw std::invalid_argument("no data source");
    for (const float size : {sizes.nodeWidth, sizes.nodeHeight, sizes.horzPadding, sizes.vertPadding,
                             sizes.spouseLineStep, sizes.lineInset}) {
        if (!std::isfinite(size)) throw std::invalid_argument("a size is not finite");
    }
    if (options.generations < 1 || options.generations > LayoutOptions::kMostGenerations) {
        throw std::invalid_argument("generations is not between 1 and 1000");
    }
    if (options.flagDepth < 0) throw std::invalid_argument("flagDepth is below 0");
}

template <class Layouter>
void run(Layouter& layouter, ViewerGlue& glue, bool withText, TypedLayout& result) {
    LineRecord record;
    layouter.recordLinesIn(record);
    layouter.layoutForFocusNID();
    writeTypedLayout(glue, record, withText, result);
}

}  // namespace

void writeTypedLayout(const ViewerGlue& glue, const SharedTreeViewer::LineRecord& record, bool withText,
                      TypedLayout& result) {
    BoxWriter boxes(glue, record, withText, result);
    for (std::size_t visit = 0; visit < record.visits(); ++visit) boxes.add(record.visited(visit));
    addFamilies(record, result);
    if (boxes.hasUnknownParents()) linkUnknownParents(result);
}

void layOut(TypedLayout::View view, std::int64_t focusId,
            const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager, const LayoutOptions& options,
            TypedLayout& result) {
    check(focusId, manager, options);
    result = TypedLayout();
    result.view = view;
    result.sizes = options.sizes;
    const NegativeIds ids;
    ViewerGlue glue;
    const HostCallbacks callbacks(glue, manager);
    DataAdapter adapter = callbacks.dataAdapter();
    const int focusKey = glue.keyOfNumber(static_cast<int>(focusId));
    const int isMale = adapter.isMale(focusKey) ? 1 : 0;
    if (view == TypedLayout::View::family) {
        SharedTreeViewer::TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale,
                                                          familyOptionsOf(options), options.sizes);
        run(layouter, glue, options.withText, result);
    } else {
        SharedTreeViewer::TreeViewPedigreeLayouter layouter(
            &adapter, focusKey, isMale, OptionMap(), options.sizes, options.generations, options.flagDepth);
        run(layouter, glue, options.withText, result);
    }
}

TypedLayout familyLayout(std::int64_t focusId,
                         const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager,
                         const LayoutOptions& options) {
    TypedLayout result;
    layOut(TypedLayout::View::family, focusId, manager, options, result);
    return result;
}

TypedLayout pedigreeLayout(std::int64_t focusId,
                           const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager,
                           const LayoutOptions& options) {
    TypedLayout result;
    layOut(TypedLayout::View::pedigree, focusId, manager, options, result);
    return result;
}

std::vector<LayoutRecord> recordsOf(const TypedLayout& layout) {
    std::vector<LayoutRecord> records;
    records.reserve(layout.boxes.size());
    for (const TypedLayout::Box& box : layout.boxes) {
        LayoutRecord record;
        record.id = box.id;
        record.x = box.x;
        record.y = box.y;
        record.hasHiddenRelatives = box.hasHiddenRelatives;
        for (const TypedLayout::Line& line : layout.linesOf(box)) {
            record.segments.push_back({line.x1, line.y1, line.x2, line.y2});
        }
        if (box.id < 0) {
            record.addNode = AddNodeSuffix{box.kind == TypedLayout::BoxKind::unknownFather, box.childId};
        }
        records.push_back(std::move(record));
    }
    return records;
}

}  // namespace olvane
