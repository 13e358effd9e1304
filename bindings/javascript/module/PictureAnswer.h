// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/picture/Picture.h>

namespace olvane::js {

// A picture as one run of numbers, which JavaScript reads faster than structs or text: first how many boxes,
// arcs, families, members, lines, bridges and marks there are, the box of the focus, how many rings and their
// middle; then each of them in the order that picture.mjs reads.
std::vector<double> numbersOf(const picture::Picture& picture);

}  // namespace olvane::js
