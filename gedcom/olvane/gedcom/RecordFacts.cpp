// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Facts, which are kept by their tags alone, dates, and what neither tables nor facts have a place for.

#include <olvane/gedcom/RecordReaderInternal.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <iterator>
#include <string_view>

#include <olvane/gedcom/RecordTagsInternal.h>

namespace olvane::gedcom {
namespace {

struct FactTag {
    std::uint64_t code;
    std::string_view name;
};

// What is stated of persons and couples, but for numbers by which an office knows them, which are nobody's
// business.
constexpr std::string_view kFactNames[] = {
    "ADOP", "ANUL", "BAPM", "BARM", "BASM", "BIRT", "BLES", "BURI", "CAST", "CENS", "CHR",
    "CHRA", "CONF", "CREM", "DEAT", "DIV",  "DIVF", "DSCR", "EDUC", "EMIG", "ENGA", "EVEN",
    "FACT", "FCOM", "GRAD", "IMMI", "MARB", "MARC", "MARL", "MARR", "MARS", "NATI", "NATU",
    "NCHI", "NMR",  "OCCU", "ORDN", "PROB", "PROP", "RELI", "RESI", "RETI", "TITL", "WILL"};

constexpr auto kFactTags = [] {
    std::array<FactTag, std::size(kFactNames)> tags{};
    for (std::size_t i = 0; i < tags.size(); ++i) tags[i] = {tagCode(kFactNames[i]), kFactNames[i]};
    std::sort(tags.begin(), tags.end(), [](const FactTag& a, const FactTag& b) { return a.code < b.code; });
    return tags;
}();

// Empty for a tag that states no fact.
std::string_view factName(std::uint64_t tag) {
    const auto* const found =
        std::lower_bound(kFactTags.begin(), kFactTags.end(), tag,
                         [](const FactTag& fact, std::uint64_t code) { return fact.code < code; });
    return found != kFactTags.end() && found->code == tag ? found->name : std::string_view();
}

}  // namespace

void RecordReader::beginFact(const GedcomLine& line, std::uint64_t tag) {
    const std::string_view name = factName(tag);
    factOpen_ = !name.empty() && !didNotHappen(line);
    if (!factOpen_) return;
    Fact fact;
    fact.tag = name;
    fact.line = line.number;
    if (trimmed(line.value) != "Y") fact.value = storedValue(line);
    valueFromType_ = fact.value.empty();
    tables_.facts.push_back(fact);
    ++factsInHand().count;
}

// Of several dates, places and types the first stands. A date that the record has kept is taken from there, so
// that its trouble is reported once.
void RecordReader::readFactDetail(const GedcomLine& line, std::uint64_t tag) {
    Fact& fact = tables_.facts.back();
    if (tag == kPlace && fact.place.empty()) fact.place = storedValue(line);
    if (tag == kType && valueFromType_ && fact.value.empty()) fact.value = storedValue(line);
    if (tag != kDate || fact.date.isGiven()) return;
    fact.date = lastDate_.line == line.number ? lastDate_ : parseGedcomDate(storedValue(line));
    fact.date.line = line.number;
}

Slice& RecordReader::factsInHand() {
    return record_ == Record::person ? tables_.factsOfPersons.back() : tables_.factsOfFamilies.back();
}

// Of several dates the first stands.
void RecordReader::readDate(const GedcomLine& line, GedcomDate& date) {
    if (date.isGiven()) return;
    const std::string_view value = storedValue(line);
    if (value.empty()) {
        openDate_ = &date;
        return;
    }
    date = parseGedcomDate(value);
    date.line = line.number;
    lastDate_ = date;
    if (date.isYearAlone) {
        diagnostics_.add(DiagnosticKind::ambiguousDate, Severity::note, line.number,
                         DiagnosticSentence::dayOrMonth, DiagnosticSentence::yearAlone, value);
    }
    if (date.isRead() || value.front() == '(') return;
    diagnostics_.add(DiagnosticKind::unreadableDate, Severity::note, line.number,
                     DiagnosticSentence::dateNotRead, DiagnosticSentence::asWritten, value);
}

// A phrase that is a date is as good as one.
void RecordReader::readDatePhrase(const GedcomLine& line) {
    *openDate_ = parseGedcomDate(storedValue(line));
    openDate_->line = line.number;
    if (factOpen_ && !tables_.facts.back().date.isGiven()) tables_.facts.back().date = *openDate_;
    openDate_ = nullptr;
}

void RecordReader::beginDetails(const GedcomLine& line, std::uint64_t tag) {
    if (nameOpen_) {
        details_->beginName();
    } else if (factOpen_) {
        details_->beginFact();
    } else {
        details_->beginOwn(line, tag);
    }
}

// What the tables of names and facts have is not kept again.
void RecordReader::keepDetail(const GedcomLine& line, std::uint64_t tag) {
    const bool keptWithFact =
        factOpen_ && (tag == kDate || tag == kPlace || (tag == kType && valueFromType_));
    const bool keptWithName = nameOpen_ && tag == kType;
    keptWithFact || keptWithName ? details_->leaveOut(line) : details_->add(line, tag);
}

}  // namespace olvane::gedcom
