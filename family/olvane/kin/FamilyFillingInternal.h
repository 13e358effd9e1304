// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include <olvane/kin/Family.h>
#include <olvane/kin/FamilyChecksInternal.h>
#include <olvane/kin/FamilyStateInternal.h>

namespace olvane {

using detail::RowPlace;
using detail::StoredFamily;
using detail::StoredPerson;

// Entries that belong to rows, as lists: those of row r are order[start[r]] to order[start[r + 1] - 1].
struct GroupedRows {
    std::vector<std::uint32_t> start;
    std::vector<std::uint32_t> order;

    GroupedRows(std::size_t rows, const std::vector<std::uint32_t>& rowOfEntry)
        : start(rows + 1, 0), order(rowOfEntry.size()) {
        for (const std::uint32_t row : rowOfEntry) ++start[row + 1];
        for (std::size_t row = 0; row < rows; ++row) start[row + 1] += start[row];
        std::vector<std::uint32_t> next(start.begin(), start.end() - 1);
        for (std::size_t entry = 0; entry < rowOfEntry.size(); ++entry) {
            order[next[rowOfEntry[entry]]++] = static_cast<std::uint32_t>(entry);
        }
    }
    std::span<const std::uint32_t> of(std::size_t row) const {
        return std::span(order).subspan(start[row], start[row + 1] - start[row]);
    }
};

// Whose list has whom, in the order of the lists.
struct ListPairs {
    std::vector<std::uint32_t> ownerRow;
    std::vector<FamilyId> listed;

    void add(std::uint32_t row, FamilyId id) {
        ownerRow.push_back(row);
        listed.push_back(id);
    }
};

// The rows of one list of the columns; a column in it has as many.
class ColumnRows {
public:
    ColumnRows(FamilyTable table, const NumberColumn& key, std::string_view keyField)
        : table_(table), size_(key.size()), keyField_(keyField), keyIsGiven_(key.isGiven()) {}

    bool isGiven() const { return keyIsGiven_; }
    std::size_t size() const { return size_; }
    RowPlace place(std::size_t row) const { return {table_, row, 0}; }

    template <class Column>
    void check(const Column& column, std::string_view field, bool isNeeded = false) const {
        const RowPlace place{table_};
        if (!column.isGiven()) {
            if (isNeeded && (size_ > 0 || keyIsGiven_)) place.fail(field, "the column is missing");
            return;
        }
        if (!keyIsGiven_) place.fail(keyField_, "the column is missing");
        if (column.size() != size_) {
            place.fail(field, "the column has " + std::to_string(column.size()) + " rows, and " +
                                  std::string(keyField_) + " has " + std::to_string(size_));
        }
    }

    std::int64_t number(const NumberColumn& column, std::size_t row, std::string_view field,
                        std::int64_t otherwise = 0) const {
        if (!column.isGiven()) return otherwise;
        const std::optional<std::int64_t> number = column.at(row);
        if (!number) place(row).fail(field, "the number is not whole");
        return *number;
    }
    std::string_view text(const TextColumn& column, std::size_t row, std::string_view field) const {
        if (!column.isGiven()) return {};
        const std::optional<std::string_view> text = column.at(row);
        if (!text) place(row).fail(field, "the starts of the texts are not in order");
        detail::checkText(place(row), field, *text);
        return *text;
    }

private:
    FamilyTable table_;
    std::size_t size_;
    std::string_view keyField_;
    bool keyIsGiven_;
};

// Fills an empty state from columns. Used for one run() only.
//
// Fails: FamilyError with the list, the row and the column that are wrong; the state is then half filled.
class FamilyFilling {
public:
    FamilyFilling(Family::State& state, const FamilyColumns& columns) : state_(state), columns_(columns) {}

    void run() {
        addPersons();
        checkParents();
        addFamilies();
        addFamilyChildren();
        addSpouses();
        addChildren();
        addNames();
        addFields();
    }

private:
    void addPersons();
    void addPerson(const ColumnRows& table, std::size_t row);
    void checkParents();
    void addFamilies();

    // FamilyFillingLists.cpp
    struct ChildEntries {
        std::vector<std::uint32_t> familyRow;
        std::vector<FamilyId> child;
        std::string kind;
    };
    void addFamilyChildren();
    ChildEntries childEntries(const ColumnRows& table);
    void storeFamilyChildren(const ColumnRows& table, const ChildEntries& entries, std::size_t family,
                             std::span<const std::uint32_t> rows);
    void addSpouses();
    void addPreferred(const ColumnRows& table);
    void addChildren();
    void addNames();
    void addFields();
    void storeFields(const ColumnRows& table, const std::vector<std::uint32_t>& keys, std::size_t person,
                     std::span<const std::uint32_t> rows);
    std::uint32_t keyNumber(const RowPlace& place, std::string_view key);

    FamilyId personId(const ColumnRows& table, const NumberColumn& column, std::size_t row,
                      std::string_view field, bool mayBeNobody);
    std::uint32_t personRow(const ColumnRows& table, const NumberColumn& column, std::size_t row,
                            std::string_view field) {
        return state_.personRow(personId(table, column, row, field, false));
    }
    detail::Reference writtenDate(std::string_view written, std::string_view sorting,
                                  detail::Reference sortingPlace);
    void pairsOfFamilies(ListPairs& spouses, ListPairs& children) const;
    void storeLists(const ListPairs& pairs, detail::Reference StoredPerson::*list, const ColumnRows* table,
                    std::string_view field);

    Family::State& state_;
    const FamilyColumns& columns_;
    std::unordered_map<std::string, std::uint32_t> keyNumbers_;
    // Used again for each row, so that few are allocated.
    std::vector<FamilyId> ids_;
    std::string packed_;
    std::vector<std::size_t> repeats_;
};

}  // namespace olvane
