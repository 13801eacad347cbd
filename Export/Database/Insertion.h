// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Database/Database.h"
#include "Platform/Bytes.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

struct sqlite3_stmt;

namespace velmora {

/// A prepared statement that adds rows to a table. Values are added in the order of the columns; those that
/// are not added are NULL.
class Insertion {
public:
    /// `columns`: how many the table has. The database must outlive it, and `finish` comes after it.
    Insertion(Database& database, const std::string& table, int columns);

    Insertion& add(std::int64_t value);
    Insertion& add(double value);
    Insertion& add(std::string_view text);
    Insertion& add(Bytes bytes);
    Insertion& addNull();
    /// The text, or NULL for an empty one.
    Insertion& addUnlessEmpty(std::string_view text) { return text.empty() ? addNull() : add(text); }
    template <class Value>
    Insertion& add(const std::optional<Value>& value) {
        return value ? add(*value) : addNull();
    }
    /// Adds the row; the next one begins.
    void done();

private:
    struct Finalize {
        void operator()(sqlite3_stmt* statement) const;
    };

    Database& _database;
    std::unique_ptr<sqlite3_stmt, Finalize> _statement;
    int _column = 0;
};

} // namespace velmora
