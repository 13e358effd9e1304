// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <string>

namespace olvane::cli {

// A photograph, JPEG, PNG, GIF, TIFF, BMP or WebP, as a JPEG whose longer side has at most longestSide pixels, turned as its
// camera was held, on white where it was transparent. Nothing else of the file is in it: no place, time or name.
//
// Holds: a picture of more than 200 million pixels is not unpacked.
// Fails: nothing for bytes that are no such picture. Throws UsageError where the library for it is not installed.
std::optional<std::string> scaledPhoto(const std::string& bytes, int longestSide);

}  // namespace olvane::cli
