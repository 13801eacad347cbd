// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/TelephonydProcess.h"

#include "Recording/Pcapng/PcapngWriter.h"
#include "Telephony/Drives/GSM/GSMScenario.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/NotifySocket.h"
#include "Tests/Support/OwnProgram.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <memory>
#include <string>
#include <thread>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class TelephonydTest : public ::testing::Test {
protected:
    using Arguments = std::vector<std::string>;

    std::unique_ptr<TestProcess> start(const Arguments& arguments) {
        return std::make_unique<TestProcess>(VELMORA_BUILD_DIR "/velmora-telephonyd", arguments,
                                             directory.path());
    }

    /// The service's sockets that are there.
    std::vector<std::string> serviceSockets() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(directory.path()))
            if (entry.is_socket() && entry.path().filename().string().starts_with("com.velmora.vox.server"))
                names.push_back(entry.path().filename().string());
        return names;
    }

    TemporaryDirectory directory;
};

TEST_F(TelephonydTest, streamsTheScenarioAndStopsCleanly) {
    for (const int signalNumber : {SIGTERM, SIGINT, SIGHUP}) {
        const auto service = start({"--source", "scenario:gsm,seed=3,speed=100", "--log-level", "5"});
        TestClient client(directory.path(), "com.velmora.test.client");
        ASSERT_TRUE(client.connect()) << service->standardError();
        EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Ostrel_GSM");
        ASSERT_TRUE(client.stream());
        ASSERT_TRUE(eventually([&] { return client.messages.size() >= 1000; }));
        GSMScenario wanted(3);
        for (std::size_t i = 0; i < 1000; ++i)
            ASSERT_EQ(client.messages[i], wanted.next().message) << i;

        EXPECT_EQ(serviceSockets().size(), 2U) << "the server's and the channel's";
        service->signal(signalNumber);
        EXPECT_EQ(service->exitStatus(), 0);
        EXPECT_THAT(serviceSockets(), IsEmpty());
        EXPECT_FALSE(client.commands->isValid());
        EXPECT_THAT(service->standardOutput(), IsEmpty());
        EXPECT_THAT(service->standardError(),
                    HasSubstr("<5>stopping on signal " + std::to_string(signalNumber) + "\n"));
        client.close();
    }
}

TEST_F(TelephonydTest, servesWithoutStandardDescriptors) {
    TestProcess service("/bin/sh",
                        {"-c", "exec \"$0\" --source scenario:ifx --log-level 7 <&- >&- 2>&-",
                         VELMORA_BUILD_DIR "/velmora-telephonyd"},
                        directory.path());
    for (const char* name : {"com.velmora.test.first", "com.velmora.test.second"}) {
        // Each is several log lines, which must not go into another file of the service.
        TestClient client(directory.path(), name);
        ASSERT_TRUE(client.connect());
        EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_IFX");
        ASSERT_TRUE(client.stream());
        ASSERT_TRUE(eventually([&] { return !client.messages.empty(); }));
        client.close();
    }
    service.signal(SIGTERM);
    EXPECT_EQ(service.exitStatus(), 0);
}

TEST_F(TelephonydTest, notifiesTheServiceManagerOfReadinessAndStop) {
    NotifySocket manager((directory / "notify").string());
    ::setenv("NOTIFY_SOCKET", manager.address().c_str(), 1);
    const auto service = start({"--source", "scenario:gsm"});
    ::unsetenv("NOTIFY_SOCKET");
    std::vector<std::string> said;
    ASSERT_TRUE(eventually([&] { return !(said = manager.take()).empty(); })) << service->standardError();
    EXPECT_THAT(said, ElementsAre("READY=1\nSTATUS=serving scenario:gsm"));
    EXPECT_THAT(serviceSockets(), ElementsAre("com.velmora.vox.server")) << "it can be connected to";
    service->signal(SIGTERM);
    EXPECT_EQ(service->exitStatus(), 0);
    EXPECT_THAT(manager.take(), ElementsAre("STOPPING=1"));
}

TEST_F(TelephonydTest, stopsAtOnceInTheHoleOfASparseFile) {
    const std::string file = directory / "sparse.pcapng";
    {
        auto writer = PcapngWriter::create(file, "Ostrel_GSM");
        ASSERT_TRUE(writer);
        ASSERT_TRUE((*writer)->append(Time(), hex("01 02 03").bytes()));
    }
    std::filesystem::resize_file(file, std::uintmax_t{12} << 30); // which takes no room
    const auto service = start({"--source", "replay:" + file + ",speed=0", "--log-level", "5"});
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    ASSERT_TRUE(client.stream());
    ASSERT_TRUE(
        eventually([&] { return service->standardError().find(": streaming to ") != std::string::npos; }));
    std::this_thread::sleep_for(std::chrono::milliseconds(300)); // it reads the hole by then
    const auto begin = std::chrono::steady_clock::now();
    service->signal(SIGTERM);
    EXPECT_EQ(service->exitStatus(), 0);
    EXPECT_LT(std::chrono::steady_clock::now() - begin, std::chrono::seconds(1));
}

TEST_F(TelephonydTest, takesItsSourceFromTheEnvironmentToo) {
    ::setenv("VELMORA_SOURCE", "scenario:lte", 1);
    const auto unnamed = start({});
    ::unsetenv("VELMORA_SOURCE");
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect()) << unnamed->standardError();
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Ostrel_LTE");
}

TEST_F(TelephonydTest, survivesAClientThatIsKilled) {
    const auto service = start({"--source", "scenario:gsm,speed=20", "--log-level", "5"});
    TestClient other(directory.path(), "com.velmora.test.other");
    ASSERT_TRUE(other.connect());
    ASSERT_TRUE(other.stream());

    TestProcess victim(ownProgram(), {"--client", directory.path().string(), "com.velmora.test.victim"},
                       directory.path());
    ASSERT_TRUE(eventually([&] { return victim.standardOutput() == "streaming\n"; }));
    EXPECT_EQ(serviceSockets().size(), 3U);
    victim.signal(SIGKILL);
    EXPECT_EQ(victim.exitStatus(), -1);

    EXPECT_TRUE(eventually([&] { return serviceSockets().size() == 2; })) << "the channel's port is closed";
    EXPECT_TRUE(eventually([&] {
        return service->standardError().find(": closed, com.velmora.test.victim has gone\n") !=
               std::string::npos;
    }));
    const auto before = other.messages.size();
    EXPECT_TRUE(eventually([&] { return other.messages.size() > before + 100; }));
    service->signal(SIGTERM);
    EXPECT_EQ(service->exitStatus(), 0);
}

TEST_F(TelephonydTest, eachLoneClientSeesTheStreamFromItsBeginning) {
    const auto service = start({"--source", "scenario:gsm,speed=100"});
    std::vector<Data> first;
    for (int round = 0; round < 2; ++round) {
        TestClient client(directory.path(), "com.velmora.test.client");
        ASSERT_TRUE(client.connect());
        ASSERT_TRUE(client.stream());
        ASSERT_TRUE(eventually([&] { return client.messages.size() >= 200; }));
        client.messages.resize(200);
        if (round == 0)
            first = client.messages;
        else
            EXPECT_EQ(client.messages, first);
        client.close();
    }
}

TEST_F(TelephonydTest, replaysAFileAsFastAsItsClientTakesItAndLosesNothing) {
    constexpr int count = 50'000;
    const std::string path = (directory / "drive.pcapng").string();
    std::vector<Data> wanted;
    const auto writer = PcapngWriter::create(path, "Ostrel_LTE");
    ASSERT_TRUE(writer);
    for (int i = 0; i < count; ++i) {
        std::vector<std::uint8_t> payload(40);
        payload[0] = static_cast<std::uint8_t>(i);
        payload[1] = static_cast<std::uint8_t>(i >> 8);
        payload[2] = static_cast<std::uint8_t>(i >> 16);
        wanted.push_back(recordOf(0xB0E5, Bytes(payload)));
        ASSERT_TRUE((*writer)->append(FakeClock::defaultNow() + i * std::chrono::milliseconds(50),
                                      wanted.back().bytes()));
    }
    ASSERT_TRUE((*writer)->close());

    const auto service = start({"--source", "replay:" + path + ",speed=max", "--log-level", "5"});
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Ostrel_LTE");
    ASSERT_TRUE(client.stream());
    ASSERT_TRUE(eventually([&] { return client.messages.size() >= count; }));
    EXPECT_TRUE(client.messages == wanted);
    EXPECT_TRUE(eventually([&] {
        return service->standardError().find("<5>" + path + ": played to the end, 50000 messages\n") !=
               std::string::npos;
    })) << service->standardError();
}

TEST_F(TelephonydTest, replaysALogWithoutATechnology) {
    // A code without subscriber, in a log of bare records.
    const Data message = recordOf(0x1375, {});
    std::vector<std::uint8_t> content;
    for (int i = 0; i < 3; ++i)
        content.insert(content.end(), message.bytes().begin() + 1, message.bytes().end());
    const std::string path = (directory / "drive.dlf").string();
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(content.data()), static_cast<std::streamsize>(content.size()));

    const auto untold = start({"--source", "replay:" + path});
    EXPECT_EQ(untold->exitStatus(), 1);
    EXPECT_EQ(untold->standardError(),
              "velmora-telephonyd: " + path +
                  ": the file does not say which technology its messages are of; technology=NAME "
                  "supplies it\n");

    const auto service = start({"--source", "replay:" + path + ",speed=max,technology=Ostrel_CDMA"});
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect()) << service->standardError();
    EXPECT_EQ(client.technology(), "kVoxLogChannelTechnology_Ostrel_CDMA");
    ASSERT_TRUE(client.stream());
    ASSERT_TRUE(eventually([&] { return client.messages.size() >= 3; }));
    EXPECT_THAT(client.messages, ElementsAre(message, message, message));
}

TEST_F(TelephonydTest, aSecondServiceIsRefused) {
    const auto service = start({"--source", "scenario:gsm"});
    ASSERT_TRUE(eventually([&] { return !serviceSockets().empty(); }));
    const auto second = start({"--source", "scenario:gsm"});
    EXPECT_EQ(second->exitStatus(), 1);
    EXPECT_EQ(second->standardError(),
              "velmora-telephonyd: the port com.velmora.vox.server is taken, wanted to be "
              "the only telephony service\n");
    TestClient client(directory.path(), "com.velmora.test.client");
    EXPECT_TRUE(client.connect()) << "the first serves on";
}

TEST_F(TelephonydTest, badCommandLinesAndInputsHaveDifferentStatus) {
    struct Case {
        Arguments arguments;
        int status;
        std::string error; ///< all of it, or its beginning where it ends in "..."
    };
    const std::string missing = (directory / "missing").string();
    for (const Case& each : {
             Case{{}, 2, "--source is required\nRun with --help for more information.\n"},
             Case{{"--source", "modem"},
                  2,
                  "velmora-telephonyd: source is \"modem\", wanted scenario:NAME[,seed=N][,speed=X], "
                  "replay:FILE[,speed=X][,loop][,technology=NAME] or modemmanager[,modem=MODEM][,sim=SIM]\n"},
             Case{{"--source", "scenario:gsm,speed=abc"},
                  2,
                  "velmora-telephonyd: speed is \"abc\", wanted a number above 0\n"},
             Case{{"--source", "scenario:gsm", "--log", "paper"},
                  2,
                  "--log: \"paper\", wanted syslog or stderr\n..."},
             Case{{"--source", "scenario:gsm", "--log-level", "8"}, 2, "--log-level: ..."},
             Case{{"--source", "scenario:gsm", "--frobnicate"},
                  2,
                  "The following argument was not expected: --frobnicate\n..."},
             Case{{"--source", "replay:" + missing}, 1, "velmora-telephonyd: " + missing + ": ..."},
         }) {
        const auto service = start(each.arguments);
        EXPECT_EQ(service->exitStatus(), each.status);
        const std::string error = service->standardError();
        if (each.error.ends_with("..."))
            EXPECT_THAT(error, ::testing::StartsWith(each.error.substr(0, each.error.size() - 3)));
        else
            EXPECT_EQ(error, each.error);
        EXPECT_THAT(service->standardOutput(), IsEmpty());
    }
}

TEST_F(TelephonydTest, helpAndVersionGoToStandardOutput) {
    const auto help = start({"--help"});
    EXPECT_EQ(help->exitStatus(), 0);
    EXPECT_THAT(help->standardOutput(), HasSubstr("velmora-telephonyd --source scenario:gsm"));
    EXPECT_THAT(help->standardOutput(), HasSubstr("velmora-telephonyd --source replay:"));
    EXPECT_THAT(help->standardError(), IsEmpty());
    const auto version = start({"--version"});
    EXPECT_EQ(version->exitStatus(), 0);
    EXPECT_THAT(version->standardOutput(),
                ::testing::MatchesRegex("velmora-telephonyd [0-9]+\\.[0-9]+\\.[0-9]+\n"));
}

} // namespace
} // namespace velmora
