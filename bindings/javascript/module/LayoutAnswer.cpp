// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A layout by the C interface, and its records as one run of numbers, which JavaScript reads faster than
// structs or text.

#include "LayoutAnswer.h"

#include <cmath>
#include <cstddef>
#include <exception>
#include <new>
#include <stdexcept>
#include <utility>

#include <olvane/boundary/TypedLayout.h>

#include <LayoutInternal.h>
#include <ViewOptions.h>

#include "HostImports.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

olvane_options optionsToUse;

void appendRecord(std::vector<std::int32_t>& numbers, const olvane_record& record) {
    numbers.insert(numbers.end(),
                   {static_cast<std::int32_t>(record.id), record.x, record.y, record.has_hidden_relatives,
                    static_cast<std::int32_t>(record.kind), static_cast<std::int32_t>(record.child),
                    static_cast<std::int32_t>(record.segment_count)});
    for (std::size_t i = 0; i < record.segment_count; ++i) {
        const olvane_segment& segment = record.segments[i];
        numbers.insert(numbers.end(), {segment.x1, segment.y1, segment.x2, segment.y2});
    }
}

void readRecords(LayoutAnswer& answer) {
    const olvane_record* records = nullptr;
    std::size_t count = 0;
    if (!answer.layout || olvane_layout_records(answer.layout.get(), &records, &count) != OLVANE_OK) return;
    for (std::size_t i = 0; i < count; ++i) appendRecord(answer.numbers, records[i]);
}

void appendBoxes(const TypedLayout& layout, std::vector<std::int32_t>& numbers) {
    numbers.reserve(layout.boxes.size() * 7 + layout.lines.size() * 4);
    for (const TypedLayout::Box& box : layout.boxes) {
        numbers.insert(numbers.end(),
                       {static_cast<std::int32_t>(box.id), box.x, box.y, box.hasHiddenRelatives ? 1 : 0,
                        static_cast<std::int32_t>(box.kind), static_cast<std::int32_t>(box.childId),
                        static_cast<std::int32_t>(box.lineCount)});
        for (const TypedLayout::Line& line : layout.linesOf(box)) {
            numbers.insert(numbers.end(), {line.x1, line.y1, line.x2, line.y2});
        }
    }
}

// JavaScript hands over whole numbers; what none of 64 bits could be is nobody.
std::int64_t idFrom(double focus) {
    constexpr double kLimit = 9007199254740992.0;  // 2^53, up to which doubles represent every whole number
    return std::abs(focus) < kLimit ? static_cast<std::int64_t>(focus) : 0;
}

}  // namespace

const olvane_options& nextOptions() {
    return optionsToUse;
}

LayoutAnswer* layoutAnswer(const olvane_host& host, View view, double focus, const olvane_options& options) {
    try {
        auto answer = std::make_unique<LayoutAnswer>();
        olvane_layout* layout = nullptr;
        const auto make = view == View::family ? olvane_layout_family : olvane_layout_pedigree;
        answer->status = make(&host, idFrom(focus), &options, &layout);
        answer->layout.reset(layout);
        readRecords(*answer);
        return answer.release();
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}

void layOutSource(const SourceMaker& source, View view, double focus, bool withText, LayoutAnswer& answer) {
    LayoutOptions options = c::layoutOptionsOf(nextOptions());
    options.withText = withText;
    TypedLayout layout;
    try {
        layOut(view == View::family ? TypedLayout::View::family : TypedLayout::View::pedigree, idFrom(focus),
               source(), options, layout);
        answer.status = OLVANE_OK;
    } catch (const std::bad_alloc&) {
        throw;
    } catch (const std::length_error&) {
        answer.status = OLVANE_HOST_FAILED;
    } catch (const std::exception&) {
        answer.status = OLVANE_LAYOUT_FAILED;
    }
    if (answer.status != OLVANE_OK && !withText) return layOutSource(source, view, focus, true, answer);
    if (!withText || answer.status != OLVANE_OK) appendBoxes(layout, answer.numbers);
    answer.text = std::move(layout.text);
}

}  // namespace olvane::js

using olvane::js::LayoutAnswer;

OLVANE_EXPORT("set_options")
void setOptions(float nodeWidth, float nodeHeight, float horzPadding, float vertPadding, float spouseLineStep,
                float lineInset, std::uint32_t shown, std::int32_t generations, std::int32_t flagDepth) {
    olvane::js::optionsToUse = {sizeof(olvane_options),
                                {nodeWidth, nodeHeight, horzPadding, vertPadding, spouseLineStep, lineInset},
                                shown,
                                generations,
                                flagDepth};
}

OLVANE_EXPORT("layout_host") LayoutAnswer* layoutHost(int view, double focus) {
    return olvane::js::layoutAnswer(olvane::js::hostOfJavaScript(), static_cast<olvane::js::View>(view),
                                    focus, olvane::js::nextOptions());
}

OLVANE_EXPORT("answer_status") int answerStatus(const LayoutAnswer* answer) {
    return answer->status;
}

OLVANE_EXPORT("answer_text") const char* answerText(const LayoutAnswer* answer) {
    const char* text = answer->text.c_str();
    if (answer->layout) olvane_layout_text(answer->layout.get(), &text, nullptr);
    return text;
}

OLVANE_EXPORT("answer_text_length") std::size_t answerTextLength(const LayoutAnswer* answer) {
    const char* text = "";
    std::size_t length = answer->text.size();
    if (answer->layout) olvane_layout_text(answer->layout.get(), &text, &length);
    return length;
}

OLVANE_EXPORT("answer_numbers") const std::int32_t* answerNumbers(const LayoutAnswer* answer) {
    return answer->numbers.data();
}

OLVANE_EXPORT("answer_count") std::size_t answerCount(const LayoutAnswer* answer) {
    return answer->numbers.size();
}

OLVANE_EXPORT("answer_free") void answerFree(LayoutAnswer* answer) {
    delete answer;
}

OLVANE_EXPORT("status_text") const char* statusText(int status) {
    return olvane_status_text(static_cast<olvane_status>(status));
}

OLVANE_EXPORT("version") const char* version() {
    return olvane_version();
}
