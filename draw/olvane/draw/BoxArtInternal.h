// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

// One box of a picture: where it stands, and what is special about it.
//
// Units: px.
struct Box {
    const LayoutRecord* record = nullptr;
    double x = 0;
    double y = 0;
    double width = 0;
    double height = 0;
    bool isFocus = false;
    // A person who stands in several boxes has a number, the same in each, counted from 1; 0 for everybody
    // else.
    int repeatNumber = 0;
    int repeatCount = 0;
};

// The definitions that boxes refer to. Once, ahead of all boxes.
void appendBoxDefinitions(std::string& svg);

// A person's box: silhouette, name, years, marks, and a title that says it all in words.
void appendPersonBox(std::string& svg, const Box& box, const PersonLabel& label, const DrawingTheme& theme);

// The dashed box of an add-node; childName tells whose parent is missing.
void appendPlaceholderBox(std::string& svg, const Box& box, const std::string& childName,
                          const DrawingTheme& theme);

}  // namespace olvane::draw
