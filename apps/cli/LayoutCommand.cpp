// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Prints the layout of one person, as the engine's result text or as JSON.

#include <cli/Commands.h>

#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/LayoutJson.h>
#include <cli/OutputFile.h>
#include <cli/PictureRun.h>
#include <cli/TerminalProgress.h>

namespace olvane::cli {

namespace {

void writeLayout(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutOptions& options,
                 const picture::TextSink& write) {
    const std::string text = layoutText(data, focus, options.request);
    if (options.format == LayoutFormat::text) return write(text + "\n");
    writeLayoutJson(data, focus, options.request, readLayoutText(text), hiddenPersons(data, options.hiding),
                    write);
}

void printPicture(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutOptions& options) {
    TerminalProgress progress;
    LayoutRequest request = options.request;
    request.chart.progress = progress.ofChart();
    const PictureRun run(data, request, hiddenPersons(data, options.hiding));
    const picture::Picture picture = run.pictureOf(focus);
    progress.clear();
    writeReport([&](const picture::TextSink& write) { run.writeJson(picture, write); });
}

}  // namespace

int runLayout(const LayoutOptions& options) {
    const gedcom::GedcomData data = readFile(options.input);
    const gedcom::PersonId focus = chooseFocus(data, options.focus);
    if (options.format == LayoutFormat::json) {
        printPicture(data, focus, options);
    } else {
        writeReport([&](const picture::TextSink& write) { writeLayout(data, focus, options, write); });
    }
    return statusOfReading(data);
}

}  // namespace olvane::cli
