// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/PartsFixture.h"

#include <limits>

/// The packet-data contexts and their traffic, from the bus to the messages.

namespace velmora {
namespace {

using namespace std::chrono_literals;

using ContextsTest = PartsFixture;

constexpr auto code = LiveModemCode::contexts;

QVariantMap statistics(qulonglong received, qulonglong sent, uint duration) {
    return {{"rx-bytes", received},
            {"tx-bytes", sent},
            {"duration", duration},
            {"start-date", qulonglong(1700000000)},
            {"uplink-speed", qulonglong(50000000)},
            {"downlink-speed", qulonglong(0)}};
}

TEST_F(ContextsTest, allOfABearerIsThere) {
    mock.put(
        Mock::bearerPath(3),
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
                                     {"dns3", "192.0.2.3"},
                                     {"mtu", 1430U}}},
           {"Ip6Config", QVariantMap{{"method", 3U}, {"address", "2001:db8::17"}, {"prefix", 64U}}},
           {"Stats", statistics(123456789012, 98765, 61)}}}});
    putModemWith({{"Bearers", paths({Mock::bearerPath(3)})}});
    follow();
    listen();
    EXPECT_TRUE(
        becomes(code, {},
                root({{"kVoxContexts",
                       array({dictionary({
                           {"kVoxContextBearer", 3},
                           {"kVoxContextIsConnected", true},
                           {"kVoxContextIsSuspended", false},
                           {"kVoxContextType", 1},
                           {"kVoxContextProfile", 3},
                           {"kVoxContextAPN", "internet.test"},
                           {"kVoxContextIPFamily", 4},
                           {"kVoxContextInterface", "wwan0"},
                           {"kVoxContextUplinkSpeed", 50000000},
                           {"kVoxContextStart", Date(1700000000s)},
                           {"kVoxContextIPv4",
                            dictionary({{"kVoxContextMethod", 2},
                                        {"kVoxContextAddress", "192.0.2.17"},
                                        {"kVoxContextPrefix", 30},
                                        {"kVoxContextGateway", "192.0.2.18"},
                                        {"kVoxContextDNS", array({"192.0.2.1", "192.0.2.2", "192.0.2.3"})},
                                        {"kVoxContextMTU", 1430}})},
                           {"kVoxContextIPv6", dictionary({{"kVoxContextMethod", 3},
                                                           {"kVoxContextAddress", "2001:db8::17"},
                                                           {"kVoxContextPrefix", 64}})},
                       })})}})));
    EXPECT_EQ(latest(LiveModemCode::traffic),
              root({{"kVoxTraffic", array({dictionary({{"kVoxTrafficBearer", 3},
                                                       {"kVoxTrafficInterface", "wwan0"},
                                                       {"kVoxTrafficReceived", 123456789012},
                                                       {"kVoxTrafficSent", 98765},
                                                       {"kVoxTrafficDuration", 61}})})}}));

    // A bearer that has disconnected keeps no address and no traffic, even where ModemManager does.
    mock.change(Mock::bearerPath(3), Mock::bearer, {{"Connected", false}});
    EXPECT_TRUE(becomes(code, {"kVoxContexts", "0", "kVoxContextIsConnected"}, false));
    EXPECT_TRUE(latest(code, {"kVoxContexts", "0", "kVoxContextIPv4"}).isNone());
    EXPECT_EQ(latest(LiveModemCode::traffic, {"kVoxTraffic"}), array({}));
}

TEST_F(ContextsTest, severalBearersAndTheOneFromTheAttach) {
    mock.put(Mock::bearerPath(1),
             {{Mock::bearer,
               {{"Connected", false},
                {"ProfileId", -1},
                {"ConnectionError", QVariant::fromValue(BearerError{"a.b.C", "no answer"})},
                {"Properties", QVariantMap{{"apn", "mms.test"}, {"ip-type", 2U}}},
                {"Ip4Config", QVariantMap{{"method", 0U}}}}}});
    mock.put(Mock::bearerPath(7), {{Mock::bearer, {{"Connected", true}, {"BearerType", 2U}}}});
    InterfaceMap modem = testModem(lteAccess, {{"Bearers", paths({Mock::bearerPath(1)})}});
    modem[Mock::modem3gpp]["InitialEpsBearer"] = QVariant::fromValue(QDBusObjectPath(Mock::bearerPath(7)));
    mock.put(Mock::modemPath(0), modem);
    follow();
    listen();
    const Value attach =
        dictionary({{"kVoxContextBearer", 7}, {"kVoxContextIsConnected", true}, {"kVoxContextType", 2}});
    EXPECT_TRUE(becomes(code, {"kVoxContexts"},
                        array({dictionary({{"kVoxContextBearer", 1},
                                           {"kVoxContextIsConnected", false},
                                           {"kVoxContextAPN", "mms.test"},
                                           {"kVoxContextIPFamily", 2},
                                           {"kVoxContextError", "a.b.C: no answer"}}),
                               attach})));
    mock.change(Mock::modemPath(0), Mock::modem, {{"Bearers", paths({})}});
    EXPECT_TRUE(becomes(code, {"kVoxContexts"}, array({attach})));
}

TEST_F(ContextsTest, aSilentBearerDelaysNoOther) {
    mock.put(Mock::bearerPath(0), {{Mock::bearer, {{"Connected", true}}}});
    mock.put(Mock::bearerPath(1), {{Mock::bearer, {{"Connected", false}}}});
    putModemWith({{"Bearers", paths({Mock::bearerPath(0), Mock::bearerPath(1)})}});
    mock.heldPath = Mock::bearerPath(0);
    setCells({{{"cell-type", 5U}, {"serving", true}, {"earfcn", 1300U}}});
    follow();
    listen();
    EXPECT_TRUE(becomes(code, {"kVoxContexts"},
                        array({dictionary({{"kVoxContextBearer", 0}}),
                               dictionary({{"kVoxContextBearer", 1}, {"kVoxContextIsConnected", false}})})));
    EXPECT_TRUE(becomes(LiveModemCode::sim, {"kSimFile_ICCID"}, "89011010000000000017"));
    EXPECT_EQ(at(cells(), {"0", "kVoxCellMonitorEARFCN"}), Value(1300));
    mock.release();
    EXPECT_TRUE(becomes(code, {"kVoxContexts", "0", "kVoxContextIsConnected"}, true));
}

TEST_F(ContextsTest, theRatesFollowFromTheTimeBetweenAnswers) {
    mock.put(Mock::bearerPath(0),
             {{Mock::bearer, {{"Connected", true}, {"Stats", statistics(1000, 500, 10)}}}});
    putModemWith({{"Bearers", paths({Mock::bearerPath(0)})}});
    follow();
    listen();
    ASSERT_TRUE(becomes(LiveModemCode::traffic, {"kVoxTraffic", "0", "kVoxTrafficReceived"}, 1000));
    EXPECT_TRUE(latest(LiveModemCode::traffic, {"kVoxTraffic", "0", "kVoxTrafficDownlinkRate"}).isNone());
    const Time first = clock.now();
    queue.advance(30s - (clock.now() - first));
    const Time before = clock.now();
    mock.change(Mock::bearerPath(0), Mock::bearer, {{"Stats", statistics(1000 + 37500, 500 + 3750, 40)}});
    drain();
    EXPECT_EQ(clock.now(), before);
    ASSERT_TRUE(becomes(LiveModemCode::traffic, {"kVoxTraffic", "0", "kVoxTrafficReceived"}, 38500));
    const Value row = latest(LiveModemCode::traffic, {"kVoxTraffic", "0"});
    const double interval = realOf(at(row, {"kVoxTrafficInterval"}));
    // The first answer came within a few tenths of a second.
    EXPECT_NEAR(interval, 30, 1);
    EXPECT_DOUBLE_EQ(realOf(at(row, {"kVoxTrafficDownlinkRate"})), 300'000 / interval); // 37500 bytes
    EXPECT_DOUBLE_EQ(realOf(at(row, {"kVoxTrafficUplinkRate"})), 30'000 / interval);
}

TEST_F(ContextsTest, membersOfOtherTypesAreLeftOut) {
    const QVariantMap bearer = {
        {"Connected", 1U},
        {"Suspended", "no"},
        {"BearerType", "1"},
        {"ProfileId", -2},
        {"Interface", QString(200, 'w')},
        {"ConnectionError", "none"},
        {"Properties", QStringList{"apn"}},
        {"Ip4Config", QVariantMap{{"address", "999.0.2.17"}, {"dns1", 5U}, {"prefix", 33U}}},
        {"Ip6Config", 5U},
        {"Stats", QVariantMap{{"rx-bytes", std::numeric_limits<qulonglong>::max()},
                              {"tx-bytes", -1},
                              {"duration", 1.5},
                              {"start-date", qulonglong(1) << 62},
                              {"uplink-speed", "fast"}}},
    };
    mock.put(Mock::bearerPath(0), {{Mock::bearer, bearer}});
    putModemWith({{"Bearers", QVariant::fromValue(QStringList{Mock::bearerPath(0), "no path", "/", ""})}});
    follow();
    listen();
    const Value nothing = array({dictionary({{"kVoxContextBearer", 0}})});
    EXPECT_TRUE(becomes(code, {"kVoxContexts"}, nothing));
    mock.change(Mock::bearerPath(0), Mock::bearer, {{"Connected", true}});
    EXPECT_TRUE(becomes(code, {"kVoxContexts"},
                        array({dictionary({{"kVoxContextBearer", 0}, {"kVoxContextIsConnected", true}})})));
    EXPECT_EQ(latest(LiveModemCode::traffic, {"kVoxTraffic"}), array({}));
}

TEST_F(ContextsTest, moreBearersThanAModemHasAreSkipped) {
    QStringList many;
    for (int i = 0; i < 100; ++i) {
        mock.put(Mock::bearerPath(i), {{Mock::bearer, {{"Connected", false}}}});
        many.push_back(Mock::bearerPath(i));
    }
    putModemWith({{"Bearers", paths(many)}});
    follow();
    listen();
    EXPECT_TRUE(becomes(code, {"kVoxContexts", "7", "kVoxContextIsConnected"}, false));
    EXPECT_EQ(latest(code, {"kVoxContexts"}).asArray()->size(), 8U);
}

} // namespace
} // namespace velmora
