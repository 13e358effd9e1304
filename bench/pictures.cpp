// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a layout costs beyond its text: the typed result beside it, and the picture with its lines routed around all
// boxes. Prints a row for each made family: processor time, the least of many rounds, which other work on the machine
// spoils little.

#include <olvane/picture/LayoutPicture.h>

#include <algorithm>
#include <cstddef>
#include <cstdio>
#include <ctime>
#include <functional>
#include <limits>

#include "FreedMemory.h"
#include "MadeLayout.h"

namespace {

constexpr double kSecondsEach = 0.4;

double now() {
    return static_cast<double>(std::clock()) / CLOCKS_PER_SEC;
}

// Milliseconds of the quickest round.
double leastOf(const std::function<std::size_t()>& work) {
    double least = std::numeric_limits<double>::infinity();
    std::size_t kept = 0;
    const double end = now() + kSecondsEach;
    for (int round = 0; round < 5 || now() < end; ++round) {
        // Short work is done often enough for the clock.
        constexpr int kTimes = 20;
        const double start = now();
        for (int i = 0; i < kTimes; ++i) kept += work();
        least = std::min(least, (now() - start) * 1000 / kTimes);
    }
    return kept == 0 ? 0 : least;
}

void print(const bench::MadeLayout& made) {
    const olvane::TypedLayout layout = made.typed(false);
    const double text = leastOf([&] { return made.text().size(); });
    const double both = leastOf([&] { return made.typed(true).boxes.size(); });
    const double values = leastOf([&] { return made.typed(false).boxes.size(); });
    const double routed = leastOf([&] { return olvane::picture::pictureOf(layout).lines.size(); });
    std::printf("| %s | %zu | %.3f | %.3f | %.0f%% | %.3f | %.3f |\n", made.name().c_str(),
                layout.boxes.size(), text, both, 100 * (both / text - 1), values, routed);
    std::fflush(stdout);
}

}  // namespace

int main() {
    bench::keepFreedMemory();
    std::printf(
        "| family | boxes | text | text and typed | more | typed alone | picture, routed |\n"
        "| --- | ---: | ---: | ---: | ---: | ---: | ---: |\n");
    for (const auto& [shape, size] : bench::layoutsOfTheTables()) {
        if (size <= 1003) print(bench::MadeLayout(shape, size));
    }
}
