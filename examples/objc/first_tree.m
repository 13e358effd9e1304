// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A first tree: five persons of the program's own, laid out around Henry and drawn to tree.svg.

#import <Foundation/Foundation.h>

#import <olvane/foundation/OlvaneViewerBridge.h>

struct Person {
    NSString* name;
    int32_t sex;     // 0 for male
    int64_t father;  // 0 where not known
    int64_t mother;
};

// The id of a person is the place in this table.
static struct Person persons[] = {
    {@"", 0, 0, 0},          {@"Henry", 0, 4, 5},  {@"Anne", 1, 0, 0},
    {@"Elizabeth", 1, 1, 2}, {@"Edmund", 0, 0, 0}, {@"Margaret", 1, 0, 0},
};
enum { personCount = sizeof persons / sizeof persons[0] };

@interface MyFamily : NSObject <OlvaneViewerManagerWrapProtocol>
@end

@implementation MyFamily

- (int64_t)fatherForPersonWithID:(int64_t)personId {
    return persons[personId].father == 0 ? OlvanePersonNotFound : persons[personId].father;
}

- (int64_t)motherForPersonWithID:(int64_t)personId {
    return persons[personId].mother == 0 ? OlvanePersonNotFound : persons[personId].mother;
}

// Everyone who has a child with the person.
- (NSArray*)spousesForPersonWithID:(int64_t)personId {
    NSMutableArray* spouses = [NSMutableArray array];
    for (NSNumber* child in [self childrenForPersonWithID:personId]) {
        struct Person* person = &persons[[child integerValue]];
        int64_t other = person->father == personId ? person->mother : person->father;
        NSNumber* spouse = [NSNumber numberWithLongLong:other];
        if (other != 0 && ![spouses containsObject:spouse]) [spouses addObject:spouse];
    }
    return spouses;
}

- (NSArray*)childrenForPersonWithID:(int64_t)personId {
    NSMutableArray* children = [NSMutableArray array];
    int64_t child;
    for (child = 1; child < personCount; ++child) {
        if (persons[child].father != personId && persons[child].mother != personId) continue;
        [children addObject:[NSNumber numberWithLongLong:child]];
    }
    return children;
}

- (BOOL)isPreferredSpouse:(int64_t)personId ofPerson:(int64_t)spouseId {
    return [[[self spousesForPersonWithID:personId] objectAtIndex:0] longLongValue] == spouseId;
}

- (BOOL)isPersonDead:(int64_t)personId {
    return YES;
}

- (NSString*)dateForPersonWithID:(int64_t)personId isBirth:(BOOL)isBirth {
    return @"";
}

- (int32_t)sexOfPersonWithID:(int64_t)personId {
    return persons[personId].sex;
}

@end

// One record of the result text, PERSON:X:Y:FLAG:SEGMENTS with :SEX:CHILD behind it for an unknown parent.
static NSString* linesOf(NSArray* fields) {
    NSMutableString* svg = [NSMutableString string];
    for (NSString* segment in [[fields objectAtIndex:4] componentsSeparatedByString:@"|"]) {
        NSArray* ends = [segment componentsSeparatedByString:@","];
        if ([ends count] != 4) continue;
        [svg appendFormat:@"<path d=\"M%@ %@L%@ %@\" stroke=\"black\"/>\n", [ends objectAtIndex:0],
                          [ends objectAtIndex:1], [ends objectAtIndex:2], [ends objectAtIndex:3]];
    }
    return svg;
}

static NSString* boxOf(NSArray* fields, int width, int height) {
    int personId = [[fields objectAtIndex:0] intValue];
    int x = [[fields objectAtIndex:1] intValue];
    int y = [[fields objectAtIndex:2] intValue];
    NSString* name = personId > 0 ? persons[personId].name : @"?";
    return [NSString
        stringWithFormat:@"<rect x=\"%d\" y=\"%d\" width=\"%d\" height=\"%d\" fill=\"white\" "
                         @"stroke=\"black\"/>\n<text x=\"%d\" y=\"%d\" font-size=\"10\">%@</text>\n",
                         x, y, width, height, x + 4, y + 44, name];
}

static NSString* drawn(NSString* text) {
    const int width = 55, height = 80;
    int left = 0, top = 0, right = 0, bottom = 0;
    NSMutableString* lines = [NSMutableString string];
    NSMutableString* boxes = [NSMutableString string];
    for (NSString* record in [text componentsSeparatedByString:@";"]) {
        NSArray* fields = [record componentsSeparatedByString:@":"];
        if ([fields count] < 5) continue;
        int x = [[fields objectAtIndex:1] intValue];
        int y = [[fields objectAtIndex:2] intValue];
        left = MIN(left, x - 10);
        top = MIN(top, y - 10);
        right = MAX(right, x + width + 10);
        bottom = MAX(bottom, y + height + 10);
        [lines appendString:linesOf(fields)];
        [boxes appendString:boxOf(fields, width, height)];
    }
    return [NSString
        stringWithFormat:@"<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"%d %d %d %d\">\n%@%@</svg>\n",
                         left, top, right - left, bottom - top, lines, boxes];
}

int main(void) {
    NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
    OlvaneViewerBridge* bridge =
        [[[OlvaneViewerBridge alloc] initWithManagerWrap:[[[MyFamily alloc] init] autorelease]] autorelease];
    NSString* text = [bridge valuesForPersonId:1];
    BOOL written = [drawn(text) writeToFile:@"tree.svg" atomically:YES];
    BOOL isEmpty = [text length] == 0;
    [pool release];
    return written && !isEmpty ? 0 : 1;
}
