// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The callbacks between the layouters and the data source: what each asks, in which order, and the records
// that it makes of the answers.

#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <support/FamilyText.h>
#include <unit/boundary/Request.h>

namespace {

using support::CaseFile;
using support::family;
using support::PersonId;
using unit::Calls;
using unit::failureOf;
using unit::kEmptyFunctionFailure;
using unit::kUnknownKeyFailure;
using unit::Request;

SpouseSet spousesOf(Request& request, PersonId id) {
    SpouseSet set;
    request.callbacks.getSpouses(request.key(id), set);
    return set;
}

ChildrenSet childrenOf(Request& request, PersonId id) {
    ChildrenSet set;
    request.callbacks.getChildren(request.key(id), set);
    return set;
}

template <class Set>
std::vector<std::string> idTexts(const Set& set) {
    std::vector<std::string> texts;
    for (const auto& record : set) texts.push_back(record.idText);
    return texts;
}

typedef std::vector<std::string> Texts;

void giveParents(Request& request, PersonId id) {
    int father = -1;
    int mother = -1;
    request.callbacks.getParents(request.key(id), father, mother);
}

// --- Spouses.

TEST(SpousesOfAPerson, recordHoldsTheHostsAnswers) {
    CaseFile input = family("17+42; 17+43");
    input.preferredSpouses[17] = 43;
    input.dead[43] = true;
    input.dates[43] = "1850";
    Request request(input);
    const SpouseSet set = spousesOf(request, 17);
    ASSERT_EQ(2u, set.size());
    const SpouseAdapter& first = *set.begin();
    EXPECT_EQ(request.key(42), first.key);
    EXPECT_FALSE(first.preferred);
    EXPECT_TRUE(first.alive);
    EXPECT_EQ("", first.date);
    EXPECT_EQ("42", first.idText);
    EXPECT_EQ(1, first.hostOrder);
    const SpouseAdapter& second = *set.rbegin();
    EXPECT_EQ(request.key(43), second.key);
    EXPECT_TRUE(second.preferred);
    EXPECT_FALSE(second.alive);
    EXPECT_EQ("1", second.date);
    EXPECT_EQ("43", second.idText);
    EXPECT_EQ(2, second.hostOrder);
}

TEST(SpousesOfAPerson, hostIsAskedAboutOneSpouseAfterTheOtherThePersonFirstInThePreference) {
    Request request(family("17+42; 17+43"));
    spousesOf(request, 17);
    EXPECT_EQ((Calls{"spousesForPersonWithID 17", "isPreferredSpouse 17 42", "isPersonDead 42",
                     "dateForPersonWithID 42 0", "isPreferredSpouse 17 43", "isPersonDead 43",
                     "dateForPersonWithID 43 0"}),
              request.newCalls());
}

TEST(SpousesOfAPerson, standInTheHostsOrderWhateverTheirKeysAndPreference) {
    CaseFile input = family("17+43; 17+42; 17+41");
    input.preferredSpouses[17] = 41;
    Request request(input);
    request.key(41);  // met first, so it has the lowest key of the three
    EXPECT_EQ((Texts{"43", "42", "41"}), idTexts(spousesOf(request, 17)));
}

TEST(SpousesOfAPerson, spouseListedTwiceYieldsTwoRecordsOfOneKey) {
    Request request(family("17+42; 17+42"));
    const SpouseSet set = spousesOf(request, 17);
    ASSERT_EQ(2u, set.size());
    EXPECT_EQ(set.begin()->key, set.rbegin()->key);
    EXPECT_EQ(1, set.begin()->hostOrder);
    EXPECT_EQ(2, set.rbegin()->hostOrder);
}

TEST(SpousesOfAPerson, personWithoutAnyLeavesTheSetAsItCame) {
    Request request(family("17"));
    SpouseSet set{SpouseAdapter(99, true, true, "", "99", 1)};
    request.callbacks.getSpouses(request.key(17), set);
    EXPECT_EQ((Texts{"99"}), idTexts(set));
    EXPECT_EQ((Calls{"spousesForPersonWithID 17"}), request.newCalls());
}

// 98 has no place, so 43, who lives, stands ahead of it; 42 has the place of 99 and is left out. Records with and
// without places have no one order among them, so where 43 comes in decides.
TEST(SpousesOfAPerson, goAmongRecordsWithoutAPlaceWhereTheSetsOwnOrderHasThem) {
    CaseFile input = family("17+42; 17+43");
    input.preferredSpouses[17] = 43;
    Request request(input);
    SpouseSet set;
    set.insert(SpouseAdapter(98, true, false, "", "98", 0));
    set.insert(SpouseAdapter(99, false, true, "", "99", 1));
    request.callbacks.getSpouses(request.key(17), set);
    EXPECT_EQ((Texts{"43", "98", "99"}), idTexts(set));
}

TEST(SpousesOfAPerson, addNodeHasNoneAndTheHostIsNotAsked) {
    Request request(family("17"));
    giveParents(request, 17);
    request.newCalls();
    EXPECT_TRUE(spousesOf(request, -1).empty());
    EXPECT_EQ(Calls{}, request.newCalls());
}

TEST(SpousesOfAPerson, listEntryIsCutToItsLow32BitsAndAskedAboutWhateverItsSign) {
    CaseFile input = family("17");
    input.spouses[17] = {0x10000002a, 0x80000000, -5, 0};
    Request request(input);
    EXPECT_EQ((Texts{"42", "-2147483648", "-5", "0"}), idTexts(spousesOf(request, 17)));
    EXPECT_EQ((Calls{"spousesForPersonWithID 17", "isPreferredSpouse 17 42", "isPersonDead 42",
                     "dateForPersonWithID 42 0", "isPreferredSpouse 17 -2147483648",
                     "isPersonDead -2147483648", "dateForPersonWithID -2147483648 0",
                     "isPreferredSpouse 17 -5", "isPersonDead -5", "dateForPersonWithID -5 0",
                     "isPreferredSpouse 17 0", "isPersonDead 0", "dateForPersonWithID 0 0"}),
              request.newCalls());
}

// --- Children.

TEST(ChildrenOfAPerson, recordHoldsTheHostsAnswers) {
    CaseFile input = family("17: 5 6");
    input.births[6] = "1899";
    input.dates[6] = "the other date";
    Request request(input);
    const ChildrenSet set = childrenOf(request, 17);
    ASSERT_EQ(2u, set.size());
    const ChildrenAdapter& second = *set.rbegin();
    EXPECT_EQ(request.key(6), second.key);
    EXPECT_EQ("1", second.date);
    EXPECT_EQ("6", second.idText);
    EXPECT_EQ("", second.sortText);
    EXPECT_EQ(2, second.hostOrder);
}

TEST(ChildrenOfAPerson, hostIsAskedForTheListThenForEachBirth) {
    Request request(family("17: 5 6"));
    childrenOf(request, 17);
    EXPECT_EQ((Calls{"childrenForPersonWithID 17", "dateForPersonWithID 5 1", "dateForPersonWithID 6 1"}),
              request.newCalls());
}

TEST(ChildrenOfAPerson, childListedTwiceYieldsOneRecordTheFirst) {
    Request request(family("17: 5 6 5"));
    const ChildrenSet set = childrenOf(request, 17);
    EXPECT_EQ((Texts{"5", "6"}), idTexts(set));
    EXPECT_EQ(1, set.begin()->hostOrder);
}

TEST(ChildrenOfAPerson, childMetEarlierStandsAheadOfItsSiblings) {
    Request request(family("3: 20 21 22"));
    request.key(22);
    EXPECT_EQ((Texts{"22", "20", "21"}), idTexts(childrenOf(request, 3)));
}

TEST(ChildrenOfAPerson, focusStandsFirstAmongItsSiblingsWhateverTheHostsOrder) {
    Request request(family("3: 20 21 17"));
    ASSERT_EQ(0, request.key(17));
    EXPECT_EQ((Texts{"17", "20", "21"}), idTexts(childrenOf(request, 3)));
}

TEST(ChildrenOfAPerson, utf8BirthKeepsItsFirstCharacterWhole) {
    CaseFile input = family("17: 5 6");
    input.births[5] = "\xC3\xA9t\xC3\xA9 1850";
    input.births[6] =
        "\xE5\xB9\xB4"
        "1850";
    Request request(input);
    const ChildrenSet set = childrenOf(request, 17);
    EXPECT_EQ("\xC3\xA9", set.begin()->date);
    EXPECT_EQ("\xE5\xB9\xB4", set.rbegin()->date);
}

TEST(ChildrenOfAPerson, listEntryIsCutToItsLow32BitsAndAskedAboutWhateverItsSign) {
    CaseFile input = family("17");
    input.children[17] = {0x7000000000000005, -6};
    Request request(input);
    EXPECT_EQ((Texts{"5", "-6"}), idTexts(childrenOf(request, 17)));
    EXPECT_EQ((Calls{"childrenForPersonWithID 17", "dateForPersonWithID 5 1", "dateForPersonWithID -6 1"}),
              request.newCalls());
}

TEST(ChildrenOfAPerson, personWithoutAnyLeavesTheSetAsItCame) {
    Request request(family("17"));
    ChildrenSet set{ChildrenAdapter(99, "", "99", 1)};
    request.callbacks.getChildren(request.key(17), set);
    EXPECT_EQ((Texts{"99"}), idTexts(set));
    EXPECT_EQ((Calls{"childrenForPersonWithID 17"}), request.newCalls());
}

// The keys say 7 before 3; the record without a place is compared by id text. It stands between them, since each
// child looks for its place from the top.
TEST(ChildrenOfAPerson, eachFindsItsOwnPlaceAmongRecordsThatHaveNone) {
    Request request(family("17: 7 3"));
    ChildrenSet set{ChildrenAdapter(99, "", "5")};
    request.callbacks.getChildren(request.key(17), set);
    EXPECT_EQ((Texts{"3", "5", "7"}), idTexts(set));
}

TEST(ChildrenOfAnAddNode, isTheOnePersonForWhomItStandsWithoutPlaceAndDate) {
    CaseFile input = family("17");
    input.births[17] = "1850";
    Request request(input);
    giveParents(request, 17);
    request.newCalls();
    const ChildrenSet set = childrenOf(request, -2);
    ASSERT_EQ(1u, set.size());
    EXPECT_EQ(request.key(17), set.begin()->key);
    EXPECT_EQ("", set.begin()->date);
    EXPECT_EQ("17", set.begin()->idText);
    EXPECT_EQ("", set.begin()->sortText);
    EXPECT_EQ(0, set.begin()->hostOrder);
    EXPECT_EQ(Calls{}, request.newCalls());
}

TEST(ChildrenOfAnAddNode, isNobodyWhereTheRecordNamesNoChild) {
    Request request(family("17"));
    request.glue.addAddNodeValue("-7", true, "", "");
    EXPECT_TRUE(childrenOf(request, -7).empty());
}

TEST(ChildrenOfAnAddNode, unknownParentWithoutARecordFailsByName) {
    Request request(family("17"));
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { childrenOf(request, -7); }));
}

// --- Sex, unknown parents, touch.

TEST(SexOfAPerson, zeroIsMaleAndEveryOtherNumberFemale) {
    CaseFile input = family("17");
    input.sexes = {{1, 0}, {2, 1}, {3, 2}, {4, -1}, {5, 256}};
    Request request(input);
    EXPECT_TRUE(request.callbacks.isMale(request.key(1)));
    for (const PersonId id : {2, 3, 4, 5}) EXPECT_FALSE(request.callbacks.isMale(request.key(id))) << id;
    EXPECT_EQ("sexOfPersonWithID 1", request.newCalls().front());
}

TEST(AddNodeQuestion, keyBelowZeroIsOneWithoutALookUp) {
    const Request request(family("17"));
    EXPECT_TRUE(request.callbacks.isAddNode(-1));
    EXPECT_TRUE(request.callbacks.isAddNode(-1000));
}

TEST(AddNodeQuestion, unknownKeyOfZeroOrMoreFailsByName) {
    const Request request(family("17"));
    for (const int key : {0, 5}) {
        EXPECT_EQ(kUnknownKeyFailure,
                  failureOf<std::out_of_range>([&] { request.callbacks.isAddNode(key); }));
    }
}

TEST(AddNodeQuestion, isSettledByTheIdAloneAndTheHostIsNotAsked) {
    Request request(family("17"));
    EXPECT_FALSE(request.callbacks.isAddNode(request.key(17)));
    EXPECT_FALSE(request.callbacks.isAddNode(request.key(1)));
    EXPECT_TRUE(request.callbacks.isAddNode(request.key(0)));
    EXPECT_TRUE(request.callbacks.isAddNode(request.key(-4)));
    EXPECT_EQ(Calls{}, request.newCalls());
}

TEST(Touch, knownPersonChangesNothingAndTheHostIsNotAsked) {
    Request request(family("17"));
    request.callbacks.touchPerson(request.key(17));
    EXPECT_EQ(1u, request.glue.keyToPerson.size());
    EXPECT_EQ(Calls{}, request.newCalls());
}

TEST(Touch, unknownKeyFailsByName) {
    const Request request(family("17"));
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { request.callbacks.touchPerson(0); }));
}

// --- All of them.

TEST(Callbacks, unknownKeyFailsByNameInEveryOneAndTheHostIsNotAsked) {
    Request request(family("17"));
    SpouseSet spouses;
    ChildrenSet children;
    EXPECT_EQ(kUnknownKeyFailure,
              failureOf<std::out_of_range>([&] { request.callbacks.getSpouses(3, spouses); }));
    EXPECT_EQ(kUnknownKeyFailure,
              failureOf<std::out_of_range>([&] { request.callbacks.getChildren(3, children); }));
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { request.callbacks.isMale(3); }));
    EXPECT_EQ(Calls{}, request.newCalls());
}

TEST(Callbacks, keepNoAnswers) {
    Request request(family("17: 5"));
    childrenOf(request, 17);
    const Calls once = request.newCalls();
    childrenOf(request, 17);
    EXPECT_EQ(once, request.newCalls());
}

TEST(Callbacks, failureOfTheHostPassesThroughUnchanged) {
    CaseFile input = family("17+42: 5");
    input.failures[support::HostOperation::isPersonDead] = {1};
    input.failures[support::HostOperation::dateForPersonWithID] = {1};
    Request request(input);
    EXPECT_EQ("isPersonDead fails at call 1",
              failureOf<support::HostFailure>([&] { spousesOf(request, 17); }));
    EXPECT_EQ("dateForPersonWithID fails at call 1",
              failureOf<support::HostFailure>([&] { childrenOf(request, 17); }));
}

TEST(Callbacks, personTextWithLettersBehindTheNumberIsAskedAboutByTheNumber) {
    Request request(family("17: 5"));
    ChildrenSet set;
    request.callbacks.getChildren(request.glue.getKeyFromPerson("17x"), set);
    EXPECT_EQ((Texts{"5"}), idTexts(set));
    EXPECT_EQ("childrenForPersonWithID 17", request.newCalls().front());
}

TEST(Callbacks, missingDataSourceFailsAtTheFirstQuestionToIt) {
    ViewerGlue glue;
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> nobody;
    const olvane::HostCallbacks callbacks(glue, nobody);
    const int key = glue.getKeyFromPerson("17");
    EXPECT_FALSE(callbacks.isAddNode(key));
    EXPECT_THROW(callbacks.isMale(key), std::invalid_argument);
}

TEST(Callbacks, replacedFieldIsWhatTheAdapterGets) {
    Request request(family("17"));
    request.callbacks.isMale = [](int) { return false; };
    const DataAdapter adapter = request.callbacks.dataAdapter();
    EXPECT_FALSE(adapter.isMale(request.key(17)));
    EXPECT_EQ(Calls{}, request.newCalls());
}

TEST(Callbacks, fieldLeftEmptyFailsByNameWhenItIsCalled) {
    Request request(family("17"));
    request.callbacks.touchPerson.clear();
    const DataAdapter adapter = request.callbacks.dataAdapter();
    EXPECT_EQ(kEmptyFunctionFailure,
              failureOf<boost::bad_function_call>([&] { adapter.touchPerson(request.key(17)); }));
}

}  // namespace
