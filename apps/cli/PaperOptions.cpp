// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/PaperOptions.h>

#include <charconv>
#include <optional>
#include <utility>

#include <CLI/CLI.hpp>

#include <olvane/draw/Sheets.h>

#include <cli/OptionChecks.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

constexpr double kUsualDpi = 96;
constexpr double kPaperDpi = 192;
constexpr int kMostOneWay = 100;

int numberOfSheets(std::string_view text) {
    int number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error != std::errc() || end != text.data() + text.size()) return 0;
    return number >= 1 && number <= kMostOneWay ? number : 0;
}

// Rows and columns; nothing for any other text.
std::optional<std::pair<int, int>> sheetsOf(std::string_view text) {
    const std::size_t cross = text.find('x');
    if (cross == std::string_view::npos) return std::nullopt;
    const int rows = numberOfSheets(text.substr(0, cross));
    const int columns = numberOfSheets(text.substr(cross + 1));
    if (rows == 0 || columns == 0) return std::nullopt;
    return std::pair(rows, columns);
}

std::string complaintOfPaper(const std::string& text) {
    if (draw::paperOf(text)) return {};
    return "'" + text +
           "' is no paper; take A4, A3, A2, A1, A0, letter or WIDTHxHEIGHT in whole millimetres, 50 to 20000";
}

std::string complaintOfSheets(const std::string& text) {
    if (sheetsOf(text)) return {};
    return "'" + text + "' is no number of sheets; take ROWSxCOLUMNS, such as 2x3, each 1 to 100";
}

}  // namespace

double PaperOptions::pixelsOfPx() const {
    const double pixels = dpi > 0 ? dpi : onPaper() ? kPaperDpi : kUsualDpi;
    return pixels / kUsualDpi;
}

void addPaperOptions(CLI::App& command, PaperOptions& options) {
    const std::string group = "On paper";
    command
        .add_option(
            "--fit", options.fit,
            "Draw on paper, as large as one sheet of it allows: A4 to A0, letter, or a width and height "
            "in millimetres. Wide generations are folded into two or three rows where that makes it larger")
        ->check(complaintOfPaper)
        ->type_name("PAPER")
        ->group(group);
    command
        .add_option(
            "--sheets", options.sheets,
            "On that many sheets of the paper, with strips to glue them by. A .pdf holds them all; other "
            "forms become OUT-1, OUT-2 and so on")
        ->check(complaintOfSheets)
        ->type_name("ROWSxCOLUMNS")
        ->group(group);
    command
        .add_option(
            "--scale", options.scale,
            "Size of the picture, by its size at 96 px an inch; with --fit, on as many sheets as that "
            "takes, up to 1,000")
        ->check(number(0.01, 100.0))
        ->type_name("S")
        ->group(group);
    command.add_option("--dpi", options.dpi, "Pixels an inch of a .png: 96 when not given, 192 on paper")
        ->check(number(10.0, 2400.0))
        ->type_name("N")
        ->group(group);
}

void checkPaperOptions(const PaperOptions& options, const std::string& output) {
    if (!options.sheets.empty() && !options.onPaper()) {
        throw UsageError("--sheets changes nothing without --fit, which says what paper");
    }
    if (!options.sheets.empty() && options.scale > 0) {
        throw UsageError(
            "--sheets and --scale exclude each other: a scale decides how many sheets there are");
    }
    if (options.dpi > 0 && !output.ends_with(".png") && !output.ends_with(".PNG")) {
        throw UsageError("--dpi is for .png; .svg and .pdf have no pixels");
    }
}

draw::SheetRequest sheetRequestOf(const PaperOptions& options) {
    draw::SheetRequest request;
    const auto paper = draw::paperOf(options.fit);
    if (!paper) throw UsageError("--fit: " + complaintOfPaper(options.fit));
    request.paper = *paper;
    request.scale = options.scale * draw::kMillimetresOfPx;
    if (options.sheets.empty()) return request;
    const auto sheets = sheetsOf(options.sheets);
    if (!sheets) throw UsageError("--sheets: " + complaintOfSheets(options.sheets));
    request.rows = sheets->first;
    request.columns = sheets->second;
    return request;
}

}  // namespace olvane::cli
