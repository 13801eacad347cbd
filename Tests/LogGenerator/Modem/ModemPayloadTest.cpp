// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Modem/ModemFixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

// Payloads that no service sends.

namespace velmora {
namespace {

using testing::SizeIs;

class ModemPayloadTest : public ModemFixture {
protected:
    static constexpr std::uint32_t codes[] = {
        LiveModemCode::sim,  LiveModemCode::cells,   LiveModemCode::contexts, LiveModemCode::registration,
        LiveModemCode::link, LiveModemCode::traffic, LiveModemCode::modem,    LiveModemCode::position};

    /// The error lines of the message.
    std::vector<std::string> errors(const Data& message) {
        std::vector<std::string> texts;
        for (const CapturedLog::Line& line : update(message))
            if (line.priority == LogPriority::Error)
                texts.push_back(line.text);
        return texts;
    }
};

TEST_F(ModemPayloadTest, WithoutAPropertyListIsOneErrorLine) {
    for (const std::uint32_t code : codes) {
        const auto number = static_cast<std::uint16_t>(code - 0xFF0000);
        EXPECT_THAT(errors(record(number, "6E 6F 70 65", 0xFF)), SizeIs(1)) << number; // "nope"
        EXPECT_THAT(errors(record(number, "", 0xFF)), SizeIs(1)) << number;
        EXPECT_THAT(errors(modemMessage(code, "text")), SizeIs(1)) << number;
        EXPECT_THAT(errors(modemMessage(code, dictionary({}))), SizeIs(0)) << number;
    }
}

/// Every key of the messages.
constexpr std::string_view keys[] = {
    kVoxModemPresence,
    kVoxModemReason,
    kVoxModemState,
    kVoxModemFailedReason,
    kVoxModemLock,
    kVoxModemCellReport,
    kVoxModemNeighborReport,
    kVoxModemCellsLeftOut,
    kVoxCellMonitorCells,
    kVoxRegistrationState,
    kVoxRegistrationPLMN,
    kVoxRegistrationOperator,
    kVoxRegistrationPacketService,
    kVoxLinkAccessTechnologies,
    kVoxLinkSignalQuality,
    kVoxLinkIsRecent,
    kVoxLinkLTE,
    kVoxLinkNR,
    kVoxContexts,
    kVoxTraffic,
    kSimFile_ICCID,
    kSimFile_MSISDN,
    kVoxSIMGroup1,
    kVoxSIMSlots,
    kVoxSIMPreferredNetworks,
    kVoxModemDrivers,
    kVoxModemCapabilities,
    kVoxPositionLatitude,
};

Value nested(int depth) {
    Value value = "deep";
    for (int i = 0; i < depth; ++i)
        value = i % 2 == 0 ? list({value}) : dictionary({{"kVoxContextIPv4", value}});
    return value;
}

TEST_F(ModemPayloadTest, ValuesOfTheWrongKindAreAbsent) {
    const Value odd[] = {"",
                         "text",
                         -1,
                         std::int64_t{1} << 62,
                         1e300,
                         true,
                         false,
                         Data(std::vector<std::uint8_t>(3)),
                         Date(std::chrono::seconds(5)),
                         list({}),
                         list({1, "a", list({}), dictionary({})}),
                         dictionary({}),
                         nested(60)};
    for (const Value& value : odd) {
        const DictionaryRef message = makeDictionary();
        for (const std::string_view key : keys)
            message->set(key, value);
        for (const std::uint32_t code : codes)
            update(modemMessage(code, message));
        EXPECT_THAT(display(), testing::Not(testing::HasSubstr("<"))) << "a kind that is shown as unknown";
    }
}

TEST_F(ModemPayloadTest, ALongListIsShownWhole) {
    const ArrayRef cells = makeArray();
    for (int i = 0; i < 700; ++i)
        cells->append(cell("LTE", "Neighbor", {{"PID", i % 504}, {"RSRP", -150 + i % 100}}));
    const DictionaryRef message = makeDictionary();
    message->set("kVoxCellMonitorCells", cells);
    EXPECT_THAT(errors(modemMessage(LiveModemCode::cells, message)), SizeIs(0));
    EXPECT_EQ(text("Neighbor Cells", "State"), "700 cells");
}

} // namespace
} // namespace velmora
