// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "LogMessages/LogMessage.h"
#include "Tests/LogGenerator/SectionHarness.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

struct LTEContract {
    const char* name;
    const char* trace;
    std::vector<std::uint32_t> codes;
};

/// Every section of this technology's own. All but the first announce themselves by their name.
const LTEContract contracts[] = {
    {"Serving Cell Info", "LTE Serving Cell Info", {0xB0C2, 0xB0C1, 0xFF0001}},
    {"Connected mode LTE Intra-frequency Measurement",
     "Connected mode LTE Intra-frequency Measurement",
     {0xB179}},
    {"Measured Neighbor Cells", "Measured Neighbor Cells", {0xB179}},
    {"Detected Cells", "Detected Cells", {0xB179}},
    {"Serving Cell Measurements", "Serving Cell Measurements", {0xB17F}},
    {"Neighbor Measurements", "Neighbor Measurements", {0xB180}},
    {"Neighbor Cells List", "Neighbor Cells List", {0xB180}},
    {"Reselection Candidates", "Reselection Candidates", {0xB186}},
    {"Reselection Candidates List", "Reselection Candidates List", {0xB186}},
};

LogLines update(Base& section, const Data& record, std::uint32_t code) {
    CapturedLog log;
    section.updateWithData(record, code);
    return log.lines();
}

class LTESectionContract : public testing::Test {
protected:
    LTEClassIndex index;

    Base& section(const LTEContract& contract) {
        Base* found = index.getClass(contract.name);
        if (!found)
            throw std::out_of_range(contract.name);
        return *found;
    }
};

TEST_F(LTESectionContract, NamesAndCodes) {
    for (const LTEContract& contract : contracts) {
        EXPECT_EQ(section(contract).getSectionName(), contract.name);
        EXPECT_EQ(section(contract).getLogCodeArray(), contract.codes) << contract.name;
    }
}

TEST_F(LTESectionContract, AnUnhandledCodeIsReportedAndChangesNothing) {
    struct Unknown {
        std::uint32_t code;
        const char* line;
    };
    const Unknown unknown[] = {
        {0x1234, "Received an unknown log message: 4660"},
        {0xFF0003, "Received an unknown log message: 16711683"},
        {0xB178, "Received an unknown log message: 45432"},
        {0xB181, "Received an unknown log message: 45441"},
        {0xFFB179, "Received an unknown log message: 16757113"},
        {0xFFFFFFFE, "Received an unknown log message: -2"},
    };
    const Data longEnough = recordWith(0x1234, 200, {{13, 1}, {14, 1}, {27, 1}, {28, 1}});
    for (const LTEContract& contract : contracts)
        for (const Unknown& each : unknown)
            for (const bool dictionary : {true, false}) {
                SCOPED_TRACE(contract.name);
                const Value node = dictionary
                                       ? Value(std::make_shared<Dictionary>(Dictionary{{"Label", "text"}}))
                                       : Value(std::make_shared<Array>(Array{"earlier"}));
                section(contract).updateSectionRef(node);
                EXPECT_EQ(
                    update(section(contract), longEnough, each.code),
                    (LogLines{{LogPriority::Warning, contract.trace}, {LogPriority::Error, each.line}}));
                EXPECT_EQ(shown(node), dictionary ? "{Label 'text'}" : "['earlier']");
            }
}

TEST_F(LTESectionContract, AShortRecordLeavesTheTraceWordAlone) {
    for (const LTEContract& contract : contracts)
        for (const std::uint32_t code : contract.codes) {
            if (code >= LogMessage::firstExtraCode)
                continue; // has no minimum
            for (const std::size_t length : {0u, 11u, 13u, 20u})
                EXPECT_EQ(update(section(contract), Data(std::vector<std::uint8_t>(length)), code),
                          (LogLines{{LogPriority::Warning, contract.trace}}))
                    << contract.name << " " << code;
        }
}

TEST_F(LTESectionContract, WithoutANodeNothingIsWritten) {
    const Data full = recordWith(0, 300, {{19, 1}, {27, 1}, {28, 1}});
    for (const LTEContract& contract : contracts)
        for (const std::uint32_t code : contract.codes) {
            const bool array = code >= LogMessage::firstExtraCode;
            const LogLines lines =
                update(section(contract), array ? cellInfo({cell("LTE", "Serving")}) : full, code);
            ASSERT_FALSE(lines.empty());
            EXPECT_EQ(lines.front(), (CapturedLog::Line{LogPriority::Warning, contract.trace}));
            // What the cell lacks is reported all the same.
            if (array) {
                EXPECT_EQ(lines.size(), 6u);
            }
        }
}

} // namespace

} // namespace velmora
