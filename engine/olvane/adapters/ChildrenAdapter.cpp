// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of children: first sight in the request for children of a real person, dates and ids for records
// that have no place in a host's list.

#include <olvane/adapters/ChildrenAdapter.h>

#include <cstring>

bool ChildrenAdapter::isLessWithoutPlaces(const ChildrenAdapter& other) const {
    if (date != other.date) return date < other.date;
    // True both ways round, so no order at all. Sort texts are empty wherever the engine makes the records; a
    // proper comparison here would let hosts rely on a field that nothing fills.
    if (sortText != other.sortText) return std::strcmp(sortText.c_str(), other.sortText.c_str()) != 0;
    if (idText != other.idText) return idText < other.idText;
    return key < other.key;
}
