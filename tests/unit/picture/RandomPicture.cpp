// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "RandomPicture.h"

#include <random>

namespace olvane::test {

namespace {

using picture::Box;
using picture::Family;
using picture::Index;
using picture::Line;
using picture::Mark;
using picture::Picture;

class PictureMaker {
public:
    explicit PictureMaker(std::uint32_t seed) : random_(seed) {}

    Picture make() {
        const int boxes = upTo(12) + 2;
        for (int i = 0; i < boxes; ++i) addBox();
        const int families = upTo(6);
        for (int i = 0; i < families; ++i) addFamily();
        const int marks = upTo(3);
        for (int i = 0; i < marks; ++i) addMark();
        for (int i = upTo(3); i > 0; --i) addFolded();
        return picture_;
    }

private:
    int upTo(int most) { return static_cast<int>(random_() % static_cast<std::uint32_t>(most + 1)); }
    double place() { return upTo(60) * 2.5; }
    Index anyBox() { return upTo(static_cast<int>(picture_.boxes.size()) - 1); }

    void addBox() {
        Box box;
        box.id = upTo(9) + 1;
        box.x = place();
        box.y = upTo(3) == 0 ? place() : upTo(3) * 40;
        box.width = static_cast<float>(10 + upTo(3) * 5);
        box.height = static_cast<float>(10 + upTo(2) * 5);
        if (upTo(8) == 0) box.kind = picture::BoxKind::unknownParent;
        picture_.boxes.push_back(box);
    }

    void addFamily() {
        Family family;
        family.firstMember = static_cast<std::uint32_t>(picture_.members.size());
        family.firstLine = static_cast<std::uint32_t>(picture_.lines.size());
        family.parentCount = static_cast<std::uint8_t>(1 + upTo(1));
        family.childCount = static_cast<std::uint32_t>(upTo(3));
        for (std::uint32_t i = 0; i < family.parentCount + family.childCount; ++i) {
            picture_.members.push_back(anyBox());
        }
        picture_.childKinds.resize(picture_.members.size());
        double x = place();
        double y = place();
        for (int pieces = upTo(5); pieces > 0; --pieces) {
            Line line{x, y, x, y};
            (upTo(1) == 0 ? line.x2 : line.y2) = place();
            picture_.lines.push_back(line);
            if (upTo(3) == 0) x = place();
            x = line.x2;
            y = line.y2;
        }
        family.lineCount = static_cast<std::uint32_t>(picture_.lines.size()) - family.firstLine;
        picture_.families.push_back(family);
    }

    void addFolded() {
        picture::FoldedBranch folded;
        folded.box = upTo(static_cast<int>(picture_.boxes.size()) - 1);
        folded.count = 1 + upTo(50);
        folded.branch = static_cast<picture::Branch>(upTo(2));
        folded.side = static_cast<picture::Side>(upTo(3));
        picture_.folded.push_back(folded);
    }

    void addMark() {
        Mark mark;
        mark.kind = static_cast<picture::MarkKind>(upTo(2));
        mark.boxes[0] = anyBox();
        mark.boxes[1] = anyBox();
        if (mark.kind == picture::MarkKind::parentsElsewhere && upTo(1) == 0) mark.boxes[2] = anyBox();
        picture_.marks.push_back(mark);
    }

    std::mt19937 random_;
    Picture picture_;
};

}  // namespace

picture::Picture randomPicture(std::uint32_t seed) {
    return PictureMaker(seed).make();
}

}  // namespace olvane::test
