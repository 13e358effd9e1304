// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Prints the layout of one person, as the engine's result text or as JSON.

#include <cli/Commands.h>

#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/LayoutJson.h>
#include <cli/OutputFile.h>

namespace olvane::cli {

int runLayout(const LayoutOptions& options) {
    const gedcom::GedcomData data = readFile(options.input);
    const gedcom::PersonId focus = chooseFocus(data, options.focus);
    std::string text = layoutText(data, focus, options.request);
    if (options.json) {
        text = layoutJson(data, focus, options.request, readLayoutText(text),
                          hiddenPersons(data, options.hiding));
    }
    writeReport(text + "\n");
    return 0;
}

}  // namespace olvane::cli
