// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// Under the address sanitizer every piece is an allocation of its own, or a stray pointer into another piece
// of the same block would go unseen.
#if defined(__SANITIZE_ADDRESS__)
#define OLVANE_EACH_PIECE_ALONE 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define OLVANE_EACH_PIECE_ALONE 1
#endif
#endif
#ifndef OLVANE_EACH_PIECE_ALONE
#define OLVANE_EACH_PIECE_ALONE 0
#endif

namespace olvane {

constexpr bool kEachPieceAlone = OLVANE_EACH_PIECE_ALONE != 0;

}  // namespace olvane
