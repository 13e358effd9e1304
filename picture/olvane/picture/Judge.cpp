// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One sweep finds everything that is close to one another: boxes, pieces of lines, and the strips between
// couples. Each pair is then looked at exactly; pairs of families and boxes are gathered as keys, so that
// each counts once however often it is found.

#include <olvane/picture/Judge.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <map>
#include <numeric>
#include <tuple>
#include <unordered_map>
#include <utility>

#include <olvane/kin/Index.h>
#include <olvane/picture/PieceGeometryInternal.h>
#include <olvane/picture/RectSweepInternal.h>

namespace olvane::picture {

namespace {

// All in points.
constexpr double kInsideBox = 0.5;  // deeper than this, a line runs through
constexpr double kApart = 2;        // nearer than this, pieces are on one track, or touch
constexpr double kBeside = 2;       // longer than this, they run beside one another
constexpr double kJoined = 0.5;     // up to this, things are joined
constexpr double kSameRow = 1;
constexpr double kSideBySide = 1.5;  // of a box
constexpr double kStraight = 0.01;
constexpr double kAngle = 1e-9;  // degrees; less than this is no overlap of cells

using Pair = std::pair<Index, Index>;

Pair ordered(Index a, Index b) {
    return {std::min(a, b), std::max(a, b)};
}

using kin::at;

Rect rectOf(const Box& box, double margin = 0) {
    return {box.x - margin, box.y - margin, box.x + static_cast<double>(box.width) + margin,
            box.y + static_cast<double>(box.height) + margin};
}

// Grown by half of the distance that is looked for, so that pieces that near meet.
Rect rectOf(const Line& line) {
    const double margin = kApart / 2;
    return {std::min(line.x1, line.x2) - margin, std::min(line.y1, line.y2) - margin,
            std::max(line.x1, line.x2) + margin, std::max(line.y1, line.y2) + margin};
}

template <class Value>
void keepEachOnce(std::vector<Value>& values) {
    std::sort(values.begin(), values.end());
    values.erase(std::unique(values.begin(), values.end()), values.end());
}

// Sets of things that are joined.
class Groups {
public:
    explicit Groups(std::size_t count) : parent_(count) {
        std::iota(parent_.begin(), parent_.end(), std::size_t{0});
    }
    std::size_t find(std::size_t i) {
        while (parent_[i] != i) i = parent_[i] = parent_[parent_[i]];
        return i;
    }
    void join(std::size_t a, std::size_t b) { parent_[find(a)] = find(b); }

private:
    std::vector<std::size_t> parent_;
};

// The members of all families, each family's sorted and each box once.
class Members {
public:
    explicit Members(const Picture& picture) {
        first_.reserve(picture.families.size() + 1);
        for (const Family& family : picture.families) {
            first_.push_back(boxes_.size());
            const auto start = static_cast<std::ptrdiff_t>(boxes_.size());
            const auto parents = picture.parents(family);
            const auto children = picture.children(family);
            boxes_.insert(boxes_.end(), parents.begin(), parents.end());
            boxes_.insert(boxes_.end(), children.begin(), children.end());
            std::sort(boxes_.begin() + start, boxes_.end());
            boxes_.erase(std::unique(boxes_.begin() + start, boxes_.end()), boxes_.end());
        }
        first_.push_back(boxes_.size());
    }

    std::size_t count() const { return boxes_.size(); }
    std::span<const Index> of(std::size_t family) const {
        return {boxes_.data() + first_[family], first_[family + 1] - first_[family]};
    }
    // The member's place among all; count() where the box is nobody's in the family.
    std::size_t placeOf(std::size_t family, Index box) const {
        const auto members = of(family);
        const auto found = std::lower_bound(members.begin(), members.end(), box);
        if (found == members.end() || *found != box) return count();
        return first_[family] + static_cast<std::size_t>(found - members.begin());
    }
    std::size_t firstOf(std::size_t family) const { return first_[family]; }
    bool has(std::size_t family, Index box) const { return placeOf(family, box) != count(); }

private:
    std::vector<Index> boxes_;
    std::vector<std::size_t> first_;
};

// The space between two boxes of a couple that stand in one row or column.
struct CoupleStrip {
    Rect rect;
    Index one = kNone;
    Index other = kNone;
    bool isFree = true;
};

class PictureJudge {
public:
    explicit PictureJudge(const Picture& picture)
        : picture_(picture), members_(picture), groups_(picture.lines.size() + members_.count()) {
        familyOfLine_.resize(picture.lines.size(), kNone);
        for (std::size_t f = 0; f < picture.families.size(); ++f) {
            const Family& family = picture.families[f];
            for (std::uint32_t i = 0; i < family.lineCount; ++i) {
                familyOfLine_[family.firstLine + i] = static_cast<Index>(f);
            }
        }
    }

    Judgement run(const kin::KinGraph* known) {
        judgement_.boxes = picture_.boxes.size();
        judgement_.families = picture_.families.size();
        listCouples();
        sweep();
        if (picture_.isRound()) judgeCells();
        countUnjoined();
        countPersons();
        countMarks();
        countSlanted();
        measure();
        if (known != nullptr) judgement_.untold = countUntold(*known);
        countPairs();
        return judgement_;
    }

    std::vector<Finding> findings() const {
        std::vector<Finding> found;
        const auto list = [&found](FindingKind kind, const std::vector<Pair>& pairs) {
            for (const auto& [one, other] : pairs) found.push_back({kind, one, other});
        };
        list(FindingKind::overlap, overlaps_);
        list(FindingKind::hit, hits_);
        list(FindingKind::crossing, crossings_);
        list(FindingKind::track, tracks_);
        list(FindingKind::touch, touches_);
        list(FindingKind::unjoined, unjoined_);
        return found;
    }

private:
    // Couples: each pair of parents' boxes once, and the strip between those that are near enough.
    void listCouples() {
        std::vector<Pair> couples;
        for (const Family& family : picture_.families) {
            if (family.parentCount != 2) continue;
            const auto parents = picture_.parents(family);
            if (parents[0] != parents[1]) couples.push_back(ordered(parents[0], parents[1]));
        }
        keepEachOnce(couples);
        judgement_.couples = couples.size();
        if (picture_.isRound()) return;
        for (const auto& [one, other] : couples) addStrip(one, other);
    }

    void addStrip(Index one, Index other) {
        const Rect a = rectOf(picture_.boxes[at(one)]);
        const Rect b = rectOf(picture_.boxes[at(other)]);
        Rect strip{std::min(a.x2, b.x2), std::max(a.y1, b.y1), std::max(a.x1, b.x1), std::min(a.y2, b.y2)};
        if (std::abs(a.y1 - b.y1) < kSameRow) {
            const double width = ((a.x2 - a.x1) + (b.x2 - b.x1)) / 2;
            if (strip.x2 - strip.x1 >= kSideBySide * width) return;
            if (strip.x2 < strip.x1) std::swap(strip.x1, strip.x2);
        } else if (std::abs(a.x1 - b.x1) < kSameRow) {
            strip = {std::max(a.x1, b.x1), std::min(a.y2, b.y2), std::min(a.x2, b.x2), std::max(a.y1, b.y1)};
            const double height = ((a.y2 - a.y1) + (b.y2 - b.y1)) / 2;
            if (strip.y2 - strip.y1 >= kSideBySide * height) return;
            if (strip.y2 < strip.y1) std::swap(strip.y1, strip.y2);
        } else {
            return;
        }
        strips_.push_back({strip, one, other, true});
    }

    // Boxes first, then lines, then strips.
    void sweep() {
        std::vector<Rect> rects;
        rects.reserve(picture_.boxes.size() + picture_.lines.size() + strips_.size());
        for (const Box& box : picture_.boxes) rects.push_back(rectOf(box, kJoined));
        for (const Line& line : picture_.lines) rects.push_back(rectOf(line));
        for (const CoupleStrip& strip : strips_) rects.push_back(strip.rect);
        RectSweep(rects).forEachPair(
            [this](std::size_t i, std::size_t j) { judgePair(std::min(i, j), std::max(i, j)); });
    }

    void judgePair(std::size_t i, std::size_t j) {
        const std::size_t boxes = picture_.boxes.size();
        const std::size_t lines = picture_.lines.size();
        if (j < boxes) return judgeBoxes(static_cast<Index>(i), static_cast<Index>(j));
        if (j < boxes + lines) {
            if (i < boxes) return judgeBoxAndLine(static_cast<Index>(i), j - boxes);
            return judgeLines(i - boxes, j - boxes);
        }
        if (i < boxes) judgeStrip(static_cast<Index>(i), strips_[j - boxes - lines]);
    }

    void judgeBoxes(Index i, Index j) {
        if (picture_.isRound()) return;
        const Rect a = rectOf(picture_.boxes[at(i)]);
        const Rect b = rectOf(picture_.boxes[at(j)]);
        if (a.x1 < b.x2 && b.x1 < a.x2 && a.y1 < b.y2 && b.y1 < a.y2) overlaps_.push_back(ordered(i, j));
    }

    void judgeBoxAndLine(Index box, std::size_t line) {
        const Index family = familyOfLine_[line];
        if (family == kNone || picture_.isRound()) return;
        const Line& piece = picture_.lines[line];
        const std::size_t member = members_.placeOf(at(family), box);
        const Box& b = picture_.boxes[at(box)];
        if (member == members_.count()) {
            if (runsThrough(piece, rectOf(b, -kInsideBox))) hits_.emplace_back(family, box);
        } else if (runsThrough(piece, rectOf(b, kJoined))) {
            groups_.join(line, picture_.lines.size() + member);
        }
    }

    void judgeLines(std::size_t i, std::size_t j) {
        const Index f = familyOfLine_[i];
        const Index g = familyOfLine_[j];
        if (f == kNone || g == kNone) return;
        const Line& a = picture_.lines[i];
        const Line& b = picture_.lines[j];
        if (f == g) {
            if (distance(a, b) <= kJoined) groups_.join(i, j);
            return;
        }
        if (crossInside(a, b)) crossings_.push_back(ordered(f, g));
        if (runBeside(a, b, kApart, kBeside)) tracks_.push_back(ordered(f, g));
        if (touchOutsideSharedBoxes(a, b, at(f), at(g))) touches_.push_back(ordered(f, g));
    }

    bool touchOutsideSharedBoxes(const Line& a, const Line& b, std::size_t f, std::size_t g) const {
        const auto touches = [&](const Point& end, const Line& piece) {
            return distance(end, piece) < kApart && !inSharedBox(end, f, g);
        };
        return touches(startOf(a), b) || touches(endOf(a), b) || touches(startOf(b), a) ||
               touches(endOf(b), a);
    }

    bool inSharedBox(const Point& p, std::size_t f, std::size_t g) const {
        if (members_.of(f).size() > members_.of(g).size()) std::swap(f, g);
        for (const Index box : members_.of(f)) {
            if (boxHolds(picture_.boxes[at(box)], p, kJoined) && members_.has(g, box)) return true;
        }
        return false;
    }

    void judgeStrip(Index box, CoupleStrip& strip) const {
        if (box == strip.one || box == strip.other) return;
        const Rect a = rectOf(picture_.boxes[at(box)]);
        const Rect& b = strip.rect;
        if (a.x1 < b.x2 && b.x1 < a.x2 && a.y1 < b.y2 && b.y1 < a.y2) strip.isFree = false;
    }

    // A cell with its beginning in [0, 360).
    struct Cell {
        double from = 0;
        double to = 0;
        Index box = kNone;
    };

    Cell cellOf(Index box) const {
        const Arc& arc = picture_.arcs[at(box)];
        const double turns = std::floor(arc.from / 360) * 360;
        return {arc.from - turns, arc.to - turns, box};
    }

    // Cells of a round chart overlap in one ring, and join in neighbouring ones. What reaches over the top is
    // listed a second time, a turn earlier.
    void judgeCells() {
        std::map<std::int32_t, std::vector<Cell>> rings;
        for (std::size_t i = 0; i < picture_.arcs.size(); ++i) {
            const Cell cell = cellOf(static_cast<Index>(i));
            std::vector<Cell>& ring = rings[picture_.arcs[i].ring];
            ring.push_back(cell);
            if (cell.to > 360) ring.push_back({cell.from - 360, cell.to - 360, cell.box});
        }
        for (auto& [ring, cells] : rings) judgeRing(cells);
        for (std::size_t f = 0; f < picture_.families.size(); ++f) joinCells(f);
    }

    void judgeRing(std::vector<Cell>& cells) {
        std::sort(cells.begin(), cells.end(), [](const Cell& a, const Cell& b) {
            return std::pair(a.from, a.box) < std::pair(b.from, b.box);
        });
        for (std::size_t i = 0; i < cells.size(); ++i) {
            for (std::size_t j = i + 1; j < cells.size() && cells[j].from < cells[i].to - kAngle; ++j) {
                if (cells[i].box != cells[j].box) overlaps_.push_back(ordered(cells[i].box, cells[j].box));
            }
        }
    }

    // The middle borders on every cell of the ring around it. Cells that are one ring farther apart are joined by
    // a line across that ring.
    bool cellsBorder(Index a, Index b, int ringsApart = 1) const {
        const std::int32_t ringA = picture_.arcs[at(a)].ring;
        const std::int32_t ringB = picture_.arcs[at(b)].ring;
        if (std::abs(ringA - ringB) != ringsApart) return false;
        if (ringA == 0 || ringB == 0) return true;
        const Cell one = cellOf(a);
        const Cell other = cellOf(b);
        for (const double turn : {-360.0, 0.0, 360.0}) {
            if (one.from < other.to + turn - kAngle && other.from + turn < one.to - kAngle) return true;
        }
        return false;
    }

    // Each parent against each child and the other parent; two parents of one child are joined by it.
    void joinCells(std::size_t f) {
        const Family& family = picture_.families[f];
        const std::size_t first = picture_.lines.size();
        for (const Index parent : picture_.parents(family)) {
            for (const Index child : picture_.children(family)) {
                if (!cellsBorder(parent, child)) continue;
                groups_.join(first + members_.placeOf(f, parent), first + members_.placeOf(f, child));
            }
            for (const Line& line : picture_.linesOf(family)) {
                if (line.child == kNone || !cellsBorder(parent, line.child, 2)) continue;
                groups_.join(first + members_.placeOf(f, parent), first + members_.placeOf(f, line.child));
            }
            const Index other = picture_.parents(family).back();
            if (!cellsBorder(parent, other)) continue;
            groups_.join(first + members_.placeOf(f, parent), first + members_.placeOf(f, other));
        }
    }

    // Reached is whoever is in the group of the family with most members; where no line is drawn, nobody,
    // but for the one who is left when all others have marks.
    void countUnjoined() {
        const std::vector<Pair> marked = markedMembers();
        for (std::size_t f = 0; f < picture_.families.size(); ++f) {
            const auto members = members_.of(f);
            const std::size_t main = mainGroup(f);
            std::vector<Pair> lost;
            for (std::size_t i = 0; i < members.size(); ++i) {
                const std::size_t group = groups_.find(picture_.lines.size() + members_.firstOf(f) + i);
                if (main != kNoGroup && group == main) continue;
                const Pair member{static_cast<Index>(f), members[i]};
                if (!std::binary_search(marked.begin(), marked.end(), member)) lost.push_back(member);
            }
            if (main == kNoGroup && lost.size() == 1 && members.size() > 1) continue;
            if (members.size() > 1) unjoined_.insert(unjoined_.end(), lost.begin(), lost.end());
        }
    }

    static constexpr std::size_t kNoGroup = std::numeric_limits<std::size_t>::max();

    // The group with most members, the first of them where several have as many; kNoGroup where each member
    // is alone and no line is drawn.
    std::size_t mainGroup(std::size_t f) {
        std::map<std::size_t, std::size_t> sizes;
        std::size_t best = kNoGroup;
        const std::size_t count = members_.of(f).size();
        for (std::size_t i = 0; i < count; ++i) {
            const std::size_t group = groups_.find(picture_.lines.size() + members_.firstOf(f) + i);
            const std::size_t size = ++sizes[group];
            if (best == kNoGroup || size > sizes[best]) best = group;
        }
        const bool isDrawn = picture_.families[f].lineCount > 0 || (best != kNoGroup && sizes[best] > 1);
        return isDrawn ? best : kNoGroup;
    }

    // Whom a mark joins to a family: a child whose parents are all parents of it, and partners of it.
    std::vector<Pair> markedMembers() const {
        const std::vector<std::vector<std::size_t>> marksOf = marksByFirstBox();
        std::vector<Pair> marked;
        for (std::size_t f = 0; f < picture_.families.size(); ++f) {
            const auto parents = picture_.parents(picture_.families[f]);
            for (const Index member : members_.of(f)) {
                for (const std::size_t m : marksOf[at(member)]) {
                    if (isMarked(picture_.marks[m], picture_.families[f], parents, member)) {
                        marked.emplace_back(static_cast<Index>(f), member);
                    }
                }
            }
        }
        keepEachOnce(marked);
        return marked;
    }

    std::vector<std::vector<std::size_t>> marksByFirstBox() const {
        std::vector<std::vector<std::size_t>> marksOf(picture_.boxes.size());
        for (std::size_t m = 0; m < picture_.marks.size(); ++m) {
            const Mark& mark = picture_.marks[m];
            if (mark.kind == MarkKind::samePerson || mark.boxes[0] == kNone) continue;
            marksOf[at(mark.boxes[0])].push_back(m);
            if (mark.kind == MarkKind::partnersElsewhere && mark.boxes[1] != kNone) {
                marksOf[at(mark.boxes[1])].push_back(m);
            }
        }
        return marksOf;
    }

    bool isMarked(const Mark& mark, const Family& family, std::span<const Index> parents,
                  Index member) const {
        const auto isParent = [&](Index box) {
            return box == kNone || std::find(parents.begin(), parents.end(), box) != parents.end();
        };
        if (mark.kind == MarkKind::partnersElsewhere)
            return isParent(mark.boxes[0]) && isParent(mark.boxes[1]);
        const auto children = picture_.children(family);
        return isParent(mark.boxes[1]) && isParent(mark.boxes[2]) &&
               std::find(children.begin(), children.end(), member) != children.end();
    }

    void countPersons() {
        std::vector<std::pair<std::int64_t, Index>> shown;
        for (std::size_t i = 0; i < picture_.boxes.size(); ++i) {
            if (picture_.boxes[i].kind == BoxKind::person) {
                shown.emplace_back(picture_.boxes[i].id, static_cast<Index>(i));
            }
        }
        std::sort(shown.begin(), shown.end());
        std::vector<bool> hasMark(picture_.boxes.size());
        for (const Mark& mark : picture_.marks) {
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
            ++judgement_.persons;
            if (next - i < 2) continue;
            ++judgement_.repeats;
            if (!allMarked) ++judgement_.unmarked;
        }
    }

    void countMarks() {
        for (const Mark& mark : picture_.marks) {
            switch (mark.kind) {
                case MarkKind::samePerson:
                    ++judgement_.samePersonMarks;
                    break;
                case MarkKind::parentsElsewhere:
                    ++judgement_.parentsElsewhereMarks;
                    break;
                case MarkKind::partnersElsewhere:
                    ++judgement_.partnersElsewhereMarks;
                    break;
            }
        }
    }

    void countSlanted() {
        if (picture_.isRound()) return;
        judgement_.slanted = static_cast<std::size_t>(
            std::count_if(picture_.lines.begin(), picture_.lines.end(), [](const Line& line) {
                return std::abs(line.x1 - line.x2) > kStraight && std::abs(line.y1 - line.y2) > kStraight;
            }));
    }

    void measure() {
        if (picture_.boxes.empty()) return;
        Rect bounds = rectOf(picture_.boxes[0]);
        const auto include = [&bounds](const Rect& r) {
            bounds = {std::min(bounds.x1, r.x1), std::min(bounds.y1, r.y1), std::max(bounds.x2, r.x2),
                      std::max(bounds.y2, r.y2)};
        };
        double area = 0;
        double widths = 0;
        for (const Box& box : picture_.boxes) {
            include(rectOf(box));
            area += static_cast<double>(box.width) * static_cast<double>(box.height);
            widths += static_cast<double>(box.width);
        }
        for (const Line& line : picture_.lines) {
            include({std::min(line.x1, line.x2), std::min(line.y1, line.y2), std::max(line.x1, line.x2),
                     std::max(line.y1, line.y2)});
        }
        const auto count = static_cast<double>(picture_.boxes.size());
        judgement_.width = bounds.x2 - bounds.x1;
        judgement_.height = bounds.y2 - bounds.y1;
        if (judgement_.height > 0) judgement_.aspect = judgement_.width / judgement_.height;
        if (area > 0 && judgement_.persons > 0) {
            judgement_.areaPerPerson = judgement_.width * judgement_.height / (area / count) /
                                       static_cast<double>(judgement_.persons);
        }
        if (widths > 0) measureLines(widths / count);
    }

    void measureLines(double boxWidth) {
        std::vector<double> lengths;
        for (const Family& family : picture_.families) {
            if (family.lineCount == 0) continue;
            double sum = 0;
            for (const Line& line : picture_.linesOf(family)) {
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
        judgement_.medianLineLength = percentile(50);
        judgement_.longLineLength = percentile(95);
    }

    using Relation = std::pair<std::int64_t, std::int64_t>;

    // Pairs of ids: children with parents, and partners with the lesser id first.
    struct Relations {
        std::vector<Relation> parents;
        std::vector<Relation> partners;

        void addParent(std::int64_t child, std::int64_t parent) { parents.emplace_back(child, parent); }
        void addPartners(std::int64_t a, std::int64_t b) {
            if (a != b) partners.emplace_back(std::min(a, b), std::max(a, b));
        }
        void sort() {
            keepEachOnce(parents);
            keepEachOnce(partners);
        }
    };

    std::int64_t idAt(Index box) const { return picture_.boxes[at(box)].id; }
    bool isPerson(Index box) const { return box != kNone && picture_.boxes[at(box)].kind == BoxKind::person; }

    Relations expressedRelations() const {
        Relations expressed;
        for (const Family& family : picture_.families) {
            const auto parents = picture_.parents(family);
            if (parents.size() == 2 && isPerson(parents[0]) && isPerson(parents[1])) {
                expressed.addPartners(idAt(parents[0]), idAt(parents[1]));
            }
            for (const Index child : picture_.children(family)) addParents(expressed, child, parents);
        }
        for (const Mark& mark : picture_.marks) {
            if (mark.kind == MarkKind::partnersElsewhere && isPerson(mark.boxes[0]) &&
                isPerson(mark.boxes[1])) {
                expressed.addPartners(idAt(mark.boxes[0]), idAt(mark.boxes[1]));
            }
            if (mark.kind == MarkKind::parentsElsewhere) {
                addParents(expressed, mark.boxes[0], {mark.boxes + 1, 2});
            }
        }
        expressed.sort();
        return expressed;
    }

    void addParents(Relations& expressed, Index child, std::span<const Index> parents) const {
        for (const Index parent : parents) {
            if (isPerson(parent) && isPerson(child)) expressed.addParent(idAt(child), idAt(parent));
        }
    }

    std::size_t countUntold(const kin::KinGraph& known) const {
        const Relations expected = knownRelations(known);
        const Relations expressed = expressedRelations();
        const auto missing = [](const std::vector<Relation>& all, const std::vector<Relation>& some) {
            return static_cast<std::size_t>(
                std::count_if(all.begin(), all.end(), [&some](const Relation& relation) {
                    return !std::binary_search(some.begin(), some.end(), relation);
                }));
        };
        return missing(expected.parents, expressed.parents) + missing(expected.partners, expressed.partners);
    }

    Relations knownRelations(const kin::KinGraph& known) const {
        std::vector<bool> isShown(static_cast<std::size_t>(known.personCount()));
        for (std::size_t i = 0; i < picture_.boxes.size(); ++i) {
            const kin::Place place =
                isPerson(static_cast<Index>(i)) ? known.placeOf(picture_.boxes[i].id) : kin::kNobody;
            if (place != kin::kNobody) isShown[at(place)] = true;
        }
        const auto shown = [&isShown](kin::Place p) { return p != kin::kNobody && isShown[at(p)]; };
        Relations relations;
        for (kin::UnionPlace u = 0; u < known.unionCount(); ++u) {
            const auto& partners = known.partners(u);
            if (shown(partners[0]) && shown(partners[1])) {
                relations.addPartners(known.id(partners[0]), known.id(partners[1]));
            }
            for (const kin::Place parent : partners) {
                if (!shown(parent)) continue;
                for (const kin::Place child : known.children(u)) {
                    if (shown(child)) relations.addParent(known.id(child), known.id(parent));
                }
            }
        }
        relations.sort();
        return relations;
    }

    void countPairs() {
        for (auto* pairs : {&overlaps_, &hits_, &crossings_, &tracks_, &touches_, &unjoined_}) {
            keepEachOnce(*pairs);
        }
        judgement_.overlaps = overlaps_.size();
        judgement_.hits = hits_.size();
        judgement_.crossings = crossings_.size();
        judgement_.tracks = tracks_.size();
        judgement_.touches = touches_.size();
        judgement_.unjoined = unjoined_.size();
        judgement_.sideBySide = static_cast<std::size_t>(
            std::count_if(strips_.begin(), strips_.end(), [](const CoupleStrip& s) { return s.isFree; }));
    }

    const Picture& picture_;
    Members members_;
    Groups groups_;  // lines, then members
    std::vector<Index> familyOfLine_;
    std::vector<CoupleStrip> strips_;
    std::vector<Pair> overlaps_;
    std::vector<Pair> hits_;
    std::vector<Pair> crossings_;
    std::vector<Pair> tracks_;
    std::vector<Pair> touches_;
    std::vector<Pair> unjoined_;
    Judgement judgement_;
};

std::unordered_map<std::int64_t, Point> placesFromFocus(const Picture& picture) {
    std::unordered_map<std::int64_t, Point> places;
    Point origin;
    if (picture.focus != kNone) {
        const Box& box = picture.boxes[at(picture.focus)];
        origin = {box.x, box.y};
    }
    for (const Box& box : picture.boxes) {
        if (box.kind == BoxKind::person && box.repeat <= 1) {
            places.emplace(box.id, Point{box.x - origin.x, box.y - origin.y});
        }
    }
    return places;
}

}  // namespace

Judgement judge(const Picture& picture, const kin::KinGraph* known, std::vector<Finding>* findings) {
    PictureJudge judge(picture);
    const Judgement judgement = judge.run(known);
    if (findings != nullptr) *findings = judge.findings();
    return judgement;
}

double movedShare(const Picture& before, const Picture& after) {
    const auto old = placesFromFocus(before);
    std::size_t both = 0;
    std::size_t moved = 0;
    for (const auto& [id, place] : placesFromFocus(after)) {
        const auto found = old.find(id);
        if (found == old.end()) continue;
        ++both;
        const bool stands =
            std::abs(found->second.x - place.x) <= 0.5 && std::abs(found->second.y - place.y) <= 0.5;
        if (!stands) ++moved;
    }
    return both == 0 ? 0 : static_cast<double>(moved) / static_cast<double>(both);
}

}  // namespace olvane::picture
