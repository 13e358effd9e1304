// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#import <olvane/foundation/OlvaneDrawing.h>

@implementation OlvaneDrawingOptions

@synthesize view = _view;
@synthesize other = _other;
@synthesize up = _up;
@synthesize down = _down;
@synthesize generations = _generations;
@synthesize direction = _direction;
@synthesize boxes = _boxes;
@synthesize theme = _theme;
@synthesize title = _title;
@synthesize unknownParents = _unknownParents;
@synthesize dates = _dates;
@synthesize places = _places;
@synthesize occupation = _occupation;
@synthesize marriage = _marriage;
@synthesize hideLiving = _hideLiving;
@synthesize year = _year;

+ (OlvaneDrawingOptions*)optionsForView:(int)view {
    OlvaneDrawingOptions* options = [[[self alloc] init] autorelease];
    options.view = view;
    return options;
}

- (void)dealloc {
    [_other release];
    [_title release];
    [super dealloc];
}

@end
