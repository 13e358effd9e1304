// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Who is shown how often, and which marks there are.

#include <olvane/picture/PictureJudgeInternal.h>

#include <algorithm>
#include <cstdint>
#include <utility>
#include <vector>

#include <olvane/kin/shared/Index.h>

namespace olvane::picture {

using kin::at;

void countPersons(const Picture& picture, Judgement& judgement) {
    std::vector<std::pair<std::int64_t, Index>> shown;
    for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
        if (picture.boxes[i].kind == BoxKind::person) {
            shown.emplace_back(picture.boxes[i].id, static_cast<Index>(i));
        }
    }
    std::sort(shown.begin(), shown.end());
    std::vector<bool> hasMark(picture.boxes.size());
    for (const Mark& mark : picture.marks) {
        if (mark.kind != MarkKind::samePerson) continue;
        for (const Index box : mark.boxes) {
            if (box != kNone) hasMark[at(box)] = true;
        }
    }
    for (std::size_t i = 0, next = 0; i < shown.size(); i = next) {
        bool allMarked = true;
        for (next = i; next < shown.size() && shown[next].first == shown[i].first; ++next) {
            allMarked = allMarked && hasMark[at(shown[next].second)];
        }
        ++judgement.persons;
        if (next - i < 2) continue;
        ++judgement.repeats;
        if (!allMarked) ++judgement.unmarked;
    }
}

void countMarks(const Picture& picture, Judgement& judgement) {
    for (const Mark& mark : picture.marks) {
        switch (mark.kind) {
            case MarkKind::samePerson:
                ++judgement.samePersonMarks;
                break;
            case MarkKind::parentsElsewhere:
                ++judgement.parentsElsewhereMarks;
                break;
            case MarkKind::partnersElsewhere:
                ++judgement.partnersElsewhereMarks;
                break;
        }
    }
}

}  // namespace olvane::picture
