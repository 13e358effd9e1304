// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/PictureNames.h>

#include <array>
#include <cstddef>

namespace olvane::picture {

namespace {

// The names stand in the order of the values.
template <class Value, std::size_t count>
std::string_view nameIn(const std::array<std::string_view, count>& names, Value value) {
    const auto i = static_cast<std::size_t>(value);
    return i < count ? names[i] : names[count - 1];
}

}  // namespace

std::string_view nameOf(kin::Sex sex) {
    return nameIn(std::to_array<std::string_view>({"male", "female", "unknown"}), sex);
}

std::string_view nameOf(kin::ChildKind kind) {
    return nameIn(
        std::to_array<std::string_view>({"birth", "adopted", "foster", "step", "sealing", "unknown"}), kind);
}

std::string_view nameOf(kin::UnionState state) {
    return nameIn(std::to_array<std::string_view>({"married", "divorced", "unmarried", "unknown"}), state);
}

std::string_view nameOf(BoxKind kind) {
    return nameIn(std::to_array<std::string_view>({"person", "unknownParent"}), kind);
}

std::string_view nameOf(LineRole role) {
    return nameIn(std::to_array<std::string_view>({"marriage", "drop", "bar", "stem", "link"}), role);
}

std::string_view nameOf(MarkKind kind) {
    return nameIn(std::to_array<std::string_view>({"samePerson", "parentsElsewhere", "partnersElsewhere"}),
                  kind);
}

std::string_view nameOf(WayKind kind) {
    return nameIn(std::to_array<std::string_view>({"blood", "legal", "marriage"}), kind);
}

std::string_view nameOf(Branch branch) {
    return nameIn(std::to_array<std::string_view>({"up", "down", "beside"}), branch);
}

std::string_view nameOf(Side side) {
    return nameIn(std::to_array<std::string_view>({"top", "right", "bottom", "left"}), side);
}

}  // namespace olvane::picture
