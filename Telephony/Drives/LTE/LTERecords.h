// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/LTE/LTENetwork.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <cstdint>
#include <vector>

/// The records of LTE, one function a log code.
namespace velmora::records {

/// 0xB0C1
[[nodiscard]] RecordBuilder lteAntennas(const LTECell& cell, int transmitAntennas);
/// 0xB0C2
[[nodiscard]] RecordBuilder lteServingCell(const LTECell& cell);
/// 0xB179, the neighbours before the detected cells. At most 255 of either.
[[nodiscard]] RecordBuilder lteIntraFrequency(const LTEMeasurement& serving, int subframe,
                                              const std::vector<LTEMeasurement>& neighbours,
                                              const std::vector<LTEMeasurement>& detected);

/// The network's parameters of cell selection: levels in dBm, thresholds in dB, all of them even.
inline constexpr int lteAccessMinimum_dBm = -120;
inline constexpr int lteMaximumPower_dBm = 23;
inline constexpr int lteIntraSearch_dB = 46;
inline constexpr int lteNonIntraSearch_dB = 8;

/// How far the cell is above the least level at which it may be used, in dB.
[[nodiscard]] int selectionLevel_dB(const LTEMeasurement& cell);

struct LTEIdleMeasurement {
    LTEMeasurement now;
    LTEMeasurement average;
    int cyclesBelow = 0;         ///< 0-63: DRX cycles in which the cell was not good enough
    bool limitedPower = false;   ///< the network limits the power
    bool searchesAlways = false; ///< there is no threshold above which other frequencies are not searched
    bool rulesUpdated = false;
    int rules = 0; ///< 0-15
};
/// 0xB17F
[[nodiscard]] RecordBuilder lteIdleMeasurement(const LTEIdleMeasurement& measurement);

struct LTENeighbour {
    LTEMeasurement now;
    LTEMeasurement average;
    int frequencyOffset = 0; ///< 16 bits
    int frameOffset = 0;     ///< 0-2047
    int sampleOffset = 0;    ///< 0-307199: a frame has so many samples
};
/// 0xB180. 1 to 32 cells of one carrier.
[[nodiscard]] RecordBuilder lteNeighbours(const LTECarrier& carrier, const std::vector<LTENeighbour>& cells);

enum class RATType : std::uint16_t { LTE = 0, UTRAN = 1, GERAN = 2, CDMA1xRTT = 3, CDMAHRPD = 4, Other = 9 };

struct ReselectionCandidate {
    RATType type = RATType::LTE;
    int priority = 0; ///< 0-7
    int channel = 0;
    int cell = 0; ///< physical cell id, primary scrambling code, BSIC or pilot offset
    int band = 0; ///< of GERAN and CDMA
};
/// 0xB186. The candidates' headers are adjacent, and only the last one has room after it for what
/// belongs to its technology: a decoder that looks past an earlier header finds the next candidate's there.
[[nodiscard]] RecordBuilder reselectionCandidates(const LTECell& serving,
                                                  const std::vector<ReselectionCandidate>& candidates);

} // namespace velmora::records
