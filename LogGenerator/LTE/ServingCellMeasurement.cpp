// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/ServingCellMeasurement.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0xB17F: EARFCN (3GPP TS 36.101 5.7.3), physical cell identity (TS 36.211 6.11), priority (TS 36.304
// 5.2.4.1), Srxlev (5.2.3.2), the two searches (5.2.4.2), Q-RxLevMin and P-Max (TS 36.331); RSRP, RSRQ and
// RSSI are quantities of TS 36.214. The scales are the modem's; for RSRP and RSRQ not the steps of TS 36.133
// 9.1.4 and 9.1.7.
//
// On purpose, the maximum transmit power is compared with 64 although its 6 bits never reach it, of the two
// searches the one is shown in dB and the other in dBm, and the RSRQ offset is not that of connected mode
// (-20).
constexpr Field measurementFields[] = {
    {"Version", u8At(13), integer("%d")},
    {"E-ARFCN", u16At(17), integer("%d"), {.role = Role::ServingChannel, .clause = "3GPP TS 36.101 5.7.3"}},
    {"Physical Cell ID",
     bitsAt(19, 0, 9),
     integer("%d"),
     {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 36.211 6.11"}},
    {"Serving Layer Priority", bitsAt(20, 1, 4), integer("%d"), {.clause = "3GPP TS 36.304 5.2.4.1"}},
    {"Measured RSRP",
     bitsAt(21, 0, 9),
     real("%4.2f dBm", 0.25, -140),
     {.role = Role::ServingLevel, .clause = "3GPP TS 36.214 5.1.1"}},
    {"Average RSRP", bitsAt(22, 1, 9), real("%4.2f dBm", 0.25, -140), {.clause = "3GPP TS 36.214 5.1.1"}},
    {"Measured RSRQ",
     bitsAt(23, 2, 7),
     real("%4.2f dB", 0.25, -30),
     {.role = Role::ServingQuality, .clause = "3GPP TS 36.214 5.1.3"}},
    {"Average RSRQ", bitsAt(24, 1, 7), real("%4.2f dB", 0.25, -30), {.clause = "3GPP TS 36.214 5.1.3"}},
    {"Measured RSSI", bitsAt(25, 0, 9), real("%4.2f dBm", 0.5, -140), {.clause = "3GPP TS 36.214 5.1.3"}},
    {"Qrxlevmin", bitsAt(26, 1, 6), integer("%d dBm", -140, 2), {.clause = "3GPP TS 36.331 6.3.1"}},
    {"P_Max",
     bitsAt(26, 7, 7),
     unless(64, "Not Present", integer("%d dBm", -30)),
     {.clause = "3GPP TS 36.331 6.3.1"}},
    {"Max UE Tx Power", bitsAt(27, 6, 6), unless(64, "Not Present", integer("%d dBm", -30))},
    {"Srxlev",
     bitsAt(29, 0, 7),
     integer("%d dBm", -30),
     {.unit = Unit::DB, .clause = "3GPP TS 36.304 5.2.3.2"}},
    {"Num of Consecutive DRX Cycles of S < 0", bitsAt(29, 7, 6), integer("%d")},
    {"S Intra Search",
     bitsAt(30, 5, 6),
     unless(32, "Not Present", integer("%d dB", 0, 2)),
     {.clause = "3GPP TS 36.304 5.2.4.2"}},
    {"S Non Intra Search",
     bitsAt(31, 3, 6),
     unless(32, "Not Present", integer("%d dBm", 0, 2)),
     {.unit = Unit::DB, .clause = "3GPP TS 36.304 5.2.4.2"}},
    {"Measurement Rules Updated",
     bitsAt(32, 1, 1),
     flag("True", "False"),
     {.clause = "3GPP TS 36.304 5.2.4.2"}},
    {"Measurement Rules", bitsAt(32, 2, 4), integer("%d"), {.clause = "3GPP TS 36.304 5.2.4.2"}},
};
constexpr Layout measurement = layout(33, measurementFields);

constexpr View sectionViews[] = {{0xB17F, measurement}};

} // namespace

std::span<const View> ServingCellMeasurement::views() const {
    return sectionViews;
}

} // namespace velmora
