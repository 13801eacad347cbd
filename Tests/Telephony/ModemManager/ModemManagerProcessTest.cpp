// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/MockModemManager.h"
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

TEST_F(ModemManagerProcessTest, aWatcherShowsTheModem) {
    putModem(lteAccess);
    serve("modemmanager", "<5>modemmanager: the technology is Ostrel_LTE now");
    const auto watcher = watch();
    const std::string refresh = shown(*watcher, {"Tracking Area Code", "EF-ICCID", "Signal Quality"});
    EXPECT_THAT(refresh, HasSubstr(" Serving Cell Info\n"
                                   " Tracking Area Code 33997\n"
                                   " Cell Identity 27447299\n"
                                   " Physical Cell ID 416\n"
                                   " Freq Band Indicator 3\n"
                                   " UARFCN 1300\n"))
        << service->standardError();
    EXPECT_THAT(refresh, HasSubstr(" PDP Context Info\n"
                                   " 0\n"
                                   " Bearer None\n"
                                   " Registration Home\n"
                                   " Operator 001-01\n"
                                   " Operator Name Test Network\n"
                                   " Modem State Registered\n"
                                   " Access Technology LTE\n"
                                   " Signal Quality 60 %\n"));
    EXPECT_THAT(refresh, HasSubstr("SIM Info\n"
                                   " EF-ICCID 89011010000000000017\n"
                                   " EF-MSISDN +15550100\n"));
}

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

TEST_F(ModemManagerProcessTest, aChangedTechnologyEndsTheChannelAndTheNextOneIsOfTheNew) {
    putModem(lteAccess);
    serve("modemmanager", "<5>modemmanager: the technology is Ostrel_LTE now");
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Ostrel_LTE");
    ASSERT_TRUE(client.stream());
    ASSERT_TRUE(eventually([&] { return client.messages.size() >= 3; }));
    const auto header = LogMessage::parse(client.messages[0].bytes());
    ASSERT_TRUE(header && header->timestamp());
    const auto sent = timeOfRecord(*header->timestamp());
    ASSERT_TRUE(sent);
    const auto age = std::chrono::system_clock::now() - *sent;
    EXPECT_TRUE(age > -std::chrono::seconds(1) && age < 1min) << "stamped when it was sent";

    mock.change(Mock::modemPath(0), Mock::modem, {{"AccessTechnologies", umtsAccess}});
    ASSERT_TRUE(eventually([&] { return !client.commands->isValid(); }));
    EXPECT_THAT(service->standardError(),
                HasSubstr("<5>com.velmora.vox.server.channel.1: closed, the technology is Ostrel_GSM now\n"));
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Ostrel_GSM");
    client.messages.clear();
    ASSERT_TRUE(client.stream());
    EXPECT_TRUE(eventually([&] { return client.messages.size() >= 3; }));
    const auto watcher = watch();
    EXPECT_THAT(shown(*watcher, {"UMTS Set", "UARFCN"}), HasSubstr(" UMTS Set\n"
                                                                   " 0\n"
                                                                   " UARFCN 10700\n"
                                                                   " Scrambling Code 33\n"
                                                                   " RSCP -95 dBm\n"
                                                                   " Energy Per Chip -7 dB\n"));
}

TEST_F(ModemManagerProcessTest, aClientBeforeTheModemGetsNoTechnology) {
    serve("modemmanager", "<4>modemmanager: no modem is there");
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "");
    EXPECT_TRUE(client.commands->isValid());
    putModem(gsmAccess);
    ASSERT_TRUE(eventually([&] { return !client.commands->isValid(); }));
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Ostrel_GSM");
}

TEST_F(ModemManagerProcessTest, anEndingServicePutsTheRateBack) {
    putModem(lteAccess);
    serve("modemmanager", "<5>modemmanager: the technology is Ostrel_LTE now");
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    ASSERT_TRUE(client.stream());
    ASSERT_TRUE(eventually([&] { return mock.count("Setup") == 1; }));
    service->signal(SIGTERM);
    EXPECT_EQ(service->exitStatus(), 0);
    ASSERT_TRUE(eventually([&] { return mock.count("Setup") == 2; }));
    EXPECT_EQ(mock.calls.back().arguments, QVariantList{0U});
}

TEST_F(ModemManagerProcessTest, theWantedModemIsFollowed) {
    putModem(lteAccess);
    mock.put(Mock::modemPath(4), testModem(gsmAccess, {{"Model", "Other"}}));
    serve("modemmanager,modem=4", "<5>modemmanager: following modem 4 Test Other");
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Ostrel_GSM");
}

TEST_F(ModemManagerProcessTest, servesWithoutABus) {
    bus.stop();
    service =
        start(VELMORA_BUILD_DIR "/velmora-telephonyd", {"--source", "modemmanager", "--log-level", "4"});
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "");
    EXPECT_THAT(service->standardError(), StartsWith("<4>modemmanager: no system bus ("));
    service->signal(SIGTERM);
    EXPECT_EQ(service->exitStatus(), 0);
}

} // namespace
} // namespace velmora
