// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Reports/PositionReport.h"

#include "Tests/Telephony/ModemManager/PartsFixture.h"

/// The position, where another program has turned the modem's satellite receiver on.

namespace velmora {
namespace {

using namespace std::chrono_literals;

class PositionTest : public PartsFixture {
protected:
    void put(uint enabled) {
        InterfaceMap modem = testModem(lteAccess);
        modem[Mock::location] = {{"Capabilities", 7U}, {"Enabled", enabled}};
        mock.put(Mock::modemPath(0), modem);
        setCells({{{"cell-type", 5U}, {"serving", true}, {"earfcn", 1300U}}});
    }
    void answerLocation(const LocationMap& location) {
        mock.answers["GetLocation"] = {{QVariant::fromValue(location)}, {}, {}};
    }
    static QDBusVariant receiver(const QVariantMap& members) { return QDBusVariant(members); }
};

constexpr auto code = LiveModemCode::position;

TEST_F(PositionTest, theReceiversDictionary) {
    put(1U << 1 | 1U);
    answerLocation({{2U, receiver({{"utc-time", "203015"},
                                   {"latitude", -38.889722},
                                   {"longitude", 77.008889},
                                   {"altitude", 33.5}})}});
    follow();
    listen();
    EXPECT_TRUE(becomes(code, {},
                        root({{"kVoxPositionLatitude", -38.889722},
                              {"kVoxPositionLongitude", 77.008889},
                              {"kVoxPositionAltitude", 33.5},
                              {"kVoxPositionTime", "203015"}})));
    // A position that is lost is gone at the next answer.
    answerLocation({{2U, receiver({{"utc-time", "203018"}})}});
    EXPECT_TRUE(becomes(code, {}, root({})));
    EXPECT_EQ(mock.count("Setup"), 0U) << "satellites are left as they are";
}

TEST_F(PositionTest, itIsAskedForOnlyWhileSatellitesAreOn) {
    put(1U);
    answerLocation({});
    follow();
    listen();
    ASSERT_TRUE(passes([this] { return mock.count("GetCellInfo") == 4; }));
    EXPECT_EQ(mock.count("GetLocation"), 0U);
    mock.change(Mock::modemPath(0), Mock::location, {{"Enabled", 1U << 2}});
    ASSERT_TRUE(passes([this] { return mock.count("GetLocation") == 2; }));
    mock.change(Mock::modemPath(0), Mock::location, {{"Enabled", 0U}});
    drain();
    const std::size_t asked = mock.count("GetLocation");
    queue.advance(1min);
    drain();
    EXPECT_EQ(mock.count("GetLocation"), asked);
}

TEST_F(PositionTest, aRefusalSaysWhy) {
    put(1U << 1);
    refuse("GetLocation", "org.freedesktop.ModemManager1.Error.Core.Unauthorized", "ask first");
    follow();
    listen();
    EXPECT_TRUE(becomes(
        code, {},
        root({{"kVoxModemReason", "org.freedesktop.ModemManager1.Error.Core.Unauthorized: ask first"}})));
    queue.advance(50s);
    drain();
    EXPECT_EQ(mock.count("GetLocation"), 1U) << "a minute passes before the next attempt";
}

TEST_F(PositionTest, sentencesReplaceTheDictionary) {
    put(1U << 2);
    // 48 degrees 7.038 minutes; the checksums are the exclusive or of what is between $ and *.
    answerLocation(
        {{4U, QDBusVariant(QString("$GPGSV,1,1,00*79\r\n"
                                   "$GPGGA,123519,4807.038,N,01131.000,E,1,08,0.9,545.4,M,46.9,M,,*47"))}});
    follow();
    listen();
    EXPECT_TRUE(becomes(code, {"kVoxPositionAltitude"}, 545.4));
    EXPECT_NEAR(realOf(latest(code, {"kVoxPositionLatitude"})), 48.1173, 1e-6);
    EXPECT_EQ(latest(code, {"kVoxPositionTime"}), Value("123519"));
}

TEST(PositionOfSentencesTest, takesGGAThenRMC) {
    const auto latitude = [](std::string_view sentences) {
        return realOf(positionOfSentences(sentences)["latitude"]);
    };
    constexpr std::string_view rmc = "$GNRMC,225446,A,4916.45,S,12311.12,W,000.5,054.7,191194,020.3,E*6B\r\n";
    EXPECT_NEAR(latitude(rmc), -(49 + 16.45 / 60), 1e-9);
    const Dictionary members = positionOfSentences(rmc);
    EXPECT_NEAR(realOf(members["longitude"]), -(123 + 11.12 / 60), 1e-9);
    EXPECT_FALSE(members.contains("altitude"));
    constexpr std::string_view gga = "$GPGGA,123519,4807.038,N,01131.000,E,1,08,0.9,545.4,M,46.9,M,,*47";
    EXPECT_NEAR(latitude(std::string(rmc) + std::string(gga)), 48.1173, 1e-9);
}

TEST(PositionOfSentencesTest, malformedSentencesSayNothing) {
    for (const std::string_view text : {
             "",
             "$GPGGA",
             "$GPGGA,123519,4807.038,N,01131.000,E,1,08,0.9,545.4,M,46.9,M,,*48", // a wrong checksum
             "$GPGGA,123519,4807.038,N,01131.000,E,1,08,0.9,545.4,M,46.9,M,,*",   // none
             "$GPGGA,,,,,,0,00,0.5,,M,0.0001999,M,0.0000099,0000*45",             // no fix
             "$GPRMC,134523.92,V,,,,,,,030136,,,N*73",                            // no fix
             "GPGGA,123519,4807.038,N,01131.000,E,1,08,0.9,545.4,M,46.9,M,,*47",  // no dollar sign
             "\r\n\r\n",
         })
        EXPECT_TRUE(positionOfSentences(text).empty()) << text;
}

} // namespace
} // namespace velmora
