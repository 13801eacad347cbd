// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/GSM/GSMPhone.h"
#include "Telephony/Drives/PeriodicReport.h"

#include <cstdint>
#include <optional>
#include <span>

namespace velmora {

/// The input of a report. The counters continue from report to report, as a modem's do.
struct GSMReportContext {
    const GSMPhone& phone;
    const RadioNetwork& network;
    ScenarioRandom& random;
    bool binary = false;        ///< the form of the next property list; reports toggle it
    std::int64_t crcs = 0;      ///< transport blocks so far
    std::int64_t crcErrors = 0; ///< those that came wrong
    bool isRankedUMTS = false;  ///< whether the last ranked list was of UMTS
    int subFrames = 0;          ///< HSDPA sub-frames so far, modulo 1024
};

using GSMReport = PeriodicReport<GSMReportContext>;

/// The reports of the phone's state: some twenty messages a second.
[[nodiscard]] std::span<const GSMReport> reportsOf(const GSMPhone& phone);

/// The same records outside their period, as parts of unusual messages.
[[nodiscard]] std::optional<RecordBuilder> gsmMeasurementReport(GSMReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> registrationReport(GSMReportContext& context);

} // namespace velmora
