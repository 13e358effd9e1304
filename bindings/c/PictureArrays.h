// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane_picture.h>

#include <cstdint>
#include <mutex>
#include <string>
#include <vector>

#include <olvane/picture/Picture.h>

// The opaque picture: the library's own, and its values in the structs of C.
//
// Holds: arrays point into each other, so a picture stays where it was filled.
struct olvane_picture {
    std::vector<olvane_picture_box> boxes;
    std::vector<olvane_picture_family> families;
    std::vector<std::int32_t> members;
    std::vector<std::int32_t> childKinds;
    std::vector<olvane_picture_line> lines;
    std::vector<double> bridges;
    std::vector<olvane_picture_mark> marks;
    std::int32_t focus = OLVANE_NO_PLACE;
    std::int32_t other = OLVANE_NO_PLACE;
    std::vector<olvane_picture_arc> arcs;
    std::vector<double> ringRadii;
    double middleX = 0;
    double middleY = 0;
    std::vector<std::string> words;  // of ways, which point to them
    std::vector<olvane_picture_way> ways;
    std::vector<std::int32_t> wayBoxes;
    std::vector<olvane_picture_piece> wayPieces;
    std::string focusIs;
    std::string otherIs;
    std::vector<olvane_picture_folded> folded;
    std::string failure;

    // Of which the text is made at the first question, and a later picture's places.
    olvane::picture::Picture source;
    mutable std::mutex guard;
    mutable std::string json;
    std::int32_t direction = 0;  // of a view in one call
    bool mirrored = false;
};

namespace olvane::c {

// Copies the picture into the arrays of an empty one.
void fill(picture::Picture from, olvane_picture& to);

}  // namespace olvane::c
