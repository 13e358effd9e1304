// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_layouts: how long one layout with its result text takes, and how that grows. Descendants and kin of 30
// to 10,000 persons in the family view and full pedigrees, one by one; then all three shapes up to some 100,000
// persons, fitted against n log n.

#include <benchmark/benchmark.h>

#include <cstddef>
#include <string>
#include <utility>

#include "FreedMemory.h"
#include "MadeLayout.h"

namespace {

void layOut(benchmark::State& state, const std::string& shape) {
    const bench::MadeLayout layout(shape, static_cast<int>(state.range(0)));
    std::string text;
    for (auto _ : state) {
        text = layout.text();
        benchmark::DoNotOptimize(text);
    }
    const std::size_t shown = bench::shownPersons(text);
    state.counters["shown"] = static_cast<double>(shown);
    state.SetComplexityN(static_cast<int>(shown));
}

void registerTimes() {
    for (const bench::LayoutName& name : bench::layoutsOfTheTables()) {
        benchmark::RegisterBenchmark((std::string("time/") + name.shape).c_str(), layOut, name.shape)
            ->Arg(name.size)
            ->Unit(benchmark::kMicrosecond);
    }
}

void registerGrowth() {
    for (const char* shape : {"desc", "ego"}) {
        auto* growth = benchmark::RegisterBenchmark((std::string("growth/") + shape).c_str(), layOut, shape);
        for (const int persons : {1000, 3000, 10000, 30000, 100000}) growth->Arg(persons);
        growth->Unit(benchmark::kMicrosecond)->Complexity(benchmark::oNLogN);
    }
    auto* growth = benchmark::RegisterBenchmark("growth/ped", layOut, "ped");
    for (const int generations : {9, 11, 12, 14, 16}) growth->Arg(generations);  // 2^(n + 1) - 1 persons
    growth->Unit(benchmark::kMicrosecond)->Complexity(benchmark::oNLogN);
}

}  // namespace

int main(int argc, char** argv) {
    bench::keepFreedMemory();
    registerTimes();
    registerGrowth();
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
