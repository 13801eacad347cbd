// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include <limits>

/// The SIM's files and the packet-data contexts, from the bus to what a decoder shows.

namespace velmora {
namespace {

using namespace std::chrono_literals;

Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

class SIMAndBearersTest : public ModemManagerTest {
protected:
    void putModem(const QVariantMap& properties) {
        mock.put(Mock::modemPath(0), testModem(lteAccess, properties));
    }
    static QVariant paths(const QStringList& texts) {
        QList<QDBusObjectPath> list;
        for (const QString& text : texts)
            list.push_back(QDBusObjectPath(text));
        return QVariant::fromValue(list);
    }
    [[nodiscard]] bool tells(std::uint16_t code, const Value& list) {
        return passes([&] { return latest(code) == list; });
    }
};

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

TEST_F(SIMAndBearersTest, theSIMsFilesAreShown) {
    mock.put(
        Mock::simPath(0),
        {{Mock::sim,
          {{"SimIdentifier", "89011010000000000017"},
           {"Imsi", "001010123456789"},
           {"OperatorIdentifier", "00101"},
           {"OperatorName", "Test Network"},
           {"EmergencyNumbers", QStringList{"112"}},
           {"PreferredNetworks", QVariant::fromValue(PreferredNetworks{{"00102", lteAccess},
                                                                       {"310260", umtsAccess | gsmAccess},
                                                                       {"99999", 0},
                                                                       {"bad", lteAccess}})}}}});
    putModem({{"OwnNumbers", QStringList{"+15550100", "+15550101"}}});
    follow();
    listen();
    EXPECT_TRUE(
        tells(simCode, dictionary({{"kSimFile_ICCID", "89011010000000000017"},
                                   {"kSimFile_AHPLMN", "001-01"},
                                   {"kSimFile_PNN", "Test Network"},
                                   {"kSimFile_OPLMNAcT", "001-02 (LTE), 310-260 (GSM, GPRS, UMTS), 999-99"},
                                   {"kSimFile_MSISDN", "+15550100, +15550101"}})));
    EXPECT_EQ(at(display("LTE"), {"SIM Info"}),
              dictionary({{"EF-ICCID", "89011010000000000017"},
                          {"EF-MSISDN", "+15550100, +15550101"},
                          {"EF-ACTING HPLMN", "001-01"},
                          {"EF-PLMN NETWORK NAME", "Test Network"},
                          {"EF-OPLMNAcT", "001-02 (LTE), 310-260 (GSM, GPRS, UMTS), 999-99"}}));
    // What does not change is not told again.
    queue.advance(10min);
    drain();
    EXPECT_EQ(count(simCode), 1U);
    mock.change(Mock::simPath(0), Mock::sim, {{"OperatorName", "Other"}});
    ASSERT_TRUE(passes([this] { return count(simCode) == 2; }));
    EXPECT_EQ(at(latest(simCode), {"kSimFile_PNN"}), Value("Other"));
}

TEST_F(SIMAndBearersTest, absurdFilesAreLeftOut) {
    const QVariant absurd[] = {
        {},
        5U,
        "",
        QString(5000, '1'),
        QString(129, '1'),
        QStringLiteral("8901\n1017"),
        QStringLiteral("8901\x1b[2J"),
        QString(QChar(0xFFFE)),
        QStringList{"1"},
        QVariantMap{{"1", "2"}},
        QByteArray("1\0\xff", 3),
        true,
        -1.5,
    };
    for (const QVariant& each : absurd) {
        QVariantMap files;
        if (each.isValid())
            for (const char* name :
                 {"SimIdentifier", "OperatorIdentifier", "OperatorName", "PreferredNetworks"})
                files[name] = each;
        mock.put(Mock::simPath(0), {{Mock::sim, files}});
        putModem({{"OwnNumbers", QStringList("+1")}});
        follow();
        listen();
        EXPECT_TRUE(tells(simCode, dictionary({{"kSimFile_MSISDN", "+1"}}))) << each.typeName();
        sink.messages.clear();
        source->stop();
    }
    for (const QVariant& each :
         {QVariant(5U), QVariant("5"), QVariant(QStringList{"", "\x01"}), QVariant(QVariantMap())}) {
        putModem({{"OwnNumbers", each}});
        follow();
        listen();
        queue.advance(1s);
        drain();
        queue.advance(1s);
        EXPECT_EQ(count(simCode), 0U) << each.typeName();
        source->stop();
    }
}

TEST_F(SIMAndBearersTest, bearersAreShown) {
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
    EXPECT_TRUE(tells(contextCode, contexts));
    EXPECT_EQ(at(display("LTE"), {"Packet Data", "PDP Context Info"}), contexts);

    mock.change(Mock::bearerPath(1), Mock::bearer, {{"Connected", true}, {"Interface", "wwan1"}});
    mock.invalidate(Mock::bearerPath(1), Mock::bearer, {"Properties"});
    mock.change(Mock::modemPath(0), Mock::modem, {{"Bearers", paths({Mock::bearerPath(1)})}});
    EXPECT_TRUE(tells(contextCode,
                      std::make_shared<Array>(Array{
                          context({{"Bearer", "1"}, {"State", "Connected"}, {"Interface", "wwan1"}}),
                          context({{"Bearer", "7"}, {"State", "Connected"}, {"Type", "Default, attach"}})})));
}

TEST_F(SIMAndBearersTest, aModemWithoutBearersShowsItsLink) {
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
    ASSERT_TRUE(tells(contextCode, std::make_shared<Array>(Array{link})));

    // Levels change often; they are told together.
    const std::size_t before = count(contextCode);
    for (int i = 0; i < 50; ++i)
        mock.change(Mock::modemPath(0), Mock::signal, {{"Lte", QVariantMap{{"rsrp", -100.0 - i * 0.1}}}});
    drain();
    queue.advance(100ms);
    EXPECT_EQ(count(contextCode), before + 1);
    EXPECT_EQ(at(latest(contextCode), {"0", "LTE RSRP"}), Value("-104.9 dBm"));
    mock.removeInterface(Mock::modemPath(0), Mock::signal);
    EXPECT_TRUE(tells(contextCode, std::make_shared<Array>(Array{context({{"Bearer", "None"}})})));
}

TEST_F(SIMAndBearersTest, absurdLinksAndBearersAreLeftOut) {
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
    EXPECT_TRUE(tells(contextCode, std::make_shared<Array>(
                                       Array{dictionary({{"Bearer", "0"}, {"Access Technology", "LTE"}})})));
}

TEST_F(SIMAndBearersTest, manyBearersAreCut) {
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

TEST_F(SIMAndBearersTest, partsThatCannotBeReadAreToldOnceAndTriedAgain) {
    mock.answers["GetAll"] = {{}, "org.freedesktop.DBus.Error.AccessDenied", "hands off"};
    putModem({{"Bearers", paths({Mock::bearerPath(0)})}});
    mock.put(Mock::bearerPath(0), {{Mock::bearer, {{"Connected", true}}}});
    follow();
    listen();
    ASSERT_TRUE(passes([this] { return mock.count("GetAll") == 6; }));
    EXPECT_LE(std::chrono::seconds(110), clock.now() - FakeClock::defaultNow());
    EXPECT_THAT(warnings(),
                ::testing::IsSupersetOf({"modemmanager: no permission to ask modem 0 for its SIM "
                                         "(org.freedesktop.DBus.Error.AccessDenied: hands off)",
                                         "modemmanager: no permission to ask modem 0 for a bearer "
                                         "(org.freedesktop.DBus.Error.AccessDenied: hands off)"}));
    EXPECT_EQ(warnings().size(), 3U) << "and one of the cells";
    EXPECT_EQ(at(latest(contextCode), {"0", "Bearer"}), Value("None"));
    mock.answers.erase("GetAll");
    EXPECT_TRUE(passes([this] { return at(latest(contextCode), {"0", "State"}) == Value("Connected"); }));
    // The answers come in any order.
    EXPECT_TRUE(
        passes([this] { return at(latest(simCode), {"kSimFile_ICCID"}) == Value("89011010000000000017"); }));
}

} // namespace
} // namespace velmora
