// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Counts references by hand.

#import <olvane/foundation/OlvanePicture.h>

#import "PictureOptionsInternal.h"
#import "Raised.h"
#import "Texts.h"

#include <cstddef>
#include <memory>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <olvane/charts/CheckedPicture.h>
#include <olvane/picture/PictureJson.h>

#include "ViewOptions.h"

NSString* const OlvaneErrorDomain = @"olvane";
NSString* const OlvaneErrorOperationKey = @"OlvaneErrorOperation";
NSString* const OlvaneErrorPersonKey = @"OlvaneErrorPerson";
NSString* const OlvaneErrorCauseKey = @"OlvaneErrorCause";

namespace {

namespace charts = olvane::charts;
namespace picture = olvane::picture;
typedef id<OlvaneViewerManagerWrapProtocol> Source;

// What an OlvanePicture holds.
struct Arrays {
    picture::Picture picture;
    charts::Direction direction = charts::Direction::down;
    bool mirrored = false;
    std::vector<OlvaneBox> boxes;
    std::vector<OlvaneFamily> families;
    std::vector<OlvaneLine> lines;
    std::vector<OlvaneMark> marks;
    std::vector<OlvaneArc> arcs;
    std::vector<OlvaneFoldedBranch> folded;
};

// Asks the source. What it raises becomes an exception of C++, thrown outside of the handler.
template <class Call>
auto ask(const Call& call) {
    struct Context {
        const Call& call;
        decltype(call()) answer;
    } context{call, {}};
    const auto run = [](void* opaque) {
        Context& asked = *static_cast<Context*>(opaque);
        asked.answer = asked.call();
    };
    NSException* raised = olvaneRaisedBy(run, &context);
    if (raised) throw std::runtime_error(olvaneUtf8Of([raised name]) + ": " + olvaneUtf8Of([raised reason]));
    return std::move(context.answer);
}

std::vector<std::int64_t> idsOf(NSArray* list) {
    std::vector<std::int64_t> ids;
    for (NSUInteger i = 0; i < [list count]; ++i) ids.push_back([[list objectAtIndex:i] integerValue]);
    return ids;
}

class FoundationSource final : public OlvaneViewerManagerWrapProtocol {
public:
    explicit FoundationSource(Source source) : source_(source) { [(id)source_ retain]; }
    ~FoundationSource() override { [(id)source_ release]; }
    FoundationSource(const FoundationSource&) = delete;
    FoundationSource& operator=(const FoundationSource&) = delete;

    std::int64_t fatherForPersonWithID(std::int64_t person) override {
        const Source source = source_;
        return ask([&]() -> std::int64_t { return [source fatherForPersonWithID:person]; });
    }
    std::int64_t motherForPersonWithID(std::int64_t person) override {
        const Source source = source_;
        return ask([&]() -> std::int64_t { return [source motherForPersonWithID:person]; });
    }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t person) override {
        const Source source = source_;
        return ask([&] { return idsOf([source spousesForPersonWithID:person]); });
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t person) override {
        const Source source = source_;
        return ask([&] { return idsOf([source childrenForPersonWithID:person]); });
    }
    bool isPreferredSpouse(std::int64_t person, std::int64_t spouse) override {
        const Source source = source_;
        return ask([&] { return [source isPreferredSpouse:person ofPerson:spouse] != 0; });
    }
    bool isPersonDead(std::int64_t person) override {
        const Source source = source_;
        return ask([&] { return [source isPersonDead:person] != 0; });
    }
    std::string dateForPersonWithID(std::int64_t person, bool isBirth) override {
        const Source source = source_;
        typedef std::pair<bool, std::string> Answer;
        Answer answer = ask([&] {
            NSString* date = [source dateForPersonWithID:person isBirth:isBirth];
            return Answer(date != nil, olvaneUtf8Of(date));
        });
        if (!answer.first) throw std::runtime_error("answered nil");
        return std::move(answer.second);
    }
    std::int32_t sexOfPersonWithID(std::int64_t person) override {
        const Source source = source_;
        return ask([&]() -> std::int32_t { return [source sexOfPersonWithID:person]; });
    }

private:
    Source source_;
};

OlvaneBox boxOf(const picture::Box& box) {
    return {box.id,
            box.x,
            box.y,
            box.width,
            box.height,
            static_cast<int32_t>(box.kind),
            static_cast<int32_t>(box.sex),
            box.childOf,
            box.repeat,
            box.hiddenParents,
            box.hiddenPartners,
            box.hiddenChildren,
            box.furtherParents,
            static_cast<BOOL>(box.flag ? YES : NO)};
}

OlvaneLine lineOf(const picture::Line& line) {
    return {line.x1,    line.y1,          line.x2,         line.y2, static_cast<int32_t>(line.role),
            line.child, line.firstBridge, line.bridgeCount};
}

std::unique_ptr<Arrays> arraysOf(picture::Picture made, const charts::ChartRequest& chart) {
    auto arrays = std::make_unique<Arrays>();
    arrays->direction = chart.direction;
    arrays->mirrored = chart.mirrored;
    for (const picture::Box& box : made.boxes) arrays->boxes.push_back(boxOf(box));
    for (const picture::Family& family : made.families) {
        arrays->families.push_back(
            {family.firstMember, family.parentCount, family.childCount, family.firstLine, family.lineCount});
    }
    for (const picture::Line& line : made.lines) arrays->lines.push_back(lineOf(line));
    for (const picture::Mark& mark : made.marks) {
        arrays->marks.push_back(
            {static_cast<int32_t>(mark.kind), mark.number, {mark.boxes[0], mark.boxes[1], mark.boxes[2]}});
    }
    for (const picture::Arc& arc : made.arcs) arrays->arcs.push_back({arc.from, arc.to, arc.ring, arc.line});
    for (const picture::FoldedBranch& folded : made.folded) {
        arrays->folded.push_back({folded.box, folded.count, static_cast<int32_t>(folded.branch),
                                  static_cast<int32_t>(folded.side)});
    }
    arrays->picture = std::move(made);
    return arrays;
}

NSString* selectorOf(olvane::HostOperation operation) {
    if (operation == olvane::HostOperation::isPreferredSpouse) return @"isPreferredSpouse:ofPerson:";
    if (operation == olvane::HostOperation::date) return @"dateForPersonWithID:isBirth:";
    return [olvaneTextOf(nameOf(operation)) stringByAppendingString:@":"];
}

NSInteger codeOf(olvane::CheckedStatus status) {
    switch (status) {
        case olvane::CheckedStatus::invalidArgument:
            return OlvaneErrorInvalidArgument;
        case olvane::CheckedStatus::invalidPerson:
            return OlvaneErrorInvalidPerson;
        case olvane::CheckedStatus::hostFailed:
            return OlvaneErrorHostFailed;
        case olvane::CheckedStatus::invalidId:
            return OlvaneErrorInvalidId;
        case olvane::CheckedStatus::outOfMemory:
            return OlvaneErrorOutOfMemory;
        case olvane::CheckedStatus::nestedCall:
            return OlvaneErrorNestedCall;
        case olvane::CheckedStatus::ok:
        case olvane::CheckedStatus::layoutFailed:
            break;
    }
    return OlvaneErrorLayoutFailed;
}

NSError* errorOf(const olvane::CheckedOutcome& outcome) {
    const olvane::FailureReason& reason = outcome.reason;
    const bool lacksMemory = outcome.status == olvane::CheckedStatus::outOfMemory;
    NSString* cause = lacksMemory ? @"there is not enough memory" : olvaneTextOf(reason.cause);
    NSString* description = cause;
    NSMutableDictionary* info = [NSMutableDictionary dictionary];
    if (reason.person != 0) {
        [info setObject:[NSNumber numberWithLongLong:reason.person] forKey:OlvaneErrorPersonKey];
    }
    if (reason.operation != olvane::HostOperation::none) {
        NSString* selector = selectorOf(reason.operation);
        [info setObject:selector forKey:OlvaneErrorOperationKey];
        description = [NSString stringWithFormat:@"%@ for person %lld: %@", selector,
                                                 static_cast<long long>(reason.person), cause];
    }
    [info setObject:cause forKey:OlvaneErrorCauseKey];
    [info setObject:description forKey:NSLocalizedDescriptionKey];
    return [NSError errorWithDomain:OlvaneErrorDomain code:codeOf(outcome.status) userInfo:info];
}

// Whether a chart can keep the places of an earlier picture.
bool isLike(const Arrays& earlier, const charts::ChartRequest& chart) {
    return earlier.direction == chart.direction && earlier.mirrored == chart.mirrored &&
           earlier.picture.view == "everybody";
}

// The arrays of a picture, or null with the outcome. No exception of C++ passes. earlier: of the picture whose places are
// kept, or null.
std::unique_ptr<Arrays> made(Source source, int64_t focus, OlvanePictureOptions* options,
                             const Arrays* earlier, olvane::CheckedOutcome& outcome) {
    const olvane_picture_options& asked = *[options options];
    try {
        olvane::c::AskedView view(asked);
        charts::ChartRequest& chart = view.request.chart;
        if (earlier && isLike(*earlier, chart)) chart.earlier = &earlier->picture;
        std::shared_ptr<FoundationSource> host;
        if (source) host = std::make_shared<FoundationSource>(source);
        charts::CheckedPicture result = charts::checkedPicture(host, focus, view.request, asked.other);
        outcome = result;
        if (result.isOk()) return arraysOf(std::move(result.picture), chart);
    } catch (...) {
        outcome.status = olvane::CheckedStatus::outOfMemory;  // nothing else can fail here
    }
    return nullptr;
}

// Those of a picture that came from a plain init are empty.
const Arrays& arraysIn(const void* held) {
    static const Arrays empty;
    return held ? *static_cast<const Arrays*>(held) : empty;
}

}  // namespace

@implementation OlvanePicture

+ (OlvanePicture*)pictureOfDataSource:(id<OlvaneViewerManagerWrapProtocol>)source
                                focus:(int64_t)personId
                              options:(OlvanePictureOptions*)options
                                error:(NSError**)error {
    olvane::CheckedOutcome outcome;
    OlvanePictureOptions* chosen = options ? options : [OlvanePictureOptions optionsForView:OlvaneViewFamily];
    OlvanePicture* earlier = [[chosen.earlier retain] autorelease];  // the source may set another one
    std::unique_ptr<Arrays> arrays = made(
        source, personId, chosen, earlier ? static_cast<const Arrays*>(earlier->_picture) : nullptr, outcome);
    if (!arrays) {
        if (error) *error = errorOf(outcome);
        return nil;
    }
    OlvanePicture* result = [[[self alloc] init] autorelease];
    result->_picture = arrays.release();
    return result;
}

- (void)dealloc {
    delete static_cast<Arrays*>(_picture);
    [super dealloc];
}

- (const OlvaneBox*)boxes {
    return arraysIn(_picture).boxes.data();
}
- (NSUInteger)boxCount {
    return arraysIn(_picture).boxes.size();
}
- (const OlvaneFamily*)families {
    return arraysIn(_picture).families.data();
}
- (NSUInteger)familyCount {
    return arraysIn(_picture).families.size();
}
- (const int32_t*)members {
    return arraysIn(_picture).picture.members.data();
}
- (NSUInteger)memberCount {
    return arraysIn(_picture).picture.members.size();
}
- (const OlvaneLine*)lines {
    return arraysIn(_picture).lines.data();
}
- (NSUInteger)lineCount {
    return arraysIn(_picture).lines.size();
}
- (const double*)bridges {
    return arraysIn(_picture).picture.bridges.data();
}
- (NSUInteger)bridgeCount {
    return arraysIn(_picture).picture.bridges.size();
}
- (const OlvaneMark*)marks {
    return arraysIn(_picture).marks.data();
}
- (NSUInteger)markCount {
    return arraysIn(_picture).marks.size();
}
- (const OlvaneArc*)arcs {
    return arraysIn(_picture).arcs.data();
}
- (NSUInteger)arcCount {
    return arraysIn(_picture).arcs.size();
}

- (const OlvaneFoldedBranch*)foldedBranches {
    return arraysIn(_picture).folded.data();
}
- (NSUInteger)foldedBranchCount {
    return arraysIn(_picture).folded.size();
}

- (int32_t)focus {
    return arraysIn(_picture).picture.focus;
}
- (int32_t)other {
    return arraysIn(_picture).picture.other;
}

- (NSString*)focusIs {
    return olvaneTextOf(arraysIn(_picture).picture.focusIs);
}
- (NSString*)otherIs {
    return olvaneTextOf(arraysIn(_picture).picture.otherIs);
}

- (NSString*)json {
    return olvaneTextOf(picture::pictureJson(arraysIn(_picture).picture));
}

@end
