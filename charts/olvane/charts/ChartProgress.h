// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>

namespace olvane::charts {

// The steps of a chart of everybody, in their order.
enum class ChartStep : std::uint8_t { rows, order, places, lines };

// How far a chart is: which step, and which share of it is done, from 0 to 1. Called at the start of each step and
// during the order, on the thread that makes the chart. Each part of a family goes through the steps, and so does each
// way to fold a generation for paper; parts that take hardly any time are not reported.
//
// Holds: the chart does not depend on it.
// Fails: what it throws ends the chart and is passed on, so that a chart can be given up.
using ChartProgress = std::function<void(ChartStep step, double share)>;

}  // namespace olvane::charts
