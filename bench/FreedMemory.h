// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#if defined(__GLIBC__)
#include <malloc.h>
#endif

namespace bench {

// Has this program keep what it frees, as Node does for the peers. glibc would return the end of the heap to the system
// after a layout and request it again, page by page, in the next.
inline void keepFreedMemory() {
#if defined(__GLIBC__)
    constexpr int kMoreThanAnyLayout = 1 << 30;  // bytes
    mallopt(M_TRIM_THRESHOLD, kMoreThanAnyLayout);
    mallopt(M_MMAP_MAX, 0);  // a threshold would not do: glibc takes none above 32 MB
#endif
}

}  // namespace bench
