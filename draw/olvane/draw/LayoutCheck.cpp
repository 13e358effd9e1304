// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Counts what disturbs in a layout. Boxes are sorted by their left edges, so that each question looks only at
// those that can answer it.

#include <olvane/draw/LayoutCheck.h>

#include <algorithm>
#include <cstdlib>
#include <iterator>
#include <set>
#include <tuple>
#include <unordered_map>

#include <olvane/draw/FamilyLinesInternal.h>

namespace olvane::draw {

namespace {

// Coordinates are cut to whole points, so that a line that ends on a box may seem to reach into it by as
// much.
constexpr int kCut = 1;

// The records in the order of their left edges.
class BoxIndex {
public:
    BoxIndex(const std::vector<LayoutRecord>& records, const BoxSize& box) : box_(box) {
        for (const LayoutRecord& record : records) byLeft_.push_back(&record);
        std::stable_sort(byLeft_.begin(), byLeft_.end(),
                         [](const LayoutRecord* a, const LayoutRecord* b) { return a->x < b->x; });
    }

    const std::vector<const LayoutRecord*>& byLeft() const { return byLeft_; }

    // Every record whose box may have a point in the open span between two x.
    template <class Visit>
    void forEachBetween(int left, int right, Visit visit) const {
        auto at = std::upper_bound(byLeft_.begin(), byLeft_.end(), left - box_.width,
                                   [](int x, const LayoutRecord* record) { return x < record->x; });
        for (; at != byLeft_.end() && (*at)->x < right; ++at) visit(**at);
    }

private:
    BoxSize box_;
    std::vector<const LayoutRecord*> byLeft_;
};

void findOverlaps(const BoxIndex& index, const BoxSize& box, LayoutFindings& findings) {
    const auto& boxes = index.byLeft();
    for (std::size_t i = 0; i < boxes.size(); ++i) {
        for (std::size_t j = i + 1; j < boxes.size() && boxes[j]->x < boxes[i]->x + box.width; ++j) {
            if (std::abs(boxes[i]->y - boxes[j]->y) < box.height) {
                findings.overlappingBoxes.emplace_back(boxes[i]->id, boxes[j]->id);
            }
        }
    }
}

bool runsThrough(const LayoutSegment& s, const LayoutRecord& record, const BoxSize& box) {
    const auto [left, right] = std::minmax(s.x1, s.x2);
    const auto [top, bottom] = std::minmax(s.y1, s.y2);
    const bool isPoint = left == right && top == bottom;
    return !isPoint && right > record.x + kCut && left < record.x + box.width - kCut &&
           bottom > record.y + kCut && top < record.y + box.height - kCut;
}

void findLinesThroughBoxes(const std::vector<LayoutRecord>& records, const BoxIndex& index,
                           const BoxSize& box, LayoutFindings& findings) {
    std::set<std::tuple<int, int, int, int>> seen;
    for (const LayoutRecord& holder : records) {
        for (const LayoutSegment& segment : holder.segments) {
            if (!seen.emplace(segment.x1, segment.y1, segment.x2, segment.y2).second) continue;
            const auto [left, right] = std::minmax(segment.x1, segment.x2);
            index.forEachBetween(left, right + 1, [&](const LayoutRecord& record) {
                if (runsThrough(segment, record, box))
                    findings.linesThroughBoxes.emplace_back(holder.id, record.id);
            });
        }
    }
}

// A straight piece of a family's line: at a place across its own direction, over a span along it.
struct Run {
    bool isTrunk;
    int across;
    int from;
    int to;
    std::size_t family;
};

std::vector<Run> runsOf(const std::vector<FamilyLine>& families) {
    std::vector<Run> runs;
    for (std::size_t i = 0; i < families.size(); ++i) {
        const FamilyLine& family = families[i];
        runs.push_back({true, family.trunk, family.first(), family.last(), i});
        for (const FamilyTap& tap : family.taps) {
            const auto [from, to] = std::minmax(tap.end, family.trunk);
            runs.push_back({false, tap.at, from, to, i});
        }
    }
    return runs;
}

std::int64_t firstChildOf(const FamilyLine& family, const std::vector<LayoutRecord>& records) {
    for (const FamilyTap& tap : family.taps) {
        if (tap.childRecord != FamilyTap::kNoRecord) return records[tap.childRecord].id;
    }
    return 0;
}

// Runs of one kind and place follow each other by where they begin, so each looks ahead as far as it reaches.
void findSharedTracks(const std::vector<LayoutRecord>& records, const std::vector<FamilyLine>& families,
                      LayoutFindings& findings) {
    std::vector<Run> runs = runsOf(families);
    std::stable_sort(runs.begin(), runs.end(), [](const Run& a, const Run& b) {
        return std::tie(a.isTrunk, a.across, a.from) < std::tie(b.isTrunk, b.across, b.from);
    });
    std::set<std::pair<std::size_t, std::size_t>> pairs;
    for (std::size_t i = 0; i < runs.size(); ++i) {
        for (std::size_t j = i + 1; j < runs.size(); ++j) {
            const bool sameTrack = runs[j].isTrunk == runs[i].isTrunk && runs[j].across == runs[i].across;
            if (!sameTrack || runs[j].from >= runs[i].to) break;
            const bool hasLength = runs[j].to > runs[j].from;
            if (hasLength && runs[i].family != runs[j].family) {
                pairs.insert(std::minmax(runs[i].family, runs[j].family));
            }
        }
    }
    for (const auto& [one, other] : pairs) {
        findings.sharedTracks.emplace_back(firstChildOf(families[one], records),
                                           firstChildOf(families[other], records));
    }
}

void findRepeats(const std::vector<LayoutRecord>& records, LayoutFindings& findings) {
    std::unordered_map<std::int64_t, std::size_t> place;
    std::vector<RepeatedPerson> persons;
    for (const LayoutRecord& record : records) {
        const auto [entry, isNew] = place.emplace(record.id, persons.size());
        if (isNew) persons.push_back({record.id, 0});
        ++persons[entry->second].boxes;
    }
    std::copy_if(persons.begin(), persons.end(), std::back_inserter(findings.repeatedPersons),
                 [](const RepeatedPerson& person) { return person.boxes > 1; });
}

}  // namespace

LayoutFindings checkLayout(const std::vector<LayoutRecord>& records, LineDirection direction,
                           const BoxSize& box) {
    LayoutFindings findings;
    const BoxIndex index(records, box);
    findOverlaps(index, box, findings);
    findLinesThroughBoxes(records, index, box, findings);
    findSharedTracks(records, collectLines(records, direction, box).families, findings);
    findRepeats(records, findings);
    return findings;
}

}  // namespace olvane::draw
