// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/ModemManagerProcesses.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCall>
#include <QString>
#include <QStringList>

#include <gmock/gmock.h>
#include <unistd.h>

#include <filesystem>

/// The telephony service with ModemManager itself, whose modem is a responder of AT commands.

namespace velmora {
namespace {

using ::testing::AllOf;
using ::testing::HasSubstr;

class RealModemManagerTest : public ModemManagerProcesses {
protected:
    static constexpr const char* program = "/usr/sbin/ModemManager";

    void SetUp() override {
        for (const char* needed : {program, "/usr/bin/mmcli", "/usr/bin/python3"})
            if (!std::filesystem::exists(needed))
                GTEST_SKIP() << "there is no " << needed;
    }

    /// Starts the responder, and ModemManager with it as its modem.
    void startModem() {
        const std::string port = "abstract:velmora-test-" + std::to_string(::getpid());
        responder = start("/usr/bin/python3",
                          {VELMORA_SOURCE_DIR "/Tests/Telephony/ModemManager/modem-responder", port});
        ASSERT_TRUE(eventually([this] { return responder->standardOutput().starts_with("listening\n"); }))
            << responder->standardError();
        daemon = start(program, {"--test-session", "--test-enable", "--test-no-udev",
                                 "--test-no-suspend-resume", "--test-no-qrtr", "--no-auto-scan"});
        ASSERT_TRUE(eventually([&] { return setProfile(port); })) << daemon->standardError();
    }

    /// False while ModemManager is not on the bus yet.
    bool setProfile(const std::string& port) {
        const QString name = QStringLiteral("velmora-test-profile");
        bool done = false;
        {
            auto session = QDBusConnection::connectToBus(QString::fromStdString(bus.address()), name);
            auto message = QDBusMessage::createMethodCall("org.freedesktop.ModemManager1",
                                                          "/org/freedesktop/ModemManager1",
                                                          "org.freedesktop.ModemManager1.Test", "SetProfile");
            message << "profile0"
                    << "generic" << QStringList(QString::fromStdString(port));
            const QDBusMessage reply = session.call(message);
            done = reply.type() == QDBusMessage::ReplyMessage;
        }
        QDBusConnection::disconnectFromBus(name);
        return done;
    }

    std::unique_ptr<TestProcess> responder;
    std::unique_ptr<TestProcess> daemon;
};

TEST_F(RealModemManagerTest, showsTheModemAsItIsEnabledRegistersAndConnects) {
    serve("modemmanager", "<5>serving modemmanager");
    startModem();
    ASSERT_TRUE(eventually([this] {
        return service->standardError().find("<5>modemmanager: following modem 0 Velmora Responder\n") !=
               std::string::npos;
    })) << service->standardError();
    // Disabled, it has its SIM already, and what it can do says which technology it will speak.
    auto watcher = watch();
    EXPECT_THAT(shown(*watcher, {"EF-ICCID", "Modem State Disabled"}),
                HasSubstr("SIM Info\n"
                          " EF-ICCID 89011010000000000017\n"
                          " EF-MSISDN +15550100\n"
                          " EF-ACTING HPLMN 001-01\n"
                          " EF-PLMN NETWORK NAME Test Network\n"
                          " EF-OPLMNAcT 001-02 (LTE), 999-70 (GSM, UMTS)\n"))
        << service->standardError();

    ASSERT_THAT(mmcli({"-m", "any", "--enable"}), HasSubstr("successfully enabled the modem"));
    ASSERT_NE(shown(*watcher, {"Modem State Registered", "LTE RSRP", "Cell Identity"}), "");
    ASSERT_THAT(mmcli({"-m", "any", "--simple-connect=apn=internet.test"}),
                HasSubstr("successfully connected the modem"));
    const std::string refresh = shown(*watcher, {"Modem State Connected", " State Connected"});
    // The same, as the reference client reads it.
    EXPECT_THAT(mmcli({"-m", "any", "--location-get"}),
                AllOf(HasSubstr("tracking area code: 001005"), HasSubstr("cell id: 01A2D003")));
    EXPECT_THAT(refresh, HasSubstr(" Serving Cell Info\n"
                                   " Tracking Area Code 4101\n"   // 0x1005
                                   " Cell Identity 27447299\n")); // 0x01A2D003
    EXPECT_THAT(mmcli({"-m", "any", "--signal-get"}),
                AllOf(HasSubstr("refresh rate: 5 seconds"), HasSubstr("rsrp: -90.00 dBm"),
                      HasSubstr("rsrq: -10.00 dB")));
    // +CSQ 20 of 31 is 64 %; +CESQ's 20 is -10 dB, and its 51 is -90 dBm.
    for (const char* line : {" APN internet.test\n", " Interface abstract:", " Registration Home\n",
                             " Operator 001-01\n", " Access Technology LTE\n", " Signal Quality 64 %\n",
                             " LTE RSRP -90.0 dBm\n", " LTE RSRQ -10.0 dB\n"})
        EXPECT_THAT(refresh, HasSubstr(line));
    EXPECT_THAT(service->standardError(),
                HasSubstr("<4>modemmanager: modem 0 does not support cell information "
                          "(org.freedesktop.ModemManager1.Error.Core.Unsupported: "));

    // Nobody watches any more: the rate is as it was.
    watcher.reset();
    EXPECT_TRUE(eventually([this] {
        return mmcli({"-m", "any", "--signal-get"}).find("refresh rate: 0 seconds") != std::string::npos;
    }));
}

} // namespace
} // namespace velmora
