// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveIdentities.h"
#include "Telephony/Drives/LTE/LTERecords.h"
#include "Telephony/Drives/PeriodicReport.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

namespace velmora {

/// The phone of the LTE scenario.
struct LTEPhone {
    enum class Radio : std::uint8_t { Off, Searching, Camped };

    Radio radio = Radio::Off;
    DriveIdentities identities;
    bool connected = false;
    std::size_t carrier = 0;               ///< on which it is or searches; index into `lteCarriers`
    std::optional<LTEMeasurement> serving; ///< none unless it camps
    LTEMeasurement average;                ///< of the serving cell's last measurements
    int cyclesBelow = 0; ///< measurements since the serving cell was good enough, at most 63
    int contexts = 0;    ///< active packet-data contexts
    CellArea registeredArea{{1, 1}, 7101, 1}; ///< its last registration
};

/// What a report is made from.
struct LTEReportContext {
    const LTEPhone& phone;
    const LTENetwork& network;
    ScenarioRandom& random;
    bool binary = false;        ///< the form of the next property list; reports toggle it
    std::size_t neighbours = 0; ///< neighbour reports so far
    std::size_t candidates = 0; ///< candidate reports so far
    int subframe = 0;           ///< of 1024 frames of ten
};

using LTEReport = PeriodicReport<LTEReportContext>;

/// The reports of the phone's state: some six to eight messages a second.
[[nodiscard]] std::span<const LTEReport> reportsOf(const LTEPhone& phone);

/// The same records outside their period.
namespace lteReports {
[[nodiscard]] std::optional<RecordBuilder> servingCell(LTEReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> antennas(LTEReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> intraFrequency(LTEReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> idleMeasurement(LTEReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> neighbours(LTEReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> candidates(LTEReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> contexts(LTEReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> sim(LTEReportContext& context);
} // namespace lteReports

} // namespace velmora
