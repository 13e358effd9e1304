// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Access to what was read: slices of shared lists, and names as people write them.

#include <olvane/gedcom/GedcomData.h>

#include <algorithm>
#include <array>
#include <functional>
#include <limits>
#include <stdexcept>
#include <utility>

#include <olvane/gedcom/UnicodeTextInternal.h>
#include <olvane/gedcom/XrefTableInternal.h>

namespace olvane::gedcom {
namespace {

template <typename Item>
std::span<const Item> part(const std::vector<Item>& list, Slice slice) {
    return std::span(list).subspan(slice.first, slice.count);
}

// Whether text begins with a character of a script that is written without spaces. UTF-8 leads from E2 BA on
// are CJK radicals, kana, Han and Hangul up to ED; EF A4 to EF AB the compatibility forms; F0 A0 and on the
// further planes.
bool beginsUnspaced(std::string_view text) {
    if (text.size() < 3) return false;
    const auto first = static_cast<unsigned char>(text[0]);
    const auto second = static_cast<unsigned char>(text[1]);
    if (first == 0xE2) return second >= 0xBA;
    if (first >= 0xE3 && first <= 0xED) return true;
    if (first == 0xEF) return second >= 0xA4 && second <= 0xAB;
    return first == 0xF0 && second >= 0xA0;
}

bool endsUnspaced(std::string_view text) {
    std::size_t start = text.size();
    while (start > 0 && (static_cast<unsigned char>(text[start - 1]) & 0xC0) == 0x80) --start;
    return start > 0 && beginsUnspaced(text.substr(start - 1));
}

constexpr std::size_t kPartBytes = 64 * 1024;

bool isSeparator(char c) {
    return c == ' ' || c == '/';
}

// The characters at the start of a text up to a space or slash, or as many as make a handy part.
std::string_view partOf(std::string_view text) {
    std::size_t end = 0;
    while (end < text.size() && end < kPartBytes && !isSeparator(text[end])) ++end;
    while (end < text.size() && end > 1 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80) --end;
    return text.substr(0, end);
}

// Visits the parts of the value with a space for each slash, but none between characters that are written without, and
// no two in a row; until the visitor returns false. Returns whether there was any.
template <typename Visitor>
bool forEachPartWithoutSlashes(std::string_view written, const Visitor& visit) {
    std::string_view previous;
    while (!written.empty()) {
        bool space = false;
        bool slash = false;
        for (; !written.empty() && isSeparator(written.front()); written.remove_prefix(1)) {
            (written.front() == ' ' ? space : slash) = true;
        }
        if (written.empty()) break;
        const bool parted = space || (slash && !(endsUnspaced(previous) && beginsUnspaced(written)));
        if (parted && !previous.empty() && !visit(" ")) return true;
        previous = partOf(written);
        if (!visit(previous)) return true;
        written.remove_prefix(previous.size());
    }
    return !previous.empty();
}

// The same of the name as displayName has it; a piece of the record is a part as it is.
template <typename Visitor>
void forEachPart(const PersonName& name, const Visitor& visit) {
    if (forEachPartWithoutSlashes(name.written, visit)) return;
    bool isAny = false;
    for (const std::string_view piece : {name.prefix, name.given, name.surname, name.suffix}) {
        if (piece.empty()) continue;
        if ((isAny && !visit(" ")) || !visit(piece)) return;
        isAny = true;
    }
    if (!isAny) visit(name.nickname);
}

// A piece that was cut may end within a character.
std::string cutToBytes(std::string text, std::size_t mostBytes) {
    if (text.size() > mostBytes) text.resize(mostBytes);
    std::size_t start = text.size();
    while (start > 0 && (static_cast<unsigned char>(text[start - 1]) & 0xC0) == 0x80) --start;
    if (start > 0 && static_cast<unsigned char>(text[start - 1]) >= 0xC0 &&
        utf8CharacterLength(std::string_view(text).substr(start - 1)) == 0) {
        text.resize(start - 1);
    }
    return text;
}

}  // namespace

std::string displayName(const PersonName& name) {
    return displayName(name, std::numeric_limits<std::size_t>::max());
}

std::string displayName(const PersonName& name, std::size_t mostBytes) {
    std::string text;
    forEachPart(name, [&](std::string_view part) {
        text += part.substr(0, mostBytes);
        return text.size() <= mostBytes;
    });
    return cutToBytes(std::move(text), mostBytes);
}

void writeDisplayName(const PersonName& name, const std::function<void(std::string_view)>& write) {
    forEachPart(name, [&](std::string_view part) {
        write(part);
        return true;
    });
}

GedcomData::GedcomData(GedcomTables tables) : tables_(std::move(tables)) {}

const Person& GedcomData::person(PersonId id) const {
    if (!hasPerson(id)) throw std::out_of_range("no person " + std::to_string(id));
    return tables_.persons[id - 1];
}

const Family& GedcomData::family(FamilyId id) const {
    if (id < 1 || id > familyCount()) throw std::out_of_range("no family " + std::to_string(id));
    return tables_.families[id - 1];
}

std::span<const PersonName> GedcomData::names(PersonId id) const {
    return part(tables_.names, person(id).nameSlice);
}

const PersonName& GedcomData::firstName(PersonId id) const {
    static const PersonName kNone;
    const auto all = names(id);
    return all.empty() ? kNone : all.front();
}

std::span<const PersonId> GedcomData::spouses(PersonId id) const {
    return part(tables_.spouses, person(id).spouseSlice);
}

std::span<const PersonId> GedcomData::children(PersonId id) const {
    return part(tables_.children, person(id).childSlice);
}

std::span<const FamilyLink> GedcomData::parentLinks(PersonId id) const {
    return part(tables_.parentLinks, person(id).parentLinkSlice);
}

std::span<const FamilyLink> GedcomData::coupleLinks(PersonId id) const {
    return part(tables_.coupleLinks, person(id).coupleLinkSlice);
}

std::span<const ChildLink> GedcomData::childLinks(FamilyId id) const {
    return part(tables_.childLinks, family(id).childLinkSlice);
}

std::span<const Fact> GedcomData::factsOfPerson(PersonId id) const {
    if (!hasPerson(id)) throw std::out_of_range("no person " + std::to_string(id));
    return tables_.factsOfPersons.empty() ? std::span<const Fact>()
                                          : part(tables_.facts, tables_.factsOfPersons[id - 1]);
}

std::span<const Fact> GedcomData::factsOfFamily(FamilyId id) const {
    if (id < 1 || id > familyCount()) throw std::out_of_range("no family " + std::to_string(id));
    return tables_.factsOfFamilies.empty() ? std::span<const Fact>()
                                           : part(tables_.facts, tables_.factsOfFamilies[id - 1]);
}

namespace {

// The place in the list of an item that lies in it.
template <typename Item>
std::size_t placeIn(const std::vector<Item>& list, const Item& item, const char* what) {
    const std::less<const Item*> before;
    if (list.empty() || before(&item, list.data()) || !before(&item, list.data() + list.size())) {
        throw std::out_of_range(std::string("a ") + what + " of other data");
    }
    return static_cast<std::size_t>(&item - list.data());
}

}  // namespace

std::span<const DetailLine> GedcomData::detailsOfPerson(PersonId id) const {
    if (!hasPerson(id)) throw std::out_of_range("no person " + std::to_string(id));
    return tables_.detailsOfPersons.empty() ? std::span<const DetailLine>()
                                            : part(tables_.details, tables_.detailsOfPersons[id - 1]);
}

std::span<const DetailLine> GedcomData::detailsOfFamily(FamilyId id) const {
    if (id < 1 || id > familyCount()) throw std::out_of_range("no family " + std::to_string(id));
    return tables_.detailsOfFamilies.empty() ? std::span<const DetailLine>()
                                             : part(tables_.details, tables_.detailsOfFamilies[id - 1]);
}

std::span<const DetailLine> GedcomData::detailsOfFact(const Fact& fact) const {
    const std::size_t place = placeIn(tables_.facts, fact, "fact");
    return place < tables_.detailsOfFacts.size() ? part(tables_.details, tables_.detailsOfFacts[place])
                                                 : std::span<const DetailLine>();
}

std::span<const DetailLine> GedcomData::detailsOfName(const PersonName& name) const {
    const std::size_t place = placeIn(tables_.names, name, "name");
    return place < tables_.detailsOfNames.size() ? part(tables_.details, tables_.detailsOfNames[place])
                                                 : std::span<const DetailLine>();
}

std::span<const DetailLine> GedcomData::detailsOfShared(const SharedRecord& record) const {
    return part(tables_.details, record.detailSlice);
}

const SharedRecord* GedcomData::sharedByXref(std::string_view xref) const {
    const auto found = tables_.sharedByXref.find(xref);
    return found == tables_.sharedByXref.end() ? nullptr : &tables_.sharedRecords[found->second];
}

PersonId GedcomData::personByXref(std::string_view xref) const {
    return tables_.xrefs == nullptr ? 0 : tables_.xrefs->at(tables_.xrefs->find(bareXref(xref))).person;
}

FamilyId GedcomData::familyByXref(std::string_view xref) const {
    return tables_.xrefs == nullptr ? 0 : tables_.xrefs->at(tables_.xrefs->find(bareXref(xref))).family;
}

}  // namespace olvane::gedcom
