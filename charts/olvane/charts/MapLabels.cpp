// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Names for what is too small to be read. The map is cut into cells, each a place for one label; the cells of a scale
// are made of four, or two, of the scale below, and so are their counts.

#include <olvane/charts/MapLabelsInternal.h>

#include <algorithm>
#include <cstddef>
#include <tuple>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

constexpr std::uint32_t kFinestLevel = 3;  // names are read in the boxes beyond it
constexpr std::int64_t kCellWidth = 200;   // pixels
constexpr std::int64_t kCellHeight = 60;
constexpr std::int64_t kWindow =
    1000;  // a small one; farther away than all of the map in it there is nothing
constexpr std::int64_t kLeastCells = 12;  // a window that shows the whole height of a map has that many
constexpr std::uint32_t kLeastBearers = 3;
constexpr std::uint32_t kLeastShare = 12;  // a surname speaks for a cell if every twelfth bears it

std::size_t at(std::uint32_t place) {
    return static_cast<std::size_t>(place);
}

// The bearers of one surname in a cell, or all its persons; where they stand, and who of them has the largest branch.
struct Group {
    std::int64_t column;
    std::int64_t line;
    std::uint32_t surname;
    std::uint32_t count;
    std::int64_t sumX;
    std::int64_t sumY;
    std::uint32_t greatest;

    auto key() const { return std::tuple(line, column, surname); }
};

class Labeller {
public:
    explicit Labeller(MapIndex& map) : map_(map), branch_(branchSizes(map)) {
        for (std::size_t row = 0; row < map.rows.size(); ++row) {
            const std::uint32_t end = row + 1 < map.rows.size() ? map.rows[row + 1].firstPerson
                                                                : static_cast<std::uint32_t>(map.x.size());
            for (std::uint32_t p = map.rows[row].firstPerson; p < end; ++p) addPerson(p, map.rows[row].y);
        }
    }

    void run() {
        const std::int64_t height = map_.rows.back().y - map_.rows.front().y + map_.boxHeight;
        const std::int64_t mapWidth = width();
        merge();
        for (std::uint32_t level = kFinestLevel;; ++level) {
            addLevel(level);
            if ((kWindow << level) * MapIndex::kUnit >= mapWidth) return;
            const bool isLower = (kCellHeight << level) * MapIndex::kUnit * kLeastCells * 2 <= height;
            for (Group& group : groups_) {
                group.column >>= 1;
                if (isLower) group.line >>= 1;
            }
            merge();
        }
    }

private:
    void addPerson(std::uint32_t p, std::int32_t y) {
        const std::int64_t x = map_.x[at(p)] + std::int64_t{map_.boxWidth} / 2;
        const std::int64_t middle = y + std::int64_t{map_.boxHeight} / 2;
        constexpr std::int64_t kWidth = (kCellWidth << kFinestLevel) * MapIndex::kUnit;
        constexpr std::int64_t kHeight = (kCellHeight << kFinestLevel) * MapIndex::kUnit;
        // Places may lie left of 0.
        groups_.push_back(
            {(x + kOffset) / kWidth, (middle + kOffset) / kHeight, map_.surnames[at(p)], 1, x, middle, p});
    }

    // Groups of the same cell and surname become one.
    void merge() {
        kin::mergeSort(groups_.begin(), groups_.end(), [](const Group& a, const Group& b) {
            return std::tuple(a.key(), a.greatest) < std::tuple(b.key(), b.greatest);
        });
        std::size_t last = 0;
        for (std::size_t i = 1; i < groups_.size(); ++i) {
            if (groups_[i].key() == groups_[last].key()) {
                join(groups_[last], groups_[i]);
            } else {
                groups_[++last] = groups_[i];
            }
        }
        groups_.resize(last + 1);
    }

    void join(Group& into, const Group& from) const {
        into.count += from.count;
        into.sumX += from.sumX;
        into.sumY += from.sumY;
        if (branch_[at(from.greatest)] > branch_[at(into.greatest)]) into.greatest = from.greatest;
    }

    std::int64_t width() const {
        const auto [least, most] = std::minmax_element(map_.x.begin(), map_.x.end());
        return std::int64_t{*most} - *least;
    }

    void addLevel(std::uint32_t level) {
        const auto first = static_cast<std::uint32_t>(map_.labels.size());
        map_.labelLevels.push_back({level, first});
        for (std::size_t begin = 0; begin < groups_.size();) {
            std::size_t end = begin + 1;
            while (end < groups_.size() && groups_[end].line == groups_[begin].line &&
                   groups_[end].column == groups_[begin].column) {
                ++end;
            }
            addCell(begin, end);
            begin = end;
        }
        kin::mergeSort(map_.labels.begin() + first, map_.labels.end(), [](const auto& a, const auto& b) {
            return std::tuple(b.weight, a.y, a.x, a.text) < std::tuple(a.weight, b.y, b.x, b.text);
        });
    }

    void addCell(std::size_t begin, std::size_t end) {
        const Group* best = nullptr;
        Group all = groups_[begin];
        for (std::size_t i = begin; i < end; ++i) {
            const Group& group = groups_[i];
            if (i > begin) join(all, group);
            if (group.surname != 0 && (!best || group.count > best->count)) best = &group;
        }
        if (best && best->count >= kLeastBearers && best->count * kLeastShare >= all.count) {
            addLabel(*best, best->surname, best->count);
        } else if (map_.names[at(all.greatest)] != 0 && branch_[at(all.greatest)] >= kLeastBearers) {
            addLabel(all, MapIndex::kPersonLabel | all.greatest, branch_[at(all.greatest)]);
        }
    }

    void addLabel(const Group& where, std::uint32_t text, std::uint32_t weight) {
        map_.labels.push_back({static_cast<std::int32_t>(where.sumX / where.count),
                               static_cast<std::int32_t>(where.sumY / where.count), text, weight});
    }

    static constexpr std::int64_t kOffset = std::int64_t{1} << 32;

    MapIndex& map_;
    std::vector<std::uint32_t> branch_;
    std::vector<Group> groups_;
};

}  // namespace

std::vector<std::uint32_t> branchSizes(const MapIndex& map) {
    std::vector<std::uint32_t> size(map.x.size(), 1);
    // The first union that a person is a child of leads to one parent.
    std::vector<std::int32_t> parent(map.x.size(), MapIndex::kNobody);
    constexpr std::uint32_t kPersonMask = (1U << MapIndex::kChildBits) - 1;
    for (std::size_t u = 0; u < map.partners.size(); ++u) {
        const auto& two = map.partners[u];
        const std::int32_t one = two[0] != MapIndex::kNobody ? two[0] : two[1];
        for (std::uint32_t i = map.childStarts[u]; i < map.childStarts[u + 1]; ++i) {
            std::int32_t& of = parent[map.children[i] & kPersonMask];
            if (of == MapIndex::kNobody) of = one;
        }
    }
    // Persons are sorted by row, so children come behind their parents; who does not is left out.
    for (std::size_t p = map.x.size(); p-- > 0;) {
        if (parent[p] != MapIndex::kNobody && static_cast<std::size_t>(parent[p]) < p) {
            size[static_cast<std::size_t>(parent[p])] += size[p];
        }
    }
    return size;
}

void addLabels(MapIndex& map) {
    if (!map.x.empty()) Labeller(map).run();
}

}  // namespace olvane::charts
