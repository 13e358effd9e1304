// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <stdexcept>
#include <string_view>

#include <olvane/picture/Picture.h>

namespace olvane::picture {

// A JSON text that is no picture of format 2; what() says why, for a user.
class PictureJsonError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Reads format 2, from any program. Fields that are not known are ignored; fields that are absent have the
// values of an empty Box, Family, Line or Mark. Only in native builds.
//
// Fails: PictureJsonError for text that is not JSON, another format, a value of the wrong type, a number that
//        is not finite, and a place in a list that does not exist.
Picture readPictureJson(std::string_view json);

}  // namespace olvane::picture
