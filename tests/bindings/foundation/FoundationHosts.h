// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <olvane/foundation/OlvaneViewerManagerWrapProtocol.h>

#include <string>
#include <vector>

#include <support/CaseFile.h>

// A case's data source as a host on Foundation has it. Where the case says that a call throws, it raises an
// NSException. Counts how many of its kind live.
@interface CaseFoundationHost : NSObject <OlvaneViewerManagerWrapProtocol> {
    support::CaseHost* _source;
}
- (id)initWithCase:(const support::CaseFile&)input;
+ (int)alive;
// The questions so far, in the form of the engine's own traces.
- (const std::vector<std::string>&)trace;
@end

// The same, with nil for every empty list.
@interface NilListHost : CaseFoundationHost
@end

// The same, with nil for every date.
@interface NilDateHost : CaseFoundationHost
@end

// The same, with lists that know count and objectAtIndex: alone, of numbers that know integerValue alone.
@interface BareListHost : CaseFoundationHost
// How many of its lists live.
+ (int)listsAlive;
@end

// The same, with lists of children that lose their last entry when the first one is read.
@interface ShrinkingListHost : CaseFoundationHost
@end

// The same, with lists of children that raise at each look at an entry.
@interface RaisingListHost : CaseFoundationHost
@end

// The same, with lists of children that hold NSNull.
@interface NullListHost : CaseFoundationHost
@end

// The same, writing the looks at its lists down between the questions: "count", "entry 42", "date 42".
@interface WatchedListHost : CaseFoundationHost {
    std::vector<std::string>* _looks;
}
- (void)writeLooksTo:(std::vector<std::string>*)looks;
- (void)note:(const std::string&)look;
@end

// The same, with lists of children that grow by one child while the first child's date is asked for.
@interface GrowingListHost : CaseFoundationHost {
    NSMutableArray* _list;
}
@end

// The same, releasing a bridge that it was given when it is asked for children, and remembering whether it outlived
// that.
@interface ReleasingHost : CaseFoundationHost {
    NSObject* _bridge;
}
- (void)setBridge:(NSObject*)bridge;  // takes the caller's reference over
@end

// The same, throwing an object that is no NSException where it is asked for children.
@interface ThrowingHost : CaseFoundationHost
@end
