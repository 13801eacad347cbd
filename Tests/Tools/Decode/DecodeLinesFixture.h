// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Tools/ToolFixture.h"

#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Runs `decode` on a small drive of a GSM phone, in the formats that print line by line.
class DecodeLinesTest : public ToolTest {
protected:
    /// A GSM phone's records, of which the second is short, the third of no stream, the fourth unknown.
    void writeDrive(const std::string& name) const {
        writeRecording(name, "Ostrel_GSM",
                       {{at(0), rrState(4)},
                        {at(500), hex("01 02 03")},
                        {at(1000), record(0x512C, "05 00 01 00", 2)},
                        {at(1500), record(0x1234, "")},
                        {at(2000), rrState(5)}});
    }

    /// Standard output of a run that ends with 0 and says nothing itself.
    [[nodiscard]] std::string decode(std::vector<std::string> arguments) const {
        arguments.insert(arguments.begin(), "decode");
        ToolProcess process(tool(std::move(arguments)));
        EXPECT_EQ(process.exitStatus(), 0);
        EXPECT_EQ(ownMessages(process.errors()), "");
        return process.output();
    }
};

/// What JSON lines say of the drive's refreshes, without the brace in front.
inline constexpr const char* firstRefresh =
    R"("time":"2026-11-16T05:00:02.000000000Z","technology":"Ostrel_GSM","messages":4,)"
    R"("display":{"GSM RR Info":{"RR State":"RR_PLMN_LIST_CONSTRUCTION","RR Sub State":"0","RR Status":"1",)"
    R"("RR Mode":"Voice"},"UMTS RR Info":{},"SIM Info":{}}})";
inline constexpr const char* secondRefresh =
    R"("time":"2026-11-16T05:00:04.000000000Z","technology":"Ostrel_GSM","messages":5,)"
    R"("display":{"GSM RR Info":{"RR State":"RR_IDLE","RR Sub State":"0","RR Status":"1",)"
    R"("RR Mode":"Voice"},"UMTS RR Info":{},"SIM Info":{}}})";

} // namespace velmora
