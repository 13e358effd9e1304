// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What was given of the options of views. The table of options has the views that each changes; what would change nothing is
// refused, since it was meant to.

#include <cli/ViewOptions.h>

#include <algorithm>
#include <cstddef>
#include <string_view>
#include <vector>

#include <CLI/CLI.hpp>

#include <cli/CommonOptions.h>
#include <cli/FamilySwitches.h>
#include <cli/UsageError.h>
#include <olvane/charts/ViewOption.h>

namespace olvane::cli {

namespace {

constexpr int kMostPedigreeGenerations = 12;

// How the command calls an option of the table; what it takes and which views it changes is said there.
struct OptionName {
    const char* name;
    std::string_view option;
};

constexpr OptionName kOptionNames[] = {
    {"--up", "up"},
    {"--down", "down"},
    {"--direction", "direction"},
    {"--compact", "compact"},
    {"--siblings", "siblings"},
    {"--no-spouses", "spouses"},
    {"--to", "to"},
    {"--by", "ways"},
    {"--ways", "mostWays"},
    {"--language", "language"},
    {"--marks", "marks"},
    {"--effort", "effort"},
    {"--all-parts", "allParts"},
    {"--of", "fan"},
    {"--angle", "angle"},
};

// Of them all but the pedigree count generations by --up and --down.
charts::ViewSet viewsOfGenerations() {
    return charts::viewOption("generations").views | charts::viewOption("up").views |
           charts::viewOption("down").views;
}

void refuseIdle(const CLI::App& command, const char* option, charts::ViewSet views, View view) {
    if (!isGiven(command, option) || (views & charts::setOf(view)) != 0) return;
    std::string text =
        std::string(option) + " changes nothing in the view " + charts::nameOf(view) + ", but in";
    const char* separator = " ";
    for (std::size_t i = 0; i < charts::viewOption("view").form.words.size(); ++i) {
        const auto other = static_cast<View>(i);
        if ((views & charts::setOf(other)) == 0) continue;
        text.append(separator).append(charts::nameOf(other));
        separator = ", ";
    }
    throw UsageError(text);
}

void refuseIdleOptions(const CLI::App& command, View view) {
    const bool hasWords = command.get_name() == "check" || command.get_name() == "draw";
    refuseIdle(command, "--generations", viewsOfGenerations(), view);
    refuseIdle(command, "--fold", charts::viewsOfFolds(), view);
    for (const OptionName& use : kOptionNames) {
        if (hasWords && use.option == "language") continue;
        refuseIdle(command, use.name, charts::viewOption(use.option).views, view);
    }
    for (const FamilySwitch& option : kFamilySwitches) {
        refuseIdle(command, option.name, charts::viewOption("shown").views, view);
    }
}

// Counted with the focus's own in --generations, and from the focus on in a chart.
void applyGenerations(const CLI::App& command, LayoutRequest& request) {
    if (!isGiven(command, "--generations")) return;
    if (request.view() == View::pedigree) {
        if (request.chart.layout.generations >= 1 &&
            request.chart.layout.generations <= kMostPedigreeGenerations)
            return;
        throw UsageError("--generations: a pedigree has 1 to " + std::to_string(kMostPedigreeGenerations) +
                         " generations");
    }
    if (request.chart.layout.generations == 1)
        throw UsageError("--generations: 1 would be the focus alone; 2 and more, or 0 for all");
    const int others = std::max(request.chart.layout.generations - 1, 0);
    if (!isGiven(command, "--up")) request.chart.up = others;
    if (!isGiven(command, "--down")) request.chart.down = others;
}

}  // namespace

std::vector<std::string> pageViewOptionNames() {
    std::vector<std::string> names{"--view", "--generations", "--up", "--down", "--direction", "--to"};
    for (const FamilySwitch& option : kFamilySwitches) names.emplace_back(option.name);
    return names;
}

std::string pageAddressOf(const CLI::App& command, const LayoutRequest& request) {
    const charts::ChartRequest& chart = request.chart;
    const bool hasGenerations = isGiven(command, "--generations");
    const bool isPedigree = request.view() == View::pedigree;
    std::string address = std::string("view=") + charts::nameOf(request.view());
    const auto add = [&address](const std::string& part) { address += "&" + part; };
    if (isPedigree && hasGenerations) add("generations=" + std::to_string(chart.layout.generations));
    if (isGiven(command, "--up") || (hasGenerations && !isPedigree)) add("up=" + std::to_string(chart.up));
    if (isGiven(command, "--down") || (hasGenerations && !isPedigree)) {
        add("down=" + std::to_string(chart.down));
    }
    const auto directions = charts::viewOption("direction").form.words;
    if (isGiven(command, "--direction"))
        add("direction=" + std::string(directions[static_cast<std::size_t>(chart.direction)]));
    std::string hidden;
    for (const charts::RelativeGroup& group : charts::relativeGroups()) {
        if (chart.layout.*group.shown) continue;
        hidden += (hidden.empty() ? "" : ",") + std::string(group.name);
    }
    if (!hidden.empty()) add("hide=" + hidden);
    return address;
}

void completeViewOptions(const CLI::App& command, LayoutRequest& request) {
    refuseIdleOptions(command, request.view());
    applyGenerations(command, request);
    if (request.view() == View::kinship && request.to.empty())
        throw UsageError("the view kinship needs --to");
}

}  // namespace olvane::cli
