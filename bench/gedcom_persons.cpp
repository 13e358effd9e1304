// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How long it takes to lay out every person of a real GEDCOM file, and the slowest of them. The file is named
// by OLVANE_BENCH_GEDCOM, or is history/royal92.ged below the folder that OLVANE_GEDCOM_DIR names.

#include <benchmark/benchmark.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/gedcom/GedcomReader.h>

#include <cli/GedcomDataSource.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <iostream>
#include <memory>
#include <string>

namespace {

std::string gedcomPath() {
    if (const char* file = std::getenv("OLVANE_BENCH_GEDCOM")) return file;
    if (const char* folder = std::getenv("OLVANE_GEDCOM_DIR"))
        return std::string(folder) + "/history/royal92.ged";
    return std::string();
}

void everyPersonOfTheFile(benchmark::State& state, const std::string& path) {
    const olvane::gedcom::GedcomData data = olvane::gedcom::readGedcomFile(path);
    const auto source = std::make_shared<olvane::cli::GedcomDataSource>(data);
    double slowest = 0;
    double boxes = 0;
    for (auto _ : state) {
        slowest = 0;
        boxes = 0;
        for (std::size_t id = 1; id <= data.personCount(); ++id) {
            const auto start = std::chrono::steady_clock::now();
            const std::string text = FamilyViewLayout(std::to_string(id), source);
            const std::chrono::duration<double, std::milli> taken = std::chrono::steady_clock::now() - start;
            slowest = std::max(slowest, taken.count());
            boxes += static_cast<double>(std::count(text.begin(), text.end(), ';'));
        }
    }
    state.counters["persons"] = static_cast<double>(data.personCount());
    state.counters["boxes"] = boxes;
    state.counters["slowest_ms"] = slowest;
}

}  // namespace

int main(int argc, char** argv) {
    const std::string path = gedcomPath();
    if (path.empty()) {
        std::cerr << "bench_gedcom_persons: name a file in OLVANE_BENCH_GEDCOM\n";
        return 2;
    }
    benchmark::RegisterBenchmark("everyPersonOfTheFile", everyPersonOfTheFile, path)
        ->Unit(benchmark::kMillisecond);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
