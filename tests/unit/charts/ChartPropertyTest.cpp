// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What holds for the charts of whatever family.

#include <gtest/gtest.h>

#include <olvane/charts/Charts.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/PictureJson.h>

#include <algorithm>
#include <map>
#include <numeric>
#include <string>
#include <vector>

#include "AnyKin.h"
#include "Chooser.h"
#include "PlainCharts.h"
#include "PlainKinship.h"

using namespace olvane::kin;
using namespace olvane::charts;
using olvane::picture::Box;
using olvane::picture::judge;
using olvane::picture::Judgement;
using olvane::picture::Picture;

namespace {

constexpr int kFamilies = 150;
const std::vector<View> kRowViews{View::near, View::ancestors, View::descendants, View::hourglass,
                                  View::relatives};

AnyKin familyOf(unsigned seed) {
    const Chooser choose(seed);
    const int persons = 2 + choose(40);
    const int unions = choose(persons);
    const bool isOrderly = choose(3) != 0;
    return AnyKin::make(persons, unions, isOrderly, choose);
}

ChartRequest requestOf(unsigned seed, View view, const KinGraph& graph) {
    const Chooser choose(seed + 77);
    ChartRequest request;
    request.view = view;
    request.focus = choose(graph.personCount());
    request.to = choose(graph.personCount());
    request.up = choose(4);
    request.down = choose(4);
    request.direction = static_cast<Direction>(choose(4));
    request.spouses = choose(4) != 0;
    request.compact = choose(4) == 0;
    request.siblings = choose(4) == 0;
    request.fanOf = static_cast<FanOf>(choose(2));
    return request;
}

template <class Check>
void forRandomCharts(const std::vector<View>& views, const Check& check) {
    for (unsigned seed = 1; seed <= kFamilies; ++seed) {
        const AnyKin family = familyOf(seed);
        const KinGraph graph = family.graph();
        for (const View view : views) {
            SCOPED_TRACE("family " + std::to_string(seed) + ", " + nameOf(view));
            const ChartRequest request = requestOf(seed, view, graph);
            check(graph, request, chartOf(graph, request));
            if (testing::Test::HasFailure()) return;
        }
    }
}

std::set<Place> personsIn(const KinGraph& graph, const Picture& picture) {
    std::set<Place> persons;
    for (const Box& box : picture.boxes) persons.insert(graph.placeOf(box.id));
    return persons;
}

// Where a box stands from generation to generation, later ones greater.
double levelOf(const Box& box, Direction direction) {
    switch (direction) {
        case Direction::down:
            return box.y;
        case Direction::up:
            return -(box.y + static_cast<double>(box.height));
        case Direction::right:
            return box.x;
        case Direction::left:
            return -(box.x + static_cast<double>(box.width));
    }
    return 0;
}

// Along a generation.
double sideOf(const Box& box, Direction direction) {
    return direction == Direction::down || direction == Direction::up ? box.x : box.y;
}

}  // namespace

TEST(ChartProperties, everybodyHasOneBoxAndNothingMisleads) {
    forRandomCharts(kRowViews, [](const KinGraph& graph, const ChartRequest&, const Picture& picture) {
        EXPECT_EQ(personsIn(graph, picture).size(), picture.boxes.size());
        const Judgement judged = judge(picture, &graph);
        EXPECT_EQ(judged.overlaps, 0U);
        EXPECT_EQ(judged.hits, 0U);
        EXPECT_EQ(judged.crossings, 0U);
        EXPECT_EQ(judged.tracks, 0U);
        EXPECT_EQ(judged.touches, 0U);
        EXPECT_EQ(judged.unjoined, 0U);
        EXPECT_EQ(judged.untold, 0U);
        EXPECT_EQ(judged.slanted, 0U);
    });
}

TEST(ChartProperties, showTheVeryPersonsThatThePlainRulesName) {
    const std::vector<View> views{View::ancestors, View::descendants, View::hourglass, View::relatives};
    forRandomCharts(views, [](const KinGraph& graph, const ChartRequest& request, const Picture& picture) {
        EXPECT_EQ(personsIn(graph, picture), plain::personsOf(graph, request));
    });
}

TEST(ChartProperties, fansAndEverybodyShowTheVeryPersonsThatThePlainRulesName) {
    forRandomCharts({View::fan, View::everybody},
                    [](const KinGraph& graph, const ChartRequest& request, const Picture& picture) {
                        EXPECT_EQ(personsIn(graph, picture),
                                  request.view == View::fan ? plain::fanPersonsOf(graph, request)
                                                            : plain::connectedWith(graph, request.focus));
                    });
}

// All ways by blood that there are, against a list of every chain; hostile families have too many chains.
TEST(ChartProperties, kinshipByBloodShowsTheWaysOfTheListOfAllChains) {
    std::size_t related = 0;
    for (unsigned seed = 1; seed <= kFamilies; ++seed) {
        const Chooser choose(seed);
        const int persons = 2 + choose(30);
        const KinGraph graph = AnyKin::make(persons, choose(persons), true, choose).graph();
        ChartRequest request = requestOf(seed, View::kinship, graph);
        request.ways = WayChoice::blood;
        request.mostWays = 0;
        SCOPED_TRACE("family " + std::to_string(seed));
        std::set<Place> onWays{request.focus, request.to};
        for (const bool byBlood : {true, false}) {
            for (const KinWay& way : plain::Kinship(graph).ways(request.focus, request.to, byBlood)) {
                onWays.insert(way.persons.begin(), way.persons.end());
                onWays.insert(way.ancestors.begin(), way.ancestors.end());
            }
        }
        const Picture picture = chartOf(graph, request);
        ASSERT_EQ(personsIn(graph, picture), onWays);
        related += picture.ways.empty() ? 0 : 1;
    }
    EXPECT_GT(related, 20U);
}

TEST(ChartProperties, aChildStandsInTheNextLevelBelowTheParentsThatItsLineComesFrom) {
    std::vector<View> views = kRowViews;
    views.push_back(View::kinship);
    forRandomCharts(views, [](const KinGraph& graph, const ChartRequest& request, const Picture& picture) {
        (void)graph;
        const auto levelAt = [&](auto box) {
            return levelOf(picture.boxes[static_cast<std::size_t>(box)], request.direction);
        };
        std::map<double, int> places;
        for (std::size_t box = 0; box < picture.boxes.size(); ++box) places[levelAt(box)] = 0;
        int count = 0;
        for (auto& [level, place] : places) place = count++;
        for (const auto& family : picture.families) {
            for (const auto& line : picture.linesOf(family)) {
                if (line.child == olvane::picture::kNone) continue;
                for (const auto parent : picture.parents(family)) {
                    EXPECT_EQ(places.at(levelAt(line.child)), places.at(levelAt(parent)) + 1);
                }
            }
        }
    });
}

TEST(ChartProperties, generationsAreThoseOfThePlainRules) {
    forRandomCharts(
        {View::ancestors, View::descendants},
        [](const KinGraph& graph, const ChartRequest& request, const Picture& picture) {
            if (request.siblings) return;
            const std::map<Place, int> generations = plain::generationsOf(graph, request);
            std::map<int, std::set<double>> levels;
            for (const Box& box : picture.boxes) {
                levels[generations.at(graph.placeOf(box.id))].insert(levelOf(box, request.direction));
            }
            double last = -1e9;
            for (const auto& [generation, places] : levels) {
                EXPECT_EQ(places.size(), 1U);
                EXPECT_GT(*places.begin(), last);
                last = *places.begin();
            }
        });
}

TEST(ChartProperties, couplesShareARowAndChildrenOfOneCoupleStandInTheOrderOfTheData) {
    forRandomCharts({View::descendants}, [](const KinGraph& graph, const ChartRequest& request,
                                            const Picture& picture) {
        (void)graph;
        for (const auto& family : picture.families) {
            const auto parents = picture.parents(family);
            if (parents.size() == 2) {
                EXPECT_EQ(levelOf(picture.boxes[static_cast<std::size_t>(parents[0])], request.direction),
                          levelOf(picture.boxes[static_cast<std::size_t>(parents[1])], request.direction));
            }
            // Children with a stem and a bar of their own couple; siblings who married each other may change places.
            double last = -1e9;
            for (const auto child : picture.children(family)) {
                const auto lines = picture.linesOf(family);
                const bool isDrawn = std::any_of(lines.begin(), lines.end(),
                                                 [child](const auto& line) { return line.child == child; });
                if (!isDrawn ||
                    graph.unionsAsChild(graph.placeOf(picture.boxes[static_cast<std::size_t>(child)].id))
                            .size() > 1) {
                    continue;
                }
                const double side = sideOf(picture.boxes[static_cast<std::size_t>(child)], request.direction);
                if (graph.unionsAsPartner(graph.placeOf(picture.boxes[static_cast<std::size_t>(child)].id))
                        .empty()) {
                    EXPECT_GT(side, last);
                    last = side;
                }
            }
        }
    });
}

TEST(ChartProperties, doNotDependOnTheOrderOfPersonsInTheData) {
    const std::vector<View> views{View::near,      View::ancestors, View::descendants, View::hourglass,
                                  View::relatives, View::fan,       View::kinship};
    for (unsigned seed = 1; seed <= kFamilies; ++seed) {
        const AnyKin family = familyOf(seed);
        std::vector<int> order(static_cast<std::size_t>(family.persons));
        std::iota(order.begin(), order.end(), 0);
        const Chooser choose(seed);
        for (int i = family.persons - 1; i > 0; --i) {
            std::swap(order[static_cast<std::size_t>(i)], order[static_cast<std::size_t>(choose(i + 1))]);
        }
        const KinGraph graph = family.graph();
        const KinGraph shuffled = family.graph(order);
        for (const View view : views) {
            SCOPED_TRACE("family " + std::to_string(seed) + ", " + nameOf(view));
            ChartRequest request = requestOf(seed, view, graph);
            const Picture picture = chartOf(graph, request);
            request.focus = shuffled.placeOf(graph.id(request.focus));
            request.to = shuffled.placeOf(graph.id(request.to));
            const Picture other = chartOf(shuffled, request);
            ASSERT_EQ(picture.boxes.size(), other.boxes.size());
            for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
                ASSERT_EQ(picture.boxes[i].id, other.boxes[i].id);
                ASSERT_EQ(picture.boxes[i].x, other.boxes[i].x);
                ASSERT_EQ(picture.boxes[i].y, other.boxes[i].y);
            }
        }
    }
}

// Who is in the data beside those who are shown, and before them.
TEST(ChartProperties, doNotDependOnPersonsWhoAreNotConnected) {
    for (unsigned seed = 1; seed <= kFamilies; ++seed) {
        const AnyKin family = familyOf(seed);
        AnyKin more = family;
        more.persons += 5;
        more.unions.push_back({{family.persons, family.persons + 1}, {family.persons + 2}});
        std::vector<int> order(static_cast<std::size_t>(more.persons));
        std::iota(order.begin(), order.end(), 0);
        std::rotate(order.begin(), order.end() - 5, order.end());
        const KinGraph graph = family.graph();
        const KinGraph larger = more.graph(order);
        for (int view = static_cast<int>(View::near); view <= static_cast<int>(View::everybody); ++view) {
            ChartRequest request = requestOf(seed, static_cast<View>(view), graph);
            const std::string json = olvane::picture::pictureJson(chartOf(graph, request));
            request.focus = larger.placeOf(graph.id(request.focus));
            request.to = larger.placeOf(graph.id(request.to));
            EXPECT_EQ(olvane::picture::pictureJson(chartOf(larger, request)), json)
                << "family " << seed << ", " << nameOf(request.view);
        }
    }
}

TEST(ChartProperties, boxesOfAnySizeStandClearOfOneAnother) {
    for (unsigned seed = 1; seed <= kFamilies; ++seed) {
        const KinGraph graph = familyOf(seed).graph();
        const Chooser choose(seed);
        std::vector<BoxSize> sizes(static_cast<std::size_t>(graph.personCount()));
        for (BoxSize& size : sizes) {
            size = {static_cast<float>(40 + choose(100)), static_cast<float>(30 + choose(90))};
        }
        for (const View view : kRowViews) {
            SCOPED_TRACE("family " + std::to_string(seed) + ", " + nameOf(view));
            ChartRequest request = requestOf(seed, view, graph);
            request.boxSizes = sizes;
            const Picture picture = chartOf(graph, request);
            const Judgement judged = judge(picture, &graph);
            ASSERT_EQ(judged.overlaps + judged.hits + judged.unjoined + judged.crossings, 0U);
            for (const Box& box : picture.boxes) {
                const BoxSize& size = sizes[static_cast<std::size_t>(graph.placeOf(box.id))];
                ASSERT_EQ(box.width, size.width);
                ASSERT_EQ(box.height, size.height);
            }
        }
    }
}

TEST(ChartProperties, fansHaveOneCellForEverybodyAndExpressEveryRelation) {
    for (unsigned seed = 1; seed <= kFamilies; ++seed) {
        const KinGraph graph = familyOf(seed).graph();
        for (const FanOf kind : {FanOf::ancestors, FanOf::descendants}) {
            SCOPED_TRACE("family " + std::to_string(seed));
            ChartRequest request = requestOf(seed, View::fan, graph);
            request.fanOf = kind;
            request.fanAngle = 90 + static_cast<double>(seed % 4) * 90;
            const Picture picture = chartOf(graph, request);
            const Judgement judged = judge(picture, &graph);
            ASSERT_EQ(personsIn(graph, picture).size(), picture.boxes.size());
            ASSERT_EQ(judged.overlaps + judged.unjoined + judged.untold.value_or(1), 0U);
        }
    }
}

TEST(ChartProperties, kinshipShowsNobodyWhoIsOnNoWay) {
    for (unsigned seed = 1; seed <= kFamilies; ++seed) {
        SCOPED_TRACE("family " + std::to_string(seed));
        const KinGraph graph = familyOf(seed).graph();
        const ChartRequest request = requestOf(seed, View::kinship, graph);
        const Picture picture = chartOf(graph, request);
        std::set<Place> onWays{request.focus, request.to};
        for (const auto& way : picture.ways) {
            const auto boxes = picture.boxesOf(way);
            EXPECT_EQ(graph.placeOf(picture.boxes[static_cast<std::size_t>(boxes.front())].id),
                      request.focus);
            EXPECT_EQ(graph.placeOf(picture.boxes[static_cast<std::size_t>(boxes.back())].id), request.to);
            for (const auto box : boxes)
                onWays.insert(graph.placeOf(picture.boxes[static_cast<std::size_t>(box)].id));
            for (const auto box : picture.ancestorsOf(way)) {
                onWays.insert(graph.placeOf(picture.boxes[static_cast<std::size_t>(box)].id));
            }
        }
        EXPECT_EQ(personsIn(graph, picture), onWays);
        const Judgement judged = judge(picture, &graph);
        ASSERT_EQ(judged.overlaps + judged.hits + judged.crossings + judged.tracks + judged.touches +
                      judged.unjoined + judged.untold.value_or(1),
                  0U);
    }
}
