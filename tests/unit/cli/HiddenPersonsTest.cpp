// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/HiddenPersons.h>

#include <cstdlib>

#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/SourceDate.h>
#include <cli/UsageError.h>

namespace olvane::cli {
namespace {

class SourceDate : public ::testing::Test {
protected:
    void TearDown() override { ::unsetenv("SOURCE_DATE_EPOCH"); }
    static void set(const char* text) { ::setenv("SOURCE_DATE_EPOCH", text, 1); }
};

TEST_F(SourceDate, isThatOfTheEnvironment) {
    EXPECT_FALSE(sourceDate());
    set("");
    EXPECT_FALSE(sourceDate());
    set("1000000000");
    EXPECT_EQ(sourceDate()->time_since_epoch().count(), 1000000000);
}

TEST_F(SourceDate, isRefusedWhereItIsNoTime) {
    for (const char* text : {"today", "-1", "1e9", "12 ", "253402300800", "99999999999999999999"}) {
        set(text);
        EXPECT_THROW(sourceDate(), UsageError) << text;
    }
}

// A later year would take more persons for dead.
TEST_F(SourceDate, bringsThePresentYearForwardNever) {
    const int byTheClock = presentYear();
    EXPECT_GE(byTheClock, 2024);
    set("0");
    EXPECT_EQ(presentYear(), 1970);
    set("253402300799");
    EXPECT_EQ(presentYear(), byTheClock);
}

TEST(HiddenPersons, areNoneUnlessAskedFor) {
    const auto data = gedcom::readGedcomBytes(
        "0 HEAD\n0 @I1@ INDI\n1 BIRT\n2 DATE 1990\n0 @I2@ INDI\n1 BIRT\n2 DATE 1790\n0 TRLR\n", "a.ged");
    EXPECT_TRUE(hiddenPersons(data, {false, 2020}).empty());
    EXPECT_EQ(hiddenPersons(data, {true, 2020}), (std::vector<bool>{true, false}));
    EXPECT_EQ(hiddenPersons(data, {true, 2200}), (std::vector<bool>{false, false}));
}

}  // namespace
}  // namespace olvane::cli
