// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Layouts in C: the engine is asked, what it throws becomes a status, and records are made from the typed layout that
// it fills beside the text.

#include <olvane.h>

#include <cstdint>
#include <memory>
#include <new>
#include <stdexcept>
#include <string>
#include <vector>

#include "FamilyInternal.h"
#include "HostSource.h"
#include "LayoutInternal.h"
#include "ViewOptions.h"

namespace {

using olvane::TypedLayout;
using olvane::c::areInRange;
using olvane::c::defaultOptions;
using olvane::c::HostFailure;
using olvane::c::isComplete;
using olvane::c::isPersonId;
using olvane::c::layoutOptionsOf;
using olvane::c::WrongId;

// Counts this thread's layouts: the engine numbers its unknown parents by thread, and a second layout inside the
// first would start the numbers of both again.
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

// What both views ask for. Exactly one of host and source is there.
struct Request {
    const olvane_host* host;
    std::shared_ptr<OlvaneViewerManagerWrapProtocol> source;
    std::int64_t focus;
    const olvane_options& options;
    TypedLayout::View view;
};

std::shared_ptr<OlvaneViewerManagerWrapProtocol> managerOf(const Request& request) {
    if (request.host) return olvane::c::sourceOf(*request.host);
    return request.source;
}

olvane_status statusOfRun(const Request& request, olvane_layout& layout) {
    try {
        olvane::layOut(request.view, request.focus, managerOf(request), layoutOptionsOf(request.options),
                       layout.typed);
    } catch (const HostFailure& failure) {
        layout.hostCode = failure.code;
        layout.failure = failure.what;
        return OLVANE_HOST_FAILED;
    } catch (const WrongId& wrong) {
        layout.failure = wrong.what;
        return OLVANE_INVALID_ID;
    } catch (const std::bad_alloc&) {
        return OLVANE_OUT_OF_MEMORY;
    } catch (...) {
        return OLVANE_LAYOUT_FAILED;
    }
    return OLVANE_OK;
}

olvane_record_kind kindOf(TypedLayout::BoxKind kind) {
    switch (kind) {
        case TypedLayout::BoxKind::unknownFather:
            return OLVANE_MISSING_FATHER;
        case TypedLayout::BoxKind::unknownMother:
            return OLVANE_MISSING_MOTHER;
        case TypedLayout::BoxKind::person:
            break;
    }
    return OLVANE_PERSON;
}

olvane_record recordOf(const TypedLayout::Box& box, const olvane_segment* segments) {
    olvane_record result = {};
    result.id = box.id;
    result.x = box.x;
    result.y = box.y;
    result.has_hidden_relatives = box.hasHiddenRelatives ? 1 : 0;
    result.kind = kindOf(box.kind);
    result.child = box.childId;
    result.segments = box.lineCount == 0 ? nullptr : segments + box.firstLine;
    result.segment_count = box.lineCount;
    return result;
}

void addRecords(olvane_layout& layout) {
    layout.segments.reserve(layout.typed.lines.size());
    for (const TypedLayout::Line& line : layout.typed.lines) {
        layout.segments.push_back({line.x1, line.y1, line.x2, line.y2});
    }
    layout.records.reserve(layout.typed.boxes.size());
    for (const TypedLayout::Box& box : layout.typed.boxes) {
        layout.records.push_back(recordOf(box, layout.segments.data()));
    }
}

olvane_status fillLayout(const Request& request, olvane_layout& layout) {
    if (!isPersonId(request.focus)) return OLVANE_INVALID_PERSON;
    const olvane_status status = statusOfRun(request, layout);
    addRecords(layout);
    return status;
}

olvane_status layOut(const Request& request, olvane_layout** layout) noexcept {
    const RunningLayout running;
    if (!running.isFirst()) return OLVANE_NESTED_CALL;
    try {
        auto filled = std::make_unique<olvane_layout>();
        const olvane_status status = fillLayout(request, *filled);
        *layout = filled.release();
        return status;
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // nothing else can fail here
    }
}

olvane_status layOutHost(const olvane_host* host, std::int64_t focus, const olvane_options* options,
                         TypedLayout::View view, olvane_layout** layout) noexcept {
    if (!layout) return OLVANE_INVALID_ARGUMENT;
    *layout = nullptr;
    const olvane_options chosen = options ? *options : defaultOptions();
    if (!host || !isComplete(*host) || !areInRange(chosen)) return OLVANE_INVALID_ARGUMENT;
    return layOut({host, nullptr, focus, chosen, view}, layout);
}

}  // namespace

olvane_status olvane::c::guarded(const std::function<void()>& work, std::string& failure) {
    try {
        work();
    } catch (const HostFailure& hostFailure) {
        failure = hostFailure.what;
        return OLVANE_HOST_FAILED;
    } catch (const WrongId& wrong) {
        failure = wrong.what;
        return OLVANE_INVALID_ID;
    } catch (const std::out_of_range&) {
        failure = "The focus, or the other person, is not there.";
        return OLVANE_INVALID_PERSON;
    } catch (const std::bad_alloc&) {
        return OLVANE_OUT_OF_MEMORY;
    } catch (const std::exception& error) {
        failure = error.what();
        return OLVANE_LAYOUT_FAILED;
    }
    return OLVANE_OK;
}

void olvane::c::unlessNested(const std::function<void()>& work) {
    const RunningLayout running;
    if (running.isFirst()) work();
}

olvane_status olvane::c::layOutSource(const MakeSource& makeSource, std::int32_t view, std::int64_t focus,
                                      const olvane_options* options, olvane_layout** layout) noexcept {
    if (!layout) return OLVANE_INVALID_ARGUMENT;
    *layout = nullptr;
    const olvane_options chosen = options ? *options : defaultOptions();
    const bool isFamilyView = view == OLVANE_VIEW_FAMILY;
    if (!(isFamilyView || view == OLVANE_VIEW_PEDIGREE) || !areInRange(chosen))
        return OLVANE_INVALID_ARGUMENT;
    const auto chosenView = isFamilyView ? TypedLayout::View::family : TypedLayout::View::pedigree;
    try {
        return ::layOut(Request{nullptr, makeSource(), focus, chosen, chosenView}, layout);
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // nothing else can fail here
    }
}

const char* olvane_status_text(olvane_status status) {
    switch (status) {
        case OLVANE_OK:
            return "The layout is complete.";
        case OLVANE_INVALID_ARGUMENT:
            return "A pointer or a callback is missing, or an option is out of its range.";
        case OLVANE_INVALID_PERSON:
            return "The id of the focus is not that of a person: ids are 1 to 2147483647.";
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
        case OLVANE_INVALID_ID:
            return "A callback answered a number that is no id of a person: ids are 1 to 2147483647.";
        case OLVANE_UNREADABLE:
            return "There is nothing to read: the file cannot be opened, or is not GEDCOM.";
    }
    return "This number is not a status of this version.";
}

const char* olvane_version(void) {
    return OLVANE_VERSION;
}

olvane_status olvane_layout_family(const olvane_host* host, int64_t focus, const olvane_options* options,
                                   olvane_layout** layout) {
    return layOutHost(host, focus, options, TypedLayout::View::family, layout);
}

olvane_status olvane_layout_pedigree(const olvane_host* host, int64_t focus, const olvane_options* options,
                                     olvane_layout** layout) {
    return layOutHost(host, focus, options, TypedLayout::View::pedigree, layout);
}

olvane_status olvane_view(const olvane_family* family, int32_t view, int64_t focus,
                          const olvane_options* options, olvane_layout** layout) {
    if (layout) *layout = nullptr;
    if (!family) return OLVANE_INVALID_ARGUMENT;
    const std::int64_t known = family->table.hasPerson(focus) ? focus : 0;
    const auto source = [&] { return std::make_shared<olvane::FamilyDataSource>(family->table); };
    return olvane::c::layOutSource(source, view, known, options, layout);
}

void olvane_layout_free(olvane_layout* layout) {
    delete layout;
}

olvane_status olvane_layout_text(const olvane_layout* layout, const char** text, size_t* length) {
    if (!layout || !text) return OLVANE_INVALID_ARGUMENT;
    *text = layout->typed.text.c_str();
    if (length) *length = layout->typed.text.size();
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

olvane_status olvane_layout_failure(const olvane_layout* layout, const char** text) {
    if (!layout || !text) return OLVANE_INVALID_ARGUMENT;
    *text = layout->failure.c_str();
    return OLVANE_OK;
}
