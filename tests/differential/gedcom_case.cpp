// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// gedcom-case FILE.ged: prints a GEDCOM file as a case file.

#include <exception>
#include <iostream>

#include "GedcomCase.h"

int main(int argc, char** argv) {
    if (argc != 2) {
        std::cerr << "usage: gedcom-case FILE.ged\n";
        return 2;
    }
    try {
        std::cout << support::formatCase(support::caseOfGedcom(argv[1]));
    } catch (const std::exception& failure) {
        std::cerr << "gedcom-case: " << failure.what() << "\n";
        return 2;
    }
    return 0;
}
