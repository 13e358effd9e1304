// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Prints the layout of one person as the engine's result text.

#include <cli/Commands.h>

#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/OutputFile.h>

namespace olvane::cli {

int runLayout(const LayoutOptions& options) {
    const gedcom::GedcomData data = readFile(options.file);
    const gedcom::PersonId focus = chooseFocus(data, options.focus);
    writeStandardOutput(layoutText(data, focus, options.request) + "\n");
    return 0;
}

}  // namespace olvane::cli
