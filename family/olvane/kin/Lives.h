// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <limits>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/KinGraph.h>

namespace olvane::kin {

// The ages that all judgements on dates share, in years.
constexpr int kLongestLife = 110;    // nobody older is taken to be living, and a longer life is odd
constexpr int kYoungestParent = 12;  // at the birth of a child
constexpr int kOldestMother = 60;
constexpr int kOldestFather = 90;
constexpr int kAboutYears = 5;  // how far a date that is "about" a year may lie from it

// The years that a date may stand for: open at an end for "before" and "after".
struct Years {
    static constexpr int kOpenStart = std::numeric_limits<int>::min() / 4;
    static constexpr int kOpenEnd = std::numeric_limits<int>::max() / 4;

    int first = kOpenStart;
    int last = kOpenEnd;
    bool isAbout = false;

    bool isKnown() const { return first != kOpenStart || last != kOpenEnd; }
    // With the years around them that an "about" may mean.
    int earliest() const { return isAbout ? first - kAboutYears : first; }
    int latest() const { return isAbout ? last + kAboutYears : last; }
};

struct Life {
    Years birth;
    Years death;
    bool isDead = false;  // also without a date
};

// What is known of the years of a graph's persons and unions, by place.
struct Lives {
    std::vector<Life> persons;
    std::vector<Years> marriages;
};

// Who is to be taken for living: everybody with no sign of death who was born less than kLongestLife years before
// thisYear, and everybody without a sign of death whose dates do not decide it and who is within two steps, to a parent, a
// child or a partner, of such a person.
//
// Holds: one entry for each person, by place.
// Fails: std::invalid_argument where the lives are not as many as the persons.
OLVANE_API std::vector<bool> livingPersons(const KinGraph& graph, const Lives& lives, int thisYear);

}  // namespace olvane::kin
