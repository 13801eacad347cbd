// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <optional>
#include <string>

struct sqlite3;

namespace velmora {

/// An SQLite database that is being made: a file that no other program knows yet, so that it has no journal,
/// and one transaction from the first statement to `finish`. The first failure is kept, and nothing is done
/// after it.
class Database {
public:
    /// An empty file, or one that is made. The reason of a failure is ready to follow "file: ".
    [[nodiscard]] static Result<Database> create(const std::string& path);
    Database(Database&& other) noexcept;
    Database& operator=(Database&&) = delete;
    ~Database();

    /// Runs statements that return nothing.
    void run(const std::string& statements);
    /// Ends the transaction and closes the database.
    [[nodiscard]] Result<Done> finish();

    /// Why nothing is done any more; absent where all was well.
    [[nodiscard]] const std::optional<std::string>& failure() const { return _failure; }
    /// Keeps the failure that the database reports now.
    void fail();
    [[nodiscard]] sqlite3* handle() const { return _handle; }

private:
    explicit Database(sqlite3* handle) : _handle(handle) {}

    sqlite3* _handle;
    std::optional<std::string> _failure;
};

} // namespace velmora
