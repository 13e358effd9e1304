// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/DataCheck.h>

namespace olvane::gedcom {

// Something that a check has to report of a file, without words: what was wrong in it, or what is odd in its data.
//
// Lifetime: refers to the data.
struct FileRemark {
    std::variant<const Diagnostic*, kin::Remark> about;
    LineNumber line = 0;              // 0 for the file as a whole
    std::vector<std::string> xrefs;   // of the records concerned, without their @, as the text names them
    std::vector<PersonId> persons{};  // those concerned, in the same order

    // "levelJump", "diedBeforeBirth" and so on, for programs.
    std::string_view kind() const;
    // "note", "warning" and "error" of what was read, "odd" of what the data say.
    std::string_view severity() const;
};

// What in the data will make a tree look odd, in the order of the lines: links that one side alone records, persons in
// two families as a child, people who are their own ancestors, dates that cannot be.
std::vector<FileRemark> checkData(const GedcomData& data);

// First what was wrong in the file, then what is odd in its data, each in the order of the lines. What the reader has
// reported of links is among the latter, with names.
std::vector<FileRemark> remarksOf(const GedcomData& data);

using PersonNamer = std::function<std::string(const GedcomData&, PersonId)>;

// "@I1@ Odd One died before being born": persons and families by their xrefs, persons also by name.
std::string remarkText(const GedcomData& data, const FileRemark& remark, kin::Language language,
                       const PersonNamer& nameOf);

// With whole names.
std::string remarkText(const GedcomData& data, const FileRemark& remark, kin::Language language);

}  // namespace olvane::gedcom
