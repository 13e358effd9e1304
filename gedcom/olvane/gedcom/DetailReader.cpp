// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lines of detail, as they stand, in one list. A line is kept if its tag is one of those that readers of a family want,
// and if the line above it is kept.

#include <olvane/gedcom/DetailReaderInternal.h>

#include <algorithm>
#include <iterator>
#include <string_view>

#include <olvane/gedcom/TagCodeInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom {
namespace {

constexpr std::uint64_t kSharedTags[] = {tagCode("NOTE"), tagCode("SNOTE"), tagCode("SOUR"), tagCode("OBJE"),
                                         tagCode("REPO")};

// On level 1 of a person or family. Facts and names are kept elsewhere.
constexpr std::uint64_t kOwnTags[] = {tagCode("NOTE"),    tagCode("SNOTE"), tagCode("SOUR"), tagCode("OBJE"),
                                      tagCode("WWW"),     tagCode("URL"),   tagCode("_URL"), tagCode("_LINK"),
                                      tagCode("_WEBTAG"), tagCode("ADDR")};

constexpr std::uint64_t kTagsBelow[] = {
    tagCode("NOTE"), tagCode("SNOTE"), tagCode("SOUR"),    tagCode("OBJE"), tagCode("WWW"),  tagCode("URL"),
    tagCode("_URL"), tagCode("_LINK"), tagCode("_WEBTAG"), tagCode("ADDR"), tagCode("ADR1"), tagCode("ADR2"),
    tagCode("ADR3"), tagCode("CITY"),  tagCode("STAE"),    tagCode("POST"), tagCode("CTRY"), tagCode("TYPE"),
    tagCode("CAUS"), tagCode("AGE"),   tagCode("AGNC"),    tagCode("RELI"), tagCode("HUSB"), tagCode("WIFE"),
    tagCode("PAGE"), tagCode("QUAY"),  tagCode("DATA"),    tagCode("TEXT"), tagCode("DATE"), tagCode("EVEN"),
    tagCode("ROLE"), tagCode("FILE"),  tagCode("FORM"),    tagCode("MEDI"), tagCode("TITL"), tagCode("AUTH"),
    tagCode("PUBL"), tagCode("ABBR"),  tagCode("REPO"),    tagCode("CALN"), tagCode("NAME"), tagCode("CROP"),
    tagCode("TOP"),  tagCode("LEFT"),  tagCode("HEIGHT"),  tagCode("WIDTH")};

template <std::size_t N>
bool isOneOf(std::uint64_t tag, const std::uint64_t (&tags)[N]) {
    return std::find(std::begin(tags), std::end(tags), tag) != std::end(tags);
}

// "@N1@", but neither "@@", which is text, nor "@#", which is a calendar.
bool looksLikePointer(std::string_view value) {
    return value.size() > 2 && value.front() == '@' && value[1] != '@' && value[1] != '#' &&
           value.find('@', 1) == value.size() - 1;
}

}  // namespace

void DetailReader::beginPerson() {
    tables_.detailsOfPersons.push_back({static_cast<std::uint32_t>(tables_.details.size()), 0});
    record_ = &tables_.detailsOfPersons.back();
    owner_ = nullptr;
    leftOutLevel_ = 0;
}

void DetailReader::beginFamily() {
    tables_.detailsOfFamilies.push_back({static_cast<std::uint32_t>(tables_.details.size()), 0});
    record_ = &tables_.detailsOfFamilies.back();
    owner_ = nullptr;
    leftOutLevel_ = 0;
}

void DetailReader::beginShared(const GedcomLine& line, std::uint64_t tag) {
    record_ = nullptr;
    owner_ = nullptr;
    leftOutLevel_ = 0;
    if (line.xref.empty() || !isOneOf(tag, kSharedTags)) return;
    SharedRecord shared;
    shared.xref = interner_.keep(line.xref, line.number);
    shared.tag = line.tag;
    shared.value = interner_.keepLines(scanner_.wholeValue(line), line.number);
    shared.line = line.number;
    shared.detailSlice.first = static_cast<std::uint32_t>(tables_.details.size());
    tables_.sharedByXref.emplace(shared.xref, static_cast<std::uint32_t>(tables_.sharedRecords.size()));
    tables_.sharedRecords.push_back(shared);
    record_ = &tables_.sharedRecords.back().detailSlice;
}

// Those before that have no slice have no details.
void DetailReader::beginOwner(std::vector<Slice>& slices, std::size_t place) {
    slices.resize(place + 1);
    slices[place].first = static_cast<std::uint32_t>(tables_.details.size());
    owner_ = &slices[place];
    leftOutLevel_ = 0;
}

void DetailReader::beginName() {
    beginOwner(tables_.detailsOfNames, tables_.names.size());
}

void DetailReader::beginFact() {
    beginOwner(tables_.detailsOfFacts, tables_.facts.size() - 1);
}

void DetailReader::beginOwn(const GedcomLine& line, std::uint64_t tag) {
    owner_ = nullptr;
    leftOutLevel_ = 0;
    isOneOf(tag, kOwnTags) ? keep(line) : leaveOut(line);
}

void DetailReader::add(const GedcomLine& line, std::uint64_t tag) {
    if (record_ == nullptr || (leftOutLevel_ != 0 && line.level > leftOutLevel_)) return;
    leftOutLevel_ = 0;
    const bool fits = isOneOf(tag, kTagsBelow) && line.level < GedcomLine::kDeep;
    fits ? keep(line) : leaveOut(line);
}

void DetailReader::keep(const GedcomLine& line) {
    DetailLine detail;
    const std::string_view value = trimmed(line.value);
    detail.isPointer = looksLikePointer(value);
    detail.tag = line.tag;
    detail.value = detail.isPointer ? interner_.keep(value.substr(1, value.size() - 2), line.number)
                                    : interner_.keepLines(scanner_.wholeValue(line), line.number);
    detail.line = line.number;
    detail.level = static_cast<std::uint8_t>(line.level);
    detail.isOfPart = owner_ != nullptr;
    tables_.details.push_back(detail);
    ++record_->count;
    if (owner_ != nullptr) ++owner_->count;
}

}  // namespace olvane::gedcom
