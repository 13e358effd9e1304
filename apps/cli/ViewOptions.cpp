// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The options of views, with their help: what each does, and what it is when not given.

#include <cli/ViewOptions.h>

#include <map>

#include <CLI/CLI.hpp>

#include <cli/FamilySwitches.h>
#include <cli/OptionChecks.h>

namespace olvane::cli {

namespace {

constexpr const char* kDepthGroup = "Views to any depth";
constexpr const char* kKinshipGroup = "Kinship view";

const std::map<std::string, View>& views() {
    static const std::map<std::string, View> kViews = {
        {"family", View::family},
        {"pedigree", View::pedigree},
        {"near", View::near},
        {"ancestors", View::ancestors},
        {"descendants", View::descendants},
        {"hourglass", View::hourglass},
        {"relatives", View::relatives},
        {"fan", View::fan},
        {"kinship", View::kinship},
        {"everybody", View::everybody},
    };
    return kViews;
}

// A switch that sets what is on when not given to off. (The library's own flags of that sort show "{false}" in the help.)
CLI::Option* addSwitchOff(CLI::App& command, const std::string& name, bool& isOn, const std::string& help) {
    return command.add_flag_callback(
        name, [&isOn] { isOn = false; }, help);
}

void addView(CLI::App& command, LayoutRequest& request) {
    command
        .add_option(
            "--view", request.chart.view,
            "family: relatives above, beside and below (default); pedigree: ancestors, lying sideways; near: "
            "the relatives of family, placed again without overlaps; ancestors, descendants, hourglass "
            "(both) "
            "and relatives (the descendants of every ancestor): any number of generations, each person once; "
            "fan: ancestors or descendants in rings; kinship: everybody on the ways to --to; everybody: the "
            "whole connected family")
        ->transform(choice(views()))
        ->type_name("VIEW");
    command
        .add_option("--generations", request.chart.layout.generations,
                    "Generations, the focus's own included. Of a pedigree 1 to 12, default 5: N generations "
                    "are up to "
                    "2^N - 1 boxes. Of other views, up and down, 2 and more; 0, the default, is all of them")
        ->check(wholeNumber(0))
        ->type_name("N");
}

void addReach(CLI::App& command, charts::ChartRequest& chart) {
    static const std::map<std::string, charts::Direction> kDirections = {{"down", charts::Direction::down},
                                                                         {"up", charts::Direction::up},
                                                                         {"left", charts::Direction::left},
                                                                         {"right", charts::Direction::right}};
    const std::string group = kDepthGroup;
    command.add_option("--up", chart.up, "Generations above the focus; 0, the default, is all")
        ->check(wholeNumber(0))
        ->type_name("N")
        ->group(group);
    command.add_option("--down", chart.down, "Generations below the focus; 0, the default, is all")
        ->check(wholeNumber(0))
        ->type_name("N")
        ->group(group);
    command
        .add_option("--direction", chart.direction,
                    "Where later generations stand: down (default), up, left or right of earlier ones")
        ->transform(choice(kDirections))
        ->type_name("down|up|left|right")
        ->group(group);
}

void addChartOptions(CLI::App& command, charts::ChartRequest& chart) {
    const std::string group = kDepthGroup;
    command
        .add_flag("--compact", chart.compact,
                  "Pack a tree tighter: parents need not stand over the middle of their children")
        ->group(group);
    command.add_flag("--siblings", chart.siblings, "Show siblings of the focus and of its ancestors")
        ->group(group);
    addSwitchOff(command, "--no-spouses", chart.spouses, "Leave out spouses of descendants")->group(group);
    static const std::map<std::string, charts::FanOf> kFansOf = {{"ancestors", charts::FanOf::ancestors},
                                                                 {"descendants", charts::FanOf::descendants}};
    command
        .add_option("--of", chart.fanOf, "Whom a fan shows in its rings: ancestors (default) or descendants")
        ->transform(choice(kFansOf))
        ->type_name("ancestors|descendants")
        ->group(group);
    command
        .add_option("--angle", chart.fanAngle,
                    "How far a fan reaches around its middle: 90 to 360 (default) degrees")
        ->check(number(90.0, 360.0))
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
    command.add_flag("--mirror", request.chart.mirrored,
                     "Exchange right and left in the picture, for those who read from right to left");
}

void addOtherPerson(CLI::App& command, LayoutRequest& request) {
    command.add_option("--to", request.to, "The other person, named like the one of --focus")
        ->type_name("WHO")
        ->group(kKinshipGroup);
}

void addKinshipOptions(CLI::App& command, LayoutRequest& request) {
    static const std::map<std::string, charts::WayChoice> kChoices = {
        {"blood", charts::WayChoice::blood},
        {"marriage", charts::WayChoice::marriage},
        {"both", charts::WayChoice::both}};
    const std::string group = kKinshipGroup;
    command
        .add_option("--by", request.chart.ways,
                    "Which ways are shown: by blood, by marriage or both (default)")
        ->transform(choice(kChoices))
        ->type_name("blood|marriage|both")
        ->group(group);
    command
        .add_option("--ways", request.chart.mostWays,
                    "The most ways shown, the nearest first; default 8, 0 for all")
        ->check(wholeNumber(0))
        ->type_name("N")
        ->group(group);
}

void addLanguage(CLI::App& command, kin::Language& language) {
    static const std::map<std::string, kin::Language> kNames = [] {
        std::map<std::string, kin::Language> names;
        for (const kin::Language one : kin::kLanguages) names.emplace(kin::languageCode(one), one);
        return names;
    }();
    command
        .add_option("--language", language,
                    "The language of a kinship's words, of remarks and of what a picture says beside its "
                    "data; English when "
                    "not given")
        ->transform(choice(kNames))
        ->type_name("en|de|es")
        ->group(kKinshipGroup);
}

void addEverybodyOptions(CLI::App& command, charts::ChartRequest& chart) {
    const std::string group = "View of everybody";
    command
        .add_option("--marks", chart.marks,
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
    command
        .add_option("--effort", chart.effort,
                    "0 is quickest; each step more takes up to twice the time; default 1")
        ->check(wholeNumber(0, 10))
        ->type_name("N")
        ->group(group);
    addSwitchOff(command, "--all-parts", chart.onePart,
                 "Show those as well who are not connected with the focus")
        ->group(group);
}

void addFamilySwitches(CLI::App& command, LayoutRequest& request) {
    for (const FamilySwitch& option : kFamilySwitches) {
        addSwitchOff(command, option.name, request.chart.layout.*option.shown, option.help)
            ->group("Family and near");
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
    addReach(command, request.chart);
    addChartOptions(command, request.chart);
    addFolds(command, request);
    addOtherPerson(command, request);
    addKinshipOptions(command, request);
    addLanguage(command, request.chart.language);
    addEverybodyOptions(command, request.chart);
    addFamilySwitches(command, request);
}

void addPageViewOptions(CLI::App& command, LayoutRequest& request) {
    addView(command, request);
    addReach(command, request.chart);
    addOtherPerson(command, request);
    addFamilySwitches(command, request);
}

}  // namespace olvane::cli
