// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/charts/MapIndexFormInternal.h>

namespace olvane::charts {

// Throws std::runtime_error: the map is damaged, and what is wrong with it.
[[noreturn]] void damaged(const std::string& what);

// A place and a step from it. Throws as damaged() does where that is no place.
std::int32_t sumOf(std::int32_t place, std::int64_t step);

// The bytes of one section, or of a list in it.
class SectionWords {
public:
    explicit SectionWords(std::string_view bytes) : bytes_(bytes) {}

    std::size_t left() const { return bytes_.size() - place_; }
    std::uint32_t word() {
        const std::uint32_t value = wordAt(bytes_, place_);
        place_ += 4;
        return value;
    }
    std::int32_t number() { return signedOf(word()); }
    std::int16_t half() {
        const auto low = static_cast<std::uint8_t>(bytes_[place_]);
        const auto high = static_cast<std::uint8_t>(bytes_[place_ + 1]);
        place_ += 2;
        return static_cast<std::int16_t>(low | high << 8);
    }
    std::uint8_t byte() { return static_cast<std::uint8_t>(bytes_[place_++]); }
    std::string_view text(std::size_t size) {
        const std::string_view text = bytes_.substr(place_, size);
        place_ += size;
        return text;
    }

private:
    std::string_view bytes_;
    std::size_t place_ = 0;
};

// Reads one map; every number of it is checked before it is followed.
//
// Fails: std::runtime_error for what is no map, has a form that is not known, or is damaged.
class MapReader {
public:
    explicit MapReader(std::string_view bytes) : bytes_(bytes) {}

    MapIndex read();

private:
    // Where the lines of each band begin, and behind the last one how many there are.
    struct BandStarts {
        std::vector<std::uint32_t> bars;
        std::vector<std::uint32_t> uprights;
    };

    // MapIndexReader.cpp
    void readHeader();
    void findSections();
    void readPersons();
    void readRows();
    void readNames();

    // MapLineReader.cpp
    void readUnions();
    void readChildren(SectionWords starts);
    void readLines();
    BandStarts readBands(std::size_t barCount, std::size_t uprightCount);
    static void readLevel(std::int32_t from, std::int32_t& y, MapIndex::Role& role);
    void checkBands(const BandStarts& starts) const;
    void readLabels();

    // The bytes of a section that has `count` items of itemSize bytes; any number of items where count is kAny.
    static constexpr std::size_t kAny = std::numeric_limits<std::size_t>::max();
    SectionWords section(Section kind, std::size_t itemSize, std::size_t count = kAny) const;

    static void require(bool holds, const char* what) {
        if (!holds) damaged(what);
    }

    // As writeRuns has written them: the first anywhere, then never back.
    template <class Add>
    static void readRuns(SectionWords& from, const std::vector<std::uint32_t>& starts, const Add& add) {
        for (std::size_t run = 0; run + 1 < starts.size(); ++run) {
            std::int32_t value = 0;
            for (std::uint32_t i = starts[run]; i < starts[run + 1]; ++i) {
                const std::uint32_t step = from.word();
                value = i == starts[run] ? signedOf(step) : sumOf(value, step);
                add(value);
            }
        }
    }

    std::string_view bytes_;
    std::uint32_t persons_ = 0;
    std::uint32_t unions_ = 0;
    std::array<std::string_view, kSections> sections_;
    std::array<bool, kSections> present_ = {};
    MapIndex map_;
};

}  // namespace olvane::charts
