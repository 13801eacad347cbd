// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/Values/TypedValue.h"

/// The values that a cell's numbers may have. What is outside is what modems report for unknown.
namespace velmora::LiveModem::CellRange {

inline constexpr Range countryCode{1, 999}; // 3GPP TS 23.003 2.2
inline constexpr Range networkCode{0, 999};
inline constexpr Range networkCodeDigits{2, 3};

inline constexpr Range locationArea{1, 0xFFFD};    // 3GPP TS 23.003 4.1: 0 and 0xFFFE are reserved
inline constexpr Range trackingArea{1, 0xFFFFFD};  // 19.4.2.3: 24 bits of 5GS; the same ones reserved
inline constexpr Range identity16{0, 0xFFFF};      // 4.3.1
inline constexpr Range identity28{0, 0xFFFFFFF};   // 3GPP TS 25.331 10.3.2.2, TS 23.003 19.6
inline constexpr Range identity36{0, 0xFFFFFFFFF}; // 3GPP TS 23.003 19.6A

inline constexpr Range bsic{0, 63};                   // 3GPP TS 23.003 4.3.2
inline constexpr Range scramblingCode{0, 511};        // 3GPP TS 25.213 5.2.2
inline constexpr Range cellParameter{0, 127};         // 3GPP TS 25.223 6.3
inline constexpr Range physicalCellLTE{0, 503};       // 3GPP TS 36.211 6.11
inline constexpr Range physicalCellNR{0, 1007};       // 3GPP TS 38.211 7.4.2.1
inline constexpr Range arfcn{0, 1023};                // 3GPP TS 45.005 2
inline constexpr Range uarfcn{0, 16383};              // 3GPP TS 25.101 5.4.3
inline constexpr Range earfcn{0, 262143};             // 3GPP TS 36.101 5.7.3
inline constexpr Range nrarfcn{0, 3279165};           // 3GPP TS 38.104 5.4.2.1
inline constexpr Range frequency_kHz{1, 100'000'000}; // up to 100 GHz
inline constexpr Range bandwidth_kHz{1, 2'000'000};   // up to 2 GHz (3GPP TS 38.104 5.3.2)

// Somewhat wider than what the phones have to report, since modems extrapolate.
inline constexpr Range rxlev{-120, -20}; // 3GPP TS 45.008 8.1.4
inline constexpr Range rscp{-130, -20};  // 3GPP TS 25.133 9.1.1.3
inline constexpr Range ecn0{-40, 0};     // 3GPP TS 25.133 9.1.2.3
inline constexpr Range rsrp{-157, -20};  // 3GPP TS 36.133 9.1.4, TS 38.133 10.1.6
inline constexpr Range rsrq{-44, 21};    // 3GPP TS 36.133 9.1.7, TS 38.133 10.1.11
inline constexpr Range rssi{-140, -10};  // of a carrier
inline constexpr Range sinr{-30, 50};    // 3GPP TS 36.133 9.1.17, TS 38.133 10.1.16
inline constexpr Range pathLoss{0, 200}; // 3GPP TS 25.133 9.1.6
inline constexpr Range pilot{-40, 0};    // 3GPP2 C.S0005 2.6.6.2.2

inline constexpr Range timingAdvanceGSM{0, 63};   // 3GPP TS 45.010 5.4
inline constexpr Range timingAdvanceLTE{0, 1282}; // 3GPP TS 36.213 4.2.3
inline constexpr Range timingAdvanceNR{0, 3846};  // 3GPP TS 38.213 4.2

inline constexpr Range systemID{0, 32767}; // 3GPP2 C.S0005 2.6.5.2
inline constexpr Range networkID{0, 65535};
inline constexpr Range baseStation{0, 65535};
inline constexpr Range pilotOffset{0, 511}; // 3GPP2 C.S0002 3.1.3.2.1

} // namespace velmora::LiveModem::CellRange
