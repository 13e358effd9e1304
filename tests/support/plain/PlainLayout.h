// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include <support/CaseFile.h>

namespace plain {

// What layout-case prints for one case, line by line and without line ends.
struct Answer {
    std::vector<std::string> lines;

    std::string text() const;  // each line with its end
};

// Lays a case out by a second, separate layout that shares nothing with the engine but the case and the
// rules. It is slow and plain on purpose, and the judge that the engine is compared with, byte for byte.
//
// Fails: never on account of a family. A host call that fails ends the layout with the text so far, as it
//        does in the engine. A pedigree of very many generations in one line can use up the stack.
Answer layOut(const support::CaseFile& request, bool graph, bool trace);

}  // namespace plain
