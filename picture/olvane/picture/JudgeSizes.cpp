// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How large a picture is for the persons in it, how long the lines of its families are, and which of them are neither
// horizontal nor vertical.

#include <olvane/picture/PictureJudgeInternal.h>

#include <algorithm>
#include <cmath>
#include <vector>

#include <olvane/kin/shared/Index.h>
#include <olvane/picture/Extent.h>

namespace olvane::picture {

using kin::at;

namespace {

constexpr double kStraight = 0.01;  // points

void countSlanted(const Picture& picture, Judgement& judgement) {
    if (picture.isRound()) return;
    judgement.slanted = static_cast<std::size_t>(
        std::count_if(picture.lines.begin(), picture.lines.end(), [](const Line& line) {
            return std::abs(line.x1 - line.x2) > kStraight && std::abs(line.y1 - line.y2) > kStraight;
        }));
}

void measureLines(const Picture& picture, double boxWidth, Judgement& judgement) {
    std::vector<double> lengths;
    for (const Family& family : picture.families) {
        if (family.lineCount == 0) continue;
        double sum = 0;
        for (const Line& line : picture.linesOf(family)) {
            const double dx = line.x1 - line.x2;
            const double dy = line.y1 - line.y2;
            sum += std::sqrt(dx * dx + dy * dy);
        }
        lengths.push_back(sum / boxWidth);
    }
    if (lengths.empty()) return;
    std::sort(lengths.begin(), lengths.end());
    const auto percentile = [&lengths](std::size_t percent) {
        return lengths[(lengths.size() * percent + 99) / 100 - 1];
    };
    judgement.medianLineLength = percentile(50);
    judgement.longLineLength = percentile(95);
}

}  // namespace

void measure(const Picture& picture, Judgement& judgement) {
    countSlanted(picture, judgement);
    if (picture.boxes.empty()) return;
    double area = 0;
    double widths = 0;
    for (const Box& box : picture.boxes) {
        area += static_cast<double>(box.width) * static_cast<double>(box.height);
        widths += static_cast<double>(box.width);
    }
    const auto count = static_cast<double>(picture.boxes.size());
    const Extent extent = extentOf(picture);
    judgement.width = extent.width();
    judgement.height = extent.height();
    if (judgement.height > 0) judgement.aspect = judgement.width / judgement.height;
    if (area > 0 && judgement.persons > 0) {
        judgement.areaPerPerson =
            judgement.width * judgement.height / (area / count) / static_cast<double>(judgement.persons);
    }
    if (widths > 0) measureLines(picture, widths / count, judgement);
}

}  // namespace olvane::picture
