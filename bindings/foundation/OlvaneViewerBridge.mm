// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Foundation's values in, the engine's out, and back. Nothing is decided here, and nothing is caught here
// either: an exception of the host passes through the engine, whose one guard catches those of both
// languages. (With GCC's runtime an @catch in a file of Objective-C++ would crash instead.)
//
// Counts references by hand.

#import <olvane/foundation/OlvaneViewerBridge.h>

#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/HostText.h>

namespace {

typedef id<OlvaneViewerManagerWrapProtocol> Host;

// The list is asked for its count at each place anew, so one that changes while it is read is read to its
// present end. All entries are read before the first question about one of them, since the engine takes a list
// as a whole: a host must not change a list when it is asked for a date.
std::vector<std::int64_t> idsOf(NSArray* list) {
    std::vector<std::int64_t> ids;
    for (NSUInteger i = 0; i < [list count]; ++i) ids.push_back([[list objectAtIndex:i] integerValue]);
    return ids;
}

// The bytes of the 16-bit form up to the first zero byte, which ends a date of ASCII characters behind its
// first one. Deliberately narrow: longer texts would tell records apart that have been one in every chart so
// far. A first character whose low byte is zero, such as U+4E00, makes an empty date.
//
// The engine cuts these bytes again, to what it takes for their first character in UTF-8. That changes no
// layout: dates are compared only where one of the two records is of an add-node's child, and its date is empty.
// So all that counts is whether there are any bytes.
std::string narrowDate(NSString* date) {
    const char* bytes = [date cStringUsingEncoding:NSUnicodeStringEncoding];
    if (!bytes) throw std::invalid_argument("no date");
    return bytes;
}

class FoundationManager final : public OlvaneViewerManagerWrapProtocol {
public:
    explicit FoundationManager(Host host) : host_(host) {}

    std::int64_t fatherForPersonWithID(std::int64_t personId) override {
        return [host_ fatherForPersonWithID:personId];
    }
    std::int64_t motherForPersonWithID(std::int64_t personId) override {
        return [host_ motherForPersonWithID:personId];
    }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override {
        return idsOf([host_ spousesForPersonWithID:personId]);
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override {
        return idsOf([host_ childrenForPersonWithID:personId]);
    }
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override {
        return [host_ isPreferredSpouse:personId ofPerson:spouseId] != 0;
    }
    bool isPersonDead(std::int64_t personId) override { return [host_ isPersonDead:personId] != 0; }
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override {
        return narrowDate([host_ dateForPersonWithID:personId isBirth:isBirth]);
    }
    std::int32_t sexOfPersonWithID(std::int64_t personId) override {
        return [host_ sexOfPersonWithID:personId];
    }

private:
    Host host_;  // not owned: the bridge holds it for longer than a layout takes
};

// What the host's answers leave behind goes when the layout ends, not when the caller's pool does.
class AnswerPool {
public:
    AnswerPool() : pool_([[NSAutoreleasePool alloc] init]) {}
    ~AnswerPool() { [pool_ release]; }
    AnswerPool(const AnswerPool&) = delete;
    AnswerPool& operator=(const AnswerPool&) = delete;

private:
    NSAutoreleasePool* pool_;
};

std::string familyText(int64_t personId, Host host) {
    const AnswerPool pool;
    const auto lowBits = static_cast<std::uint32_t>(static_cast<std::uint64_t>(personId));
    return FamilyViewLayout(intToString(static_cast<int>(lowBits)),
                            std::make_shared<FoundationManager>(host));
}

}  // namespace

@implementation OlvaneViewerBridge

- (id)initWithManagerWrap:(id<OlvaneViewerManagerWrapProtocol>)manager {
    self = [super init];
    if (self) _manager = [(id)manager retain];
    return self;
}

- (void)dealloc {
    [(id)_manager release];
    [super dealloc];
}

- (NSString*)valuesForPersonId:(int64_t)personId {
    const std::string text = familyText(personId, _manager);
    return [NSString stringWithCString:text.c_str() encoding:[NSString defaultCStringEncoding]];
}

@end
