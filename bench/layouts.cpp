// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How long one layout with its result text takes, and how that grows: descendants and kin of 30 to 10,000
// persons in the family view, and full pedigrees.

#include <benchmark/benchmark.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/LayoutPieces.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include <algorithm>
#include <memory>
#include <string>

#include "MadeFamily.h"

namespace {

using bench::MadeFamily;
using bench::MadeFamilySource;

// Add-nodes are boxes too, so a picture can hold more boxes than the family has persons.
void countBoxes(benchmark::State& state, const std::string& text) {
    const auto boxes = std::count(text.begin(), text.end(), ';');
    state.counters["boxes"] = static_cast<double>(boxes);
    state.SetComplexityN(boxes);
}

void layOutFamily(benchmark::State& state, MadeFamily family) {
    const auto source = std::make_shared<MadeFamilySource>(std::move(family));
    std::string text;
    for (auto _ : state) {
        text = FamilyViewLayout("1", source);
        benchmark::DoNotOptimize(text);
    }
    countBoxes(state, text);
}

void descendantsInTheFamilyView(benchmark::State& state) {
    layOutFamily(state, MadeFamily::descendants(static_cast<int>(state.range(0))));
}

void kinInTheFamilyView(benchmark::State& state) {
    layOutFamily(state, MadeFamily::kin(static_cast<int>(state.range(0))));
}

std::string pedigreeText(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source, int generations) {
    ViewerGlue glue;
    const olvane::HostCallbacks callbacks(glue, source);
    std::string text;
    olvane::resetAddParentId();
    olvane::guarded([&] {
        DataAdapter adapter = callbacks.dataAdapter();
        const int focusKey = glue.getKeyFromPerson("1");
        const int isMale = adapter.isMale(focusKey) ? 1 : 0;
        SharedTreeViewer::TreeViewPedigreeLayouter layouter(&adapter, focusKey, isMale,
                                                            SharedTreeViewer::OptionMap(),
                                                            olvane::familyTreeSize(), generations, 4);
        layouter.layoutForFocusNID();
        olvane::ResultBounds bounds;
        layouter.graphIterator(olvane::resultWriter(glue, bounds, text));
    });
    return text;
}

void ancestorsInThePedigreeView(benchmark::State& state) {
    const int generations = static_cast<int>(state.range(0));
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> source =
        std::make_shared<MadeFamilySource>(MadeFamily::ancestors(generations));
    std::string text;
    for (auto _ : state) {
        text = pedigreeText(source, generations + 1);
        benchmark::DoNotOptimize(text);
    }
    countBoxes(state, text);
}

}  // namespace

BENCHMARK(descendantsInTheFamilyView)
    ->Arg(30)
    ->Arg(100)
    ->Arg(1003)
    ->Arg(9998)
    ->Unit(benchmark::kMicrosecond)
    ->Complexity();
BENCHMARK(kinInTheFamilyView)
    ->Arg(30)
    ->Arg(100)
    ->Arg(1000)
    ->Arg(10000)
    ->Unit(benchmark::kMicrosecond)
    ->Complexity();
BENCHMARK(ancestorsInThePedigreeView)
    ->Arg(4)
    ->Arg(6)
    ->Arg(9)
    ->Arg(12)
    ->Unit(benchmark::kMicrosecond)
    ->Complexity();

BENCHMARK_MAIN();
