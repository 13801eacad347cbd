// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GPRSInformation.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

const auto make = inDictionary<GPRSInformation>;

TEST(GPRSInformation, ShowsTheSI13Position) {
    expectEnumeration(make, recordWith(0x51F4, 15), 14, "SI13 Position",
                      {{0, "Located on BCCH"}, {1, "Located on Extended BCCH"}, {255, "Not Available"}},
                      "Unknown");
    expectPrefixes(make, record(0x51F4, "FF 01 FF"), 15, "GPRSInformation",
                   "{SI13 Position 'Located on Extended BCCH'}");
}

TEST(GPRSInformation, ShowsTheCellOptions) {
    const Data options = recordWith(0x51F5, 18);
    // 255 is available, unlike in the other two.
    expectEnumeration(make, options, 13, "PFC Supported",
                      {{0, "Not Supported"}, {1, "Supported"}, {255, "Available"}}, "Unknown");
    expectEnumeration(make, options, 14, "Priority Access Threshold",
                      {{0, "Barred (PKT access not allowed in the Cell)"},
                       {1, "Barred"},
                       {2, "Barred"},
                       {3, "1 Only"},
                       {4, "1 to 2"},
                       {5, "1 to 3"},
                       {6, "1 to 4"},
                       {7, "Allowed"},
                       {255, "Not Available"}},
                      "Unknown");
    expectEnumeration(make, options, 15, "Network Control Order",
                      {{0, "NC0"}, {1, "NC1"}, {2, "NC2"}, {255, "Not Available"}}, "Unknown");
    expectPrefixes(make, record(0x51F5, "01 04 02 00 00 99"), 18, "GPRSInformation",
                   "{Network Control Order 'NC2', PFC Supported 'Supported', "
                   "Priority Access Threshold '1 to 2'}");
}

TEST(GPRSInformation, ShowsTheTimers) {
    const Data timers = recordWith(0x51F6, 24);
    expectEnumeration(make, timers, 15, "T3192",
                      {{0, "500 ms"},
                       {1, "1000 ms"},
                       {2, "1500 ms"},
                       {3, "0 ms"},
                       {4, "80 ms"},
                       {5, "120 ms"},
                       {6, "160 ms"},
                       {7, "200 ms"}},
                      "?? ms");
    expectFlag(make, timers, 17, "Access Burst Type", "11-bit format", "8-bit format");
    expectPrefixes(make, record(0x51F6, "00 00 09 F0 01 00 00 00 00 00 00 99"), 24, "GPRSInformation",
                   "{T3192 '?? ms', Access Burst Type '11-bit format', DRX Timer Max '240'}");
}

TEST(GPRSInformation, ShowsThePBCCH) {
    const Data full = recordWith(0x51FB, 35, {{13, 255}});
    expectPrefixes(make, full, 34, "GPRSInformation", "{PBCCH Present '255'}");
}

TEST(GPRSInformation, ShowsTheSystemInformationStatus) {
    expectFlag(make, recordWith(0x51FD, 35), 33, "Packet SI Status", "Supported", "Not Supported");
    const Data full = recordWith(0x51FD, 36, {{13, 201}, {14, 202}, {15, 203}, {16, 204}, {33, 1}});
    expectPrefixes(make, full, 35, "GPRSInformation",
                   "{Ext Measurement Order '204', Packet PSI Status '201', Packet SI Status 'Supported', "
                   "Count LR '202', Count HR '203'}");
}

TEST(GPRSInformation, ShowsTheReselectionHysteresis) {
    expectFlag(make, recordWith(0x5137, 29), 26, "Cell Reselect Hysteresis", "Applied", "Not Applied");
    // The neighbours that follow are another section's.
    expectPrefixes(make, recordWith(0x5137, 31, {{26, 1}, {28, 255}}), 29, "GPRSInformation",
                   "{Cell Reselect Hysteresis 'Applied'}");
}

TEST(GPRSInformation, ShowsTheOperatingMode) {
    expectEnumeration(make, recordWith(0x7135, 32), 13, "Network Operating Mode",
                      {{0, "Class 1"}, {1, "Class 2"}, {2, "Class 3"}}, "Unknown");
    expectPrefixes(make, recordWith(0x7135, 33, {{13, 2}}), 32, "GPRSInformation",
                   "{Network Operating Mode 'Class 3'}");
}

} // namespace

} // namespace velmora
