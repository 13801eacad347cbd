// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Modem/ModemPhone.h"
#include "Telephony/Drives/PeriodicReport.h"

#include <optional>
#include <span>

namespace velmora {

using ModemReport = PeriodicReport<ModemReportContext>;

/// The reports of the modem's state: two to three messages a second of a modem that works.
[[nodiscard]] std::span<const ModemReport> reportsOf(const ModemPhone& phone);
/// A message of each code, as after a change of the modem itself.
[[nodiscard]] std::span<const ModemReport> allModemReports();

/// Reports outside their period; those of cells and link are in ModemCellReports.h.
namespace modemReports {
[[nodiscard]] std::optional<RecordBuilder> sim(ModemReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> contexts(ModemReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> registration(ModemReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> traffic(ModemReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> modem(ModemReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> position(ModemReportContext& context);
} // namespace modemReports

} // namespace velmora
