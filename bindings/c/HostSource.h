// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane.h>

#include <cstdint>
#include <limits>
#include <memory>
#include <string>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

namespace olvane::c {

constexpr bool isPersonId(std::int64_t id) {
    return id >= 1 && id <= std::numeric_limits<std::int32_t>::max();
}

// What a source of callbacks throws; neither ever leaves this library.
struct HostFailure {
    int code;  // of the callback; -1 where it threw an exception
    std::string what;
};

struct WrongId {
    std::string what;
};

// Whether the struct is of this version and has every callback.
bool isComplete(const olvane_host& host);

// The callbacks as a data source; the host outlives it.
// Fails: each question throws HostFailure, WrongId for an answer that is no id, or std::bad_alloc.
std::shared_ptr<OlvaneViewerManagerWrapProtocol> sourceOf(const olvane_host& host);

}  // namespace olvane::c
