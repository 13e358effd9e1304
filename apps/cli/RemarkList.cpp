// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One list of what reading and looking at the data bring up.

#include <cli/RemarkList.h>

#include <olvane/source/GedcomCheck.h>

#include <cli/FocusChoice.h>
#include <cli/JoinedTexts.h>
#include <cli/TableCells.h>

namespace olvane::cli {

namespace {

std::string lineText(const Remark& remark) {
    return remark.line == 0 ? std::string() : std::to_string(remark.line);
}

}  // namespace

std::vector<Remark> remarksOf(const gedcom::GedcomData& data, kin::Language language) {
    std::vector<Remark> remarks;
    for (const gedcom::FileRemark& remark : gedcom::remarksOf(data)) {
        remarks.push_back({std::string(remark.kind()), std::string(remark.severity()), remark.line,
                           remark.xrefs, gedcom::remarkText(data, remark, language, readableName)});
    }
    return remarks;
}

std::string remarksText(const gedcom::GedcomData& data, const std::vector<Remark>& remarks) {
    std::string text;
    for (const Remark& remark : remarks) {
        text += data.file() + ":" + (remark.line == 0 ? "" : lineText(remark) + ":") + " " + remark.severity +
                ": " + remark.text + "\n";
    }
    return text;
}

std::string remarksTable(const gedcom::GedcomData& data, const std::vector<Remark>& remarks) {
    std::string text = "kind\tseverity\tfile\tline\txrefs\ttext\n";
    for (const Remark& remark : remarks) {
        text += tableLine({remark.kind, remark.severity, data.file(), lineText(remark),
                           joined(remark.xrefs, " "), remark.text});
    }
    return text;
}

}  // namespace olvane::cli
