// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What joins the persons of a map: families, lines, marks and labels, each checked against the persons that are read.

#include <olvane/charts/MapReaderInternal.h>

namespace olvane::charts {

namespace {

constexpr std::uint32_t kPersonMask = (1U << MapIndex::kChildBits) - 1;

}  // namespace

void MapReader::readUnions() {
    SectionWords partners = section(Section::unions, 8, unions_);
    SectionWords states = section(Section::states, 1, unions_);
    SectionWords starts = section(Section::starts, 4, std::size_t{unions_} + 1);
    const auto isPerson = [this](std::int32_t p) {
        return p == MapIndex::kNobody || (p >= 0 && static_cast<std::uint32_t>(p) < persons_);
    };
    for (std::uint32_t u = 0; u < unions_; ++u) {
        const std::int32_t one = partners.number();
        const std::int32_t other = partners.number();
        require(isPerson(one) && isPerson(other), "a partner who is not there");
        map_.partners.push_back({one, other});
        map_.states.push_back(states.byte());
        require(map_.states.back() <= 3, "a marriage of an unknown kind");
    }
    readChildren(starts);
}

void MapReader::readChildren(SectionWords starts) {
    SectionWords children = section(Section::children, 4);
    const std::size_t count = children.left() / 4;
    for (std::size_t i = 0; i <= unions_; ++i) {
        const std::uint32_t start = starts.word();
        require(i == 0 ? start == 0 : start >= map_.childStarts.back(), "children out of order");
        map_.childStarts.push_back(start);
    }
    require(map_.childStarts.back() == count, "children of nobody");
    for (std::size_t i = 0; i < count; ++i) {
        const std::uint32_t child = children.word();
        require((child & kPersonMask) < persons_ && child >> MapIndex::kChildBits <= 5,
                "a child who is not there");
        map_.children.push_back(child);
    }
}

void MapReader::readLines() {
    SectionWords bars = section(Section::bars, 12);
    SectionWords uprights = section(Section::uprights, 12);
    const BandStarts starts = readBands(bars.left() / 12, uprights.left() / 12);
    readRuns(bars, starts.bars, [this](std::int32_t x) {
        map_.bars.push_back({x, 0, 0, MapIndex::Role::marriage});
    });
    for (MapIndex::Bar& bar : map_.bars) bar.x2 = sumOf(bar.x1, bars.word());
    for (MapIndex::Bar& bar : map_.bars) readLevel(bars.number(), bar.y, bar.role);
    readRuns(uprights, starts.uprights, [this](std::int32_t x) {
        map_.uprights.push_back({x, 0, 0, MapIndex::Role::marriage});
    });
    for (MapIndex::Upright& one : map_.uprights) readLevel(uprights.number(), one.y1, one.role);
    for (MapIndex::Upright& one : map_.uprights) one.y2 = sumOf(one.y1, uprights.word());
    checkBands(starts);
}

MapReader::BandStarts MapReader::readBands(std::size_t barCount, std::size_t uprightCount) {
    SectionWords bands = section(Section::bands, 16, map_.rows.size() + 2);
    BandStarts starts;
    while (bands.left() > 0) {
        const MapIndex::Band band = {bands.number(), bands.number(), bands.word(), bands.word()};
        const bool isFirst = map_.bands.empty();
        require(isFirst ? band.firstBar == 0 && band.firstUpright == 0
                        : band.firstBar >= starts.bars.back() && band.firstUpright >= starts.uprights.back(),
                "lines out of order");
        map_.bands.push_back(band);
        starts.bars.push_back(band.firstBar);
        starts.uprights.push_back(band.firstUpright);
    }
    require(starts.bars.back() <= barCount && starts.uprights.back() <= uprightCount,
            "lines that are not there");
    starts.bars.push_back(static_cast<std::uint32_t>(barCount));
    starts.uprights.push_back(static_cast<std::uint32_t>(uprightCount));
    return starts;
}

void MapReader::readLevel(std::int32_t from, std::int32_t& y, MapIndex::Role& role) {
    const std::int32_t low = ((from % kRoles) + kRoles) % kRoles;
    require(low <= 3, "a line of an unknown kind");
    y = (from - low) / kRoles;
    role = static_cast<MapIndex::Role>(low);
}

void MapReader::checkBands(const BandStarts& starts) const {
    for (std::size_t i = 0; i < map_.bands.size(); ++i) {
        const MapIndex::Band& band = map_.bands[i];
        for (std::uint32_t b = starts.bars[i]; b < starts.bars[i + 1]; ++b) {
            require(map_.bars[b].y >= band.top && map_.bars[b].y <= band.bottom, "a line outside its band");
        }
        for (std::uint32_t u = starts.uprights[i]; u < starts.uprights[i + 1]; ++u) {
            require(map_.uprights[u].y1 >= band.top && map_.uprights[u].y2 <= band.bottom,
                    "a line outside its band");
        }
    }
}

void MapReader::readLabels() {
    SectionWords marks = section(Section::marks, 8);
    while (marks.left() > 0) {
        const MapIndex::Mark mark = {marks.word(), marks.word()};
        require(mark.person < persons_, "a mark at nobody");
        require(map_.marks.empty() || mark.person >= map_.marks.back().person, "marks out of order");
        map_.marks.push_back(mark);
    }
    SectionWords levels = section(Section::levels, 8);
    SectionWords labels = section(Section::labels, 16);
    const std::size_t count = labels.left() / 16;
    while (levels.left() > 0) {
        const MapIndex::LabelLevel level = {levels.word(), levels.word()};
        require(level.level < 32 && level.firstLabel <= count, "a level beyond all others");
        require(map_.labelLevels.empty() ? level.firstLabel == 0
                                         : level.level == map_.labelLevels.back().level + 1 &&
                                               level.firstLabel >= map_.labelLevels.back().firstLabel,
                "levels out of order");
        map_.labelLevels.push_back(level);
    }
    require(count == 0 || !map_.labelLevels.empty(), "labels without a level");
    while (labels.left() > 0) {
        const MapIndex::Label label = {labels.number(), labels.number(), labels.word(), labels.word()};
        const std::uint32_t text = label.text & ~MapIndex::kPersonLabel;
        require(text < ((label.text & MapIndex::kPersonLabel) != 0 ? persons_ : map_.strings.size()),
                "a label without a text");
        map_.labels.push_back(label);
    }
}

}  // namespace olvane::charts
