// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/C2K/C2KNetwork.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <array>
#include <cstdint>
#include <optional>
#include <vector>

/// The records of CDMA2000, one function a log code.
namespace velmora::records {

enum class EVDOState : std::uint8_t { Inactive, Acquisition, Sync, Idle, Access, Connected };
enum class EVDOSession : std::uint8_t { Closed, AMPSetup, ATInitiated, Initiated, Open };
enum class OneXState : std::uint8_t {
    Inactive = 0,
    Initial = 2,
    Acquisition = 3,
    Sync = 4,
    Paging = 6,
    SlottedSleep = 7,
    Traffic = 8,
    PowerUp = 11,
};

struct EVDOStatusReport {
    EVDOState state = EVDOState::Inactive;
    EVDOSession session = EVDOSession::Closed;
    int uati = 0;                          ///< 24 bits
    std::optional<C2KSector> serving;      ///< without one there is no pilot
    double received_dBm[2] = {-106, -106}; ///< by receive chain
    double sent_dBm = -60;
};
/// 0x1183
[[nodiscard]] RecordBuilder evdoStatus(const EVDOStatusReport& report);

/// 0x12B6. At most 6 pilots, with what the sector sends against all that is received.
[[nodiscard]] RecordBuilder evdoActiveSet(const std::vector<C2KPilot>& pilots);
/// 0x108A: six fingers, of which those after the pilots are unassigned; none at all for `fingers` of 0.
[[nodiscard]] RecordBuilder evdoFingers(const std::vector<C2KPilot>& pilots, std::size_t fingers = 6);

struct OneXStatusReport {
    OneXState state = OneXState::Inactive;
    C2KSector serving;
    double received_dBm[2] = {-106, -106};
    double sent_dBm = -60;
    std::vector<C2KPilot> pilots; ///< the active set, the reference pilot first; at most 6
};
/// 0x119C
[[nodiscard]] RecordBuilder oneXStatus(const OneXStatusReport& report);
/// 0x119D
[[nodiscard]] RecordBuilder trafficFrame(bool erased);

/// 0x134F. Without a sector no system has been found.
[[nodiscard]] RecordBuilder systemIdentification(const std::optional<C2KSector>& serving,
                                                 int roamingIndicator);

/// Packets so far by their size in bits.
struct ForwardPackets {
    std::int64_t of1024 = 0, of2048 = 0, of4096 = 0;
};
struct ReversePackets {
    std::int64_t of256 = 0, of1024 = 0, of4096 = 0;
};
/// 0x1192; `second` numbers the record.
[[nodiscard]] RecordBuilder forwardPackets(std::int64_t second, const ForwardPackets& packets);
/// 0x127E
[[nodiscard]] RecordBuilder reversePackets(std::int64_t second, const ReversePackets& packets);

} // namespace velmora::records
