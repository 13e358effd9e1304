// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A host on Foundation gets the picture that one in C++ gets, or an error that says what failed.

#import <bindings/foundation/FoundationHosts.h>
#import <olvane/foundation/OlvanePicture.h>
#import <olvane/foundation/OlvaneViewerBridge.h>

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <stdexcept>
#include <string>

#include <olvane/charts/Views.h>
#include <olvane/picture/PictureJson.h>
#include <support/CaseRun.h>
#include <support/FamilyText.h>

// Answers a number that is no id where it is asked for the father of 42.
@interface WrongFatherHost : CaseFoundationHost
@end

@implementation WrongFatherHost

- (int64_t)fatherForPersonWithID:(int64_t)personId {
    return personId == 42 ? (INT64_C(1) << 32) + 4 : [super fatherForPersonWithID:personId];
}

@end

// Raises where it is asked for children.
@interface ClosedHost : CaseFoundationHost
@end

@implementation ClosedHost

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    (void)personId;
    [NSException raise:NSGenericException format:@"the database is closed"];
    return nil;
}

@end

// Throws an exception of C++ where it is asked for children.
@interface CxxThrowingHost : CaseFoundationHost
@end

@implementation CxxThrowingHost

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    (void)personId;
    throw std::runtime_error("the database is closed");
}

@end

// Asks for a picture and for a text of its own when it is asked for children.
@interface NestingHost : CaseFoundationHost {
    NSInteger _innerCode;
    NSUInteger _innerLength;
}
- (NSInteger)innerCode;
- (NSUInteger)innerLength;
@end

@implementation NestingHost

- (NSInteger)innerCode {
    return _innerCode;
}

- (NSUInteger)innerLength {
    return _innerLength;
}

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    if (_innerCode == 0) {
        NSError* error = nil;
        _innerCode = -1;
        [OlvanePicture pictureOfDataSource:self focus:17 options:nil error:&error];
        _innerCode = [error code];
        OlvaneViewerBridge* bridge = [[[OlvaneViewerBridge alloc] initWithManagerWrap:self] autorelease];
        _innerLength = [[bridge valuesForPersonId:17] length];
    }
    return [super childrenForPersonWithID:personId];
}

@end

namespace {

namespace charts = olvane::charts;
using support::CaseFile;
using support::family;

const char* const kThreeGenerations = "17+42: 5 6f; 3+4: 17 18; 1+2: 3; 5+8: 9";

class FoundationPicture : public testing::Test {
protected:
    void SetUp() override { pool_ = [[NSAutoreleasePool alloc] init]; }
    void TearDown() override { [pool_ release]; }

    template <class Host>
    Host* hostOf(const CaseFile& input) {
        return [[[Host alloc] initWithCase:input] autorelease];
    }

    // The error of the family view around 17.
    NSError* errorOf(id host, OlvanePictureOptions* options = nil, std::int64_t focus = 17) {
        NSError* error = nil;
        OlvanePicture* picture = [OlvanePicture pictureOfDataSource:host
                                                              focus:focus
                                                            options:options
                                                              error:&error];
        EXPECT_TRUE(picture == nil);
        EXPECT_TRUE([[error domain] isEqual:OlvaneErrorDomain]);
        return error;
    }

    std::string descriptionOf(NSError* error) { return [[error localizedDescription] UTF8String]; }

private:
    NSAutoreleasePool* pool_ = nil;
};

TEST_F(FoundationPicture, leavesFoldedBranchesOutAndCountsThem) {
    const CaseFile input = family(kThreeGenerations);
    OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:OlvaneViewHourglass];
    [options foldBranch:OlvaneBranchDown ofPerson:5];
    [options foldBranch:OlvaneBranchUp ofPerson:17];
    [options unfoldBranch:OlvaneBranchDown ofPerson:5];
    ASSERT_EQ(1U, [options foldedCount]);
    EXPECT_EQ(17, [options folded][0].personId);
    OlvanePicture* picture = [OlvanePicture pictureOfDataSource:hostOf<CaseFoundationHost>(input)
                                                          focus:17
                                                        options:options
                                                          error:NULL];
    ASSERT_TRUE(picture != nil);
    const charts::Fold fold{17, olvane::picture::Branch::up};
    charts::ViewRequest request;
    request.chart.view = charts::View::hourglass;
    request.chart.folded = {&fold, 1};
    const auto expected = charts::pictureOfHost(std::make_shared<support::CaseManager>(input), 17, request);
    EXPECT_EQ(olvane::picture::pictureJson(expected), [[picture json] UTF8String]);
    // His father, mother and one grandparent on each side of the father.
    ASSERT_EQ(1U, [picture foldedBranchCount]);
    const OlvaneFoldedBranch& folded = [picture foldedBranches][0];
    EXPECT_EQ([picture focus], folded.box);
    EXPECT_EQ(4, folded.count);
    EXPECT_EQ(OlvaneBranchUp, folded.branch);
    EXPECT_EQ(0, folded.side);
}

TEST_F(FoundationPicture, hasBoxesOfTheirOwnSizes) {
    const CaseFile input = family(kThreeGenerations);
    OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:OlvaneViewHourglass];
    [options setBoxWidth:30 height:20 ofPerson:17];
    [options setBoxWidth:120 height:40 ofPerson:17];
    options.aspect = 0.2;
    ASSERT_EQ(2U, [options boxSizeCount]);
    EXPECT_EQ(40, [options boxSizes][1].height);
    OlvanePicture* picture = [OlvanePicture pictureOfDataSource:hostOf<CaseFoundationHost>(input)
                                                          focus:17
                                                        options:options
                                                          error:NULL];
    ASSERT_TRUE(picture != nil);
    const charts::SizedBox sized{17, {120, 40}};
    charts::ViewRequest request;
    request.chart.view = charts::View::hourglass;
    request.chart.sizedBoxes = {&sized, 1};
    request.chart.aspect = 0.2;
    const auto expected = charts::pictureOfHost(std::make_shared<support::CaseManager>(input), 17, request);
    EXPECT_EQ(olvane::picture::pictureJson(expected), [[picture json] UTF8String]);
    EXPECT_EQ(120, expected.boxes.front().width);
}

TEST_F(FoundationPicture, refusesSizesOfBoxesThatAreNone) {
    OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:OlvaneViewHourglass];
    [options setBoxWidth:-1 height:40 ofPerson:17];
    NSError* error = errorOf(hostOf<CaseFoundationHost>(family(kThreeGenerations)), options);
    EXPECT_EQ(OlvaneErrorInvalidArgument, [error code]);
    EXPECT_NE(descriptionOf(error).find("size"), std::string::npos) << descriptionOf(error);
}

TEST_F(FoundationPicture, refusesABranchThatIsNone) {
    OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:OlvaneViewHourglass];
    [options foldBranch:3 ofPerson:17];
    NSError* error = errorOf(hostOf<CaseFoundationHost>(family(kThreeGenerations)), options);
    EXPECT_EQ(OlvaneErrorInvalidArgument, [error code]);
    EXPECT_NE(descriptionOf(error).find("branch"), std::string::npos) << descriptionOf(error);
}

TEST_F(FoundationPicture, isThatOfAHostInCxxInEveryView) {
    const CaseFile input = family(kThreeGenerations);
    for (int view = OlvaneViewFamily; view <= OlvaneViewEverybody; ++view) {
        OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:view];
        options.other = 9;
        NSError* error = nil;
        OlvanePicture* picture = [OlvanePicture pictureOfDataSource:hostOf<CaseFoundationHost>(input)
                                                              focus:17
                                                            options:options
                                                              error:&error];
        ASSERT_TRUE(picture != nil) << view << ": " << descriptionOf(error);
        EXPECT_TRUE(error == nil);
        charts::ViewRequest request;
        request.chart.view = static_cast<charts::View>(view);
        request.chart.effort = 1;
        const auto expected =
            charts::pictureOfHost(std::make_shared<support::CaseManager>(input), 17, request, 9);
        EXPECT_EQ(olvane::picture::pictureJson(expected), [[picture json] UTF8String]) << view;
        EXPECT_EQ(expected.boxes.size(), [picture boxCount]);
        EXPECT_EQ(expected.lines.size(), [picture lineCount]);
        EXPECT_EQ(expected.arcs.size(), [picture arcCount]);
        const int32_t focus = [picture focus];
        EXPECT_EQ(17, [picture boxes][focus].personId);
    }
}

// The couple 17 and 42 with the child 5: three boxes of 40 by 20 and one family.
TEST_F(FoundationPicture, hasBoxesFamiliesAndLinesAsRecords) {
    OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:OlvaneViewDescendants];
    options.boxWidth = 40;
    options.boxHeight = 20;
    OlvanePicture* picture = [OlvanePicture pictureOfDataSource:hostOf<CaseFoundationHost>(family("17+42: 5"))
                                                          focus:17
                                                        options:options
                                                          error:NULL];
    ASSERT_EQ(3u, [picture boxCount]);
    EXPECT_EQ(40, [picture boxes][0].width);
    EXPECT_EQ(20, [picture boxes][0].height);
    ASSERT_EQ(1u, [picture familyCount]);
    const OlvaneFamily couple = [picture families][0];
    ASSERT_EQ(2u, couple.parentCount);
    ASSERT_EQ(1u, couple.childCount);
    const int32_t* members = [picture members] + couple.firstMember;
    EXPECT_EQ(17, [picture boxes][members[0]].personId);
    EXPECT_EQ(42, [picture boxes][members[1]].personId);
    EXPECT_EQ(5, [picture boxes][members[2]].personId);
    EXPECT_EQ(couple.lineCount, [picture lineCount]);
    EXPECT_LT(0u, [picture lineCount]);
}

// The same records as the picture in C++ has them, of every view, with marks, bridges, arcs and words among them.
TEST_F(FoundationPicture, hasEveryRecordOfThePictureInCxx) {
    // 4 has two families of parents, and cousins marry.
    const CaseFile input = family("1+2: 3 4; 5+6: 4; 3+7: 8 9f; 4+10f: 11f 12; 8+11: 13; 9+12: 14");
    std::size_t marks = 0, arcs = 0, words = 0;
    for (int view = OlvaneViewFamily; view <= OlvaneViewEverybody; ++view) {
        OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:view];
        options.other = 14;
        OlvanePicture* picture = [OlvanePicture pictureOfDataSource:hostOf<CaseFoundationHost>(input)
                                                              focus:13
                                                            options:options
                                                              error:NULL];
        ASSERT_TRUE(picture != nil) << view;
        charts::ViewRequest request;
        request.chart.view = static_cast<charts::View>(view);
        request.chart.effort = 1;
        const auto expected =
            charts::pictureOfHost(std::make_shared<support::CaseManager>(input), 13, request, 14);
        ASSERT_EQ(expected.members.size(), [picture memberCount]);
        ASSERT_EQ(expected.lines.size(), [picture lineCount]);
        for (std::size_t i = 0; i < expected.lines.size(); ++i) {
            const OlvaneLine& line = [picture lines][i];
            EXPECT_EQ(expected.lines[i].x1, line.x1);
            EXPECT_EQ(expected.lines[i].y2, line.y2);
            EXPECT_EQ(static_cast<int>(expected.lines[i].role), static_cast<int>(line.role));
        }
        ASSERT_EQ(expected.bridges.size(), [picture bridgeCount]);
        for (std::size_t i = 0; i < expected.bridges.size(); ++i) {
            EXPECT_EQ(expected.bridges[i], [picture bridges][i]);
        }
        ASSERT_EQ(expected.marks.size(), [picture markCount]);
        for (std::size_t i = 0; i < expected.marks.size(); ++i) {
            const OlvaneMark& mark = [picture marks][i];
            EXPECT_EQ(static_cast<int>(expected.marks[i].kind), static_cast<int>(mark.kind));
            EXPECT_EQ(expected.marks[i].boxes[1], mark.boxes[1]);
        }
        ASSERT_EQ(expected.arcs.size(), [picture arcCount]);
        for (std::size_t i = 0; i < expected.arcs.size(); ++i) {
            EXPECT_EQ(expected.arcs[i].from, [picture arcs][i].from);
        }
        EXPECT_EQ(expected.focusIs, [[picture focusIs] UTF8String]);
        EXPECT_EQ(expected.otherIs, [[picture otherIs] UTF8String]);
        EXPECT_EQ(expected.other, [picture other]);
        marks += expected.marks.size();
        arcs += expected.arcs.size();
        words += expected.otherIs.size();
    }
    EXPECT_LT(0U, marks);
    EXPECT_LT(0U, arcs);
    EXPECT_LT(0U, words);
}

TEST_F(FoundationPicture, takesOptionsAsProperties) {
    const CaseFile input = family(kThreeGenerations);
    OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:OlvaneViewFamily];
    OlvanePicture* all = [OlvanePicture pictureOfDataSource:hostOf<CaseFoundationHost>(input)
                                                      focus:17
                                                    options:options
                                                      error:NULL];
    options.familySiblings = NO;
    options.unknownParents = NO;
    OlvanePicture* few = [OlvanePicture pictureOfDataSource:hostOf<CaseFoundationHost>(input)
                                                      focus:17
                                                    options:options
                                                      error:NULL];
    const auto has = [](OlvanePicture* picture, std::int64_t person, int kind) {
        for (NSUInteger i = 0; i < [picture boxCount]; ++i) {
            const OlvaneBox& box = [picture boxes][i];
            if (box.personId == person && box.kind == kind) return true;
        }
        return false;
    };
    EXPECT_TRUE(has(all, 18, 0));
    EXPECT_TRUE(has(all, 0, 1));
    EXPECT_FALSE(has(few, 18, 0));
    EXPECT_FALSE(has(few, 0, 1));
}

// As C++ does with the same earlier picture; one in another direction is not looked at.
TEST_F(FoundationPicture, ofEverybodyKeepsThePlacesOfAnEarlierOne) {
    const CaseFile input = family("17+42: 5 6; 5+8: 9");
    const CaseFile later = family("17+42: 7 5 6; 5+8: 9");
    charts::ViewRequest request;
    request.chart.view = charts::View::everybody;
    const auto ofHost = [&request](const CaseFile& of) {
        return charts::pictureOfHost(std::make_shared<support::CaseManager>(of), 17, request);
    };
    const olvane::picture::Picture fromScratch = ofHost(later);
    const olvane::picture::Picture before = ofHost(input);
    request.chart.earlier = &before;
    const std::string kept = olvane::picture::pictureJson(ofHost(later));
    ASSERT_NE(olvane::picture::pictureJson(fromScratch), kept);

    OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:OlvaneViewEverybody];
    const auto drawn = [&](const CaseFile& of) {
        return [OlvanePicture pictureOfDataSource:hostOf<CaseFoundationHost>(of)
                                            focus:17
                                          options:options
                                            error:NULL];
    };
    options.earlier = drawn(input);
    EXPECT_EQ(kept, [[drawn(later) json] UTF8String]);
    options.direction = 3;
    NSString* sideways = [drawn(later) json];
    options.earlier = nil;
    EXPECT_TRUE([sideways isEqual:[drawn(later) json]]);
    options.direction = 0;
    EXPECT_EQ(olvane::picture::pictureJson(fromScratch), [[drawn(later) json] UTF8String]);
}

TEST_F(FoundationPicture, namesOperationPersonAndCauseWhereTheHostRaises) {
    NSError* error = errorOf(hostOf<ClosedHost>(family(kThreeGenerations)));
    EXPECT_EQ(OlvaneErrorHostFailed, [error code]);
    EXPECT_TRUE(
        [[[error userInfo] objectForKey:OlvaneErrorOperationKey] isEqual:@"childrenForPersonWithID:"]);
    EXPECT_EQ(17, [[[error userInfo] objectForKey:OlvaneErrorPersonKey] longLongValue]);
    EXPECT_TRUE([[[error userInfo] objectForKey:OlvaneErrorCauseKey]
        isEqual:@"NSGenericException: the database is closed"]);
    EXPECT_EQ("childrenForPersonWithID: for person 17: NSGenericException: the database is closed",
              descriptionOf(error));
}

TEST_F(FoundationPicture, reportsARaiseOfEachOperation) {
    for (std::size_t i = 0; i < support::kHostOperationCount; ++i) {
        CaseFile input = family(kThreeGenerations);
        input.failures[static_cast<support::HostOperation>(i)].insert(1);
        NSError* error = errorOf(hostOf<CaseFoundationHost>(input));
        EXPECT_EQ(OlvaneErrorHostFailed, [error code]) << i;
        const std::string name(support::operationName(static_cast<support::HostOperation>(i)));
        NSString* selector = [[error userInfo] objectForKey:OlvaneErrorOperationKey];
        EXPECT_EQ(0u, std::string([selector UTF8String]).find(name + ":"));
    }
}

TEST_F(FoundationPicture, reportsWhateverElseTheHostThrows) {
    EXPECT_EQ("childrenForPersonWithID: for person 17: an exception without a text",
              descriptionOf(errorOf(hostOf<ThrowingHost>(family("17+42")))));
    EXPECT_EQ("childrenForPersonWithID: for person 17: the database is closed",
              descriptionOf(errorOf(hostOf<CxxThrowingHost>(family("17+42")))));
    EXPECT_EQ(OlvaneErrorHostFailed, [errorOf(hostOf<RaisingListHost>(family("17+42: 5"))) code]);
    EXPECT_EQ(OlvaneErrorHostFailed, [errorOf(hostOf<NullListHost>(family("17+42: 5"))) code]);
    NSError* date = errorOf(hostOf<NilDateHost>(family("17+42")));
    EXPECT_TRUE([[[date userInfo] objectForKey:OlvaneErrorCauseKey] isEqual:@"answered nil"]);
}

TEST_F(FoundationPicture, refusesNumbersThatAreNoIds) {
    NSError* answer = errorOf(hostOf<WrongFatherHost>(family(kThreeGenerations)));
    EXPECT_EQ(OlvaneErrorInvalidId, [answer code]);
    EXPECT_EQ(
        "fatherForPersonWithID: for person 42: answered 4294967300, which is no id: ids are 1 to 2147483647",
        descriptionOf(answer));
    CaseFoundationHost* host = hostOf<CaseFoundationHost>(family(kThreeGenerations));
    EXPECT_EQ(OlvaneErrorInvalidPerson, [errorOf(host, nil, 17 + (std::int64_t{1} << 32)) code]);
}

TEST_F(FoundationPicture, refusesNoSourceAndOptionsOutOfRange) {
    EXPECT_EQ(OlvaneErrorInvalidArgument, [errorOf(nil) code]);
    CaseFoundationHost* host = hostOf<CaseFoundationHost>(family(kThreeGenerations));
    for (const int view : {-1, 10, 256}) {
        NSError* error = errorOf(host, [OlvanePictureOptions optionsForView:view]);
        EXPECT_EQ(OlvaneErrorInvalidArgument, [error code]) << view;
        EXPECT_EQ("view is none of the views", descriptionOf(error));
    }
    EXPECT_TRUE([OlvanePicture pictureOfDataSource:nil focus:17 options:nil error:NULL] == nil);
}

TEST_F(FoundationPicture, refusesANestedCallAndLeavesTheBridgeToAnswer) {
    NestingHost* host = hostOf<NestingHost>(family(kThreeGenerations));
    OlvanePicture* picture = [OlvanePicture pictureOfDataSource:host focus:17 options:nil error:NULL];
    EXPECT_EQ(OlvaneErrorNestedCall, [host innerCode]);
    EXPECT_EQ(support::layoutText(family(kThreeGenerations)).size(), [host innerLength]);
    EXPECT_LT(0u, [picture boxCount]);
}

TEST_F(FoundationPicture, releasesItsSourceAfterTheCall) {
    const int before = [CaseFoundationHost alive];
    NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
    CaseFoundationHost* host = [[CaseFoundationHost alloc] initWithCase:family("17+42: 5")];
    OlvanePicture* picture = [[OlvanePicture pictureOfDataSource:host focus:17 options:nil
                                                           error:NULL] retain];
    [host release];
    [pool release];
    EXPECT_EQ(before, [CaseFoundationHost alive]);
    EXPECT_LT(0u, [picture boxCount]);
    [picture release];
}

}  // namespace
