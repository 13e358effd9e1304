// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A map as bytes. The writer and the reader name the sections in the same order; the reader then looks whether what
// it has read is a map at all, before anybody follows a number of it.

#include <olvane/charts/MapIndex.h>

#include <algorithm>
#include <cstddef>
#include <limits>

namespace olvane::charts {

namespace {

constexpr std::string_view kMagic = "OLVMAP\r\n";
constexpr std::uint32_t kVersion = 1;
constexpr std::size_t kChecked = 20;  // where the words that the checksum is of begin
constexpr std::size_t kHeader = 28;
constexpr std::uint32_t kPersonMask = (1U << MapIndex::kChildBits) - 1;
constexpr std::int32_t kRoles = 8;  // y and role share a number: 8 y + role

enum class Section : std::uint32_t {
    box = 1,
    rows,
    places,
    numbers,
    births,
    deaths,
    flags,
    names,
    strings,
    unions,
    states,
    starts,
    children,
    bands,
    bars,
    uprights,
    marks,
    levels,
    labels
};
constexpr std::size_t kSections = 19;

std::uint32_t bitsOf(std::int32_t value) {
    return static_cast<std::uint32_t>(value);
}

std::int32_t signedOf(std::uint32_t bits) {
    return static_cast<std::int32_t>(bits);
}

class Writer {
public:
    Writer() { bytes_.append(kMagic); }

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

std::uint32_t wordAt(std::string_view bytes, std::size_t place) {
    std::uint32_t word = 0;
    for (std::size_t i = 0; i < 4; ++i) {
        word |= std::uint32_t{static_cast<std::uint8_t>(bytes[place + i])} << (8 * i);
    }
    return word;
}

std::uint32_t checksumOf(std::string_view bytes) {
    std::uint32_t sum = 2166136261U;
    for (std::size_t place = kChecked; place + 4 <= bytes.size(); place += 4) {
        sum = (sum ^ wordAt(bytes, place)) * 16777619U;
    }
    return sum;
}

[[noreturn]] void damaged(const std::string& what) {
    throw std::runtime_error("the map is damaged: " + what);
}

// --- differences ---

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

std::int32_t sumOf(std::int32_t a, std::int64_t b) {
    const std::int64_t sum = a + b;
    if (sum < std::numeric_limits<std::int32_t>::min() || sum > std::numeric_limits<std::int32_t>::max()) {
        damaged("a place beyond all measure");
    }
    return static_cast<std::int32_t>(sum);
}

std::vector<std::uint32_t> rowStarts(const MapIndex& map) {
    std::vector<std::uint32_t> starts;
    for (const MapIndex::Row& row : map.rows) starts.push_back(row.firstPerson);
    starts.push_back(static_cast<std::uint32_t>(map.x.size()));
    return starts;
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

void writeLines(Writer& to, const MapIndex& map) {
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

void writePersons(Writer& to, const MapIndex& map) {
    const auto word = [&to](std::uint32_t value) { to.word(value); };
    to.section(Section::places, [&] {
        writeRuns(
            map.x, rowStarts(map), [](std::int32_t x) { return x; }, word);
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

void writeKin(Writer& to, const MapIndex& map) {
    const auto word = [&to](std::uint32_t value) { to.word(value); };
    to.list(Section::unions, map.partners, [&](const std::array<std::int32_t, 2>& two) {
        to.word(bitsOf(two[0]));
        to.word(bitsOf(two[1]));
    });
    to.list(Section::states, map.states, [&](std::uint8_t state) { to.byte(state); });
    to.list(Section::starts, map.childStarts, word);
    to.list(Section::children, map.children, word);
}

// --- reading ---

// The bytes of one section, or of a list in it.
class Words {
public:
    explicit Words(std::string_view bytes) : bytes_(bytes) {}

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

class Reader {
public:
    explicit Reader(std::string_view bytes) : bytes_(bytes) {}

    MapIndex read() {
        readHeader();
        findSections();
        readPersons();
        readUnions();
        readLines();
        readLabels();
        return std::move(map_);
    }

private:
    void readHeader() {
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

    void findSections() {
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

    // The bytes of a section that has count items of so many bytes; any number of items where count is kAny.
    static constexpr std::size_t kAny = std::numeric_limits<std::size_t>::max();
    Words section(Section kind, std::size_t itemSize, std::size_t count = kAny) const {
        const std::size_t i = static_cast<std::size_t>(kind) - 1;
        const std::string name = "section " + std::to_string(i + 1);
        if (!present_[i]) damaged(name + " is missing");
        const std::size_t size = sections_[i].size();
        if (size % itemSize != 0 || (count != kAny && size / itemSize != count))
            damaged(name + " has a wrong length");
        return Words(sections_[i]);
    }

    static void require(bool holds, const char* what) {
        if (!holds) damaged(what);
    }

    void readPersons() {
        Words box = section(Section::box, 4, 2);
        map_.boxWidth = box.number();
        map_.boxHeight = box.number();
        require(map_.boxWidth >= 0 && map_.boxHeight >= 0, "a box without a size");
        readRows();
        Words numbers = section(Section::numbers, 4, persons_);
        Words births = section(Section::births, 2, persons_);
        Words deaths = section(Section::deaths, 2, persons_);
        Words flags = section(Section::flags, 1, persons_);
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

    void readRows() {
        Words rows = section(Section::rows, 12);
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
        Words places = section(Section::places, 4, persons_);
        readRuns(places, rowStarts(map_, persons_), [this](std::int32_t x) { map_.x.push_back(x); });
    }

    static std::vector<std::uint32_t> rowStarts(const MapIndex& map, std::size_t persons) {
        std::vector<std::uint32_t> starts;
        for (const MapIndex::Row& row : map.rows) starts.push_back(row.firstPerson);
        starts.push_back(static_cast<std::uint32_t>(persons));
        return starts;
    }

    // As writeRuns has written them: the first anywhere, then never back.
    template <class Add>
    static void readRuns(Words& from, const std::vector<std::uint32_t>& starts, const Add& add) {
        for (std::size_t run = 0; run + 1 < starts.size(); ++run) {
            std::int32_t value = 0;
            for (std::uint32_t i = starts[run]; i < starts[run + 1]; ++i) {
                const std::uint32_t step = from.word();
                value = i == starts[run] ? signedOf(step) : sumOf(value, step);
                add(value);
            }
        }
    }

    void readNames() {
        Words strings = section(Section::strings, 1);
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
        Words names = section(Section::names, 8, persons_);
        for (auto* list : {&map_.names, &map_.surnames}) {
            for (std::size_t p = 0; p < persons_; ++p) {
                list->push_back(names.word());
                require(list->back() < count, "a name that is not there");
            }
        }
    }

    void readUnions() {
        Words partners = section(Section::unions, 8, unions_);
        Words states = section(Section::states, 1, unions_);
        Words starts = section(Section::starts, 4, std::size_t{unions_} + 1);
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
        Words children = section(Section::children, 4);
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

    void readLines() {
        Words bars = section(Section::bars, 12);
        Words uprights = section(Section::uprights, 12);
        Words bands = section(Section::bands, 16, map_.rows.size() + 2);
        const std::size_t barCount = bars.left() / 12;
        const std::size_t uprightCount = uprights.left() / 12;
        std::vector<std::uint32_t> barStarts;
        std::vector<std::uint32_t> uprightStarts;
        while (bands.left() > 0) {
            const MapIndex::Band band = {bands.number(), bands.number(), bands.word(), bands.word()};
            const bool isFirst = map_.bands.empty();
            require(isFirst ? band.firstBar == 0 && band.firstUpright == 0
                            : band.firstBar >= barStarts.back() && band.firstUpright >= uprightStarts.back(),
                    "lines out of order");
            map_.bands.push_back(band);
            barStarts.push_back(band.firstBar);
            uprightStarts.push_back(band.firstUpright);
        }
        require(barStarts.back() <= barCount && uprightStarts.back() <= uprightCount,
                "lines that are not there");
        barStarts.push_back(static_cast<std::uint32_t>(barCount));
        uprightStarts.push_back(static_cast<std::uint32_t>(uprightCount));
        readRuns(bars, barStarts, [this](std::int32_t x) {
            map_.bars.push_back({x, 0, 0, MapIndex::Role::marriage});
        });
        for (MapIndex::Bar& bar : map_.bars) bar.x2 = sumOf(bar.x1, bars.word());
        for (MapIndex::Bar& bar : map_.bars) readLevel(bars.number(), bar.y, bar.role);
        readRuns(uprights, uprightStarts, [this](std::int32_t x) {
            map_.uprights.push_back({x, 0, 0, MapIndex::Role::marriage});
        });
        for (MapIndex::Upright& one : map_.uprights) readLevel(uprights.number(), one.y1, one.role);
        for (MapIndex::Upright& one : map_.uprights) one.y2 = sumOf(one.y1, uprights.word());
        checkBands(barStarts, uprightStarts);
    }

    static void readLevel(std::int32_t from, std::int32_t& y, MapIndex::Role& role) {
        const std::int32_t low = ((from % kRoles) + kRoles) % kRoles;
        require(low <= 3, "a line of an unknown kind");
        y = (from - low) / kRoles;
        role = static_cast<MapIndex::Role>(low);
    }

    void checkBands(const std::vector<std::uint32_t>& barStarts,
                    const std::vector<std::uint32_t>& uprightStarts) const {
        for (std::size_t i = 0; i < map_.bands.size(); ++i) {
            const MapIndex::Band& band = map_.bands[i];
            for (std::uint32_t b = barStarts[i]; b < barStarts[i + 1]; ++b) {
                require(map_.bars[b].y >= band.top && map_.bars[b].y <= band.bottom,
                        "a line outside its band");
            }
            for (std::uint32_t u = uprightStarts[i]; u < uprightStarts[i + 1]; ++u) {
                require(map_.uprights[u].y1 >= band.top && map_.uprights[u].y2 <= band.bottom,
                        "a line outside its band");
            }
        }
    }

    void readLabels() {
        Words marks = section(Section::marks, 8);
        while (marks.left() > 0) {
            const MapIndex::Mark mark = {marks.word(), marks.word()};
            require(mark.person < persons_, "a mark at nobody");
            require(map_.marks.empty() || mark.person >= map_.marks.back().person, "marks out of order");
            map_.marks.push_back(mark);
        }
        Words levels = section(Section::levels, 8);
        Words labels = section(Section::labels, 16);
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

    std::string_view bytes_;
    std::uint32_t persons_ = 0;
    std::uint32_t unions_ = 0;
    std::array<std::string_view, kSections> sections_;
    std::array<bool, kSections> present_ = {};
    MapIndex map_;
};

}  // namespace

std::string writeMapIndex(const MapIndex& map) {
    Writer to;
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

MapIndex readMapIndex(std::string_view bytes) {
    return Reader(bytes).read();
}

}  // namespace olvane::charts
