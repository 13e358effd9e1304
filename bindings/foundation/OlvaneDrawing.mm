// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Counts references by hand. No exception of C++ passes.

#import <olvane/foundation/OlvaneDrawing.h>

#import "Texts.h"

#include <array>
#include <cstddef>
#include <string>

#include "GuardedDrawing.h"

namespace {

// The entry of a list, or the text of a number that is none of it, which is refused by name.
template <std::size_t count>
const char* nameOf(const std::array<const char*, count>& names, int number, std::string& text) {
    if (number >= 0 && static_cast<std::size_t>(number) < count)
        return names[static_cast<std::size_t>(number)];
    text = std::to_string(number);
    return text.c_str();
}

constexpr std::array kViews{"family",    "pedigree",  "near", "ancestors", "descendants",
                            "hourglass", "relatives", "fan",  "kinship",   "everybody"};
constexpr std::array kDirections{"down", "up", "left", "right"};
constexpr std::array kThemes{"light", "dark", "print"};
constexpr std::array<const char*, 3> kBoxes{nullptr, "tall", "wide"};

// Texts that are chosen, which the options refer to.
struct Texts {
    std::string view, direction, boxes, theme, title;
};

olvane_draw_options optionsOf(OlvaneDrawingOptions* options, Texts& texts) {
    olvane_draw_options chosen = {};
    chosen.struct_size = sizeof chosen;
    chosen.view = nameOf(kViews, options.view, texts.view);
    chosen.direction = nameOf(kDirections, options.direction, texts.direction);
    chosen.boxes = nameOf(kBoxes, options.boxes, texts.boxes);
    chosen.theme = nameOf(kThemes, options.theme, texts.theme);
    texts.title = olvaneUtf8Of(options.title);
    chosen.title = texts.title.c_str();
    chosen.up = options.up;
    chosen.down = options.down;
    chosen.generations = options.generations;
    chosen.unknown_parents = options.unknownParents ? 1 : 0;
    chosen.dates = options.dates ? 1 : 0;
    chosen.places = options.places ? 1 : 0;
    chosen.occupation = options.occupation ? 1 : 0;
    chosen.marriage = options.marriage ? 1 : 0;
    chosen.hide_living = options.hideLiving ? 1 : 0;
    chosen.year = options.year;
    return chosen;
}

NSInteger codeOf(GuardedDrawing::Status status) {
    switch (status) {
        case GuardedDrawing::Status::invalidPerson:
            return OlvaneErrorInvalidPerson;
        case GuardedDrawing::Status::invalidArgument:
            return OlvaneErrorInvalidArgument;
        case GuardedDrawing::Status::unreadable:
            return OlvaneErrorUnreadable;
        case GuardedDrawing::Status::outOfMemory:
            return OlvaneErrorOutOfMemory;
        case GuardedDrawing::Status::drawn:
        case GuardedDrawing::Status::failed:
            break;
    }
    return OlvaneErrorLayoutFailed;
}

NSError* errorOf(NSInteger code, NSString* cause) {
    NSDictionary* info = [NSDictionary
        dictionaryWithObjectsAndKeys:cause, NSLocalizedDescriptionKey, cause, OlvaneErrorCauseKey, nil];
    return [NSError errorWithDomain:OlvaneErrorDomain code:code userInfo:info];
}

}  // namespace

@implementation OlvaneDrawing

+ (NSString*)svgOfFile:(NSString*)path
                person:(NSString*)who
               options:(OlvaneDrawingOptions*)options
                 error:(NSError**)error {
    OlvaneDrawingOptions* chosen = options ? options : [OlvaneDrawingOptions optionsForView:OlvaneViewFamily];
    NSInteger code = OlvaneErrorOutOfMemory;
    NSString* cause = @"there is not enough memory";
    try {
        Texts texts;
        const olvane_draw_options given = optionsOf(chosen, texts);
        const std::string other = olvaneUtf8Of(chosen.other);
        const GuardedDrawing drawing =
            guardedDrawing(olvaneUtf8Of(path), olvaneUtf8Of(who),
                           chosen.view == OlvaneViewKinship ? &other : nullptr, given);
        if (drawing.status == GuardedDrawing::Status::drawn) return olvaneTextOf(drawing.text);
        code = codeOf(drawing.status);
        if (!drawing.text.empty()) cause = olvaneTextOf(drawing.text);
    } catch (...) {
        code = OlvaneErrorOutOfMemory;  // nothing else can fail here
    }
    if (error) *error = errorOf(code, cause);
    return nil;
}

@end
