// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// The rows of a table as they lie in memory. Persons and families refer to each other by id, so a row may move.

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include <olvane/kin/Family.h>
#include <olvane/kin/FamilyStorageInternal.h>

namespace olvane {

namespace detail {

using Reference = BlobStore::Reference;

// Holds: an id of 0 is a row that was removed. A written date has the reference of the sorting form where both are
//        the same text.
struct StoredPerson {
    FamilyId id = 0;
    FamilyId father = 0;
    FamilyId mother = 0;
    FamilyId preferred = 0;
    Reference spouses = 0;
    Reference children = 0;
    Reference birth = 0;
    Reference death = 0;
    Reference birthWritten = 0;
    Reference deathWritten = 0;
    Reference names = 0;   // packed, see NamePacking
    Reference fields = 0;  // packed, see FieldPacking
    kin::Sex sex = kin::Sex::unknown;
    bool dead = false;
};

struct StoredFamily {
    FamilyId number = 0;
    FamilyId partner0 = 0;
    FamilyId partner1 = 0;
    Reference children = 0;
    Reference kinds = 0;  // a byte for each child; the empty text where all are children by birth
    Reference marriage = 0;
    Reference marriageWritten = 0;
    Reference marriagePlace = 0;
    kin::UnionState state = kin::UnionState::unknown;
};

// Names and fields of a person as one text: for each entry its number (a kind, or the place of the key) in
// headBytes, the length in four bytes, and the bytes.
struct PackedEntry {
    std::uint32_t number;
    std::string_view text;
};
void appendPacked(std::string& packed, PackedEntry entry, std::size_t headBytes);
// The next entry, which is removed from the front of rest; rest is not empty.
PackedEntry takePacked(std::string_view& rest, std::size_t headBytes);
constexpr std::size_t kNameHeadBytes = 1;
constexpr std::size_t kFieldHeadBytes = 2;

}  // namespace detail

// Holds: every list names a person at most once, and all ids in lists, parents and partners are of persons in the
//        table; the preferred spouse is in the list of spouses.
struct Family::State {
    State() = default;
    State(const State& other);
    State& operator=(const State&) = delete;
    ~State() = default;

    detail::Rows<detail::StoredPerson> persons;
    detail::Rows<detail::StoredFamily> families;
    detail::IdIndex personIndex;
    detail::IdIndex familyIndex;
    detail::BlobStore blobs;
    std::vector<std::string> fieldKeys;
    std::size_t personCount = 0;
    std::size_t familyCount = 0;
    std::size_t tidyWords = 0;  // words of the blobs when they were tidied last
    std::atomic<std::uint32_t> owners{1};

    // kNoRow where there is none.
    std::uint32_t personRow(std::int64_t id) const {
        const std::uint32_t row = personIndex.rowOf(id);
        return row != detail::IdIndex::kNoRow && persons[row].id == id ? row : detail::IdIndex::kNoRow;
    }
    std::uint32_t familyRow(std::int64_t number) const {
        const std::uint32_t row = familyIndex.rowOf(number);
        return row != detail::IdIndex::kNoRow && families[row].number == number ? row
                                                                                : detail::IdIndex::kNoRow;
    }
    // Fail: std::out_of_range.
    const detail::StoredPerson& person(std::int64_t id) const;
    const detail::StoredFamily& family(std::int64_t number) const;

    static void release(State* state) noexcept;
};

}  // namespace olvane
