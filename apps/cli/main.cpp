// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The olvane command.

#include <cli/CommandLine.h>

int main(int argc, char** argv) {
    return olvane::cli::runCommand(argc, argv);
}
