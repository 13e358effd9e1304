// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <CLI/CLI.hpp>

#include <cli/Commands.h>

namespace olvane::cli {

// Wrong use, and anything that could not be read or written.
constexpr int kWrongUse = 2;

// The subcommands with what they were given.
class CommandLine {
public:
    CommandLine();
    int run(int argc, char** argv);

private:
    std::string complaintOf(const CLI::ParseError& error) const;
    std::string nameOfChosen() const;
    void refuseWithoutEffect() const;
    void addPeople();
    void addLayout();
    void addDraw();
    void addBatch();
    void addCheck();
    void addKin();
    void addJudge();
    void addPage();
    void addPageContents();

    // Without a family these would change nothing.
    void needsFile(CLI::Option* option) { option->needs(page_->get_option("FILE")); }

    static void refuseMirroredText(const LayoutRequest& request, bool isPicture);
    LayoutOptions completedLayoutOptions() const;
    BatchOptions completedBatchOptions() const;
    DrawOptions completedDrawOptions() const;
    CheckOptions completedCheckOptions() const;
    PageOptions completedPageOptions() const;
    static void widenSideways(const CLI::App& command, LayoutRequest& request, bool onPaper = false);

    CLI::App app_{"Family trees from GEDCOM files: lists persons, lays out families and draws them.",
                  "olvane"};
    CLI::App* people_ = nullptr;
    CLI::App* layout_ = nullptr;
    CLI::App* draw_ = nullptr;
    CLI::App* batch_ = nullptr;
    CLI::App* check_ = nullptr;
    CLI::App* kin_ = nullptr;
    CLI::App* judge_ = nullptr;
    CLI::App* page_ = nullptr;
    PeopleOptions peopleOptions_;
    LayoutOptions layoutOptions_;
    DrawOptions drawOptions_;
    std::vector<std::string> drawShown_;
    BatchOptions batchOptions_;
    CheckOptions checkOptions_;
    KinOptions kinOptions_;
    JudgeOptions judgeOptions_;
    PageOptions pageOptions_;
};

}  // namespace olvane::cli
