// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/DataCheck.h>

namespace olvane::cli {

// The rules of the data check.
using DataFindingKind = kin::RemarkKind;
using kin::nameOf;

// Something in the data that will make a tree look odd, and the line that it comes from.
struct DataFinding {
    DataFindingKind kind = DataFindingKind::childNotListed;
    gedcom::LineNumber line = 0;
    std::vector<std::string>
        xrefs;         // of the persons and families concerned, without their @, as the text names them
    std::string text;  // names persons and families by their xrefs
};

// Everything odd in the data, in the order of the lines: links that one side alone states, persons in two
// families as a child, people who are their own ancestors, dates that cannot be.
std::vector<DataFinding> checkData(const gedcom::GedcomData& data);

// Whether checkData finds, with names, what the reader has reported by a diagnostic of this kind.
bool isFoundInData(gedcom::DiagnosticKind kind);

}  // namespace olvane::cli
