// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Hosts on Foundation over a case.

#import <bindings/foundation/FoundationHosts.h>

#include <utility>
#include <vector>

namespace {

int livingHosts = 0;
int livingLists = 0;

// An exception of C++ becomes the one that a host on Foundation would raise. It's raised outside of the
// handler: the two kinds don't mix. (A closure in a method does not find its instance variables with GCC, so
// the source is handed in.)
template <class Question>
auto answerOf(support::CaseHost* source, Question question) {
    try {
        return question(*source);
    } catch (const support::HostFailure&) {
    }
    [NSException raise:NSGenericException format:@"the database is closed"];
    return decltype(question(*source)){};
}

NSArray* arrayOf(const std::vector<std::int64_t>& ids) {
    NSMutableArray* list = [NSMutableArray array];
    for (const std::int64_t id : ids) [list addObject:[NSNumber numberWithLongLong:id]];
    return list;
}

// Bytes that are no UTF-8 are passed on as they stand.
NSString* textOf(const std::string& date) {
    NSString* text = [NSString stringWithUTF8String:date.c_str()];
    return text ? text : [NSString stringWithCString:date.c_str() encoding:NSISOLatin1StringEncoding];
}

}  // namespace

@implementation CaseFoundationHost

+ (int)alive {
    return livingHosts;
}

- (id)initWithCase:(const support::CaseFile&)input {
    self = [super init];
    if (self) {
        _source = new support::CaseHost(input, true);
        ++livingHosts;
    }
    return self;
}

- (void)dealloc {
    delete _source;
    --livingHosts;
    [super dealloc];
}

- (const std::vector<std::string>&)trace {
    return _source->trace();
}

- (int64_t)fatherForPersonWithID:(int64_t)personId {
    return answerOf(_source,
                    [&](support::CaseHost& source) { return source.fatherForPersonWithID(personId); });
}

- (int64_t)motherForPersonWithID:(int64_t)personId {
    return answerOf(_source,
                    [&](support::CaseHost& source) { return source.motherForPersonWithID(personId); });
}

- (NSArray*)spousesForPersonWithID:(int64_t)personId {
    return arrayOf(answerOf(
        _source, [&](support::CaseHost& source) { return source.spousesForPersonWithID(personId); }));
}

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    return arrayOf(answerOf(
        _source, [&](support::CaseHost& source) { return source.childrenForPersonWithID(personId); }));
}

- (BOOL)isPreferredSpouse:(int64_t)personId ofPerson:(int64_t)spouseId {
    return answerOf(_source,
                    [&](support::CaseHost& source) { return source.isPreferredSpouse(personId, spouseId); });
}

- (BOOL)isPersonDead:(int64_t)personId {
    return answerOf(_source, [&](support::CaseHost& source) { return source.isPersonDead(personId); });
}

- (NSString*)dateForPersonWithID:(int64_t)personId isBirth:(BOOL)isBirth {
    const std::string date = answerOf(_source, [&](support::CaseHost& source) {
        return source.dateForPersonWithID(personId, isBirth != 0);
    });
    return textOf(date);
}

- (int32_t)sexOfPersonWithID:(int64_t)personId {
    return answerOf(_source, [&](support::CaseHost& source) { return source.sexOfPersonWithID(personId); });
}

@end

@implementation NilListHost

- (NSArray*)spousesForPersonWithID:(int64_t)personId {
    NSArray* list = [super spousesForPersonWithID:personId];
    return [list count] == 0 ? nil : list;
}

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    NSArray* list = [super childrenForPersonWithID:personId];
    return [list count] == 0 ? nil : list;
}

@end

@implementation NilDateHost

- (NSString*)dateForPersonWithID:(int64_t)personId isBirth:(BOOL)isBirth {
    (void)personId;
    (void)isBirth;
    return nil;
}

@end

// A number that answers one message.
@interface BareNumber : NSObject {
    int64_t _value;
}
+ (BareNumber*)numberWithValue:(int64_t)value;
- (NSInteger)integerValue;
@end

@implementation BareNumber

+ (BareNumber*)numberWithValue:(int64_t)value {
    BareNumber* number = [[[BareNumber alloc] init] autorelease];
    number->_value = value;
    return number;
}

- (NSInteger)integerValue {
    return static_cast<NSInteger>(_value);
}

@end

// A list that answers two.
@interface BareList : NSObject {
    NSArray* _numbers;
}
+ (NSArray*)listOf:(NSArray*)numbers;
- (NSUInteger)count;
- (id)objectAtIndex:(NSUInteger)index;
@end

@implementation BareList

+ (NSArray*)listOf:(NSArray*)numbers {
    BareList* list = [[[self alloc] init] autorelease];
    list->_numbers = [numbers retain];
    ++livingLists;
    return (NSArray*)list;
}

- (void)dealloc {
    [_numbers release];
    --livingLists;
    [super dealloc];
}

- (NSUInteger)count {
    return [_numbers count];
}

- (id)objectAtIndex:(NSUInteger)index {
    return [BareNumber numberWithValue:[[_numbers objectAtIndex:index] longLongValue]];
}

@end

@implementation BareListHost

+ (int)listsAlive {
    return livingLists;
}

- (NSArray*)spousesForPersonWithID:(int64_t)personId {
    return [BareList listOf:[super spousesForPersonWithID:personId]];
}

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    return [BareList listOf:[super childrenForPersonWithID:personId]];
}

@end

@interface ShrinkingList : BareList {
    NSUInteger _lost;
}
@end

@implementation ShrinkingList

- (NSUInteger)count {
    return [super count] - _lost;
}

- (id)objectAtIndex:(NSUInteger)index {
    if (index == 0) _lost = 1;
    return [super objectAtIndex:index];
}

@end

@implementation ShrinkingListHost

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    return [ShrinkingList listOf:[super childrenForPersonWithID:personId]];
}

@end

@interface RaisingList : BareList
@end

@implementation RaisingList

- (id)objectAtIndex:(NSUInteger)index {
    [NSException raise:NSRangeException format:@"no entry %lu", static_cast<unsigned long>(index)];
    return nil;
}

@end

@implementation RaisingListHost

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    return [RaisingList listOf:[super childrenForPersonWithID:personId]];
}

@end

@implementation NullListHost

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    const NSUInteger count = [[super childrenForPersonWithID:personId] count];
    NSMutableArray* list = [NSMutableArray array];
    for (NSUInteger i = 0; i < count; ++i) [list addObject:[NSNull null]];
    return list;
}

@end

@implementation ThrowingHost

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    (void)personId;
    @throw @"the database is closed";
}

@end

// A list that writes down how it is looked at.
@interface WatchedList : BareList {
    WatchedListHost* _watcher;  // not held
}
+ (NSArray*)listOf:(NSArray*)numbers watcher:(WatchedListHost*)watcher;
@end

@implementation WatchedList

+ (NSArray*)listOf:(NSArray*)numbers watcher:(WatchedListHost*)watcher {
    WatchedList* list = (WatchedList*)[self listOf:numbers];
    list->_watcher = watcher;
    return (NSArray*)list;
}

- (NSUInteger)count {
    [_watcher note:"count"];
    return [super count];
}

- (id)objectAtIndex:(NSUInteger)index {
    id number = [super objectAtIndex:index];
    [_watcher note:"entry " + std::to_string([number integerValue])];
    return number;
}

@end

@implementation WatchedListHost

- (void)writeLooksTo:(std::vector<std::string>*)looks {
    _looks = looks;
}

- (void)note:(const std::string&)look {
    _looks->push_back(look);
}

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    return [WatchedList listOf:[super childrenForPersonWithID:personId] watcher:self];
}

- (NSArray*)spousesForPersonWithID:(int64_t)personId {
    return [WatchedList listOf:[super spousesForPersonWithID:personId] watcher:self];
}

- (BOOL)isPreferredSpouse:(int64_t)personId ofPerson:(int64_t)spouseId {
    [self note:"preferred " + std::to_string(spouseId)];
    return [super isPreferredSpouse:personId ofPerson:spouseId];
}

- (BOOL)isPersonDead:(int64_t)personId {
    [self note:"dead " + std::to_string(personId)];
    return [super isPersonDead:personId];
}

- (NSString*)dateForPersonWithID:(int64_t)personId isBirth:(BOOL)isBirth {
    [self note:"date " + std::to_string(personId)];
    return [super dateForPersonWithID:personId isBirth:isBirth];
}

@end

@implementation GrowingListHost

- (void)dealloc {
    [_list release];
    [super dealloc];
}

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    NSArray* input = [super childrenForPersonWithID:personId];
    if (personId != 17) return input;
    [_list release];
    _list = [input mutableCopy];
    return _list;
}

- (NSString*)dateForPersonWithID:(int64_t)personId isBirth:(BOOL)isBirth {
    if (isBirth && personId == 5 && [_list count] == 1) [_list addObject:[NSNumber numberWithInt:6]];
    return [super dateForPersonWithID:personId isBirth:isBirth];
}

@end

@implementation ReleasingHost

- (void)setBridge:(NSObject*)bridge {
    _bridge = bridge;
}

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    [_bridge release];
    _bridge = nil;
    return [super childrenForPersonWithID:personId];
}

@end
