// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/OptionChecks.h>

#include <algorithm>
#include <charconv>
#include <sstream>
#include <utility>

namespace olvane::cli {

namespace {

std::string textOf(double value) {
    std::ostringstream text;
    text << value;
    return text.str();
}

template <class Number>
bool reads(const std::string& text, Number& value) {
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    return error == std::errc() && end == text.data() + text.size();
}

}  // namespace

std::string noneOf(const std::string& text, const std::vector<std::string>& words) {
    if (words.size() == 2) return "'" + text + "' is neither " + words[0] + " nor " + words[1];
    std::string message = "'" + text + "' is none of ";
    for (std::size_t i = 0; i < words.size(); ++i) {
        if (i > 0) message += i + 1 == words.size() ? " and " : ", ";
        message += words[i];
    }
    return message;
}

CLI::Validator word(std::vector<std::string> words) {
    return CLI::Validator(
        [words = std::move(words)](const std::string& text) {
            const bool isOne = std::find(words.begin(), words.end(), text) != words.end();
            return isOne ? std::string() : noneOf(text, words);
        },
        "");
}

CLI::Validator wholeNumber(int least, int most) {
    return CLI::Validator(
        [least, most](const std::string& text) {
            int value = 0;
            if (reads(text, value) && value >= least && value <= most) return std::string();
            const std::string range = most == std::numeric_limits<int>::max()
                                          ? "of " + std::to_string(least) + " or more"
                                          : "from " + std::to_string(least) + " to " + std::to_string(most);
            return "'" + text + "' is no whole number " + range;
        },
        "");
}

CLI::Validator number(double least, double most) {
    return CLI::Validator(
        [least, most](const std::string& text) {
            double value = 0;
            if (reads(text, value) && value >= least && value <= most) return std::string();
            return "'" + text + "' is no number from " + textOf(least) + " to " + textOf(most);
        },
        "");
}

}  // namespace olvane::cli
