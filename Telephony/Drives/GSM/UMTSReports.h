// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/GSM/GSMReports.h"

#include <optional>
#include <vector>

/// The reports of the UMTS side; see GSMReport.
namespace velmora::umtsReports {

/// The cells but the serving one, the best `limit` of them.
[[nodiscard]] std::vector<UMTSMeasurement> neighbours(const GSMReportContext& context, std::size_t limit);

[[nodiscard]] std::optional<RecordBuilder> rankedCells(GSMReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> searcher(GSMReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> rrc(GSMReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> servingCell(GSMReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> security(GSMReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> transmitPower(GSMReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> blockErrors(GSMReportContext& context);
/// Only while a packet session is on a dedicated channel.
[[nodiscard]] std::optional<RecordBuilder> hsdpa(GSMReportContext& context);

} // namespace velmora::umtsReports
