// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace velmora {

class WantedLeaves;

/// Where a section's fields and lists are in the catalogue.
class FieldMap {
public:
    /// A field in a list (null: in none) and a leaf that shows it.
    struct Entry {
        const List* list;
        const Field* field;
        Catalogue::Node* node;
        const CatalogueSource* source;
        ObservedKind kind;
        double scale; ///< physical value = shown value * scale + offset
        double offset;
    };
    /// What is read of a record by a table: the same of one of its fields, once for all records.
    struct TableEntry {
        Place place;
        bool hasSpecial;
        ObservedKind kind;
        bool isLine; ///< the shown value is the raw one times `shownScale` plus `shownOffset`
        std::int64_t specialValue;
        double shownScale;
        double shownOffset;
        double scale;
        double offset;
        const CatalogueField* leaf;
        const CatalogueSource* source;
        const Field* field;
    };
    /// A list and a place that shows it.
    struct ListEntry {
        const List* outer;
        const List* list;
        Catalogue::Node* node;
    };

    FieldMap() = default;
    FieldMap(Catalogue& catalogue, std::string section)
        : _catalogue(&catalogue), _section(std::move(section)) {}

    [[nodiscard]] Catalogue& catalogue() const { return *_catalogue; }
    [[nodiscard]] const std::string& section() const { return _section; }

    void add(const Entry& entry) { _entries.push_back(entry); }
    void add(const ListEntry& entry) {
        _lists.push_back(entry);
        _wantedLists.push_back(entry);
    }
    /// When the section's latest record arrived, since its records are observed; absent where none has.
    [[nodiscard]] const std::optional<Time>& latestRecord() const { return _latestRecord; }
    void setLatestRecord(Time arrival) const { _latestRecord = arrival; }

    /// Call it when all have been added, before anything is looked up.
    void sort();
    /// From now on only what shows a wanted leaf is found. By default all is.
    void setWanted(const WantedLeaves& wanted);

    /// All that show a wanted leaf.
    [[nodiscard]] std::span<const Entry> entries() const { return _wanted; }
    [[nodiscard]] bool isEmpty() const { return _wanted.empty() && _wantedLists.empty(); }
    /// Whether records of that code may report a wanted leaf or a list of them.
    [[nodiscard]] bool hasCode(std::uint32_t code) const {
        return !_codes || std::binary_search(_codes->begin(), _codes->end(), code);
    }
    /// The leaves that show the field; most have one. Fields are looked up fastest in the order of their
    /// tables.
    [[nodiscard]] std::span<const Entry> find(const List* list, const Field& field) const;
    /// The same for all fields of a table, in its order, as far as records of that code show them. They are
    /// looked up once.
    [[nodiscard]] std::span<const TableEntry> findAll(const List* list, const Layout& layout,
                                                      std::uint32_t code) const {
        for (const Table& table : _tables)
            if (table.fields.data() == layout.fields.data() && table.list == list && table.code == code &&
                table.fields.size() == layout.fields.size())
                return table.entries;
        return addTable(list, layout, code);
    }
    /// The leaf of that label in the section's own dictionary; null for none.
    [[nodiscard]] const CatalogueField* leafOf(std::string_view label) const;
    [[nodiscard]] std::span<const ListEntry> findList(const List* outer, const List& list) const;

private:
    /// What `findAll` has found.
    struct Table {
        const List* list;
        std::span<const Field> fields;
        std::uint32_t code;
        std::vector<TableEntry> entries;
    };
    [[nodiscard]] std::vector<std::uint32_t> wantedCodes() const;
    std::span<const TableEntry> addTable(const List* list, const Layout& layout, std::uint32_t code) const;

    Catalogue* _catalogue = nullptr;
    std::string _section;
    std::vector<Entry> _entries; ///< by list and field
    std::vector<ListEntry> _lists;
    std::vector<Entry> _wanted; ///< of the entries, in their order
    std::vector<ListEntry> _wantedLists;
    std::optional<std::vector<std::uint32_t>> _codes; ///< of what is wanted, in order; absent: any
    mutable std::vector<Table> _tables;
    mutable std::optional<Time> _latestRecord; ///< no part of what the map says of the section
    mutable std::size_t _expected = 0;         ///< the entry that follows the one found last
};

} // namespace velmora
