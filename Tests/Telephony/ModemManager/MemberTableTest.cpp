// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberTable.h"

#include "Telephony/ModemManager/Members/LTEBand.h"
#include "Telephony/ModemManager/Members/MemberNumber.h"
#include "Telephony/ModemManager/Members/MemberText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <set>
#include <string>
#include <tuple>

namespace velmora {
namespace {

bool setsKey(const MemberRow& row) {
    return row.use != MemberUse::Service && row.use != MemberUse::Unused;
}

TEST(MemberTableTest, everyRowIsComplete) {
    for (const MemberRow& row : memberTable()) {
        EXPECT_FALSE(row.member.empty());
        EXPECT_FALSE(row.note.empty()) << row.member << ": units, or why it is unused";
        EXPECT_EQ(row.convert != nullptr, setsKey(row)) << row.member;
        EXPECT_EQ(!row.key.empty(), setsKey(row)) << row.member;
        if (row.convert) {
            EXPECT_TRUE(row.convert(Value()).isNone()) << row.member << ": missing is left out";
        }
    }
}

TEST(MemberTableTest, noKeyOfARecordIsSetTwice) {
    // A bearer's dictionary holds its own values and the link's.
    std::set<std::string_view> bearer;
    std::set<std::string_view> files;
    std::set<std::tuple<MemberOf, MemberUse, std::string_view>> all;
    for (const MemberRow& row : memberTable()) {
        if (!setsKey(row))
            continue;
        EXPECT_TRUE(all.insert({row.of, row.use, row.key}).second) << row.key;
        if (row.use == MemberUse::Bearer || row.use == MemberUse::Link) {
            EXPECT_TRUE(bearer.insert(row.key).second) << row.key;
        } else if (row.use == MemberUse::SIMFile) {
            EXPECT_TRUE(files.insert(row.key).second) << row.key;
        }
    }
}

TEST(MemberTableTest, credentialsAreNeverUsed) {
    Dictionary target;
    setKeys(target, MemberUse::Bearer, MemberOf::BearerProperties,
            Dictionary{{"user", "me"}, {"password", "secret"}, {"apn", "a.test"}});
    EXPECT_EQ(target.size(), 1U);
    EXPECT_EQ(target["APN"], Value("a.test"));
    setKeys(target, MemberUse::Bearer, MemberOf::BearerProperties, Value("no dictionary"));
    EXPECT_EQ(target.size(), 1U);
}

/// A conversion, its argument and its result.
struct Case {
    Value (*convert)(const Value&);
    Value given;
    Value wanted; ///< none where it is left out
};

TEST(MemberConversionTest, numbers) {
    using namespace convert;
    for (const Case& each : {
             Case{hexadecimalNumber<0xFFFF>, "0", 0},
             Case{hexadecimalNumber<0xFFFF>, "ffff", 65535},
             Case{hexadecimalNumber<0xFFFF>, "0000FFFF", 65535},
             Case{hexadecimalNumber<0xFFFF>, "10000", {}},
             Case{hexadecimalNumber<0xFFFF>, "", {}},
             Case{hexadecimalNumber<0xFFFF>, "+1", {}},
             Case{hexadecimalNumber<0xFFFF>, "1 ", {}},
             Case{hexadecimalNumber<0xFFFF>, 1, {}},
             Case{hexadecimalNumber<0xFFFF>, "FFFFFFFFFFFFFFFFFF", {}},
             Case{number<511>, 511, 511},
             Case{number<511>, 512, {}},
             Case{number<511>, -1, {}},
             Case{number<511>, 5.0, {}},
             Case{level<-150, 0>, -80.5, -81},
             Case{level<-150, 0>, -80.49, -80},
             Case{level<-150, 0>, -150.0, -150},
             Case{level<-150, 0>, -150.1, {}},
             Case{level<-150, 0>, 0.1, {}},
             Case{level<-150, 0>, -80, {}},
             Case{level<-150, 0>, std::nan(""), {}},
             Case{level<-150, 0>, -HUGE_VAL, {}},
             Case{halfSteps, -70.0, -35},
             Case{halfSteps, -71.0, -36},
             Case{halfSteps, -70.9, -35},
             Case{halfSteps, -71.1, -36},
             Case{halfSteps, 0.0, 0},
             Case{halfSteps, 1.0, {}},
             Case{halfStepsOfRXLEV, 0, -56},
             Case{halfStepsOfRXLEV, 1, -55},
             Case{halfStepsOfRXLEV, 63, -24},
             Case{halfStepsOfRXLEV, 64, {}},
             Case{halfStepsOfRXLEV, -1, {}},
             Case{halfStepsOfRXLEV, 99, {}},
             Case{countryCode, "00101", 1},
             Case{countryCode, "310260", 310},
             Case{networkCode, "00101", 1},
             Case{networkCode, "310260", 260},
             Case{networkCode, "3102601", {}},
             Case{countryCode, "0010", {}},
             Case{decimalCode, "001", 1},
             Case{decimalCode, "1234", {}},
             Case{decimalCode, "", {}},
             Case{decimalCode, "1a", {}},
             // The ends of bands, and a gap between two.
             Case{bandOfEARFCN, 0, 1},
             Case{bandOfEARFCN, 599, 1},
             Case{bandOfEARFCN, 600, 2},
             Case{bandOfEARFCN, 4949, 11},
             Case{bandOfEARFCN, 4950, {}},
             Case{bandOfEARFCN, 5010, 12},
             Case{bandOfEARFCN, 37750, 38},
             Case{bandOfEARFCN, 70645, 88},
             Case{bandOfEARFCN, 70646, {}},
             Case{bandOfEARFCN, -1, {}},
             Case{bandOfEARFCN, "0", {}},
         })
        EXPECT_EQ(each.convert(each.given), each.wanted);
}

TEST(MemberConversionTest, texts) {
    using namespace convert;
    const auto pair = [](Value a, Value b) {
        return Value(std::make_shared<Array>(Array{std::move(a), std::move(b)}));
    };
    for (const Case& each : {
             Case{text, "Größe 5 €", "Größe 5 €"},
             Case{text, "a\tb", {}},
             Case{text, std::string(128, 'a'), std::string(128, 'a')},
             Case{text, std::string(129, 'a'), {}},
             Case{text, "\xC3", {}},
             Case{text, "\u0085", {}},
             Case{digits, "0123456789", "0123456789"},
             Case{digits, "12a", {}},
             Case{internetAddress, "::1", "::1"},
             Case{internetAddress, "10.0.0.1", "10.0.0.1"},
             Case{internetAddress, "10.0.0", {}},
             Case{internetAddress, "host", {}},
             Case{networkText, "00101", "001-01"},
             Case{networkText, "310260", "310-260"},
             Case{networkText, "x", {}},
             Case{modemState, -1, "Failed"},
             Case{modemState, 11, "Connected"},
             Case{modemState, 12, "12"},
             Case{registrationState, 5, "Roaming"},
             Case{registrationState, 11, "Attached for restricted services"},
             Case{registrationState, 99, "99"},
             Case{accessTechnologies, 1 << 14 | 1 << 15, "LTE, 5G NR"},
             Case{accessTechnologies, 0, {}},
             Case{accessTechnologies, std::int64_t(1) << 40, {}},
             Case{bearerState, true, "Connected"},
             Case{bearerState, 1, {}},
             Case{bearerType, 3, "Dedicated"},
             Case{bearerType, 0, {}},
             Case{bearerType, 9, "9"},
             Case{internetFamily, 3, "IPv4, IPv6"},
             Case{internetFamily, 0, {}},
             Case{configurationMethod, 1, "PPP"},
             Case{configurationMethod, 0, {}},
             Case{yesOrNo, true, "Yes"},
             Case{yesOrNo, 0, {}},
             Case{numberText, 0, "0"},
             Case{numberText, -1, {}},
             Case{byteCount, 1, "1 bytes"},
             Case{seconds, 60, "60 s"},
             Case{bitRate, 384999, "384 kbit/s"},
             Case{bitRate, 0, {}},
             Case{dateText, 0, {}},
             Case{dateText, 1, "1970-01-01 00:00:01 +0000"},
             Case{dateText, -1, {}},
             Case{dateText, std::int64_t(9'000'000'001), {}},
             Case{signalQuality, pair(0, true), "0 %"},
             Case{signalQuality, pair(100, false), "100 % (not recent)"},
             Case{signalQuality, pair(101, true), {}},
             Case{signalQuality, pair(50, 1), {}},
             Case{signalQuality, 50, {}},
             Case{powerText, -90.0, "-90.0 dBm"},
             Case{powerText, -0.05, "-0.1 dBm"},
             Case{powerText, -0.04, "0.0 dBm"},
             Case{powerText, -201.0, {}},
             Case{ratioText, 13.25, "13.3 dB"},
             Case{ratioText, std::nan(""), {}},
             Case{percentText, 0.4, "0.4 %"},
             Case{percentText, 100.1, {}},
         })
        EXPECT_EQ(each.convert(each.given), each.wanted);
}

} // namespace
} // namespace velmora
