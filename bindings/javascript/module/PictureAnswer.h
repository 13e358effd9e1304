// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>
#include <vector>

#include <olvane/picture/Picture.h>

namespace olvane::js {

// A picture as one run of numbers, which JavaScript reads faster than structs or text: first how many boxes,
// arcs, families, members, lines, bridges and marks there are, the box of the focus, how many rings and their
// middle, the box of a kinship's other person, how many ways, boxes on them and pieces of their lines; then each of them in the order that picture.mjs reads.
std::vector<double> numbersOf(const picture::Picture& picture);

// The words of a kinship as a JSON array: those of the focus, of the other person, and of each way.
std::string textsOf(const picture::Picture& picture);

// The numbers of the picture that make gives, and what addMore puts behind them, with its words in last_text; null where it
// failed, and last_text says why.
std::vector<double>* pictureAnswer(
    const std::function<picture::Picture()>& make,
    const std::function<void(std::vector<double>& numbers)>& addMore = nullptr);

}  // namespace olvane::js
