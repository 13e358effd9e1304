// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <support/CaseFile.h>

namespace support {

// A GEDCOM file as a case, with its first person as the focus. Fails as the reader does.
CaseFile caseOfGedcom(const std::string& path);

}  // namespace support
