// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/Drives/Displays/ExpectedDisplays.h"

namespace velmora {

ExpectedDisplay expectedUTRANDisplay() {
    using testing::Contains;
    using testing::Ge;
    using testing::IsSupersetOf;

    const std::string cell = "/Serving Cell/Serving Cell Info/";
    const std::string neighbours = "/Neighbors/Neighbor Cell List";
    const std::string blockErrors = "/Channel Quality/TRCH BLER";
    const std::string ratios = "/Channel Quality/CCTRCH SIR";
    ExpectedDisplay display;
    display.scenario = "utran";
    display.templateName = "Ostrel_UTRAN";
    display.texts = {
        // The last one is shown after a record of the RRC state that is too short.
        {"/Serving Cell/RRC Info/State", exactly({"Disconnected", "Connecting", "Cell Fach", "Cell DCH",
                                                  "Cell PCH", "Cell URA PCH", "Unknown RRC Mode"})},
        {cell + "Cell Access Restrictions", exactly({"0", "1"})},
        {cell + "Cell ID", numbers(0, (1 << 28) - 1)},
        {cell + "Downlink UARFCN", numbers(10054, 10121)}, // 2010 to 2025 MHz in steps of 200 kHz
        {cell + "Uplink UARFCN", numbers(10054, 10121)},
        {cell + "URA ID", numbers(0, 255)},
        {cell + "Allowed Access", exactly({"All Calls", "Emergency Calls Only"})},
        {cell + "Local Area Code", numbers(1, 65533)},
        {cell + "Freq Band Indicator", exactly({"1"})},
        {cell + "Cell Scrambling Code", numbers(0, 127)},
        {neighbours + "/UARFCN", numbers(10054, 10121)},
        {neighbours + "/Cell ID", numbers(0, 127)},
        {neighbours + "/Filter RSCP", numbers(0, 91.0 / 256)}, // the 92 levels of 3GPP TS 25.123
        {neighbours + "/Status", exactly({"ASET", "MSET", "DSET"})},
        {neighbours + "/inJDCS", exactly({"TRUE", "FALSE"})},
        {blockErrors + "/TRCH ID", numbers(1, 32)},
        {blockErrors + "/TRCH BLER Measurement", numbers(0, 63)},
        {ratios + "/CCTRCH ID", numbers(0, 7)},
        {ratios + "/TSNUM", exactly({"1", "4"})},
        {ratios + "/SIR", numbers(0, 63)},
    };
    display.lengths = {
        {neighbours, Contains(Ge(6U))},
        {"/Neighbors/GSM Neighbor Cell List", testing::Eq(Lengths{0})}, // this list is never shown
        {blockErrors, IsSupersetOf<std::size_t>({0, 1, 2, 4})},
        {ratios, IsSupersetOf<std::size_t>({0, 1, 2})},
        {ratios + "/SIR", testing::Eq(Lengths{6})},
    };
    display.reports = {
        {"Invalid log type: 2\\. Dropping\\.", Ge(5)},
        {"Record 0xD00A: .*", Ge(1)},
        {"Record 0xD00C: .*", Ge(2)}, // both lists of it
        {"Record 0xD00E: .*", Ge(1)},
    };
    addServiceTexts(display, "/PDP Context Info");
    return display;
}

} // namespace velmora
