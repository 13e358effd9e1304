// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <span>
#include <string>
#include <string_view>

#include <olvane/draw/MarkArtInternal.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/picture/KinshipPlates.h>

namespace olvane::draw {

// How far a mark at the edge of a box reaches out of it.
constexpr double kMarkOutside = 12;

// One box of a picture: where it stands, and what is special about it.
//
// Units: px.
struct BoxFrame {
    const picture::Box* box = nullptr;
    double x = 0;
    double y = 0;
    double width = 0;
    double height = 0;
    bool isFocus = false;
    bool isOther = false;                          // whom a kinship is about beside the focus
    bool isCommonAncestor = false;                 // at the top of a way
    std::string caption;                           // what the one of a kinship is to the other
    const picture::KinshipPlate* plate = nullptr;  // of the caption; in points
    // A person with several boxes has a number, the same in each; 0 for everybody else.
    int repeatNumber = 0;
    int repeatCount = 0;
    bool countsHidden = false;  // the box's numbers of hidden relatives are known
    std::span<const BoxMark> marks;
    kin::Language language = kin::Language::english;
    std::string_view photo;     // its address; empty for a silhouette
    double leastName = 0;       // DrawingOptions::leastNameSize
    TextSizes* text = nullptr;  // takes the sizes of what is written

    int hiddenCount() const { return box->hiddenParents + box->hiddenPartners + box->hiddenChildren; }
    bool hasHidden() const { return box->hasFlag ? box->flag : hiddenCount() > 0; }
};

// How plates of a kinship are drawn, in points.
picture::PlateStyle plateStyle();

// What is said of a person, each text cut to what can be read.
kin::PersonLabel readableLabel(const DrawingContent& content, std::int64_t id);

// The definitions that boxes refer to. Once, ahead of all boxes.
void appendBoxDefinitions(std::string& svg);

// A person's box: silhouette, name, years, marks, and a title that says it all in words.
void appendPersonBox(std::string& svg, const BoxFrame& box, const kin::PersonLabel& label,
                     const DrawingTheme& theme);

// The dashed box of an unknown parent; childName says whose parent.
void appendUnknownParentBox(std::string& svg, const BoxFrame& box, const std::string& childName,
                            const DrawingTheme& theme);

}  // namespace olvane::draw
