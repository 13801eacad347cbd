// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Database/Insertion.h"

#include <sqlite3.h>

namespace velmora {

namespace {

std::string statementFor(const std::string& table, int columns) {
    std::string text = "INSERT INTO " + table + " VALUES (?";
    for (int i = 1; i < columns; ++i)
        text += ", ?";
    return text + ")";
}

} // namespace

void Insertion::Finalize::operator()(sqlite3_stmt* statement) const {
    static_cast<void>(sqlite3_finalize(statement));
}

Insertion::Insertion(Database& database, const std::string& table, int columns) : _database(database) {
    sqlite3_stmt* statement = nullptr;
    if (!database.failure() && sqlite3_prepare_v2(database.handle(), statementFor(table, columns).c_str(), -1,
                                                  &statement, nullptr) != SQLITE_OK)
        database.fail();
    _statement.reset(statement);
}

Insertion& Insertion::add(std::int64_t value) {
    if (sqlite3_bind_int64(_statement.get(), ++_column, value) != SQLITE_OK)
        _database.fail();
    return *this;
}

Insertion& Insertion::add(double value) {
    if (sqlite3_bind_double(_statement.get(), ++_column, value) != SQLITE_OK)
        _database.fail();
    return *this;
}

Insertion& Insertion::add(std::string_view text) {
    if (sqlite3_bind_text64(_statement.get(), ++_column, text.data() ? text.data() : "", text.size(),
                            SQLITE_TRANSIENT, SQLITE_UTF8) != SQLITE_OK)
        _database.fail();
    return *this;
}

Insertion& Insertion::add(Bytes bytes) {
    // A blob of no address would be NULL.
    static constexpr char none = 0;
    if (sqlite3_bind_blob64(_statement.get(), ++_column,
                            bytes.empty() ? static_cast<const void*>(&none) : bytes.data(), bytes.size(),
                            SQLITE_TRANSIENT) != SQLITE_OK)
        _database.fail();
    return *this;
}

Insertion& Insertion::addNull() {
    ++_column; // as bindings are, once they are cleared
    return *this;
}

void Insertion::done() {
    _column = 0;
    if (_database.failure())
        return;
    if (sqlite3_step(_statement.get()) != SQLITE_DONE)
        _database.fail();
    static_cast<void>(sqlite3_reset(_statement.get()));
    static_cast<void>(sqlite3_clear_bindings(_statement.get()));
}

} // namespace velmora
