// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The map of an open GEDCOM file, as bytes that go out as they are.

#include <cstddef>
#include <exception>
#include <memory>
#include <string>

#include <olvane/charts/MapIndex.h>
#include <olvane/source/GedcomLabels.h>

#include "OpenFile.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

using namespace olvane;

// Null for a map that is refused; last_text then says why.
OLVANE_EXPORT("gedcom_map") std::string* gedcomMap(js::OpenFile* file) {
    try {
        const charts::MapIndex map = charts::mapIndexOf(file->kin(), gedcom::captionsOf(file->data));
        return std::make_unique<std::string>(charts::writeMapIndex(map)).release();
    } catch (const std::exception& error) {
        js::lastText = error.what();
        return nullptr;
    }
}

OLVANE_EXPORT("map_bytes") const char* mapBytes(const std::string* map) {
    return map->data();
}

OLVANE_EXPORT("map_size") std::size_t mapSize(const std::string* map) {
    return map->size();
}

OLVANE_EXPORT("map_free") void mapFree(std::string* map) {
    delete map;
}
