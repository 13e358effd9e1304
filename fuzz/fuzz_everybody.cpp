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

// What must hold of a chart of this family.
olvane::picture::Picture checkedChart(const olvane::kin::KinGraph& graph,
                                      const olvane::charts::EverybodyOptions& options) {
    olvane::picture::Picture picture = olvane::charts::everybodyChart(graph, options);
    const olvane::picture::Judgement j = olvane::picture::judge(picture, &graph);
    HOLDS(j.persons == picture.boxes.size());
    HOLDS(options.onePart || picture.boxes.size() == static_cast<std::size_t>(graph.personCount()));
    HOLDS(j.overlaps == 0 && j.hits == 0 && j.slanted == 0);
    HOLDS(j.tracks == 0 && j.touches == 0);
    HOLDS(j.unjoined == 0 && *j.untold == 0);
    HOLDS(options.marks >= 0 || j.crossings == 0);
    return picture;
}

}  // namespace

// The last byte asks for lines closer together, for paper, and for a chart of another family of the same ids, whose
// bytes are those of the second half, with the places of the first kept.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Bytes bytes(data, size);
    const int further = size > 0 ? data[size - 1] : 0;
    olvane::charts::EverybodyOptions options;
    options.marks = bytes.below(5) - 1;
    options.effort = bytes.below(2);
    options.onePart = bytes.below(4) == 0;
    options.direction = static_cast<olvane::charts::Direction>(bytes.below(4));
    if (bytes.below(4) == 0) options.foldAspect = 0;
    options.compact = (further & 1) != 0;
    if ((further & 6) == 6) options.aspect = 0.5 + (further >> 4);
    const olvane::kin::KinGraph graph = familyOf(bytes);
    options.focus = bytes.below(graph.personCount());
    const olvane::picture::Picture picture = checkedChart(graph, options);
    if ((further & 8) == 0) return 0;
    Bytes half(data + size / 2, size - size / 2);
    const olvane::kin::KinGraph other = familyOf(half);
    options.focus = 0;
    options.earlier = &picture;
    checkedChart(other, options);
    return 0;
}
