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

// Holds a host's object for as long as it stands itself.
class Held {
public:
    explicit Held(id object) : object_([object retain]) {}
    ~Held() { [object_ release]; }
    Held(const Held&) = delete;
    Held& operator=(const Held&) = delete;

private:
    id object_;
};

// The list is asked for its count at each place again, and the questions about an entry come before the next one,
// so a list that changes meanwhile is read to its present end. It is held, since a question may make the host let
// go of it.
void visitEntries(NSArray* list, const PersonIdVisitor& visit) {
    const Held held(list);
    for (NSUInteger i = 0; i < [list count]; ++i) visit([[list objectAtIndex:i] integerValue]);
}

std::vector<std::int64_t> idsOf(NSArray* list) {
    std::vector<std::int64_t> ids;
    const auto add = [&ids](std::int64_t person) { ids.push_back(person); };
    visitEntries(list, PersonIdVisitor(add));
    return ids;
}

// The bytes of the 16-bit form up to the first zero byte, which ends a date of ASCII characters behind its
// first one. Deliberately narrow: longer texts would separate records that have been one in every chart so
// far. A first character whose low byte is zero, such as U+4E00, makes an empty date.
//
// The engine cuts these bytes again, to what it takes for their first character in UTF-8. That changes no
// layout: dates are compared only where one of the two records is of an unknown parent's child, and its date is empty.
// So all that counts is whether there are any bytes.
std::string narrowDate(NSString* date) {
    const char* bytes = [date cStringUsingEncoding:NSUnicodeStringEncoding];
    if (!bytes) throw std::invalid_argument("no date");
    return bytes;
}

class FoundationManager final : public OlvaneViewerManagerWrapProtocol {
public:
    // Held for the whole layout: a callback may release the bridge, and with it the host.
    explicit FoundationManager(Host host) : host_(host), held_((id)host) {}

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
    void visitSpousesOfPerson(std::int64_t personId, const PersonIdVisitor& visit) override {
        visitEntries([host_ spousesForPersonWithID:personId], visit);
    }
    void visitChildrenOfPerson(std::int64_t personId, const PersonIdVisitor& visit) override {
        visitEntries([host_ childrenForPersonWithID:personId], visit);
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
    Host host_;
    Held held_;
};

std::string familyText(int64_t personId, Host host) {
    const auto lowBits = static_cast<std::uint32_t>(static_cast<std::uint64_t>(personId));
    return FamilyViewLayout(intToString(static_cast<int>(lowBits)),
                            std::make_shared<FoundationManager>(host));
}

}  // namespace

@implementation OlvaneViewerBridge

- (id)initWithManagerWrap:(id<OlvaneViewerManagerWrapProtocol>)manager {
    self = [super init];
    if (self) {
        const id before = (id)_manager;  // of an init before this one
        _manager = [(id)manager retain];
        [before release];
    }
    return self;
}

- (void)dealloc {
    const id before = (id)_manager;
    _manager = nil;
    [before release];
    [super dealloc];
}

// A callback may release this object, so it is not looked at again once the layout has begun.
- (NSString*)valuesForPersonId:(int64_t)personId {
    const std::string text = familyText(personId, _manager);
    return [NSString stringWithCString:text.c_str() encoding:[NSString defaultCStringEncoding]];
}

@end
