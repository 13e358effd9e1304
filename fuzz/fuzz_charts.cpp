// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Any bytes as a family and a chart of it. Everybody has one box, nothing overlaps, no line misleads, and every
// relation is expressed; in round charts as well. Boxes may be of any size, zero included.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <set>
#include <vector>

#include <olvane/charts/Charts.h>
#include <olvane/picture/Judge.h>

#include "AnyKin.h"
#include "Holds.h"

namespace {

using namespace olvane::charts;
using olvane::kin::KinGraph;
using olvane::picture::Picture;

// Numbers from the bytes, and zeros behind their end.
class Bytes {
public:
    Bytes(const std::uint8_t* data, std::size_t size) : data_(data), size_(size) {}
    int operator()(int count) const { return place_ < size_ ? data_[place_++] % count : 0; }

private:
    const std::uint8_t* data_;
    std::size_t size_;
    mutable std::size_t place_ = 0;
};

ChartRequest requestFrom(const Bytes& choose, const KinGraph& graph) {
    constexpr View kViews[] = {View::near,      View::ancestors, View::descendants, View::hourglass,
                               View::relatives, View::fan,       View::kinship};
    ChartRequest request;
    request.view = kViews[choose(7)];
    request.focus = choose(graph.personCount());
    request.to = choose(graph.personCount());
    request.up = choose(5);
    request.down = choose(5);
    request.direction = static_cast<Direction>(choose(4));
    request.spouses = choose(2) == 0;
    request.siblings = choose(2) == 0;
    request.fanOf = static_cast<FanOf>(choose(2));
    request.fanAngle = 90 + 10 * choose(28);
    request.ways = static_cast<WayChoice>(choose(3));
    request.compact = choose(2) == 0;
    request.mirrored = choose(2) == 0;
    return request;
}

void judgeChart(const KinGraph& graph, const ChartRequest& request, bool usualSizes) {
    const Picture picture = chartOf(graph, request);
    HOLDS(!picture.boxes.empty());
    HOLDS(picture.boxes[static_cast<std::size_t>(picture.focus)].id == graph.id(request.focus));
    std::set<std::int64_t> ids;
    for (const auto& box : picture.boxes) HOLDS(ids.insert(box.id).second);
    const auto judged = olvane::picture::judge(picture, &graph);
    HOLDS(judged.overlaps == 0);
    HOLDS(judged.untold == 0U);
    if (!usualSizes) return;
    HOLDS(judged.unjoined == 0);
    HOLDS(judged.hits + judged.crossings + judged.tracks + judged.touches + judged.slanted == 0);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const Bytes choose(data, size);
    const int persons = 1 + choose(60);
    const int unions = choose(60);
    const bool isOrderly = choose(2) == 0;
    const KinGraph graph = AnyKin::make(persons, unions, isOrderly, choose).graph();
    ChartRequest request = requestFrom(choose, graph);
    std::vector<BoxSize> sizes;
    const bool usualSizes = choose(4) != 0;
    if (!usualSizes) {
        sizes.resize(static_cast<std::size_t>(persons));
        for (BoxSize& one : sizes) one = {static_cast<float>(choose(120)), static_cast<float>(choose(120))};
        request.boxSizes = sizes;
    }
    if (choose(4) == 3) request.aspect = 0.25 * (1 + choose(12));
    judgeChart(graph, request, usualSizes);
    return 0;
}
