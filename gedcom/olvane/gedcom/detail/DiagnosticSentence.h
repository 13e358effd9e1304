// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace olvane::gedcom {

// What a diagnostic says, without words: these are in words/DiagnosticWords.cpp, for each language.
enum class DiagnosticSentence : std::uint8_t {
    // what was wrong
    archiveWithoutGedcomFile,
    noLevelAndTag,
    badlyWrittenLevel,
    jumpingLevel,
    identifierWithoutEnd,
    identifierInUse,
    onePersonTwice,
    onePersonMore,
    thirdPartner,
    noSuchRecord,
    noPerson,
    noFamily,
    pointerWithoutEnd,
    linkWithoutPointer,
    noHeader,
    noTrailer,
    recordBehindTrailer,
    dateNotRead,
    dayOrMonth,
    halfCharacter,
    encodingNotKnown,
    otherThanNamed,
    unlikeNamed,
    systemNamed,
    noneNamed,
    otherThanChosen,
    faultsInUtf8,
    faultsInText,
    faultsInValue,
    controlCharacters,
    marriageOfOthers,
    marriageNotReturned,
    partnerNotReturned,
    childOfOthers,
    childNotReturned,
    parentsNotReturned,
    manAsWife,
    womanAsHusband,
    oneOfKind,
    firstOfKind,
    moreOfKind,
    // what was done about it
    skipped,
    leftOut,
    otherMemberRead,
    asWritten,
    notListed,
    noOwnSpouse,
    withoutChildren,
    childrenOfAll,
    bothKept,
    yearAlone,
    asHusband,
    asWife,
    asLastChild,
    asIfItHad,
    asIfItDid,
    upToSpace,
    asLevel,
    asOneBelow,
    asOwnRecord,
    withoutIt,
    asFarAsItGoes,
    likeOthers,
    asWellAsCanBe,
    maybeOtherEncoding,
    asEncoding,
    looksLike,
    chooseFarEncoding,
    chooseNearEncoding,
    listedBelow,
};

constexpr std::size_t kDiagnosticSentences = static_cast<std::size_t>(DiagnosticSentence::listedBelow) + 1;

// A sentence, and what stands in its places, in order: numbers, names of encodings, or the name of a kind.
struct DiagnosticPhrase {
    DiagnosticPhrase(DiagnosticSentence sentenceIn, std::vector<std::string> argumentsIn = {})
        : sentence(sentenceIn), arguments(std::move(argumentsIn)) {}

    DiagnosticSentence sentence;
    std::vector<std::string> arguments;
};

// "jumpingLevel" and so on, for programs.
std::string_view sentenceName(DiagnosticSentence sentence);
// Empty for a name that no sentence has.
std::optional<DiagnosticSentence> sentenceOfName(std::string_view name);

// In the language of a code such as "de" or "es-MX"; English for others.
std::string phraseText(const DiagnosticPhrase& phrase, std::string_view language = "en");

}  // namespace olvane::gedcom
