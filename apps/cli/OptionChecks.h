// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <limits>
#include <map>
#include <string>
#include <vector>

#include <CLI/CLI.hpp>

namespace olvane::cli {

// What an option accepts. Anything else is refused by a sentence that says what is accepted; the help states it by the
// option's type_name and description alone.

// "'foo' is none of a, b and c".
std::string noneOf(const std::string& text, const std::vector<std::string>& words);

// One of a few words, which stands for a value.
template <class Value>
CLI::Validator choice(const std::map<std::string, Value>& values) {
    const CLI::CheckedTransformer transform(values);
    return CLI::Validator(
        [values, transform](std::string& text) {
            if (values.contains(text)) return transform(text);
            std::vector<std::string> words;
            words.reserve(values.size());
            for (const auto& [word, value] : values) words.push_back(word);
            return noneOf(text, words);
        },
        "");
}

// One of a few words, kept as it is.
CLI::Validator word(std::vector<std::string> words);

// A whole number from the least to the most; those that are just the limits of an int are not stated.
CLI::Validator wholeNumber(int least, int most = std::numeric_limits<int>::max());

// A number from the least to the most.
CLI::Validator number(double least, double most);

}  // namespace olvane::cli
