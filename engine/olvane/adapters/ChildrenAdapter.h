// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

#include <olvane/Export.h>
#include <olvane/detail/RecordSet.h>

// One child of a person, as the data source states it. Lives in ordered sets; the order of a set is the
// order in which children are drawn.
struct OLVANE_API ChildrenAdapter {
    int key;               // the child's person key
    std::string date;      // the birth date, compared as bytes; empty for the child of an unknown parent
    std::string idText;    // the host's id as text
    std::string sortText;  // nothing fills it; always empty in the sets that the engine makes
    int hostOrder;         // place in the host's list, counted from 1; 0 for the child of an unknown parent

    ChildrenAdapter(int childKey, std::string_view dateText, std::string_view hostId, int placeInList)
        : key(childKey), date(dateText), idText(hostId), hostOrder(placeInList) {}
    // Without a place: hostOrder 0.
    ChildrenAdapter(int childKey, std::string_view dateText, std::string_view hostId)
        : ChildrenAdapter(childKey, dateText, hostId, 0) {}

    // By KEY where both records have a place, not by the place: a child met earlier in the request stands
    // ahead of its siblings, and the focus, whose key is 0, ahead of all of them. Otherwise the earlier date
    // first, then the lesser id text, then the lesser key.
    //
    // The same child has unlike records in a real parent's set and in an unknown parent's set, and the two are
    // equivalent only when the real parent's record has no date either. Whether such a child counts as shared
    // by both parents hangs on that, so comparing by key alone would move half siblings in every chart with
    // an unknown parent.
    bool operator<(const ChildrenAdapter& other) const {
        if (hostOrder >= 1 && other.hostOrder >= 1) return key < other.key;
        return isLessWithoutPlaces(other);
    }

private:
    bool isLessWithoutPlaces(const ChildrenAdapter& other) const;
};

typedef olvane::RecordSet<ChildrenAdapter> ChildrenSet;
