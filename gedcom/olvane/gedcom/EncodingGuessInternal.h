// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

#include <olvane/gedcom/EncodingTableInternal.h>
#include <olvane/gedcom/detail/DiagnosticSentence.h>

namespace olvane::gedcom {

// The encoding that text of one byte a character looks like where it does not look like Western European text in
// windows-1252; null where it does. A guess, from which letters stand side by side: Cyrillic, Greek and Hebrew words have
// no ASCII in them, and Polish letters are signs in windows-1252.
//
// Holds: no guess is made of fewer than two words.
const KnownEncoding* likelyEncoding(std::string_view bytes);

// Whether text may be Western European, in windows-1252: it looks like no other encoding, nor like one of which no guess can be
// made, as the Chinese ones and words in capitals alone.
bool looksWestern(std::string_view bytes);

// What to try for text in an encoding that is not certain: "it looks like windows-1251", or a choice.
DiagnosticPhrase encodingSuggestion(std::string_view bytes);

}  // namespace olvane::gedcom
