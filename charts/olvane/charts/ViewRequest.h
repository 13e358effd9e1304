// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <span>

#include <olvane/boundary/TypedLayout.h>
#include <olvane/charts/ChartProgress.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/kin/Language.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

enum class View : std::uint8_t {
    family,
    pedigree,
    near,
    ancestors,
    descendants,
    hourglass,
    relatives,
    fan,
    kinship,
    everybody
};

// Where later generations stand, seen from earlier ones: below, above, to the left or to the right.
enum class Direction : std::uint8_t { down, up, left, right };

// No box and no gap may be larger, in points: so places stay exact in whatever chart.
constexpr float kLargestSize = 1000000;

constexpr bool isSize(float points) {
    return points >= 0 && points <= kLargestSize;
}

// The size of a box and the least gaps around it, in points. gapX lies between neighbours of one generation and
// gapY between generations, whichever way the chart runs.
struct ChartSizes {
    float boxWidth = 55;
    float boxHeight = 80;
    float gapX = 25;
    float gapY = 30;
};

// The size of one person's box, in points, as it stands on paper: not turned when the chart runs sideways.
struct BoxSize {
    float width = 0;
    float height = 0;

    bool operator==(const BoxSize&) const = default;
};

// A person, by id, whose box has a size of its own.
struct SizedBox {
    std::int64_t person = 0;
    BoxSize size;

    bool operator==(const SizedBox&) const = default;
};

// Whom a fan shows around its middle.
enum class FanOf : std::uint8_t { ancestors, descendants };

// Which ways between two persons the kinship view draws.
enum class WayChoice : std::uint8_t { blood, marriage, both };

// A branch of a person, by id, that is left out.
struct Fold {
    std::int64_t person = 0;
    picture::Branch branch = picture::Branch::down;

    bool operator==(const Fold&) const = default;
};

// What chart to make. A view ignores the options that it has no use for.
//
// Holds: numbers of generations count from the focus, and 0 means all of them. boxSizes is empty, or has one
//        size for each person of the graph by place; it is read during the call only.
struct ChartRequest {
    View view = View::descendants;
    kin::Place focus = 0;
    kin::Place to = kin::kNobody;  // kinship: the other person
    int up = 0;                    // generations of ancestors
    int down = 0;                  // generations of descendants; relatives: below the focus's own generation
    Direction direction = Direction::down;
    ChartSizes sizes;
    std::span<const BoxSize> boxSizes;
    // Near, ancestors, descendants, hourglass, relatives, kinship, everybody: persons whose boxes are not of the usual
    // size, where boxSizes is empty; read during the call only. Persons who are not in the family are passed over, and
    // of two sizes for one person the last counts.
    std::span<const SizedBox> sizedBoxes;
    // Family, pedigree: the engine's own options, but for the sizes; near: which relatives are shown.
    LayoutOptions layout;
    bool spouses = true;    // descendants, hourglass, relatives, fan of descendants
    bool siblings = false;  // ancestors, hourglass: the siblings of the focus and of its ancestors
    // Trees: generations packed tighter. Parents need not stand over the middle of their children. Everybody: lines
    // lie closer together.
    bool compact = false;
    bool mirrored = false;  // every view: right and left exchanged
    // Near, ancestors, descendants, hourglass, relatives: what is left out; read during the call only. Persons who are
    // not shown and branches that hide nobody are passed over.
    std::span<const Fold> folded;

    FanOf fanOf = FanOf::ancestors;
    double fanAngle = 360;  // degrees, 90 to 360

    WayChoice ways = WayChoice::both;
    int mostWays = 8;  // kinship: no more ways than this are drawn, the nearest first; 0 means all
    kin::Language language = kin::Language::english;  // kinship: of its words

    int marks = 0;        // everybody: how many second links become marks; -1 for all of them
    int effort = 1;       // everybody: 0 is quickest, each step more takes up to twice the time
    bool onePart = true;  // everybody: only the part of the family that the focus is in
    // Everybody: an earlier picture of it whose places are kept where a change leaves them; see EverybodyOptions.
    const picture::Picture* earlier = nullptr;
    // Everybody, near, ancestors, descendants, hourglass, relatives: width by height of the paper that wide generations
    // are folded for; 0 for none.
    double aspect = 0;
    const ChartProgress* progress =
        nullptr;  // everybody: is called meanwhile, if not null; only during the call
};

}  // namespace olvane::charts
