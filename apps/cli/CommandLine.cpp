// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The command line: which command is run, and what is printed when it is wrong.

#include <cli/CommandLine.h>

#include <exception>
#include <memory>
#include <new>

#include <cli/CommonOptions.h>
#include <cli/HelpFormat.h>
#include <cli/InputFiles.h>
#include <cli/Messages.h>
#include <cli/Subcommands.h>
#include <cli/UsageError.h>

namespace olvane::cli {

CommandLine::CommandLine() {
    app_.set_version_flag("--version", "olvane " OLVANE_VERSION);
    app_.require_subcommand(1);
    app_.formatter(std::make_shared<HelpFormat>());
    addPeople();
    addLayout();
    addDraw();
    addBatch();
    addCheck();
    addKin();
    addJudge();
    addPage();
}

int CommandLine::run(int argc, char** argv) {
    try {
        app_.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        if (error.get_exit_code() == 0) return app_.exit(error);
        printMessage(complaintOf(error));
        return kWrongUse;
    }
    refuseWithoutEffect();
    if (people_->parsed()) return runPeople(peopleOptions_);
    if (layout_->parsed()) return runLayout(completedLayoutOptions());
    if (batch_->parsed()) return runBatch(completedBatchOptions());
    if (check_->parsed()) return runCheck(completedCheckOptions());
    if (kin_->parsed()) return runKin(kinOptions_);
    if (judge_->parsed()) return runJudge(judgeOptions_);
    if (page_->parsed()) return runPage(completedPageOptions());
    return runDraw(completedDrawOptions());
}

// The library would only ask for a command where the first word is none.
std::string CommandLine::complaintOf(const CLI::ParseError& error) const {
    const std::vector<std::string> unknownWords = app_.remaining();
    if (app_.get_subcommands().empty() && !unknownWords.empty() && !unknownWords.front().starts_with('-')) {
        return "there is no command '" + unknownWords.front() +
               "', but people, layout, draw, batch, check, kin, judge and page; 'olvane --help' lists "
               "more";
    }
    return std::string(error.what()) + "; 'olvane" + nameOfChosen() + " --help' lists more";
}

std::string CommandLine::nameOfChosen() const {
    const auto chosen = app_.get_subcommands();
    return chosen.empty() ? "" : " " + chosen.front()->get_name();
}

// An option that changes nothing was meant to change something.
void CommandLine::refuseWithoutEffect() const {
    const CLI::App& command = *app_.get_subcommands().front();
    if (isGiven(command, "--year") && !isGiven(command, "--hide-living")) {
        throw UsageError("--year changes nothing without --hide-living");
    }
}

namespace {

// The files that the words of a command line may name for reading.
std::vector<std::string> wordsThatMayBeInput(int argc, char** argv) {
    std::vector<std::string> words;
    for (int i = 1; i < argc; ++i) {
        const std::string word = argv[i];
        const bool namesOutput = word == "-o" || word == "--output";
        if (namesOutput) ++i;
        if (namesOutput || word.starts_with("-o")) continue;
        const std::size_t value = word.starts_with("--") ? word.find('=') + 1 : 0;
        if (!word.starts_with("--output=")) words.push_back(word.substr(value));
    }
    return words;
}

}  // namespace

int runCommand(int argc, char** argv) {
    try {
        refuseStreamsIntoInputs(InputFiles(wordsThatMayBeInput(argc, argv)));
        return CommandLine().run(argc, argv);
    } catch (const UsageError& error) {
        printMessage(error.what());
    } catch (const std::bad_alloc&) {
        printMessage("not enough memory");
    } catch (const std::exception& error) {
        printMessage(error.what());
    }
    return kWrongUse;
}

}  // namespace olvane::cli
