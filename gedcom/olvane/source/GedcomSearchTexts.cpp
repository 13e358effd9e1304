// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/source/GedcomSearchTexts.h>

#include <span>
#include <string>
#include <string_view>

#include <olvane/kin/Folding.h>

namespace olvane::gedcom {

namespace {

using kin::FoundIn;
using kin::SearchTexts;

// A search looks no further into a text: a name in a file may be of any length.
constexpr std::size_t kMostSearchedBytes = 100000;

void visitDate(const GedcomDate& date, FoundIn in, std::string_view label,
               const SearchTexts::Visitor& visitor) {
    if (!date.isGiven()) return;
    const std::string sorting = sortText(date);
    visitor({in, date.written, label, true, sorting});
}

FoundIn placeOfDate(std::string_view tag) {
    if (tag == "BIRT") return FoundIn::birth;
    return tag == "DEAT" ? FoundIn::death : FoundIn::other;
}

void visitFacts(std::span<const Fact> facts, const SearchTexts::Visitor& visitor) {
    for (const Fact& fact : facts) {
        const FoundIn in = fact.tag == "TITL" ? FoundIn::title : FoundIn::other;
        if (!fact.value.empty()) visitor({in, fact.value, fact.tag, false, {}});
        if (!fact.place.empty()) visitor({FoundIn::place, fact.place, fact.tag, false, {}});
        visitDate(fact.date, placeOfDate(fact.tag), fact.tag, visitor);
    }
}

}  // namespace

void GedcomSearchTexts::visit(std::size_t place, const Visitor& wholeVisitor) const {
    const auto id = static_cast<PersonId>(place + 1);
    const Visitor visitor = [&wholeVisitor](const kin::SearchText& text) {
        kin::SearchText beginning = text;
        beginning.text = text.text.substr(0, kMostSearchedBytes);
        wholeVisitor(beginning);
    };
    const Person& person = data_.person(id);
    visitor({FoundIn::identifier, person.xref, {}, false, {}});
    visitNames(id, visitor);
    visitDate(person.birth, FoundIn::birth, "BIRT", visitor);
    visitDate(person.death, FoundIn::death, "DEAT", visitor);
    visitFacts(data_.factsOfPerson(id), visitor);
    for (const FamilyLink& link : data_.coupleLinks(id)) {
        if (link.family != 0) visitFacts(data_.factsOfFamily(link.family), visitor);
    }
}

// Of a name by marriage the surname alone is a married name; the rest is the person's own.
void GedcomSearchTexts::visitNames(PersonId id, const Visitor& visitor) const {
    for (const PersonName& name : data_.names(id)) {
        const auto visitPart = [&visitor](FoundIn in, std::string_view text) {
            if (!text.empty()) visitor({in, text, {}, false, {}});
        };
        if (kin::foldedForSearch(name.type) == "married") {
            visitPart(FoundIn::name, name.given);
            visitPart(FoundIn::marriedName,
                      name.surname.empty() ? displayName(name, kMostSearchedBytes) : name.surname);
        } else {
            visitor({FoundIn::name, displayName(name, kMostSearchedBytes), {}, false, {}});
            visitPart(FoundIn::name, name.given);
            visitPart(FoundIn::name, name.surname);
        }
        visitPart(FoundIn::title, name.prefix);
        visitPart(FoundIn::title, name.suffix);
        visitPart(FoundIn::nickname, name.nickname);
    }
    visitMarriedNames(id, visitor);
}

void GedcomSearchTexts::visitMarriedNames(PersonId id, const Visitor& visitor) const {
    if (data_.person(id).sex != Sex::female) return;
    for (const PersonId spouse : data_.spouses(id)) {
        const std::string_view surname = data_.firstName(spouse).surname;
        if (data_.person(spouse).sex != Sex::female && !surname.empty())
            visitor({FoundIn::marriedName, surname, {}, false, {}});
    }
}

}  // namespace olvane::gedcom
