// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include <support/CaseFile.h>

namespace unit {

struct DisturbedRequest {
    std::string name;  // of the golden case, with its folder
    support::CaseFile input;
};

// Golden cases of both views, for the tests that let a request fail at each of its calls or allocations in turn.
// Undisturbed, each gives a whole text.
std::vector<DisturbedRequest> disturbedRequests();

// The case again, with its n-th call of all failing, counted from 0. Calls are those of the unhurt request, each
// "<operation> <arguments>".
support::CaseFile failingAt(const support::CaseFile& input, const std::vector<std::string>& calls,
                            std::size_t n);

}  // namespace unit
