// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// sqlite_family FILE ID: two queries fill the table of a family, and the engine lays out one of its persons.

#include <sqlite3.h>

#include <cstdlib>
#include <exception>
#include <iostream>
#include <memory>
#include <stdexcept>
#include <string>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/kin/FamilyDataSource.h>

#include "FamilyRows.h"

namespace {

struct Close {
    void operator()(sqlite3* database) const { sqlite3_close(database); }
    void operator()(sqlite3_stmt* query) const { sqlite3_finalize(query); }
};
typedef std::unique_ptr<sqlite3, Close> Database;
typedef std::unique_ptr<sqlite3_stmt, Close> Query;

Database open(const char* file) {
    sqlite3* opened = nullptr;
    const int status = sqlite3_open_v2(file, &opened, SQLITE_OPEN_READONLY, nullptr);
    Database database(opened);
    if (status != SQLITE_OK) throw std::runtime_error(sqlite3_errmsg(opened));
    return database;
}

// NULL is 0, and the empty text.
std::int64_t number(sqlite3_stmt* row, int column) {
    return sqlite3_column_int64(row, column);
}

std::string_view text(sqlite3_stmt* row, int column) {
    const auto* const bytes = reinterpret_cast<const char*>(sqlite3_column_text(row, column));
    return {bytes == nullptr ? "" : bytes, static_cast<std::size_t>(sqlite3_column_bytes(row, column))};
}

template <class AddRow>
void forEachRow(sqlite3* database, const char* sql, const AddRow& addRow) {
    sqlite3_stmt* prepared = nullptr;
    if (sqlite3_prepare_v2(database, sql, -1, &prepared, nullptr) != SQLITE_OK) {
        throw std::runtime_error(sqlite3_errmsg(database));
    }
    const Query query(prepared);
    int status = SQLITE_ROW;
    while ((status = sqlite3_step(prepared)) == SQLITE_ROW) addRow(prepared);
    if (status != SQLITE_DONE) throw std::runtime_error(sqlite3_errmsg(database));
}

olvane::Family familyFrom(sqlite3* database) {
    FamilyRows rows;
    forEachRow(database,
               "SELECT id, father, mother, sex, dead, birth, death, name FROM person ORDER BY birth, id",
               [&rows](sqlite3_stmt* row) {
                   rows.addPerson(number(row, 0), number(row, 1), number(row, 2), text(row, 3),
                                  number(row, 4) != 0, text(row, 5), text(row, 6), text(row, 7));
               });
    forEachRow(database, "SELECT id, husband, wife, state, day FROM couple ORDER BY day, id",
               [&rows](sqlite3_stmt* row) {
                   rows.addCouple(number(row, 0), number(row, 1), number(row, 2), text(row, 3), text(row, 4));
               });
    return rows.family();
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::cerr << "usage: sqlite_family FILE ID\n";
        return 2;
    }
    try {
        const Database database = open(argv[1]);
        const auto family = std::make_shared<olvane::FamilyDataSource>(familyFrom(database.get()));
        std::cout << FamilyViewLayout(argv[2], family) << "\n";
    } catch (const std::exception& error) {
        std::cerr << "sqlite_family: " << error.what() << "\n";
        return 1;
    }
    return 0;
}
