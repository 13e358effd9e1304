// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The one file that sees both sides: C structs and callbacks on the left, the engine on the right. A host's
// callbacks become a data source for the length of a call; a failure that one of them reports travels through
// the engine as an exception and becomes a status at the entry. The records are read from the result text, so
// text and records can't disagree.

#include <olvane.h>

#include <cmath>
#include <cstdint>
#include <exception>
#include <memory>
#include <new>
#include <string>
#include <utility>
#include <vector>

#include "FamilyInternal.h"

#include <olvane/boundary/HostText.h>
#include <olvane/boundary/LayoutPieces.h>
#include <olvane/family/FamilyOptions.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/host/LayoutText.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

// The opaque answers are what the engine takes, so nothing is copied twice. An append that found no memory is
// remembered: a callback that does not look at its status must not hand in a shorter list unnoticed.
struct olvane_person_list {
    std::vector<std::int64_t> ids;
    bool lacksMemory = false;
};

struct olvane_date {
    std::string text;
    bool lacksMemory = false;
};

// Holds: records point into segments, which never grow after they were linked.
struct olvane_layout {
    std::string text;
    std::vector<olvane_segment> segments;
    std::vector<olvane_record> records;
    int hostCode = 0;
};

namespace {

using SharedTreeViewer::OptionMap;

constexpr int kThrownCode = -1;
constexpr int kDefaultGenerations = 5;
constexpr int kDefaultFlagDepth = 4;  // as the family view's own

// Travels through the engine only; never leaves this file.
struct HostFailure {
    int code;
};

// A data source that asks C callbacks.
class CallbackManager final : public OlvaneViewerManagerWrapProtocol {
public:
    explicit CallbackManager(const olvane_host& host) : host_(host) {}

    std::int64_t fatherForPersonWithID(std::int64_t personId) override {
        return parentFrom(host_.father_of, personId);
    }

    std::int64_t motherForPersonWithID(std::int64_t personId) override {
        return parentFrom(host_.mother_of, personId);
    }

    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override {
        return listFrom(host_.spouses_of, personId);
    }

    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override {
        return listFrom(host_.children_of, personId);
    }

    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override {
        int preferred = 0;
        ask([&] { return host_.is_preferred_spouse(host_.context, personId, spouseId, &preferred); });
        return preferred != 0;
    }

    bool isPersonDead(std::int64_t personId) override {
        int dead = 0;
        ask([&] { return host_.is_dead(host_.context, personId, &dead); });
        return dead != 0;
    }

    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override {
        olvane_date date;
        askInto(date, [&] { return host_.date_of(host_.context, personId, isBirth ? 1 : 0, &date); });
        return std::move(date.text);
    }

    std::int32_t sexOfPersonWithID(std::int64_t personId) override {
        std::int32_t sex = 0;
        ask([&] { return host_.sex_of(host_.context, personId, &sex); });
        return sex;
    }

private:
    typedef int (*ParentCallback)(void*, std::int64_t, std::int64_t*);
    typedef int (*ListCallback)(void*, std::int64_t, olvane_person_list*);

    // A callback in C++ may throw in spite of what it was told.
    template <class Question>
    static void ask(Question question) {
        int code = kThrownCode;
        try {
            code = question();
        } catch (...) {
            throw HostFailure{kThrownCode};
        }
        if (code != 0) throw HostFailure{code};
    }

    // For the opaque answers. One that found no memory is why the callback failed, if it did.
    template <class OpaqueAnswer, class Question>
    static void askInto(const OpaqueAnswer& answer, Question question) {
        try {
            ask(question);
        } catch (const HostFailure&) {
            if (!answer.lacksMemory) throw;
        }
        if (answer.lacksMemory) throw std::bad_alloc();
    }

    std::int64_t parentFrom(ParentCallback callback, std::int64_t personId) const {
        std::int64_t parent = kPersonNotFound;
        ask([&] { return callback(host_.context, personId, &parent); });
        return parent;
    }

    std::vector<std::int64_t> listFrom(ListCallback callback, std::int64_t personId) const {
        olvane_person_list list;
        askInto(list, [&] { return callback(host_.context, personId, &list); });
        return std::move(list.ids);
    }

    const olvane_host& host_;
};

// Counts this thread's layouts: the engine numbers its add-nodes by thread, and a second layout inside the
// first would start the numbers of both anew.
class RunningLayout {
public:
    RunningLayout() : isFirst_(!isRunning_) { isRunning_ = true; }
    ~RunningLayout() {
        if (isFirst_) isRunning_ = false;
    }
    RunningLayout(const RunningLayout&) = delete;
    RunningLayout& operator=(const RunningLayout&) = delete;

    bool isFirst() const { return isFirst_; }

private:
    static thread_local bool isRunning_;
    bool isFirst_;
};

thread_local bool RunningLayout::isRunning_ = false;

olvane_options defaultOptions() {
    const TreeSize size = olvane::familyTreeSize();
    olvane_options options;
    options.sizes = {size.nodeWidth,   size.nodeHeight,     size.horzPadding,
                     size.vertPadding, size.spouseLineStep, size.lineInset};
    options.shown = OLVANE_SHOW_ALL;
    options.generations = kDefaultGenerations;
    options.flag_depth = kDefaultFlagDepth;
    return options;
}

bool isComplete(const olvane_host& host) {
    return host.father_of && host.mother_of && host.spouses_of && host.children_of &&
           host.is_preferred_spouse && host.is_dead && host.date_of && host.sex_of;
}

bool areFinite(const olvane_sizes& sizes) {
    for (const float size : {sizes.node_width, sizes.node_height, sizes.horz_padding, sizes.vert_padding,
                             sizes.spouse_line_step, sizes.line_inset}) {
        if (!std::isfinite(size)) return false;
    }
    return true;
}

bool areInRange(const olvane_options& options) {
    return areFinite(options.sizes) && (options.shown & ~OLVANE_SHOW_ALL) == 0 && options.generations >= 1 &&
           options.generations <= OLVANE_MOST_GENERATIONS && options.flag_depth >= 0;
}

TreeSize treeSizeOf(const olvane_sizes& sizes) {
    TreeSize size;
    size.nodeWidth = sizes.node_width;
    size.nodeHeight = sizes.node_height;
    size.horzPadding = sizes.horz_padding;
    size.vertPadding = sizes.vert_padding;
    size.spouseLineStep = sizes.spouse_line_step;
    size.lineInset = sizes.line_inset;
    return size;
}

OptionMap familyOptionsOf(const olvane_options& options) {
    using namespace SharedTreeViewer;
    OptionMap map;
    map[IndicateNonDisplayedRelationships] = true;
    map[kTreeViewFamShowAuntsUnclesKey] = (options.shown & OLVANE_SHOW_AUNTS_UNCLES) != 0;
    map[kTreeViewFamShowCousinsKey] = (options.shown & OLVANE_SHOW_COUSINS) != 0;
    map[kTreeViewFamShowSiblingsKey] = (options.shown & OLVANE_SHOW_SIBLINGS) != 0;
    map[kTreeViewFamShowSiblingSpousesKey] = (options.shown & OLVANE_SHOW_SIBLING_SPOUSES) != 0;
    map[kTreeViewFamShowNeicesNephewsKey] = (options.shown & OLVANE_SHOW_NIECES_NEPHEWS) != 0;
    map[kTreeViewFamShowGrandchildrenKey] = (options.shown & OLVANE_SHOW_GRANDCHILDREN) != 0;
    map[kTreeViewFamShowGreatGrandparentsKey] = (options.shown & OLVANE_SHOW_GREAT_GRANDPARENTS) != 0;
    map[kTreeViewFamShowSpousesOfChildrenKey] = (options.shown & OLVANE_SHOW_SPOUSES_OF_CHILDREN) != 0;
    return map;
}

// What both views ask for. Exactly one of host and family is there.
struct Request {
    const olvane_host* host;
    const olvane_family* family;
    int focus;
    const olvane_options& options;
};

std::shared_ptr<OlvaneViewerManagerWrapProtocol> managerOf(const Request& request) {
    if (request.host) return std::make_shared<CallbackManager>(*request.host);
    return std::make_shared<olvane::FamilyDataSource>(request.family->table);
}

template <class Layouter>
void writeLayout(Layouter& layouter, ViewerGlue& glue, std::string& text) {
    layouter.layoutForFocusNID();
    olvane::ResultBounds bounds;
    layouter.graphIterator(olvane::resultWriter(glue, bounds, text));
}

void writeFamily(const Request& request, DataAdapter& adapter, ViewerGlue& glue, int focusKey,
                 std::string& text) {
    const int isMale = adapter.isMale(focusKey) ? 1 : 0;
    SharedTreeViewer::TreeViewFamilyLayouter layouter(
        &adapter, focusKey, isMale, familyOptionsOf(request.options), treeSizeOf(request.options.sizes));
    writeLayout(layouter, glue, text);
}

void writePedigree(const Request& request, DataAdapter& adapter, ViewerGlue& glue, int focusKey,
                   std::string& text) {
    const int isMale = adapter.isMale(focusKey) ? 1 : 0;
    SharedTreeViewer::TreeViewPedigreeLayouter layouter(
        &adapter, focusKey, isMale, OptionMap(), treeSizeOf(request.options.sizes),
        request.options.generations, request.options.flag_depth);
    writeLayout(layouter, glue, text);
}

typedef void (*ViewWriter)(const Request&, DataAdapter&, ViewerGlue&, int, std::string&);

void runRequest(const Request& request, ViewWriter writeView, std::string& text) {
    ViewerGlue glue;
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> manager = managerOf(request);
    const olvane::HostCallbacks callbacks(glue, manager);
    olvane::resetAddParentId();
    DataAdapter adapter = callbacks.dataAdapter();
    writeView(request, adapter, glue, glue.getKeyFromPerson(intToString(request.focus)), text);
}

olvane_status statusOfRun(const Request& request, ViewWriter writeView, olvane_layout& layout) {
    try {
        runRequest(request, writeView, layout.text);
    } catch (const HostFailure& failure) {
        layout.hostCode = failure.code;
        return OLVANE_HOST_FAILED;
    } catch (const std::bad_alloc&) {
        return OLVANE_OUT_OF_MEMORY;
    } catch (...) {
        return OLVANE_LAYOUT_FAILED;
    }
    return OLVANE_OK;
}

olvane_record_kind kindOf(const olvane::LayoutRecord& record) {
    if (!record.addNode) return OLVANE_PERSON;
    return record.addNode->male ? OLVANE_MISSING_FATHER : OLVANE_MISSING_MOTHER;
}

olvane_record recordOf(const olvane::LayoutRecord& record) {
    olvane_record result = {};
    result.id = record.id;
    result.x = record.x;
    result.y = record.y;
    result.has_hidden_relatives = record.hasHiddenRelatives ? 1 : 0;
    result.kind = kindOf(record);
    result.child = record.addNode ? record.addNode->childId : 0;
    result.segment_count = record.segments.size();
    return result;
}

void linkSegments(olvane_layout& layout) {
    const olvane_segment* next = layout.segments.data();
    for (olvane_record& record : layout.records) {
        record.segments = record.segment_count == 0 ? nullptr : next;
        next += record.segment_count;
    }
}

void readRecords(olvane_layout& layout) {
    for (const olvane::LayoutRecord& record : olvane::readWholeRecords(layout.text).records) {
        layout.records.push_back(recordOf(record));
        for (const olvane::LayoutSegment& piece : record.segments) {
            layout.segments.push_back({piece.x1, piece.y1, piece.x2, piece.y2});
        }
    }
    linkSegments(layout);
}

int lowBits(std::int64_t hostId) {
    return static_cast<int>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(hostId)));
}

olvane_status fillLayout(const Request& request, ViewWriter writeView, olvane_layout& layout) {
    if (request.focus < 1) return OLVANE_INVALID_PERSON;
    const olvane_status status = statusOfRun(request, writeView, layout);
    readRecords(layout);
    return status;
}

olvane_status layOut(const Request& request, ViewWriter writeView, olvane_layout** layout) noexcept {
    const RunningLayout running;
    if (!running.isFirst()) return OLVANE_NESTED_CALL;
    try {
        auto filled = std::make_unique<olvane_layout>();
        const olvane_status status = fillLayout(request, writeView, *filled);
        *layout = filled.release();
        return status;
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // nothing else can fail here: the text is the writer's own
    }
}

olvane_status layOutHost(const olvane_host* host, std::int64_t focus, const olvane_options* options,
                         ViewWriter writeView, olvane_layout** layout) noexcept {
    if (!layout) return OLVANE_INVALID_ARGUMENT;
    *layout = nullptr;
    const olvane_options chosen = options ? *options : defaultOptions();
    if (!host || !isComplete(*host) || !areInRange(chosen)) return OLVANE_INVALID_ARGUMENT;
    return layOut({host, nullptr, lowBits(focus), chosen}, writeView, layout);
}

}  // namespace

const char* olvane_status_text(olvane_status status) {
    switch (status) {
        case OLVANE_OK:
            return "The layout is complete.";
        case OLVANE_INVALID_ARGUMENT:
            return "A pointer or a callback is missing, or an option is out of its range.";
        case OLVANE_INVALID_PERSON:
            return "The id of the focus is not that of a person: ids are 1 and more in their low 32 bits.";
        case OLVANE_HOST_FAILED:
            return "A callback of the host failed; the layout holds what came before.";
        case OLVANE_LAYOUT_FAILED:
            return "The family's data leave no picture; the layout holds what came before.";
        case OLVANE_OUT_OF_MEMORY:
            return "There is not enough memory.";
        case OLVANE_NESTED_CALL:
            return "A callback asked for a layout while its own is still running on this thread.";
        case OLVANE_REFUSED:
            return "Rows of a family are wrong; nothing has changed, and the error says where.";
    }
    return "This number is not a status of this version.";
}

const char* olvane_version(void) {
    return OLVANE_VERSION;
}

olvane_status olvane_person_list_append(olvane_person_list* list, const int64_t* ids, size_t count) {
    if (!list || (!ids && count > 0)) return OLVANE_INVALID_ARGUMENT;
    try {
        list->ids.insert(list->ids.end(), ids, ids + count);
    } catch (...) {
        list->lacksMemory = true;
        return OLVANE_OUT_OF_MEMORY;
    }
    return OLVANE_OK;
}

olvane_status olvane_date_set(olvane_date* date, const char* text) {
    if (!date) return OLVANE_INVALID_ARGUMENT;
    try {
        date->text = text ? text : "";
    } catch (...) {
        date->lacksMemory = true;
        return OLVANE_OUT_OF_MEMORY;
    }
    return OLVANE_OK;
}

olvane_status olvane_options_default(olvane_options* options) {
    if (!options) return OLVANE_INVALID_ARGUMENT;
    *options = defaultOptions();
    return OLVANE_OK;
}

olvane_status olvane_layout_family(const olvane_host* host, int64_t focus, const olvane_options* options,
                                   olvane_layout** layout) {
    return layOutHost(host, focus, options, writeFamily, layout);
}

olvane_status olvane_layout_pedigree(const olvane_host* host, int64_t focus, const olvane_options* options,
                                     olvane_layout** layout) {
    return layOutHost(host, focus, options, writePedigree, layout);
}

olvane_status olvane_view(const olvane_family* family, int32_t view, int64_t focus,
                          const olvane_options* options, olvane_layout** layout) {
    if (!layout) return OLVANE_INVALID_ARGUMENT;
    *layout = nullptr;
    const olvane_options chosen = options ? *options : defaultOptions();
    const bool isView = view == OLVANE_VIEW_FAMILY || view == OLVANE_VIEW_PEDIGREE;
    if (!family || !isView || !areInRange(chosen)) return OLVANE_INVALID_ARGUMENT;
    const int known = family->table.hasPerson(focus) ? static_cast<int>(focus) : 0;
    return layOut({nullptr, family, known, chosen}, view == OLVANE_VIEW_FAMILY ? writeFamily : writePedigree,
                  layout);
}

void olvane_layout_free(olvane_layout* layout) {
    delete layout;
}

olvane_status olvane_layout_text(const olvane_layout* layout, const char** text, size_t* length) {
    if (!layout || !text) return OLVANE_INVALID_ARGUMENT;
    *text = layout->text.c_str();
    if (length) *length = layout->text.size();
    return OLVANE_OK;
}

olvane_status olvane_layout_records(const olvane_layout* layout, const olvane_record** records,
                                    size_t* count) {
    if (!layout || !records || !count) return OLVANE_INVALID_ARGUMENT;
    *records = layout->records.empty() ? nullptr : layout->records.data();
    *count = layout->records.size();
    return OLVANE_OK;
}

olvane_status olvane_layout_host_code(const olvane_layout* layout, int* code) {
    if (!layout || !code) return OLVANE_INVALID_ARGUMENT;
    *code = layout->hostCode;
    return OLVANE_OK;
}
