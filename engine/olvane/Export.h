// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// Marks what a shared build of the engine offers; everything else stays hidden.
#if defined(__GNUC__) && !defined(__EMSCRIPTEN__)
#define OLVANE_API __attribute__((visibility("default")))
#else
#define OLVANE_API
#endif
