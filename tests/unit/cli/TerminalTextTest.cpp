// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/TerminalText.h>

#include <gtest/gtest.h>

namespace olvane::cli {
namespace {

TEST(TerminalText, writesOutWhatWouldCommandATerminal) {
    EXPECT_EQ(visibleText("\x1b[2J\x07\r\x7f"), "\\u001B[2J\\u0007\\u000D\\u007F");
    EXPECT_EQ(visibleText("\xC2\x9B"
                          "31m\xC2\x85"),
              "\\u009B31m\\u0085");
}

TEST(TerminalText, writesOutWhatWouldReorderOrBreakALine) {
    EXPECT_EQ(visibleText("a\xE2\x80\xAE"
                          "b\xE2\x80\xA8"
                          "c\xE2\x80\xA9"),
              "a\\u202Eb\\u2028c\\u2029");
    EXPECT_EQ(visibleText("\xE2\x80\xAA\xE2\x80\xAB\xE2\x80\xAC\xE2\x80\xAD"),
              "\\u202A\\u202B\\u202C\\u202D");
    EXPECT_EQ(visibleText("\xE2\x81\xA6\xE2\x81\xA7\xE2\x81\xA8\xE2\x81\xA9"),
              "\\u2066\\u2067\\u2068\\u2069");
}

TEST(TerminalText, leavesEveryOtherText) {
    for (const char* text : {"", "a\tb\n", "\xC3\xA9 \xD7\x90 \xE5\xB0\x8F \xF0\x9F\x91\xB6",
                             "\xE2\x80\x8F\xE2\x80\x93", "\xE2\x80", "\xC2", "\xFF\x80"}) {
        EXPECT_EQ(visibleText(text), text);
    }
}

}  // namespace
}  // namespace olvane::cli
