// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <random>

// Random choices from 0 to count - 1: the same ones from every standard library. Two in the arguments of one call have no
// order that all compilers share, so they are made before it.
class Chooser {
public:
    explicit Chooser(unsigned seed) : random_(seed) {}
    int operator()(int count) const { return static_cast<int>(random_() % static_cast<unsigned>(count)); }

private:
    mutable std::mt19937 random_;
};
