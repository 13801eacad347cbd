// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/SIMAndBearersFixture.h"

#include <limits>

/// The packet-data contexts, from the bus to what a decoder shows.

namespace velmora {
namespace {

using namespace std::chrono_literals;

using BearersTest = SIMAndBearersFixture;

/// What the link of `testModem` shows.
constexpr std::pair<const char*, const char*> linkValues[] = {
    {"Registration", "Home"},      {"Operator", "001-01"},       {"Operator Name", "Test Network"},
    {"Modem State", "Registered"}, {"Access Technology", "LTE"}, {"Signal Quality", "60 %"},
};

/// A context of these values and the link's.
Value context(std::initializer_list<Dictionary::Entry> entries) {
    const auto values = std::make_shared<Dictionary>(entries);
    for (const auto& [label, text] : linkValues)
        values->set(label, text);
    return values;
}

TEST_F(BearersTest, bearersAreShown) {
    mock.put(
        Mock::bearerPath(0),
        {{Mock::bearer,
          {{"Connected", true},
           {"Suspended", false},
           {"BearerType", 1U},
           {"ProfileId", 3},
           {"Interface", "wwan0"},
           {"Properties",
            QVariantMap{{"apn", "internet.test"}, {"ip-type", 4U}, {"user", "me"}, {"password", "secret"}}},
           {"Ip4Config", QVariantMap{{"method", 2U},
                                     {"address", "192.0.2.17"},
                                     {"prefix", 30U},
                                     {"gateway", "192.0.2.18"},
                                     {"dns1", "192.0.2.1"},
                                     {"dns2", "192.0.2.2"},
                                     {"mtu", 1430U}}},
           {"Ip6Config", QVariantMap{{"method", 3U}, {"address", "2001:db8::17"}, {"prefix", 64U}}},
           {"Stats", QVariantMap{{"rx-bytes", qulonglong(123456789012)},
                                 {"tx-bytes", qulonglong(98765)},
                                 {"duration", 61U},
                                 {"start-date", qulonglong(1700000000)}, // 2023-11-14 22:13:20
                                 {"uplink-speed", qulonglong(50000000)},
                                 {"downlink-speed", qulonglong(0)}}}}}});
    mock.put(Mock::bearerPath(1), {{Mock::bearer,
                                    {{"Connected", false},
                                     {"ProfileId", -1},
                                     {"Properties", QVariantMap{{"apn", "mms.test"}, {"ip-type", 2U}}},
                                     {"Ip4Config", QVariantMap{{"method", 0U}}}}}});
    mock.put(Mock::bearerPath(7), {{Mock::bearer, {{"Connected", true}, {"BearerType", 2U}}}});
    InterfaceMap modem =
        testModem(lteAccess, {{"Bearers", paths({Mock::bearerPath(1), Mock::bearerPath(0)})}});
    modem[Mock::modem3gpp]["InitialEpsBearer"] = QVariant::fromValue(QDBusObjectPath(Mock::bearerPath(7)));
    mock.put(Mock::modemPath(0), modem);
    follow();
    listen();
    const Value contexts = std::make_shared<Array>(Array{
        context({{"Bearer", "1"}, {"State", "Disconnected"}, {"APN", "mms.test"}, {"PDP Type", "IPv6"}}),
        context({{"Bearer", "0"},
                 {"State", "Connected"},
                 {"Suspended", "No"},
                 {"Type", "Default"},
                 {"Context ID", "3"},
                 {"Interface", "wwan0"},
                 {"APN", "internet.test"},
                 {"PDP Type", "IPv4v6"},
                 {"IPv4 Method", "Static"},
                 {"PDP Address", "192.0.2.17"},
                 {"IPv4 Prefix Length", "30"},
                 {"IPv4 Gateway", "192.0.2.18"},
                 {"Primary DNS", "192.0.2.1"},
                 {"Secondary DNS", "192.0.2.2"},
                 {"IPv4 MTU", "1430 bytes"},
                 {"IPv6 Method", "DHCP"},
                 {"PDP Address (IPv6)", "2001:db8::17"},
                 {"IPv6 Prefix Length", "64"},
                 {"Maximum Bit Rate Uplink", "50000 kbit/s"},
                 {"Connected Since", "2023-11-14 22:13:20 +0000"},
                 {"Duration", "61 s"},
                 {"Received", "123456789012 bytes"},
                 {"Sent", "98765 bytes"}}),
        context({{"Bearer", "7"}, {"State", "Connected"}, {"Type", "Default, attach"}}),
    });
    EXPECT_TRUE(receives(contextCode, contexts));
    EXPECT_EQ(at(display("LTE"), {"Packet Data", "PDP Context Info"}), contexts);

    mock.change(Mock::bearerPath(1), Mock::bearer, {{"Connected", true}, {"Interface", "wwan1"}});
    mock.invalidate(Mock::bearerPath(1), Mock::bearer, {"Properties"});
    mock.change(Mock::modemPath(0), Mock::modem, {{"Bearers", paths({Mock::bearerPath(1)})}});
    EXPECT_TRUE(receives(
        contextCode, std::make_shared<Array>(Array{
                         context({{"Bearer", "1"}, {"State", "Connected"}, {"Interface", "wwan1"}}),
                         context({{"Bearer", "7"}, {"State", "Connected"}, {"Type", "Default, attach"}})})));
}

TEST_F(BearersTest, aModemWithoutBearersShowsItsLink) {
    InterfaceMap modem = testModem(lteAccess);
    modem[Mock::signal] = {{"Rate", 1U},
                           {"Gsm", QVariantMap()},
                           {"Lte", QVariantMap{{"rssi", -62.0},
                                               {"rsrp", -95.25},
                                               {"rsrq", -10.5},
                                               {"snr", 13.04},
                                               {"error-rate", std::numeric_limits<double>::quiet_NaN()}}},
                           {"Umts", QVariantMap{{"rscp", 77.0}, {"ecio", "-5"}, {"rssi", -1e300}}}};
    mock.put(Mock::modemPath(0), modem);
    follow();
    listen();
    Value link = context({{"Bearer", "None"}});
    for (const auto& [label, text] : {std::pair("LTE RSSI", "-62.0 dBm"), std::pair("LTE RSRP", "-95.3 dBm"),
                                      std::pair("LTE RSRQ", "-10.5 dB"), std::pair("LTE SNR", "13.0 dB")})
        link.asDictionary()->set(label, text);
    ASSERT_TRUE(receives(contextCode, std::make_shared<Array>(Array{link})));

    // Levels change often; they are reported together.
    const std::size_t before = count(contextCode);
    for (int i = 0; i < 50; ++i)
        mock.change(Mock::modemPath(0), Mock::signal, {{"Lte", QVariantMap{{"rsrp", -100.0 - i * 0.1}}}});
    drain();
    queue.advance(100ms);
    EXPECT_EQ(count(contextCode), before + 1);
    EXPECT_EQ(at(latest(contextCode), {"0", "LTE RSRP"}), Value("-104.9 dBm"));
    mock.removeInterface(Mock::modemPath(0), Mock::signal);
    EXPECT_TRUE(receives(contextCode, std::make_shared<Array>(Array{context({{"Bearer", "None"}})})));
}

TEST_F(BearersTest, absurdLinksAndBearersAreLeftOut) {
    const QVariantMap bearerMembers = {
        {"Connected", 1U},
        {"Suspended", "no"},
        {"BearerType", "1"},
        {"ProfileId", -2},
        {"Interface", QString(200, 'w')},
        {"Properties", QStringList{"apn"}},
        {"Ip4Config", QVariantMap{{"address", "999.0.2.17"},
                                  {"gateway", "192.0.2"},
                                  {"dns1", 5U},
                                  {"prefix", "24"},
                                  {"mtu", -5},
                                  {"method", "static"}}},
        {"Ip6Config", 5U},
        {"Stats", QVariantMap{{"rx-bytes", std::numeric_limits<qulonglong>::max()},
                              {"tx-bytes", -1},
                              {"duration", 1.5},
                              {"start-date", qulonglong(1) << 62},
                              {"uplink-speed", "fast"}}},
    };
    mock.put(Mock::bearerPath(0), {{Mock::bearer, bearerMembers}});
    InterfaceMap modem = testModem(
        lteAccess, {{"State", "8"},
                    {"SignalQuality", QVariant::fromValue(Quality{101, true})},
                    {"AccessTechnologies", lteAccess},
                    {"Bearers", QVariant::fromValue(QStringList{Mock::bearerPath(0), "no path", "/", ""})}});
    modem[Mock::modem3gpp] = {{"RegistrationState", -1.0},
                              {"OperatorCode", "1"},
                              {"OperatorName", "\x07"},
                              {"InitialEpsBearer", 5U}};
    mock.put(Mock::modemPath(0), modem);
    follow();
    listen();
    EXPECT_TRUE(receives(contextCode, std::make_shared<Array>(Array{
                                          dictionary({{"Bearer", "0"}, {"Access Technology", "LTE"}})})));
}

TEST_F(BearersTest, manyBearersAreCut) {
    QStringList many;
    for (int i = 0; i < 100; ++i) {
        mock.put(Mock::bearerPath(i), {{Mock::bearer, {{"Connected", false}}}});
        many.push_back(Mock::bearerPath(i));
    }
    putModem({{"Bearers", paths(many)}});
    follow();
    listen();
    EXPECT_TRUE(passes(
        [this] { return latest(contextCode).asArray() && latest(contextCode).asArray()->size() == 8; }));
}

} // namespace
} // namespace velmora
