// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#import <olvane/foundation/OlvanePicture.h>

#include <string.h>

@implementation OlvanePictureOptions

@synthesize view = _view;
@synthesize up = _up;
@synthesize down = _down;
@synthesize direction = _direction;
@synthesize boxWidth = _boxWidth;
@synthesize boxHeight = _boxHeight;
@synthesize gapX = _gapX;
@synthesize gapY = _gapY;
@synthesize spouses = _spouses;
@synthesize siblings = _siblings;
@synthesize compact = _compact;
@synthesize mirrored = _mirrored;
@synthesize fanOf = _fanOf;
@synthesize fanAngle = _fanAngle;
@synthesize other = _other;
@synthesize ways = _ways;
@synthesize mostWays = _mostWays;
@synthesize language = _language;
@synthesize marks = _marks;
@synthesize effort = _effort;
@synthesize allParts = _allParts;
@synthesize generations = _generations;
@synthesize flagDepth = _flagDepth;
@synthesize unknownParents = _unknownParents;
@synthesize auntsUncles = _auntsUncles;
@synthesize cousins = _cousins;
@synthesize familySiblings = _familySiblings;
@synthesize siblingSpouses = _siblingSpouses;
@synthesize niecesNephews = _niecesNephews;
@synthesize grandchildren = _grandchildren;
@synthesize greatGrandparents = _greatGrandparents;
@synthesize spousesOfChildren = _spousesOfChildren;

+ (OlvanePictureOptions*)optionsForView:(int)view {
    OlvanePictureOptions* options = [[[self alloc] init] autorelease];
    options.view = view;
    return options;
}

- (id)init {
    self = [super init];
    if (self) {
        _folded = [[NSMutableData alloc] init];
        _boxWidth = 55;
        _boxHeight = 80;
        _gapX = 25;
        _gapY = 30;
        _spouses = YES;
        _fanAngle = 360;
        _ways = 2;
        _mostWays = 8;
        _effort = 1;
        _generations = 5;
        _flagDepth = 4;
        _unknownParents = YES;
        _auntsUncles = _cousins = _familySiblings = _siblingSpouses = YES;
        _niecesNephews = _grandchildren = _greatGrandparents = _spousesOfChildren = YES;
    }
    return self;
}

- (void)dealloc {
    [_folded release];
    [super dealloc];
}

- (const OlvaneFold*)folded {
    return (const OlvaneFold*)[_folded bytes];
}

- (NSUInteger)foldedCount {
    return [_folded length] / sizeof(OlvaneFold);
}

- (void)foldBranch:(int)branch ofPerson:(int64_t)personId {
    OlvaneFold fold;
    memset(&fold, 0, sizeof fold);
    fold.personId = personId;
    fold.branch = branch;
    [self unfoldBranch:branch ofPerson:personId];
    [_folded appendBytes:&fold length:sizeof fold];
}

- (void)unfoldBranch:(int)branch ofPerson:(int64_t)personId {
    NSUInteger i;
    for (i = 0; i < [self foldedCount]; ++i) {
        const OlvaneFold fold = [self folded][i];
        if (fold.personId != personId || fold.branch != branch) continue;
        [_folded replaceBytesInRange:NSMakeRange(i * sizeof fold, sizeof fold) withBytes:NULL length:0];
        return;
    }
}

@end
