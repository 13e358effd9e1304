// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "GuardedDrawing.h"

#include <exception>
#include <new>

#include <olvane/gedcom/GedcomReader.h>

#include "FileDrawing.h"
#include "FileInternal.h"

namespace {

namespace c = olvane::c;
namespace gedcom = olvane::gedcom;

std::string drawn(const std::string& path, const std::string& who, const std::string* other,
                  olvane_draw_options options) {
    gedcom::ReadOptions reading;
    reading.facts = options.places != 0 || options.occupation != 0;
    const olvane_file file(gedcom::readGedcomFile(path, reading));
    if (other) options.to = c::personMeant(file, other->c_str());
    return c::drawnFromFile(file, c::personMeant(file, who.c_str()), options);
}

}  // namespace

GuardedDrawing guardedDrawing(const std::string& path, const std::string& who, const std::string* other,
                              const olvane_draw_options& options) {
    using Status = GuardedDrawing::Status;
    try {
        return {Status::drawn, drawn(path, who, other, options)};
    } catch (const c::Refusal& refusal) {
        const bool isPerson = refusal.status == OLVANE_INVALID_PERSON;
        return {isPerson ? Status::invalidPerson : Status::invalidArgument, refusal.text};
    } catch (const gedcom::GedcomError& unreadable) {
        return {Status::unreadable, unreadable.what()};
    } catch (const std::bad_alloc&) {
        return {Status::outOfMemory, {}};
    } catch (const std::exception& failure) {
        return {Status::failed, failure.what()};
    }
}
