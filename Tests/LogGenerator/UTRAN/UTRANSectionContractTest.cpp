// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "LogMessages/LogMessage.h"
#include "Tests/LogGenerator/SectionHarness.h"

#include <gtest/gtest.h>

#include <stdexcept>

namespace velmora {

namespace {

struct Contract {
    const char* name;
    CapturedLog::Line trace;
    std::vector<std::uint32_t> codes;
};

/// Every section of this technology's own.
const Contract contracts[] = {
    {"RRC Info", {LogPriority::Warning, "RRC Info"}, {0xD0E0}},
    {"Serving Cell Info", {LogPriority::Warning, "Serving Cell Info"}, {0xD0E2, 0xFF0001}},
    {"Neighbor Cell List", {LogPriority::Warning, "NeighbhorMeasurements List"}, {0xD00A}},
    {"GSM Neighbor Cell List", {LogPriority::Warning, "GSM Neighbor Cell List"}, {0xD00E}},
    {"TRCH BLER", {LogPriority::Notice, "TRCH BLER Measurement"}, {0xD00C}},
    {"CCTRCH SIR", {LogPriority::Warning, "CCTRCH SIR Measurement"}, {0xD00C}},
};

class UTRANSectionContract : public testing::Test {
protected:
    UTRANClassIndex index;

    Base& section(const Contract& contract) {
        Base* found = index.getClass(contract.name);
        if (!found)
            throw std::out_of_range(contract.name);
        return *found;
    }
    static LogLines update(Base& section, const Data& record, std::uint32_t code) {
        CapturedLog log;
        section.updateWithData(record, code);
        return log.lines();
    }
};

TEST_F(UTRANSectionContract, NamesAndCodes) {
    for (const Contract& contract : contracts) {
        EXPECT_EQ(section(contract).getSectionName(), contract.name);
        EXPECT_EQ(section(contract).getLogCodeArray(), contract.codes) << contract.name;
    }
}

TEST_F(UTRANSectionContract, ACodeOfAnotherLeavesTheTraceWordAlone) {
    for (const Contract& contract : contracts) {
        const DictionaryRef dictionary = std::make_shared<Dictionary>(Dictionary{{"Label", "text"}});
        const ArrayRef array = std::make_shared<Array>(Array{"text"});
        for (const std::uint32_t code : {0x0000u, 0xD0E1u, 0xFFD0E0u, 0xFF0000u, 0xFFFFFFFFu}) {
            section(contract).updateSectionRef(dictionary);
            EXPECT_EQ(update(section(contract), recordWith(0xD0E1, 400), code), (LogLines{contract.trace}))
                << contract.name << " " << code;
            section(contract).updateSectionRef(array);
            EXPECT_EQ(update(section(contract), recordWith(0xD0E1, 400), code), (LogLines{contract.trace}));
        }
        EXPECT_EQ(shown(dictionary), "{Label 'text'}");
        EXPECT_EQ(shown(array), "['text']");
    }
}

TEST_F(UTRANSectionContract, TheShortestRecordIsAccepted) {
    // A prefixed message of 13 bytes leaves a record of 11.
    for (const Contract& contract : contracts)
        for (const std::uint32_t code : contract.codes) {
            const LogLines lines = update(section(contract), Data(std::vector<std::uint8_t>(11)), code);
            ASSERT_FALSE(lines.empty());
            EXPECT_EQ(lines.front(), contract.trace);
            // Only the RRC state's warnings and the unreadable cells' line come besides.
            EXPECT_EQ(lines.size(), code == 0xD0E0 ? 3u : code == 0xFF0001 ? 2u : 1u) << contract.name;
        }
}

TEST_F(UTRANSectionContract, WithoutANodeNothingIsWritten) {
    const Data full = recordWith(0, 3000, {{13, 1}, {14, 0xFF}, {15, 0xFF}, {16, 0xFF}});
    for (const Contract& contract : contracts)
        for (const std::uint32_t code : contract.codes) {
            const LogLines lines =
                update(section(contract),
                       code < LogMessage::firstExtraCode ? full : cellInfo({cell("UTRAN", "Serving")}), code);
            ASSERT_FALSE(lines.empty());
            EXPECT_EQ(lines.front(), contract.trace);
            // The RRC state's own line, and what the cell lacks.
            EXPECT_EQ(lines.size(), code == 0xD0E0 ? 2u : code == 0xFF0001 ? 6u : 1u) << contract.name;
        }
}

TEST_F(UTRANSectionContract, ANodeOfTheOtherKindIsNotChanged) {
    const Data full = recordWith(0, 3000, {{13, 1}, {14, 0xFF}, {15, 0xFF}, {16, 0xFF}});
    for (const Contract& contract : contracts) {
        const bool wantsDictionary = contract.codes.front() == 0xD0E0 || contract.codes.front() == 0xD0E2;
        const Value other = wantsDictionary
                                ? Value(std::make_shared<Array>(Array{"text"}))
                                : Value(std::make_shared<Dictionary>(Dictionary{{"Label", "text"}}));
        const std::string before = shown(other);
        section(contract).updateSectionRef(other);
        update(section(contract), full, contract.codes.front());
        EXPECT_EQ(shown(other), before) << contract.name;
    }
}

} // namespace

} // namespace velmora
