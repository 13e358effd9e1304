// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Any bytes as the text of a layout. The strict and the lenient reader agree on what is whole, what was read
// writes the same bytes again, and any shorter piece of the text gives the records that lie whole in it.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/host/LayoutText.h>

#include "Holds.h"

namespace {

using olvane::LayoutReading;
using olvane::LayoutRecord;

void writeBack(std::string_view text, const LayoutReading& reading) {
    HOLDS(reading.wholeBytes <= text.size());
    HOLDS(olvane::writeLayoutText(reading.records) == text.substr(0, reading.wholeBytes));
    HOLDS(reading.cut.has_value() == (reading.wholeBytes != text.size()));
    for (const LayoutRecord& record : reading.records) HOLDS(record.addNode.has_value() == (record.id < 0));
}

void readStrictly(std::string_view text, const LayoutReading& reading) {
    try {
        HOLDS(olvane::readLayoutText(text) == reading.records);
        HOLDS(!reading.cut);
    } catch (const olvane::LayoutTextError& error) {
        HOLDS(reading.cut);
        HOLDS(error.position() >= reading.wholeBytes && error.position() <= text.size());
        HOLDS(error.position() == reading.cut->position() && error.reason() == reading.cut->reason());
    }
}

// The records of a text that broke off are the first ones of the whole text.
void cutShort(std::string_view text, const LayoutReading& whole, std::size_t length) {
    const LayoutReading reading = olvane::readWholeRecords(text.substr(0, length));
    HOLDS(reading.records.size() <= whole.records.size());
    HOLDS(std::equal(reading.records.begin(), reading.records.end(), whole.records.begin()));
    HOLDS(reading.wholeBytes <= whole.wholeBytes);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size) {
    const std::string text(reinterpret_cast<const char*>(bytes), size);
    const LayoutReading reading = olvane::readWholeRecords(text);
    writeBack(text, reading);
    readStrictly(text, reading);
    cutShort(text, reading, size / 2);
    cutShort(text, reading, size - std::min<std::size_t>(size, 1));
    return 0;
}
