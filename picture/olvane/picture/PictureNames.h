// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

#include <olvane/picture/Picture.h>

namespace olvane::picture {

// The names of values in JSON and in messages: "birth", "married", "bar", ...
std::string_view nameOf(kin::Sex sex);
std::string_view nameOf(kin::ChildKind kind);
std::string_view nameOf(kin::UnionState state);
std::string_view nameOf(BoxKind kind);
std::string_view nameOf(LineRole role);
std::string_view nameOf(MarkKind kind);
std::string_view nameOf(WayKind kind);
std::string_view nameOf(Branch branch);
std::string_view nameOf(Side side);

}  // namespace olvane::picture
