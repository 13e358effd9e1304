// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <olvane/foundation/OlvaneViewerManagerWrapProtocol.h>

// What a host makes once with its data source and asks for layouts. It keeps the data source and nothing
// else: each call is a whole layout, independent of the others.
//
// Threads: several bridges may be asked at once, each with a data source of its own or one that is safe to
//          share.
// Memory: the data source is held for the whole of a call, also where one of its operations releases the bridge. What
//         it autoreleases goes to the pool that stands when the call is made.
// Nested: an operation may ask for a layout of its own. Both count unknown parents in one sequence, so those of the
//         outer layout that are made afterwards have other negative ids than without it.
// Not to be included together with the class of the same name in C++.
@interface OlvaneViewerBridge : NSObject {
    id<OlvaneViewerManagerWrapProtocol> _manager;
}

// A data source of nil, as after a plain init, is not refused: it answers 0 to everything, so the picture has two
// parents with the number 0. A second init puts its data source in the place of the first.
- (id)initWithManagerWrap:(id<OlvaneViewerManagerWrapProtocol>)manager;

// The family view around that person as one line of text, which the caller does not own. Only the low 32 bits
// of the id count; an id that is then below 1 gives the empty text. Whatever fails in the layout leaves the
// text written so far, usually the empty one.
- (NSString*)valuesForPersonId:(int64_t)personId;

@end
