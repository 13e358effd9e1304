// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include <olvane_file.h>

#include <olvane/kin/Family.h>

namespace olvane::c {

// What a call refuses, with the status that says so.
struct Refusal {
    olvane_status status;
    std::string text;
};

[[noreturn]] void refuseOption(const char* option, std::string_view given, const char* allowed);
void requirePerson(bool isKnown, std::int64_t person);

// Those that are given, or the defaults.
// Fails: Refusal for another struct_size.
olvane_draw_options chosenOptions(const olvane_draw_options* options);

// The number of the person whom a text means.
// Fails: Refusal for nobody and for several.
std::int64_t personMeant(const olvane_file& file, const char* who);

// Drawings as SVG.
// Fails: Refusal for a person who is not there and for an option out of its range; GedcomError for a file that cannot be
//        read; as charts::pictureOf.
std::string drawnFromFile(const olvane_file& file, std::int64_t focus, const olvane_draw_options& options);
std::string drawnFromTable(const Family& table, std::int64_t focus, const olvane_draw_options& options);
std::string drawnFromPath(const char* path, const char* who, const olvane_draw_options& options);

}  // namespace olvane::c
