// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/boundary/ViewerGlue.h>
#include <olvane/layouter/TreeViewLayouter.h>

namespace support {

// The finished graph of a layouter, line by line: for each person one P line, then its S, L, E with C, and G
// lines. Persons are named by key, floats by the eight hex digits of their bits.
std::vector<std::string> graphLines(SharedTreeViewer::TreeViewLayouter& layouter, const ViewerGlue& glue);

}  // namespace support
