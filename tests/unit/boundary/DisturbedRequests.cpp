// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A handful of golden cases that together take most paths through both layouters: step-children, cousins, unknown
// parents, loops, many wives, the bare adapter. All have the sizes and options that every binding starts with.

#include <unit/boundary/DisturbedRequests.h>

#include <cstdint>

namespace unit {

namespace {

const char* const kCases[] = {
    "family/children-of-two-wives",
    "family/cousins-of-the-father",
    "family/great-grandparents",
    "family/half-brother-of-a-second-marriage",
    "family/own-ancestor",
    "family/son-with-family",
    "pedigree/a-child-with-each-wife",
    "pedigree/five-generations-of-mothers",
    "pedigree/own-ancestor",
    "pedigree/six-wives",
    "pedigree/unknown-children-of-a-man",
};

}  // namespace

std::vector<DisturbedRequest> disturbedRequests() {
    std::vector<DisturbedRequest> requests;
    for (const std::string name : kCases) {
        requests.push_back({name, support::readCase(OLVANE_GOLDEN_FOLDER "/" + name + ".case")});
    }
    return requests;
}

support::CaseFile failingAt(const support::CaseFile& input, const std::vector<std::string>& calls,
                            std::size_t n) {
    const auto operationOf = [&](std::size_t i) { return calls[i].substr(0, calls[i].find(' ')); };
    std::int64_t count = 0;
    for (std::size_t i = 0; i <= n; ++i) count += operationOf(i) == operationOf(n) ? 1 : 0;
    support::CaseFile failing = input;
    for (std::size_t i = 0; i < support::kHostOperationCount; ++i) {
        const auto operation = static_cast<support::HostOperation>(i);
        if (support::operationName(operation) == operationOf(n)) failing.failures[operation] = {count};
    }
    return failing;
}

}  // namespace unit
