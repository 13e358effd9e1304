// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/HelpFormat.h>

#include <algorithm>

namespace olvane::cli {

namespace {

constexpr std::size_t kNames = 34;         // columns
constexpr std::size_t kExplanations = 66;  // columns: with the names, 100

}  // namespace

HelpFormat::HelpFormat() {
    column_width(kNames);
}

std::string HelpFormat::make_option_name(const CLI::Option* option, bool isPositional) const {
    std::string name = CLI::Formatter::make_option_name(option, isPositional);
    const std::size_t value = name.find("{false}");
    return value == std::string::npos ? name : name.erase(value);
}

std::string HelpFormat::make_option_desc(const CLI::Option* option) const {
    return wrappedText(CLI::Formatter::make_option_desc(option), kExplanations);
}

std::string wrappedText(const std::string& text, std::size_t width) {
    std::string lines;
    std::size_t lineStart = 0;  // in lines
    std::size_t wordStart = 0;  // in text
    while (wordStart < text.size()) {
        const std::size_t wordEnd = std::min(text.find(' ', wordStart), text.size());
        const std::size_t length = wordEnd - wordStart;
        if (lines.size() > lineStart) {
            const bool fits = lines.size() - lineStart + 1 + length <= width;
            lines += fits ? ' ' : '\n';
            if (!fits) lineStart = lines.size();
        }
        lines.append(text, wordStart, length);
        wordStart = wordEnd + 1;
    }
    return lines;
}

}  // namespace olvane::cli
