// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GPRSInformation.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x51F4: where SI 13 is sent (3GPP TS 44.018 10.5.2.34); 255 is the modem's.
constexpr EnumText si13PositionRows[] = {
    {0, "Located on BCCH"},
    {1, "Located on Extended BCCH"},
    {255, "Not Available"},
};
constexpr EnumTexts si13Positions(si13PositionRows, "Unknown");

constexpr Field si13Fields[] = {
    {"SI13 Position", u8At(14), text(si13Positions), {.clause = "3GPP TS 44.018 10.5.2.34"}},
};
constexpr Layout si13 = layout(15, si13Fields);

// 0x51F5: NETWORK_CONTROL_ORDER and PRIORITY_ACCESS_THR of SI 13 (3GPP TS 44.018 10.5.2.37b), the packet-flow
// support of the GPRS cell options (TS 44.060 12.24); 255 is the modem's.
constexpr EnumText controlOrderRows[] = {
    {0, "NC0"},
    {1, "NC1"},
    {2, "NC2"},
    {255, "Not Available"},
};
constexpr EnumTexts controlOrders(controlOrderRows, "Unknown");

constexpr EnumText pfcSupportRows[] = {
    {0, "Not Supported"},
    {1, "Supported"},
    {255, "Available"}, // not "Not Available" as elsewhere, on purpose
};
constexpr EnumTexts pfcSupport(pfcSupportRows, "Unknown");

constexpr EnumText accessThresholdRows[] = {
    {0, "Barred (PKT access not allowed in the Cell)"},
    {1, "Barred"},
    {2, "Barred"},
    {3, "1 Only"},
    {4, "1 to 2"},
    {5, "1 to 3"},
    {6, "1 to 4"},
    {7, "Allowed"},
    {255, "Not Available"},
};
constexpr EnumTexts accessThresholds(accessThresholdRows, "Unknown");

constexpr Field cellOptionFields[] = {
    {"Network Control Order", u8At(15), text(controlOrders), {.clause = "3GPP TS 44.018 10.5.2.37b"}},
    {"PFC Supported", u8At(13), text(pfcSupport), {.clause = "3GPP TS 44.060 12.24"}},
    {"Priority Access Threshold", u8At(14), text(accessThresholds), {.clause = "3GPP TS 44.018 10.5.2.37b"}},
};
constexpr Layout cellOptions = layout(18, cellOptionFields);

// 0x51F6: T3192, ACCESS_BURST_TYPE and DRX_TIMER_MAX of the GPRS cell options (3GPP TS 44.060 12.24); of the
// last one the number is shown as the modem reports it.
constexpr EnumText t3192Rows[] = {
    {0, "500 ms"}, {1, "1000 ms"}, {2, "1500 ms"}, {3, "0 ms"},
    {4, "80 ms"},  {5, "120 ms"},  {6, "160 ms"},  {7, "200 ms"},
};
constexpr EnumTexts t3192(t3192Rows, "?? ms");

constexpr Field timerFields[] = {
    {"T3192", u8At(15), text(t3192), {.clause = "3GPP TS 44.060 12.24"}},
    {"Access Burst Type",
     u8At(17),
     flag("11-bit format", "8-bit format"),
     {.clause = "3GPP TS 44.060 12.24"}},
    {"DRX Timer Max", u8At(16), integer("%d"), {.clause = "3GPP TS 44.060 12.24"}},
};
constexpr Layout timers = layout(24, timerFields);

// 0x51FB: as the modem reports it.
constexpr Field pbcchFields[] = {
    {"PBCCH Present", u8At(13), integer("%d")},
};
constexpr Layout pbcch = layout(34, pbcchFields);

// 0x51FD: quantities of 3GPP TS 44.060 (the counts are those of PSI 1), numbers as the modem reports them.
constexpr Field systemInformationFields[] = {
    {"Ext Measurement Order", u8At(16), integer("%d")},
    {"Packet PSI Status", u8At(13), integer("%d")},
    {"Packet SI Status", u8At(33), flag("Supported", "Not Supported")},
    {"Count LR", u8At(14), integer("%d")},
    {"Count HR", u8At(15), integer("%d")},
};
constexpr Layout systemInformation = layout(35, systemInformationFields);

// 0x5137: whether CELL_RESELECT_HYSTERESIS (3GPP TS 45.008) is applied, as the modem reports it.
constexpr Field reselectionFields[] = {
    {"Cell Reselect Hysteresis", u8At(26), flag("Applied", "Not Applied"), {.clause = "3GPP TS 45.008"}},
};
constexpr Layout reselection = layout(29, reselectionFields);

// 0x7135: the network operation mode, numbered as NMO in the GPRS cell options (3GPP TS 44.060 12.24).
constexpr EnumText operatingModeRows[] = {
    {0, "Class 1"},
    {1, "Class 2"},
    {2, "Class 3"},
};
constexpr EnumTexts operatingModes(operatingModeRows, "Unknown");

constexpr Field networkFields[] = {
    {"Network Operating Mode", u8At(13), text(operatingModes), {.clause = "3GPP TS 44.060 12.24"}},
};
constexpr Layout network = layout(32, networkFields);

constexpr View sectionViews[] = {
    {0x51F5, cellOptions},       {0x7135, network}, {0x51F6, timers},      {0x51FB, pbcch},
    {0x51FD, systemInformation}, {0x51F4, si13},    {0x5137, reselection},
};

} // namespace

std::span<const View> GPRSInformation::views() const {
    return sectionViews;
}

void GPRSInformation::trace() const {
    logLine(LogPriority::Warning, "GPRSInformation");
}

} // namespace velmora
