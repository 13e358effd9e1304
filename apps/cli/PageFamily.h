// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomDiagnostic.h>

#include <cli/PagePhotos.h>

namespace olvane::cli {

// What a page carries of a family, and how it opens.
struct PageFamily {
    std::string name;     // of the file
    std::string title;    // above the picture and in the window's title
    std::string focus;    // the number of a person in the text, from 1; empty for the page's own choice
    std::string address;  // what the page opens with, in the form of its own addresses, without the #
    std::string gedcom;   // UTF-8; empty where the page has the map alone
    std::string map;      // as charts::writeMapIndex writes it; empty for a page that opens without one
    bool livingHidden = false;
    // On the file that the text was made of, with its line numbers.
    std::vector<gedcom::Diagnostic> remarks;
    std::vector<PagePhoto> photos;
};

// The page with the family in it.
//
// Holds: whatever the texts hold, nothing of them is markup or script in the page. The same family gives the same
//        bytes.
// Fails: throws std::logic_error for a page that has no place for a family, std::runtime_error where compression
//        fails.
std::string pageWith(std::string_view pageTemplate, const PageFamily& family);

}  // namespace olvane::cli
