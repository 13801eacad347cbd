// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/MockModemManager.h"
#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"
#include "Tests/Telephony/ModemManager/ModemManagerProcesses.h"

#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"

#include <gmock/gmock.h>

#include <csignal>
#include <filesystem>

/// The telephony service as a process, with a ModemManager that the test makes up.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::AllOf;
using ::testing::HasSubstr;
using ::testing::StartsWith;

class ModemManagerProcessTest : public ModemManagerProcesses {
protected:
    using Mock = MockModemManager;

    ModemManagerProcessTest() {
        mock.put(Mock::simPath(0), {{Mock::sim, {{"SimIdentifier", "89011010000000000017"}}}});
        mock.answers["GetCellInfo"] = {{QVariant::fromValue(CellList{
                                           {{"cell-type", 5U},
                                            {"serving", true},
                                            {"operator-id", "00101"},
                                            {"tac", "84CD"},   // 33997
                                            {"ci", "1A2D003"}, // 27447299
                                            {"physical-ci", "1A0"},
                                            {"earfcn", 1300U}},
                                           {{"cell-type", 3U},
                                            {"serving", false},
                                            {"uarfcn", 10700U},
                                            {"psc", 33U},
                                            {"rscp", -95.0},
                                            {"ecio", -7.0}},
                                       })},
                                       {},
                                       {}};
        mock.answers["Setup"] = {{}, {}, {}};
    }

    void putModem(uint access) {
        InterfaceMap modem = testModem(access);
        modem[Mock::signal] = {{"Rate", 0U}};
        mock.put(Mock::modemPath(0), modem);
    }

    MockModemManager mock{bus.address()};
};

TEST_F(ModemManagerProcessTest, theReferenceClientReadsTheSame) {
    if (!std::filesystem::exists("/usr/bin/mmcli"))
        GTEST_SKIP() << "there is no mmcli";
    putModem(lteAccess);
    EXPECT_THAT(mmcli({"-L"}), HasSubstr("/org/freedesktop/ModemManager1/Modem/0 [Test] Modem"));
    EXPECT_THAT(mmcli({"-m", "0", "--get-cell-info"}),
                AllOf(HasSubstr("tac: 84CD"), HasSubstr("ci: 1A2D003"), HasSubstr("physical ci: 1A0"),
                      HasSubstr("earfcn: 1300"), HasSubstr("uarfcn: 10700")));
    EXPECT_THAT(mmcli({"-i", "0"}), HasSubstr("iccid: 89011010000000000017"));
}

TEST_F(ModemManagerProcessTest, oneChannelLivesThroughChangesOfTechnologyAndModem) {
    serve("modemmanager", "<4>modemmanager: no modem is there");
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Modem");
    ASSERT_TRUE(client.stream());
    EXPECT_TRUE(becomes(client, LiveModemCode::cells, {"kVoxModemPresence"}, 4)); // there is none

    putModem(lteAccess);
    const std::vector<std::string> first{"kVoxCellMonitorCells", "0"};
    ASSERT_TRUE(eventually([&] { return !latest(client, LiveModemCode::cells, first).isNone(); }));
    const Value cell = latest(client, LiveModemCode::cells, first);
    EXPECT_EQ(at(cell, {"kVoxCellMonitorTAC"}), Value(33997));
    EXPECT_EQ(at(cell, {"kVoxCellMonitorCellId"}), Value(27447299));
    EXPECT_EQ(at(cell, {"kVoxCellMonitorPID"}), Value(416));
    EXPECT_EQ(latest(client, LiveModemCode::cells, {"kVoxCellMonitorCells", "1", "kVoxCellMonitorRSCP"}),
              Value(-95.0));
    EXPECT_TRUE(becomes(client, LiveModemCode::registration, {"kVoxRegistrationPLMN"}, "00101"));
    EXPECT_TRUE(becomes(client, LiveModemCode::sim, {"kSimFile_ICCID"}, "89011010000000000017"));
    const auto header = LogMessage::parse(client.messages.back().bytes());
    ASSERT_TRUE(header && header->timestamp());
    const auto sent = timeOfRecord(*header->timestamp());
    ASSERT_TRUE(sent);
    const auto age = std::chrono::system_clock::now() - *sent;
    EXPECT_TRUE(age > -std::chrono::seconds(1) && age < 1min) << "stamped when it was sent";

    mock.change(Mock::modemPath(0), Mock::modem, {{"AccessTechnologies", umtsAccess}});
    EXPECT_TRUE(becomes(client, LiveModemCode::link, {"kVoxLinkAccessTechnologies"}, 1 << 5));
    mock.remove(Mock::modemPath(0));
    EXPECT_TRUE(becomes(client, LiveModemCode::cells, {"kVoxModemPresence"}, 4));
    mock.put(Mock::modemPath(3), testModem(gsmAccess));
    EXPECT_TRUE(becomes(client, LiveModemCode::modem, {"kVoxModemIndex"}, 3));
    EXPECT_TRUE(client.commands->isValid());
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Modem");
}

TEST_F(ModemManagerProcessTest, aServiceThatWasKilledPutsTheRateBackWhenItRunsAgain) {
    mock.setsRates = true;
    putModem(lteAccess);
    serve("modemmanager", "<5>modemmanager: following modem 0 Test Modem");
    {
        TestClient client(directory.path(), "com.velmora.test.client");
        ASSERT_TRUE(client.connect());
        ASSERT_TRUE(client.stream());
        ASSERT_TRUE(eventually([&] { return mock.count("Setup") == 1; }));
        service->signal(SIGKILL);
        static_cast<void>(service->exitStatus());
    }
    EXPECT_EQ(mock.count("Setup"), 1U);
    serve("modemmanager", "<5>modemmanager: following modem 0 Test Modem");
    ASSERT_TRUE(eventually([&] { return mock.count("Setup") == 2; }));
    std::vector<uint> rates;
    for (const Mock::Call& call : mock.calls)
        if (call.member == "Setup")
            rates.push_back(call.arguments.value(0).toUInt());
    EXPECT_THAT(rates, ::testing::ElementsAre(5U, 0U));
}

TEST_F(ModemManagerProcessTest, anEndingServicePutsTheRateBack) {
    putModem(lteAccess);
    serve("modemmanager", "<5>modemmanager: following modem 0 Test Modem");
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    ASSERT_TRUE(client.stream());
    ASSERT_TRUE(eventually([&] { return mock.count("Setup") == 1; }));
    service->signal(SIGTERM);
    EXPECT_EQ(service->exitStatus(), 0);
    ASSERT_TRUE(eventually([&] { return mock.count("Setup") == 2; }));
    EXPECT_EQ(mock.calls.back().arguments, QVariantList{0U});
}

TEST_F(ModemManagerProcessTest, theChosenModemIsFollowed) {
    putModem(lteAccess);
    mock.put(Mock::modemPath(4),
             testModem(gsmAccess, {{"Model", "Other"}, {"EquipmentIdentifier", "004999010640000"}}));
    serve("modemmanager,modem=004999010640000", "<5>modemmanager: following modem 4 Test Other");
}

TEST_F(ModemManagerProcessTest, servesWithoutABus) {
    bus.stop();
    service =
        start(VELMORA_BUILD_DIR "/velmora-telephonyd", {"--source", "modemmanager", "--log-level", "4"});
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Modem");
    ASSERT_TRUE(client.stream());
    EXPECT_TRUE(becomes(client, LiveModemCode::cells, {"kVoxModemPresence"}, 1));
    EXPECT_THAT(service->standardError(), StartsWith("<4>modemmanager: no system bus ("));
    service->signal(SIGTERM);
    EXPECT_EQ(service->exitStatus(), 0);
}

} // namespace
} // namespace velmora
