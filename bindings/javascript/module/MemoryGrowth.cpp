// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "MemoryGrowth.h"

namespace olvane::js {

void ensureMemory(std::size_t bytes) {
    constexpr std::size_t kPage = 65536;
    const std::size_t wanted = bytes / kPage;
    const std::size_t present = __builtin_wasm_memory_size(0);
    // Refused where there is no such room; the file may still find enough.
    if (wanted > present) __builtin_wasm_memory_grow(0, wanted - present);
}

}  // namespace olvane::js
