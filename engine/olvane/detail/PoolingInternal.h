// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// Under the address sanitizer every block is an allocation of its own, or a stray pointer into another block of
// the same chunk would go unseen.
#if defined(__SANITIZE_ADDRESS__)
#define OLVANE_POOLING_DISABLED 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define OLVANE_POOLING_DISABLED 1
#endif
#endif
#ifndef OLVANE_POOLING_DISABLED
#define OLVANE_POOLING_DISABLED 0
#endif

namespace olvane {

constexpr bool kPoolingDisabled = OLVANE_POOLING_DISABLED != 0;

}  // namespace olvane
