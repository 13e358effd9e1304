// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A map has what the picture has, and its reader believes nothing.

#include <olvane/charts/MapIndex.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>
#include <random>
#include <set>
#include <stdexcept>
#include <string>
#include <tuple>
#include <vector>

#include <olvane/charts/Everybody.h>
#include <olvane/charts/MapLabelsInternal.h>

#include <RandomKin.h>

namespace {

using namespace olvane;
using charts::MapIndex;
using charts::mapIndexOf;
using charts::readMapIndex;
using charts::writeMapIndex;

std::vector<kin::PersonCaption> captionsFor(const kin::KinGraph& graph) {
    std::vector<kin::PersonCaption> captions;
    captions.reserve(static_cast<std::size_t>(graph.personCount()));
    for (int p = 0; p < graph.personCount(); ++p) {
        captions.push_back({"Given" + std::to_string(p % 7) + " Ash" + std::to_string(p % 3),
                            "Ash" + std::to_string(p % 3),
                            static_cast<std::int16_t>(p % 5 == 0 ? 0 : 1700 + p),
                            static_cast<std::int16_t>(p % 4 == 0 ? -40 : 0)});
    }
    return captions;
}

MapIndex mapOf(const kin::KinGraph& graph) {
    return mapIndexOf(graph, captionsFor(graph));
}

std::vector<kin::KinGraph> families(int count) {
    std::vector<kin::KinGraph> made;
    for (int seed = 0; seed < count; ++seed) {
        const auto number = static_cast<std::uint64_t>(seed);
        made.push_back(test::soundKin(number, 1 + seed * 3 % 90));
        made.push_back(test::hostileKin(number, 1 + seed % 50, 1 + seed * 7 % 60));
    }
    return made;
}

using Segment = std::tuple<double, double, double, double>;

double quarter(double points) {
    return std::floor(points * 4 + 0.5) / 4;
}

// Of the picture, in points, to the quarter; zero-length pieces show nothing.
std::multiset<Segment> segmentsOf(const picture::Picture& picture) {
    std::multiset<Segment> segments;
    for (const picture::Line& l : picture.lines) {
        const Segment segment = {quarter(std::min(l.x1, l.x2)), quarter(std::min(l.y1, l.y2)),
                                 quarter(std::max(l.x1, l.x2)), quarter(std::max(l.y1, l.y2))};
        const auto& [x1, y1, x2, y2] = segment;
        if (x1 != x2 || y1 != y2) segments.insert(segment);
    }
    return segments;
}

std::multiset<Segment> segmentsOf(const MapIndex& map) {
    std::multiset<Segment> segments;
    const auto points = [](std::int32_t quarters) { return quarters / 4.0; };
    for (const auto& b : map.bars) segments.insert({points(b.x1), points(b.y), points(b.x2), points(b.y)});
    for (const auto& u : map.uprights)
        segments.insert({points(u.x), points(u.y1), points(u.x), points(u.y2)});
    for (std::size_t row = 0; row < map.rows.size(); ++row) {
        const std::size_t end = row + 1 < map.rows.size() ? map.rows[row + 1].firstPerson : map.x.size();
        for (std::size_t p = map.rows[row].firstPerson; p < end; ++p) {
            if ((map.flags[p] & MapIndex::kJoined) == 0) continue;
            const double y = points(map.rows[row].y) + 28;
            segments.insert({points(map.x[p]) + 120, y, points(map.x[p + 1]), y});
        }
    }
    return segments;
}

TEST(MapIndex, hasTheBoxesAndLinesOfThePicture) {
    for (const kin::KinGraph& graph : families(30)) {
        charts::EverybodyOptions options;
        options.onePart = false;
        options.sizes = {120, 56, 16, 40};
        const picture::Picture picture = charts::everybodyChart(graph, options);
        const MapIndex map = mapOf(graph);
        ASSERT_EQ(map.x.size(), picture.boxes.size());
        std::set<std::tuple<std::int64_t, double, double>> places;
        for (const picture::Box& box : picture.boxes) {
            places.insert({graph.placeOf(box.id) + 1, quarter(box.x), quarter(box.y)});
        }
        for (std::size_t row = 0; row < map.rows.size(); ++row) {
            const std::size_t end = row + 1 < map.rows.size() ? map.rows[row + 1].firstPerson : map.x.size();
            for (std::size_t p = map.rows[row].firstPerson; p < end; ++p) {
                EXPECT_EQ(places.count({map.numbers[p], map.x[p] / 4.0, map.rows[row].y / 4.0}), 1U);
            }
        }
        // A couple that is joined twice has one line.
        std::multiset<Segment> drawn = segmentsOf(picture);
        for (const Segment& segment : segmentsOf(map)) {
            const auto found = drawn.find(segment);
            ASSERT_NE(found, drawn.end());
            drawn.erase(found);
        }
        const std::multiset<Segment> mapped = segmentsOf(map);
        for (const Segment& segment : drawn) EXPECT_GE(mapped.count(segment), 1U);
    }
}

TEST(MapIndex, hasTheKinOfTheGraph) {
    for (const kin::KinGraph& graph : families(30)) {
        const MapIndex map = mapOf(graph);
        ASSERT_EQ(map.partners.size(), static_cast<std::size_t>(graph.unionCount()));
        const auto placeOf = [&map](std::int32_t person) {
            return person == MapIndex::kNobody
                       ? kin::kNobody
                       : static_cast<kin::Place>(map.numbers[static_cast<std::size_t>(person)]) - 1;
        };
        for (kin::UnionPlace u = 0; u < graph.unionCount(); ++u) {
            const auto i = static_cast<std::size_t>(u);
            EXPECT_EQ(placeOf(map.partners[i][0]), graph.partners(u)[0]);
            EXPECT_EQ(placeOf(map.partners[i][1]), graph.partners(u)[1]);
            ASSERT_EQ(map.childStarts[i + 1] - map.childStarts[i], graph.children(u).size());
            for (std::size_t c = 0; c < graph.children(u).size(); ++c) {
                const std::uint32_t child = map.children[map.childStarts[i] + c];
                EXPECT_EQ(placeOf(static_cast<std::int32_t>(child & 0x0FFFFFFFU)), graph.children(u)[c]);
                EXPECT_EQ(child >> 28U, static_cast<std::uint32_t>(graph.childKinds(u)[c]));
            }
        }
    }
}

TEST(MapIndex, comesBackFromItsBytes) {
    for (const kin::KinGraph& graph : families(40)) {
        const MapIndex map = mapOf(graph);
        EXPECT_EQ(readMapIndex(writeMapIndex(map)), map);
    }
}

TEST(MapIndex, hasTheNamesOfTheCaptions) {
    kin::KinGraphBuilder builder;
    const std::vector<kin::PersonCaption> captions = {
        {"Ann Ash", "Ash", 0, 0}, {"Ash", "Ash", 0, 0}, {"Ash Ann", "Ash", 0, 0},     {"Annash", "ash", 0, 0},
        {"", "", 0, 0},           {"Ann", "", 0, 0},    {"Ann Ash Jr.", "Ash", 0, 0}, {" Ash", "Ash", 0, 0}};
    for (std::size_t i = 0; i < captions.size(); ++i)
        builder.addPerson(static_cast<int>(i) + 1, kin::Sex::unknown);
    const MapIndex map = mapIndexOf(builder.build(), captions);
    for (std::size_t p = 0; p < captions.size(); ++p) {
        const bool isSplit = (map.flags[p] & MapIndex::kSurnameLast) != 0;
        const std::string& surname = map.strings[map.surnames[p]];
        const std::string name = map.strings[map.names[p]] + (isSplit ? " " + surname : "");
        EXPECT_EQ(name, captions[map.numbers[p] - 1].name);
        EXPECT_EQ(surname, captions[map.numbers[p] - 1].surname);
        EXPECT_EQ(isSplit, map.numbers[p] == 1) << captions[map.numbers[p] - 1].name;
    }
}

TEST(MapIndex, ofNobodyIsEmpty) {
    const MapIndex map = mapIndexOf(kin::KinGraphBuilder().build(), {});
    EXPECT_TRUE(map.x.empty());
    EXPECT_EQ(readMapIndex(writeMapIndex(map)), map);
}

TEST(MapIndex, needsACaptionForEachPerson) {
    EXPECT_THROW(mapIndexOf(test::soundKin(1, 5), {}), std::invalid_argument);
}

std::string refusalOf(const std::string& bytes) {
    try {
        readMapIndex(bytes);
    } catch (const std::runtime_error& error) {
        return error.what();
    }
    return "";
}

TEST(MapIndex, thatEndsEarlyIsRefusedWithItsLength) {
    const std::string bytes = writeMapIndex(mapOf(test::soundKin(3, 40)));
    for (std::size_t size = 28; size < bytes.size(); ++size) {
        EXPECT_EQ(refusalOf(bytes.substr(0, size)), "the map ends after " + std::to_string(size) +
                                                        " of its " + std::to_string(bytes.size()) + " bytes");
    }
    for (std::size_t size = 0; size < 28; ++size) EXPECT_NE(refusalOf(bytes.substr(0, size)), "");
}

TEST(MapIndex, withAnyByteChangedIsRefused) {
    const std::string bytes = writeMapIndex(mapOf(test::soundKin(5, 25)));
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        std::string changed = bytes;
        changed[i] = static_cast<char>(changed[i] ^ 0x41);
        EXPECT_NE(refusalOf(changed), "") << "byte " << i;
    }
}

void setWord(std::string& bytes, std::size_t place, std::uint32_t word) {
    for (std::size_t i = 0; i < 4; ++i) bytes[place + i] = static_cast<char>(word >> (8 * i) & 0xFFU);
}

// Written down again from the form's description.
void setChecksum(std::string& bytes) {
    std::uint32_t sum = 2166136261U;
    for (std::size_t place = 20; place + 4 <= bytes.size(); place += 4) {
        std::uint32_t word = 0;
        for (std::size_t i = 4; i-- > 0;) word = word << 8U | static_cast<std::uint8_t>(bytes[place + i]);
        sum = (sum ^ word) * 16777619U;
    }
    setWord(bytes, 16, sum);
}

TEST(MapIndex, withWrongNumbersAndTheRightChecksumIsRefusedOrSound) {
    const std::string bytes = writeMapIndex(mapOf(test::hostileKin(7, 30, 30)));
    std::mt19937 random(20);
    const std::array<std::uint32_t, 8> words = {0, 1, 29, 30, 31, 0x7FFFFFFF, 0x80000000U, 0xFFFFFFFFU};
    int refused = 0;
    int sound = 0;
    for (std::size_t place = 20; place + 4 <= bytes.size(); place += 4) {
        for (int trial = 0; trial < 3; ++trial) {
            std::string changed = bytes;
            setWord(changed, place,
                    trial == 2 ? static_cast<std::uint32_t>(random()) : words[random() % words.size()]);
            setChecksum(changed);
            try {
                const MapIndex map = readMapIndex(changed);
                EXPECT_EQ(readMapIndex(writeMapIndex(map)), map);
                ++sound;
            } catch (const std::runtime_error&) {
                ++refused;
            }
        }
    }
    EXPECT_GT(refused, 100);
    EXPECT_GT(sound, 100);
}

TEST(MapIndex, namesAPartOfTheMapByTheSurnameThatMostBear) {
    // A man called Ash and a woman called Bell with four children called Ash: five of six.
    kin::KinGraphBuilder builder;
    std::vector<kin::PersonCaption> captions;
    for (int i = 0; i < 6; ++i) {
        builder.addPerson(i + 1, i == 1 ? kin::Sex::female : kin::Sex::male);
        const std::string surname = i == 1 ? "Bell" : "Ash";
        captions.push_back({"Somebody " + surname, surname, static_cast<std::int16_t>(1800 + i), 0});
    }
    const kin::UnionPlace u = builder.addUnion(0, 1, kin::UnionState::married);
    for (int child = 2; child < 6; ++child) builder.addChild(u, child, kin::ChildKind::birth);
    const MapIndex map = mapIndexOf(builder.build(), captions);
    ASSERT_EQ(map.labelLevels.size(), 1U);
    ASSERT_EQ(map.labels.size(), 1U);
    EXPECT_EQ(map.strings[map.labels[0].text], "Ash");
    EXPECT_EQ(map.labels[0].weight, 5U);
    // Births of the rows: 1800 and 1801, of which the later is in the middle; 1802 to 1805, likewise.
    ASSERT_EQ(map.rows.size(), 2U);
    EXPECT_EQ(map.rows[0].year, 1801);
    EXPECT_EQ(map.rows[1].year, 1804);
}

TEST(MapIndex, countsDescendantsOfABranchOnce) {
    // 1 and 2 have 3; 3 and 4 have 5 and 6: six, less the two who married in.
    kin::KinGraphBuilder builder;
    for (int i = 1; i <= 6; ++i) builder.addPerson(i, kin::Sex::male);
    builder.addChild(builder.addUnion(0, 1, kin::UnionState::married), 2, kin::ChildKind::birth);
    const kin::UnionPlace second = builder.addUnion(2, 3, kin::UnionState::married);
    builder.addChild(second, 4, kin::ChildKind::birth);
    builder.addChild(second, 5, kin::ChildKind::birth);
    const kin::KinGraph graph = builder.build();
    const MapIndex map = mapOf(graph);
    const std::vector<std::uint32_t> sizes = charts::branchSizes(map);
    const std::array<std::uint32_t, 6> expected = {4, 1, 3, 1, 1, 1};
    for (std::size_t p = 0; p < 6; ++p) EXPECT_EQ(sizes[p], expected[map.numbers[p] - 1]);
}

}  // namespace
