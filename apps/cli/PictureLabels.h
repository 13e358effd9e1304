// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/draw/SvgDrawing.h>
#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// What boxes and lines say beside names and years.
struct ShownFacts {
    bool dates = false;       // as the file writes them, instead of years
    bool places = false;      // of birth and death
    bool occupation = false;  // the first one
    bool marriage = false;    // its year, at the marriage line

    // Whether the file has to be read with its facts.
    bool needFacts() const { return places || occupation; }
};

// A picture with everything that is said of its persons. Refers to the data, which must outlive it.
//
// hidden: who is drawn as living, an entry for each person; empty for nobody. The picture itself must not hold
// what is known of them.
draw::DrawingContent pictureContent(const gedcom::GedcomData& data, picture::Picture picture,
                                    const ShownFacts& shown, std::vector<bool> hidden = {});

}  // namespace olvane::cli
