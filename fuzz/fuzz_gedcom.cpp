// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Any bytes as a GEDCOM file. Whatever they are, they are either refused with a GedcomError or give data
// that keeps every promise of its headers: relatives within the counts, texts valid, dates that sort. What was
// read is written and read again as the same, and without those whom the input's size says are hidden.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/gedcom/DateText.h>
#include <olvane/gedcom/GedcomDate.h>
#include <olvane/gedcom/GedcomDetails.h>
#include <olvane/gedcom/GedcomDiagnostic.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/gedcom/GedcomWriter.h>
#include <olvane/kin/PersonIndex.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomFamily.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomSearchTexts.h>
#include <olvane/source/LimitedDataSource.h>

#include "Holds.h"

namespace {

using namespace olvane::gedcom;

// Persons whose names are searched for: each search looks at all, and a file of 64 KiB has thousands.
constexpr std::size_t kSearchedPersons = 8;
constexpr std::size_t kSortTextBytes = 12;
// Hidden persons whose names are looked for in all that is written of the others.
constexpr std::size_t kSoughtPersons = 8;
constexpr std::size_t kMostRelatives = 100;
constexpr std::string_view kHiddenName = "(nobody)";

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

bool isCapital(char c) {
    return c >= 'A' && c <= 'Z';
}

void lookAtText(std::string_view text) {
    HOLDS(isUtf8(text) && hasNoControls(text));
    HOLDS(text.empty() || (text.front() != ' ' && text.back() != ' '));
}

void lookAtName(const PersonName& name) {
    for (const std::string_view piece :
         {name.written, name.prefix, name.given, name.surname, name.suffix, name.nickname, name.type}) {
        lookAtText(piece);
    }
    HOLDS(isUtf8(displayName(name)));
}

void lookAtDate(const GedcomDate& date) {
    HOLDS(date.month <= 12 && date.day <= 31);
    HOLDS(sortText(date).size() <= kSortTextBytes);
    HOLDS(date.isRead() || sortText(date).empty());
    HOLDS(date.isRead() || displayYear(date) == date.written);
    for (const char* language : {"en", "de", "es"}) {
        const std::string words = dateText(date, language);
        HOLDS(isUtf8(words) && words.empty() == date.written.empty());
        HOLDS(date.isRead() || words == date.written);
    }
    const GedcomDate again = parseGedcomDate(date.written);
    HOLDS(again.year == date.year && again.month == date.month && again.day == date.day);
}

void lookAtFacts(std::span<const Fact> facts) {
    for (const Fact& fact : facts) {
        HOLDS(!fact.tag.empty() && std::all_of(fact.tag.begin(), fact.tag.end(), isCapital));
        lookAtText(fact.value);
        lookAtText(fact.place);
        lookAtDate(fact.date);
    }
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
    lookAtFacts(data.factsOfPerson(id));
    HOLDS(isUtf8(person.xref));
    // An identifier with an @ in it cannot be distinguished from one that was given with its own.
    const bool canBeAskedFor = !person.xref.empty() && person.xref.find('@') == std::string_view::npos;
    if (canBeAskedFor) HOLDS(data.personByXref(person.xref) != 0);
}

void lookAtFamily(const GedcomData& data, FamilyId id) {
    const Family& family = data.family(id);
    lookAtDate(family.marriage);
    lookAtFacts(data.factsOfFamily(id));
    HOLDS(family.husband == 0 || data.hasPerson(family.husband));
    HOLDS(family.wife == 0 || data.hasPerson(family.wife));
    for (const ChildLink& link : data.childLinks(id)) HOLDS(link.child == 0 || data.hasPerson(link.child));
    data.familyByXref(family.xref);
}

void search(const GedcomData& data, const olvane::kin::PersonIndex& index, std::string_view text) {
    const auto all = index.find(text);
    const GedcomSearchTexts texts(data);
    HOLDS(all.size() <= data.personCount());
    for (const auto& hit : all) {
        HOLDS(hit.id >= 1 && data.hasPerson(static_cast<PersonId>(hit.id)));
        for (const auto& reason : hit.reasons) {
            const bool isIdentifier = reason.in == olvane::kin::FoundIn::identifier;
            HOLDS(writtenReason(texts, hit, reason).text.empty() == isIdentifier);
        }
    }
    HOLDS(index.find(text, 1).size() == std::min<std::size_t>(all.size(), 1));
}

void searchForNames(const GedcomData& data) {
    const olvane::kin::PersonIndex index{GedcomSearchTexts(data)};
    search(data, index, "anna b");
    search(data, index, "");
    const std::size_t searched = std::min(data.personCount(), kSearchedPersons);
    for (PersonId id = 1; id <= searched; ++id) search(data, index, displayName(data.firstName(id)));
}

void lookAtDiagnostics(const GedcomData& data) {
    for (const Diagnostic& diagnostic : data.diagnostics()) {
        const std::string line = formatDiagnostic(diagnostic);
        HOLDS(isUtf8(line) && isOneLine(line));
        HOLDS(severityName(diagnostic.severity)[0] != '\0');
    }
}

void lookAtAll(const GedcomData& data) {
    for (PersonId id = 1; id <= data.personCount(); ++id) lookAtPerson(data, id);
    for (FamilyId id = 1; id <= data.familyCount(); ++id) lookAtFamily(data, id);
    searchForNames(data);
    lookAtDiagnostics(data);
}

bool areEqual(const PersonName& one, const PersonName& other) {
    return one.written == other.written && one.prefix == other.prefix && one.given == other.given &&
           one.surname == other.surname && one.suffix == other.suffix && one.nickname == other.nickname &&
           one.type == other.type;
}

bool areEqual(const Citation& one, const Citation& other) {
    return one.title == other.title && one.author == other.author && one.publication == other.publication &&
           one.page == other.page && one.text == other.text && one.quality == other.quality;
}

bool areEqual(const MediaFile& one, const MediaFile& other) {
    return one.title == other.title && one.file == other.file && one.format == other.format;
}

bool areEqual(const GedcomDate& one, const GedcomDate& other) {
    return one.written == other.written && displayYear(one) == displayYear(other) &&
           sortText(one) == sortText(other);
}

bool areEqual(const Fact& one, const Fact& other) {
    return one.tag == other.tag && one.value == other.value && one.place == other.place &&
           areEqual(one.date, other.date);
}

template <typename Item>
bool allEqual(std::span<const Item> some, std::span<const Item> others) {
    return std::equal(some.begin(), some.end(), others.begin(), others.end(),
                      [](const Item& one, const Item& other) { return areEqual(one, other); });
}

// The families that links lead to, with how, and without those that lead nowhere, which are not written.
std::vector<std::pair<FamilyId, Pedigree>> familiesOf(std::span<const FamilyLink> links) {
    std::vector<std::pair<FamilyId, Pedigree>> families;
    for (const FamilyLink& link : links) {
        if (link.family != 0) families.emplace_back(link.family, link.pedigree);
    }
    return families;
}

std::vector<PersonId> childrenOf(std::span<const ChildLink> links) {
    std::vector<PersonId> children;
    for (const ChildLink& link : links) {
        if (link.child != 0) children.push_back(link.child);
    }
    return children;
}

// Of a hidden person, other parents than father and mother are not written.
std::vector<PersonId> shownChildren(const GedcomData& data, FamilyId family,
                                    const std::vector<bool>& hidden) {
    std::vector<PersonId> children = childrenOf(data.childLinks(family));
    std::erase_if(children, [&](PersonId child) {
        return !hidden.empty() && hidden[child - 1] && data.person(child).parentFamily != family;
    });
    return children;
}

void holdEqualRelatives(const GedcomData& data, const GedcomData& again, const std::vector<bool>& hidden) {
    HOLDS(again.personCount() == data.personCount() && again.familyCount() == data.familyCount());
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        const Person& person = data.person(id);
        const Person& same = again.person(id);
        HOLDS(same.sex == person.sex && same.father == person.father && same.mother == person.mother);
        HOLDS(std::ranges::equal(data.spouses(id), again.spouses(id)));
        HOLDS(!hidden.empty() || std::ranges::equal(data.children(id), again.children(id)));
        HOLDS(familiesOf(data.coupleLinks(id)) == familiesOf(again.coupleLinks(id)));
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) {
        const Family& family = data.family(id);
        const Family& same = again.family(id);
        HOLDS(same.husband == family.husband && same.wife == family.wife);
        HOLDS(shownChildren(data, id, hidden) == childrenOf(again.childLinks(id)));
    }
}

void holdEqualDetails(const Details& one, const Details& other) {
    HOLDS(one.type == other.type && one.cause == other.cause && one.age == other.age);
    HOLDS(one.husbandAge == other.husbandAge && one.wifeAge == other.wifeAge && one.agency == other.agency);
    HOLDS(one.address == other.address && one.notes == other.notes && one.links == other.links);
    HOLDS(allEqual(std::span(one.citations), std::span(other.citations)));
    HOLDS(allEqual(std::span(one.media), std::span(other.media)));
    for (const std::string_view note : one.notes) HOLDS(isUtf8(note));
}

void holdEqualFactDetails(const GedcomData& data, std::span<const Fact> facts, const GedcomData& again,
                          std::span<const Fact> same) {
    for (std::size_t i = 0; i < facts.size(); ++i) {
        holdEqualDetails(factDetails(data, facts[i]), factDetails(again, same[i]));
    }
}

void holdEqualDetails(const GedcomData& data, const GedcomData& again) {
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        holdEqualDetails(personDetails(data, id), personDetails(again, id));
        holdEqualFactDetails(data, data.factsOfPerson(id), again, again.factsOfPerson(id));
        const auto names = data.names(id);
        for (std::size_t i = 0; i < names.size(); ++i) {
            holdEqualDetails(nameDetails(data, names[i]), nameDetails(again, again.names(id)[i]));
        }
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) {
        holdEqualDetails(familyDetails(data, id), familyDetails(again, id));
        holdEqualFactDetails(data, data.factsOfFamily(id), again, again.factsOfFamily(id));
    }
}

void holdEqualFacts(const GedcomData& data, const GedcomData& again) {
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        const Person& person = data.person(id);
        const Person& same = again.person(id);
        HOLDS(same.dead == person.dead);
        HOLDS(areEqual(person.birth, same.birth) && areEqual(person.death, same.death));
        HOLDS(allEqual(data.factsOfPerson(id), again.factsOfPerson(id)));
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) {
        const Family& family = data.family(id);
        const Family& same = again.family(id);
        HOLDS(same.married == family.married && same.divorced == family.divorced);
        HOLDS(areEqual(family.marriage, same.marriage));
        HOLDS(allEqual(data.factsOfFamily(id), again.factsOfFamily(id)));
    }
}

GedcomData writtenAndRead(const GedcomData& data, const WriteOptions& options) {
    const std::string text = writeGedcom(data, options);
    HOLDS(isUtf8(text));
    ReadOptions reading;
    reading.details = true;
    GedcomData again = readGedcomBytes(text, "written", reading);
    const bool wasSound = data.diagnostics().empty();
    for (const Diagnostic& diagnostic : again.diagnostics())
        HOLDS(!wasSound || diagnostic.severity != Severity::error);
    return again;
}

void writeAll(const GedcomData& data, const ReadOptions& options) {
    const GedcomData again = writtenAndRead(data, {});
    holdEqualRelatives(data, again, {});
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        HOLDS(allEqual(data.names(id), again.names(id)));
        HOLDS(familiesOf(data.parentLinks(id)) == familiesOf(again.parentLinks(id)));
    }
    if (options.facts || options.details) holdEqualFacts(data, again);
    if (options.details) holdEqualDetails(data, again);
}

bool isLetter(char c) {
    return isCapital(c) || (c >= 'a' && c <= 'z');
}

bool isWordByte(char c) {
    return isLetter(c) || (c >= '0' && c <= '9') || static_cast<unsigned char>(c) >= 0x80;
}

// A name that is one word of two letters or more, in the alphabet that any reader can compare.
bool isPlainWord(std::string_view name) {
    return name.size() > 1 && std::all_of(name.begin(), name.end(), isLetter);
}

std::string smallLetters(std::string_view text) {
    std::string small(text);
    for (char& c : small) {
        if (isCapital(c)) c = static_cast<char>(c - 'A' + 'a');
    }
    return small;
}

bool holdsWord(std::string_view text, std::string_view word) {
    for (std::size_t at = text.find(word); at != std::string_view::npos; at = text.find(word, at + 1)) {
        const std::size_t end = at + word.size();
        if ((at == 0 || !isWordByte(text[at - 1])) && (end == text.size() || !isWordByte(text[end])))
            return true;
    }
    return false;
}

void holdNotNamedIn(std::span<const Fact> facts, const PersonName& name) {
    const std::string given = smallLetters(name.given);
    const std::string surname = smallLetters(name.surname);
    for (const Fact& fact : facts) {
        for (const std::string_view written : {fact.value, fact.place, fact.date.written}) {
            const std::string text = smallLetters(written);
            HOLDS(given == surname || !holdsWord(text, given) || !holdsWord(text, surname));
        }
    }
}

void holdNamedNowhere(const GedcomData& again, const PersonName& name) {
    if (!isPlainWord(name.given) || !isPlainWord(name.surname)) return;
    for (PersonId id = 1; id <= again.personCount(); ++id) holdNotNamedIn(again.factsOfPerson(id), name);
    for (FamilyId id = 1; id <= again.familyCount(); ++id) holdNotNamedIn(again.factsOfFamily(id), name);
}

// A nickname that names somebody hidden is not written.
void holdEqualNames(std::span<const PersonName> names, std::span<const PersonName> again) {
    HOLDS(names.size() == again.size());
    for (std::size_t i = 0; i < names.size(); ++i) {
        PersonName expected = names[i];
        if (again[i].nickname.empty()) expected.nickname = {};
        HOLDS(areEqual(expected, again[i]));
    }
}

void holdHidden(const GedcomData& data, const GedcomData& again, const std::vector<bool>& hidden) {
    std::size_t sought = 0;
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        if (!hidden[id - 1]) {
            holdEqualNames(data.names(id), again.names(id));
            continue;
        }
        HOLDS(again.names(id).size() == 1 && again.firstName(id).written == kHiddenName);
        HOLDS(again.factsOfPerson(id).empty() && !again.person(id).dead);
        HOLDS(again.detailsOfPerson(id).empty());
        HOLDS(!again.person(id).birth.isGiven() && !again.person(id).death.isGiven());
        if (++sought <= kSoughtPersons) holdNamedNowhere(again, data.firstName(id));
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) {
        const Family& family = data.family(id);
        const bool isHidden = (family.husband != 0 && hidden[family.husband - 1]) ||
                              (family.wife != 0 && hidden[family.wife - 1]);
        HOLDS(!isHidden || (again.factsOfFamily(id).empty() && again.detailsOfFamily(id).empty()));
    }
}

// Every n-th person, the first one included.
void writeHidden(const GedcomData& data, std::size_t step) {
    WriteOptions options;
    options.hiddenName = kHiddenName;
    for (std::size_t i = 0; i < data.personCount(); ++i) options.hidden.push_back(i % step == 0);
    const GedcomData again = writtenAndRead(data, options);
    holdEqualRelatives(data, again, options.hidden);
    holdHidden(data, again, options.hidden);
}

std::int64_t asAnswer(PersonId id) {
    return id == 0 ? OlvaneViewerManagerWrapProtocol::kPersonNotFound : std::int64_t{id};
}

// The questions of a layout, as a layout asks them.
void lookAtSource(const GedcomData& data) {
    GedcomDataSource source(data);
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        const Person& person = data.person(id);
        HOLDS(source.fatherForPersonWithID(id) == asAnswer(person.father));
        HOLDS(source.motherForPersonWithID(id) == asAnswer(person.mother));
        HOLDS(std::ranges::equal(source.spousesForPersonWithID(id), data.spouses(id)));
        HOLDS(std::ranges::equal(source.childrenForPersonWithID(id), data.children(id)));
        for (const PersonId spouse : data.spouses(id)) {
            HOLDS(source.isPreferredSpouse(id, spouse) == (spouse == data.spouses(id).front()));
        }
        HOLDS(source.isPersonDead(id) == person.dead);
        HOLDS(source.dateForPersonWithID(id, true) == sortText(person.birth));
        HOLDS(source.dateForPersonWithID(id, false) == sortText(person.death));
        HOLDS(source.sexOfPersonWithID(id) == static_cast<std::int32_t>(person.sex));
    }
}

// Father and mother are the partners of the first union as a child.
void lookAtKin(const GedcomData& data) {
    const olvane::kin::KinGraph graph = kinGraphOf(data);
    HOLDS(graph.personCount() == static_cast<olvane::kin::Place>(data.personCount()));
    for (olvane::kin::Place place = 0; place < graph.personCount(); ++place) {
        const Person& person = data.person(static_cast<PersonId>(place) + 1);
        if (person.father == 0 && person.mother == 0) continue;
        HOLDS(!graph.unionsAsChild(place).empty());
        const auto& partners = graph.partners(graph.unionsAsChild(place).front());
        HOLDS(partners[0] == static_cast<olvane::kin::Place>(person.father) - 1);
        HOLDS(partners[1] == static_cast<olvane::kin::Place>(person.mother) - 1);
    }
}

// Whether it ends is a matter of how many relatives there are, a father and a mother for everybody included.
void lookAtLimit(const GedcomData& data) {
    GedcomDataSource source(data);
    LimitedDataSource limited(source, kMostRelatives);
    std::size_t asked = 0;
    try {
        for (PersonId id = 1; id <= data.personCount(); ++id) {
            asked += 2 + data.spouses(id).size();
            HOLDS(limited.fatherForPersonWithID(id) == asAnswer(data.person(id).father));
            HOLDS(limited.motherForPersonWithID(id) == asAnswer(data.person(id).mother));
            HOLDS(std::ranges::equal(limited.spousesForPersonWithID(id), data.spouses(id)));
            asked += data.children(id).size();
            HOLDS(std::ranges::equal(limited.childrenForPersonWithID(id), data.children(id)));
        }
        HOLDS(asked <= kMostRelatives);
    } catch (const std::length_error&) {
        HOLDS(asked > kMostRelatives);
    }
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
    // Three sizes in four read facts, and one of them details; of these, seven in eight hide every person, every second
    // one, and so on.
    ReadOptions options;
    options.facts = size % 4 != 0;
    options.details = size % 4 == 3;
    const std::size_t hiddenStep = size / 4 % 8;
    try {
        const GedcomData data = readGedcomBytes(text, "f", options);
        lookAtAll(data);
        lookAtSource(data);
        lookAtKin(data);
        lookAtLimit(data);
        writeAll(data, options);
        if (options.facts && hiddenStep != 0) writeHidden(data, hiddenStep);
    } catch (const GedcomError& error) {
        HOLDS(isOneLine(error.what()));
    }
    return 0;
}
