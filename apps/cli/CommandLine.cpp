// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The command line: what can be asked for, and how it is told. Every option says in its help what it does and
// what it is when not given.

#include <cli/CommandLine.h>

#include <exception>
#include <iostream>
#include <map>
#include <new>

#include <CLI/CLI.hpp>

#include <olvane/family/FamilyOptions.h>

#include <cli/Commands.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

constexpr int kWrongUse = 2;

struct FamilySwitch {
    const char* name;
    const std::string& key;
    const char* help;
};

const std::vector<FamilySwitch>& familySwitches() {
    using namespace SharedTreeViewer;
    static const std::vector<FamilySwitch> kSwitches = {
        {"--no-aunts-uncles", kTreeViewFamShowAuntsUnclesKey,
         "Leave out siblings of the parents, and so cousins too"},
        {"--no-cousins", kTreeViewFamShowCousinsKey, "Leave out children of the parents' siblings"},
        {"--no-siblings", kTreeViewFamShowSiblingsKey, "Leave out siblings and half siblings"},
        {"--no-sibling-spouses", kTreeViewFamShowSiblingSpousesKey, "Leave out spouses of the siblings"},
        {"--no-nieces-nephews", kTreeViewFamShowNeicesNephewsKey, "Leave out children of the siblings"},
        {"--no-grandchildren", kTreeViewFamShowGrandchildrenKey, "Leave out grandchildren"},
        {"--no-great-grandparents", kTreeViewFamShowGreatGrandparentsKey, "Leave out great-grandparents"},
        {"--no-spouses-of-children", kTreeViewFamShowSpousesOfChildrenKey,
         "Leave out spouses of the children"},
    };
    return kSwitches;
}

void addFile(CLI::App& command, std::string& file) {
    command.add_option("FILE", file, "GEDCOM file: .ged, or a .gdz archive")->required()->type_name("");
}

void addFocus(CLI::App& command, std::string& focus) {
    command
        .add_option("--focus", focus, "The person in the middle: an xref (I17 or @I17@) or words of the name")
        ->required()
        ->type_name("WHO");
}

void addView(CLI::App& command, LayoutRequest& request) {
    static const std::map<std::string, View> kViews = {{"family", View::family},
                                                       {"pedigree", View::pedigree}};
    command
        .add_option(
            "--view", request.view,
            "family: relatives above, beside and below (default); pedigree: ancestors, lying sideways")
        ->transform(CLI::CheckedTransformer(kViews))
        ->type_name("family|pedigree");
    command
        .add_option(
            "--generations", request.generations,
            "Generations of a pedigree, the focus's own included: 1 to 12, default 5. Full ancestry of N "
            "generations is 2^N - 1 boxes: 5 are 31, 8 are 255, 10 are 1,023, 12 are 4,095, and each "
            "generation doubles the height of the picture")
        ->check(CLI::Range(1, 12))
        ->type_name("N");
}

void addFamilySwitches(CLI::App& command, LayoutRequest& request) {
    for (const FamilySwitch& option : familySwitches()) {
        const std::string& key = option.key;
        command
            .add_flag_callback(
                option.name, [&request, &key] { request.keysOff.push_back(key); }, option.help)
            ->group("Family view");
    }
}

void addBoxes(CLI::App& command, LayoutRequest& request, const std::string& defaults) {
    static const std::map<std::string, BoxForm> kForms = {{"tall", BoxForm::tall}, {"wide", BoxForm::wide}};
    command
        .add_option("--boxes", request.boxes,
                    "Form of the boxes: tall (55 by 80) or wide (105 by 40); " + defaults)
        ->transform(CLI::CheckedTransformer(kForms))
        ->type_name("tall|wide");
}

// The subcommands with what they were given.
class CommandLine {
public:
    CommandLine() {
        app_.set_version_flag("--version", "olvane " OLVANE_VERSION);
        app_.require_subcommand(1);
        app_.get_formatter()->column_width(34);
        addPeople();
        addLayout();
        addDraw();
    }

    int run(int argc, char** argv) {
        try {
            app_.parse(argc, argv);
        } catch (const CLI::ParseError& error) {
            return app_.exit(error) == 0 ? 0 : kWrongUse;
        }
        if (people_->parsed()) return runPeople(peopleOptions_);
        if (layout_->parsed()) return runLayout(layoutOptions_);
        return runDraw(completedDrawOptions());
    }

private:
    void addPeople() {
        people_ = app_.add_subcommand("people", "List persons with ids, names and years");
        addFile(*people_, peopleOptions_.file);
        people_
            ->add_option("WORDS", peopleOptions_.words,
                         "Words that the name must hold; everybody without any")
            ->type_name("");
    }

    void addLayout() {
        layout_ = app_.add_subcommand("layout", "Print where everybody stands, as the engine's result text");
        addFile(*layout_, layoutOptions_.file);
        addFocus(*layout_, layoutOptions_.focus);
        addView(*layout_, layoutOptions_.request);
        addBoxes(*layout_, layoutOptions_.request, "default tall");
        addFamilySwitches(*layout_, layoutOptions_.request);
    }

    void addDraw() {
        draw_ = app_.add_subcommand("draw", "Draw a person's family or pedigree");
        addFile(*draw_, drawOptions_.file);
        addFocus(*draw_, drawOptions_.focus);
        draw_
            ->add_option("-o,--output", drawOptions_.output,
                         "Picture to write: .svg, .png or .pdf; - writes SVG to the standard output")
            ->required()
            ->type_name("OUT");
        addView(*draw_, drawOptions_.request);
        addBoxes(*draw_, drawOptions_.request, "default tall, and wide in a pedigree");
        draw_
            ->add_option("--theme", drawOptions_.theme,
                         "Colours: light (default), dark, or print for little ink")
            ->check(CLI::IsMember({"light", "dark", "print"}))
            ->type_name("light|dark|print");
        draw_->add_option("--title", drawOptions_.title, "Title above the picture; none is drawn without it")
            ->type_name("TEXT");
        draw_
            ->add_option(
                "--page", drawOptions_.page,
                "Lay the picture out on sheets of this paper, with strips to glue them by. A .pdf holds "
                "them all; other forms become OUT-1, OUT-2 and so on")
            ->check(CLI::IsMember({"A4", "A3", "letter"}))
            ->type_name("A4|A3|letter");
        draw_->add_flag(
            "--hide-living", drawOptions_.hideLiving,
            "Draw as 'Living', without name, sex and dates, whoever may be alive: no death told and "
            "born less than 110 years ago, or dates that cannot tell and near kin of such a person");
        draw_
            ->add_option("--year", drawOptions_.year,
                         "The year that --hide-living counts from; this year if not given")
            ->check(CLI::Range(1, 9999))
            ->type_name("YEAR");
        addFamilySwitches(*draw_, drawOptions_.request);
    }

    DrawOptions completedDrawOptions() const {
        DrawOptions options = drawOptions_;
        const bool isPedigree = options.request.view == View::pedigree;
        if (isPedigree && draw_->count("--boxes") == 0) options.request.boxes = BoxForm::wide;
        return options;
    }

    CLI::App app_{"Family trees from GEDCOM files: lists persons, lays out families and draws them.",
                  "olvane"};
    CLI::App* people_ = nullptr;
    CLI::App* layout_ = nullptr;
    CLI::App* draw_ = nullptr;
    PeopleOptions peopleOptions_;
    LayoutOptions layoutOptions_;
    DrawOptions drawOptions_;
};

}  // namespace

int runCommand(int argc, char** argv) {
    try {
        return CommandLine().run(argc, argv);
    } catch (const UsageError& error) {
        std::cerr << "olvane: " << error.what() << '\n';
    } catch (const std::bad_alloc&) {
        std::cerr << "olvane: not enough memory\n";
    } catch (const std::exception& error) {
        std::cerr << "olvane: " << error.what() << '\n';
    }
    return kWrongUse;
}

}  // namespace olvane::cli
