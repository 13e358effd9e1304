// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/TextInternerInternal.h>

namespace olvane::gedcom {

// Keeps the lines that state more of persons, families, facts and names: notes, sources, media, addresses, causes, ages and
// links, and the records that they point to. Whatever else stands in a file is left out, with what lies below it.
//
// Holds: receives every line below level 0, in order.
class DetailReader {
public:
    DetailReader(LineScanner& scanner, TextInterner& interner, GedcomTables& tables)
        : scanner_(scanner), interner_(interner), tables_(tables) {}

    void beginPerson();
    void beginFamily();
    // A record of any other sort.
    void beginShared(const GedcomLine& line, std::uint64_t tag);

    // A line on level 1: the name that will be the next in the tables, the last fact, or anything else.
    void beginName();
    void beginFact();
    void beginOwn(const GedcomLine& line, std::uint64_t tag);

    // A line below these, or below a shared record.
    void add(const GedcomLine& line, std::uint64_t tag);
    void leaveOut(const GedcomLine& line) { leftOutLevel_ = line.level; }

private:
    void beginOwner(std::vector<Slice>& slices, std::size_t place);
    void keep(const GedcomLine& line);

    LineScanner& scanner_;
    TextInterner& interner_;
    GedcomTables& tables_;
    Slice* record_ = nullptr;       // of the record in hand; null for one that is left out
    Slice* owner_ = nullptr;        // of the fact or name in hand, beside the record's
    std::size_t leftOutLevel_ = 0;  // what lies deeper goes with it; 0 for nothing
};

}  // namespace olvane::gedcom
