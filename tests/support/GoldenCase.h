// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace support {

// A golden case is a case file whose "#=" lines hold the expected result text, a record a line so that people
// can read it. Spaces do not count there.

// The whole of a file. Fails with std::runtime_error.
std::string readWhole(const std::string& path);

bool hasExpectedText(const std::string& caseText);

// The expected text of a golden case; empty where its lines say so.
std::string expectedText(const std::string& caseText);

// The same case with the expected lines replaced, or put behind the leading comment where it had none.
std::string withExpectedText(const std::string& caseText, const std::string& text);

}  // namespace support
