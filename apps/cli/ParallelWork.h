// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <functional>

namespace olvane::cli {

// Does work(0) to work(count - 1), over all cores, in no order that may be relied on; returns when all is
// done. Fails: the first exception passes on, after the work under way has ended; the rest is left undone.
void inParallel(std::size_t count, const std::function<void(std::size_t)>& work);

}  // namespace olvane::cli
