// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomDiagnostic.h>
#include <olvane/gedcom/GedcomRecords.h>

namespace olvane::gedcom {

class XrefTable;

// The lists behind the records, as the reader fills them.
struct GedcomTables {
    // Owner of the text that every view looks into; never moves.
    std::shared_ptr<const void> text;
    std::vector<Person> persons;
    std::vector<Family> families;
    std::vector<PersonName> names;
    std::vector<FamilyLink> parentLinks;
    std::vector<FamilyLink> coupleLinks;
    std::vector<ChildLink> childLinks;
    std::vector<PersonId> spouses;
    std::vector<PersonId> children;
    // Empty, all three, unless facts were asked for; else a slice for each person and each family.
    std::vector<Fact> facts;
    std::vector<Slice> factsOfPersons;
    std::vector<Slice> factsOfFamilies;
    // Empty, all of them, unless details were asked for; else a slice for each person, family, fact and name.
    std::vector<DetailLine> details;
    std::vector<Slice> detailsOfPersons;
    std::vector<Slice> detailsOfFamilies;
    std::vector<Slice> detailsOfFacts;
    std::vector<Slice> detailsOfNames;
    std::vector<SharedRecord> sharedRecords;
    std::map<std::string_view, std::uint32_t> sharedByXref;  // places in sharedRecords
    // Which records the identifiers stand for.
    std::shared_ptr<const XrefTable> xrefs;
    std::vector<Diagnostic> diagnostics;
    std::string file;
    std::string encoding;
    std::string version;
};

}  // namespace olvane::gedcom
