// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page lies in the command itself, as the bytes of a file, so that it is found wherever the command is.

#include <cli/PageTemplate.h>

#include <cstddef>

__asm__(
    ".section .rodata\n"
    ".hidden olvanePageBegin\n"
    ".hidden olvanePageEnd\n"
    ".global olvanePageBegin\n"
    ".global olvanePageEnd\n"
    "olvanePageBegin:\n"
    ".incbin \"" OLVANE_PAGE_TEMPLATE
    "\"\n"
    "olvanePageEnd:\n"
    ".byte 0\n"
    ".previous\n");

extern "C" const char olvanePageBegin[];
extern "C" const char olvanePageEnd[];

namespace olvane::cli {

std::string_view pageTemplate() {
    return std::string_view(olvanePageBegin, static_cast<std::size_t>(olvanePageEnd - olvanePageBegin));
}

}  // namespace olvane::cli
