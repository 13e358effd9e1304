// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

struct WriteOptions {
    // By person, entry 0 for person 1: whose identifier, name, dates and facts stay out. Empty for nobody.
    std::vector<bool> hidden;
    // The name that hidden persons get. One line of UTF-8.
    std::string hiddenName = "Living";
    // What of the details is written.
    bool notes = true;
    bool sources = true;
    bool media = true;
};

// A GEDCOM text of what was read and no more: persons with names, sex, facts and links, families with facts, and the
// details of all of them with the shared records that they point to.
//
// Holds: UTF-8. Read again with facts, it gives the same persons and families with the same ids, relatives,
//        names, dates and facts, and read with details the same details. Identifiers stay where each stands for one record; others are made. Of a
//        hidden person there are sex and links alone, but for links to other parents than father and mother, so that
//        nothing mentions an adoption; of a family with a hidden partner, or
//        with hidden children and no partner, there is nothing but who belongs to it. No identifier of theirs is
//        in the text, not even for another record.
//        With anybody hidden, free text of others stays out too: the values of EVEN and FACT, and any value,
//        nickname, place, date or identifier that holds, as words in any order and whatever their capitals and
//        accents, a given name or nickname of a hidden person and a surname of theirs or of a spouse; and any value,
//        nickname, detail or identifier with a single word that is such a name of somebody hidden and of nobody else. Where
//        no surname is given, the last word of the name stands for it. Particles in small letters and single letters
//        are no such words, and of very long names the first words alone count. Given names and surnames of those who
//        are not hidden stay.
//        Of shared records there are those that something written points to: a note, source or picture that only hidden
//        persons have is not in the text. A detail that is left out takes along what lies below it.
// Units: time grows with the size of the data, not with who is hidden.
// Fails: what was read without facts or details is written without; nothing is thrown but std::bad_alloc.
std::string writeGedcom(const GedcomData& data, const WriteOptions& options = {});

}  // namespace olvane::gedcom
