// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/TerminalText.h>

#include <string>
#include <vector>

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

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

// A text in parts of that many bytes each, and how long the longest piece was that came out.
std::string inPieces(int descriptor, std::string_view text, std::size_t bytes, std::size_t& longest) {
    std::string all;
    TextPieces pieces(descriptor, [&](std::string_view piece) {
        longest = std::max(longest, piece.size());
        all += piece;
    });
    for (; !text.empty(); text.remove_prefix(std::min(bytes, text.size()))) pieces.add(text.substr(0, bytes));
    pieces.finish();
    return all;
}

std::string longText() {
    std::string text;
    while (text.size() < 300'000) text += "a\xE2\x80\xAE\xC2\x9B\xF0\x9F\x91\xB6\x1b\xE5\xB0\x8F";
    return text + "\xE2\x80";
}

// The leading side of a new terminal is a terminal itself.
TEST(TextPieces, areForATerminalTheVisibleTextWhereverTheyAreCut) {
    const int terminal = ::open("/dev/ptmx", O_RDWR | O_NOCTTY | O_CLOEXEC);
    if (terminal < 0) GTEST_SKIP() << "no terminal can be opened";
    const std::string text = longText();
    for (const std::size_t bytes : {1U, 2U, 3U, 7U, 65'535U, 65'536U, 1'000'000U}) {
        std::size_t longest = 0;
        EXPECT_EQ(inPieces(terminal, text, bytes, longest), visibleText(text)) << bytes;
        EXPECT_LT(longest, text.size()) << bytes;
    }
    ::close(terminal);
}

TEST(TextPieces, areTheTextItselfForAFile) {
    const int file = ::open("/dev/null", O_RDWR | O_CLOEXEC);
    ASSERT_GE(file, 0);
    const std::string text = longText();
    for (const std::size_t bytes : {1U, 1000U, 1'000'000U}) {
        std::size_t longest = 0;
        EXPECT_EQ(inPieces(file, text, bytes, longest), text) << bytes;
        EXPECT_LT(longest, text.size()) << bytes;
    }
    ::close(file);
}

}  // namespace
}  // namespace olvane::cli
