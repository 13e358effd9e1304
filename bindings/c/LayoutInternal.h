// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane.h>

#include <string>
#include <vector>

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

// The options of a C host as the engine takes them.
LayoutOptions layoutOptionsOf(const olvane_options& options);

}  // namespace olvane::c
