// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace velmora {

class DriveReport;
class Markup;

/// All events that are kept as JSON, column by column.
void writeEventsData(Markup& out, const DriveReport& report, std::int64_t base_ms);

} // namespace velmora
