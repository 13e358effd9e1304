// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates, lives and places in words: the rows that the module for JavaScript is tried with as well, and that no language lacks
// a word.

#include <algorithm>
#include <cstddef>
#include <fstream>
#include <string>
#include <string_view>
#include <tuple>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include <olvane/gedcom/DateLanguageInternal.h>
#include <olvane/gedcom/DateText.h>
#include <olvane/gedcom/LifeOrder.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

using nlohmann::json;

const json& rows() {
    static const json kRows = json::parse(std::ifstream(OLVANE_FIXTURES "/dates.json"));
    return kRows;
}

TEST(DateText, datesHaveTheWordsOfTheRows) {
    for (const json& row : rows()["dates"]) {
        const std::string written = row["written"];
        for (const DateLanguage& language : kAllDateLanguages)
            EXPECT_EQ(dateText(parseGedcomDate(written), language.code), row[std::string(language.code)]);
    }
}

TEST(DateText, livesHaveTheWordsOfTheRows) {
    for (const json& row : rows()["lives"]) {
        const std::string birth = row["birth"];
        const std::string death = row["death"];
        for (const DateLanguage& language : kAllDateLanguages) {
            const std::string code(language.code);
            const GedcomDate born = parseGedcomDate(birth);
            const GedcomDate died = parseGedcomDate(death);
            EXPECT_EQ(yearsText(born, died, code), row["years"][code]);
            EXPECT_EQ(lifeText(born, died, code), row["life"][code]);
        }
    }
}

TEST(DateText, placesAreThoseOfTheRows) {
    for (const json& row : rows()["places"])
        EXPECT_EQ(placeText(row["written"].get<std::string>()), row["shown"]);
}

TEST(DateText, aLanguageThatNobodyHasIsEnglish) {
    const GedcomDate date = parseGedcomDate("12 MAR 1809");
    EXPECT_EQ(dateText(date, "fr"), "12 Mar 1809");
    EXPECT_EQ(dateText(date, ""), "12 Mar 1809");
    EXPECT_EQ(dateText(date, "de-AT"), "12. März 1809");
    EXPECT_EQ(displayYear(parseGedcomDate("ABT 44 BC"), "de"), "~44 v. Chr.");
}

// A date of a file may be of any length and of any bytes; it stays as it is.
TEST(DateText, whatCannotBeReadStaysAsWritten) {
    const std::string longDate = "(" + std::string(200000, 'x') + ")";
    EXPECT_EQ(dateText(parseGedcomDate(longDate)), longDate);
    EXPECT_EQ(dateText(parseGedcomDate("1809 " + longDate)), "1809 " + longDate);
    EXPECT_EQ(dateText(parseGedcomDate("")), "");
}

// The words of a list that must have that many, and one behind them, which is none.
std::vector<std::string_view> listed(std::string_view list, std::size_t count) {
    std::vector<std::string_view> words;
    for (std::size_t i = 0; i < count; ++i) words.push_back(wordIn(list, i));
    EXPECT_EQ(std::count(list.begin(), list.end(), '|'), static_cast<std::ptrdiff_t>(count) - 1) << list;
    return words;
}

TEST(DateText, noLanguageLacksAWordOrIsStillEnglish) {
    constexpr std::size_t kJoins = 2;
    const DateLanguage& english = kAllDateLanguages.front();
    for (const DateLanguage& language : kAllDateLanguages) {
        SCOPED_TRACE(language.code);
        for (const auto& [list, count] : {std::pair<std::string_view, std::size_t>{language.months, 12},
                                          {language.frenchMonths, 13},
                                          {language.hebrewMonths, 13}}) {
            for (const std::string_view word : listed(list, count)) EXPECT_NE(word, "");
        }
        for (const std::string_view word : {language.behindDay, language.beforeChrist, language.julian,
                                            language.frenchYear, language.born, language.died})
            EXPECT_NE(word, "");
        const bool isEnglish = &language == &english;
        for (const auto& [list, inEnglish, count] :
             {std::tuple{language.beforeDay, english.beforeDay, kDateForms},
              std::tuple{language.beforeOther, english.beforeOther, kDateForms},
              std::tuple{language.joinsDay, english.joinsDay, kJoins},
              std::tuple{language.joinsOther, english.joinsOther, kJoins}}) {
            const auto words = listed(list, count);
            const auto englishWords = listed(inEnglish, count);
            for (std::size_t i = 0; i < count; ++i) {
                EXPECT_EQ(words[i].empty(), englishWords[i].empty()) << i;
                EXPECT_TRUE(isEnglish || words[i].empty() || words[i] != englishWords[i]) << words[i];
            }
        }
        if (isEnglish) continue;
        EXPECT_NE(language.beforeChrist, english.beforeChrist);
        EXPECT_NE(language.julian, english.julian);
        EXPECT_NE(language.frenchYear, english.frenchYear);
        EXPECT_NE(language.born, english.born);
        EXPECT_NE(language.died, english.died);
    }
}

TEST(LifeOrder, factsStandInTheOrderOfALife) {
    std::string text = "0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n";
    for (const json& fact : rows()["order"]["facts"]) {
        text += "1 " + fact[0].get<std::string>() + "\n";
        if (fact[1] != "") text += "2 DATE " + fact[1].get<std::string>() + "\n";
    }
    ReadOptions options;
    options.facts = true;
    const GedcomData data = readGedcomBytes(text + "0 TRLR\n", "order.ged", options);
    json lived = json::array();
    for (const Fact* fact : inLifeOrder(data.factsOfPerson(1)))
        lived.push_back({fact->tag, fact->date.written});
    EXPECT_EQ(lived, rows()["order"]["lived"]);
}

}  // namespace
}  // namespace olvane::gedcom::test
