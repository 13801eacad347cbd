// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberTable.h"
#include "Tests/Telephony/ModemManager/ModemManagerProcesses.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCall>
#include <QString>
#include <QStringList>
#include <QXmlStreamReader>

#include <gmock/gmock.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <map>
#include <set>

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

    /// The properties of an object, by interface, as its introspection lists them.
    [[nodiscard]] std::map<std::string, std::set<std::string>> properties(const QString& path) const {
        const QString name = QStringLiteral("velmora-test-introspection");
        std::map<std::string, std::set<std::string>> all;
        {
            auto session = QDBusConnection::connectToBus(QString::fromStdString(bus.address()), name);
            const QDBusMessage reply = session.call(QDBusMessage::createMethodCall(
                "org.freedesktop.ModemManager1", "/org/freedesktop/ModemManager1" + path,
                "org.freedesktop.DBus.Introspectable", "Introspect"));
            QXmlStreamReader reader(reply.arguments().value(0).toString());
            std::string interface;
            while (!reader.atEnd()) {
                if (reader.readNext() != QXmlStreamReader::StartElement)
                    continue;
                const std::string named = reader.attributes().value("name").toString().toStdString();
                if (reader.name() == QStringLiteral("interface"))
                    interface = named;
                else if (reader.name() == QStringLiteral("property"))
                    all[interface].insert(named);
            }
        }
        QDBusConnection::disconnectFromBus(name);
        return all;
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
    TestClient client(directory.path(), "com.velmora.test.client");
    ASSERT_TRUE(client.connect());
    ASSERT_TRUE(client.stream());
    const auto has = [&client](std::uint32_t code, const std::vector<std::string>& path, const Value& value) {
        return becomes(client, code, path, value);
    };
    // Disabled, it has its SIM already.
    ASSERT_TRUE(has(LiveModemCode::modem, {"kVoxModemState"}, 3)) << service->standardError();
    EXPECT_TRUE(has(LiveModemCode::modem, {"kVoxModemEquipment"}, "004999010640000"));
    EXPECT_TRUE(has(LiveModemCode::modem, {"kVoxModemManufacturer"}, "Velmora"));
    EXPECT_FALSE(latest(client, LiveModemCode::modem, {"kVoxModemManagerVersion"}).isNone());
    EXPECT_TRUE(has(LiveModemCode::sim, {"kSimFile_ICCID"}, "89011010000000000017"));
    EXPECT_TRUE(has(LiveModemCode::sim, {"kVoxSIMIMSI"}, "001010123456789"));
    EXPECT_TRUE(has(LiveModemCode::sim, {"kVoxSIMOperatorCode"}, "00101"));
    EXPECT_TRUE(has(LiveModemCode::sim, {"kVoxSIMOperatorName"}, "Test Network"));
    EXPECT_TRUE(has(LiveModemCode::sim, {"kSimFile_MSISDN", "0"}, "+15550100"));
    EXPECT_TRUE(has(LiveModemCode::sim, {"kVoxSIMPreferredNetworks", "0", "kVoxSIMOperatorCode"}, "00102"));
    EXPECT_TRUE(
        has(LiveModemCode::sim, {"kVoxSIMPreferredNetworks", "0", "kVoxLinkAccessTechnologies"}, 1 << 14));

    ASSERT_THAT(mmcli({"-m", "any", "--enable"}), HasSubstr("successfully enabled the modem"));
    ASSERT_TRUE(has(LiveModemCode::modem, {"kVoxModemState"}, 8));
    ASSERT_THAT(mmcli({"-m", "any", "--simple-connect=apn=internet.test"}),
                HasSubstr("successfully connected the modem"));
    ASSERT_TRUE(has(LiveModemCode::modem, {"kVoxModemState"}, 11));
    // The same, as the reference client reads it.
    EXPECT_THAT(mmcli({"-m", "any", "--location-get"}),
                AllOf(HasSubstr("tracking area code: 001005"), HasSubstr("cell id: 01A2D003")));
    EXPECT_TRUE(
        has(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorTAC"}, 4101)); // 0x1005
    EXPECT_TRUE(has(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorCellId"},
                    27447299)); // 0x01A2D003
    EXPECT_TRUE(has(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorIsPlace"}, true));
    EXPECT_TRUE(has(LiveModemCode::cells, {"kVoxModemCellReport"}, 1));
    EXPECT_THAT(mmcli({"-m", "any", "--signal-get"}),
                AllOf(HasSubstr("refresh rate: 5 seconds"), HasSubstr("rsrp: -90.00 dBm"),
                      HasSubstr("rsrq: -10.00 dB")));
    // +CSQ 20 of 31 is 64 %; +CESQ's 20 is -10 dB, and its 51 is -90 dBm.
    EXPECT_TRUE(has(LiveModemCode::link, {"kVoxLinkSignalQuality"}, 64));
    EXPECT_TRUE(has(LiveModemCode::link, {"kVoxLinkLTE", "kVoxLinkRSRP"}, -90.0));
    EXPECT_TRUE(has(LiveModemCode::link, {"kVoxLinkLTE", "kVoxLinkRSRQ"}, -10.0));
    EXPECT_TRUE(has(LiveModemCode::link, {"kVoxLinkAccessTechnologies"}, 1 << 14));
    EXPECT_TRUE(has(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorRSRP"}, -90.0));
    EXPECT_TRUE(has(LiveModemCode::registration, {"kVoxRegistrationState"}, 1));
    EXPECT_TRUE(has(LiveModemCode::registration, {"kVoxRegistrationPLMN"}, "00101"));
    EXPECT_TRUE(has(LiveModemCode::contexts, {"kVoxContexts", "0", "kVoxContextIsConnected"}, true));
    EXPECT_TRUE(has(LiveModemCode::contexts, {"kVoxContexts", "0", "kVoxContextAPN"}, "internet.test"));
    EXPECT_THAT(service->standardError(),
                HasSubstr("<4>modemmanager: modem 0 does not support cell information "
                          "(org.freedesktop.ModemManager1.Error.Core.Unsupported: "));

    // Without a client the rate is as it was.
    client.close();
    EXPECT_TRUE(eventually([this] {
        return mmcli({"-m", "any", "--signal-get"}).find("refresh rate: 0 seconds") != std::string::npos;
    }));
}

bool isInTable(MemberOf of, const std::string& property) {
    const auto rows = memberTable();
    return std::any_of(rows.begin(), rows.end(),
                       [&](const MemberRow& row) { return row.of == of && row.member == property; });
}

/// The properties that are dictionaries, whose members have rows of their own.
const std::set<std::string> dictionaries{"Cdma", "Evdo",       "Gsm",   "Umts",      "Lte",
                                         "Nr5g", "Properties", "Stats", "Ip4Config", "Ip6Config"};

TEST_F(RealModemManagerTest, everyPropertyHasItsRowInTheMemberTable) {
    startModem();
    ASSERT_TRUE(eventually([this] { return mmcli({"-L"}).find("/Modem/0") != std::string::npos; }));
    ASSERT_THAT(mmcli({"-m", "any", "--enable"}), HasSubstr("successfully enabled the modem"));
    ASSERT_THAT(mmcli({"-m", "any", "--simple-connect=apn=internet.test"}),
                HasSubstr("successfully connected the modem"));
    auto all = properties("/Modem/0");
    all.merge(properties("/SIM/0"));
    all.merge(properties("/Bearer/0"));
    const std::string prefix = "org.freedesktop.ModemManager1.";
    for (const auto& [interface, of] :
         std::map<std::string, MemberOf>{{"Modem", MemberOf::Modem},
                                         {"Modem.Modem3gpp", MemberOf::Modem3gpp},
                                         {"Modem.Location", MemberOf::Location},
                                         {"Modem.Signal", MemberOf::Signal},
                                         {"Sim", MemberOf::SIM},
                                         {"Bearer", MemberOf::Bearer}}) {
        EXPECT_GE(all[prefix + interface].size(), 5U) << interface;
        for (const std::string& property : all[prefix + interface])
            EXPECT_TRUE(dictionaries.contains(property) || isInTable(of, property))
                << interface << '.' << property;
    }
}

} // namespace
} // namespace velmora
