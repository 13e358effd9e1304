// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <olvane/foundation/OlvaneViewerManagerWrapProtocol.h>

#include <support/CaseFile.h>

// A case's data source as a host on Foundation has it. Where the case says that a call throws, it raises an
// NSException. Counts how many of its kind live.
@interface CaseFoundationHost : NSObject <OlvaneViewerManagerWrapProtocol> {
    support::CaseHost* _source;
}
- (id)initWithCase:(const support::CaseFile&)told;
+ (int)alive;
@end

// The same, with nil for every empty list.
@interface NilListHost : CaseFoundationHost
@end

// The same, with nil for every date.
@interface NilDateHost : CaseFoundationHost
@end

// The same, with lists that know count and objectAtIndex: alone, of numbers that know integerValue alone.
@interface BareListHost : CaseFoundationHost
@end
