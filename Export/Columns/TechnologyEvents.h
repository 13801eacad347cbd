// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/EventEngine.h"
#include "Analysis/Events/EventSink.h"
#include "Analysis/Rules/RuleSet.h"
#include "Export/Columns/EventsTable.h"
#include "Export/Columns/RecentPlaces.h"

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {

/// Makes the events of one technology of an input, and writes their table, in the order in which they become
/// known.
class TechnologyEvents final : private EventSink {
public:
    /// Catalogue, sink and compressor must outlive it.
    TechnologyEvents(const Catalogue& catalogue, const RuleSet& rules, const std::string& file,
                     ByteSink& sink, PageCompressor& compressor);

    /// The next message: its number in the input, and where it arrived.
    void report(const ObservedMessage& message, std::uint64_t number,
                const std::optional<DecimalDegrees>& place);
    /// As EventEngine has them.
    void noted(std::uint64_t message, std::string_view text) { _engine.noted({0, message}, text); }
    void damaged(std::uint64_t message, std::string_view reason) { _engine.damaged({0, message}, reason); }
    /// There are no more messages.
    Result<Done> finish();

    [[nodiscard]] InputTable& table() { return _table.table(); }
    [[nodiscard]] std::uint64_t rows() const { return _table.table().rows(); }

private:
    using Key = std::pair<Time, std::string>;

    void began(const Event& event) override;
    void happened(const Event& event) override;

    EventsTable _table;
    RecentPlaces _places;
    std::map<Key, DecimalDegrees> _begun; ///< of what lasts: time and kind, and where it began
    EventEngine _engine;
};

} // namespace velmora
