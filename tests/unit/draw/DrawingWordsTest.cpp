// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What pictures say in every language: no phrase is missing, and none leaves an argument out.

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>

#include <olvane/charts/Charts.h>
#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/Sheets.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/kin/KinGraph.h>

namespace olvane::draw {
namespace {

using kin::Language;

std::size_t argumentsIn(std::string_view words) {
    return static_cast<std::size_t>(std::count(words.begin(), words.end(), '{'));
}

TEST(DrawingWords, everyLanguageHasEveryPhraseWithTheSameArguments) {
    for (std::size_t i = 0; i < kPhrases; ++i) {
        const auto phrase = static_cast<Phrase>(i);
        const std::string_view english = wordsOf(phrase, Language::english);
        for (const Language language : kin::kLanguages) {
            const std::string_view words = wordsOf(phrase, language);
            EXPECT_FALSE(words.empty()) << english << " in " << languageCode(language);
            EXPECT_EQ(argumentsIn(words), argumentsIn(english)) << words;
            EXPECT_EQ(words.front() == ' ', english.front() == ' ') << words;
            if (language != Language::english) {
                EXPECT_NE(words, english) << languageCode(language);
            }
        }
    }
}

TEST(DrawingWords, argumentsStandInTheirPlaces) {
    EXPECT_EQ(phraseWith(Phrase::inBoxes, Language::english, {"3", "7"}), "Stands in 3 boxes, all marked 7");
    EXPECT_EQ(phraseWith(Phrase::sheet, Language::german, {"1", "6", "1", "2", "1", "3"}),
              "Blatt 1 von 6: Zeile 1 von 2, Spalte 1 von 3");
}

TEST(DrawingWords, viewsHaveNamesOfTheirOwnInEveryLanguage) {
    for (const Language language : kin::kLanguages) {
        std::set<std::string> titles;
        for (const char* view : {"family", "pedigree", "near", "ancestors", "descendants", "hourglass",
                                 "relatives", "fan", "kinship", "everybody"}) {
            const std::string title = viewTitle(view, language);
            EXPECT_NE(title, view);
            titles.insert(title);
        }
        EXPECT_EQ(titles.size(), 10U);
    }
    EXPECT_EQ(viewTitle("of my own", Language::german), "of my own");
}

// 1 and 2, divorced, have 3 and 4; 3 has 5 with nobody known. Around 3, with the ancestors of 3 folded.
DrawingContent content(bool folded) {
    kin::KinGraphBuilder builder;
    for (std::int64_t id = 1; id <= 5; ++id)
        builder.addPerson(id, id % 2 == 0 ? kin::Sex::female : kin::Sex::male);
    const kin::UnionPlace parents = builder.addUnion(0, 1, kin::UnionState::divorced);
    builder.addChild(parents, 2, kin::ChildKind::birth);
    builder.addChild(parents, 3, kin::ChildKind::adopted);
    const kin::UnionPlace own = builder.addUnion(2, kin::kNobody, kin::UnionState::unknown);
    builder.addChild(own, 4, kin::ChildKind::birth);
    const kin::KinGraph graph = builder.build();
    charts::ChartRequest request;
    request.view = charts::View::hourglass;
    request.focus = 2;
    const charts::Fold fold{3, picture::Branch::up};
    if (folded) request.folded = {&fold, 1};
    DrawingContent content;
    content.picture = charts::chartOf(graph, request);
    content.labelOf = [](std::int64_t id) {
        kin::PersonLabel label;
        if (id != 5) label.given = "P" + std::to_string(id);
        label.living = id == 1;
        return label;
    };
    content.countsHidden = true;
    return content;
}

std::string drawnIn(Language language, bool folded = false) {
    const DrawingContent drawn = content(folded);
    DrawingOptions options;
    options.language = language;
    options.title = titleOf("hourglass", drawn, language);
    return drawSvg(drawn, options).svg;
}

TEST(DrawingWords, aPictureSpeaksTheLanguageThatIsAskedFor) {
    const std::string german = drawnIn(Language::german);
    for (const char* said : {"Sanduhr: P3", "P3 (Mittelpunkt dieses Bildes)", ">Lebt<", "Name unbekannt",
                             "Legende", "geschieden", "Nicht gezeigt: 1 Kind"}) {
        EXPECT_NE(german.find(said), std::string::npos) << said;
    }
    for (const char* english : {"focus", "Living", "not known", "Legend<", "divorced", "Not shown"}) {
        EXPECT_EQ(german.find(english), std::string::npos) << english;
    }
    EXPECT_NE(drawnIn(Language::english).find("Hourglass of P3"), std::string::npos);
    EXPECT_NE(drawnIn(Language::spanish).find("divorciados"), std::string::npos);
}

TEST(DrawingWords, foldedBranchesAreNamedInEveryLanguage) {
    EXPECT_NE(drawnIn(Language::english, true).find("Folded ancestors: 2"), std::string::npos);
    EXPECT_NE(drawnIn(Language::german, true).find("Eingeklappte Vorfahren: 2"), std::string::npos);
    EXPECT_NE(drawnIn(Language::spanish, true).find("Antepasados plegados: 2"), std::string::npos);
}

TEST(DrawingWords, sheetsSayTheirPlaceInEveryLanguage) {
    const DrawingContent drawn = content(false);
    SheetRequest request;
    request.paper = {60, 60, false};
    request.scale = 0.3;
    const SheetDrawing drawing =
        drawSheets(drawSvg(drawn, DrawingOptions()), request, "P", Language::spanish);
    ASSERT_GT(drawing.sheets.size(), 1U);
    const std::string& first = drawing.sheets.front().svg;
    EXPECT_NE(first.find("hoja 1 de "), std::string::npos);
    EXPECT_NE(first.find("a la hoja "), std::string::npos);
    EXPECT_NE(first.find("Mapa de las hojas"), std::string::npos);
    EXPECT_EQ(first.find("sheet"), std::string::npos);
}

}  // namespace
}  // namespace olvane::draw
