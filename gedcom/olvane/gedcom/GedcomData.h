// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomDiagnostic.h>
#include <olvane/gedcom/GedcomRecords.h>
#include <olvane/gedcom/detail/GedcomTables.h>

namespace olvane::gedcom {

// Everything that was read from one GEDCOM file. Every relative is found in constant time.
//
// Holds: moves, is never copied; views stay valid as long as the data lives, moved or not.
// Fails: an id outside 1 to the count throws std::out_of_range.
class GedcomData {
public:
    explicit GedcomData(GedcomTables tables);
    GedcomData(GedcomData&&) noexcept = default;
    GedcomData& operator=(GedcomData&&) noexcept = default;
    GedcomData(const GedcomData&) = delete;
    GedcomData& operator=(const GedcomData&) = delete;

    std::size_t personCount() const { return tables_.persons.size(); }
    std::size_t familyCount() const { return tables_.families.size(); }
    bool hasPerson(PersonId id) const { return id >= 1 && id <= personCount(); }

    const Person& person(PersonId id) const;
    const Family& family(FamilyId id) const;
    // persons()[0] is person 1.
    std::span<const Person> persons() const { return tables_.persons; }
    std::span<const Family> families() const { return tables_.families; }

    // All NAMEs in the order of the record; the first is the one to show.
    std::span<const PersonName> names(PersonId id) const;
    // The first name; one without text for a person without any.
    const PersonName& firstName(PersonId id) const;

    // Partners over all coupleLinks in order, each once; the first is the preferred one. Never the person themself.
    std::span<const PersonId> spouses(PersonId id) const;
    // Children over all coupleLinks in order, each once.
    std::span<const PersonId> children(PersonId id) const;
    // All FAMC in order; behind them the families that name the person as CHIL alone, in the order of the file.
    std::span<const FamilyLink> parentLinks(PersonId id) const;
    // All FAMS in order; behind them the families that name the person as partner alone, in the order of the file.
    std::span<const FamilyLink> coupleLinks(PersonId id) const;
    // All CHIL in order; behind them those who name the family by FAMC alone, in the order of the file.
    std::span<const ChildLink> childLinks(FamilyId id) const;

    // In the order of the record; empty unless the facts were asked for when the file was read.
    std::span<const Fact> factsOfPerson(PersonId id) const;
    std::span<const Fact> factsOfFamily(FamilyId id) const;

    // Every detail in the record of the person or family, those of facts and names among them; empty unless details
    // were asked for when the file was read.
    std::span<const DetailLine> detailsOfPerson(PersonId id) const;
    std::span<const DetailLine> detailsOfFamily(FamilyId id) const;
    // Of a fact or name of this data. Fails: std::out_of_range for any other.
    std::span<const DetailLine> detailsOfFact(const Fact& fact) const;
    std::span<const DetailLine> detailsOfName(const PersonName& name) const;
    std::span<const SharedRecord> sharedRecords() const { return tables_.sharedRecords; }
    std::span<const DetailLine> detailsOfShared(const SharedRecord& record) const;
    // Null if there is none. xref is without @.
    const SharedRecord* sharedByXref(std::string_view xref) const;

    // By xref, with or without @; 0 if there is none. Of several records of one xref the first is found.
    PersonId personByXref(std::string_view xref) const;
    FamilyId familyByXref(std::string_view xref) const;

    // What was wrong with the file, in the order of its lines.
    const std::vector<Diagnostic>& diagnostics() const { return tables_.diagnostics; }
    const std::string& file() const { return tables_.file; }
    // How the bytes were read: "UTF-8", "UTF-16LE", "UTF-16BE", "ANSEL", "ASCII", "windows-1252" and so on.
    const std::string& encoding() const { return tables_.encoding; }
    // GEDC.VERS as written: "5.5.1", "7.0"; empty if not given.
    const std::string& version() const { return tables_.version; }

private:
    GedcomTables tables_;
};

}  // namespace olvane::gedcom
