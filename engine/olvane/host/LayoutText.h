// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/Export.h>

namespace olvane {

// A straight piece of a line, in points; both ends as the layout gave them.
struct LayoutSegment {
    int x1 = 0;
    int y1 = 0;
    int x2 = 0;
    int y2 = 0;

    bool operator==(const LayoutSegment&) const = default;
};

// What only the record of an unknown parent states: whom it stands for.
struct AddNodeSuffix {
    bool male = false;         // an unknown father; else an unknown mother
    std::int64_t childId = 0;  // the person whose parent is unknown

    bool operator==(const AddNodeSuffix&) const = default;
};

// One box of a layout.
//
// Units: points; x grows right, y grows down. (x, y) is the upper-left corner; the size is not in the text.
// Holds: addNode is set exactly when id is negative.
struct LayoutRecord {
    std::int64_t id = 0;
    int x = 0;
    int y = 0;
    bool hasHiddenRelatives = false;
    std::vector<LayoutSegment> segments;  // repeated ones included, in the order of the text
    std::optional<AddNodeSuffix> addNode;

    bool operator==(const LayoutRecord&) const = default;
};

// Thrown by the strict reader.
//
// Holds: position counts bytes from 0 to the first one that does not fit; what() is "byte 17: TEXT".
class OLVANE_API LayoutTextError : public std::runtime_error {
public:
    LayoutTextError(std::size_t position, const std::string& reason);

    std::size_t position() const { return position_; }
    const std::string& reason() const { return reason_; }

private:
    std::size_t position_;
    std::string reason_;
};

// What could be read of a text that may have been cut.
struct LayoutReading {
    std::vector<LayoutRecord> records;   // the whole ones, up to the first that is not
    std::size_t wholeBytes = 0;          // length of the text that they take
    std::optional<LayoutTextError> cut;  // set when something follows that is no whole record
};

// The records of a result text, in its order; none for the empty text.
// Fails: throws LayoutTextError for a text that the result writer could not have ended.
OLVANE_API std::vector<LayoutRecord> readLayoutText(std::string_view text);

// The whole records ahead of the first byte that does not fit. Fails: never because of the text.
OLVANE_API LayoutReading readWholeRecords(std::string_view text);

// The text of these records: reading it again gives the same records, and writing what was read the same
// bytes.
OLVANE_API std::string writeLayoutText(const std::vector<LayoutRecord>& records);

}  // namespace olvane
