// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

#include <cli/MediaFiles.h>

namespace olvane::cli {

// A photograph in a page.
struct PagePhoto {
    std::string file;  // as the GEDCOM text in the page names it
    std::string jpeg;
};

struct PagePhotos {
    std::vector<PagePhoto> photos;     // in the order of the text, each once
    std::vector<std::string> missing;  // files that were not found, are too large or no photographs
};

// The photographs that the text of a page links to, scaled to the longest side in pixels. written is that text, read with
// details; whole is the family that it was written of, and hidden who of it is hidden.
//
// Holds: no photograph is there that a hidden person, or a family with a hidden partner, has as well: they may be on it.
//        Links to other sites are passed over.
// Fails: throws UsageError where the photographs have more than 256 MiB, and as scaledPhoto does.
PagePhotos photosOfPage(const gedcom::GedcomData& written, const gedcom::GedcomData& whole,
                        const std::vector<bool>& hidden, const MediaFiles& files, int longestSide);

}  // namespace olvane::cli
