// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Prints the order problems of small random families, one as JSON on each line, for bench/peers/exact.mjs to solve exactly:
// nodes with their rows and how many ends they have room for, strands with their ends, and how many pairs of strands
// cross in the order that the chart of everybody finds.
//
//   everybody_order_problems COUNT

#include <olvane/charts/EverybodyChainsInternal.h>
#include <olvane/charts/EverybodyComponentInternal.h>
#include <olvane/charts/EverybodyLevelsInternal.h>
#include <olvane/charts/EverybodyMarksInternal.h>
#include <olvane/charts/EverybodyOrderInternal.h>
#include <olvane/charts/EverybodyRowsInternal.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <span>

#include <RandomKin.h>

namespace {

using olvane::charts::Rows;

void printEnds(const char* name, std::span<const Rows::End> ends) {
    std::printf("\"%s\":[", name);
    const char* comma = "";
    for (const Rows::End& end : ends) {
        std::printf("%s[%d,%d]", comma, end.node, end.sub);
        comma = ",";
    }
    std::printf("]");
}

void printProblem(const Rows& rows, std::int64_t crossings) {
    std::printf("{\"crossings\":%lld,\"nodes\":[", static_cast<long long>(crossings));
    for (std::int32_t node = 0; node < rows.nodeCount(); ++node) {
        const auto place = static_cast<std::size_t>(node);
        std::printf("%s[%d,%d]", node > 0 ? "," : "", rows.row[place], rows.size[place]);
    }
    std::printf("],\"strands\":[");
    const char* comma = "";
    for (const Rows::Strand& strand : rows.strands) {
        std::printf("%s{\"gap\":%d,", comma, strand.gap);
        printEnds("above", rows.endsAbove(strand));
        std::printf(",");
        printEnds("below", rows.endsBelow(strand));
        std::printf("}");
        comma = ",";
    }
    std::printf("]}\n");
}

void printFamily(std::uint64_t seed) {
    using namespace olvane::charts;
    constexpr std::int64_t kEffort = 60'000'000;
    constexpr int kStarts = 4;  // as layouts of so few persons have
    const auto graph = olvane::test::soundKin(seed, 10 + static_cast<int>(seed % 31));
    const Component part = componentsOf(graph).front();
    const Chains chains = weldCouples(part);
    const MarkedLinks marked =
        marksForWantOfRoom(part, chains, olvane::charts::LineRoom(part.persons.size()));
    const Rows rows = makeRows(part, chains, chooseRows(part, chains, kEffort), marked);
    printProblem(rows, countCrossings(rows, findOrder(rows, kEffort, kStarts)));
}

}  // namespace

int main(int argc, char** argv) {
    const int count = argc > 1 ? std::atoi(argv[1]) : 500;
    for (int seed = 0; seed < count; ++seed) printFamily(static_cast<std::uint64_t>(seed));
    return 0;
}
