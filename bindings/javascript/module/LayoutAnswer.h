// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <olvane.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

namespace olvane::js {

struct FreeLayout {
    void operator()(olvane_layout* layout) const { olvane_layout_free(layout); }
};

// One layout as JavaScript reads it.
//
// Holds: numbers has, for each record: id, x, y, flag, kind, child, count of segments, and four numbers for
//        each segment. Ids have 32 bits that count, in records as elsewhere.
struct LayoutAnswer {
    olvane_status status = OLVANE_OUT_OF_MEMORY;
    std::unique_ptr<olvane_layout, FreeLayout> layout;
    std::vector<std::int32_t> numbers;
    std::string text;  // of a layout that is no olvane_layout
};

enum class View : int { family = 0, pedigree = 1 };

// Never throws; an answer without memory for it is null.
LayoutAnswer* layoutAnswer(const olvane_host& host, View view, double focus, const olvane_options& options);

using SourceMaker = std::function<std::shared_ptr<OlvaneViewerManagerWrapProtocol>()>;

// Asks a data source of ours directly: for the text of the layout, or else for its records; one that fails has both, from
// a second run. A source that ends a layout which asks for too much has failed as a host.
// Fails: std::bad_alloc.
void layOutSource(const SourceMaker& source, View view, double focus, bool withText, LayoutAnswer& answer);

// The options of the next layout, which JavaScript fills by set_options.
const olvane_options& nextOptions();

}  // namespace olvane::js
