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

std::string outputOf(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutOptions& options) {
    if (options.format == LayoutFormat::json) {
        TerminalProgress progress;
        LayoutRequest request = options.request;
        request.chart.progress = progress.ofChart();
        return PictureRun(data, request, hiddenPersons(data, options.hiding)).jsonOf(focus);
    }
    const std::string text = layoutText(data, focus, options.request);
    if (options.format == LayoutFormat::text) return text + "\n";
    return layoutJson(data, focus, options.request, readLayoutText(text),
                      hiddenPersons(data, options.hiding)) +
           "\n";
}

}  // namespace

int runLayout(const LayoutOptions& options) {
    const gedcom::GedcomData data = readFile(options.input);
    const gedcom::PersonId focus = chooseFocus(data, options.focus);
    writeReport(outputOf(data, focus, options));
    return 0;
}

}  // namespace olvane::cli
