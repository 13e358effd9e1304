// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include <olvane/gedcom/EncodingTableInternal.h>

namespace olvane::gedcom {

// Text in Unicode by the platform's own tables: iconv, or the browser's TextDecoder. Bytes that are no character
// become U+FFFD. Nothing where the platform does not know the encoding.
std::optional<std::string> decodedByPlatform(const KnownEncoding& encoding, std::string_view bytes);

}  // namespace olvane::gedcom
