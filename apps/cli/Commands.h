// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include <olvane/source/GedcomLabels.h>

#include <cli/FileReading.h>
#include <cli/HiddenPersons.h>
#include <cli/LayoutRun.h>
#include <cli/PaperOptions.h>

namespace olvane::cli {

// What the user asked for. Each run... does one subcommand and answers the exit status.
// Fails: throws UsageError; whatever else goes wrong passes on as it is.

// How a command lists: for people to read, as tab-separated values, or as JSON.
enum class ListFormat : std::uint8_t { text, tsv, json };

struct PeopleOptions {
    InputOptions input;
    ListFormat format = ListFormat::text;
    std::vector<std::string> words;
};

// The result text of a view of the engine, a picture as JSON (format 2), or the older JSON of the engine's views.
enum class LayoutFormat : std::uint8_t { text, json, json1 };

struct LayoutOptions {
    InputOptions input;
    std::string focus;
    LayoutFormat format = LayoutFormat::text;
    HidingOptions hiding;
    LayoutRequest request;
};

struct DrawOptions {
    InputOptions input;
    std::string focus;
    std::string output;
    LayoutRequest request;
    std::string theme = "light";
    std::string title;  // empty for one made of the focus's name
    PaperOptions paper;
    gedcom::ShownFacts shown{};
    HidingOptions hiding;
};

struct BatchOptions {
    InputOptions input;
    std::string focusFrom;  // file of ids, "-" for the standard input; empty for everybody
    bool unbuffered = false;
    LayoutRequest request;
};

struct CheckOptions {
    InputOptions input;
    std::string focus;  // empty for the data alone
    bool all = false;   // the layouts of everybody
    ListFormat format = ListFormat::text;
    LayoutRequest request;
};

struct KinOptions {
    InputOptions input;
    std::string a;
    std::string b;
    bool json = false;
    std::size_t ways = 50;  // of each sort, at least 1
    std::string language;   // code of the words; empty for that of the environment
};

struct JudgeOptions {
    std::vector<std::string> files;  // pictures as JSON, "-" for the standard input
    InputOptions family;             // what is known, without a file for nothing
    ListFormat format = ListFormat::text;
};

struct PageOptions {
    InputOptions input;  // without a file for a page without a family
    std::string focus;
    std::string output;
    std::string title;      // empty for one made of the focus's name
    LayoutRequest request;  // what the page opens with
    std::string address;    // the same, as pageAddressOf has it
    bool map = false;       // everybody as a map, laid out here
    HidingOptions hiding;
    bool notes = true;  // and sources
    bool media = true;
    int photoSize = 0;  // pixels of the longer side of photographs in the page; 0 for none
};

int runPeople(const PeopleOptions& options);
int runLayout(const LayoutOptions& options);
int runDraw(const DrawOptions& options);
int runBatch(const BatchOptions& options);
int runCheck(const CheckOptions& options);
int runKin(const KinOptions& options);
int runJudge(const JudgeOptions& options);
int runPage(const PageOptions& options);

}  // namespace olvane::cli
