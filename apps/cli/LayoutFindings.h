// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include <olvane/picture/Judge.h>

namespace olvane::cli {

// What makes one picture hard to read, by the ids of those whom it is about. A family has the id of its first child,
// or by that of a parent where it has none.
struct LayoutFindings {
    struct Pair {
        picture::FindingKind kind = picture::FindingKind::overlap;
        std::int64_t one = 0;
        std::int64_t other = 0;
    };

    picture::Judgement counts;
    std::vector<Pair> pairs;                                 // of every kind but crossings
    std::vector<std::pair<std::int64_t, int>> severalBoxes;  // ids, and how many boxes they have

    // Whether anything can be misread; a crossing, or several boxes with marks, cannot.
    bool hasTrouble() const;
};

LayoutFindings findingsOf(const picture::Picture& picture);

// For one picture: a line for each finding, then the counts in a sentence.
std::string findingsText(const LayoutFindings& findings, double boxWidth, double boxHeight);

// For many pictures, tab-separated: a heading, a line for the picture of each focus, a line of totals.
std::string findingsHeading();
std::string findingsLine(const std::string& focus, const LayoutFindings& findings);
std::string findingsTotal(const picture::Judgement& totals, std::size_t troubled);

// Adds what findingsTotal prints.
void addCounts(const picture::Judgement& counts, picture::Judgement& totals);

}  // namespace olvane::cli
