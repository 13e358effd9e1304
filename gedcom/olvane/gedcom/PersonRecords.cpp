// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Records of persons: sex, birth and death, and the families that a person is a child or a partner of.

#include <olvane/gedcom/RecordReaderInternal.h>

#include <algorithm>
#include <span>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GrowthEstimateInternal.h>
#include <olvane/gedcom/RecordTagsInternal.h>

namespace olvane::gedcom {
namespace {

Sex sexOf(std::string_view value) {
    if (value == "M" || value == "m") return Sex::male;
    if (value == "F" || value == "f") return Sex::female;
    return Sex::other;
}

}  // namespace

Pedigree pedigreeOf(std::string_view value) {
    switch (tagCode(value)) {
        case tagCode(""):
            return Pedigree::notGiven;
        case tagCode("BIRTH"):
            return Pedigree::birth;
        case tagCode("ADOPTED"):
            return Pedigree::adopted;
        case tagCode("FOSTER"):
            return Pedigree::foster;
        case tagCode("SEALING"):
            return Pedigree::sealing;
        case tagCode("STEP"):
            return Pedigree::step;
        default:
            return Pedigree::other;
    }
}

void RecordReader::beginPerson(const GedcomLine& line) {
    record_ = Record::person;
    sexRead_ = false;
    Person fresh;
    fresh.line = line.number;
    fresh.xref = interner_.keep(line.xref, line.number);
    fresh.nameSlice.first = static_cast<std::uint32_t>(tables_.names.size());
    fresh.parentLinkSlice.first = static_cast<std::uint32_t>(tables_.parentLinks.size());
    fresh.coupleLinkSlice.first = static_cast<std::uint32_t>(tables_.coupleLinks.size());
    appendWithGrowthEstimate(tables_.persons, fresh, scanner_.share());
    if (keepsFacts_) tables_.factsOfPersons.push_back({static_cast<std::uint32_t>(tables_.facts.size()), 0});
    if (details_ != nullptr) details_->beginPerson();
    XrefTable::Entry* entry = claimXref(line);
    if (entry != nullptr && entry->person == 0) entry->person = static_cast<PersonId>(tables_.persons.size());
}

void RecordReader::readPersonFact(const GedcomLine& line, std::uint64_t tag) {
    switch (tag) {
        case kName:
            return beginName(line);
        case kSex:
            if (!sexRead_) person().sex = sexOf(trimmed(line.value));
            sexRead_ = true;
            return;
        case kBirth:
            passOverIfNot(line);
            return;
        case kDeath:
        case kBurial:
        case kCremation:
        case kProbate:
            person().dead = !passOverIfNot(line) || person().dead;
            return;
        case kAlias:
        case kAlsoKnownAs:
        case kAlsoKnownAsName:
            if (!trimmed(line.value).starts_with('@')) addFurtherName(line, "aka");
            return;
        case kMarriedName:
        case kMarriedNameInFull:
            return addFurtherName(line, "married");
        case kFamilyAsChild:
            tables_.parentLinks.push_back({readPointer(line), line.number});
            ++person().parentLinkSlice.count;
            return;
        case kFamilyAsSpouse:
            tables_.coupleLinks.push_back({readPointer(line), line.number});
            ++person().coupleLinkSlice.count;
            return;
        default:
            return;
    }
}

// Whatever stands below what did not happen did not happen either.
bool RecordReader::passOverIfNot(const GedcomLine& line) {
    if (!didNotHappen(line)) return false;
    fact_ = 0;
    return true;
}

void RecordReader::readPersonDetail(const GedcomLine& line, std::uint64_t tag) {
    if (fact_ == kName) return readNamePiece(line, tag);
    if (fact_ == kBirth && tag == kDate) return readDate(line, person().birth);
    if (fact_ == kDeath && tag == kDate) return readDate(line, person().death);
    if (fact_ == kFamilyAsChild && tag == kPedigree && !trimmed(line.value).empty()) {
        tables_.parentLinks.back().pedigree = pedigreeOf(trimmed(line.value));
    }
    if (fact_ == kAdoption && tag == kFamilyAsChild) adoptiveFamilies_.push_back(readPointer(line));
}

// An adoption says of a link to the adoptive family what its PEDI did not.
void RecordReader::endPerson() {
    if (!furtherNames_.empty()) addFurtherNames(givenNameOfPerson());
    if (adoptiveFamilies_.empty()) return;
    const Slice slice = person().parentLinkSlice;
    for (FamilyLink& link : std::span(tables_.parentLinks).subspan(slice.first, slice.count)) {
        const auto& adoptive = adoptiveFamilies_;
        const bool isAdoptive = std::find(adoptive.begin(), adoptive.end(), link.family) != adoptive.end();
        if (isAdoptive && link.pedigree == Pedigree::notGiven) link.pedigree = Pedigree::adopted;
    }
    adoptiveFamilies_.clear();
}

std::string_view RecordReader::givenNameOfPerson() const {
    const Person& last = tables_.persons.back();
    return last.nameSlice.count == 0 ? std::string_view() : tables_.names[last.nameSlice.first].given;
}

}  // namespace olvane::gedcom
