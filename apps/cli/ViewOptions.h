// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <cli/LayoutRun.h>

namespace CLI {
class App;
}

namespace olvane::cli {

// The options that choose a view and what it shows, by the same names in every command that lays out.

// Everything: the view, its own options, and the form of the boxes. boxDefaults completes the help on the boxes.
void addViewOptions(CLI::App& command, LayoutRequest& request, const std::string& boxDefaults);

// Of them, those that a page opens with, and their names.
void addPageViewOptions(CLI::App& command, LayoutRequest& request);
std::vector<std::string> pageViewOptionNames();

// What was given to a page, completed, as the part of the page's address that names no person.
std::string pageAddressOf(const CLI::App& command, const LayoutRequest& request);

// What was given, checked and completed; to be called once behind the parsing.
// Fails: throws UsageError for an option that changes nothing in the view, and for one that the view needs.
void completeViewOptions(const CLI::App& command, LayoutRequest& request);

}  // namespace olvane::cli
