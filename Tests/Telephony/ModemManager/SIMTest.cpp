// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/PartsFixture.h"

/// The SIM and the slots, from the bus to the message.

namespace velmora {
namespace {

using namespace std::chrono_literals;

using SIMTest = PartsFixture;

constexpr auto code = LiveModemCode::sim;

Value data(std::vector<std::uint8_t> bytes) {
    return Data(std::move(bytes));
}

TEST_F(SIMTest, allOfTheSIMIsThere) {
    mock.put(Mock::simPath(0),
             {{Mock::sim,
               {{"SimIdentifier", "89011010000000000017"},
                {"Imsi", "001010123456789"},
                {"Eid", "89049032000000000000000000000017"},
                {"OperatorIdentifier", "00101"},
                {"OperatorName", "Test Network"},
                {"Gid1", QByteArray("\x01\xff", 2)},
                {"Gid2", QByteArray()},
                {"SimType", 2U},
                {"EmergencyNumbers", QStringList{"112", "911"}},
                {"PreferredNetworks",
                 QVariant::fromValue(PreferredNetworks{
                     {"00102", lteAccess}, {"310260", umtsAccess}, {"99999", 0}, {"bad", lteAccess}})}}}});
    putModemWith({{"OwnNumbers", QStringList{"+15550100", "+15550101"}}});
    follow();
    listen();
    const Value whole =
        root({{"kSimFile_ICCID", "89011010000000000017"},
              {"kVoxSIMIMSI", "001010123456789"},
              {"kVoxSIMEID", "89049032000000000000000000000017"},
              {"kVoxSIMOperatorCode", "00101"},
              {"kVoxSIMOperatorName", "Test Network"},
              {"kVoxSIMGroup1", data({0x01, 0xFF})},
              {"kVoxSIMType", 2},
              {"kVoxSIMEmergencyNumbers", array({"112", "911"})},
              {"kVoxSIMPreferredNetworks",
               array({dictionary({{"kVoxSIMOperatorCode", "00102"}, {"kVoxLinkAccessTechnologies", 1 << 14}}),
                      dictionary({{"kVoxSIMOperatorCode", "310260"}, {"kVoxLinkAccessTechnologies", 1 << 5}}),
                      dictionary({{"kVoxSIMOperatorCode", "99999"}})})},
              {"kSimFile_MSISDN", array({"+15550100", "+15550101"})}});
    EXPECT_TRUE(becomes(code, {}, whole));
    // What does not change is not reported again.
    const std::size_t before = count(code);
    queue.advance(10min);
    drain();
    EXPECT_EQ(count(code), before);
    mock.change(Mock::simPath(0), Mock::sim, {{"OperatorName", "Other"}});
    EXPECT_TRUE(becomes(code, {"kVoxSIMOperatorName"}, "Other"));
    mock.invalidate(Mock::simPath(0), Mock::sim, {"Imsi"});
    EXPECT_TRUE(becomes(code, {"kVoxSIMIMSI"}, {}));
}

TEST_F(SIMTest, theSlotsOfAModemWithSeveral) {
    mock.put(Mock::simPath(7), {{Mock::sim,
                                 {{"SimIdentifier", "89011010000000000025"},
                                  {"OperatorName", "Other"},
                                  {"OperatorIdentifier", "00102"},
                                  {"Active", false}}}});
    putModemWith({{"SimSlots", paths({"/", Mock::simPath(7), Mock::simPath(0)})}, {"PrimarySimSlot", 3U}});
    follow();
    listen();
    EXPECT_TRUE(becomes(
        code, {"kVoxSIMSlots"},
        array({dictionary(
                   {{"kVoxSIMSlotNumber", 1}, {"kVoxSIMSlotIsActive", false}, {"kVoxSIMSlotHasSIM", false}}),
               dictionary({{"kVoxSIMSlotNumber", 2},
                           {"kVoxSIMSlotIsActive", false},
                           {"kVoxSIMSlotHasSIM", true},
                           {"kSimFile_ICCID", "89011010000000000025"},
                           {"kVoxSIMOperatorName", "Other"},
                           {"kVoxSIMOperatorCode", "00102"}}),
               dictionary({{"kVoxSIMSlotNumber", 3},
                           {"kVoxSIMSlotIsActive", true},
                           {"kVoxSIMSlotHasSIM", true},
                           {"kSimFile_ICCID", "89011010000000000017"}})})));
    mock.change(Mock::modemPath(0), Mock::modem, {{"SimSlots", paths({Mock::simPath(0)})}});
    EXPECT_TRUE(becomes(code, {"kVoxSIMSlots"}, {})) << "one slot is no choice";
}

TEST_F(SIMTest, withoutASIMThereIsNoNumberEither) {
    putModemWith({{"OwnNumbers", QStringList("+1")}});
    follow();
    listen();
    ASSERT_TRUE(becomes(code, {"kSimFile_MSISDN"}, array({"+1"})));
    mock.change(Mock::modemPath(0), Mock::modem, {{"Sim", QVariant::fromValue(QDBusObjectPath("/"))}});
    EXPECT_TRUE(becomes(code, {}, root({})));
}

TEST_F(SIMTest, membersOfOtherTypesAreLeftOut) {
    const QVariant absurd[] = {
        5U,
        "",
        QString(5000, '1'),
        QString(129, '1'),
        QStringLiteral("8901\n1017"),
        QStringLiteral("8901\x1b[2J"),
        QString(QChar(0xFFFE)),
        QVariantMap{{"1", "2"}},
        true,
        -1.5,
    };
    for (const QVariant& each : absurd) {
        QVariantMap members;
        for (const char* name : {"SimIdentifier", "Imsi", "Eid", "OperatorIdentifier", "OperatorName",
                                 "PreferredNetworks", "EmergencyNumbers", "Gid1"})
            members[name] = each;
        mock.put(Mock::simPath(0), {{Mock::sim, members}});
        putModemWith({{"OwnNumbers", each}, {"SimSlots", each}});
        follow();
        listen();
        const std::size_t reads = mock.count("GetAll");
        ASSERT_TRUE(passes([&] { return mock.count("GetAll") >= reads + 2; }));
        drain();
        queue.advance(1s);
        EXPECT_EQ(latest(code), root({})) << each.typeName();
        sink.messages.clear();
        source->stop();
    }
}

TEST_F(SIMTest, anUnreadableSIMSaysWhyAndIsReadAgain) {
    mock.answers["GetAll"] = {{}, "org.freedesktop.DBus.Error.AccessDenied", "hands off"};
    putModemWith({{"Bearers", paths({Mock::bearerPath(0)})}});
    mock.put(Mock::bearerPath(0), {{Mock::bearer, {{"Connected", true}}}});
    follow();
    listen();
    ASSERT_TRUE(becomes(code, {"kVoxModemReason"}, "org.freedesktop.DBus.Error.AccessDenied: hands off"));
    EXPECT_TRUE(becomes(LiveModemCode::contexts, {"kVoxModemReason"},
                        "org.freedesktop.DBus.Error.AccessDenied: hands off"));
    // The SIM, the bearer and ModemManager itself.
    ASSERT_TRUE(passes([this] { return mock.count("GetAll") == 6; }));
    EXPECT_LE(60s, clock.now() - FakeClock::defaultNow());
    EXPECT_THAT(warnings(),
                ::testing::IsSupersetOf({"modemmanager: no permission to ask modem 0 for its SIM "
                                         "(org.freedesktop.DBus.Error.AccessDenied: hands off)",
                                         "modemmanager: no permission to ask modem 0 for a bearer "
                                         "(org.freedesktop.DBus.Error.AccessDenied: hands off)"}));
    EXPECT_EQ(warnings().size(), 3U) << "and one of the cells";
    mock.answers.erase("GetAll");
    EXPECT_TRUE(becomes(code, {"kSimFile_ICCID"}, "89011010000000000017"));
    EXPECT_TRUE(latest(code, {"kVoxModemReason"}).isNone());
}

} // namespace
} // namespace velmora
