// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Export/Database/Insertion.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/Observation.h"
#include "Platform/Clock.h"
#include "Platform/Fix.h"

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The tables of a recording in an SQLite database: messages, samples, catalogue, events and positions. The
/// layout is that of Documentation/database.md. What could not be written is in the database's failure.
class RecordingDatabase {
public:
    /// A row of the table of messages.
    struct Message {
        std::uint64_t number; ///< in the file, from 1
        Time time;
        std::optional<Time> modemTime;
        std::string_view technology;
        std::optional<std::uint32_t> code;
        std::string_view damage;  ///< empty for none
        std::string_view channel; ///< serving, as it was reported last; empty before
        std::string_view cell;
    };

    /// The database is empty and must outlive it.
    explicit RecordingDatabase(Database& database);

    void add(const Message& message);
    /// A value of the message of that number. The catalogue is that of the technology.
    void add(std::uint64_t message, const std::string& technology, const Observation& observation);
    void add(const Event& event);
    void add(const Fix& fix);
    /// Makes the indexes and views, when all has been added.
    void finish();

private:
    /// The number of the leaf in the table of the catalogue, to which it is added when it is first used.
    std::int64_t numberOf(const std::string& technology, const CatalogueField& leaf);

    Database& _database;
    Insertion _messages;
    Insertion _samples;
    Insertion _catalogue;
    Insertion _events;
    Insertion _positions;
    std::map<const CatalogueField*, std::int64_t> _leaves;
    ObservedText _texts;
    std::string _rows;
};

} // namespace velmora
