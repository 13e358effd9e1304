// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

namespace olvane::cli {

// The whole command. Answers the exit status: 0, 1 for problems found in the data, 2 for wrong use and for
// anything that could not be read or written.
int runCommand(int argc, char** argv);

}  // namespace olvane::cli
