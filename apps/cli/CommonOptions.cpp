// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Options that several commands have. Every option says in its help what it does and what it is when not given.

#include <cli/CommonOptions.h>

#include <map>

#include <CLI/CLI.hpp>

#include <olvane/gedcom/GedcomEncodings.h>

#include <cli/OptionChecks.h>

namespace olvane::cli {

namespace {

std::string unknownEncoding(const std::string& name) {
    std::string text = "'" + name + "' is no known encoding; known are";
    const char* separator = " ";
    for (const std::string_view known : gedcom::encodingNames()) {
        text.append(separator).append(known);
        separator = ", ";
    }
    return text;
}

}  // namespace

void addEncoding(CLI::App& command, InputOptions& input) {
    command
        .add_option(
            "--encoding", input.encoding,
            "The encoding of the file, such as UTF-8, ANSEL, windows-1250, ISO-8859-2 or KOI8-R; as the file "
            "says and its text allows when not given. Where that is in doubt the status is 1")
        ->check([](const std::string& name) {
            return gedcom::encodingLabelled(name).empty() ? unknownEncoding(name) : std::string();
        })
        ->type_name("NAME");
}

void addFile(CLI::App& command, InputOptions& input) {
    command.add_option("FILE", input.file, "GEDCOM file: .ged, or a .gdz archive; - for the standard input")
        ->required()
        ->type_name("");
    addEncoding(command, input);
}

void addListFormat(CLI::App& command, ListFormat& format, const char* help) {
    static const std::map<std::string, ListFormat> kFormats = {
        {"text", ListFormat::text}, {"tsv", ListFormat::tsv}, {"json", ListFormat::json}};
    command.add_option("--format", format, help)->transform(choice(kFormats))->type_name("text|tsv|json");
}

void addFocus(CLI::App& command, std::string& focus) {
    command
        .add_option(
            "--focus", focus,
            "The person in the middle: an xref (I17 or @I17@), a number as 'olvane people' prints it, or "
            "words of the name")
        ->required()
        ->type_name("WHO");
}

void addHideLiving(CLI::App& command, HidingOptions& hiding, const std::string& further) {
    command.add_flag(
        "--hide-living", hiding.hideLiving,
        "Hide everyone who may be living, as 'Living': no death is recorded and the birth was less than 110 "
        "years ago, or the dates decide nothing and the person is near kin of such a person" +
            further);
    command
        .add_option("--year", hiding.year,
                    "The year that --hide-living counts from; this year if not given, or an earlier one of "
                    "SOURCE_DATE_EPOCH")
        ->check(wholeNumber(1, 9999))
        ->type_name("YEAR");
}

bool isGiven(const CLI::App& command, const char* option) {
    return command.get_option_no_throw(option) != nullptr && command.count(option) > 0;
}

}  // namespace olvane::cli
