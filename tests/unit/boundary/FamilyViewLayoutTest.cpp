// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The entry of a layout and the bridge before it: what comes in as the focus, what survives a call, and how
// every failure of a host ends.

#include <cstdint>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/OlvaneViewerBridge.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <support/FamilyText.h>
#include <unit/boundary/DisturbedRequests.h>
#include <unit/boundary/Request.h>

namespace {

using support::CaseFile;
using support::CaseManager;
using support::family;
using unit::Calls;
using unit::failingAt;
using unit::Request;

std::string layOut(const std::string& personText, const CaseFile& input) {
    return FamilyViewLayout(personText, std::make_shared<CaseManager>(input));
}

std::string layOutById(std::int64_t id, const CaseFile& input) {
    return OlvaneViewerBridge::initWithManagerWrap(std::make_shared<CaseManager>(input))
        .valuesForPersonId(id);
}

// The focus alone under two unknown parents; the name of the focus is what the request said.
std::string textOfLoneFocus(const std::string& name) {
    return name + ":27:0:0:55,-15,55,-15|55,0,55,-15|;-1:-12:-110:0:55,-70,55,-15|42,-70,67,-70|:M:" + name +
           ";-2:67:-110:0::F:" + name + ";";
}

// --- The focus.

TEST(FocusOfALayout, withoutRelativesStandsUnderTwoAddNodes) {
    EXPECT_EQ(textOfLoneFocus("17"), layOut("17", family("17")));
    EXPECT_EQ(textOfLoneFocus("17"), layOut("17", family("17f")));
}

TEST(FocusOfALayout, idOfZeroOrBelowGivesTheEmptyTextAndTheHostIsNotAsked) {
    for (const char* id : {"0", "-1", "-17", "-2147483648"}) {
        Request request(family("17"));
        EXPECT_EQ("", FamilyViewLayout(id, request.source)) << id;
        EXPECT_EQ(Calls{}, request.newCalls()) << id;
    }
}

TEST(FocusOfALayout, textThatIsNoNumberBehavesAsIdZero) {
    for (const char* text : {"", "abc", " ", "x17"}) EXPECT_EQ("", layOut(text, family("17"))) << text;
}

TEST(FocusOfALayout, textBehindTheNumberStandsInTheRecordsAsItCame) {
    EXPECT_EQ(textOfLoneFocus("17x"), layOut("17x", family("17")));
    EXPECT_EQ(textOfLoneFocus(" 17"), layOut(" 17", family("17")));
}

TEST(FocusOfALayout, zeroByteInItsTextEndsTheResultThere) {
    EXPECT_EQ("17", layOut(std::string("17\0"
                                       "9",
                                       4),
                           family("17")));
    EXPECT_EQ("", layOut(std::string("\0"
                                     "17",
                                     3),
                         family("17")));
}

TEST(FocusOfALayout, hasKeyZeroWhateverItsId) {
    for (const char* id : {"1", "17", "2147483647"}) {
        CaseFile input = family(id);
        const std::string firstPerson = support::runCase(input, true, false).at(1);
        EXPECT_EQ("P 0 " + std::string(id) + " ", firstPerson.substr(0, 5 + std::string(id).size()));
    }
}

// --- The bridge.

TEST(Bridge, idOfZeroOrBelowGivesTheEmptyText) {
    for (const std::int64_t id : {std::int64_t{0}, std::int64_t{-1}, std::int64_t{-17}, INT64_MIN}) {
        EXPECT_EQ("", layOutById(id, family("17"))) << id;
    }
}

TEST(Bridge, idAboveAnIntIsCutToItsLow32Bits) {
    EXPECT_EQ(textOfLoneFocus("17"), layOutById(0x100000011, family("17")));
    EXPECT_EQ(textOfLoneFocus("17"), layOutById(-std::int64_t{0xffffffef}, family("17")));
    EXPECT_EQ("", layOutById(0x100000000, family("17")));
    EXPECT_EQ("", layOutById(0x80000011, family("17")));  // negative once it is cut
}

TEST(Bridge, hostIsAskedWithTheCutId) {
    Request request(family("17"));
    OlvaneViewerBridge::initWithManagerWrap(request.source).valuesForPersonId(0x100000011);
    EXPECT_EQ("sexOfPersonWithID 17", request.newCalls().front());
}

TEST(Bridge, asksAgainInEveryCallAndKeepsNoPerson) {
    Request request(family("17+42: 5"));
    const auto bridge = OlvaneViewerBridge::initWithManagerWrap(request.source);
    const std::string first = bridge.valuesForPersonId(17);
    const Calls firstCalls = request.newCalls();
    EXPECT_NE("", bridge.valuesForPersonId(42));
    request.newCalls();
    EXPECT_EQ(first, bridge.valuesForPersonId(17));
    EXPECT_EQ(firstCalls, request.newCalls());
}

TEST(Bridge, holdsItsDataSourceUntilItGoes) {
    auto manager = std::make_shared<CaseManager>(family("17"));
    const std::weak_ptr<CaseManager> watched = manager;
    {
        const auto bridge = OlvaneViewerBridge::initWithManagerWrap(std::move(manager));
        EXPECT_EQ(textOfLoneFocus("17"), bridge.valuesForPersonId(17));
        EXPECT_FALSE(watched.expired());
    }
    EXPECT_TRUE(watched.expired());
}

TEST(Bridge, withoutADataSourceGivesTheEmptyText) {
    EXPECT_EQ("", OlvaneViewerBridge::initWithManagerWrap(nullptr).valuesForPersonId(17));
}

// --- What survives a call.

TEST(Layouts, sameRequestTwiceGivesTheSameText) {
    const CaseFile input = family("17+42: 5 6f; 17: 8; 3: 17 18 19f; 5+50: 51");
    const std::string first = layOut("17", input);
    EXPECT_NE(std::string::npos, first.find(":M:"));  // with unknown parents, whose ids could run on
    EXPECT_EQ(first, layOut("17", input));
}

TEST(Layouts, requestThatFailedLeavesNoMarkOnTheNext) {
    CaseFile failing = family("17+42: 5");
    failing.failures[support::HostOperation::motherForPersonWithID] = {3};
    EXPECT_EQ("", layOut("17", failing));
    EXPECT_EQ(textOfLoneFocus("17"), layOut("17", family("17")));
}

TEST(Layouts, dataSourceIsHeldForTheCallAndReleasedBehindIt) {
    auto manager = std::make_shared<CaseManager>(family("17"));
    const std::weak_ptr<CaseManager> watched = manager;
    EXPECT_EQ(textOfLoneFocus("17"), FamilyViewLayout("17", std::move(manager)));
    EXPECT_TRUE(watched.expired());
}

TEST(Layouts, withoutADataSourceTheTextIsEmpty) {
    EXPECT_EQ("", FamilyViewLayout("17", nullptr));
    EXPECT_EQ("", FamilyViewLayout("0", nullptr));
}

TEST(Layouts, drawIn55By80BoxesWithTheirGaps) {
    const TreeSize size = olvane::familyTreeSize();
    EXPECT_EQ(55.0f, size.nodeWidth);
    EXPECT_EQ(80.0f, size.nodeHeight);
    EXPECT_EQ(25.0f, size.horzPadding);
    EXPECT_EQ(30.0f, size.vertPadding);
    EXPECT_EQ(10.0f, size.spouseLineStep);
    EXPECT_EQ(0.0f, size.lineInset);
}

TEST(Layouts, spouseListedTwiceIsDrawnTwice) {
    CaseFile input = family("17+42; 17+42");
    input.spouses[42] = {17};
    EXPECT_EQ(
        "17:27:0:0:82,45,107,45|82,35,227,35|55,-15,55,-15|55,0,55,-15|;"
        "-1:-12:-110:0:55,-70,55,-15|42,-70,67,-70|:M:17;-2:67:-110:0::F:17;"
        "42:107:0:0:;42:227:0:0:;",
        layOut("17", input));
}

TEST(Layouts, idsOfRelativesAbove32BitsAreDrawnCut) {
    CaseFile input = family("17+42: 5; 3+4: 17");
    const std::string whole = layOut("17", input);
    constexpr support::PersonId kAbove = 0x500000000;
    input.spouses[17] = {kAbove + 42};
    input.spouses[42] = {kAbove + 17};
    input.children[17] = {kAbove + 5};
    input.children[42] = {kAbove * 3 + 5};
    input.children[3] = {kAbove + 17};
    input.fathers[5] = kAbove + 17;
    input.mothers[5] = kAbove + 42;
    input.fathers[17] = kAbove + 3;
    input.mothers[17] = kAbove + 4;
    EXPECT_EQ(whole, layOut("17", input));
}

TEST(Layouts, spouseOfAnIdBelowOneEndsTheLayoutWithNothingWritten) {
    CaseFile input = family("17");
    input.spouses[17] = {-5};
    EXPECT_EQ("", layOut("17", input));
}

// --- Hosts that fail.

// All questions come before the first record, so that nothing is written yet, whichever of them fails.
void expectEmptyTextWhicheverCallFails(const CaseFile& input) {
    Request unhurt(input);
    const std::string whole = FamilyViewLayout("17", unhurt.source);
    const Calls calls = unhurt.newCalls();
    ASSERT_NE("", whole);
    ASSERT_LT(60u, calls.size());
    for (std::size_t n = 0; n < calls.size(); ++n) {
        Request request(failingAt(input, calls, n));
        EXPECT_EQ("", FamilyViewLayout("17", request.source)) << "call " << n << ": " << calls[n];
        EXPECT_EQ(Calls(calls.begin(), calls.begin() + static_cast<std::ptrdiff_t>(n) + 1),
                  request.newCalls());
        EXPECT_EQ(2, request.source.use_count());  // the request's own two references
        ASSERT_EQ(whole, layOut("17", input)) << "behind a failure of call " << n;
    }
}

TEST(FailingHost, leavesTheEmptyTextAtEveryCallAndIsNotAskedAgain) {
    expectEmptyTextWhicheverCallFails(family("17+42: 5; 3+4: 17"));
}

TEST(FailingHost, leavesTheEmptyTextAtEveryCallOfAFamilyWithUnknownParentsAndRemarriages) {
    CaseFile input =
        family("17+42: 5 6f; 17+43: 7; 42f: 8; 3+4: 17 18 19f; 3: 20; 4f: 21; 1+2: 3 22; 5+50: 51");
    input.births[17] = "1850";
    expectEmptyTextWhicheverCallFails(input);
}

// The same for a case of any view: its calls up to the one that fails, no text, and the next request is whole.
void expectNoTextWhicheverCallFails(const CaseFile& input) {
    const Calls whole = support::runCase(input, false, true);
    ASSERT_NE("text ", whole.front());
    ASSERT_LT(15u, whole.size());
    Calls calls;
    for (std::size_t i = 1; i < whole.size(); ++i)
        calls.push_back(whole[i].substr(std::string("call ").size()));
    for (std::size_t n = 0; n < calls.size(); ++n) {
        Calls expected(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(n) + 2);
        expected.front() = "text ";
        EXPECT_EQ(expected, support::runCase(failingAt(input, calls, n), false, true)) << "call " << n;
        ASSERT_EQ(whole, support::runCase(input, false, true)) << "behind a failure of call " << n;
    }
}

TEST(FailingHost, leavesTheEmptyTextAtEveryCallOfGoldenCasesOfBothViews) {
    int pedigrees = 0;
    for (const unit::DisturbedRequest& request : unit::disturbedRequests()) {
        SCOPED_TRACE(request.name);
        expectNoTextWhicheverCallFails(request.input);
        pedigrees += request.input.view == support::CaseView::pedigree ? 1 : 0;
    }
    EXPECT_LT(1, pedigrees);
}

// Throws what is not even a standard exception.
class HostThatThrowsANumber : public CaseManager {
public:
    using CaseManager::CaseManager;
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t) override { throw 42; }
};

TEST(FailingHost, mayThrowAnythingAtAll) {
    EXPECT_EQ("", FamilyViewLayout("17", std::make_shared<HostThatThrowsANumber>(family("17"))));
}

// A walk that writes a person's record and then asks the host about the person.
TEST(FailingHost, duringTheWalkLeavesTheRecordsAlreadyWritten) {
    CaseFile input = family("17+42: 5; 3+4: 17");
    input.failures[support::HostOperation::isPersonDead] = {10};
    Request request(input);
    std::string text;
    int asked = 0;
    olvane::guarded([&] {
        DataAdapter adapter = request.callbacks.dataAdapter();
        SharedTreeViewer::TreeViewFamilyLayouter layouter(&adapter, request.key(17), 1, {},
                                                          olvane::familyTreeSize());
        layouter.layoutForFocusNID();  // the first eight questions whether somebody is dead
        olvane::ResultBounds bounds;
        const TreeViewPerson::Visitor write = olvane::resultWriter(request.glue, bounds, text);
        layouter.graphIterator([&](TreeViewPerson& person) {
            write(person);
            ++asked;
            request.source->isPersonDead(person.personId);
        });
    });
    EXPECT_EQ(2, asked);
    EXPECT_EQ(
        "17:27:0:0:82,40,107,40|55,-15,55,-15|55,0,55,-15|;"
        "3:-12:-110:0:55,-70,55,-15|42,-70,67,-70|15,-125,-25,-125|15,-110,15,-125|;",
        text);
}

TEST(Guard, swallowsWhateverTheWorkThrowsAndKeepsWhatWasDone) {
    std::string text;
    EXPECT_NO_THROW(olvane::guarded([&] {
        text += "done";
        throw 42;
    }));
    EXPECT_EQ("done", text);
}

}  // namespace
