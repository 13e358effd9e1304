// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <cli/Commands.h>

namespace CLI {
class App;
}

namespace olvane::cli {

// Options that several commands have, by the same names and with the same help.

// --encoding
void addEncoding(CLI::App& command, InputOptions& input);

// FILE, and --encoding
void addFile(CLI::App& command, InputOptions& input);

// --focus, which must be given
void addFocus(CLI::App& command, std::string& focus);

// --format of a list
void addListFormat(CLI::App& command, ListFormat& format, const char* help);

// --hide-living and --year; `further` completes the help on what is hidden.
void addHideLiving(CLI::App& command, HidingOptions& hiding, const std::string& further = "");

// Whether the command has the option and was given it.
bool isGiven(const CLI::App& command, const char* option);

}  // namespace olvane::cli
