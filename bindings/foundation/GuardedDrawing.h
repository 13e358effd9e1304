// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane_file.h>

// What became of a drawing. The runtime of Objective-C does not distinguish the exceptions of C++, so they are
// caught where C++ is compiled alone.
struct GuardedDrawing {
    enum class Status { drawn, invalidPerson, invalidArgument, unreadable, outOfMemory, failed };

    Status status = Status::outOfMemory;
    std::string text;  // the SVG, or else the cause; empty where memory ran out
};

// A drawing of the file at that path, as drawnFromFile makes it. other is whom the options mean with to; null for
// nobody. Fails: std::bad_alloc alone.
GuardedDrawing guardedDrawing(const std::string& path, const std::string& who, const std::string* other,
                              const olvane_draw_options& options);
