// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyPictureInternal.h>

#include <algorithm>

#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

using picture::Index;
using picture::LineRole;

constexpr double kPartGap = 80;

class PictureBuilder {
public:
    PictureBuilder(const kin::KinGraph& graph, const BoxSizes& boxes, picture::Picture& picture)
        : graph_(graph), boxes_(boxes), picture_(picture), boxOf_(at(graph.personCount()), picture::kNone) {}

    void addBoxes(const std::vector<PartLayout>& parts, kin::Place focus) {
        std::vector<std::int32_t> partOf(at(graph_.personCount()), -1);
        std::vector<std::int32_t> local(at(graph_.personCount()), -1);
        for (std::size_t p = 0; p < parts.size(); ++p) {
            for (std::int32_t i = 0; i < parts[p].part.personCount(); ++i) {
                partOf[at(parts[p].part.persons[at(i)])] = static_cast<std::int32_t>(p);
                local[at(parts[p].part.persons[at(i)])] = i;
            }
            offset_.push_back(p == 0 ? 0 : offset_.back() + parts[p - 1].width + kPartGap);
        }
        for (kin::Place person = 0; person < graph_.personCount(); ++person) {
            if (partOf[at(person)] < 0) continue;
            boxOf_[at(person)] = static_cast<Index>(picture_.boxes.size());
            if (person == focus) picture_.focus = boxOf_[at(person)];
            addBox(parts[at(partOf[at(person)])], local[at(person)], offset_[at(partOf[at(person)])]);
        }
    }

    void addPart(const PartLayout& layout, std::size_t place) {
        l_ = &layout;
        offsetX_ = offset_[place];
        std::size_t strand = 0;
        std::size_t link = 0;
        for (std::int32_t u = 0; u < layout.part.unionCount(); ++u) {
            const std::size_t firstStrand = strand;
            while (strand < layout.rows.strands.size() && layout.rows.strands[strand].unionPlace == u)
                ++strand;
            addFamily(u, firstStrand, strand, link);
            link += layout.part.children[u].size();
        }
    }

private:
    void addBox(const PartLayout& layout, std::int32_t person, double offsetX) {
        const std::int32_t chain = layout.chains.chain[at(person)];
        const auto persons = layout.chains.persons[chain];
        const bool flipped = layout.order.flipped[at(chain)] != 0;
        double x = offsetX + layout.left[at(chain)];
        const auto slot = at(layout.chains.slot[at(person)]);
        for (std::size_t i = flipped ? persons.size() - 1 : 0; i != slot; flipped ? --i : ++i) {
            x += boxes_.width(layout.part, persons[i]) + layout.sizes.gap;
        }
        const auto row = at(layout.rows.row[at(chain)]);
        picture::Box box;
        const kin::Place place = layout.part.persons[at(person)];
        box.id = graph_.id(place);
        box.sex = graph_.sex(place);
        box.width = static_cast<float>(boxes_.width(layout.part, person));
        box.height = static_cast<float>(boxes_.height(layout.part, person));
        box.x = x;
        box.y = layout.rowTop[row] + (layout.rowHeight[row] - double{box.height}) / 2;
        picture_.boxes.push_back(box);
    }

    const picture::Box& box(std::int32_t person) const {
        return picture_.boxes[at(boxOf_[at(l_->part.persons[at(person)])])];
    }
    Index boxIndex(std::int32_t person) const { return boxOf_[at(l_->part.persons[at(person)])]; }

    void addFamily(std::int32_t u, std::size_t firstStrand, std::size_t lastStrand, std::size_t link) {
        const auto& two = l_->part.partners[at(u)];
        const kin::UnionPlace place = l_->part.unions[at(u)];
        const auto children = graph_.children(place);
        const std::size_t parents = (two[0] >= 0 ? 1U : 0U) + (two[1] >= 0 ? 1U : 0U);
        if (parents + children.size() < 2) return;
        picture::Family family;
        family.firstMember = static_cast<std::uint32_t>(picture_.members.size());
        family.firstLine = static_cast<std::uint32_t>(picture_.lines.size());
        family.number = graph_.family(place);
        family.parentCount = static_cast<std::uint8_t>(parents);
        family.childCount = static_cast<std::uint32_t>(children.size());
        family.style = graph_.state(place);
        for (const std::int32_t person : two) {
            if (person < 0) continue;
            picture_.members.push_back(boxIndex(person));
            picture_.childKinds.push_back(kin::ChildKind::unknown);
        }
        for (std::size_t i = 0; i < children.size(); ++i) {
            picture_.members.push_back(boxOf_[at(children[i])]);
            picture_.childKinds.push_back(graph_.childKinds(place)[i]);
        }
        const bool together = two[0] >= 0 && two[1] >= 0 && l_->marked.partner[at(u)] == 0 &&
                              l_->chains.areNeighbours(two[0], two[1]);
        double startY = 0;
        if (together) startY = addMarriage(two[0], two[1], u, firstStrand < lastStrand);
        double passTop = 0;
        for (std::size_t s = firstStrand; s < lastStrand; ++s) addStrand(s, startY, passTop);
        family.lineCount = static_cast<std::uint32_t>(picture_.lines.size()) - family.firstLine;
        addMarks(u, link);
        picture_.families.push_back(family);
    }

    // The y of the line between two neighbours. Of several unions of one couple, those from which nothing hangs are
    // drawn higher and higher, out of the way of the others' drops.
    double addMarriage(std::int32_t a, std::int32_t b, std::int32_t u, bool hasDrop) {
        const picture::Box& left = box(a).x < box(b).x ? box(a) : box(b);
        const picture::Box& right = box(a).x < box(b).x ? box(b) : box(a);
        int before = 0;
        for (const std::int32_t other : l_->part.asPartner[a]) {
            if (other == u) break;
            const auto& two = l_->part.partners[at(other)];
            if ((two[0] == a && two[1] == b) || (two[0] == b && two[1] == a)) ++before;
        }
        const double room =
            std::max(0.0, std::min(double{left.height}, double{right.height}) / 2 - kMarriageMargin);
        const double away = std::min(before * kMarriageGap, room);
        const double y = left.y + double{left.height} / 2 + (hasDrop ? away : -away);
        addLine(left.x + double{left.width}, y, right.x, y, LineRole::marriage);
        return y;
    }

    void addLine(double x1, double y1, double x2, double y2, LineRole role, Index child = picture::kNone) {
        if (x1 == x2 && y1 == y2 && role != LineRole::marriage) return;  // boxes without a gap are joined
        picture::Line line;
        line.x1 = x1;
        line.y1 = y1;
        line.x2 = x2;
        line.y2 = y2;
        line.role = role;
        line.child = child;
        picture_.lines.push_back(line);
    }

    // passTop: where the upright of the strand's pass from above starts; then where that of its pass below does.
    void addStrand(std::size_t s, double coupleY, double& passTop) {
        const Rows& rows = l_->rows;
        const Rows::Strand& strand = rows.strands[s];
        const std::int32_t track = l_->lines.track[s];
        const double barY = l_->gapTop[at(strand.gap + 1)] + std::max(0, track) * l_->trackGap;
        const auto x = [&](std::uint32_t e) { return offsetX_ + l_->lines.endX[e]; };
        const bool straight = track < 0 && strand.aboveCount == 1 && strand.belowCount == 1;
        double low = x(strand.firstEnd);
        double high = low;
        double start = barY;
        for (std::uint32_t e = strand.firstEnd; e < strand.firstEnd + strand.aboveCount; ++e) {
            const double top = startOf(rows.ends[e], coupleY, passTop);
            low = std::min(low, x(e));
            high = std::max(high, x(e));
            if (straight) {
                start = top;
            } else {
                addLine(x(e), top, x(e), barY,
                        rows.ends[e].sub % 2 == 1 || rows.isPass(rows.ends[e].node) ? LineRole::drop
                                                                                    : LineRole::marriage);
            }
        }
        for (std::uint32_t e = strand.firstEnd + strand.aboveCount;
             e < strand.firstEnd + strand.aboveCount + strand.belowCount; ++e) {
            low = std::min(low, x(e));
            high = std::max(high, x(e));
        }
        if (low < high) addLine(low, barY, high, barY, LineRole::bar);
        for (std::uint32_t e = strand.firstEnd + strand.aboveCount;
             e < strand.firstEnd + strand.aboveCount + strand.belowCount; ++e) {
            const Rows::End& end = rows.ends[e];
            if (rows.isPass(end.node)) {
                passTop = start;
                continue;
            }
            const std::int32_t child = l_->chains.persons[end.node][at(end.sub / 2)];
            addLine(x(e), start, x(e), box(child).y, LineRole::stem, boxIndex(child));
        }
    }

    double startOf(const Rows::End& end, double coupleY, double passTop) const {
        if (l_->rows.isPass(end.node)) return passTop;
        if (end.sub % 2 == 1) return coupleY;
        const picture::Box& parent = box(l_->chains.persons[end.node][at(end.sub / 2)]);
        return parent.y + double{parent.height};
    }

    void addMarks(std::int32_t u, std::size_t link) {
        const auto& two = l_->part.partners[at(u)];
        std::int32_t number = 0;
        for (const std::int32_t child : l_->part.children[u]) {
            if (l_->marked.child[link++] == 0) continue;
            if (number == 0) number = ++marks_;
            picture::Mark mark;
            mark.kind = picture::MarkKind::parentsElsewhere;
            mark.number = number;
            mark.boxes[0] = boxIndex(child);
            std::size_t next = 1;
            for (const std::int32_t parent : two) {
                if (parent >= 0) mark.boxes[next++] = boxIndex(parent);
            }
            picture_.marks.push_back(mark);
        }
        if (l_->marked.partner[at(u)] == 0 || two[0] < 0 || two[1] < 0) return;
        picture::Mark mark;
        mark.kind = picture::MarkKind::partnersElsewhere;
        mark.number = ++marks_;
        mark.boxes[0] = boxIndex(two[0]);
        mark.boxes[1] = boxIndex(two[1]);
        picture_.marks.push_back(mark);
    }

    const kin::KinGraph& graph_;
    const BoxSizes& boxes_;
    picture::Picture& picture_;
    std::vector<Index> boxOf_;
    std::vector<double> offset_;
    const PartLayout* l_ = nullptr;
    double offsetX_ = 0;
    std::int32_t marks_ = 0;
};

}  // namespace

picture::Picture pictureOfParts(const kin::KinGraph& graph, const std::vector<PartLayout>& parts,
                                const BoxSizes& boxes, kin::Place focus) {
    picture::Picture picture;
    picture.view = "everybody";
    PictureBuilder builder(graph, boxes, picture);
    builder.addBoxes(parts, focus);
    for (std::size_t i = 0; i < parts.size(); ++i) builder.addPart(parts[i], i);
    return picture;
}

}  // namespace olvane::charts
