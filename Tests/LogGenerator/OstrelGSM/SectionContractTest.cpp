// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMClassIndex.h"
#include "LogMessages/LogMessage.h"
#include "Tests/LogGenerator/SectionHarness.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

enum class Unhandled { Reported, Silent };

struct Contract {
    const char* name;
    const char* trace;
    Unhandled unhandled;
    std::vector<std::uint32_t> codes;
};

/// Every section of this technology's own.
const Contract contracts[] = {
    {"Active Set", "ActiveSet", Unhandled::Reported, {0x417A}},
    {"Coding Scheme", "CellChangeCounters", Unhandled::Silent, {}}, // the trace word of another, meant so
    {"GPRS Information",
     "GPRSInformation",
     Unhandled::Reported,
     {0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137}},
    {"GSM Serving Cell", "GSMServingCell", Unhandled::Reported, {0x5134, 0x5137, 0x5076, 0xFF0001}},
    {"Mobile Allocation", "MobileAllocation", Unhandled::Reported, {0x51F8}},
    {"Neighboring Cells", "NeighboringCells", Unhandled::Reported, {0x5137, 0x51FF, 0xFF0001}},
    {"Process PS", "ProcessPS", Unhandled::Reported, {0x7130, 0x7132}},
    {"UMTS RR Measurement", "UMTSRRMeasurement", Unhandled::Silent, {}},
    {"Cell Change Counters", "CellChangeCounters", Unhandled::Silent, {}},
    {"Detected Set", "DetectedSet", Unhandled::Reported, {0x417A}},
    {"GSM Set", "GSMSet", Unhandled::Reported, {0x4005}},
    {"Non-Ranked GSM Set", "NonRankedGSMSet", Unhandled::Silent, {}},
    {"Process CO", "ProcessCS", Unhandled::Reported, {0x7131, 0x7132}}, // as above
    {"Serving PLMN", "Serving PLMN", Unhandled::Reported, {0x7135, 0x7132, 0xFF0001}},
    {"UMTS Set", "UMTSSet", Unhandled::Reported, {0x4005, 0xFF0001}},
    {"Equivalent PLMN List", "Equivalent PLMN List", Unhandled::Reported, {0x7150}},
    {"GSM RR Info", "GSMRRInfo", Unhandled::Reported, {0x512C, 0x5137, 0x5072, 0x51F6}},
    {"Monitored Set", "MonitoredSet", Unhandled::Reported, {0x417A}},
    {"Non-Ranked UMTS Set", "NonRankedUMTSSet", Unhandled::Silent, {}},
    {"Process CS", "ProcessCS", Unhandled::Reported, {0x7131, 0x7132}},
    {"UMTS RR Info", "UMTSRRInfo", Unhandled::Reported, {0x4125, 0x4031, 0x4127, 0x4157, 0xFF0001}},
    {"BLER", "BLER", Unhandled::Reported, {0x4116}},
    {"Virtual Active Set", "VirtualActiveSet", Unhandled::Reported, {0x417A}},
    {"HSDPA Info", "HSDPA Info", Unhandled::Silent, {0x4221}},
};

LogLines update(Base& section, const Data& record, std::uint32_t code) {
    CapturedLog log;
    section.updateWithData(record, code);
    return log.lines();
}

class SectionContract : public testing::Test {
protected:
    Ostrel_GSMClassIndex index;

    Base& section(const Contract& contract) {
        Base* found = index.getClass(contract.name);
        if (!found)
            throw std::out_of_range(contract.name);
        return *found;
    }
};

TEST_F(SectionContract, NamesAndCodes) {
    for (const Contract& contract : contracts) {
        EXPECT_EQ(section(contract).getSectionName(), contract.name);
        EXPECT_EQ(section(contract).getLogCodeArray(), contract.codes) << contract.name;
    }
}

TEST_F(SectionContract, AnUnhandledCodeIsReportedAndChangesNothing) {
    const Data longEnough = recordWith(0x1234, 200, {{13, 1}, {14, 1}, {15, 1}});
    for (const Contract& contract : contracts) {
        SCOPED_TRACE(contract.name);
        for (const Value& node : {Value(makeDictionary()), Value(makeArray())}) {
            section(contract).updateSectionRef(node);
            LogLines expected{{LogPriority::Warning, contract.trace}};
            if (contract.unhandled == Unhandled::Reported)
                expected.push_back({LogPriority::Error, "Received an unknown log message: 4660"});
            EXPECT_EQ(update(section(contract), longEnough, 0x1234), expected);
            if (contract.unhandled == Unhandled::Reported)
                expected.back().text = "Received an unknown log message: 16711683";
            EXPECT_EQ(update(section(contract), longEnough, 0xFF0003), expected);
            EXPECT_TRUE(node == Value(makeDictionary()) || node == Value(makeArray())) << shown(node);
        }
    }
}

TEST_F(SectionContract, TheCodeShowsAsASignedNumber) {
    for (const Contract& contract : contracts) {
        if (contract.unhandled == Unhandled::Silent)
            continue;
        const LogLines lines = update(section(contract), Data(), 0xFFFFFFFE);
        EXPECT_EQ(lines, (LogLines{{LogPriority::Warning, contract.trace},
                                   {LogPriority::Error, "Received an unknown log message: -2"}}));
    }
}

TEST_F(SectionContract, AShortRecordLeavesTheTraceWordAlone) {
    for (const Contract& contract : contracts) {
        for (const std::uint32_t code : contract.codes) {
            if (code >= LogMessage::firstExtraCode)
                continue; // has no minimum
            for (const std::size_t length : {11u, 13u}) {
                EXPECT_EQ(update(section(contract), Data(std::vector<std::uint8_t>(length)), code),
                          (LogLines{{LogPriority::Warning, contract.trace}}))
                    << contract.name << " " << code;
            }
        }
    }
}

TEST_F(SectionContract, WithoutANodeNothingIsWritten) {
    const Data full = recordWith(0, 300, {{13, 1}, {14, 1}, {15, 1}, {16, 1}, {17, 1}, {28, 1}});
    const Data cells = cellInfo({cell("GSM", "Serving", {{"ARFCN", 1}}), cell("UMTS", "Serving"),
                                 cell("GSM", "Neighbor"), cell("UMTS", "Neighbor")});
    for (const Contract& contract : contracts)
        for (const std::uint32_t code : contract.codes) {
            const LogLines lines =
                update(section(contract), code < LogMessage::firstExtraCode ? full : cells, code);
            ASSERT_FALSE(lines.empty());
            EXPECT_EQ(lines.front(), (CapturedLog::Line{LogPriority::Warning, contract.trace}));
            // What the cells lack is reported all the same.
            EXPECT_EQ(lines.size() > 1, code == 0xFF0001) << contract.name << " " << code;
        }
}

TEST_F(SectionContract, PlaceholdersChangeNothing) {
    int placeholders = 0;
    for (const Contract& contract : contracts) {
        if (!contract.codes.empty())
            continue;
        ++placeholders;
        const Value node = std::make_shared<Dictionary>(Dictionary{{"Label", "text"}});
        section(contract).updateSectionRef(node);
        EXPECT_EQ(update(section(contract), recordWith(0x5137, 200), 0x5137),
                  (LogLines{{LogPriority::Warning, contract.trace}}));
        EXPECT_EQ(shown(node), "{Label 'text'}");
    }
    EXPECT_EQ(placeholders, 5);
}

} // namespace

} // namespace velmora
