// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The compact form of families that the tests speak in, checked against the long form of a case.

#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

#include <support/FamilyText.h>

namespace {

using support::family;
using support::formatCase;
using support::parseCase;

void expectCase(const std::string& compact, const std::string& directives) {
    EXPECT_EQ(formatCase(parseCase(directives)), formatCase(family(compact))) << compact;
}

TEST(FamilyText, coupleWithChildrenStatesBothSidesOfEveryTie) {
    expectCase("17+42: 5 6f",
               "focus 17\nspouses 17 42\nspouses 42 17\nsex 42 1\nsex 6 1\nchildren 17 5 6\nchildren 42 5 6\n"
               "father 5 17\nmother 5 42\nfather 6 17\nmother 6 42\n");
}

TEST(FamilyText, loneParentIsTheFatherUnlessMarkedAsAWoman) {
    expectCase("17: 5; 42f: 9",
               "focus 17\nsex 42 1\nchildren 17 5\nfather 5 17\nchildren 42 9\nmother 9 42\n");
}

TEST(FamilyText, coupleNamedTwiceIsListedTwice) {
    expectCase("17+42; 17+42", "focus 17\nsex 42 1\nspouses 17 42 42\nspouses 42 17 17\n");
}

TEST(FamilyText, malformedTextIsRefused) {
    for (const char* text : {"", "17+", "17 42", "17: 5,", "+42", "x"}) {
        EXPECT_THROW(family(text), std::invalid_argument) << text;
    }
}

}  // namespace
