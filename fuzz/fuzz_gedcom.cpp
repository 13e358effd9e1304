// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Any bytes as a GEDCOM file. Whatever they are, they are either refused with a GedcomError or give data
// that keeps every promise of its headers: relatives within the counts, texts valid, dates that sort.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomDate.h>
#include <olvane/gedcom/GedcomDiagnostic.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/gedcom/PersonSearch.h>

#include "Holds.h"

namespace {

using namespace olvane::gedcom;

// Persons whose names are searched for: each search looks at all, and a file of 64 KiB has thousands.
constexpr std::size_t kSearchedPersons = 8;
constexpr std::size_t kSortTextBytes = 12;

std::size_t bytesOfCharacter(unsigned char lead) {
    if (lead < 0x80) return 1;
    if (lead >= 0xC2 && lead < 0xE0) return 2;
    if (lead >= 0xE0 && lead < 0xF0) return 3;
    return lead >= 0xF0 && lead < 0xF5 ? 4 : 0;
}

// Neither longer than need be, nor half of a surrogate pair, nor beyond the last character.
bool secondByteFits(unsigned char lead, unsigned char second) {
    if (lead == 0xE0) return second >= 0xA0;
    if (lead == 0xED) return second < 0xA0;
    if (lead == 0xF0) return second >= 0x90;
    return lead != 0xF4 || second < 0x90;
}

bool isUtf8(std::string_view text) {
    for (std::size_t at = 0; at < text.size();) {
        const unsigned char lead = static_cast<unsigned char>(text[at]);
        const std::size_t length = bytesOfCharacter(lead);
        if (length == 0 || text.size() - at < length) return false;
        for (std::size_t i = 1; i < length; ++i) {
            if ((static_cast<unsigned char>(text[at + i]) & 0xC0) != 0x80) return false;
        }
        if (length > 1 && !secondByteFits(lead, static_cast<unsigned char>(text[at + 1]))) return false;
        at += length;
    }
    return true;
}

bool isOneLine(std::string_view text) {
    return text.find_first_of("\r\n") == std::string_view::npos;
}

bool hasNoControls(std::string_view text) {
    return std::none_of(text.begin(), text.end(),
                        [](char c) { return static_cast<unsigned char>(c) < 0x20; });
}

void lookAtName(const PersonName& name) {
    for (const std::string_view piece :
         {name.written, name.prefix, name.given, name.surname, name.suffix, name.nickname}) {
        HOLDS(isUtf8(piece) && hasNoControls(piece));
        HOLDS(piece.empty() || (piece.front() != ' ' && piece.back() != ' '));
    }
    HOLDS(isUtf8(displayName(name)));
}

void lookAtDate(const GedcomDate& date) {
    HOLDS(date.month <= 12 && date.day <= 31);
    HOLDS(sortText(date).size() <= kSortTextBytes);
    HOLDS(date.isRead() || sortText(date).empty());
    HOLDS(date.isRead() || displayYear(date) == date.written);
    const GedcomDate again = parseGedcomDate(date.written);
    HOLDS(again.year == date.year && again.month == date.month && again.day == date.day);
}

void lookAtRelatives(const GedcomData& data, PersonId id) {
    const Person& person = data.person(id);
    HOLDS(person.father == 0 || data.hasPerson(person.father));
    HOLDS(person.mother == 0 || data.hasPerson(person.mother));
    for (const PersonId spouse : data.spouses(id)) HOLDS(data.hasPerson(spouse) && spouse != id);
    for (const PersonId child : data.children(id)) HOLDS(data.hasPerson(child));
    for (const FamilyLink& link : data.parentLinks(id)) HOLDS(link.family <= data.familyCount());
    for (const FamilyLink& link : data.coupleLinks(id)) HOLDS(link.family <= data.familyCount());
}

void lookAtPerson(const GedcomData& data, PersonId id) {
    const Person& person = data.person(id);
    for (const PersonName& name : data.names(id)) lookAtName(name);
    lookAtName(data.firstName(id));
    lookAtDate(person.birth);
    lookAtDate(person.death);
    lookAtRelatives(data, id);
    HOLDS(isUtf8(person.xref));
    // An identifier with an @ in it cannot be told from one that was given with its own.
    const bool canBeAskedFor = !person.xref.empty() && person.xref.find('@') == std::string_view::npos;
    if (canBeAskedFor) HOLDS(data.personByXref(person.xref) != 0);
}

void lookAtFamily(const GedcomData& data, FamilyId id) {
    const Family& family = data.family(id);
    lookAtDate(family.marriage);
    HOLDS(family.husband == 0 || data.hasPerson(family.husband));
    HOLDS(family.wife == 0 || data.hasPerson(family.wife));
    for (const ChildLink& link : data.childLinks(id)) HOLDS(link.child == 0 || data.hasPerson(link.child));
    data.familyByXref(family.xref);
}

void search(const GedcomData& data, std::string_view text) {
    const std::vector<PersonId> all = findPersons(data, text);
    HOLDS(all.size() <= data.personCount());
    for (const PersonId id : all) HOLDS(data.hasPerson(id));
    HOLDS(findPersons(data, text, 1).size() == std::min<std::size_t>(all.size(), 1));
}

void searchForNames(const GedcomData& data) {
    search(data, "anna b");
    search(data, "");
    const std::size_t searched = std::min(data.personCount(), kSearchedPersons);
    for (PersonId id = 1; id <= searched; ++id) search(data, displayName(data.firstName(id)));
}

void lookAtDiagnostics(const GedcomData& data) {
    for (const Diagnostic& diagnostic : data.diagnostics()) {
        const std::string line = formatDiagnostic(diagnostic);
        HOLDS(isUtf8(line) && isOneLine(line));
    }
}

void lookAtAll(const GedcomData& data) {
    for (PersonId id = 1; id <= data.personCount(); ++id) lookAtPerson(data, id);
    for (FamilyId id = 1; id <= data.familyCount(); ++id) lookAtFamily(data, id);
    searchForNames(data);
    lookAtDiagnostics(data);
}

void readAsDate(std::string_view bytes) {
    const GedcomDate date = parseGedcomDate(bytes);
    HOLDS(sortText(date).size() <= kSortTextBytes);
    displayYear(date);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size) {
    const std::string text(reinterpret_cast<const char*>(bytes), size);
    readAsDate(text);
    try {
        lookAtAll(readGedcomBytes(text, "f"));
    } catch (const GedcomError& error) {
        HOLDS(isOneLine(error.what()));
    }
    return 0;
}
