// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <olvane/foundation/OlvaneViewerManagerWrapProtocol.h>

// The picture of any view in one call, with options, and with an error where it fails.
//
//     OlvanePictureOptions* options = [OlvanePictureOptions optionsForView:OlvaneViewHourglass];
//     options.up = 4;
//     NSError* error = nil;
//     OlvanePicture* picture = [OlvanePicture pictureOfDataSource:source focus:17 options:options error:&error];
//     for (NSUInteger i = 0; i < [picture boxCount]; ++i) draw(&[picture boxes][i]);

// The numbers of these enumerations never change; later versions may add some.
enum {
    OlvaneViewFamily = 0,
    OlvaneViewPedigree = 1,
    OlvaneViewNear = 2,  // the persons of the family view, placed compactly
    OlvaneViewAncestors = 3,
    OlvaneViewDescendants = 4,
    OlvaneViewHourglass = 5,
    OlvaneViewRelatives = 6,
    OlvaneViewFan = 7,
    OlvaneViewKinship = 8,
    OlvaneViewEverybody = 9
};

// A branch of a person: everybody to whom only it leads.
enum {
    OlvaneBranchUp = 0,     // ancestors
    OlvaneBranchDown = 1,   // descendants
    OlvaneBranchBeside = 2  // partners and, of the focus and its ancestors, siblings with theirs
};

typedef struct OlvaneFold {
    int64_t personId;
    int branch;
} OlvaneFold;

typedef struct OlvaneBoxSize {
    int64_t personId;
    float width;
    float height;
} OlvaneBoxSize;

@class OlvanePicture;

struct olvane_picture_options;  // of the C interface, whose header is not needed

// What to make a picture of. What a view has no use for is ignored, but must be in its range.
//
// Units: points; degrees. Generations count from the focus, and 0 is all of them.
@interface OlvanePictureOptions : NSObject {
    struct olvane_picture_options* _options;
    NSMutableData* _folded;
    NSMutableData* _boxSizes;
    OlvanePicture* _earlier;
}

// Everything else at its usual value; a plain init is for the family view.
+ (OlvanePictureOptions*)optionsForView:(int)view;

@property(nonatomic, assign) int view;
@property(nonatomic, assign) int up;    // generations of ancestors
@property(nonatomic, assign) int down;  // generations of descendants
@property(nonatomic, assign)
    int direction;  // where later generations stand: 0 below, 1 above, 2 left, 3 right
@property(nonatomic, assign) float boxWidth;
@property(nonatomic, assign) float boxHeight;
@property(nonatomic, assign) float gapX;     // between neighbours of one generation
@property(nonatomic, assign) float gapY;     // between generations
@property(nonatomic, assign) BOOL spouses;   // of descendants: YES
@property(nonatomic, assign) BOOL siblings;  // of ancestors: NO
@property(nonatomic, assign) BOOL compact;   // trees packed tighter: NO
@property(nonatomic, assign) BOOL mirrored;  // right and left exchanged: NO

@property(nonatomic, assign) int fanOf;        // 0 ancestors, 1 descendants
@property(nonatomic, assign) double fanAngle;  // 90 to 360

@property(nonatomic, assign) int64_t other;  // kinship: the other person
@property(nonatomic, assign) int ways;       // kinship: 0 by blood, 1 by marriage, 2 both
@property(nonatomic, assign) int mostWays;   // kinship: 8; 0 for all
@property(nonatomic, assign) int language;   // kinship: 0 English, 1 German, 2 Spanish

@property(nonatomic, assign) int marks;      // everybody: how many second links become marks; -1 for all
@property(nonatomic, assign) int effort;     // everybody: 0 to 100
@property(nonatomic, assign) BOOL allParts;  // everybody: also those who are not connected with the focus
// Everybody: an earlier picture of everybody, or nil. Who is in both, by id, stays where that picture has them as far
// as the change allows; it is not looked at if it is of another view or direction, or if less than half of the family is
// in it.
@property(nonatomic, retain) OlvanePicture* earlier;

@property(nonatomic, assign) int generations;  // pedigree: 1 to 1000, the focus's own included
@property(nonatomic, assign) int flagDepth;    // pedigree: generations in which partners raise the flag
@property(nonatomic, assign)
    BOOL unknownParents;  // family, pedigree: boxes of parents who are not known: YES

// Family, near: who is shown; all YES. Cousins need aunts and uncles; nieces, nephews and the spouses of siblings need
// siblings.
@property(nonatomic, assign) BOOL auntsUncles;
@property(nonatomic, assign) BOOL cousins;
@property(nonatomic, assign) BOOL familySiblings;
@property(nonatomic, assign) BOOL siblingSpouses;
@property(nonatomic, assign) BOOL niecesNephews;
@property(nonatomic, assign) BOOL grandchildren;
@property(nonatomic, assign) BOOL greatGrandparents;
@property(nonatomic, assign) BOOL spousesOfChildren;

// Near, ancestors, descendants, hourglass, relatives: branches that are left out, in the order in which they were last
// folded. The array lives until the next fold or unfold, and no longer than the options.
- (void)foldBranch:(int)branch ofPerson:(int64_t)personId;
- (void)unfoldBranch:(int)branch ofPerson:(int64_t)personId;
- (const OlvaneFold*)folded;
- (NSUInteger)foldedCount;

// Near, ancestors, descendants, hourglass, relatives, kinship, everybody: whose boxes are not of the usual size, as they stand
// on paper. Who is not in the family is passed over, and the last of two sizes for one person counts. The array
// lives until the next size, and no longer than the options.
- (void)setBoxWidth:(float)width height:(float)height ofPerson:(int64_t)personId;
- (const OlvaneBoxSize*)boxSizes;
- (NSUInteger)boxSizeCount;

// Everybody, near, ancestors, descendants, hourglass, relatives: width by height of the paper that wide generations are
// folded for; 0 for none.
@property(nonatomic, assign) double aspect;

@end

// The place of nothing in an array. Places count from 0.
#define OlvaneNoPlace (-1)

typedef struct OlvaneBox {
    int64_t personId;  // 0 for an unknown parent
    double x;          // of the upper-left corner; x grows right, y grows down
    double y;
    float width;
    float height;
    int32_t kind;     // 0 a person, 1 an unknown parent
    int32_t sex;      // 0 male, 1 female, 2 unknown
    int32_t childOf;  // of an unknown parent: the box whose parent it is
    int32_t repeat;   // 0 for a person with one box; else it counts the person's boxes from 1
    int32_t
        hiddenParents;  // relatives without a box; 0 in the family view and the pedigree, which have the flag
    int32_t hiddenPartners;
    int32_t hiddenChildren;
    int32_t furtherParents;  // families that the person is a child of, beside the first, with no parent shown
    BOOL flag;               // family, pedigree: has relatives without a box
} OlvaneBox;

// Its members lie side by side in members: one or two parents, the father or husband first, then the children.
typedef struct OlvaneFamily {
    uint32_t firstMember;
    uint32_t parentCount;
    uint32_t childCount;
    uint32_t firstLine;  // in lines
    uint32_t lineCount;
} OlvaneFamily;

// A straight piece; horizontal or vertical, save in round charts. Its bridges are where it jumps over another family's
// line: the x of each on a horizontal piece, the y on a vertical one.
typedef struct OlvaneLine {
    double x1;
    double y1;
    double x2;
    double y2;
    int32_t role;   // 0 marriage, 1 drop, 2 bar, 3 stem, 4 link
    int32_t child;  // the box of the child to whom the piece belongs alone, or OlvaneNoPlace
    uint32_t firstBridge;
    uint32_t bridgeCount;
} OlvaneLine;

// What is labelled instead of joined by a line. Marks of one number, from 1, have one sign at each of their boxes.
typedef struct OlvaneMark {
    int32_t kind;  // 0 boxes of one person, 1 a child and its parents elsewhere, 2 partners elsewhere
    int32_t number;
    int32_t boxes[3];  // OlvaneNoPlace where there are fewer
} OlvaneMark;

// A branch that is left out: count persons would have boxes with it, on that side of the box.
typedef struct OlvaneFoldedBranch {
    int32_t box;
    int32_t count;
    int32_t branch;
    int32_t side;  // 0 top, 1 right, 2 bottom, 3 left
} OlvaneFoldedBranch;

// A box of a round chart, beside the box: a piece of a ring, in degrees clockwise from the top. Ring 0 is the middle.
typedef struct OlvaneArc {
    double from;
    double to;
    int32_t ring;
    int32_t line;  // the box at which its line of descent begins, or OlvaneNoPlace
} OlvaneArc;

// A picture never changes. Its arrays live as long as it does; those of no entries may be NULL.
@interface OlvanePicture : NSObject {
    void* _picture;
}

// The picture around the focus, or nil, with an error where the caller wants one. Options of nil are for the family view.
//
// The source answers as for a bridge, on this thread and within the call, and is held for all of it. Its dates are taken
// as UTF-8, and numbers that are not 1 to 2147483647 are refused. What it raises does not pass.
// Nested: refused with OlvaneErrorNestedCall where an operation of the source calls this. A bridge may be asked.
// Memory: what the source autoreleases goes to the pool that stands when the call is made.
+ (OlvanePicture*)pictureOfDataSource:(id<OlvaneViewerManagerWrapProtocol>)source
                                focus:(int64_t)personId
                              options:(OlvanePictureOptions*)options
                                error:(NSError**)error;

- (const OlvaneBox*)boxes;
- (NSUInteger)boxCount;
- (const OlvaneFamily*)families;
- (NSUInteger)familyCount;
- (const int32_t*)members;  // places of boxes
- (NSUInteger)memberCount;
- (const OlvaneLine*)lines;
- (NSUInteger)lineCount;
- (const double*)bridges;
- (NSUInteger)bridgeCount;
- (const OlvaneMark*)marks;
- (NSUInteger)markCount;
- (const OlvaneArc*)arcs;  // one for each box of a round chart
- (NSUInteger)arcCount;

- (const OlvaneFoldedBranch*)foldedBranches;
- (NSUInteger)foldedBranchCount;

- (int32_t)focus;  // the place of its box
- (int32_t)other;  // the other person's box in a picture of kinship, or OlvaneNoPlace

// What the focus is to the other person of a kinship view, and the reverse, in words; empty without a way.
- (NSString*)focusIs;
- (NSString*)otherIs;

// All of it as JSON of format 2, the ways of a kinship view and the rings of a fan as well.
- (NSString*)json;

@end

// Of every error: the domain, and what its userInfo has beside NSLocalizedDescriptionKey. The operation is the name of
// its selector; it is absent where no operation of the source failed, and the person, an NSNumber, where there is none.
extern NSString* const OlvaneErrorDomain;
extern NSString* const OlvaneErrorOperationKey;
extern NSString* const OlvaneErrorPersonKey;
extern NSString* const OlvaneErrorCauseKey;

// Codes of errors.
enum {
    OlvaneErrorInvalidArgument = 1,  // no data source, or an option out of its range
    OlvaneErrorInvalidPerson = 2,    // the focus, or the other person of a kinship view
    OlvaneErrorHostFailed = 3,       // an operation raised, or answered nil for a date
    OlvaneErrorInvalidId = 4,        // an operation answered a number that is not 1 to 2147483647
    OlvaneErrorLayoutFailed = 5,     // the data leave no picture
    OlvaneErrorOutOfMemory = 6,
    OlvaneErrorNestedCall = 7,
    OlvaneErrorUnreadable = 8  // a file that cannot be read
};
