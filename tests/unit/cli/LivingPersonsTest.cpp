// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Who is taken to be living.

#include <cli/LivingPersons.h>

#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/AgeLimits.h>

namespace olvane::cli {
namespace {

// "1" for each person who is taken to be living.
std::string livingIn(const std::string& records, int year) {
    const auto data = gedcom::readGedcomBytes(
        "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n" + records + "0 TRLR\n", "a.ged");
    std::string text;
    for (const bool living : livingPersons(data, year)) text += living ? '1' : '0';
    return text;
}

std::string born(const std::string& date) {
    return "0 INDI\n1 BIRT\n2 DATE " + date + "\n";
}

TEST(LivingPersons, areThoseBornWithinTheLongestLife) {
    const int year = 2020;
    EXPECT_EQ(livingIn(born(std::to_string(year - kLongestLife + 1)), year), "1");
    EXPECT_EQ(livingIn(born(std::to_string(year - kLongestLife)), year), "0");
}

TEST(LivingPersons, areNotThoseWithASignOfDeath) {
    for (const char* sign : {"1 DEAT Y\n", "1 DEAT\n2 DATE 2010\n", "1 BURI\n2 PLAC Bern\n"}) {
        EXPECT_EQ(livingIn(born("1990") + sign, 2020), "0") << sign;
    }
    EXPECT_EQ(livingIn(born("1990"), 2020), "1");
}

// By the latest year that a date may stand for.
TEST(LivingPersons, areJudgedInDoubtForTheirPrivacy) {
    EXPECT_EQ(livingIn(born("BET 1900 AND 1915"), 2020), "1");
    EXPECT_EQ(livingIn(born("BET 1900 AND 1910"), 2020), "0");
    EXPECT_EQ(livingIn(born("BEF 1910"), 2020), "0");
    EXPECT_EQ(livingIn(born("AFT 1915"), 2020), "1");
}

// A chain of children: the first was born in 1990, nobody else has dates.
TEST(LivingPersons, areThoseWithoutDatesWithinTwoStepsOfALivingOne) {
    const std::string chain =
        "0 @A@ INDI\n1 BIRT\n2 DATE 1990\n1 FAMC @F@\n0 @B@ INDI\n1 FAMS @F@\n1 FAMC @G@\n0 @C@ INDI\n1 FAMS "
        "@G@\n"
        "1 FAMC @H@\n0 @D@ INDI\n1 FAMS @H@\n0 @F@ FAM\n1 HUSB @B@\n1 CHIL @A@\n0 @G@ FAM\n1 HUSB @C@\n1 "
        "CHIL @B@\n"
        "0 @H@ FAM\n1 HUSB @D@\n1 CHIL @C@\n";
    EXPECT_EQ(livingIn(chain, 2020), "1110");
    EXPECT_EQ(livingIn(chain, 2200), "0000");
}

}  // namespace
}  // namespace olvane::cli
