// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// postgresql_family CONNECTION ID: two queries fill the table of a family, and the engine lays out one of its persons.
// CONNECTION is as libpq reads it: "dbname=tree" or "postgresql://host/tree"; empty for what the environment says.

#include <libpq-fe.h>

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
    void operator()(PGconn* connection) const { PQfinish(connection); }
    void operator()(PGresult* result) const { PQclear(result); }
};
typedef std::unique_ptr<PGconn, Close> Connection;
typedef std::unique_ptr<PGresult, Close> Result;

Connection connect(const char* where) {
    Connection connection(PQconnectdb(where));
    if (PQstatus(connection.get()) != CONNECTION_OK)
        throw std::runtime_error(PQerrorMessage(connection.get()));
    return connection;
}

Result select(PGconn* connection, const char* sql) {
    Result result(PQexec(connection, sql));
    if (PQresultStatus(result.get()) != PGRES_TUPLES_OK) throw std::runtime_error(PQerrorMessage(connection));
    return result;
}

// NULL is 0, and the empty text.
std::int64_t number(const PGresult* result, int row, int column) {
    return std::strtoll(PQgetvalue(result, row, column), nullptr, 10);
}

std::string_view text(const PGresult* result, int row, int column) {
    return {PQgetvalue(result, row, column), static_cast<std::size_t>(PQgetlength(result, row, column))};
}

olvane::Family familyFrom(PGconn* connection) {
    FamilyRows rows;
    const Result persons = select(connection,
                                  "SELECT id, father, mother, sex, dead, birth, death, name FROM person"
                                  " ORDER BY birth NULLS FIRST, id");
    for (int row = 0; row < PQntuples(persons.get()); ++row) {
        const PGresult* const from = persons.get();
        rows.addPerson(number(from, row, 0), number(from, row, 1), number(from, row, 2), text(from, row, 3),
                       number(from, row, 4) != 0, text(from, row, 5), text(from, row, 6), text(from, row, 7));
    }
    const Result couples =
        select(connection, "SELECT id, husband, wife, state, day FROM couple ORDER BY day NULLS FIRST, id");
    for (int row = 0; row < PQntuples(couples.get()); ++row) {
        const PGresult* const from = couples.get();
        rows.addCouple(number(from, row, 0), number(from, row, 1), number(from, row, 2), text(from, row, 3),
                       text(from, row, 4));
    }
    return rows.family();
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::cerr << "usage: postgresql_family CONNECTION ID\n";
        return 2;
    }
    try {
        const Connection connection = connect(argv[1]);
        const auto family = std::make_shared<olvane::FamilyDataSource>(familyFrom(connection.get()));
        std::cout << FamilyViewLayout(argv[2], family) << "\n";
    } catch (const std::exception& error) {
        std::cerr << "postgresql_family: " << error.what() << "\n";
        return 1;
    }
    return 0;
}
