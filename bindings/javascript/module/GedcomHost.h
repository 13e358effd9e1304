// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane.h>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

namespace olvane::js {

// A data source as a host of the C interface. It outlives what is returned.
olvane_host hostOfSource(OlvaneViewerManagerWrapProtocol& source);

}  // namespace olvane::js
