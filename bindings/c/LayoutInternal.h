// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/boundary/TypedLayout.h>

// The opaque layout: what the engine filled, and the form in which C reads it.
//
// Holds: records point into segments, which stay as they are once they are linked.
struct olvane_layout {
    olvane::TypedLayout typed;
    std::vector<olvane_segment> segments;
    std::vector<olvane_record> records;
    int hostCode = 0;
    std::string failure;  // what a callback did; empty for other failures
};

namespace olvane::c {

// Runs the work, and makes a status and a sentence of what it throws.
olvane_status guarded(const std::function<void()>& work, std::string& failure);

// Runs the work unless a layout of a host is running on this thread.
void unlessNested(const std::function<void()>& work);

typedef std::function<std::shared_ptr<OlvaneViewerManagerWrapProtocol>()> MakeSource;

// A layout of a source in C++, with all checks of what C passes in; view is an olvane_view_kind.
olvane_status layOutSource(const MakeSource& makeSource, std::int32_t view, std::int64_t focus,
                           const olvane_options* options, olvane_layout** layout) noexcept;

}  // namespace olvane::c
