// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace olvane::gedcom {

// The name of the archive's member that the FILE of a medium stands for: its path with percent signs decoded. Nothing for
// what lies elsewhere: an address with a scheme, an absolute path, a path with "..", a backslash or a zero byte.
std::optional<std::string> memberOfArchive(std::string_view file);

// The bytes of a media file in a .gdz archive, whose bytes are given. Nothing is fetched or looked for outside.
//
// Holds: nothing for a file that is not in the archive, or that unpacks to more than `most` bytes: no more are
//        unpacked.
// Fails: GedcomError, in the name of the archive, for bytes that are no archive and for a damaged member. Without libzip
//        nothing is found.
std::optional<std::string> readFromArchive(const std::string& archive, const std::string& archiveName,
                                           std::string_view file, std::size_t mostBytes);

}  // namespace olvane::gedcom
