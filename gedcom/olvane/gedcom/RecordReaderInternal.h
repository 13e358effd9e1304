// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/DetailReaderInternal.h>
#include <olvane/gedcom/GedcomData.h>
#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/TextInternerInternal.h>
#include <olvane/gedcom/XrefTableInternal.h>

namespace olvane::gedcom {

// Of a PEDI, in whatever case.
Pedigree pedigreeOf(std::string_view value);

// Fills the tables from the lines of a file, in one pass and without a tree of lines. What the tables have no place for
// goes to details, if there is one.
//
// Holds: until links are resolved, each id in parentLinks, coupleLinks, childLinks and a family's partners is
//        an XrefPlace. Spouses, children, fathers and mothers are not filled in here.
class RecordReader {
public:
    RecordReader(LineScanner& scanner, TextInterner& interner, GedcomTables& tables, XrefTable& xrefs,
                 DiagnosticList& diagnostics, bool keepsFacts, DetailReader* details)
        : scanner_(scanner),
          interner_(interner),
          tables_(tables),
          xrefs_(xrefs),
          diagnostics_(diagnostics),
          keepsFacts_(keepsFacts),
          details_(details) {}

    // False if there was no record that GEDCOM knows.
    bool readAll(void (*progress)(std::size_t done, std::size_t all) = nullptr);

private:
    enum class Record : std::uint8_t { other, person, family };

    // A piece of a name, which may come several times.
    struct PieceDraft {
        std::string_view first;
        std::string joined;  // empty while there is but one
    };

    // A NAME while its pieces come in.
    struct NameDraft {
        std::string_view written;
        PieceDraft prefix;
        PieceDraft given;
        PieceDraft surnamePrefix;
        PieceDraft surname;
        PieceDraft suffix;
        PieceDraft nickname;
        std::string_view type;
    };

    // A married name or another by which somebody is known, which stands in a line of its own.
    struct FurtherName {
        std::string_view value;
        std::string_view type;
    };

    // The HUSB, or the WIFE, of a family: the first two that point to anybody.
    struct PartnerDraft {
        struct Mention {
            XrefPlace place = 0;
            LineNumber line = 0;
        };
        std::array<Mention, 2> mentions{};
        std::size_t count = 0;
    };

    // RecordReader.cpp
    void readLine(const GedcomLine& line);
    void readFactLine(const GedcomLine& line, std::uint64_t tag);
    void readDetailLine(const GedcomLine& line, std::uint64_t tag);
    void beginRecord(const GedcomLine& line);
    void endRecord();
    void checkBeginning(const GedcomLine& line);
    void checkEnd(const GedcomLine& line, std::uint64_t tag);
    XrefTable::Entry* claimXref(const GedcomLine& line);
    XrefPlace readPointer(const GedcomLine& line);
    std::string_view pointedXref(const GedcomLine& line);

    // PersonRecords.cpp
    void beginPerson(const GedcomLine& line);
    void readPersonFact(const GedcomLine& line, std::uint64_t tag);
    bool passOverIfNot(const GedcomLine& line);
    void readPersonDetail(const GedcomLine& line, std::uint64_t tag);
    void endPerson();
    std::string_view givenNameOfPerson() const;

    // FamilyRecords.cpp
    void beginFamily(const GedcomLine& line);
    void readFamilyFact(const GedcomLine& line, std::uint64_t tag);
    void readFamilyDetail(const GedcomLine& line, std::uint64_t tag);
    void readChildTie(Pedigree tie);
    void addPartner(const GedcomLine& line, PartnerDraft& draft);
    void refusePartner(LineNumber line);
    void endFamily();
    void settlePartners();

    // RecordNames.cpp
    void beginName(const GedcomLine& line);
    void readNamePiece(const GedcomLine& line, std::uint64_t tag);
    void addFurtherName(const GedcomLine& line, std::string_view type);
    void addPiece(PieceDraft& piece, const GedcomLine& line, std::string_view separator);
    std::string_view storedPiece(const PieceDraft& piece);
    void endName();
    void addFurtherNames(std::string_view given);

    // RecordFacts.cpp
    void beginFact(const GedcomLine& line, std::uint64_t tag);
    void readFactDetail(const GedcomLine& line, std::uint64_t tag);
    Slice& factsInHand();
    void readDate(const GedcomLine& line, GedcomDate& date);
    void readDatePhrase(const GedcomLine& line);
    void beginDetails(const GedcomLine& line, std::uint64_t tag);
    void keepDetail(const GedcomLine& line, std::uint64_t tag);

    // Before 7.0, the value N negates the event.
    static bool didNotHappen(const GedcomLine& line) { return trimmed(line.value) == "N"; }
    std::string_view storedValue(const GedcomLine& line) {
        return interner_.keep(scanner_.wholeValue(line), line.number);
    }
    Person& person() { return tables_.persons.back(); }
    Family& family() { return tables_.families.back(); }

    LineScanner& scanner_;
    TextInterner& interner_;
    GedcomTables& tables_;
    XrefTable& xrefs_;
    DiagnosticList& diagnostics_;
    bool keepsFacts_;
    DetailReader* details_;  // null if no details are kept

    Record record_ = Record::other;
    std::uint64_t fact_ = 0;          // tag of the line on level 1 that the one in hand lies under
    GedcomDate* openDate_ = nullptr;  // a date without a value, which a phrase may still fill
    GedcomDate lastDate_;             // of the last line with a date of birth, death or marriage
    bool factOpen_ = false;           // the last of the facts lies above the line in hand
    bool valueFromType_ = false;
    NameDraft name_;
    bool nameOpen_ = false;
    std::vector<FurtherName> furtherNames_;  // behind the name in hand, or behind all names of the person
    bool sexRead_ = false;
    std::vector<XrefPlace> adoptiveFamilies_;  // that ADOP events of the person in hand name
    std::uint32_t tiesOfChild_ = 0;            // of the CHIL in hand: _FREL and _MREL so far
    PartnerDraft husbands_;
    PartnerDraft wives_;
    std::uint32_t marriages_ = 0;
    bool marriedLast_ = false;  // no DIV behind the last MARR
    bool anyLine_ = false;
    bool anyRecord_ = false;
    bool trailerSeen_ = false;
};

}  // namespace olvane::gedcom
