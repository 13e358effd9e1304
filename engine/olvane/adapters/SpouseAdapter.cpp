// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of spouses. Every record that the engine itself makes has a place in the host's list, so the
// first rule decides; the others serve a host that fills the sets with records of its own.

#include <olvane/adapters/SpouseAdapter.h>

bool SpouseAdapter::isLessWithoutPlaces(const SpouseAdapter& other) const {
    if (preferred != other.preferred) return preferred;
    if (alive != other.alive) return alive;
    if (date != other.date) return other.date < date;
    return other.idText < idText;
}
