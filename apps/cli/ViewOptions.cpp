// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The options of views under the command's own names, with their help. What each takes is in the table of options.

#include <cli/ViewOptions.h>

#include <algorithm>
#include <functional>
#include <map>
#include <span>
#include <string_view>
#include <vector>

#include <CLI/CLI.hpp>

#include <cli/FamilySwitches.h>
#include <cli/JoinedTexts.h>
#include <cli/OptionChecks.h>
#include <olvane/charts/ViewOption.h>

namespace olvane::cli {

namespace {

constexpr const char* kDepthGroup = "Views to any depth";
constexpr const char* kKinshipGroup = "Kinship view";

// A switch that sets what is on when not given to off. (The library's own flags of that sort show "{false}" in the help.)
CLI::Option* addSwitchOff(CLI::App& command, const std::string& name, bool& isOn, const std::string& help) {
    return command.add_flag_callback(
        name, [&isOn] { isOn = false; }, help);
}

CLI::Option* addWord(CLI::App& command, const char* name, const charts::ViewOption& option,
                     charts::ViewRequest& request, const std::string& help) {
    const auto words = option.form.words;
    const auto set = [&option, &request, words](const std::string& given) {
        const auto found = std::find(words.begin(), words.end(), given);
        option.set(request, static_cast<double>(found - words.begin()));
    };
    return command.add_option_function<std::string>(name, set, help)
        ->check(word({words.begin(), words.end()}))
        ->type_name(joined(words, "|"));
}

// An option of the table under the command's own name. A switch changes what is usual.
CLI::Option* addOption(CLI::App& command, const char* name, std::string_view option,
                       charts::ViewRequest& request, const std::string& help) {
    const charts::ViewOption& known = charts::viewOption(option);
    const charts::OptionForm& form = known.form;
    const auto set = [&known, &request](double value) { known.set(request, value); };
    if (form.kind == charts::OptionKind::word) return addWord(command, name, known, request, help);
    if (form.kind == charts::OptionKind::flag) {
        const auto change = [set, &form] { set(1 - form.usual); };
        return command.add_flag_callback(name, change, help);
    }
    if (form.kind == charts::OptionKind::number)
        return command.add_option_function<double>(name, set, help)->check(number(form.least, form.most));
    const std::function<void(const int&)> setWhole = set;
    return command.add_option_function<int>(name, setWhole, help)
        ->check(wholeNumber(static_cast<int>(form.least), static_cast<int>(form.most)))
        ->type_name("N");
}

void addView(CLI::App& command, LayoutRequest& request) {
    addOption(
        command, "--view", "view", request,
        "family: relatives above, beside and below (default); pedigree: ancestors, lying sideways; near: "
        "the relatives of family, placed again without overlaps; ancestors, descendants, hourglass (both) "
        "and relatives (the descendants of every ancestor): any number of generations, each person once; "
        "fan: ancestors or descendants in rings; kinship: everybody on the ways to --to; everybody: the "
        "whole connected family")
        ->type_name("VIEW");
    command
        .add_option("--generations", request.chart.layout.generations,
                    "Generations, the focus's own included. Of a pedigree 1 to 12, default 5: N generations "
                    "are up to "
                    "2^N - 1 boxes. Of other views, up and down, 2 and more; 0, the default, is all of them")
        ->check(wholeNumber(0))
        ->type_name("N");
}

void addReach(CLI::App& command, LayoutRequest& request) {
    const std::string group = kDepthGroup;
    addOption(command, "--up", "up", request, "Generations above the focus; 0, the default, is all")
        ->group(group);
    addOption(command, "--down", "down", request, "Generations below the focus; 0, the default, is all")
        ->group(group);
    addOption(command, "--direction", "direction", request,
              "Where later generations stand: down (default), up, left or right of earlier ones")
        ->group(group);
}

void addChartOptions(CLI::App& command, LayoutRequest& request) {
    const std::string group = kDepthGroup;
    addOption(command, "--compact", "compact", request,
              "Pack a tree tighter: parents need not stand over the middle of their children")
        ->group(group);
    addOption(command, "--siblings", "siblings", request, "Show siblings of the focus and of its ancestors")
        ->group(group);
    addOption(command, "--no-spouses", "spouses", request, "Leave out spouses of descendants")->group(group);
    addOption(command, "--of", "fan", request,
              "Whom a fan shows in its rings: ancestors (default) or descendants")
        ->group(group);
    addOption(command, "--angle", "angle", request,
              "How far a fan reaches around its middle: 90 to 360 (default) degrees")
        ->type_name("DEGREES")
        ->group(group);
}

void addFolds(CLI::App& command, LayoutRequest& request) {
    command
        .add_option(
            "--fold", request.folds,
            "Leave out a branch of somebody, named like the one of --focus: ancestors, descendants, or "
            "partners and siblings with theirs; all three without a word behind the colon. The box says how "
            "many persons that hides")
        ->delimiter(',')
        ->type_name("WHO[:up|down|beside],...")
        ->group(kDepthGroup);
    addOption(command, "--mirror", "mirrored", request,
              "Exchange right and left in the picture, for those who read from right to left");
}

void addOtherPerson(CLI::App& command, LayoutRequest& request) {
    command.add_option("--to", request.to, "The other person, named like the one of --focus")
        ->type_name("WHO")
        ->group(kKinshipGroup);
}

void addKinshipOptions(CLI::App& command, LayoutRequest& request) {
    const std::string group = kKinshipGroup;
    addOption(command, "--by", "ways", request,
              "Which ways are shown: by blood, by marriage or both (default)")
        ->group(group);
    addOption(command, "--ways", "mostWays", request,
              "The most ways shown, the nearest first; default 8, 0 for all")
        ->group(group);
    addOption(
        command, "--language", "language", request,
        "The language of a kinship's words, of remarks and of what a picture says beside its data; English "
        "when not given")
        ->group(group);
}

void addEverybodyOptions(CLI::App& command, LayoutRequest& request) {
    const std::string group = "View of everybody";
    command
        .add_option("--marks", request.chart.marks,
                    "How many second links to parents may become marks, for fewer crossings; default 0, all "
                    "for all of "
                    "them")
        ->transform(CLI::Validator(
            [](std::string& text) {
                const bool isAll = text == "all";
                if (isAll) text = "-1";
                return isAll || wholeNumber(0)(text).empty()
                           ? std::string()
                           : "'" + text + "' is neither a whole number of 0 or more nor all";
            },
            ""))
        ->type_name("N|all")
        ->group(group);
    addOption(command, "--effort", "effort", request,
              "0 is quickest; each step more takes up to twice the time; default 1")
        ->group(group);
    addOption(command, "--all-parts", "allParts", request,
              "Show those as well who are not connected with the focus")
        ->group(group);
}

void addFamilySwitches(CLI::App& command, LayoutRequest& request) {
    for (const FamilySwitch& option : kFamilySwitches) {
        addSwitchOff(command, option.name, shownBy(option, request), option.help)->group("Family and near");
    }
}

void addParents(CLI::App& command, LayoutRequest& request) {
    static const std::map<std::string, gedcom::ParentOrder> kOrders = {
        {"birth", gedcom::ParentOrder::birth},
        {"adoptive", gedcom::ParentOrder::adoptive},
        {"all-in-order", gedcom::ParentOrder::inOrder}};
    command
        .add_option("--parents", request.parents.order,
                    "Whose parents come first where somebody is a child of several families: those by birth "
                    "(default), who adopted, or the first in the file")
        ->transform(choice(kOrders))
        ->type_name("birth|adoptive|all-in-order");
}

void addBoxes(CLI::App& command, LayoutRequest& request, const std::string& defaults) {
    static const std::map<std::string, BoxForm> kForms = {{"tall", BoxForm::tall}, {"wide", BoxForm::wide}};
    command
        .add_option("--boxes", request.boxes,
                    "Form of the boxes: tall (55 by 80) or wide (105 by 40); " + defaults)
        ->transform(choice(kForms))
        ->type_name("tall|wide");
}

}  // namespace

void addViewOptions(CLI::App& command, LayoutRequest& request, const std::string& boxDefaults) {
    addView(command, request);
    addParents(command, request);
    addBoxes(command, request, boxDefaults);
    addReach(command, request);
    addChartOptions(command, request);
    addFolds(command, request);
    addOtherPerson(command, request);
    addKinshipOptions(command, request);
    addEverybodyOptions(command, request);
    addFamilySwitches(command, request);
}

void addPageViewOptions(CLI::App& command, LayoutRequest& request) {
    addView(command, request);
    addReach(command, request);
    addOtherPerson(command, request);
    addFamilySwitches(command, request);
}

}  // namespace olvane::cli
