// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ColumnBuilder.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// A table of a technology: its name, its columns, and what is said of these in its files.
struct TableLayout {
    using Properties = std::vector<std::pair<std::string, std::string>>;

    std::string name;
    std::size_t depth = 0; ///< how many rows of lists lead to its values
    std::vector<TableColumn> columns;
    Properties properties;

    /// Adds a column, and returns its index.
    std::size_t add(std::string_view column, StoredType type, ValueMeaning meaning = ValueMeaning::Plain);
    /// The index of the column of that name; `columns.size()` where there is none.
    [[nodiscard]] std::size_t find(std::string_view column) const;
};

/// The version of what tables and columns are called and mean.
inline constexpr std::string_view tableVersion = "2";

/// What each table begins with, so that their indices are the same everywhere.
struct CommonColumns {
    static constexpr std::size_t file = 0;      ///< the hash of the input
    static constexpr std::size_t message = 1;   ///< its number in the file
    static constexpr std::size_t time = 2;      ///< when it arrived
    static constexpr std::size_t modemTime = 3; ///< its own time stamp
    static constexpr std::size_t code = 4;      ///< the log code
    static constexpr std::size_t latitude = 5;  ///< where it arrived
    static constexpr std::size_t longitude = 6;
    static constexpr std::size_t count = 7;
};

/// Adds the columns of a place, and returns the index of the first.
std::size_t addPlace(TableLayout& table);

/// A table of messages, or of what they report, with the common columns and nothing else yet.
[[nodiscard]] TableLayout messageTable(std::string name, std::string_view technology);

/// As `messageTable`, with the numbers of the rows that lead to its values: "row", and "outer_row" where that
/// is in another list; and "row_key".
[[nodiscard]] TableLayout listTable(std::string name, std::string_view technology, std::size_t depth);

/// A leaf's column in the layouts of its technology.
struct LeafColumn {
    static constexpr std::size_t none = ~std::size_t{0};

    std::size_t table = none;
    std::size_t column = none; ///< of an enumeration: its text; its raw number follows
};

/// The tables of all leaves that the catalogue has.
struct TechnologyLayout {
    std::vector<TableLayout> tables;
    std::vector<LeafColumn> leaves; ///< by the leaf's index

    explicit TechnologyLayout(const Catalogue& catalogue);

private:
    void add(const CatalogueField& leaf, std::string_view technology);
    [[nodiscard]] std::size_t tableOf(const std::string& name, std::string_view technology,
                                      std::size_t depth);
};

} // namespace velmora
