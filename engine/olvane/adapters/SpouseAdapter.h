// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

#include <olvane/Export.h>
#include <olvane/detail/RecordSet.h>

// One spouse of a person, as the data source states it. Lives in ordered sets; the order of a set is the
// order in which spouses are drawn.
struct OLVANE_API SpouseAdapter {
    int key;             // the spouse's person key
    bool preferred;      // the preferred spouse of the person
    bool alive;          // not said to be dead
    std::string date;    // a date other than birth, compared as bytes
    std::string idText;  // the host's id as text
    int hostOrder;       // place in the host's list, counted from 1; 0 without a place

    SpouseAdapter(int spouseKey, bool isPreferred, bool isAlive, std::string_view dateText,
                  std::string_view hostId, int placeInList)
        : key(spouseKey),
          preferred(isPreferred),
          alive(isAlive),
          date(dateText),
          idText(hostId),
          hostOrder(placeInList) {}

    // The host's order where both records have a place. Records without one: the preferred spouse first, then
    // the living, then the later date, then the greater id text. Note that texts run backwards here and
    // forwards for children.
    bool operator<(const SpouseAdapter& other) const {
        if (hostOrder >= 1 && other.hostOrder >= 1) return hostOrder < other.hostOrder;
        return isLessWithoutPlaces(other);
    }

private:
    bool isLessWithoutPlaces(const SpouseAdapter& other) const;
};

typedef olvane::RecordSet<SpouseAdapter> SpouseSet;
