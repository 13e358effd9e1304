// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Bytes to a map. Every number is checked before anybody follows it: what is no map, or a damaged one, ends in an exception
// that says what is wrong. Here: the header, the list of sections, and the persons; lines are read in MapLineReader.cpp.

#include <limits>
#include <stdexcept>
#include <utility>

#include <olvane/charts/MapReaderInternal.h>

namespace olvane::charts {

void damaged(const std::string& what) {
    throw std::runtime_error("the map is damaged: " + what);
}

std::int32_t sumOf(std::int32_t place, std::int64_t step) {
    const std::int64_t sum = place + step;
    if (sum < std::numeric_limits<std::int32_t>::min() || sum > std::numeric_limits<std::int32_t>::max()) {
        damaged("a place beyond all measure");
    }
    return static_cast<std::int32_t>(sum);
}

MapIndex MapReader::read() {
    readHeader();
    findSections();
    readPersons();
    readUnions();
    readLines();
    readLabels();
    return std::move(map_);
}

void MapReader::readHeader() {
    if (bytes_.size() < kHeader || bytes_.substr(0, kMagic.size()) != kMagic) {
        throw std::runtime_error("this is no map, or not even the beginning of one");
    }
    const std::uint32_t version = wordAt(bytes_, 8);
    if (version != kVersion) {
        throw std::runtime_error("the map has the form " + std::to_string(version) + ", and only " +
                                 std::to_string(kVersion) + " is known");
    }
    const std::uint32_t size = wordAt(bytes_, 12);
    if (size > bytes_.size()) {
        throw std::runtime_error("the map ends after " + std::to_string(bytes_.size()) + " of its " +
                                 std::to_string(size) + " bytes");
    }
    if (size < bytes_.size() || size % 4 != 0) damaged("its length is not its own");
    if (checksumOf(bytes_) != wordAt(bytes_, 16)) damaged("its checksum is another");
    persons_ = wordAt(bytes_, 20);
    unions_ = wordAt(bytes_, 24);
}

void MapReader::findSections() {
    for (std::size_t place = kHeader; place < bytes_.size();) {
        if (bytes_.size() - place < 8) damaged("a section without a length");
        const std::uint32_t kind = wordAt(bytes_, place);
        const std::size_t size = wordAt(bytes_, place + 4);
        place += 8;
        if (size > bytes_.size() - place)
            damaged("section " + std::to_string(kind) + " is longer than the map");
        if (kind >= 1 && kind <= kSections) {
            sections_[kind - 1] = bytes_.substr(place, size);
            present_[kind - 1] = true;
        }
        place += (size + 3) / 4 * 4;
    }
}

SectionWords MapReader::section(Section kind, std::size_t itemSize, std::size_t count) const {
    const std::size_t i = static_cast<std::size_t>(kind) - 1;
    const std::string name = "section " + std::to_string(i + 1);
    if (!present_[i]) damaged(name + " is missing");
    const std::size_t size = sections_[i].size();
    if (size % itemSize != 0 || (count != kAny && size / itemSize != count))
        damaged(name + " has a wrong length");
    return SectionWords(sections_[i]);
}

void MapReader::readPersons() {
    SectionWords box = section(Section::box, 4, 2);
    map_.boxWidth = box.number();
    map_.boxHeight = box.number();
    require(map_.boxWidth >= 0 && map_.boxHeight >= 0, "a box without a size");
    readRows();
    SectionWords numbers = section(Section::numbers, 4, persons_);
    SectionWords births = section(Section::births, 2, persons_);
    SectionWords deaths = section(Section::deaths, 2, persons_);
    SectionWords flags = section(Section::flags, 1, persons_);
    std::vector<bool> seen(persons_, false);
    for (std::size_t p = 0; p < persons_; ++p) {
        const std::uint32_t number = numbers.word();
        require(number >= 1 && number <= persons_ && !seen[number - 1], "a person is there twice");
        seen[number - 1] = true;
        map_.numbers.push_back(number);
        map_.births.push_back(births.half());
        map_.deaths.push_back(deaths.half());
        map_.flags.push_back(flags.byte());
        require((map_.flags.back() & MapIndex::kSexMask) <= 2, "a sex that is not known");
    }
    for (std::size_t row = 0; row < map_.rows.size(); ++row) {
        const std::size_t end = row + 1 < map_.rows.size() ? map_.rows[row + 1].firstPerson : persons_;
        require((map_.flags[end - 1] & MapIndex::kJoined) == 0, "the last of a row is joined to nobody");
    }
    readNames();
}

void MapReader::readRows() {
    SectionWords rows = section(Section::rows, 12);
    while (rows.left() > 0) {
        const MapIndex::Row row = {rows.number(), rows.word(), rows.number()};
        require(row.firstPerson < persons_, "a row begins beyond the last person");
        require(map_.rows.empty()
                    ? row.firstPerson == 0
                    : row.firstPerson > map_.rows.back().firstPerson && row.y > map_.rows.back().y,
                "the rows are not in order");
        map_.rows.push_back(row);
    }
    require(map_.rows.empty() == (persons_ == 0), "persons without a row");
    SectionWords places = section(Section::places, 4, persons_);
    readRuns(places, rowStarts(map_, persons_), [this](std::int32_t x) { map_.x.push_back(x); });
}

void MapReader::readNames() {
    SectionWords strings = section(Section::strings, 1);
    require(strings.left() >= 4, "no names");
    const std::uint32_t count = strings.word();
    require(count >= 1 && strings.left() / 4 >= count, "more names than there is room for");
    std::vector<std::size_t> ends;
    for (std::uint32_t i = 0; i < count; ++i) ends.push_back(strings.word());
    std::size_t start = 0;
    for (const std::size_t end : ends) {
        require(end >= start && end - start <= strings.left(), "a name ends before it begins");
        map_.strings.emplace_back(strings.text(end - start));
        start = end;
    }
    require(strings.left() == 0, "something behind the names");
    require(map_.strings.front().empty(), "the first name is not the empty one");
    SectionWords names = section(Section::names, 8, persons_);
    for (auto* list : {&map_.names, &map_.surnames}) {
        for (std::size_t p = 0; p < persons_; ++p) {
            list->push_back(names.word());
            require(list->back() < count, "a name that is not there");
        }
    }
}

MapIndex readMapIndex(std::string_view bytes) {
    return MapReader(bytes).read();
}

}  // namespace olvane::charts
