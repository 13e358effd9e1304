// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The checked entry gives what the silent one gives, and says of each failure what it was.

#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <limits>
#include <memory>
#include <new>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <olvane/boundary/CheckedLayout.h>
#include <support/CaseRun.h>
#include <support/FamilyText.h>

namespace {

using olvane::CheckedLayout;
using olvane::checkedLayout;
using olvane::CheckedStatus;
using olvane::HostOperation;
using olvane::LayoutOptions;
using olvane::TypedLayout;
typedef std::shared_ptr<OlvaneViewerManagerWrapProtocol> Source;

constexpr const char* kRelatives = "17+42: 5 6f; 3+4: 17 18; 1+2: 3";
constexpr auto kFamily = TypedLayout::View::family;

// Relatives that answer as the text says, but for one question: there, an action of the test comes first.
class DisturbedSource final : public support::CaseManager {
public:
    DisturbedSource(HostOperation operation, std::int64_t person, std::function<void()> action)
        : CaseManager(support::family(kRelatives)),
          operation_(operation),
          person_(person),
          action_(std::move(action)) {}

    std::int64_t fatherForPersonWithID(std::int64_t person) override {
        disturb(HostOperation::father, person);
        return CaseManager::fatherForPersonWithID(person);
    }
    std::int64_t motherForPersonWithID(std::int64_t person) override {
        disturb(HostOperation::mother, person);
        return CaseManager::motherForPersonWithID(person);
    }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t person) override {
        disturb(HostOperation::spouses, person);
        return CaseManager::spousesForPersonWithID(person);
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t person) override {
        disturb(HostOperation::children, person);
        return CaseManager::childrenForPersonWithID(person);
    }
    bool isPreferredSpouse(std::int64_t person, std::int64_t spouse) override {
        disturb(HostOperation::isPreferredSpouse, person);
        return CaseManager::isPreferredSpouse(person, spouse);
    }
    bool isPersonDead(std::int64_t person) override {
        disturb(HostOperation::isPersonDead, person);
        return CaseManager::isPersonDead(person);
    }
    std::string dateForPersonWithID(std::int64_t person, bool isBirth) override {
        disturb(HostOperation::date, person);
        return CaseManager::dateForPersonWithID(person, isBirth);
    }
    std::int32_t sexOfPersonWithID(std::int64_t person) override {
        disturb(HostOperation::sex, person);
        return CaseManager::sexOfPersonWithID(person);
    }

private:
    void disturb(HostOperation operation, std::int64_t person) const {
        if (operation == operation_ && person == person_) action_();
    }

    HostOperation operation_;
    std::int64_t person_;
    std::function<void()> action_;
};

Source plainSource(const std::string& text = kRelatives) {
    return std::make_shared<support::CaseManager>(support::family(text));
}

CheckedLayout disturbed(HostOperation operation, std::int64_t person, std::function<void()> action) {
    return checkedLayout(kFamily, 17,
                         std::make_shared<DisturbedSource>(operation, person, std::move(action)));
}

// Relatives whose answers about one person are those of the test.
class StrangeSource final : public support::CaseManager {
public:
    StrangeSource() : CaseManager(support::family(kRelatives)) {}

    std::int64_t father = kPersonNotFound;
    std::vector<std::int64_t> children;

    std::int64_t fatherForPersonWithID(std::int64_t person) override {
        return person == 42 ? father : CaseManager::fatherForPersonWithID(person);
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t person) override {
        return person == 42 ? children : CaseManager::childrenForPersonWithID(person);
    }
};

TEST(CheckedLayout, hasTheTextOfTheSilentEntry) {
    const CheckedLayout result = checkedLayout(kFamily, 17, plainSource());
    EXPECT_TRUE(result.isOk());
    EXPECT_EQ("", result.reason.text());
    EXPECT_EQ(support::layoutText(support::family(kRelatives)), result.layout.text);
    EXPECT_EQ(17, result.layout.boxes.front().id);
}

TEST(CheckedLayout, laysOutAPedigree) {
    LayoutOptions options;
    options.generations = 3;
    const CheckedLayout result = checkedLayout(TypedLayout::View::pedigree, 17, plainSource(), options);
    EXPECT_TRUE(result.isOk());
    EXPECT_EQ(olvane::pedigreeLayout(17, plainSource(), options).text, result.layout.text);
    EXPECT_NE(support::layoutText(support::family(kRelatives)), result.layout.text);
}

TEST(CheckedLayout, namesOperationPersonAndCauseOfAnException) {
    const std::pair<HostOperation, std::int64_t> questions[] = {{HostOperation::father, 17},
                                                                {HostOperation::mother, 17},
                                                                {HostOperation::spouses, 17},
                                                                {HostOperation::children, 17},
                                                                {HostOperation::isPreferredSpouse, 17},
                                                                {HostOperation::isPersonDead, 42},
                                                                {HostOperation::date, 5},
                                                                {HostOperation::sex, 17}};
    for (const auto& [operation, person] : questions) {
        const CheckedLayout result =
            disturbed(operation, person, [] { throw std::runtime_error("the database is closed"); });
        EXPECT_EQ(CheckedStatus::hostFailed, result.status) << nameOf(operation);
        EXPECT_EQ(std::string(nameOf(operation)) + "(" + std::to_string(person) + "): the database is closed",
                  result.reason.text());
    }
}

TEST(CheckedLayout, reportsAnExceptionThatIsNoStandardOne) {
    const CheckedLayout result = disturbed(HostOperation::children, 17, [] { throw 5; });
    EXPECT_EQ(CheckedStatus::hostFailed, result.status);
    EXPECT_EQ("childrenForPersonWithID(17): an exception without a text", result.reason.text());
}

// Exceptions of the library's own kinds are the data source's all the same.
TEST(CheckedLayout, doesNotTakeTheSourcesExceptionForTheEnginesOwn) {
    const CheckedLayout result =
        disturbed(HostOperation::mother, 3, [] { throw std::invalid_argument("no such column"); });
    EXPECT_EQ(CheckedStatus::hostFailed, result.status);
    EXPECT_EQ("motherForPersonWithID(3): no such column", result.reason.text());
}

TEST(CheckedLayout, saysWhereMemoryRanOutInTheSource) {
    const CheckedLayout result = disturbed(HostOperation::spouses, 17, [] { throw std::bad_alloc(); });
    EXPECT_EQ(CheckedStatus::outOfMemory, result.status);
    EXPECT_EQ(HostOperation::spouses, result.reason.operation);
    EXPECT_EQ(17, result.reason.person);
}

TEST(CheckedLayout, refusesANumberThatIsNoId) {
    for (const std::int64_t wrong : {std::int64_t{0}, std::int64_t{-1}, (std::int64_t{1} << 32) + 4}) {
        const auto source = std::make_shared<StrangeSource>();
        source->father = wrong;
        const CheckedLayout result = checkedLayout(kFamily, 17, source);
        EXPECT_EQ(CheckedStatus::invalidId, result.status);
        EXPECT_EQ("fatherForPersonWithID(42): answered " + std::to_string(wrong) +
                      ", which is no id: ids are 1 to 2147483647",
                  result.reason.text());
    }
}

TEST(CheckedLayout, refusesAnEntryOfAListThatIsNoId) {
    const auto source = std::make_shared<StrangeSource>();
    source->children = {5, OlvaneViewerManagerWrapProtocol::kPersonNotFound};
    const CheckedLayout result = checkedLayout(kFamily, 17, source);
    EXPECT_EQ(CheckedStatus::invalidId, result.status);
    EXPECT_EQ(HostOperation::children, result.reason.operation);
    EXPECT_EQ(42, result.reason.person);
}

TEST(CheckedLayout, refusesAFocusThatIsNoId) {
    for (const std::int64_t wrong : {std::int64_t{0}, (std::int64_t{1} << 32) + 17}) {
        const CheckedLayout result = checkedLayout(kFamily, wrong, plainSource());
        EXPECT_EQ(CheckedStatus::invalidPerson, result.status);
        EXPECT_EQ(wrong, result.reason.person);
        EXPECT_EQ("", result.layout.text);
    }
}

TEST(CheckedLayout, refusesNoSourceAndOptionsOutOfRange) {
    EXPECT_EQ(CheckedStatus::invalidArgument, checkedLayout(kFamily, 17, nullptr).status);
    LayoutOptions options;
    options.generations = 0;
    const CheckedLayout result = checkedLayout(kFamily, 17, plainSource(), options);
    EXPECT_EQ(CheckedStatus::invalidArgument, result.status);
    EXPECT_EQ("generations is not between 1 and 1000", result.reason.text());
}

TEST(CheckedLayout, refusesANestedCallAndFinishesTheOuterOne) {
    CheckedStatus inner = CheckedStatus::ok;
    const CheckedLayout outer = disturbed(HostOperation::children, 17,
                                          [&] { inner = checkedLayout(kFamily, 3, plainSource()).status; });
    EXPECT_EQ(CheckedStatus::nestedCall, inner);
    EXPECT_TRUE(outer.isOk());
    EXPECT_EQ(support::layoutText(support::family(kRelatives)), outer.layout.text);
    EXPECT_TRUE(checkedLayout(kFamily, 17, plainSource()).isOk());
}

TEST(CheckedLayout, laysOutAgainAfterAFailure) {
    EXPECT_FALSE(disturbed(HostOperation::sex, 17, [] { throw 5; }).isOk());
    EXPECT_TRUE(checkedLayout(kFamily, 17, plainSource()).isOk());
}

}  // namespace
