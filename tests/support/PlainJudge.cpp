// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "PlainJudge.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <set>
#include <utility>
#include <vector>

namespace olvane::test {

namespace {

using picture::Box;
using picture::Family;
using picture::Index;
using picture::Line;
using picture::Mark;
using picture::MarkKind;
using picture::Picture;
using Pairs = std::set<std::pair<std::size_t, std::size_t>>;

// A piece as the ranges that it covers; one of them is a single value.
struct Ranges {
    double left, right, top, bottom;
};

Ranges rangesOf(const Line& line) {
    return {std::min(line.x1, line.x2), std::max(line.x1, line.x2), std::min(line.y1, line.y2),
            std::max(line.y1, line.y2)};
}
Ranges rangesOf(const Box& box) {
    return {box.x, box.x + static_cast<double>(box.width), box.y, box.y + static_cast<double>(box.height)};
}

bool isFlat(const Line& line) {
    return line.y1 == line.y2;
}

double gap(double from1, double to1, double from2, double to2) {
    return std::max({0.0, from2 - to1, from1 - to2});
}

double distance(const Ranges& a, const Ranges& b) {
    const double dx = gap(a.left, a.right, b.left, b.right);
    const double dy = gap(a.top, a.bottom, b.top, b.bottom);
    return std::sqrt(dx * dx + dy * dy);
}

bool overlap(const Ranges& a, const Ranges& b, double least) {
    return std::min(a.right, b.right) - std::max(a.left, b.left) > least &&
           std::min(a.bottom, b.bottom) - std::max(a.top, b.top) > least;
}

bool insideOf(double v, double from, double to) {
    return v > from + 1e-6 && v < to - 1e-6;
}

bool cross(const Line& a, const Line& b) {
    if (isFlat(a) == isFlat(b)) return false;
    const Ranges flat = rangesOf(isFlat(a) ? a : b);
    const Ranges steep = rangesOf(isFlat(a) ? b : a);
    return insideOf(steep.left, flat.left, flat.right) && insideOf(flat.top, steep.top, steep.bottom);
}

bool onOneTrack(const Line& a, const Line& b) {
    if (isFlat(a) != isFlat(b)) return false;
    const Ranges p = rangesOf(a);
    const Ranges q = rangesOf(b);
    if (isFlat(a))
        return std::abs(p.top - q.top) < 2 && std::min(p.right, q.right) - std::max(p.left, q.left) > 2;
    return std::abs(p.left - q.left) < 2 && std::min(p.bottom, q.bottom) - std::max(p.top, q.top) > 2;
}

class PlainJudge {
public:
    explicit PlainJudge(const Picture& picture) : picture_(picture) {
        for (const Family& family : picture.families) {
            std::set<Index> members;
            for (const Index box : picture.parents(family)) members.insert(box);
            for (const Index box : picture.children(family)) members.insert(box);
            members_.push_back(members);
        }
    }

    picture::Judgement run(const kin::KinGraph* known) {
        picture::Judgement counts;
        counts.overlaps = countOverlaps();
        counts.hits = countHits();
        counts.crossings = countFamilies(cross);
        counts.tracks = countFamilies(onOneTrack);
        counts.touches = countTouches();
        counts.unjoined = countUnjoined();
        countCouples(counts);
        countRepeats(counts);
        for (const Line& line : picture_.lines) {
            if (line.x1 != line.x2 && line.y1 != line.y2) ++counts.slanted;
        }
        if (known != nullptr) counts.untold = countUntold(*known);
        return counts;
    }

private:
    const Box& box(Index i) const { return picture_.boxes[static_cast<std::size_t>(i)]; }
    std::span<const Line> lines(std::size_t f) const { return picture_.linesOf(picture_.families[f]); }
    std::size_t familyCount() const { return picture_.families.size(); }

    std::size_t countOverlaps() const {
        std::size_t count = 0;
        for (std::size_t i = 0; i < picture_.boxes.size(); ++i) {
            for (std::size_t j = 0; j < i; ++j) {
                if (overlap(rangesOf(picture_.boxes[i]), rangesOf(picture_.boxes[j]), 0)) ++count;
            }
        }
        return count;
    }

    std::size_t countHits() const {
        Pairs hits;
        for (std::size_t f = 0; f < familyCount(); ++f) {
            for (std::size_t b = 0; b < picture_.boxes.size(); ++b) {
                if (members_[f].contains(static_cast<Index>(b))) continue;
                Ranges inside = rangesOf(picture_.boxes[b]);
                inside = {inside.left + 0.5, inside.right - 0.5, inside.top + 0.5, inside.bottom - 0.5};
                for (const Line& line : lines(f)) {
                    const Ranges piece = rangesOf(line);
                    const bool meets = piece.left < inside.right && piece.right > inside.left &&
                                       piece.top < inside.bottom && piece.bottom > inside.top;
                    if (meets) hits.emplace(f, b);
                }
            }
        }
        return hits.size();
    }

    template <class Test>
    std::size_t countFamilies(Test test) const {
        Pairs pairs;
        for (std::size_t f = 0; f < familyCount(); ++f) {
            for (std::size_t g = 0; g < f; ++g) {
                for (const Line& a : lines(f)) {
                    for (const Line& b : lines(g)) {
                        if (test(a, b)) pairs.emplace(f, g);
                    }
                }
            }
        }
        return pairs.size();
    }

    bool inSharedBox(const Ranges& point, std::size_t f, std::size_t g) const {
        for (const Index member : members_[f]) {
            if (!members_[g].contains(member)) continue;
            const Ranges b = rangesOf(box(member));
            const Ranges grown{b.left - 0.5, b.right + 0.5, b.top - 0.5, b.bottom + 0.5};
            if (distance(point, grown) == 0) return true;
        }
        return false;
    }

    bool endsOn(const Line& a, const Line& b, std::size_t f, std::size_t g) const {
        for (const Ranges end : {Ranges{a.x1, a.x1, a.y1, a.y1}, Ranges{a.x2, a.x2, a.y2, a.y2}}) {
            if (distance(end, rangesOf(b)) < 2 && !inSharedBox(end, f, g)) return true;
        }
        return false;
    }

    std::size_t countTouches() const {
        Pairs pairs;
        for (std::size_t f = 0; f < familyCount(); ++f) {
            for (std::size_t g = 0; g < familyCount(); ++g) {
                if (f == g) continue;
                for (const Line& a : lines(f)) {
                    for (const Line& b : lines(g)) {
                        if (endsOn(a, b, f, g)) pairs.emplace(std::min(f, g), std::max(f, g));
                    }
                }
            }
        }
        return pairs.size();
    }

    bool isMarked(std::size_t f, Index member) const {
        const auto parents = picture_.parents(picture_.families[f]);
        const auto children = picture_.children(picture_.families[f]);
        const auto in = [](std::span<const Index> list, Index b) {
            return std::find(list.begin(), list.end(), b) != list.end();
        };
        for (const Mark& mark : picture_.marks) {
            const auto parentOrNone = [&](Index b) { return b == picture::kNone || in(parents, b); };
            if (mark.kind == MarkKind::parentsElsewhere && mark.boxes[0] == member && in(children, member) &&
                parentOrNone(mark.boxes[1]) && parentOrNone(mark.boxes[2])) {
                return true;
            }
            if (mark.kind == MarkKind::partnersElsewhere &&
                (mark.boxes[0] == member || mark.boxes[1] == member) && parentOrNone(mark.boxes[0]) &&
                parentOrNone(mark.boxes[1])) {
                return true;
            }
        }
        return false;
    }

    // Spreads from each member over lines and members that are joined; the largest reach is the family's.
    std::size_t countUnjoined() const {
        std::size_t count = 0;
        for (std::size_t f = 0; f < familyCount(); ++f) {
            std::set<Index> main;
            for (const Index member : members_[f]) {
                const std::set<Index> reached = reachFrom(f, member);
                if (reached.size() > main.size()) main = reached;
            }
            if (lines(f).empty()) main.clear();
            std::size_t lost = 0;
            for (const Index member : members_[f]) {
                if (!main.contains(member) && !isMarked(f, member)) ++lost;
            }
            if (members_[f].size() < 2 || (lines(f).empty() && lost == 1)) lost = 0;
            count += lost;
        }
        return count;
    }

    std::set<Index> reachFrom(std::size_t f, Index start) const {
        std::set<Index> reached{start};
        std::vector<bool> reachedLine(lines(f).size());
        for (bool grows = true; grows;) {
            grows = false;
            for (std::size_t i = 0; i < lines(f).size(); ++i) {
                const Ranges piece = rangesOf(lines(f)[i]);
                bool joins = false;
                for (const Index b : reached) joins = joins || distance(rangesOf(box(b)), piece) < 0.5;
                for (std::size_t j = 0; j < lines(f).size(); ++j) {
                    joins = joins || (reachedLine[j] && distance(rangesOf(lines(f)[j]), piece) <= 0.5);
                }
                if (!joins || reachedLine[i]) continue;
                reachedLine[i] = grows = true;
                for (const Index b : members_[f]) {
                    if (distance(rangesOf(box(b)), piece) < 0.5) reached.insert(b);
                }
            }
        }
        return reached;
    }

    void countCouples(picture::Judgement& counts) const {
        std::set<std::pair<Index, Index>> couples;
        for (const Family& family : picture_.families) {
            const auto parents = picture_.parents(family);
            if (parents.size() == 2 && parents[0] != parents[1]) {
                couples.emplace(std::min(parents[0], parents[1]), std::max(parents[0], parents[1]));
            }
        }
        counts.couples = couples.size();
        for (const auto& [a, b] : couples) {
            if (standSideBySide(a, b)) ++counts.sideBySide;
        }
    }

    bool standSideBySide(Index a, Index b) const {
        Ranges p = rangesOf(box(a));
        Ranges q = rangesOf(box(b));
        const bool inRow = std::abs(p.top - q.top) < 1;
        const bool inColumn = std::abs(p.left - q.left) < 1;
        if (!inRow && !inColumn) return false;
        if (!inRow) {
            std::swap(p.left, p.top), std::swap(p.right, p.bottom);
            std::swap(q.left, q.top), std::swap(q.right, q.bottom);
        }
        const double size = (p.right - p.left + q.right - q.left) / 2;
        const double from = std::min(p.right, q.right);
        const double to = std::max(p.left, q.left);
        if (to - from >= 1.5 * size) return false;
        Ranges strip{std::min(from, to), std::max(from, to), std::max(p.top, q.top),
                     std::min(p.bottom, q.bottom)};
        if (!inRow) std::swap(strip.left, strip.top), std::swap(strip.right, strip.bottom);
        for (Index i = 0; i < static_cast<Index>(picture_.boxes.size()); ++i) {
            if (i != a && i != b && overlap(rangesOf(box(i)), strip, 0)) return false;
        }
        return true;
    }

    void countRepeats(picture::Judgement& counts) const {
        std::map<std::int64_t, std::vector<Index>> boxesOf;
        for (Index i = 0; i < static_cast<Index>(picture_.boxes.size()); ++i) {
            if (box(i).kind == picture::BoxKind::person) boxesOf[box(i).id].push_back(i);
        }
        counts.persons = boxesOf.size();
        for (const auto& [id, boxes] : boxesOf) {
            if (boxes.size() < 2) continue;
            ++counts.repeats;
            const bool allMarked = std::all_of(boxes.begin(), boxes.end(), [this](Index b) {
                return std::any_of(picture_.marks.begin(), picture_.marks.end(), [b](const Mark& mark) {
                    return mark.kind == MarkKind::samePerson &&
                           std::find(mark.boxes, mark.boxes + 3, b) != mark.boxes + 3;
                });
            });
            if (!allMarked) ++counts.unmarked;
        }
    }

    // Whether an entry or a mark has the child's id with the parent's id; both boxes are persons.
    bool expressesParent(std::int64_t child, std::int64_t parent) const {
        const auto is = [this](Index b, std::int64_t id) {
            return b != picture::kNone && box(b).kind == picture::BoxKind::person && box(b).id == id;
        };
        for (const Family& family : picture_.families) {
            for (const Index c : picture_.children(family)) {
                for (const Index p : picture_.parents(family)) {
                    if (is(c, child) && is(p, parent)) return true;
                }
            }
        }
        return std::any_of(picture_.marks.begin(), picture_.marks.end(), [&](const Mark& mark) {
            return mark.kind == MarkKind::parentsElsewhere && is(mark.boxes[0], child) &&
                   (is(mark.boxes[1], parent) || is(mark.boxes[2], parent));
        });
    }

    bool expressesPartners(std::int64_t a, std::int64_t b) const {
        const auto are = [&](Index p, Index q) {
            return p != picture::kNone && q != picture::kNone && box(p).kind == picture::BoxKind::person &&
                   box(q).kind == picture::BoxKind::person &&
                   ((box(p).id == a && box(q).id == b) || (box(p).id == b && box(q).id == a));
        };
        for (const Family& family : picture_.families) {
            const auto parents = picture_.parents(family);
            if (parents.size() == 2 && are(parents[0], parents[1])) return true;
        }
        return std::any_of(picture_.marks.begin(), picture_.marks.end(), [&](const Mark& mark) {
            return mark.kind == MarkKind::partnersElsewhere && are(mark.boxes[0], mark.boxes[1]);
        });
    }

    std::size_t countUntold(const kin::KinGraph& known) const {
        std::set<std::int64_t> shown;
        for (const Box& b : picture_.boxes) {
            if (b.kind == picture::BoxKind::person) shown.insert(b.id);
        }
        std::set<std::pair<std::int64_t, std::int64_t>> parents;
        std::set<std::pair<std::int64_t, std::int64_t>> partners;
        for (const std::int64_t id : shown) {
            const kin::Place person = known.placeOf(id);
            if (person == kin::kNobody) continue;
            for (const kin::UnionPlace u : known.unionsAsChild(person)) {
                for (const kin::Place parent : known.partners(u)) {
                    if (parent == kin::kNobody || !shown.contains(known.id(parent))) continue;
                    if (!expressesParent(id, known.id(parent))) parents.emplace(id, known.id(parent));
                }
            }
            for (const kin::UnionPlace u : known.unionsAsPartner(person)) {
                const kin::Place other = known.otherPartner(u, person);
                if (other == kin::kNobody || other == person || !shown.contains(known.id(other))) continue;
                const std::int64_t otherId = known.id(other);
                if (!expressesPartners(id, otherId))
                    partners.emplace(std::min(id, otherId), std::max(id, otherId));
            }
        }
        return parents.size() + partners.size();
    }

    const Picture& picture_;
    std::vector<std::set<Index>> members_;
};

}  // namespace

picture::Judgement plainJudgement(const Picture& picture, const kin::KinGraph* known) {
    return PlainJudge(picture).run(known);
}

}  // namespace olvane::test
