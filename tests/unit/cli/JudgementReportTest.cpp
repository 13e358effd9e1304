// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/JudgementReport.h>

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <cstddef>
#include <set>
#include <string>

namespace olvane::cli {
namespace {

using picture::FindingKind;
using picture::Judgement;

TEST(JudgementReport, whatCanBeMisreadIsTrouble) {
    EXPECT_FALSE(hasTrouble(Judgement()));
    for (std::size_t Judgement::*const count :
         {&Judgement::overlaps, &Judgement::hits, &Judgement::tracks, &Judgement::touches,
          &Judgement::unjoined, &Judgement::unmarked}) {
        Judgement judgement;
        judgement.*count = 1;
        EXPECT_TRUE(hasTrouble(judgement));
    }
    Judgement judgement;
    judgement.untold = 0;
    EXPECT_FALSE(hasTrouble(judgement));
    judgement.untold = 1;
    EXPECT_TRUE(hasTrouble(judgement));
}

TEST(JudgementReport, whatIsOnlyHardToFollowIsNone) {
    Judgement judgement;
    judgement.crossings = 3;
    judgement.slanted = 2;
    judgement.repeats = 1;
    judgement.couples = 4;
    EXPECT_FALSE(hasTrouble(judgement));
}

TEST(JudgementReport, aCountThatWasNotMadeIsLeftOut) {
    const JudgedPicture judged{"a.json", "near", Judgement(), {{FindingKind::hit, 2, 5}}};
    const std::string table = judgementsTable({judged});
    EXPECT_EQ(table.substr(0, 9), "file\tview");
    EXPECT_NE(table.find("\na.json\tnear\t"), std::string::npos);
    EXPECT_NE(judgementsText({judged}).find("untold                    -"), std::string::npos);
    const auto json = nlohmann::json::parse(judgementsJson({judged}))["pictures"][0];
    EXPECT_FALSE(json["counts"].contains("untold"));
    EXPECT_EQ(json["counts"]["hits"], 0);
    EXPECT_EQ(json["findings"][0]["kind"], "hit");
    EXPECT_FALSE(json["trouble"]);
}

TEST(JudgementReport, everyFindingHasANameOfItsOwn) {
    std::set<std::string> names;
    for (const FindingKind kind : {FindingKind::overlap, FindingKind::hit, FindingKind::crossing,
                                   FindingKind::track, FindingKind::touch, FindingKind::unjoined}) {
        EXPECT_TRUE(names.insert(findingName(kind)).second) << findingName(kind);
    }
}

}  // namespace
}  // namespace olvane::cli
