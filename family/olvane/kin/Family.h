// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <span>
#include <string_view>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/FamilyError.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/kin/detail/FamilyColumns.h>

namespace olvane {

// The id of a person, or the number of a family: 1 to kMostId; 0 is nobody and none.
using FamilyId = std::uint32_t;
constexpr std::int64_t kMostId = std::numeric_limits<std::int32_t>::max();

// What a part of a name is. A person may have several names: a full part, where there is one, begins the next.
enum class NameKind : std::uint8_t { full, given, surname, prefix, suffix, nickname, married, other };

struct NamePart {
    NameKind kind = NameKind::full;
    std::string_view text{};

    bool operator==(const NamePart&) const = default;
};

struct LabelField {
    std::string_view key{};
    std::string_view text{};

    bool operator==(const LabelField&) const = default;
};

// A person as one row. To hand one over, ids may be any number: what is out of range is refused.
struct PersonRow {
    std::int64_t id = 0;
    std::int64_t father = 0;  // 0 for unknown
    std::int64_t mother = 0;
    kin::Sex sex = kin::Sex::unknown;
    bool dead = false;
    std::string_view birth{};         // in a form that sorts by its bytes
    std::string_view death{};         // in a form that sorts by its bytes
    std::string_view birthWritten{};  // for people to read; empty stands for the sorting form
    std::string_view deathWritten{};

    bool operator==(const PersonRow&) const = default;
};

struct FamilyChild {
    std::int64_t child = 0;
    kin::ChildKind kind = kin::ChildKind::birth;

    bool operator==(const FamilyChild&) const = default;
};

// A couple or a lone parent, with what is known of their marriage. Both partners may be unknown: then the row
// says of its children that they are siblings.
struct FamilyRow {
    std::int64_t number = 0;
    std::int64_t partner0 = 0;  // the father or husband; 0 for unknown
    std::int64_t partner1 = 0;  // the mother or wife
    kin::UnionState state = kin::UnionState::unknown;
    std::string_view marriage{};  // in a form that sorts by its bytes
    std::string_view marriageWritten{};
    std::string_view marriagePlace{};

    bool operator==(const FamilyRow&) const = default;
};

// A family as a table: what the eight questions of a data source answer, and what labels, search and charts want.
//
// Lists: of every person, the spouses and the children in the order of drawing. They are kept as they were given,
//        so they may contradict father and mother, as real data do; a list names a person at most once.
// Copies: share everything until one is changed, which then copies the rows around the change: a copy for undo
//        takes some hundred bytes. A copy of a million persons is made in the time of a count.
// Threads: any number may read one table, and each may change a copy of its own.
// Lifetime: views and spans that are handed out live until the table that gave them is changed or destroyed.
// Fails: FamilyError for what is wrong, before anything changes; std::out_of_range for a question about a person
//        or family that is not in the table; std::bad_alloc, and then the table is as it was.
// Memory: about 110 bytes a person beside names, for persons with two dates, a spouse and two children.
class OLVANE_API Family {
public:
    static constexpr std::size_t kMostTextBytes = 1U << 20U;  // of one text
    static constexpr std::size_t kMostFieldKeys = 65535;      // different ones in one table

    Family() noexcept = default;
    // Filled in one go, in time that grows with the rows.
    explicit Family(const FamilyColumns& columns);
    ~Family();
    Family(const Family& other) noexcept;
    Family(Family&& other) noexcept;
    Family& operator=(const Family& other) noexcept;
    Family& operator=(Family&& other) noexcept;

    std::size_t personCount() const;
    std::size_t familyCount() const;
    bool hasPerson(std::int64_t id) const;
    bool hasFamily(std::int64_t number) const;
    // In the order in which they were added.
    std::vector<FamilyId> personIds() const;
    std::vector<FamilyId> familyNumbers() const;

    PersonRow person(std::int64_t id) const;
    FamilyId father(std::int64_t id) const;
    FamilyId mother(std::int64_t id) const;
    kin::Sex sex(std::int64_t id) const;
    bool isDead(std::int64_t id) const;
    std::string_view birth(std::int64_t id) const;
    std::string_view death(std::int64_t id) const;
    std::span<const FamilyId> spouses(std::int64_t id) const;
    // 0 where none is preferred.
    FamilyId preferredSpouse(std::int64_t id) const;
    std::span<const FamilyId> children(std::int64_t id) const;
    std::vector<NamePart> names(std::int64_t id) const;
    // The first part of that kind; empty where there is none.
    std::string_view name(std::int64_t id, NameKind kind) const;
    std::vector<LabelField> fields(std::int64_t id) const;
    // Empty where the person has no such field.
    std::string_view field(std::int64_t id, std::string_view key) const;

    FamilyRow family(std::int64_t number) const;
    std::vector<FamilyChild> familyChildren(std::int64_t number) const;

    // The parents that a row names get the person at the end of their lists of children where it is missing.
    void addPerson(const PersonRow& row);
    // In place of the person of that id. Who is no longer a parent loses the person from the list of children.
    void setPerson(const PersonRow& row);
    // With everything that names the person. Looks at every row.
    void removePerson(std::int64_t id);

    // The list and nothing else. preferred is one of them, or 0 for none.
    void setSpouses(std::int64_t id, std::span<const std::int64_t> spouses, std::int64_t preferred);
    void setPreferredSpouse(std::int64_t id, std::int64_t preferred);
    void setChildren(std::int64_t id, std::span<const std::int64_t> children);
    // In place of the names that the person has.
    void setNames(std::int64_t id, std::span<const NamePart> names);
    // In place of the text under that key; an empty text removes the field.
    void setField(std::int64_t id, std::string_view key, std::string_view text);

    // Partners get each other at the end of their lists of spouses, and the children at the end of their lists of
    // children, where these are missing. Who had no spouse prefers the new one.
    void addFamily(const FamilyRow& row, std::span<const FamilyChild> children);
    // In place of the family of that number: as removing it and adding the other, but in its place.
    void setFamily(const FamilyRow& row, std::span<const FamilyChild> children);
    // Partners whom no other family joins are no longer listed as each other's spouses. Lists of children stay.
    // Looks at every family.
    void removeFamily(std::int64_t number);

    // Bytes that the table holds, shared ones included.
    std::size_t memoryBytes() const;

private:
    friend class FamilyFilling;
    friend class FamilyEdit;
    struct State;

    const State& state() const {
        if (state_ == nullptr) return emptyState();
        return *state_;
    }
    static const State& emptyState();

    State* state_ = nullptr;  // null for an empty table; counted by CowPointer's rules
};

// The table as unions for charts and kinship. Families come first, in their order; then couples and parents who
// are in no family, in the order of the persons, with the number 0. A family without any partner is left out, for
// a union has at least one.
OLVANE_API kin::KinGraph kinGraphOf(const Family& family);

namespace kin {
using olvane::Family;
}

}  // namespace olvane
