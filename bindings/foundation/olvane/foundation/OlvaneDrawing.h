// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <olvane/foundation/OlvanePicture.h>

// A GEDCOM file, drawn as SVG in one call.
//
//     NSError* error = nil;
//     OlvaneDrawingOptions* options = [OlvaneDrawingOptions optionsForView:OlvaneViewHourglass];
//     NSString* svg = [OlvaneDrawing svgOfFile:@"family.ged" person:@"Charles Darwin" options:options error:&error];

// Themes and forms of boxes. The numbers never change; later versions may add some.
enum { OlvaneThemeLight = 0, OlvaneThemeDark = 1, OlvaneThemePrint = 2 };
enum {
    OlvaneBoxesUsual = 0,  // what suits the view
    OlvaneBoxesTall = 1,
    OlvaneBoxesWide = 2
};

// What to draw. What a view has no use for is ignored, but must be in its range.
@interface OlvaneDrawingOptions : NSObject {
    int _view, _up, _down, _generations, _direction, _boxes, _theme, _year;
    NSString* _other;
    NSString* _title;
    BOOL _unknownParents, _dates, _places, _occupation, _marriage, _hideLiving;
}

// Everything else at its usual value; a plain init is for the family view.
+ (OlvaneDrawingOptions*)optionsForView:(int)view;

@property(nonatomic, assign) int view;
@property(nonatomic, copy) NSString* other;    // kinship: the other person, named as the first one
@property(nonatomic, assign) int up;           // generations of ancestors; 0 is all
@property(nonatomic, assign) int down;         // generations of descendants; 0 is all
@property(nonatomic, assign) int generations;  // pedigree: 1 to 12, the focus's own included; 0 is 5
@property(nonatomic, assign)
    int direction;                       // where later generations stand: 0 below, 1 above, 2 left, 3 right
@property(nonatomic, assign) int boxes;  // OlvaneBoxesUsual and so on
@property(nonatomic, assign) int theme;  // OlvaneThemeLight and so on
@property(nonatomic, copy) NSString* title;        // stands above the picture; none by default
@property(nonatomic, assign) BOOL unknownParents;  // family, pedigree: boxes of parents who are not known
@property(nonatomic, assign) BOOL dates;           // as the file writes them, instead of years
@property(nonatomic, assign) BOOL places;          // of birth and death
@property(nonatomic, assign) BOOL occupation;      // the first one
@property(nonatomic, assign) BOOL marriage;        // its year, at its line
@property(nonatomic, assign) BOOL hideLiving;      // everyone who may be living is hidden
@property(nonatomic, assign) int year;             // that hideLiving counts from; 0 is the present one

@end

@interface OlvaneDrawing : NSObject

// A person of a file, as "olvane draw" draws it, or nil, with an error where the caller wants one: OlvaneErrorUnreadable,
// OlvaneErrorInvalidPerson for a name that means nobody or several, OlvaneErrorInvalidArgument for an option out of its
// range. The person is named by a number, by the file's own identifier or by a name. Options of nil are for the family view.
+ (NSString*)svgOfFile:(NSString*)path
                person:(NSString*)who
               options:(OlvaneDrawingOptions*)options
                 error:(NSError**)error;

@end
