// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the C++ library calls before it ends the module. Its own puts a message together by printf, numbers with a point
// included, for a stream that a module does not have: 7 kB that nobody reads.

#include <cstdlib>

extern "C" [[noreturn]] void abort_message(const char* format, ...) {
    static_cast<void>(format);
    std::abort();
}
