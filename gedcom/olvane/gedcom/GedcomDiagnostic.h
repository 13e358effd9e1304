// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/detail/DiagnosticSentence.h>

namespace olvane::gedcom {

enum class Severity : std::uint8_t {
    note,     // nothing is lost
    warning,  // something had to be guessed
    error,    // something was left out
};

// What kind of trouble a diagnostic reports. New kinds are added at the end.
enum class DiagnosticKind : std::uint8_t {
    missingHeader,      // the first record is not HEAD
    missingTrailer,     // the file ends without TRLR: it may have been cut off
    afterTrailer,       // records behind TRLR
    notALine,           // a line without level and tag
    emptyLine,          // lines with nothing in them
    wrongLevel,         // a level that is no plain number
    levelJump,          // a level more than one above its predecessor
    brokenXref,         // an identifier or pointer without its closing @
    duplicateXref,      // two records of one identifier
    danglingPointer,    // a pointer to no record
    wrongPointer,       // a pointer to a record of another sort, or a link without a pointer
    tooManyPartners,    // a family with a third partner
    samePartners,       // a family with one person as both partners
    encodingMismatch,   // the bytes are not what the header says
    encodingUnknown,    // an encoding that the header names and nobody knows
    badCharacter,       // bytes that are no character in the file's encoding
    controlCharacter,   // control characters in a text that is kept
    unreadableDate,     // a date that is shown as written
    archiveMember,      // an archive whose GEDCOM member has another name than the standard's
    moreOfAKind,        // stands for diagnostics of one kind that are not listed singly
    oneSidedLink,       // a person and a family of which one alone names the other
    contradictingLink,  // a link beside which the other side names somebody else
    wrongSlot,          // a man as WIFE, or a woman as HUSB
    ambiguousDate,      // a date whose day and month may be either way round
};

constexpr std::size_t kDiagnosticKinds = static_cast<std::size_t>(DiagnosticKind::ambiguousDate) + 1;

// One thing that was wrong with a file, and what was done about it. Words are made last, for a reader.
//
// Holds: line counts from 1; 0 means the file as a whole. Texts are valid UTF-8 without line ends.
struct Diagnostic {
    std::string file;
    std::uint32_t line = 0;
    Severity severity = Severity::note;
    DiagnosticKind kind = DiagnosticKind::notALine;
    DiagnosticPhrase what;
    std::vector<DiagnosticPhrase> done;
    std::string quoted;  // of the file, short and fit to print; empty where nothing is quoted
};

// "level jumps from 1 to 4 (NAME)", in the language of a code such as "de"; English for others.
std::string whatText(const Diagnostic& diagnostic, std::string_view language = "en");

// "read as level 2"
std::string doneText(const Diagnostic& diagnostic, std::string_view language = "en");

// "royal.ged:12: warning: level jumps from 1 to 4; read as level 2"
std::string formatDiagnostic(const Diagnostic& diagnostic, std::string_view language = "en");

// "missingHeader" and so on: the name of the kind, for other programs.
const char* kindName(DiagnosticKind kind);

// "note", "warning", "error"
const char* severityName(Severity severity);

}  // namespace olvane::gedcom
