// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Counts references by hand. No exception of C++ passes.

#import <olvane/foundation/OlvaneDrawing.h>

#import "Texts.h"

#include <array>
#include <cstddef>
#include <exception>
#include <new>
#include <string>

#include "FileDrawing.h"
#include "FileInternal.h"

#include <olvane/gedcom/GedcomReader.h>

namespace {

namespace c = olvane::c;
namespace gedcom = olvane::gedcom;

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

std::string drawn(NSString* path, NSString* who, OlvaneDrawingOptions* options) {
    Texts texts;
    olvane_draw_options chosen = optionsOf(options, texts);
    gedcom::ReadOptions reading;
    reading.facts = chosen.places != 0 || chosen.occupation != 0;
    const olvane_file file(gedcom::readGedcomFile(olvaneUtf8Of(path), reading));
    if (options.view == OlvaneViewKinship)
        chosen.to = c::personMeant(file, olvaneUtf8Of(options.other).c_str());
    return c::drawnFromFile(file, c::personMeant(file, olvaneUtf8Of(who).c_str()), chosen);
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
    NSInteger code = OlvaneErrorLayoutFailed;
    NSString* cause = @"there is not enough memory";
    try {
        return olvaneTextOf(drawn(path, who, chosen));
    } catch (const c::Refusal& refusal) {
        const bool isPerson = refusal.status == OLVANE_INVALID_PERSON;
        code = isPerson ? OlvaneErrorInvalidPerson : OlvaneErrorInvalidArgument;
        cause = olvaneTextOf(refusal.text);
    } catch (const gedcom::GedcomError& unreadable) {
        code = OlvaneErrorUnreadable;
        cause = olvaneTextOf(unreadable.what());
    } catch (const std::bad_alloc&) {
        code = OlvaneErrorOutOfMemory;
    } catch (const std::exception& failure) {
        cause = olvaneTextOf(failure.what());
    }
    if (error) *error = errorOf(code, cause);
    return nil;
}

@end
