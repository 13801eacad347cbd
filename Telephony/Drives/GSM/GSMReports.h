// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/GSM/GSMPhone.h"
#include "Telephony/Drives/PeriodicReport.h"

#include <cstdint>
#include <optional>
#include <span>

namespace velmora {

/// What a report is made from. The counters keep what a modem counts from report to report.
struct GSMReportContext {
    const GSMPhone& phone;
    const RadioNetwork& network;
    ScenarioRandom& random;
    bool binary = false;        ///< the form of the next property list; reports turn it over
    std::int64_t crcs = 0;      ///< transport blocks so far
    std::int64_t crcErrors = 0; ///< those that came wrong
    int subFrames = 0;          ///< HSDPA sub-frames so far, modulo 1024
};

using GSMReport = PeriodicReport<GSMReportContext>;

/// The reports of the phone's state: some twenty messages a second.
[[nodiscard]] std::span<const GSMReport> reportsOf(const GSMPhone& phone);

/// The same records out of turn, for whoever wants one to spoil.
[[nodiscard]] std::optional<RecordBuilder> gsmMeasurementReport(GSMReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> registrationReport(GSMReportContext& context);

} // namespace velmora
