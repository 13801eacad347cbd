// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveIdentities.h"
#include "Telephony/Drives/PeriodicReport.h"
#include "Telephony/Drives/UTRAN/UTRANRecords.h"

#include <cstdint>
#include <optional>
#include <span>

namespace velmora {

/// The phone of the UTRAN scenario.
struct UTRANPhone {
    enum class Radio : std::uint8_t { Off, Searching, Camped };

    Radio radio = Radio::Off;
    std::optional<UTRANMeasurement> serving; ///< none unless it camps
    records::RRCState rrc = records::RRCState::Disconnected;
    DriveIdentities identities;
    bool registered = false;
    bool call = false;                        ///< of speech
    int contexts = 0;                         ///< active packet-data contexts
    CellArea registeredArea{{1, 1}, 4101, 1}; ///< its last registration

    /// Whether it has channels whose quality can be measured.
    [[nodiscard]] bool hasChannels() const {
        return rrc == records::RRCState::CellFACH || rrc == records::RRCState::CellDCH;
    }
};

/// What a report is made from.
struct UTRANReportContext {
    const UTRANPhone& phone;
    const UTRANNetwork& network;
    ScenarioRandom& random;
    bool binary = false;       ///< the form of the next property list; reports toggle it
    double worstErrorRate = 0; ///< of the blocks of all channels, in the latest report of their quality
};

using UTRANReport = PeriodicReport<UTRANReportContext>;

/// The reports of the phone's state: some ten messages a second.
[[nodiscard]] std::span<const UTRANReport> reportsOf(const UTRANPhone& phone);

/// The same records outside their period.
namespace utranReports {
[[nodiscard]] std::optional<RecordBuilder> rrc(UTRANReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> serving(UTRANReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> neighbours(UTRANReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> gsmNeighbours(UTRANReportContext& context);
/// Without channels one that says so, which empties both lists.
[[nodiscard]] std::optional<RecordBuilder> quality(UTRANReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> contexts(UTRANReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> sim(UTRANReportContext& context);
} // namespace utranReports

} // namespace velmora
