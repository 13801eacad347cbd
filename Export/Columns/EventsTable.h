// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Export/Columns/DecimalDegrees.h"
#include "Export/Columns/InputTable.h"

#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The table of what happened in an input, a row for each event. The fields that events of several kinds have
/// are columns; what else rules say is one text.
class EventsTable {
public:
    EventsTable(std::string_view technology, std::string file, ByteSink& sink, PageCompressor& compressor);

    /// Adds a row. `place`: where the event happened or began.
    void add(const Event& event, const std::optional<DecimalDegrees>& place);
    [[nodiscard]] InputTable& table() { return _table; }
    [[nodiscard]] const InputTable& table() const { return _table; }

    [[nodiscard]] static TableLayout layout(std::string_view technology);

private:
    /// Whether there is a column for it.
    [[nodiscard]] bool set(const EventField& field);
    void setValue(const EventField& value);

    InputTable _table;
};

} // namespace velmora
