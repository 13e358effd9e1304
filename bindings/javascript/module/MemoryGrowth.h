// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>

namespace olvane::js {

// Grows the module's memory to a size in bytes at once. The allocator would grow it by what each allocation lacks, which for a
// large file is thousands of times, and each time the browser makes JavaScript another buffer.
void ensureMemory(std::size_t bytes);

}  // namespace olvane::js
