// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// draw_file FILE WHO: one person of a GEDCOM file, drawn with ancestors and descendants to tree.svg.

#import <Foundation/Foundation.h>

#import <olvane/foundation/OlvaneDrawing.h>

int main(int argc, char** argv) {
    NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
    OlvaneDrawingOptions* options = [OlvaneDrawingOptions optionsForView:OlvaneViewHourglass];
    NSString* file = argc == 3 ? [NSString stringWithUTF8String:argv[1]] : @"";
    NSString* who = argc == 3 ? [NSString stringWithUTF8String:argv[2]] : @"";
    NSError* error = nil;
    NSString* svg = [OlvaneDrawing svgOfFile:file person:who options:options error:&error];
    if (svg) [svg writeToFile:@"tree.svg" atomically:YES encoding:NSUTF8StringEncoding error:&error];
    if (error) fprintf(stderr, "%s\n", [[error localizedDescription] UTF8String]);
    [pool release];
    return svg ? 0 : 1;
}
