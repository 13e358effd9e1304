// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Any host, asked for a picture of any view with any options: all that a request can say, the places of an earlier
// picture included. The host contradicts itself, answers numbers that are no ids, changes its mind and throws at any
// question. Either there is a picture, which its own reader reads back, or a status with a reason, and never an
// exception. Of a host that answers the same each time, the picture is the same each time, everybody stands in one
// box, and no line of a chart misleads.

#include <array>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include <olvane/charts/CheckedPicture.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/PictureJson.h>
#include <olvane/picture/PictureJsonReader.h>

#include "Holds.h"
#include "MadeUpHost.h"

namespace {

using namespace olvane::charts;
using olvane::picture::Picture;

// All that an input says.
struct Input {
    std::vector<MadeUpPerson> family;
    Mischief mischief;
    ViewRequest request;
    std::int64_t focus = 0;
    std::int64_t other = 0;
    bool usualSizes = true;
    bool keepsPlaces = false;
};

float nextLength(ByteSource& bytes) {
    constexpr std::array<float, 8> kOdd = {0.0F,
                                           -1.0F,
                                           0.25F,
                                           1e30F,
                                           std::numeric_limits<float>::max(),
                                           std::numeric_limits<float>::infinity(),
                                           std::numeric_limits<float>::quiet_NaN(),
                                           std::numeric_limits<float>::denorm_min()};
    const std::uint8_t byte = bytes.next();
    return byte >= 224 ? kOdd[byte % kOdd.size()] : static_cast<float>(byte);
}

double nextNumber(ByteSource& bytes) {
    constexpr std::array<double, 8> kOdd = {0.0,  -1.0,
                                            1e-9, 1e300,
                                            1e9,  std::numeric_limits<double>::infinity(),
                                            90.0, std::numeric_limits<double>::quiet_NaN()};
    const std::uint8_t byte = bytes.next();
    return byte >= 224 ? kOdd[byte % kOdd.size()] : 2.0 * byte;
}

// 0 for all generations; the last is one that no request may have.
int nextGenerations(ByteSource& bytes) {
    constexpr std::array<int, 8> kGenerations = {0, 1, 2, 3, 5, 25, std::numeric_limits<int>::max(), -1};
    return kGenerations[bytes.nextBelow(kGenerations.size())];
}

void drawLayoutOptions(ByteSource& bytes, olvane::LayoutOptions& layout) {
    bool* const kSwitches[] = {&layout.auntsUncles,       &layout.cousins,          &layout.siblings,
                               &layout.siblingSpouses,    &layout.niecesNephews,    &layout.grandchildren,
                               &layout.greatGrandparents, &layout.spousesOfChildren};
    const std::uint8_t off = bytes.next();
    for (std::size_t i = 0; i < std::size(kSwitches); ++i) *kSwitches[i] = ((off >> i) & 1U) == 0;
    layout.generations = 1 + static_cast<int>(bytes.nextBelow(6));
    layout.flagDepth = static_cast<int>(bytes.nextBelow(6));
}

void drawChart(ByteSource& bytes, ChartRequest& chart) {
    chart.view = static_cast<View>(bytes.nextBelow(10));
    chart.up = nextGenerations(bytes);
    chart.down = nextGenerations(bytes);
    chart.direction = static_cast<Direction>(bytes.nextBelow(4));
    const std::uint8_t switches = bytes.next();
    chart.spouses = (switches & 1U) == 0;
    chart.siblings = (switches & 2U) != 0;
    chart.compact = (switches & 4U) != 0;
    chart.onePart = (switches & 8U) == 0;
    chart.fanOf = static_cast<FanOf>((switches >> 4U) & 1U);
    chart.effort = static_cast<int>((switches >> 5U) & 1U);
    chart.ways = static_cast<WayChoice>(bytes.nextBelow(3));
    chart.mostWays = static_cast<int>(bytes.nextBelow(10)) - 1;
    chart.language = olvane::kin::kLanguages[bytes.nextBelow(olvane::kin::kLanguages.size())];
    chart.marks = static_cast<int>(bytes.nextBelow(6)) - 1;
    drawLayoutOptions(bytes, chart.layout);
}

Input nextInput(ByteSource& bytes) {
    Input input;
    drawChart(bytes, input.request.chart);
    const std::uint8_t choices = bytes.next();
    input.usualSizes = (choices & 3U) != 0;
    input.keepsPlaces = (choices & 4U) != 0;
    input.mischief.isFickle = (choices & 24U) == 8U;
    if ((choices & 24U) == 16U) input.mischief.throwsAtCall = 1 + bytes.nextBelow(200);
    input.mischief.kindOfThrow = bytes.next();
    input.request.unknownParents = (choices & 32U) == 0;
    if (!input.usualSizes) {
        ChartSizes& sizes = input.request.chart.sizes;
        for (float* const size : {&sizes.boxWidth, &sizes.boxHeight, &sizes.gapX, &sizes.gapY}) {
            *size = nextLength(bytes);
        }
    }
    if ((choices & 64U) != 0) input.request.chart.fanAngle = nextNumber(bytes);
    if ((choices & 128U) != 0) input.request.chart.aspect = nextNumber(bytes);
    const std::size_t focus = bytes.next();
    const std::size_t other = bytes.next();
    input.family = makeUpFamily(bytes);
    input.focus = input.family[focus % input.family.size()].id;
    input.other = input.family[other % input.family.size()].id;
    return input;
}

CheckedPicture pictureFrom(const Input& input, const Mischief& mischief) {
    const auto host = std::make_shared<MadeUpHost>(input.family, mischief);
    return checkedPicture(host, input.focus, input.request, input.other);
}

bool isOfEngine(View view) {
    return view == View::family || view == View::pedigree;
}

// Which lines a chart may have: none that misleads, and everybody's relations drawn or marked.
void judgeChart(const Picture& picture, const ChartRequest& chart, bool usualSizes) {
    std::set<std::int64_t> ids;
    for (const auto& box : picture.boxes) HOLDS(ids.insert(box.id).second);
    const auto judged = olvane::picture::judge(picture);
    HOLDS(judged.unmarked == 0);
    if (!usualSizes) return;
    HOLDS(judged.overlaps + judged.unjoined + judged.hits + judged.tracks + judged.touches == 0);
    HOLDS(judged.slanted == 0);
    HOLDS(chart.view == View::everybody || judged.crossings == 0);
}

void checkOutcome(const Input& input, const CheckedPicture& made) {
    if (!made.isOk()) {
        HOLDS(made.picture.boxes.empty());
        HOLDS(made.status == olvane::CheckedStatus::outOfMemory || !made.reason.text().empty());
        return;
    }
    const std::string json = olvane::picture::pictureJson(made.picture);
    const Picture read = olvane::picture::readPictureJson(json);
    HOLDS(read.boxes.size() == made.picture.boxes.size() && read.lines.size() == made.picture.lines.size());
    if (isOfEngine(input.request.chart.view)) return;
    HOLDS(made.picture.focus >= 0);
    HOLDS(made.picture.boxes[static_cast<std::size_t>(made.picture.focus)].id == input.focus);
    judgeChart(made.picture, input.request.chart, input.usualSizes);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    ByteSource bytes({data, size});
    Input input = nextInput(bytes);
    Picture earlier;
    if (input.keepsPlaces) {
        Input before = input;
        before.family = makeUpFamily(bytes);  // other relations between the same ids
        before.request.chart.view = View::everybody;
        before.focus = before.family.front().id;
        earlier = pictureFrom(before, Mischief()).picture;
        if (!earlier.boxes.empty()) input.request.chart.earlier = &earlier;
    }
    const CheckedPicture made = pictureFrom(input, input.mischief);
    checkOutcome(input, made);
    const CheckedPicture again = pictureFrom(input, input.mischief);
    HOLDS(again.status == made.status && again.reason.text() == made.reason.text());
    HOLDS(olvane::picture::pictureJson(again.picture) == olvane::picture::pictureJson(made.picture));
    return 0;
}
