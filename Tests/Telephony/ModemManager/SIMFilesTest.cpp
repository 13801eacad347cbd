// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/SIMAndBearersFixture.h"

/// The SIM's files, from the bus to what a decoder shows.

namespace velmora {
namespace {

using namespace std::chrono_literals;

using SIMFilesTest = SIMAndBearersFixture;

TEST_F(SIMFilesTest, theSIMsFilesAreShown) {
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
    EXPECT_TRUE(receives(simCode,
                         dictionary({{"kSimFile_ICCID", "89011010000000000017"},
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
    // What does not change is not reported again.
    queue.advance(10min);
    drain();
    EXPECT_EQ(count(simCode), 1U);
    mock.change(Mock::simPath(0), Mock::sim, {{"OperatorName", "Other"}});
    ASSERT_TRUE(passes([this] { return count(simCode) == 2; }));
    EXPECT_EQ(at(latest(simCode), {"kSimFile_PNN"}), Value("Other"));
}

TEST_F(SIMFilesTest, absurdFilesAreLeftOut) {
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
        EXPECT_TRUE(receives(simCode, dictionary({{"kSimFile_MSISDN", "+1"}}))) << each.typeName();
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

TEST_F(SIMFilesTest, unreadablePartsAreReportedOnceAndRetried) {
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
