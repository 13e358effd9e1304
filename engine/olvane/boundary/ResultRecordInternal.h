// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <span>
#include <string>

#include <olvane/boundary/TypedLayout.h>
#include <olvane/boundary/ViewerGlue.h>

namespace olvane {

// Appends the record that resultWriter appends for the person of this key, from numbers that are whole already. Of the box
// its id, place and flag are read.
// Fails: as resultWriter.
void appendRecord(const ViewerGlue& glue, int key, const TypedLayout::Box& box,
                  std::span<const TypedLayout::Line> lines, std::string& text);

}  // namespace olvane
