// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LiveModem.h"
#include "Telephony/Drives/DriveIdentities.h"
#include "Telephony/Drives/Modem/ModemCell.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Values of ModemManager's enumerations that the drive goes through; the numbers are on its bus.
namespace MM {
enum class State : std::int8_t {
    Failed = -1,
    Initializing = 1,
    Locked = 2,
    Disabled = 3,
    Enabling = 5,
    Searching = 7,
    Registered = 8,
    Connected = 11,
};
enum class Registration : std::uint8_t { Idle = 0, Home = 1, Searching = 2, Denied = 3, Roaming = 5 };
} // namespace MM

/// A bearer of the modem and its traffic.
struct ModemBearer {
    int number = 0;      ///< ModemManager's; 1 is that of the attachment
    bool isIPv6 = false; ///< alone, for messages; the other one has both versions
    bool isConnected = false;
    bool isSuspended = false;
    std::string error;       ///< why it failed, in ModemManager's words
    double start_s = 0;      ///< of the connection
    double downlink_bps = 0; ///< what flows now
    double uplink_bps = 0;
    double received = 0; ///< bytes of the connection
    double sent = 0;
    /// The counters of the earlier answer, from which rates are computed.
    struct Answer {
        double at_s;
        std::int64_t received;
        std::int64_t sent;
    };
    std::optional<Answer> last;
};

/// The modem of the scenario, and what ModemManager says of it.
struct ModemPhone {
    ModemPresence presence = ModemPresence::NoManager;
    std::string reason;
    DriveIdentities identities;
    int index = 0; ///< ModemManager's number
    MM::State state = MM::State::Initializing;
    bool isLocked = false;     ///< the SIM asks for its PIN
    bool isSIMMissing = false; ///< so that the modem fails
    int slot = 1;              ///< of the SIM in use, 1 or 2
    MM::Registration registration = MM::Registration::Idle;
    ModemCellReport cellReport = ModemCellReport::Reported;
    ModemCellReport neighborReport = ModemCellReport::Reported;
    bool isPlaceOnly = false; ///< the cell is known by its identity alone

    ModemCell::Radio radio = ModemCell::Radio::GSM;
    std::size_t carrier = 0;            ///< of LTE and NR; see cellsOf
    bool hasSecondary = false;          ///< NR beside LTE
    std::optional<ModemCell> serving;   ///< none without coverage
    std::optional<ModemCell> secondary; ///< the cell of NR beside that of LTE
    std::vector<ModemBearer> bearers;

    [[nodiscard]] bool isPresent() const { return presence == ModemPresence::Present; }
    [[nodiscard]] bool isRegistered() const {
        return registration == MM::Registration::Home || registration == MM::Registration::Roaming;
    }
    [[nodiscard]] bool isConnected() const {
        for (const ModemBearer& each : bearers)
            if (each.isConnected)
                return true;
        return false;
    }
};

/// What a report is made from.
struct ModemReportContext {
    ModemPhone& phone; ///< counters remember their last report
    const NRNetwork& network;
    double now_s = 0;            ///< since the start of the drive
    std::size_t cellReports = 0; ///< so far
};

} // namespace velmora
