// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <CLI/CLI.hpp>

namespace olvane::cli {

// How --help is set: names on the left, and beside them what they mean, in lines that are no longer than a usual
// terminal is wide. A switch that turns something off is printed by its name alone, without the value that it stands for.
class HelpFormat : public CLI::Formatter {
public:
    HelpFormat();

    std::string make_option_name(const CLI::Option* option, bool isPositional) const override;
    std::string make_option_desc(const CLI::Option* option) const override;
};

// A text in lines of at most `width` bytes, broken at spaces. A word that is longer stands in a line of its own.
std::string wrappedText(const std::string& text, std::size_t width);

}  // namespace olvane::cli
