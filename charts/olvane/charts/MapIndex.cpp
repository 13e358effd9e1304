// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Makes a map from the picture of everybody: persons row by row, then the lines between the rows, then what they are
// called, near and far.

#include <olvane/charts/MapIndex.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <limits>
#include <numeric>
#include <tuple>
#include <unordered_map>

#include <olvane/charts/Everybody.h>
#include <olvane/charts/MapLabelsInternal.h>
#include <olvane/kin/shared/MergeSort.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

namespace {

using picture::LineRole;
using picture::Picture;

// Wide enough for most names in two lines, and a line for the years.
constexpr ChartSizes kSizes = {120, 56, 16, 40};
constexpr double kMostPoints = 536870911.0 / MapIndex::kUnit;  // so that 8 y + role is a 32-bit number

template <class Number>
std::size_t at(Number place) {
    return static_cast<std::size_t>(place);
}

std::int32_t quarters(double points) {
    if (!(std::abs(points) < kMostPoints)) throw std::length_error("the family is too large for a map");
    return static_cast<std::int32_t>(std::floor(points * MapIndex::kUnit + 0.5));
}

class MapMaker {
public:
    MapMaker(const kin::KinGraph& graph, std::span<const kin::PersonCaption> captions,
             const ChartProgress* progress)
        : graph_(graph), captions_(captions) {
        EverybodyOptions options;
        options.onePart = false;
        options.sizes = kSizes;
        options.progress = progress;
        picture_ = everybodyChart(graph, options);
        map_.boxWidth = quarters(double{kSizes.boxWidth});
        map_.boxHeight = quarters(double{kSizes.boxHeight});
    }

    MapIndex make() {
        sortPersons();
        addPersons();
        addUnions();
        addLines();
        addMarks();
        addLabels(map_);
        return std::move(map_);
    }

private:
    void sortPersons() {
        const std::size_t count = picture_.boxes.size();
        boxAt_.resize(count);
        std::iota(boxAt_.begin(), boxAt_.end(), 0U);
        std::vector<std::int32_t> x(count);
        std::vector<std::int32_t> y(count);
        for (std::size_t i = 0; i < count; ++i) {
            x[i] = quarters(picture_.boxes[i].x);
            y[i] = quarters(picture_.boxes[i].y);
        }
        kin::mergeSort(boxAt_.begin(), boxAt_.end(), [&](std::uint32_t a, std::uint32_t b) {
            return std::tuple(y[at(a)], x[at(a)], a) < std::tuple(y[at(b)], x[at(b)], b);
        });
        personOfBox_.resize(count);
        personOfPlace_.resize(at(graph_.personCount()));
        for (std::uint32_t person = 0; person < count; ++person) {
            const std::uint32_t box = boxAt_[person];
            personOfBox_[at(box)] = person;
            personOfPlace_[at(graph_.placeOf(picture_.boxes[at(box)].id))] =
                static_cast<std::int32_t>(person);
            map_.x.push_back(x[at(box)]);
            if (map_.rows.empty() || map_.rows.back().y != y[at(box)])
                map_.rows.push_back({y[at(box)], person, 0});
        }
    }

    void addPersons() {
        map_.strings.emplace_back();
        placeOfString_[""] = 0;
        for (const std::uint32_t box : boxAt_) {
            const kin::Place place = graph_.placeOf(picture_.boxes[at(box)].id);
            const kin::PersonCaption& person = captions_[at(place)];
            map_.numbers.push_back(static_cast<std::uint32_t>(place) + 1);
            map_.births.push_back(person.birth);
            map_.deaths.push_back(person.death);
            const bool endsSo = endsWithSurname(person);
            const std::string_view name = person.name;
            map_.flags.push_back(static_cast<std::uint8_t>(static_cast<std::uint8_t>(graph_.sex(place)) |
                                                           (endsSo ? MapIndex::kSurnameLast : 0)));
            map_.names.push_back(
                stringPlace(endsSo ? name.substr(0, name.size() - person.surname.size() - 1) : name));
            map_.surnames.push_back(stringPlace(person.surname));
        }
        for (std::size_t row = 0; row < map_.rows.size(); ++row) {
            map_.rows[row].year = middleYear(map_.rows[row].firstPerson, endOfRow(row));
        }
    }

    std::uint32_t endOfRow(std::size_t row) const {
        return row + 1 < map_.rows.size() ? map_.rows[row + 1].firstPerson
                                          : static_cast<std::uint32_t>(map_.x.size());
    }

    // Given names are shared by many more persons than whole names.
    static bool endsWithSurname(const kin::PersonCaption& person) {
        const std::size_t rest = person.surname.size() + 1;
        return rest > 1 && person.name.size() > rest && person.name.ends_with(person.surname) &&
               person.name[person.name.size() - rest] == ' ';
    }

    std::uint32_t stringPlace(std::string_view text) {
        const auto [entry, isNew] =
            placeOfString_.try_emplace(text, static_cast<std::uint32_t>(map_.strings.size()));
        if (isNew) map_.strings.emplace_back(text);
        return entry->second;
    }

    std::int32_t middleYear(std::uint32_t first, std::uint32_t end) const {
        std::vector<std::int16_t> years;
        for (std::uint32_t p = first; p < end; ++p) {
            if (map_.births[at(p)] != 0) years.push_back(map_.births[at(p)]);
        }
        if (years.empty()) return 0;
        const auto middle = years.begin() + static_cast<std::ptrdiff_t>(years.size() / 2);
        std::nth_element(years.begin(), middle, years.end());
        return *middle;
    }

    void addUnions() {
        const auto personAt = [this](kin::Place place) {
            return place == kin::kNobody ? MapIndex::kNobody : personOfPlace_[at(place)];
        };
        map_.childStarts.push_back(0);
        for (kin::UnionPlace u = 0; u < graph_.unionCount(); ++u) {
            map_.partners.push_back({personAt(graph_.partners(u)[0]), personAt(graph_.partners(u)[1])});
            map_.states.push_back(static_cast<std::uint8_t>(graph_.state(u)));
            for (std::size_t i = 0; i < graph_.children(u).size(); ++i) {
                const auto child = static_cast<std::uint32_t>(personAt(graph_.children(u)[i]));
                const auto kind = static_cast<std::uint32_t>(graph_.childKinds(u)[i]);
                map_.children.push_back(child | kind << MapIndex::kChildBits);
            }
            map_.childStarts.push_back(static_cast<std::uint32_t>(map_.children.size()));
        }
    }

    // --- lines ---

    struct Piece {
        std::int32_t x1;
        std::int32_t y1;
        std::int32_t x2;
        std::int32_t y2;
        std::uint32_t band;
        MapIndex::Role role;
    };

    void addLines() {
        for (const picture::Family& family : picture_.families) addFamily(family);
        map_.bands.assign(map_.rows.size() + 2, {0, 0, 0, 0});
        sortPieces(bars_);
        sortPieces(uprights_);
        for (const Piece& p : bars_) map_.bars.push_back({p.x1, p.x2, p.y1, p.role});
        for (const Piece& p : uprights_) map_.uprights.push_back({p.x1, p.y1, p.y2, p.role});
        std::size_t bar = 0;
        std::size_t upright = 0;
        for (std::uint32_t band = 0; band < map_.bands.size(); ++band) {
            MapIndex::Band& one = map_.bands[band];
            one.firstBar = static_cast<std::uint32_t>(bar);
            one.firstUpright = static_cast<std::uint32_t>(upright);
            one.top = std::numeric_limits<std::int32_t>::max();
            one.bottom = std::numeric_limits<std::int32_t>::min();
            for (; bar < bars_.size() && bars_[bar].band == band; ++bar) widen(one, bars_[bar]);
            for (; upright < uprights_.size() && uprights_[upright].band == band; ++upright) {
                widen(one, uprights_[upright]);
            }
            if (one.top > one.bottom) one.top = one.bottom = 0;
        }
    }

    static void widen(MapIndex::Band& band, const Piece& piece) {
        band.top = std::min(band.top, piece.y1);
        band.bottom = std::max(band.bottom, piece.y2);
    }

    static void sortPieces(std::vector<Piece>& pieces) {
        kin::mergeSort(pieces.begin(), pieces.end(), [](const Piece& a, const Piece& b) {
            return std::tuple(a.band, a.x1, a.y1, a.x2, a.y2, a.role) <
                   std::tuple(b.band, b.x1, b.y1, b.x2, b.y2, b.role);
        });
    }

    void addFamily(const picture::Family& family) {
        const bool isDivorced = family.style == kin::UnionState::divorced;
        for (const picture::Line& line : picture_.linesOf(family)) {
            Piece piece = {quarters(std::min(line.x1, line.x2)),
                           quarters(std::min(line.y1, line.y2)),
                           quarters(std::max(line.x1, line.x2)),
                           quarters(std::max(line.y1, line.y2)),
                           0,
                           roleOf(family, line, isDivorced)};
            if (piece.x1 != piece.x2 && piece.y1 != piece.y2)
                throw std::logic_error("a slanted line in a map");
            if (line.role == LineRole::marriage && joinNeighbours(piece)) continue;
            if (piece.x1 != piece.x2) {
                piece.band = bandAt(piece.y1);
                bars_.push_back(piece);
            } else if (piece.y1 != piece.y2) {
                piece.band = bandAt(piece.y1);
                if (piece.band < map_.rows.size() && piece.y2 > map_.rows[piece.band].y + map_.boxHeight) {
                    piece.band = static_cast<std::uint32_t>(map_.rows.size()) + 1;
                }
                uprights_.push_back(piece);
            }
        }
    }

    MapIndex::Role roleOf(const picture::Family& family, const picture::Line& line, bool isDivorced) const {
        if (line.role == LineRole::marriage) {
            return isDivorced ? MapIndex::Role::divorced : MapIndex::Role::marriage;
        }
        if (line.child != picture::kNone) {
            const auto children = picture_.children(family);
            for (std::size_t i = 0; i < children.size(); ++i) {
                if (children[i] != line.child) continue;
                const kin::ChildKind kind = picture_.kinds(family)[i];
                const bool isBirth = kind == kin::ChildKind::birth || kind == kin::ChildKind::unknown;
                return isBirth ? MapIndex::Role::descent : MapIndex::Role::adopted;
            }
        }
        return MapIndex::Role::descent;
    }

    // How many rows begin above y, or there.
    std::uint32_t bandAt(std::int32_t y) const {
        const auto row =
            std::upper_bound(map_.rows.begin(), map_.rows.end(), y,
                             [](std::int32_t value, const MapIndex::Row& one) { return value < one.y; });
        return static_cast<std::uint32_t>(row - map_.rows.begin());
    }

    // Most couples stand side by side; a bit says so in the place of a line.
    bool joinNeighbours(const Piece& piece) {
        const std::uint32_t band = bandAt(piece.y1);
        if (band == 0 || piece.y1 != piece.y2) return false;
        const MapIndex::Row& row = map_.rows[band - 1];
        if (piece.y1 != row.y + map_.boxHeight / 2) return false;
        const auto begin = map_.x.begin() + row.firstPerson;
        const auto end = map_.x.begin() + endOfRow(band - 1);
        const auto left = std::lower_bound(begin, end, piece.x1 - map_.boxWidth);
        if (left == end || left + 1 == end) return false;
        if (*left != piece.x1 - map_.boxWidth || *(left + 1) != piece.x2) return false;
        std::uint8_t& flags = map_.flags[at(left - map_.x.begin())];
        const bool isDivorced = piece.role == MapIndex::Role::divorced;
        const auto wanted =
            static_cast<std::uint8_t>(MapIndex::kJoined | (isDivorced ? MapIndex::kDivorced : 0));
        if ((flags & MapIndex::kJoined) == 0) flags = static_cast<std::uint8_t>(flags | wanted);
        return true;
    }

    void addMarks() {
        for (const picture::Mark& mark : picture_.marks) {
            for (const picture::Index box : mark.boxes) {
                if (box == picture::kNone) continue;
                map_.marks.push_back({personOfBox_[at(box)], static_cast<std::uint32_t>(mark.number)});
            }
        }
        kin::mergeSort(map_.marks.begin(), map_.marks.end(),
                       [](const MapIndex::Mark& a, const MapIndex::Mark& b) {
                           return std::tuple(a.person, a.number) < std::tuple(b.person, b.number);
                       });
    }

    const kin::KinGraph& graph_;
    std::span<const kin::PersonCaption> captions_;
    Picture picture_;
    MapIndex map_;
    std::vector<std::uint32_t> boxAt_;  // by person
    std::vector<std::uint32_t> personOfBox_;
    std::vector<std::int32_t> personOfPlace_;
    std::unordered_map<std::string_view, std::uint32_t> placeOfString_;  // looked up, never walked
    std::vector<Piece> bars_;
    std::vector<Piece> uprights_;
};

}  // namespace

MapIndex mapIndexOf(const kin::KinGraph& graph, std::span<const kin::PersonCaption> captions,
                    const ChartProgress* progress) {
    if (captions.size() != static_cast<std::size_t>(graph.personCount())) {
        throw std::invalid_argument("a map needs what it shows of each person");
    }
    if (captions.size() >= std::size_t{1} << MapIndex::kChildBits) {
        throw std::length_error("more persons than a map can hold");
    }
    if (captions.empty()) {
        MapIndex none;
        none.strings.emplace_back();
        none.childStarts.push_back(0);
        none.bands.assign(2, {0, 0, 0, 0});
        return none;
    }
    return MapMaker(graph, captions, progress).make();
}

}  // namespace olvane::charts
