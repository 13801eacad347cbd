// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/RadioNetwork.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <cstdint>
#include <vector>

/// The records of the UMTS radio side and of the ranked reselection lists, one function a log code and view.
namespace velmora::records {

enum class RRCState : std::uint8_t { Disconnected, Connecting, CellFACH, CellDCH, CellPCH, URAPCH };

/// A cell as the searcher reports it.
struct SearchedCell {
    UMTSMeasurement measurement;
    int setType = 0; ///< 0 is the active set; 3 bits
};

/// One HARQ process's counters since the last record.
struct HARQProcess {
    int identity = 0;
    std::int64_t receivedBits = 0;
    int newTransmissions = 0;
    int blockErrors = 0;
};

struct TransportChannel {
    int identity = 0;
    std::int64_t crcs = 0;
    std::int64_t crcErrors = 0;
};

/// The energy value that stands for an Ec/No of so many dB: 2^19 is 0 dB.
[[nodiscard]] std::int64_t chipEnergy(double ecno_dB);

/// 0x4005 with the GSM list. At most 32 cells, ranked in their order.
[[nodiscard]] RecordBuilder rankedGSMCells(const std::vector<GSMMeasurement>& cells);
/// 0x4005 with the UMTS list. At most 32 cells, ranked in their order.
[[nodiscard]] RecordBuilder rankedUMTSCells(const std::vector<UMTSMeasurement>& cells);
/// 0x4031: the transmit powers of the last slots; at most 32.
[[nodiscard]] RecordBuilder transmitPowers(const std::vector<double>& powers_dBm);
/// 0x4116
[[nodiscard]] RecordBuilder blockErrorRates(int windowSize, const std::vector<TransportChannel>& channels);
/// 0x4125
[[nodiscard]] RecordBuilder rrcState(RRCState state);
/// 0x4127; the uplink lies 950 channel numbers below the downlink.
[[nodiscard]] RecordBuilder umtsServingCell(const UMTSCell& cell, int uraId);
/// 0x4157
[[nodiscard]] RecordBuilder ciphering(bool enabled);
/// 0x417A; `received_dBm` is the carrier's total power. At most 16 cells.
[[nodiscard]] RecordBuilder searchedCells(double received_dBm, const std::vector<SearchedCell>& cells);
/// 0x4221; at most 8 processes each. Secondary processes make a dual-carrier record.
[[nodiscard]] RecordBuilder harqStatistics(int subFrames, const std::vector<HARQProcess>& primary,
                                           const std::vector<HARQProcess>& secondary);

} // namespace velmora::records
