// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/RadioNetwork.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <cstdint>
#include <vector>

/// The records of the GSM radio side, one function a log code.
namespace velmora::records {

enum class RRState : std::uint8_t {
    Inactive = 0,
    GoingActive = 1,
    CellSelection = 3,
    PLMNListConstruction = 4,
    Idle = 5,
    CellReselection = 6,
    ConnectionPending = 7,
    ChooseCell = 8,
    DataTransfer = 9,
    ConnectionRelease = 11,
    EarlyCampedWaitForSI = 12,
    UMTSToGSMReselection = 14,
    GSMToUMTSReselection = 18,
    GSMToUMTSHandover = 19,
    CellReestablishment = 20,
};

/// The reference of a neighbour's path-loss criterion: the lowest level at which a cell may be used.
inline constexpr int gsmAccessMinimum_dBm = -105;

/// 0x5134
[[nodiscard]] RecordBuilder gsmServingCell(const GSMCell& cell);
/// 0x5137. Levels are magnitudes: 85 is -85 dBm. At most 32 neighbours.
[[nodiscard]] RecordBuilder gsmMeasurements(const GSMMeasurement& serving, int c2, bool hysteresisApplied,
                                            const std::vector<GSMMeasurement>& neighbours);
/// 0x5076
[[nodiscard]] RecordBuilder dedicatedChannel(int arfcn);
/// 0x51FF. At most 32 cells.
[[nodiscard]] RecordBuilder bsicList(const std::vector<GSMMeasurement>& cells);
/// 0x51F4
[[nodiscard]] RecordBuilder si13Position(int position);
/// 0x51F5
[[nodiscard]] RecordBuilder gprsCellOptions(int pfcSupport, int priorityAccessThreshold,
                                            int networkControlOrder);
/// 0x51F6
[[nodiscard]] RecordBuilder gprsTimers(int t3192, int drxTimerMaximum, bool elevenBitBurst);
/// 0x51FB
[[nodiscard]] RecordBuilder pbcchPresence(bool present);
/// 0x51FD
[[nodiscard]] RecordBuilder packetSystemInformation(int psiStatus, int countLR, int countHR,
                                                    int extendedOrder, bool siStatusSupported);
/// 0x512C
[[nodiscard]] RecordBuilder rrState(RRState state, int subState, int status, bool data);
/// 0x5072
[[nodiscard]] RecordBuilder discontinuousTransmission(bool used);
/// 0x51F8. At most 64 channels.
[[nodiscard]] RecordBuilder mobileAllocation(int hoppingSequence, const std::vector<int>& arfcns);

} // namespace velmora::records
