// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/Hex.h"

#include <cstdint>
#include <initializer_list>
#include <string>

/// What the tests of the 1x status record share: its sub-packets and what they show.

namespace velmora::c2k {

inline const Data paging = hex("01 00 08 00 06 00 00 00");
inline const Data traffic = hex("01 00 08 00 08 00 00 00");
inline const Data radio = hex("02 00 0E 00"
                              "01 00"   // +4 band classes 1 and 0
                              "77 01"   // +6 channel 375
                              "2A 01"   // +8 channel 298
                              "C4"      // +10 -60: -60 * 0.334 - 63.248 = -83.288
                              "20"      // +11 32: 32 * 0.334 - 63.248 = -52.56
                              "9C FF"); // +12 -100 tenths
// Energies: 2^(2S-3) E / (9 N^2 G) - 1/N with N 2, G 1, S 2: E/18 - 1/2.
inline const Data active = hex("03 00 34 00"
                               "02 00" // +4 N
                               "01 02" // +6 G, S
                               "02 01" // +8 two pilots, M
                               "0E 01" // +10 reference PN 270
                               // M of 1: 20 bytes a pilot (21 & 0xFFC), the energy at 28 - 12 = 16
                               "64 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00" // +12 PN 100
                               "12 00 00 00"                                     // +28 E 18: 0.5, -3.0103 dB
                               "0E 01 00 00 00 00 00 00 00 00 00 00 00 00 00 00" // +32 PN 270
                               "1B 00 00 00");                                   // +48 E 27: 1, 0 dB
inline const Data fingers = hex("04 00 04 00");

/// The record of these sub-packets: bytes 13 to 16 with the count, then they.
inline Data status(std::initializer_list<Data> subPackets) {
    return joined(withByte(recordWith(0x119C, 17), 14, static_cast<std::uint8_t>(subPackets.size())),
                  joined(subPackets));
}

inline Data idleRecord() {
    return status({paging, radio, active, fingers}); // at 17, 25, 39, 91; 95 bytes
}
inline Data trafficRecord() {
    return status({traffic, radio, active, fingers});
}

inline constexpr const char* pilots =
    "k1xActiveSetInfo {_sorted '_sorted', 0;100 '-3.01 dB', 1;270 '(ref pilot) +0.00 dB'}";

/// What `idleRecord` shows.
inline std::string idleDisplay() {
    return std::string("{k1xDeviceState 'Paging [6]', k1xRx0BandClass '1.8 to 2.0GHz PCS band [1]', "
                       "k1xRx0ChanNum '375', k1xRxAGC0 '-83.29 dBm', k1xRx1BandClass 'N/A', "
                       "k1xRx1ChanNum 'N/A', k1xRxAGC1 'N/A', k1xTxAGC 'N/A', ")
        .append(pilots)
        .append("}");
}

} // namespace velmora::c2k
