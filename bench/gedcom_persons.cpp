// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bench_gedcom_persons: how long it takes to lay out every person of a real GEDCOM file, the slowest of them, and
// how many take over three milliseconds. A person's time is the least of all rounds, since a round goes over
// everybody and a busy machine hits somebody in each; the time of the benchmark is that of a whole round. The
// file is named by OLVANE_BENCH_GEDCOM, or is history/royal92.ged below the folder that OLVANE_GEDCOM_DIR names.

#include <benchmark/benchmark.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/gedcom/GedcomReader.h>

#include <olvane/source/GedcomDataSource.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <iostream>
#include <limits>
#include <memory>
#include <string>
#include <vector>

namespace {

std::string gedcomPath() {
    if (const char* file = std::getenv("OLVANE_BENCH_GEDCOM")) return file;
    if (const char* folder = std::getenv("OLVANE_GEDCOM_DIR"))
        return std::string(folder) + "/history/royal92.ged";
    return std::string();
}

constexpr double kSlowMilliseconds = 3;

double millisecondsOf(std::size_t id, const std::shared_ptr<olvane::gedcom::GedcomDataSource>& source,
                      std::size_t& boxes) {
    const auto start = std::chrono::steady_clock::now();
    const std::string text = FamilyViewLayout(std::to_string(id), source);
    const std::chrono::duration<double, std::milli> taken = std::chrono::steady_clock::now() - start;
    boxes += static_cast<std::size_t>(std::count(text.begin(), text.end(), ';'));
    return taken.count();
}

void everyPersonOfTheFile(benchmark::State& state, const std::string& path) {
    const olvane::gedcom::GedcomData data = olvane::gedcom::readGedcomFile(path);
    const auto source = std::make_shared<olvane::gedcom::GedcomDataSource>(data);
    std::vector<double> least(data.personCount(), std::numeric_limits<double>::infinity());
    std::size_t boxes = 0;
    for (auto _ : state) {
        boxes = 0;
        for (std::size_t i = 0; i < least.size(); ++i) {
            least[i] = std::min(least[i], millisecondsOf(i + 1, source, boxes));
        }
    }
    const auto isSlow = [](double milliseconds) { return milliseconds > kSlowMilliseconds; };
    state.counters["persons"] = static_cast<double>(least.size());
    state.counters["boxes"] = static_cast<double>(boxes);
    state.counters["slowest_ms"] = least.empty() ? 0 : *std::max_element(least.begin(), least.end());
    state.counters["over_3_ms"] = static_cast<double>(std::count_if(least.begin(), least.end(), isSlow));
}

}  // namespace

int main(int argc, char** argv) {
    const std::string path = gedcomPath();
    if (path.empty()) {
        std::cerr << "bench_gedcom_persons: name a file in OLVANE_BENCH_GEDCOM\n";
        return 2;
    }
    benchmark::RegisterBenchmark("everyPersonOfTheFile", everyPersonOfTheFile, path)
        ->Iterations(7)
        ->Unit(benchmark::kMillisecond);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
