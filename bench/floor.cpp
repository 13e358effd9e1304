// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_floor: how far a layout is from the least that it could cost: asking the host the same questions and
// writing the same text with nothing in between. Both are timed in turn, so that a busy moment hits both. The
// time of a benchmark is the layout's; floor_us is the floor's, and ratio says how many floors a layout costs.

#include <benchmark/benchmark.h>

#include <algorithm>
#include <chrono>
#include <string>
#include <vector>

#include "Floor.h"
#include "FreedMemory.h"
#include "MadeLayout.h"

namespace {

template <class Work>
double secondsOf(const Work& work) {
    const auto start = std::chrono::steady_clock::now();
    const std::string text = work();
    benchmark::DoNotOptimize(text);
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

double median(std::vector<double> values) {
    const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
    std::nth_element(values.begin(), middle, values.end());
    return *middle;
}

void layOutAndFloor(benchmark::State& state, const std::string& shape) {
    const bench::MadeLayout layout(shape, static_cast<int>(state.range(0)));
    const bench::Floor floor(layout);
    std::vector<double> layouts;
    std::vector<double> floors;
    for (auto _ : state) {
        layouts.push_back(secondsOf([&layout] { return layout.text(); }));
        floors.push_back(secondsOf([&floor] { return floor.text(); }));
        benchmark::DoNotOptimize(floor.answers());
        state.SetIterationTime(layouts.back());
    }
    state.counters["questions"] = static_cast<double>(floor.questions().size());
    state.counters["layout_us"] = 1e6 * median(layouts);
    state.counters["floor_us"] = 1e6 * median(floors);
    state.counters["ratio"] = median(layouts) / median(floors);
}

}  // namespace

int main(int argc, char** argv) {
    bench::keepFreedMemory();
    for (const bench::LayoutName& name : bench::layoutsOfTheTables()) {
        benchmark::RegisterBenchmark((std::string("floor/") + name.shape).c_str(), layOutAndFloor, name.shape)
            ->Arg(name.size)
            ->UseManualTime()
            ->Unit(benchmark::kMicrosecond);
    }
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
