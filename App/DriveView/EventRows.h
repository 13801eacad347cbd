// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Platform/Clock.h"
#include "Toolkit/Tables/GridView.h"

#include <array>
#include <cstddef>
#include <deque>
#include <string>
#include <vector>

namespace velmora {

/// Which severities are listed, by their number.
using SeverityFilter = std::array<bool, 3>;

[[nodiscard]] std::vector<GridColumn> eventColumns();
/// "handover: PCI 62 on EARFCN 6300 to PCI 17 on EARFCN 6300".
[[nodiscard]] std::string eventText(const Event& event);
/// The first events that the filter lets through, in their order, and which ones these are.
struct EventRows {
    std::vector<GridRow> rows;
    std::vector<Time> times; ///< of the rows
};
[[nodiscard]] EventRows eventRows(const std::deque<Event>& events, const SeverityFilter& filter,
                                  const Clock& clock, std::size_t most);

} // namespace velmora
