// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Records line by line. A line means something by its own tag, the tag of the fact above it and the sort of record it lies
// in; that is all the state there is. Names and links of one record lie together in lists that all records share, so a
// record that has few of them is small. What persons, families, names and facts have in them is read in PersonRecords,
// FamilyRecords, RecordNames and RecordFacts; here are the lines, where records begin and end, and what points to them.

#include <olvane/gedcom/RecordReaderInternal.h>

#include <algorithm>
#include <string>
#include <string_view>

#include <olvane/gedcom/RecordTagsInternal.h>

namespace olvane::gedcom {
namespace {

constexpr std::string_view kVoid = "VOID";

bool isKnownRecord(std::uint64_t tag) {
    switch (tag) {
        case kHeader:
        case kIndividual:
        case kFamily:
        case kTrailer:
        case tagCode("NOTE"):
        case tagCode("SNOTE"):
        case tagCode("SOUR"):
        case tagCode("SUBM"):
        case tagCode("SUBN"):
        case tagCode("REPO"):
        case tagCode("OBJE"):
            return true;
        default:
            return false;
    }
}

}  // namespace

bool RecordReader::readAll(void (*progress)(std::size_t done, std::size_t all)) {
    constexpr std::uint32_t kLinesBetween = 1U << 14U;
    const std::size_t all = scanner_.bytesLeft();
    GedcomLine line;
    while (scanner_.next(line)) {
        readLine(line);
        if (progress != nullptr && line.number % kLinesBetween == 0)
            progress(all - scanner_.bytesLeft(), all);
    }
    endRecord();
    if (anyRecord_ && !trailerSeen_) {
        diagnostics_.add(DiagnosticKind::missingTrailer, Severity::warning, scanner_.lineNumber(),
                         DiagnosticSentence::noTrailer, DiagnosticSentence::asFarAsItGoes);
    }
    return anyRecord_;
}

void RecordReader::readLine(const GedcomLine& line) {
    if (!anyLine_) checkBeginning(line);
    anyLine_ = true;
    if (details_ != nullptr && line.level > 0 && record_ == Record::other)
        details_->add(line, tagCode(line.tag));
    if (line.level > 0 && record_ == Record::other) return;
    const std::uint64_t tag = tagCode(line.tag);
    if (line.level > 3) {
        if (details_ != nullptr) details_->add(line, tag);
        return;
    }
    if (line.level == 0) return beginRecord(line);
    if (line.level == 1) return readFactLine(line, tag);
    if (line.level == 2) return readDetailLine(line, tag);
    if (details_ != nullptr) details_->add(line, tag);
    if (tag == kPhrase && openDate_ != nullptr) readDatePhrase(line);
}

void RecordReader::readFactLine(const GedcomLine& line, std::uint64_t tag) {
    endName();
    openDate_ = nullptr;
    fact_ = tag;
    if (keepsFacts_) beginFact(line, tag);
    record_ == Record::person ? readPersonFact(line, tag) : readFamilyFact(line, tag);
    if (details_ != nullptr) beginDetails(line, tag);
}

void RecordReader::readDetailLine(const GedcomLine& line, std::uint64_t tag) {
    openDate_ = nullptr;
    record_ == Record::person ? readPersonDetail(line, tag) : readFamilyDetail(line, tag);
    if (factOpen_) readFactDetail(line, tag);
    if (details_ != nullptr) keepDetail(line, tag);
}

void RecordReader::beginRecord(const GedcomLine& line) {
    endRecord();
    const std::uint64_t tag = tagCode(line.tag);
    checkEnd(line, tag);
    anyRecord_ = anyRecord_ || isKnownRecord(tag);
    fact_ = 0;
    if (tag == kIndividual) {
        beginPerson(line);
    } else if (tag == kFamily) {
        beginFamily(line);
    } else {
        record_ = Record::other;
        claimXref(line);
        if (details_ != nullptr) details_->beginShared(line, tag);
    }
}

void RecordReader::endRecord() {
    endName();
    openDate_ = nullptr;
    factOpen_ = false;
    if (record_ == Record::person) endPerson();
    if (record_ == Record::family) endFamily();
    record_ = Record::other;
}

void RecordReader::checkBeginning(const GedcomLine& line) {
    if (line.level == 0 && tagCode(line.tag) == kHeader) return;
    diagnostics_.add(DiagnosticKind::missingHeader, Severity::warning, line.number,
                     DiagnosticSentence::noHeader, DiagnosticSentence::withoutIt, line.tag);
}

void RecordReader::checkEnd(const GedcomLine& line, std::uint64_t tag) {
    if (trailerSeen_) {
        diagnostics_.add(DiagnosticKind::afterTrailer, Severity::warning, line.number,
                         DiagnosticSentence::recordBehindTrailer, DiagnosticSentence::likeOthers, line.tag);
    }
    trailerSeen_ = trailerSeen_ || tag == kTrailer;
}

// The place of the record's identifier, which is now known to have a record; null if it has none.
XrefTable::Entry* RecordReader::claimXref(const GedcomLine& line) {
    if (line.xref.empty()) return nullptr;
    XrefTable::Entry& entry = xrefs_.at(xrefs_.place(interner_.keep(line.xref, line.number)));
    if (entry.line != 0) {
        diagnostics_.add(DiagnosticKind::duplicateXref, Severity::warning, line.number,
                         DiagnosticPhrase{DiagnosticSentence::identifierInUse, {std::to_string(entry.line)}},
                         DiagnosticSentence::asOwnRecord, line.xref);
    } else {
        entry.line = line.number;
    }
    return &entry;
}

XrefPlace RecordReader::readPointer(const GedcomLine& line) {
    const std::string_view xref = pointedXref(line);
    return xref.empty() || xref == kVoid ? 0 : xrefs_.place(interner_.keep(xref, line.number));
}

// Empty if there is none. A void pointer is as good as none, and needs no word.
std::string_view RecordReader::pointedXref(const GedcomLine& line) {
    const std::string_view value = trimmed(line.value);
    if (value.empty() || value.front() != '@') {
        diagnostics_.add(DiagnosticKind::wrongPointer, Severity::error, line.number,
                         DiagnosticSentence::linkWithoutPointer, DiagnosticSentence::leftOut,
                         value.empty() ? line.tag : value);
        return {};
    }
    const std::size_t end = std::min(value.find('@', 1), value.size());
    if (end + 1 != value.size()) {
        diagnostics_.add(DiagnosticKind::brokenXref, Severity::warning, line.number,
                         DiagnosticSentence::pointerWithoutEnd, DiagnosticSentence::asIfItDid, value);
    }
    return trimmed(value.substr(1, end - 1));
}

}  // namespace olvane::gedcom
