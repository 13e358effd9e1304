// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The bridge gives a host on Foundation what the engine gives one in C++, and keeps its exceptions inside.

#import <bindings/foundation/FoundationHosts.h>
#import <olvane/foundation/OlvaneViewerBridge.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

#include <support/CaseRun.h>
#include <support/FamilyMaker.h>
#include <support/FamilyText.h>

// Says whether it still holds a host.
@interface LookingBridge : OlvaneViewerBridge
- (BOOL)hasHost;
@end

@implementation LookingBridge

- (BOOL)hasHost {
    return _manager != nil;
}

@end

// Looks at its bridge when it goes.
@interface PartingHost : CaseFoundationHost {
    LookingBridge* _bridge;  // not held
    BOOL* _bridgeHadHost;
}
- (void)lookAt:(LookingBridge*)bridge into:(BOOL*)bridgeHadHost;
@end

@implementation PartingHost

- (void)lookAt:(LookingBridge*)bridge into:(BOOL*)bridgeHadHost {
    _bridge = bridge;
    _bridgeHadHost = bridgeHadHost;
}

- (void)dealloc {
    *_bridgeHadHost = [_bridge hasHost];
    [super dealloc];
}

@end

namespace {

using support::CaseFile;
using support::family;

const char* const kThreeGenerations = "17+42: 5 6f; 3+4: 17 18; 1+2: 3; 5+8: 9";

class FoundationBridge : public testing::Test {
protected:
    void SetUp() override { pool_ = [[NSAutoreleasePool alloc] init]; }
    void TearDown() override { [pool_ release]; }

    template <class Host>
    Host* hostOf(const CaseFile& input) {
        return [[[Host alloc] initWithCase:input] autorelease];
    }

    std::string valuesOf(id host, std::int64_t personId) {
        OlvaneViewerBridge* bridge = [[[OlvaneViewerBridge alloc] initWithManagerWrap:host] autorelease];
        return [[bridge valuesForPersonId:personId] UTF8String];
    }

    std::string familyOf(const CaseFile& input) {
        return valuesOf(hostOf<CaseFoundationHost>(input), input.focus);
    }

    // Two brothers whose father is not known: the undated child of an unknown father meets the one of the
    // mother.
    std::string textWithBirth(const std::string& date) {
        CaseFile input = family("2f: 17 18");
        input.focus = 17;
        input.births[17] = date;
        return familyOf(input);
    }

private:
    NSAutoreleasePool* pool_ = nil;
};

TEST_F(FoundationBridge, givesTheTextOfTheEngine) {
    const CaseFile input = family(kThreeGenerations);
    EXPECT_EQ(support::layoutText(input), familyOf(input));
    EXPECT_NE(std::string::npos, familyOf(input).find("17:"));
}

TEST_F(FoundationBridge, givesTheTextOfTheEngineForManyFamilies) {
    for (std::uint64_t seed = 1; seed <= 100; ++seed) {
        support::FamilyMaker maker(seed, 25);
        if (seed % 3 == 0) maker.strewOddIds();
        const CaseFile input = maker.any();
        ASSERT_EQ(support::layoutText(input), familyOf(input)) << support::formatCase(input);
    }
}

TEST_F(FoundationBridge, asksTheSameQuestionsAsTheEngine) {
    CaseFile input = family(kThreeGenerations);
    input.births = {{5, "1850"}, {6, "1848"}, {17, "1820"}, {18, "1818"}};
    input.dates = {{4, "1815"}, {42, "1846"}};
    CaseFoundationHost* host = hostOf<CaseFoundationHost>(input);
    ASSERT_EQ(support::layoutText(input), valuesOf(host, 17));
    std::vector<std::string> calls = support::runCase(input, false, true);
    calls.erase(calls.begin());  // the text
    EXPECT_EQ(calls, [host trace]);
    EXPECT_LT(0, std::count(calls.begin(), calls.end(), "call isPreferredSpouse 4 3"));
}

TEST_F(FoundationBridge, readsTheCountOfAListAtEachPlaceAgain) {
    EXPECT_EQ(familyOf(family("17+42: 5 6")),
              valuesOf(hostOf<ShrinkingListHost>(family("17+42: 5 6 7")), 17));
}

// The children of a childless focus are looked at once; the wife's questions stand between the looks at her list.
TEST_F(FoundationBridge, readsAListEntryByEntryWithTheQuestionsBetween) {
    WatchedListHost* host = hostOf<WatchedListHost>(family("17+42: 5 6"));
    std::vector<std::string> looks;
    [host writeLooksTo:&looks];
    valuesOf(host, 17);
    const auto standsTogether = [&looks](const std::vector<std::string>& wanted) {
        return std::search(looks.begin(), looks.end(), wanted.begin(), wanted.end()) != looks.end();
    };
    EXPECT_TRUE(standsTogether({"count", "entry 42", "preferred 42", "dead 42", "date 42", "count"}));
    EXPECT_TRUE(standsTogether({"count", "entry 5", "date 5", "count", "entry 6", "date 6", "count"}));
}

TEST_F(FoundationBridge, readsAListThatGrowsWhileAnEntryIsAskedAboutToItsEnd) {
    CaseFile grown = family("17+42: 5 6");
    CaseFile input = grown;
    input.children[17] = {5};
    EXPECT_EQ(familyOf(grown), valuesOf(hostOf<GrowingListHost>(input), 17));
}

TEST_F(FoundationBridge, leavesAHostsAnswersToThePoolOfTheCaller) {
    BareListHost* host = hostOf<BareListHost>(family(kThreeGenerations));
    OlvaneViewerBridge* bridge = [[[OlvaneViewerBridge alloc] initWithManagerWrap:host] autorelease];
    const int before = [BareListHost listsAlive];
    NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
    EXPECT_LT(0u, [[bridge valuesForPersonId:17] length]);
    EXPECT_LT(before, [BareListHost listsAlive]);
    [pool release];
    EXPECT_EQ(before, [BareListHost listsAlive]);
}

TEST_F(FoundationBridge, takesANilListForAnEmptyOne) {
    const CaseFile input = family(kThreeGenerations);
    EXPECT_EQ(familyOf(input), valuesOf(hostOf<NilListHost>(input), 17));
}

TEST_F(FoundationBridge, readsListsByCountObjectAtIndexAndIntegerValueAlone) {
    const CaseFile input = family(kThreeGenerations);
    EXPECT_EQ(familyOf(input), valuesOf(hostOf<BareListHost>(input), 17));
}

TEST_F(FoundationBridge, endsALayoutWhereTheHostRaises) {
    for (std::size_t i = 0; i < support::kHostOperationCount; ++i) {
        for (const std::int64_t nth : {1, 3}) {
            CaseFile input = family(kThreeGenerations);
            input.failures[static_cast<support::HostOperation>(i)].insert(nth);
            EXPECT_EQ(support::layoutText(input), familyOf(input)) << i;
        }
    }
    EXPECT_NE("", familyOf(family(kThreeGenerations)));
}

TEST_F(FoundationBridge, endsALayoutWhereAListRaises) {
    EXPECT_EQ("", valuesOf(hostOf<RaisingListHost>(family("17+42: 5")), 17));
    EXPECT_EQ(familyOf(family("17+42")), valuesOf(hostOf<RaisingListHost>(family("17+42")), 17));
}

TEST_F(FoundationBridge, endsALayoutWhereAListHoldsNoNumber) {
    EXPECT_EQ("", valuesOf(hostOf<NullListHost>(family("17+42: 5")), 17));
    EXPECT_EQ(familyOf(family("17+42")), valuesOf(hostOf<NullListHost>(family("17+42")), 17));
}

TEST_F(FoundationBridge, endsALayoutWhereTheHostThrowsAnyObject) {
    EXPECT_EQ("", valuesOf(hostOf<ThrowingHost>(family("17+42")), 17));
}

TEST_F(FoundationBridge, takesNoHostForOneThatAnswers0) {
    CaseFile input;
    input.focus = 17;
    input.fathers[17] = 0;
    input.mothers[17] = 0;
    EXPECT_EQ(familyOf(input), valuesOf(nil, 17));
    EXPECT_NE(std::string::npos, valuesOf(nil, 17).find(";0:"));
}

TEST_F(FoundationBridge, endsALayoutAtANilDate) {
    EXPECT_EQ("", valuesOf(hostOf<NilDateHost>(family("17+42")), 17));
    EXPECT_NE("", valuesOf(hostOf<NilDateHost>(family("17")), 17));
}

TEST_F(FoundationBridge, distinguishesAnEmptyDateFromAnyOther) {
    const std::string dated = textWithBirth("1850");
    EXPECT_NE(dated, textWithBirth(""));
    EXPECT_EQ(dated, textWithBirth("2"));
    EXPECT_EQ(dated, textWithBirth("\u00E9t\u00E9 1850"));
    EXPECT_EQ(dated, textWithBirth("\u4E01 1850"));
    EXPECT_EQ(dated, textWithBirth("\u5F01 1850"));
}

TEST_F(FoundationBridge, takesADateForEmptyWhoseFirstCharacterEndsInAZeroByte) {
    EXPECT_EQ(textWithBirth(""), textWithBirth("\u0100 1850"));
    EXPECT_EQ(textWithBirth(""), textWithBirth("\u4E00 1850"));
    EXPECT_NE(textWithBirth(""), textWithBirth("\u00E9t\u00E9 1850"));
}

TEST_F(FoundationBridge, countsTheLow32BitsOfAnId) {
    const CaseFile input = family(kThreeGenerations);
    CaseFoundationHost* host = hostOf<CaseFoundationHost>(input);
    EXPECT_EQ(familyOf(input), valuesOf(host, 17 + (std::int64_t{3} << 32)));
    EXPECT_EQ("", valuesOf(host, 0));
    EXPECT_EQ("", valuesOf(host, -17));
}

TEST_F(FoundationBridge, holdsItsHostAsLongAsItLives) {
    CaseFoundationHost* host = [[CaseFoundationHost alloc] initWithCase:family("17")];
    OlvaneViewerBridge* bridge = [[OlvaneViewerBridge alloc] initWithManagerWrap:host];
    [host release];
    EXPECT_EQ(1, [CaseFoundationHost alive]);
    NSString* text = [bridge valuesForPersonId:17];
    [bridge release];
    EXPECT_EQ(0, [CaseFoundationHost alive]);
    EXPECT_TRUE([text hasPrefix:@"17:27:0:0:"]);
}

// The bridge holds the only reference to the host, and goes in the first question for children.
TEST_F(FoundationBridge, holdsTheHostToTheEndOfACallThatReleasesTheBridge) {
    const CaseFile input = family(kThreeGenerations);
    ReleasingHost* host = [[ReleasingHost alloc] initWithCase:input];
    OlvaneViewerBridge* bridge = [[OlvaneViewerBridge alloc] initWithManagerWrap:host];
    [host setBridge:bridge];
    [host release];
    NSString* text = [bridge valuesForPersonId:17];
    EXPECT_EQ(0, [ReleasingHost alive]);
    EXPECT_EQ(familyOf(input), [text UTF8String]);
}

TEST_F(FoundationBridge, aSecondInitLetsTheFirstHostGo) {
    CaseFoundationHost* first = [[CaseFoundationHost alloc] initWithCase:family("17")];
    CaseFoundationHost* second = [[CaseFoundationHost alloc] initWithCase:family("17+42")];
    OlvaneViewerBridge* bridge = [[OlvaneViewerBridge alloc] initWithManagerWrap:first];
    [first release];
    bridge = [bridge initWithManagerWrap:second];
    EXPECT_EQ(1, [CaseFoundationHost alive]);
    bridge = [bridge initWithManagerWrap:second];
    [second release];
    EXPECT_EQ(1, [CaseFoundationHost alive]);
    const std::string text = [[bridge valuesForPersonId:17] UTF8String];
    EXPECT_EQ(familyOf(family("17+42")), text);
    [bridge release];
}

TEST_F(FoundationBridge, holdsNoHostAnyMoreWhenItLetsItGo) {
    PartingHost* host = [[PartingHost alloc] initWithCase:family("17")];
    LookingBridge* bridge = [[LookingBridge alloc] initWithManagerWrap:host];
    BOOL bridgeHadHost = YES;
    [host lookAt:bridge into:&bridgeHadHost];
    [host release];
    [bridge release];
    EXPECT_EQ(NO, bridgeHadHost);
}

}  // namespace
