// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/FocusChoice.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/UsageError.h>

namespace olvane::cli {
namespace {

using testing::HasSubstr;

class FocusChoice : public testing::Test {
protected:
    gedcom::GedcomData data = gedcom::readGedcomBytes(
        "0 HEAD\n1 CHAR UTF-8\n0 @I7@ INDI\n1 NAME Ada /Lund/\n1 BIRT\n2 DATE 1801\n"
        "0 @I1@ INDI\n1 NAME Ada /Berg/\n0 @P3@ INDI\n1 NAME Olga /Berg/\n0 TRLR\n",
        "a.ged");

    std::string refusalOf(const std::string& who) const {
        try {
            chooseFocus(data, who);
        } catch (const UsageError& error) {
            return error.what();
        }
        return "";
    }
};

TEST_F(FocusChoice, takesAnXrefWithAndWithoutItsSigns) {
    EXPECT_EQ(chooseFocus(data, "I7"), 1U);
    EXPECT_EQ(chooseFocus(data, "@I1@"), 2U);
}

TEST_F(FocusChoice, takesANumberAndWordsOfOneName) {
    EXPECT_EQ(chooseFocus(data, "3"), 3U);
    EXPECT_EQ(chooseFocus(data, "lund ada"), 1U);
}

TEST_F(FocusChoice, listsTheCandidatesOfANameThatSeveralHave) {
    EXPECT_THAT(refusalOf("Ada"), testing::AllOf(HasSubstr("@I7@"), HasSubstr("@I1@")));
    EXPECT_THAT(refusalOf("Ada"), testing::Not(HasSubstr("@P3@")));
    EXPECT_THAT(refusalOf("Nobody"), HasSubstr("no person is called 'Nobody'"));
}

TEST_F(FocusChoice, writesAPersonOnOneLine) {
    EXPECT_EQ(personLine(data, 1), "1\t@I7@\tAda Lund\t* 1801");
}

}  // namespace
}  // namespace olvane::cli
