// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A map to bytes: section by section, in the order of their numbers. Places are written as steps from the one before, which
// compresses well.

#include <limits>
#include <stdexcept>
#include <string>
#include <utility>

#include <olvane/charts/MapIndexFormInternal.h>

namespace olvane::charts {

namespace {

class MapWriter {
public:
    MapWriter() { bytes_.append(kMagic); }

    void word(std::uint32_t value) {
        for (int shift = 0; shift < 32; shift += 8)
            bytes_.push_back(static_cast<char>(value >> shift & 0xFFU));
    }
    void half(std::int16_t value) {
        bytes_.push_back(static_cast<char>(value & 0xFF));
        bytes_.push_back(static_cast<char>(value >> 8 & 0xFF));
    }
    void byte(std::uint8_t value) { bytes_.push_back(static_cast<char>(value)); }
    void text(std::string_view value) { bytes_.append(value); }

    template <class Write>
    void section(Section kind, const Write& write) {
        word(static_cast<std::uint32_t>(kind));
        const std::size_t sizeAt = bytes_.size();
        word(0);
        write();
        patch(sizeAt, bytes_.size() - sizeAt - 4);
        while (bytes_.size() % 4 != 0) bytes_.push_back('\0');
    }
    template <class Values, class Write>
    void list(Section kind, const Values& values, const Write& write) {
        section(kind, [&] {
            for (const auto& value : values) write(value);
        });
    }

    void patch(std::size_t place, std::size_t value) {
        if (value > std::numeric_limits<std::uint32_t>::max())
            throw std::length_error("the map is too large for a file");
        for (std::size_t i = 0; i < 4; ++i) bytes_[place + i] = static_cast<char>(value >> (8 * i) & 0xFFU);
    }
    std::size_t size() const { return bytes_.size(); }
    std::string_view bytes() const { return bytes_; }
    std::string take() { return std::move(bytes_); }

private:
    std::string bytes_;
};

// The first of each run as it is, every other less the one before it.
template <class Item, class Value, class Write>
void writeRuns(const std::vector<Item>& items, const std::vector<std::uint32_t>& starts, const Value& value,
               const Write& write) {
    for (std::size_t run = 0; run + 1 < starts.size(); ++run) {
        std::int32_t before = 0;
        for (std::uint32_t i = starts[run]; i < starts[run + 1]; ++i) {
            const std::int32_t here = value(items[i]);
            write(bitsOf(here) - bitsOf(before));
            before = here;
        }
    }
}

std::vector<std::uint32_t> bandStarts(const MapIndex& map, bool bars) {
    std::vector<std::uint32_t> starts;
    for (const MapIndex::Band& band : map.bands) starts.push_back(bars ? band.firstBar : band.firstUpright);
    starts.push_back(static_cast<std::uint32_t>(bars ? map.bars.size() : map.uprights.size()));
    return starts;
}

std::uint32_t levelWithRole(std::int32_t y, MapIndex::Role role) {
    return bitsOf(y) * bitsOf(kRoles) + static_cast<std::uint32_t>(role);
}

void writeLines(MapWriter& to, const MapIndex& map) {
    const auto word = [&to](std::uint32_t value) { to.word(value); };
    to.section(Section::bars, [&] {
        writeRuns(
            map.bars, bandStarts(map, true), [](const auto& bar) { return bar.x1; }, word);
        for (const auto& bar : map.bars) to.word(bitsOf(bar.x2) - bitsOf(bar.x1));
        for (const auto& bar : map.bars) to.word(levelWithRole(bar.y, bar.role));
    });
    to.section(Section::uprights, [&] {
        writeRuns(
            map.uprights, bandStarts(map, false), [](const auto& one) { return one.x; }, word);
        for (const auto& one : map.uprights) to.word(levelWithRole(one.y1, one.role));
        for (const auto& one : map.uprights) to.word(bitsOf(one.y2) - bitsOf(one.y1));
    });
}

void writePersons(MapWriter& to, const MapIndex& map) {
    const auto word = [&to](std::uint32_t value) { to.word(value); };
    to.section(Section::places, [&] {
        writeRuns(
            map.x, rowStarts(map, map.x.size()), [](std::int32_t x) { return x; }, word);
    });
    to.list(Section::numbers, map.numbers, word);
    to.list(Section::births, map.births, [&](std::int16_t year) { to.half(year); });
    to.list(Section::deaths, map.deaths, [&](std::int16_t year) { to.half(year); });
    to.list(Section::flags, map.flags, [&](std::uint8_t flags) { to.byte(flags); });
    to.section(Section::names, [&] {
        for (const std::uint32_t name : map.names) to.word(name);
        for (const std::uint32_t name : map.surnames) to.word(name);
    });
    to.section(Section::strings, [&] {
        to.word(static_cast<std::uint32_t>(map.strings.size()));
        std::size_t end = 0;
        for (const std::string& text : map.strings) to.word(static_cast<std::uint32_t>(end += text.size()));
        for (const std::string& text : map.strings) to.text(text);
    });
}

void writeKin(MapWriter& to, const MapIndex& map) {
    const auto word = [&to](std::uint32_t value) { to.word(value); };
    to.list(Section::unions, map.partners, [&](const std::array<std::int32_t, 2>& two) {
        to.word(bitsOf(two[0]));
        to.word(bitsOf(two[1]));
    });
    to.list(Section::states, map.states, [&](std::uint8_t state) { to.byte(state); });
    to.list(Section::starts, map.childStarts, word);
    to.list(Section::children, map.children, word);
}

}  // namespace

std::string writeMapIndex(const MapIndex& map) {
    MapWriter to;
    const auto word = [&to](std::uint32_t value) { to.word(value); };
    for (const std::size_t value :
         {std::size_t{kVersion}, std::size_t{0}, std::size_t{0}, map.x.size(), map.partners.size()}) {
        to.word(static_cast<std::uint32_t>(value));
    }
    to.section(Section::box, [&] { word(bitsOf(map.boxWidth)), word(bitsOf(map.boxHeight)); });
    to.list(Section::rows, map.rows,
            [&](const auto& row) { word(bitsOf(row.y)), word(row.firstPerson), word(bitsOf(row.year)); });
    writePersons(to, map);
    writeKin(to, map);
    to.list(Section::bands, map.bands, [&](const auto& band) {
        word(bitsOf(band.top)), word(bitsOf(band.bottom)), word(band.firstBar), word(band.firstUpright);
    });
    writeLines(to, map);
    to.list(Section::marks, map.marks, [&](const auto& mark) { word(mark.person), word(mark.number); });
    to.list(Section::levels, map.labelLevels,
            [&](const auto& one) { word(one.level), word(one.firstLabel); });
    to.list(Section::labels, map.labels, [&](const auto& label) {
        word(bitsOf(label.x)), word(bitsOf(label.y)), word(label.text), word(label.weight);
    });
    to.patch(12, to.size());
    to.patch(16, checksumOf(to.bytes()));
    return to.take();
}

}  // namespace olvane::charts
