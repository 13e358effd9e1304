// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane.h>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

namespace olvane::js {

// The number with which such a host says that an answer found no memory; any other is what the data source threw.
constexpr int kLacksMemory = 2;

// A data source as a host of the C interface. It outlives what is returned.
olvane_host hostOfSource(OlvaneViewerManagerWrapProtocol& source);

}  // namespace olvane::js
