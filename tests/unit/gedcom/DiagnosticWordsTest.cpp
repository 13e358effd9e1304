// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What diagnostics say, in every language: no sentence is missing, and none leaves out what another one names.

#include <algorithm>
#include <set>
#include <string>

#include <gtest/gtest.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

constexpr const char* kLanguages[] = {"en", "de", "es"};

DiagnosticSentence sentenceAt(std::size_t place) {
    return static_cast<DiagnosticSentence>(place);
}

// Which of two arguments a sentence quotes. Kinds are named by their words.
std::string argumentsIn(DiagnosticSentence sentence, const std::string& language) {
    std::string found;
    const std::string text = phraseText({sentence, {"<1>", "<2>", "<3>"}}, language);
    for (const char* const argument : {"<1>", "<2>", "<3>"}) {
        if (text.find(argument) != std::string::npos) found += argument;
    }
    return found;
}

TEST(DiagnosticWords, everyLanguageHasEverySentenceWithTheSameArguments) {
    for (std::size_t i = 0; i < kDiagnosticSentences; ++i) {
        const DiagnosticSentence sentence = sentenceAt(i);
        for (const std::string language : kLanguages) {
            const std::string text = phraseText({sentence}, language);
            const bool isKindAlone = sentence == DiagnosticSentence::oneOfKind;
            EXPECT_EQ(text.empty(), isKindAlone) << sentenceName(sentence) << " in " << language;
            EXPECT_EQ(text.find('{'), std::string::npos) << text;
            EXPECT_EQ(argumentsIn(sentence, language), argumentsIn(sentence, "en")) << sentenceName(sentence);
            const bool hasWords =
                std::any_of(text.begin(), text.end(), [](char c) { return c >= 'a' && c <= 'z'; });
            if (language != "en" && hasWords) {
                EXPECT_NE(text, phraseText({sentence}, "en")) << "still English in " << language;
            }
        }
    }
}

TEST(DiagnosticWords, everyKindHasANameInEveryLanguage) {
    for (std::size_t i = 0; i < kDiagnosticKinds; ++i) {
        const std::string name = kindName(static_cast<DiagnosticKind>(i));
        std::set<std::string> names;
        for (const std::string language : kLanguages)
            names.insert(phraseText({DiagnosticSentence::oneOfKind, {name}}, language));
        EXPECT_EQ(names.size(), 3U) << name;
        EXPECT_EQ(names.count(name), 0U) << name;
        EXPECT_EQ(names.count(""), 0U) << name;
    }
}

TEST(DiagnosticWords, sentencesHaveNamesOfTheirOwn) {
    for (std::size_t i = 0; i < kDiagnosticSentences; ++i)
        EXPECT_EQ(sentenceOfName(sentenceName(sentenceAt(i))), sentenceAt(i));
    EXPECT_EQ(sentenceOfName("nothing of the kind"), std::nullopt);
}

TEST(DiagnosticWords, aLanguageThatNobodyHasIsEnglish) {
    const DiagnosticPhrase phrase{DiagnosticSentence::jumpingLevel, {"1", "4"}};
    EXPECT_EQ(phraseText(phrase, "fr"), "level jumps from 1 to 4");
    EXPECT_EQ(phraseText(phrase, ""), "level jumps from 1 to 4");
    EXPECT_EQ(phraseText(phrase, "de-AT"), "die Ebene springt von 1 auf 4");
}

TEST(DiagnosticWords, argumentsAreKeptApartFromWords) {
    const GedcomData data = read("0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n4 NAME A\n0 TRLR\n");
    ASSERT_EQ(data.diagnostics().size(), 1U);
    const Diagnostic& diagnostic = data.diagnostics()[0];
    EXPECT_EQ(diagnostic.what.sentence, DiagnosticSentence::jumpingLevel);
    EXPECT_EQ(diagnostic.what.arguments, (std::vector<std::string>{"0", "4"}));
    EXPECT_EQ(diagnostic.quoted, "NAME");
    EXPECT_EQ(formatDiagnostic(diagnostic, "de"),
              "test.ged:4: warning: die Ebene springt von 0 auf 4 (NAME); gelesen als eine Ebene unter der "
              "Zeile davor");
}

}  // namespace
}  // namespace olvane::gedcom::test
