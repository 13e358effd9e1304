// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Diagnostics as text, and the list that gathers them. A broken file may hold a million broken lines, so the
// list keeps the first of each kind and counts the others; what it quotes from a file is short and fit to
// print.

#include <olvane/gedcom/GedcomDiagnostic.h>

#include <algorithm>
#include <utility>

#include <olvane/gedcom/DiagnosticListInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom {
namespace {

constexpr std::size_t kQuotedBytes = 60;

std::string printable(std::string_view raw) {
    std::string shown = lossyUtf8(raw.substr(0, std::min(raw.size(), kQuotedBytes)));
    for (char& c : shown) {
        if (static_cast<unsigned char>(c) < 0x20 || c == 0x7F) c = '?';
    }
    if (raw.size() > kQuotedBytes) shown += "...";
    return shown;
}

}  // namespace

const char* kindName(DiagnosticKind kind) {
    switch (kind) {
        case DiagnosticKind::missingHeader:
            return "missingHeader";
        case DiagnosticKind::missingTrailer:
            return "missingTrailer";
        case DiagnosticKind::afterTrailer:
            return "afterTrailer";
        case DiagnosticKind::notALine:
            return "notALine";
        case DiagnosticKind::emptyLine:
            return "emptyLine";
        case DiagnosticKind::wrongLevel:
            return "wrongLevel";
        case DiagnosticKind::levelJump:
            return "levelJump";
        case DiagnosticKind::brokenXref:
            return "brokenXref";
        case DiagnosticKind::duplicateXref:
            return "duplicateXref";
        case DiagnosticKind::danglingPointer:
            return "danglingPointer";
        case DiagnosticKind::wrongPointer:
            return "wrongPointer";
        case DiagnosticKind::tooManyPartners:
            return "tooManyPartners";
        case DiagnosticKind::samePartners:
            return "samePartners";
        case DiagnosticKind::encodingMismatch:
            return "encodingMismatch";
        case DiagnosticKind::encodingUnknown:
            return "encodingUnknown";
        case DiagnosticKind::badCharacter:
            return "badCharacter";
        case DiagnosticKind::controlCharacter:
            return "controlCharacter";
        case DiagnosticKind::unreadableDate:
            return "unreadableDate";
        case DiagnosticKind::archiveMember:
            return "archiveMember";
        case DiagnosticKind::moreOfAKind:
            return "moreOfAKind";
        case DiagnosticKind::oneSidedLink:
            return "oneSidedLink";
        case DiagnosticKind::contradictingLink:
            return "contradictingLink";
        case DiagnosticKind::wrongSlot:
            return "wrongSlot";
        case DiagnosticKind::ambiguousDate:
            return "ambiguousDate";
    }
    return "";
}

const char* severityName(Severity severity) {
    switch (severity) {
        case Severity::note:
            return "note";
        case Severity::warning:
            return "warning";
        case Severity::error:
            return "error";
    }
    return "error";
}

std::string whatText(const Diagnostic& diagnostic, std::string_view language) {
    std::string text = phraseText(diagnostic.what, language);
    if (!diagnostic.quoted.empty()) text.append(" (").append(diagnostic.quoted).append(")");
    return text;
}

std::string doneText(const Diagnostic& diagnostic, std::string_view language) {
    std::string text;
    for (const DiagnosticPhrase& phrase : diagnostic.done)
        text.append(text.empty() ? "" : "; ").append(phraseText(phrase, language));
    return text;
}

std::string formatDiagnostic(const Diagnostic& diagnostic, std::string_view language) {
    std::string text = diagnostic.file;
    if (diagnostic.line != 0) text.append(":").append(std::to_string(diagnostic.line));
    text += ": ";
    text += severityName(diagnostic.severity);
    text.append(": ").append(whatText(diagnostic, language));
    const std::string done = doneText(diagnostic, language);
    if (!done.empty()) text.append("; ").append(done);
    return text;
}

DiagnosticList::DiagnosticList(std::string file, std::size_t listedPerKind)
    : file_(std::move(file)), listedPerKind_(listedPerKind) {}

void DiagnosticList::add(DiagnosticKind kind, Severity severity, std::uint32_t line, DiagnosticPhrase what,
                         std::vector<DiagnosticPhrase> done, std::string_view quoted) {
    Tally& tally = tallies_[static_cast<std::size_t>(kind)];
    if (++tally.seen > listedPerKind_) return;
    listed_.push_back({file_, line, severity, kind, std::move(what), std::move(done), printable(quoted)});
}

void DiagnosticList::add(DiagnosticKind kind, Severity severity, std::uint32_t line, DiagnosticPhrase what,
                         DiagnosticPhrase done, std::string_view quoted) {
    add(kind, severity, line, std::move(what), std::vector<DiagnosticPhrase>{std::move(done)}, quoted);
}

void DiagnosticList::count(DiagnosticKind kind, std::uint32_t line) {
    Tally& tally = tallies_[static_cast<std::size_t>(kind)];
    if (tally.onlyCounted++ == 0) tally.firstCountedLine = line;
}

std::vector<Diagnostic> DiagnosticList::take() {
    listCounted();
    std::stable_sort(listed_.begin(), listed_.end(),
                     [](const Diagnostic& a, const Diagnostic& b) { return a.line < b.line; });
    listUnlisted();
    return std::exchange(listed_, {});
}

void DiagnosticList::listCounted() {
    for (std::size_t kind = 0; kind < kKinds; ++kind) {
        const Tally& tally = tallies_[kind];
        if (tally.onlyCounted == 0) continue;
        const auto of = static_cast<DiagnosticKind>(kind);
        const DiagnosticPhrase what =
            tally.onlyCounted == 1 ? DiagnosticPhrase{DiagnosticSentence::oneOfKind, {kindName(of)}}
                                   : DiagnosticPhrase{DiagnosticSentence::firstOfKind,
                                                      {kindName(of), std::to_string(tally.onlyCounted)}};
        listed_.push_back(
            {file_, tally.firstCountedLine, Severity::note, of, what, {DiagnosticSentence::skipped}, ""});
    }
}

void DiagnosticList::listUnlisted() {
    for (std::size_t kind = 0; kind < kKinds; ++kind) {
        if (tallies_[kind].seen <= listedPerKind_) continue;
        const std::size_t unlisted = tallies_[kind].seen - listedPerKind_;
        const DiagnosticPhrase what{DiagnosticSentence::moreOfKind,
                                    {std::to_string(unlisted), kindName(static_cast<DiagnosticKind>(kind))}};
        listed_.push_back({file_,
                           0,
                           Severity::note,
                           DiagnosticKind::moreOfAKind,
                           what,
                           {DiagnosticSentence::notListed},
                           ""});
    }
}

}  // namespace olvane::gedcom
