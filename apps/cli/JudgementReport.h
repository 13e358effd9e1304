// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/picture/Judge.h>

namespace olvane::cli {

// A picture that was judged.
struct JudgedPicture {
    std::string file;
    std::string view;
    picture::Judgement counts;
    std::vector<picture::Finding> findings;
};

// "overlap", "hit", "crossing" and so on.
const char* findingName(picture::FindingKind kind);

// Whether something in the picture can be misread: boxes that overlap, lines through boxes of others, lines of two
// families on one track or ending on one another, members whom no line reaches, relations that nothing expresses, a
// person's several boxes without a mark.
bool hasTrouble(const picture::Judgement& counts);

// For people to read: a line for each count, a column for each picture.
std::string judgementsText(const std::vector<JudgedPicture>& pictures);

// Tab-separated values: a heading, then a line for each picture. An empty cell is a count that was not made.
std::string judgementsTable(const std::vector<JudgedPicture>& pictures);

// JSON of the form of docs/judgement.schema.json.
std::string judgementsJson(const std::vector<JudgedPicture>& pictures);

}  // namespace olvane::cli
