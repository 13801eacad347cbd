// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/GSM/UMTSRecords.h"
#include "Telephony/Drives/RecordBuilder.h"
#include "Telephony/Drives/UTRAN/UTRANNetwork.h"

#include <array>
#include <cstdint>
#include <vector>

/// The records of the time-division UTRAN, one function a log code.
namespace velmora::records {

/// Which of the phone's sets a measured cell is in. The decoder knows no text for the last.
enum class UTRANSet : std::uint8_t { Active, Monitored, Detected, None };

/// A cell as 0xD00A reports it.
struct UTRANNeighbour {
    UTRANMeasurement measurement;
    UTRANSet set = UTRANSet::Monitored;
    bool jointDetection = false; ///< in the joint-detection cell set
};

/// A transport channel and its block error rate, 0-1.
struct UTRANTransportChannel {
    int identity = 0;
    double blockErrorRate = 0;
};

/// A coded composite transport channel and the signal-to-interference ratios of its time slots, the first
/// `slots` of six.
struct UTRANCompositeChannel {
    int identity = 0;
    int slots = 0;
    std::array<double, 6> sir_dB{};
};

/// 0xD0E0, in the version that the decoder knows.
[[nodiscard]] RecordBuilder utranRRCState(RRCState state);
/// 0xD0E2; both directions have the cell's channel number.
[[nodiscard]] RecordBuilder utranServingCell(const UTRANCell& cell, bool emergencyCallsOnly);
/// 0xD00A. At most 32 cells. The level is the reporting step of 1 dB from -116 dBm on, 0-91, which the
/// decoder shows in units of 256.
[[nodiscard]] RecordBuilder utranNeighbours(const std::vector<UTRANNeighbour>& cells);
/// 0xD00E. At most 32 cells.
[[nodiscard]] RecordBuilder utranGSMNeighbours(const std::vector<GSMMeasurement>& cells);
/// 0xD00C. At most 8 channels of each kind. Rates and ratios are the reporting steps 0-63: of a 0.065th of a
/// decade down from 63 for every block wrong, and of half a decibel from -11 dB on.
[[nodiscard]] RecordBuilder utranChannelQuality(const std::vector<UTRANTransportChannel>& transport,
                                                const std::vector<UTRANCompositeChannel>& composite);

} // namespace velmora::records
