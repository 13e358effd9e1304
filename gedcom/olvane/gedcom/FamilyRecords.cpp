// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Records of families: partners, children with how they came, marriage and divorce.

#include <olvane/gedcom/RecordReaderInternal.h>

#include <string_view>

#include <olvane/gedcom/GrowthEstimateInternal.h>
#include <olvane/gedcom/RecordTagsInternal.h>

namespace olvane::gedcom {
namespace {

// What a program says of a child's tie to father or mother alone: "Natural", "Adopted", "Step".
Pedigree tieOf(std::string_view value) {
    const std::uint64_t word = tagCode(value.substr(0, 7));
    if (word == tagCode("NATURAL") || word == tagCode("BIOLOGI")) return Pedigree::birth;
    return word == tagCode("UNKNOWN") ? Pedigree::notGiven : pedigreeOf(value);
}

}  // namespace

void RecordReader::beginFamily(const GedcomLine& line) {
    record_ = Record::family;
    marriages_ = 0;
    marriedLast_ = false;
    husbands_ = {};
    wives_ = {};
    Family fresh;
    fresh.line = line.number;
    fresh.xref = interner_.keep(line.xref, line.number);
    fresh.childLinkSlice.first = static_cast<std::uint32_t>(tables_.childLinks.size());
    appendWithGrowthEstimate(tables_.families, fresh, scanner_.share());
    if (keepsFacts_) tables_.factsOfFamilies.push_back({static_cast<std::uint32_t>(tables_.facts.size()), 0});
    if (details_ != nullptr) details_->beginFamily();
    XrefTable::Entry* entry = claimXref(line);
    if (entry != nullptr && entry->family == 0)
        entry->family = static_cast<FamilyId>(tables_.families.size());
}

void RecordReader::readFamilyFact(const GedcomLine& line, std::uint64_t tag) {
    switch (tag) {
        case kHusband:
            return addPartner(line, husbands_);
        case kWife:
            return addPartner(line, wives_);
        case kChild:
            tables_.childLinks.push_back({readPointer(line), line.number});
            tiesOfChild_ = 0;
            ++family().childLinkSlice.count;
            return;
        case kNo:
            if (tagCode(trimmed(line.value)) == kMarriage) family().notMarried = true;
            return;
        case kMarriage:
            if (passOverIfNot(line)) {
                family().notMarried = true;
                return;
            }
            family().married = true;
            marriedLast_ = true;
            ++marriages_;
            return;
        case kDivorce:
            if (didNotHappen(line)) return;
            family().divorced = true;
            marriedLast_ = false;
            return;
        default:
            return;
    }
}

void RecordReader::readFamilyDetail(const GedcomLine& line, std::uint64_t tag) {
    if (fact_ == kMarriage && tag == kDate) return readDate(line, family().marriage);
    if (fact_ == kChild && (tag == kFatherTie || tag == kMotherTie)) readChildTie(tieOf(trimmed(line.value)));
}

// A child by birth of either parent is the family's by birth.
void RecordReader::readChildTie(Pedigree tie) {
    if (tie == Pedigree::notGiven) return;
    Pedigree& pedigree = tables_.childLinks.back().pedigree;
    if (tiesOfChild_++ == 0 || tie == Pedigree::birth) pedigree = tie;
}

void RecordReader::addPartner(const GedcomLine& line, PartnerDraft& draft) {
    const XrefPlace place = readPointer(line);
    if (place == 0) return;
    if (draft.count == draft.mentions.size()) return refusePartner(line.number);
    draft.mentions[draft.count++] = {place, line.number};
}

void RecordReader::refusePartner(LineNumber line) {
    diagnostics_.add(DiagnosticKind::tooManyPartners, Severity::error, line, DiagnosticSentence::thirdPartner,
                     DiagnosticSentence::leftOut, family().xref);
}

void RecordReader::endFamily() {
    settlePartners();
    if (marriages_ > 1 && marriedLast_) family().divorced = false;
    if (family().married) family().notMarried = false;
}

// One HUSB and one WIFE if there are both; else two of one tag in their order.
void RecordReader::settlePartners() {
    const bool couple = husbands_.count > 0 && wives_.count > 0;
    if (couple && husbands_.count > 1) refusePartner(husbands_.mentions[1].line);
    if (couple && wives_.count > 1) refusePartner(wives_.mentions[1].line);
    const bool twoWives = !couple && wives_.count == 2;
    const bool twoHusbands = !couple && husbands_.count == 2;
    const auto husband = twoWives ? wives_.mentions[0] : husbands_.mentions[0];
    const auto wife = twoHusbands ? husbands_.mentions[1] : wives_.mentions[twoWives ? 1 : 0];
    family().husband = husband.place;
    family().husbandLine = husband.line;
    family().wife = wife.place;
    family().wifeLine = wife.line;
}

}  // namespace olvane::gedcom
