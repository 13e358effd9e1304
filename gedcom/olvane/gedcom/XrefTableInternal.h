// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

// A place in the table. Records are known by it while a file is read, since pointers run ahead of what they
// point to.
using XrefPlace = std::uint32_t;

// All identifiers of a file, whether a record has them or only a pointer.
//
// Holds: places never change; place 0 stands for no identifier, and for a void pointer. Finding one takes
//        constant time on the average. Memory is at most some 100 bytes an identifier.
// Lifetime: the texts are views; whatever they look into outlives the table.
class XrefTable {
public:
    struct Entry {
        std::string_view xref;
        std::uint32_t hash = 0;
        PersonId person = 0;
        FamilyId family = 0;
        LineNumber line = 0;  // of the first record of that identifier; 0 while only pointers are known
    };

    XrefTable();

    // The place of the identifier; 0 if it was never seen.
    XrefPlace find(std::string_view xref) const;
    // The same, made if need be. xref is not empty.
    XrefPlace place(std::string_view xref);

    const Entry& at(XrefPlace place) const { return entries_[place]; }
    Entry& at(XrefPlace place) { return entries_[place]; }

private:
    // Identifiers of one beginning that count up, such as I1, I2, I3: places by number.
    struct Series {
        std::string_view beginning;
        std::size_t digits = 0;  // of numbers with zeros in front; 0 for those without
        std::vector<XrefPlace> places;
    };

    // An identifier as a member of a series; number is npos for one that cannot be.
    struct Serial {
        std::string_view beginning;
        std::size_t digits = 0;
        std::size_t number = 0;
    };

    static Serial serialOf(std::string_view xref);
    std::uint32_t hashOf(std::string_view text) const;
    std::size_t seriesOf(const Serial& serial) const;
    XrefPlace findInSeries(const Serial& serial) const;
    XrefPlace findByHash(std::string_view xref) const;
    bool addToSeries(const Serial& serial, XrefPlace place);
    void addByHash(XrefPlace place);
    void putIntoBucket(XrefPlace place);
    void grow();

    std::vector<Entry> entries_;
    std::vector<Series> series_;
    std::vector<XrefPlace> buckets_;  // size is a power of two, at most half of them taken; 0 is free
    std::size_t hashed_ = 0;
    std::uint64_t seed_;
};

// The identifier without its @, if it has them.
std::string_view bareXref(std::string_view text);

}  // namespace olvane::gedcom
