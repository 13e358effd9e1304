// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_memory: what one layout with its result text takes of the heap at its peak, and how often it asks for
// memory, for each displayed person, as a Markdown table. The data source is built before the count starts;
// the lists and texts that it hands over count.

#include <cstdio>

#include "CountedMemory.h"
#include "MadeLayout.h"

namespace {

void printRow(const bench::MadeLayout& layout) {
    bench::startCounting();
    const std::string text = layout.text();
    const bench::MemoryCount count = bench::memoryCount();
    const auto shown = static_cast<double>(bench::shownPersons(text));
    std::printf("| %s | %.0f | %zu | %.0f | %.1f | %.0f |\n", layout.name().c_str(), shown,
                count.peakBytes / 1024, static_cast<double>(count.peakBytes) / shown,
                static_cast<double>(count.allocations) / shown, static_cast<double>(text.size()) / shown);
}

}  // namespace

int main() {
    std::printf(
        "| family | persons shown | KiB at the peak | bytes a person | allocations a person | of the bytes: "
        "text |\n");
    std::printf("| --- | ---: | ---: | ---: | ---: | ---: |\n");
    for (const bench::LayoutName& name : bench::layoutsOfTheTables()) {
        printRow(bench::MadeLayout(name.shape, name.size));
    }
    return 0;
}
