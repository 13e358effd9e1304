// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Each property is a field of the options of the C interface, which has their usual values and says what they mean to the
// libraries.

#import <olvane/foundation/OlvanePicture.h>

#import "PictureOptionsInternal.h"

#include <stddef.h>
#include <stdlib.h>
#include <string.h>

#define OLVANE_FIELD(type, getter, setter, field) \
    -(type)getter {                               \
        return (type)_options->field;             \
    }                                             \
    -(void)setter : (type)value {                 \
        _options->field = value;                  \
    }

#define OLVANE_SWITCH(getter, setter, field)      \
    -(BOOL)getter {                               \
        return _options->field != 0 ? YES : NO;   \
    }                                             \
    -(void)setter : (BOOL)value {                 \
        _options->field = value ? 1 : 0;          \
    }

#define OLVANE_SHOWN(getter, setter, bit)                               \
    -(BOOL)getter {                                                     \
        return (_options->layout.shown & (bit)) != 0 ? YES : NO;        \
    }                                                                   \
    -(void)setter : (BOOL)value {                                       \
        if (value)                                                      \
            _options->layout.shown |= (bit);                            \
        else                                                            \
            _options->layout.shown &= ~(bit);                           \
    }

_Static_assert(sizeof(OlvaneFold) == sizeof(olvane_fold) &&
                   offsetof(OlvaneFold, branch) == offsetof(olvane_fold, branch),
               "folds are handed over as they lie");
_Static_assert(sizeof(OlvaneBoxSize) == sizeof(olvane_box_size) &&
                   offsetof(OlvaneBoxSize, width) == offsetof(olvane_box_size, width) &&
                   offsetof(OlvaneBoxSize, height) == offsetof(olvane_box_size, height),
               "sizes of boxes are handed over as they lie");

@implementation OlvanePictureOptions

@synthesize earlier = _earlier;

// clang-format off
OLVANE_FIELD(int, view, setView, view)
OLVANE_FIELD(int, up, setUp, up)
OLVANE_FIELD(int, down, setDown, down)
OLVANE_FIELD(int, direction, setDirection, direction)
OLVANE_FIELD(float, boxWidth, setBoxWidth, layout.sizes.node_width)
OLVANE_FIELD(float, boxHeight, setBoxHeight, layout.sizes.node_height)
OLVANE_FIELD(float, gapX, setGapX, layout.sizes.horz_padding)
OLVANE_FIELD(float, gapY, setGapY, layout.sizes.vert_padding)
OLVANE_SWITCH(spouses, setSpouses, spouses)
OLVANE_SWITCH(siblings, setSiblings, siblings)
OLVANE_SWITCH(compact, setCompact, compact)
OLVANE_SWITCH(mirrored, setMirrored, mirrored)
OLVANE_FIELD(int, fanOf, setFanOf, fan_of)
OLVANE_FIELD(double, fanAngle, setFanAngle, fan_angle)
OLVANE_FIELD(int64_t, other, setOther, other)
OLVANE_FIELD(int, ways, setWays, ways)
OLVANE_FIELD(int, mostWays, setMostWays, most_ways)
OLVANE_FIELD(int, language, setLanguage, language)
OLVANE_FIELD(int, marks, setMarks, marks)
OLVANE_FIELD(int, effort, setEffort, effort)
OLVANE_SWITCH(allParts, setAllParts, all_parts)
OLVANE_FIELD(double, aspect, setAspect, aspect)
OLVANE_FIELD(int, generations, setGenerations, layout.generations)
OLVANE_FIELD(int, flagDepth, setFlagDepth, layout.flag_depth)
OLVANE_SWITCH(unknownParents, setUnknownParents, unknown_parents)
OLVANE_SHOWN(auntsUncles, setAuntsUncles, OLVANE_SHOW_AUNTS_UNCLES)
OLVANE_SHOWN(cousins, setCousins, OLVANE_SHOW_COUSINS)
OLVANE_SHOWN(familySiblings, setFamilySiblings, OLVANE_SHOW_SIBLINGS)
OLVANE_SHOWN(siblingSpouses, setSiblingSpouses, OLVANE_SHOW_SIBLING_SPOUSES)
OLVANE_SHOWN(niecesNephews, setNiecesNephews, OLVANE_SHOW_NIECES_NEPHEWS)
OLVANE_SHOWN(grandchildren, setGrandchildren, OLVANE_SHOW_GRANDCHILDREN)
OLVANE_SHOWN(greatGrandparents, setGreatGrandparents, OLVANE_SHOW_GREAT_GRANDPARENTS)
OLVANE_SHOWN(spousesOfChildren, setSpousesOfChildren, OLVANE_SHOW_SPOUSES_OF_CHILDREN)
// clang-format on

+ (OlvanePictureOptions*)optionsForView:(int)view {
    OlvanePictureOptions* options = [[[self alloc] init] autorelease];
    options.view = view;
    return options;
}

- (id)init {
    self = [super init];
    if (!self) return nil;
    _folded = [[NSMutableData alloc] init];
    _boxSizes = [[NSMutableData alloc] init];
    _options = malloc(sizeof *_options);
    if (!_options) {
        [self release];
        return nil;
    }
    olvane_picture_options_default(OLVANE_PICTURE_FAMILY, _options);
    return self;
}

- (void)dealloc {
    [_earlier release];
    [_folded release];
    [_boxSizes release];
    free(_options);
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

- (void)setBoxWidth:(float)width height:(float)height ofPerson:(int64_t)personId {
    OlvaneBoxSize size;
    memset(&size, 0, sizeof size);
    size.personId = personId;
    size.width = width;
    size.height = height;
    [_boxSizes appendBytes:&size length:sizeof size];
}

- (const OlvaneBoxSize*)boxSizes {
    return (const OlvaneBoxSize*)[_boxSizes bytes];
}

- (NSUInteger)boxSizeCount {
    return [_boxSizes length] / sizeof(OlvaneBoxSize);
}

- (const struct olvane_picture_options*)options {
    _options->folds = (const olvane_fold*)[_folded bytes];
    _options->fold_count = [self foldedCount];
    _options->box_sizes = (const olvane_box_size*)[_boxSizes bytes];
    _options->box_size_count = [self boxSizeCount];
    return _options;
}

@end
