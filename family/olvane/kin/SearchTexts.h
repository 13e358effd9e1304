// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string_view>

#include <olvane/Export.h>
#include <olvane/kin/Family.h>

namespace olvane::kin {

// Where in a person's record a word of a search was found. Better places come first.
enum class FoundIn : std::uint8_t {
    identifier,  // the xref, or the number of the person
    name,
    nickname,
    marriedName,  // one that is recorded, or the surname of a woman's husband
    title,        // before or behind the name
    birth,        // its year
    death,
    place,
    other,
};

constexpr std::size_t kFoundIns = static_cast<std::size_t>(FoundIn::other) + 1;

// "identifier", "name" and so on, for programs.
OLVANE_API const char* nameOf(FoundIn in);

// A piece of a person's record that a search looks into.
struct SearchText {
    FoundIn in = FoundIn::name;
    std::string_view text{};
    std::string_view label{};    // what the data call it: a GEDCOM tag, the key of a field; empty for a name
    bool isDate = false;         // only its years are searched
    std::string_view sorting{};  // of a date: the form that sorts
};

// What a search looks into, person by person: a table, a file.
//
// Holds: persons stand at places 0 to personCount() - 1, each with an id of its own. A person's texts come in the same
//        order each time. A text lives as long as the call of the visitor.
class OLVANE_API SearchTexts {
public:
    using Visitor = std::function<void(const SearchText&)>;

    virtual ~SearchTexts() = default;
    virtual std::size_t personCount() const = 0;
    virtual std::int64_t id(std::size_t place) const = 0;
    virtual void visit(std::size_t place, const Visitor& visitor) const = 0;
};

// The texts of a table: names, dates, and fields, of which "xref" is the identifier.
// Lifetime: refers to the table.
class OLVANE_API FamilySearchTexts : public SearchTexts {
public:
    explicit FamilySearchTexts(const Family& family) : family_(family), ids_(family.personIds()) {}

    std::size_t personCount() const override { return ids_.size(); }
    std::int64_t id(std::size_t place) const override { return ids_[place]; }
    void visit(std::size_t place, const Visitor& visitor) const override;

private:
    void visitNames(std::int64_t id, const Visitor& visitor) const;

    const Family& family_;
    std::vector<FamilyId> ids_;
};

}  // namespace olvane::kin
