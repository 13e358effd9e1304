// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One call gives the picture of every view, whether a family is handed over or a host is asked.

#include <gtest/gtest.h>

#include <olvane/charts/Views.h>
#include <olvane/kin/FamilyDataSource.h>
#include <olvane/picture/PictureJson.h>

#include <memory>
#include <set>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace olvane::charts {
namespace {

constexpr View kViews[] = {View::family,    View::pedigree,  View::near, View::ancestors, View::descendants,
                           View::hourglass, View::relatives, View::fan,  View::kinship,   View::everybody};

PersonRow row(std::int64_t id, std::int64_t father, std::int64_t mother, kin::Sex sex) {
    PersonRow person;
    person.id = id;
    person.father = father;
    person.mother = mother;
    person.sex = sex;
    return person;
}

// Grandparents 1 and 2, their children 3 and 5 with spouses 4 and 6, and one child of each couple: 7 and 8.
Family cousins() {
    Family family;
    const kin::Sex man = kin::Sex::male;
    const kin::Sex woman = kin::Sex::female;
    for (const PersonRow& person :
         {row(1, 0, 0, man), row(2, 0, 0, woman), row(3, 1, 2, man), row(4, 0, 0, woman), row(5, 1, 2, woman),
          row(6, 0, 0, man), row(7, 3, 4, man), row(8, 6, 5, woman)}) {
        family.addPerson(person);
    }
    const auto join = [&family](std::int64_t one, std::int64_t other,
                                const std::vector<std::int64_t>& children) {
        for (const std::int64_t id : {one, other}) {
            const std::int64_t spouse[] = {id == one ? other : one};
            family.setSpouses(id, spouse, spouse[0]);
            family.setChildren(id, children);
        }
    };
    join(1, 2, {3, 5});
    join(3, 4, {7});
    join(5, 6, {8});
    return family;
}

ViewRequest requestFor(View view) {
    ViewRequest request;
    request.chart.view = view;
    return request;
}

std::set<std::int64_t> idsOf(const picture::Picture& picture) {
    std::set<std::int64_t> ids;
    for (const picture::Box& box : picture.boxes) {
        if (box.id > 0) ids.insert(box.id);
    }
    return ids;
}

// Answers until that many questions have been asked.
class FailingHost final : public OlvaneViewerManagerWrapProtocol {
public:
    FailingHost(const Family& family, int answers) : family_(family), left_(answers) {}

    std::int64_t fatherForPersonWithID(std::int64_t id) override { return asked().fatherForPersonWithID(id); }
    std::int64_t motherForPersonWithID(std::int64_t id) override { return asked().motherForPersonWithID(id); }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t id) override {
        return asked().spousesForPersonWithID(id);
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t id) override {
        return asked().childrenForPersonWithID(id);
    }
    bool isPreferredSpouse(std::int64_t id, std::int64_t spouse) override {
        return asked().isPreferredSpouse(id, spouse);
    }
    bool isPersonDead(std::int64_t id) override { return asked().isPersonDead(id); }
    std::string dateForPersonWithID(std::int64_t id, bool isBirth) override {
        return asked().dateForPersonWithID(id, isBirth);
    }
    std::int32_t sexOfPersonWithID(std::int64_t id) override { return asked().sexOfPersonWithID(id); }

    int left() const { return left_; }

private:
    FamilyDataSource& asked() {
        if (left_-- <= 0) throw std::runtime_error("the host fails here");
        return family_;
    }

    FamilyDataSource family_;
    int left_;
};

// Answers that contradict one another, the same each time: parents who are no parents, spouses of oneself, repeats, and
// now and then a number that is no id.
class HostileHost final : public OlvaneViewerManagerWrapProtocol {
public:
    HostileHost(std::uint32_t seed, bool withWrongIds) : seed_(seed), withWrongIds_(withWrongIds) {}

    std::int64_t fatherForPersonWithID(std::int64_t id) override { return parent(id, 1); }
    std::int64_t motherForPersonWithID(std::int64_t id) override { return parent(id, 2); }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t id) override { return list(id, 3, 3); }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t id) override { return list(id, 4, 4); }
    bool isPreferredSpouse(std::int64_t id, std::int64_t spouse) override {
        return number(id + spouse, 5) % 2 == 0;
    }
    bool isPersonDead(std::int64_t id) override { return number(id, 6) % 2 == 0; }
    std::string dateForPersonWithID(std::int64_t id, bool) override {
        return std::string(number(id, 7) % 3, 'x');
    }
    std::int32_t sexOfPersonWithID(std::int64_t id) override {
        return static_cast<std::int32_t>(number(id, 8) % 5) - 1;
    }

private:
    static constexpr std::uint32_t kPersons = 12;

    std::uint32_t number(std::int64_t id, std::uint32_t question) const {
        std::uint32_t value =
            seed_ * 2654435761u + static_cast<std::uint32_t>(id) * 40503u + question * 69069u;
        for (int turn = 0; turn < 3; ++turn) value = (value ^ (value >> 15)) * 2246822519u;
        return value >> 8;
    }
    std::int64_t idOf(std::uint32_t value) const {
        if (withWrongIds_ && value % 97 == 0) return value % 2 == 0 ? 0 : -7;
        return 1 + value % kPersons;
    }
    std::int64_t parent(std::int64_t id, std::uint32_t question) const {
        const std::uint32_t value = number(id, question);
        return value % 3 == 0 ? kPersonNotFound : idOf(value);
    }
    std::vector<std::int64_t> list(std::int64_t id, std::uint32_t question, std::uint32_t most) const {
        std::vector<std::int64_t> ids(number(id, question) % (most + 1));
        for (std::size_t i = 0; i < ids.size(); ++i) {
            ids[i] = idOf(number(id, question + 16 * static_cast<std::uint32_t>(i + 1)));
        }
        return ids;
    }

    std::uint32_t seed_;
    bool withWrongIds_;
};

// Either a picture, the same each time, or an exception that says what is wrong.
std::string outcomeOf(std::uint32_t seed, bool withWrongIds, View view) {
    ViewRequest request = requestFor(view);
    request.chart.direction = static_cast<Direction>(seed % 4);
    request.chart.compact = seed % 3 == 0;
    request.chart.siblings = seed % 2 == 0;
    try {
        const auto host = std::make_shared<HostileHost>(seed, withWrongIds);
        return picture::pictureJson(pictureOfHost(host, 1 + seed % 12, request, 1 + (seed / 12) % 12));
    } catch (const std::exception& error) {
        return std::string("refused: ") + error.what();
    }
}

TEST(Views, takeWhateverAHostAnswers) {
    std::size_t drawn = 0;
    for (std::uint32_t seed = 0; seed < 20; ++seed) {
        for (const View view : kViews) {
            for (const bool withWrongIds : {false, true}) {
                const std::string outcome = outcomeOf(seed, withWrongIds, view);
                EXPECT_EQ(outcome, outcomeOf(seed, withWrongIds, view)) << seed << " " << nameOf(view);
                const bool isRefused = outcome.starts_with("refused: ");
                EXPECT_TRUE(!isRefused || outcome.size() > std::string("refused: ").size());
                if (!isRefused) ++drawn;
            }
        }
    }
    EXPECT_GT(drawn, 130U);
}

TEST(Views, showTheSamePersonsOfATableAndOfAHost) {
    const Family family = cousins();
    const auto host = std::make_shared<FamilyDataSource>(family);
    for (const View view : kViews) {
        const ViewRequest request = requestFor(view);
        const picture::Picture ofTable = pictureOf(family, 7, request, 8);
        const picture::Picture ofHost = pictureOfHost(host, 7, request, 8);
        EXPECT_EQ(idsOf(ofTable), idsOf(ofHost)) << nameOf(view);
        EXPECT_GE(idsOf(ofTable).size(), view == View::descendants ? 1U : 4U) << nameOf(view);
        ASSERT_NE(ofHost.focus, picture::kNone) << nameOf(view);
        EXPECT_EQ(ofHost.boxes[static_cast<std::size_t>(ofHost.focus)].id, 7) << nameOf(view);
    }
}

TEST(Views, askAHostNoFartherThanTheyReach) {
    const Family family = cousins();
    ViewRequest request = requestFor(View::ancestors);
    request.chart.up = 1;
    auto few = std::make_shared<FailingHost>(family, 1000000);
    pictureOfHost(few, 7, request);
    auto many = std::make_shared<FailingHost>(family, 1000000);
    pictureOfHost(many, 7, requestFor(View::everybody));
    EXPECT_GT(few->left(), many->left());
    EXPECT_EQ(idsOf(pictureOfHost(few, 7, request)), (std::set<std::int64_t>{3, 4, 7}));
    EXPECT_EQ(pictureOfHost(few, 7, request).boxes[1].hiddenParents, 2);
}

TEST(Views, refuseSomebodyWhoIsNotThere) {
    const Family family = cousins();
    for (const View view : kViews) {
        EXPECT_THROW(pictureOf(family, 9, requestFor(view), 8), std::out_of_range) << nameOf(view);
    }
    EXPECT_THROW(pictureOf(family, 7, requestFor(View::kinship), 9), std::out_of_range);
    const auto host = std::make_shared<FamilyDataSource>(family);
    EXPECT_THROW(pictureOfHost(host, 7, requestFor(View::kinship), 9), std::out_of_range);
}

// The n-th question fails, for every n: what the host throws comes out, and no picture is made of half the answers.
TEST(Views, letAFailureOfTheHostOutWhereverItHappens) {
    const Family family = cousins();
    for (const View view : kViews) {
        const ViewRequest request = requestFor(view);
        const std::string whole =
            picture::pictureJson(pictureOfHost(std::make_shared<FamilyDataSource>(family), 7, request, 8));
        int answers = 0;
        for (bool fails = true; fails && answers < 10000; ++answers) {
            try {
                const auto host = std::make_shared<FailingHost>(family, answers);
                EXPECT_EQ(picture::pictureJson(pictureOfHost(host, 7, request, 8)), whole) << nameOf(view);
                fails = false;
            } catch (const std::runtime_error& error) {
                EXPECT_STREQ(error.what(), "the host fails here");
            }
        }
        EXPECT_GT(answers, 10) << nameOf(view);
        EXPECT_LT(answers, 10000) << nameOf(view);
    }
}

}  // namespace
}  // namespace olvane::charts
