// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// What a program that draws a GEDCOM file begins with: readGedcomFile, GedcomDataSource, kinGraphOf and GedcomLabels.

#include <olvane/gedcom/GedcomReader.h>      // IWYU pragma: export
#include <olvane/source/GedcomDataSource.h>  // IWYU pragma: export
#include <olvane/source/GedcomKin.h>         // IWYU pragma: export
#include <olvane/source/GedcomLabels.h>      // IWYU pragma: export
