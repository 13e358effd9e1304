// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What was given of the options of views. Each knows the views that it changes; what would change nothing is refused, since
// it was meant to.

#include <cli/ViewOptions.h>

#include <algorithm>
#include <map>
#include <span>
#include <vector>

#include <CLI/CLI.hpp>

#include <cli/CommonOptions.h>
#include <cli/FamilySwitches.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

constexpr int kMostPedigreeGenerations = 12;

// An option, and the views that it changes.
struct OptionUse {
    const char* option;
    std::vector<View> views;
};

const std::vector<OptionUse>& optionUses() {
    static const std::vector<View> kDirected = {View::near,      View::ancestors, View::descendants,
                                                View::hourglass, View::relatives, View::kinship,
                                                View::everybody};
    static const std::vector<OptionUse> kUses = {
        {"--generations",
         {View::pedigree, View::ancestors, View::descendants, View::hourglass, View::relatives, View::fan}},
        {"--up", {View::ancestors, View::hourglass, View::relatives, View::fan}},
        {"--down", {View::descendants, View::hourglass, View::relatives, View::fan}},
        {"--direction", kDirected},
        {"--compact",
         {View::near, View::ancestors, View::descendants, View::hourglass, View::relatives, View::kinship}},
        {"--fold", {View::near, View::ancestors, View::descendants, View::hourglass, View::relatives}},
        {"--siblings", {View::ancestors, View::hourglass}},
        {"--no-spouses", {View::descendants, View::hourglass, View::relatives, View::fan}},
        {"--to", {View::kinship}},
        {"--by", {View::kinship}},
        {"--ways", {View::kinship}},
        {"--language", {View::kinship}},
        {"--marks", {View::everybody}},
        {"--effort", {View::everybody}},
        {"--all-parts", {View::everybody}},
        {"--of", {View::fan}},
        {"--angle", {View::fan}},
    };
    return kUses;
}

void refuseIdle(const CLI::App& command, const char* option, std::span<const View> views, View view) {
    if (!isGiven(command, option) || std::find(views.begin(), views.end(), view) != views.end()) return;
    std::string text =
        std::string(option) + " changes nothing in the view " + charts::nameOf(view) + ", but in";
    const char* separator = " ";
    for (const View other : views) {
        text.append(separator).append(charts::nameOf(other));
        separator = ", ";
    }
    throw UsageError(text);
}

void refuseIdleOptions(const CLI::App& command, View view) {
    constexpr View kOfNearRelatives[] = {View::family, View::near};
    for (const OptionUse& use : optionUses()) {
        const bool isOfWords = (command.get_name() == "check" || command.get_name() == "draw") &&
                               std::string_view(use.option) == "--language";
        if (!isOfWords) refuseIdle(command, use.option, use.views, view);
    }
    for (const FamilySwitch& option : kFamilySwitches) {
        refuseIdle(command, option.name, kOfNearRelatives, view);
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
    static const std::map<charts::Direction, const char*> kNames = {{charts::Direction::down, "down"},
                                                                    {charts::Direction::up, "up"},
                                                                    {charts::Direction::left, "left"},
                                                                    {charts::Direction::right, "right"}};
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
    if (isGiven(command, "--direction")) add(std::string("direction=") + kNames.at(chart.direction));
    std::string hidden;
    for (const FamilySwitch& option : kFamilySwitches) {
        if (chart.layout.*option.shown) continue;
        hidden += (hidden.empty() ? "" : ",") + std::string(option.pageName);
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
