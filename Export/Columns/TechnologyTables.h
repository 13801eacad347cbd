// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Position.h"
#include "Export/Columns/OtherFields.h"
#include "Export/Columns/TableOutputs.h"
#include "Export/Columns/TableWriter.h"
#include "Export/Columns/TechnologyEvents.h"
#include "LogGenerator/Observations/Observation.h"

#include <cstddef>
#include <cstdint>
#include <deque>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// The message that is being decoded.
struct CurrentMessage {
    std::uint64_t number = 0; ///< in the file, from 1; 0 for none
    Time arrival{};
    std::size_t size = 0;                  ///< in bytes
    std::optional<Position> position = {}; ///< where it arrived
    bool isObserved = false;               ///< what it reported is in the tables
    std::size_t textBytes = 0;             ///< of texts that have been added since this was set to 0
};

/// The tables of one technology of an input: "messages", one for each section and list of its catalogue,
/// "other_fields" for what these have no column for, "events", and "files".
class TechnologyTables final : public ObservationSink {
public:
    /// All arguments but `file` and `rules` must outlive it. `message`: the one that is being decoded.
    TechnologyTables(const Catalogue& catalogue, const RuleSet& rules, const std::string& file,
                     CurrentMessage& message, TableOutputs& outputs, PageCompressor& compressor);

    void observed(const ObservedMessage& message) override;
    /// The current message could not be decoded.
    void addUndecoded();

    [[nodiscard]] const std::string& technology() const { return _technology; }
    [[nodiscard]] std::deque<TableWriter>& tables() { return _tables; }
    [[nodiscard]] const std::deque<TableWriter>& tables() const { return _tables; }
    [[nodiscard]] TechnologyEvents& events() { return _events; }
    [[nodiscard]] const TechnologyEvents& events() const { return _events; }

    /// What the table "files" says of its messages.
    struct Summary {
        std::uint64_t messages = 0;
        std::uint64_t undecoded = 0;
        std::optional<Time> first = {};
        std::optional<Time> last = {};
    };
    [[nodiscard]] const Summary& summary() const { return _summary; }

private:
    void addMessage(const RowContext& context, bool isDecoded);
    void add(const RowContext& context, const Observation& observation);
    void set(TableWriter& table, std::size_t column, const Observation& observation);
    void setEnumeration(ColumnBuilder& column, std::uint32_t row, const Observation& observation);
    void setText(TableWriter& table, std::size_t column, std::string_view text);
    [[nodiscard]] RowContext contextOf(const ObservedMessage& message) const;

    std::string _technology;
    TechnologyLayout _layout;
    CurrentMessage& _message;
    std::deque<TableWriter> _tables; ///< in the layout's order, then the messages, then the other fields
    TableWriter* _messages;
    std::optional<OtherFields> _others;
    TechnologyEvents _events;
    Summary _summary;
    ObservedText _text;
    std::string _storage;
};

} // namespace velmora
