// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <exception>
#include <string>

#include <olvane/kin/FamilyError.h>

namespace olvane::js {

// What the last call about a family has to say: JSON that was asked for, a file, or why something was refused.
extern std::string lastFamilyText;

// 0, or the number of what went wrong: 1 for rows that were refused, with the error as JSON, 2 where memory is short.
constexpr int kRefused = 1;
constexpr int kLacksMemory = 2;

// The error as JSON, to lastFamilyText.
void writeRefusal(const FamilyError& error);

template <class Work>
int outcomeOf(const Work& work) {
    try {
        work();
        return 0;
    } catch (const FamilyError& error) {
        writeRefusal(error);
        return kRefused;
    } catch (const std::exception&) {
        return kLacksMemory;
    }
}

}  // namespace olvane::js
