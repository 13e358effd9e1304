// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The checked call gives the picture of the plain one, and says of each failure what it was.

#include <gtest/gtest.h>

#include <olvane/charts/CheckedPicture.h>
#include <olvane/kin/FamilyDataSource.h>
#include <olvane/picture/PictureJson.h>

#include <cstdint>
#include <functional>
#include <limits>
#include <memory>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace olvane::charts {
namespace {

constexpr View kViews[] = {View::family,    View::pedigree,  View::near, View::ancestors, View::descendants,
                           View::hourglass, View::relatives, View::fan,  View::kinship,   View::everybody};

// The couple 1 and 2 with their children 3 and 5; nobody knows the person 9.
Family parentsAndChildren() {
    Family family;
    for (const std::int64_t id : {1, 2, 3, 5, 9}) {
        PersonRow person;
        person.id = id;
        person.father = id == 3 || id == 5 ? 1 : 0;
        person.mother = id == 3 || id == 5 ? 2 : 0;
        person.sex = id == 2 ? kin::Sex::female : kin::Sex::male;
        family.addPerson(person);
    }
    for (const std::int64_t id : {1, 2}) {
        const std::int64_t spouse[] = {3 - id};
        const std::int64_t children[] = {3, 5};
        family.setSpouses(id, spouse, spouse[0]);
        family.setChildren(id, children);
    }
    return family;
}

// A host whose list of children is what the test says.
class Host final : public OlvaneViewerManagerWrapProtocol {
public:
    typedef std::function<std::vector<std::int64_t>(std::int64_t)> Children;
    explicit Host(Children children) : family_(parentsAndChildren()), children_(std::move(children)) {}

    std::int64_t fatherForPersonWithID(std::int64_t id) override { return family_.fatherForPersonWithID(id); }
    std::int64_t motherForPersonWithID(std::int64_t id) override { return family_.motherForPersonWithID(id); }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t id) override {
        return family_.spousesForPersonWithID(id);
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t id) override { return children_(id); }
    bool isPreferredSpouse(std::int64_t id, std::int64_t spouse) override {
        return family_.isPreferredSpouse(id, spouse);
    }
    bool isPersonDead(std::int64_t id) override { return family_.isPersonDead(id); }
    std::string dateForPersonWithID(std::int64_t id, bool isBirth) override {
        return family_.dateForPersonWithID(id, isBirth);
    }
    std::int32_t sexOfPersonWithID(std::int64_t id) override { return family_.sexOfPersonWithID(id); }

private:
    FamilyDataSource family_;
    Children children_;
};

ViewRequest requestFor(View view) {
    ViewRequest request;
    request.chart.view = view;
    return request;
}

std::shared_ptr<FamilyDataSource> source() {
    return std::make_shared<FamilyDataSource>(parentsAndChildren());
}

TEST(CheckedPicture, isThePictureOfThePlainCallInEveryView) {
    for (const View view : kViews) {
        const ViewRequest request = requestFor(view);
        const CheckedPicture checked = checkedPicture(source(), 3, request, 5);
        EXPECT_TRUE(checked.isOk()) << nameOf(view) << ": " << checked.reason.text();
        EXPECT_EQ(picture::pictureJson(pictureOfHost(source(), 3, request, 5)),
                  picture::pictureJson(checked.picture));
        EXPECT_LE(view == View::descendants ? 1U : 3U, checked.picture.boxes.size()) << nameOf(view);
    }
}

TEST(CheckedPicture, namesOperationPersonAndCauseInEveryView) {
    const auto host = std::make_shared<Host>([](std::int64_t) -> std::vector<std::int64_t> {
        throw std::runtime_error("the database is closed");
    });
    for (const View view : kViews) {
        const CheckedPicture checked = checkedPicture(host, 1, requestFor(view), 5);
        EXPECT_EQ(CheckedStatus::hostFailed, checked.status) << nameOf(view);
        EXPECT_EQ("childrenForPersonWithID(1): the database is closed", checked.reason.text());
        EXPECT_TRUE(checked.picture.boxes.empty());
    }
}

TEST(CheckedPicture, refusesAnAnswerThatIsNoId) {
    const auto host = std::make_shared<Host>(
        [](std::int64_t) { return std::vector<std::int64_t>{(std::int64_t{1} << 32) + 3}; });
    for (const View view : {View::family, View::descendants}) {
        const CheckedPicture checked = checkedPicture(host, 1, requestFor(view));
        EXPECT_EQ(CheckedStatus::invalidId, checked.status);
        EXPECT_EQ("childrenForPersonWithID(1): answered 4294967299, which is no id: ids are 1 to 2147483647",
                  checked.reason.text());
    }
}

TEST(CheckedPicture, saysWhichOptionIsOutOfItsRange) {
    ViewRequest angle = requestFor(View::fan);
    angle.chart.fanAngle = std::numeric_limits<double>::quiet_NaN();
    ViewRequest up = requestFor(View::ancestors);
    up.chart.up = -1;
    ViewRequest size = requestFor(View::family);
    size.chart.sizes.gapX = -1;
    ViewRequest view = requestFor(static_cast<View>(10));
    const std::pair<ViewRequest, std::string> wrong[] = {
        {angle, "fanAngle is not between 90 and 360"},
        {up, "up is below 0"},
        {size, "a size is not between 0 and a million points"},
        {view, "view is none of the views"}};
    for (const auto& [request, cause] : wrong) {
        const CheckedPicture checked = checkedPicture(source(), 3, request);
        EXPECT_EQ(CheckedStatus::invalidArgument, checked.status);
        EXPECT_EQ(cause, checked.reason.text());
    }
}

TEST(CheckedPicture, refusesPersonsWhoCannotBeAskedAbout) {
    const CheckedPicture focus = checkedPicture(source(), 0, requestFor(View::fan));
    EXPECT_EQ(CheckedStatus::invalidPerson, focus.status);
    const CheckedPicture other = checkedPicture(source(), 3, requestFor(View::kinship), 9);
    EXPECT_EQ(CheckedStatus::invalidPerson, other.status);
    EXPECT_EQ(9, other.reason.person);
    EXPECT_EQ("not connected with the focus", other.reason.text());
}

TEST(CheckedPicture, refusesANestedCallOfEitherKind) {
    CheckedStatus picture = CheckedStatus::ok;
    CheckedStatus layout = CheckedStatus::ok;
    const auto host = std::make_shared<Host>([&](std::int64_t) {
        picture = checkedPicture(source(), 3, requestFor(View::fan)).status;
        layout = checkedLayout(TypedLayout::View::family, 3, source()).status;
        return std::vector<std::int64_t>();
    });
    EXPECT_TRUE(checkedPicture(host, 3, requestFor(View::descendants)).isOk());
    EXPECT_EQ(CheckedStatus::nestedCall, picture);
    EXPECT_EQ(CheckedStatus::nestedCall, layout);
}

}  // namespace
}  // namespace olvane::charts
