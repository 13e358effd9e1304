// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>
#include <type_traits>

namespace olvane {

// A column of numbers where it lies: any of five machine types, one behind the other. Absent by default.
//
// Lifetime: refers to the numbers, which must live while the column is read.
class NumberColumn {
public:
    enum class Type : std::uint8_t { int8, uint8, int32, uint32, int64, float64 };

    NumberColumn() = default;
    NumberColumn(Type type, const void* first, std::size_t size)
        : first_(first), size_(size), type_(type), isGiven_(true) {}
    // Doubles are for languages that have no other numbers.
    template <class Number>
    NumberColumn(std::span<Number> numbers)
        : NumberColumn(typeOf(std::remove_const_t<Number>()), numbers.data(), numbers.size()) {}

    bool isGiven() const { return isGiven_; }
    std::size_t size() const { return size_; }

    // Nothing for a double that is not whole or beyond 2^53.
    std::optional<std::int64_t> at(std::size_t row) const {
        switch (type_) {
            case Type::int8:
                return static_cast<const std::int8_t*>(first_)[row];
            case Type::uint8:
                return static_cast<const std::uint8_t*>(first_)[row];
            case Type::int32:
                return static_cast<const std::int32_t*>(first_)[row];
            case Type::uint32:
                return static_cast<const std::uint32_t*>(first_)[row];
            case Type::int64:
                return static_cast<const std::int64_t*>(first_)[row];
            case Type::float64:
                break;
        }
        return wholeNumber(static_cast<const double*>(first_)[row]);
    }

private:
    static Type typeOf(std::int8_t) { return Type::int8; }
    static Type typeOf(std::uint8_t) { return Type::uint8; }
    static Type typeOf(std::int32_t) { return Type::int32; }
    static Type typeOf(std::uint32_t) { return Type::uint32; }
    static Type typeOf(std::int64_t) { return Type::int64; }
    static Type typeOf(double) { return Type::float64; }

    static std::optional<std::int64_t> wholeNumber(double number) {
        constexpr double kLimit = 9007199254740992.0;
        if (!(number > -kLimit && number < kLimit)) return std::nullopt;
        const auto whole = static_cast<std::int64_t>(number);
        if (static_cast<double>(whole) != number) return std::nullopt;
        return whole;
    }

    const void* first_ = nullptr;
    std::size_t size_ = 0;
    Type type_ = Type::int64;
    bool isGiven_ = false;
};

// A column of texts where they lie: views, texts ended by a zero byte, or one run of bytes with the place where
// each text begins. Absent by default.
//
// Lifetime: refers to the texts, which must live while the column is read.
class TextColumn {
public:
    TextColumn() = default;
    TextColumn(std::span<const std::string_view> texts)
        : views_(texts.data()), size_(texts.size()), isGiven_(true) {}
    TextColumn(std::span<std::string_view> texts) : TextColumn(std::span<const std::string_view>(texts)) {}
    // A null pointer is the empty text.
    TextColumn(std::span<const char* const> texts)
        : pointers_(texts.data()), size_(texts.size()), isGiven_(true) {}
    // starts has one number more than there are texts, never falls, and its last is no more than length: text i is
    // the bytes from starts[i] to starts[i + 1].
    TextColumn(const char* bytes, std::size_t length, std::span<const std::uint32_t> starts)
        : bytes_(bytes),
          length_(length),
          starts_(starts.data()),
          size_(starts.empty() ? 0 : starts.size() - 1),
          isGiven_(true) {}

    bool isGiven() const { return isGiven_; }
    std::size_t size() const { return size_; }

    // Nothing where the starts of a run of bytes are not in order.
    std::optional<std::string_view> at(std::size_t row) const {
        if (views_ != nullptr) return views_[row];
        if (pointers_ != nullptr) {
            return pointers_[row] == nullptr ? std::string_view() : std::string_view(pointers_[row]);
        }
        const std::uint32_t first = starts_[row];
        const std::uint32_t last = starts_[row + 1];
        if (first > last || last > length_) return std::nullopt;
        return std::string_view(bytes_ + first, last - first);
    }

private:
    const std::string_view* views_ = nullptr;
    const char* const* pointers_ = nullptr;
    const char* bytes_ = nullptr;
    std::size_t length_ = 0;
    const std::uint32_t* starts_ = nullptr;
    std::size_t size_ = 0;
    bool isGiven_ = false;
};

// A whole family as columns, from which a Family is filled in one call. All columns of one list of rows have the
// same length; a column that is not given stands for its default in every row.
//
// Ids of persons and numbers of families are 1 to 2^31 - 1, each once; 0 stands for nobody where that is allowed.
struct FamilyColumns {
    struct Persons {
        NumberColumn id;      // needed
        NumberColumn father;  // 0 for unknown
        NumberColumn mother;  // 0 for unknown
        NumberColumn sex;     // 0 male, 1 female, 2 unknown; unknown by default
        NumberColumn dead;    // 0 or 1; 0 by default
        TextColumn birth;     // in a form that sorts by its bytes
        TextColumn death;
        TextColumn birthWritten;  // for people to read; the sorting form by default
        TextColumn deathWritten;
    } persons;

    // Who is listed as whose spouse, in the order of drawing; one row for each of the two lists that a couple
    // stands in. Where the columns are not given, the lists follow from the families.
    struct Spouses {
        NumberColumn person;     // needed
        NumberColumn spouse;     // needed
        NumberColumn preferred;  // 1 for at most one row of a person; by default 1 in the first row of each
    } spouses;

    // Who is listed as whose child, in the order of drawing. Where the columns are not given, the lists follow from
    // the families and then from father and mother.
    struct Children {
        NumberColumn parent;  // needed
        NumberColumn child;   // needed
    } children;

    struct Families {
        NumberColumn number;    // needed
        NumberColumn partner0;  // the father or husband; 0 for unknown
        NumberColumn partner1;  // the mother or wife; 0 for unknown
        NumberColumn state;     // 0 married, 1 divorced, 2 unmarried, 3 unknown; unknown by default
        TextColumn marriage;    // in a form that sorts
        TextColumn marriageWritten;
        TextColumn marriagePlace;
    } families;

    struct FamilyChildren {
        NumberColumn family;  // needed
        NumberColumn child;   // needed
        NumberColumn kind;    // 0 birth, 1 adopted, 2 foster, 3 step, 4 sealing, 5 unknown; birth by default
    } familyChildren;

    // The parts of a person's names in their order.
    struct Names {
        NumberColumn person;  // needed
        NumberColumn kind;    // a NameKind; full by default
        TextColumn text;      // needed
    } names;

    // Anything else for labels.
    struct Fields {
        NumberColumn person;  // needed
        TextColumn key;       // needed, not empty, each once for a person
        TextColumn text;      // needed
    } fields;
};

}  // namespace olvane
