// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <Foundation/Foundation.h>

#include <stdint.h>

// The answer of fatherForPersonWithID: and motherForPersonWithID: for a parent who is not known. A number below
// 1 is no such answer: it is not refused, but may be drawn as a box too many or end the layout.
#define OlvanePersonNotFound INT64_MAX

// The host's data source: eight questions about persons.
//
// Units: person ids are the host's own. Real persons have ids of 1 and more, and only the low 32 bits count.
//        The engine never asks about an id below 1.
// Holds: asked on the caller's thread, within valuesForPersonId:, and many times for the same person. Answers
//        must agree with themselves within one layout.
// Fails: an operation, or a list that it has answered, may throw an NSException or any other object. The layout
//        then ends with the text written so far.
@protocol OlvaneViewerManagerWrapProtocol

- (int64_t)fatherForPersonWithID:(int64_t)personId;
- (int64_t)motherForPersonWithID:(int64_t)personId;

// Numbers, read by count, objectAtIndex: and integerValue; nil is an empty list. The order of the spouses is
// the order of drawing.
- (NSArray*)spousesForPersonWithID:(int64_t)personId;
- (NSArray*)childrenForPersonWithID:(int64_t)personId;

// Whether the second is the preferred spouse of the first.
- (BOOL)isPreferredSpouse:(int64_t)personId ofPerson:(int64_t)spouseId;
- (BOOL)isPersonDead:(int64_t)personId;

// The date of birth, asked of children, or another date, asked of spouses; in any form, of which no more than
// the beginning is compared. Empty where there is none, and taken for empty where the first character is one
// like U+0100 or U+4E00, whose number ends in a zero byte; nil ends the layout as an exception does.
- (NSString*)dateForPersonWithID:(int64_t)personId isBirth:(BOOL)isBirth;

// 0 for male; any other number counts as female.
- (int32_t)sexOfPersonWithID:(int64_t)personId;

@end
