// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/HelpFormat.h>

#include <algorithm>
#include <memory>
#include <sstream>
#include <string>

#include <gtest/gtest.h>

namespace olvane::cli {
namespace {

TEST(Help, breaksTextAtSpacesIntoLinesOfAWidth) {
    EXPECT_EQ(wrappedText("one two three", 7), "one two\nthree");
    EXPECT_EQ(wrappedText("one two three", 6), "one\ntwo\nthree");
    EXPECT_EQ(wrappedText("one two three", 13), "one two three");
    EXPECT_EQ(wrappedText("", 5), "");
}

TEST(Help, leavesAWordThatIsTooLongWhole) {
    EXPECT_EQ(wrappedText("a incomprehensible b", 5), "a\nincomprehensible\nb");
}

TEST(Help, namesASwitchThatTurnsOffWithoutItsValue) {
    CLI::App app;
    bool shown = true;
    const CLI::Option* option = app.add_flag("!--no-cousins", shown, "Leave out cousins");
    EXPECT_EQ(HelpFormat().make_option_name(option, false), "--no-cousins");
}

TEST(Help, standsInHundredColumns) {
    CLI::App app;
    app.formatter(std::make_shared<HelpFormat>());
    std::string value;
    std::string text;
    for (int i = 0; i < 60; ++i) text += "word ";
    app.add_option("--text", value, text);
    std::istringstream help(app.help());
    std::size_t longest = 0;
    for (std::string line; std::getline(help, line);) longest = std::max(longest, line.size());
    EXPECT_EQ(longest, 98u);  // 34 and 13 words of 4 letters with 12 spaces
}

}  // namespace
}  // namespace olvane::cli
