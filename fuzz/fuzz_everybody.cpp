// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Bytes as a family of up to 60 persons, contradictions and all, and as what is asked of its chart. Whatever it is,
// each person has one box, no two boxes overlap, every link is expressed, and no line can be taken for another's.

#include <olvane/charts/Everybody.h>
#include <olvane/picture/Judge.h>

#include <cstddef>
#include <cstdint>

#include "Holds.h"

namespace {

class Bytes {
public:
    Bytes(const std::uint8_t* data, std::size_t size) : data_(data), size_(size) {}
    bool empty() const { return next_ >= size_; }
    int below(int count) { return empty() ? 0 : data_[next_++] % count; }

private:
    const std::uint8_t* data_;
    std::size_t size_;
    std::size_t next_ = 0;
};

olvane::kin::KinGraph familyOf(Bytes& bytes) {
    olvane::kin::KinGraphBuilder builder;
    const int persons = 1 + bytes.below(60);
    for (int i = 0; i < persons; ++i) builder.addPerson(7 * i - 20, static_cast<olvane::kin::Sex>(i % 3));
    for (int unions = 0; unions < 80 && !bytes.empty(); ++unions) {
        const int one = bytes.below(persons);
        const int other = bytes.below(persons + 1) - 1;
        const auto u = builder.addUnion(one, other, static_cast<olvane::kin::UnionState>(unions % 4));
        for (int children = bytes.below(5); children > 0; --children) {
            builder.addChild(u, bytes.below(persons), olvane::kin::ChildKind::birth);
        }
    }
    return builder.build();
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Bytes bytes(data, size);
    olvane::charts::EverybodyOptions options;
    options.marks = bytes.below(5) - 1;
    options.effort = bytes.below(2);
    options.onePart = bytes.below(4) == 0;
    options.direction = static_cast<olvane::charts::Direction>(bytes.below(4));
    if (bytes.below(4) == 0) options.foldAspect = 0;
    const olvane::kin::KinGraph graph = familyOf(bytes);
    options.focus = bytes.below(graph.personCount());
    const olvane::picture::Picture picture = olvane::charts::everybodyChart(graph, options);
    const olvane::picture::Judgement j = olvane::picture::judge(picture, &graph);
    HOLDS(j.persons == picture.boxes.size());
    HOLDS(options.onePart || picture.boxes.size() == static_cast<std::size_t>(graph.personCount()));
    HOLDS(j.overlaps == 0 && j.hits == 0 && j.slanted == 0);
    HOLDS(j.tracks == 0 && j.touches == 0);
    HOLDS(j.unjoined == 0 && *j.untold == 0);
    HOLDS(options.marks >= 0 || j.crossings == 0);
    return 0;
}
