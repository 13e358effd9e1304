// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of spouses. Every record that the engine itself makes has a place in the host's list, so the
// first rule decides; the others serve a host that fills the sets with records of its own.

#include <olvane/adapters/SpouseAdapter.h>

#include <utility>

SpouseAdapter::SpouseAdapter(int spouseKey, bool isPreferred, bool isAlive, std::string dateText,
                             std::string hostId, int placeInList)
    : key(spouseKey),
      preferred(isPreferred),
      alive(isAlive),
      date(std::move(dateText)),
      idText(std::move(hostId)),
      hostOrder(placeInList) {}

bool SpouseAdapter::isLessWithoutPlaces(const SpouseAdapter& other) const {
    if (preferred != other.preferred) return preferred;
    if (alive != other.alive) return alive;
    if (date != other.date) return other.date < date;
    return other.idText < idText;
}
