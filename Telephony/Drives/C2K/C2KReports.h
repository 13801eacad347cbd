// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/C2K/C2KRecords.h"
#include "Telephony/Drives/PeriodicReport.h"
#include "Telephony/Drives/UnusualMessages.h"

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace velmora {

/// The phone of the CDMA2000 scenario: where it camps and what its two radios do. The scenario's script
/// changes it, reports show it.
struct C2KPhone {
    records::OneXState oneX = records::OneXState::Inactive;
    records::EVDOState evdo = records::EVDOState::Inactive;
    records::EVDOSession session = records::EVDOSession::Closed;
    int uati = 0;
    std::optional<C2KPilot> serving; ///< none before a pilot has been acquired

    [[nodiscard]] bool inTraffic() const { return oneX == records::OneXState::Traffic; }
    [[nodiscard]] bool onPacketData() const { return evdo == records::EVDOState::Connected; }
};

/// The input of a report. The counters continue from report to report, as a modem's do.
struct C2KReportContext {
    const C2KPhone& phone;
    const C2KNetwork& network;
    ScenarioRandom& random;
    double now = 0; ///< seconds from the start
    records::ForwardPackets forward{};
    records::ReversePackets reverse{};
    double forwardRest_bits = 0; ///< what has not filled a packet yet
    double reverseRest_bits = 0;
    /// The 1x state as its latest report has it: the receiver sleeps between two pages.
    records::OneXState receiver = records::OneXState::Inactive;
    bool isFrameErased = false; ///< the latest frame of a call
    bool isStalled = false;     ///< no packet arrives, whatever is sent

    /// The serving pilot and those of its carrier that are close enough to be in the active set.
    [[nodiscard]] std::vector<C2KPilot> activeSet(std::size_t limit) const;
    /// Counts the packets up to that second, which is then now.
    void transferUntil(double at);
};

using C2KReport = PeriodicReport<C2KReportContext>;

/// The reports of the phone's state: some ten messages a second, twenty in a call.
[[nodiscard]] std::span<const C2KReport> c2kReports();

/// The same records outside their period, for code that changes what they report.
[[nodiscard]] std::optional<RecordBuilder> oneXStatusReport(C2KReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> evdoStatusReport(C2KReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> systemReport(C2KReportContext& context);

/// The parts of unusual messages; `turn` selects which record is too short and which is inconsistent.
[[nodiscard]] UnusualMessageParts c2kUnusualMessageParts(C2KReportContext& context, std::size_t turn);

} // namespace velmora
