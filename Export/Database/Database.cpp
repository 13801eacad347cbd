// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Database/Database.h"

#include <cerrno>
#include <cstring>
#include <utility>

#include <sqlite3.h>

namespace velmora {

namespace {

/// The system's reason, where it has one: "No space left on device".
std::string reasonOf(sqlite3* handle) {
    if (!handle)
        return "not enough memory";
    // SQLite has no number of the system's for this one.
    if (sqlite3_errcode(handle) == SQLITE_FULL)
        return std::strerror(ENOSPC);
    if (const int number = sqlite3_system_errno(handle);
        number != 0 &&
        (sqlite3_errcode(handle) == SQLITE_IOERR || sqlite3_errcode(handle) == SQLITE_CANTOPEN))
        return std::strerror(number);
    return sqlite3_errmsg(handle);
}

} // namespace

Result<Database> Database::create(const std::string& path) {
    sqlite3* handle = nullptr;
    const int flags = SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE | SQLITE_OPEN_NOMUTEX;
    const int status = sqlite3_open_v2(path.c_str(), &handle, flags, nullptr);
    Database database(handle);
    if (status != SQLITE_OK)
        return Failure{reasonOf(handle)};
    // The file is discarded where it does not become complete: nothing has to be restored in it.
    database.run("PRAGMA journal_mode=OFF; PRAGMA synchronous=OFF; PRAGMA locking_mode=EXCLUSIVE;"
                 "PRAGMA temp_store=FILE; BEGIN");
    if (database.failure())
        return Failure{*database.failure()};
    return database;
}

Database::Database(Database&& other) noexcept
    : _handle(std::exchange(other._handle, nullptr)), _failure(std::move(other._failure)) {}

Database::~Database() {
    static_cast<void>(sqlite3_close_v2(_handle));
}

void Database::run(const std::string& statements) {
    if (!_failure && sqlite3_exec(_handle, statements.c_str(), nullptr, nullptr, nullptr) != SQLITE_OK)
        fail();
}

void Database::fail() {
    if (!_failure)
        _failure = reasonOf(_handle);
}

Result<Done> Database::finish() {
    run("COMMIT");
    if (_failure)
        return Failure{*_failure};
    if (sqlite3_close(std::exchange(_handle, nullptr)) != SQLITE_OK)
        return Failure{"the database cannot be closed"};
    return Done{};
}

} // namespace velmora
