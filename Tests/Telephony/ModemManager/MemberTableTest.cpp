// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberTable.h"

#include "LogMessages/LiveModem.h"
#include "Platform/TelephonyService.h"
#include "Telephony/ModemManager/Members/MemberNumber.h"
#include "Telephony/ModemManager/Members/MemberText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <cmath>
#include <initializer_list>
#include <memory>
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

TEST(MemberTableTest, aKeyIsSetTwiceOnlyWhereOneMemberReplacesAnother) {
    std::set<std::tuple<MemberOf, MemberUse, std::string_view>> all;
    std::set<std::string_view> repeated;
    for (const MemberRow& row : memberTable())
        if (setsKey(row) && !all.insert({row.of, row.use, row.key}).second && !row.listed)
            repeated.insert(row.key);
    // The channel number of UMTS has three members, its frequency two.
    EXPECT_THAT(repeated,
                ::testing::UnorderedElementsAre(kVoxCellMonitorUARFCN, kVoxCellMonitorDownlinkFrequency));
}

TEST(MemberTableTest, credentialsAreNeverUsed) {
    Dictionary target;
    setKeys(target, MemberUse::Context, MemberOf::BearerProperties,
            Dictionary{{"user", "me"}, {"password", "secret"}, {"apn", "a.test"}});
    EXPECT_EQ(target.size(), 1U);
    EXPECT_EQ(target["kVoxContextAPN"], Value("a.test"));
    setKeys(target, MemberUse::Context, MemberOf::BearerProperties, Value("no dictionary"));
    EXPECT_EQ(target.size(), 1U);
}

/// A conversion, its argument and its result.
struct Case {
    Value (*convert)(const Value&);
    Value given;
    Value wanted; ///< none where it is left out
};

Value array(std::initializer_list<Value> values) {
    return std::make_shared<Array>(values);
}

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
             Case{cellIdentity<0xFFFFFFF>, "FFFFFFE", 268435454},
             Case{cellIdentity<0xFFFFFFF>, "FFFFFFF", {}},
             Case{cellIdentity<0xFFFFFFF>, "FFFFFFFF", {}},
             Case{areaCode, "0", {}},
             Case{areaCode, "1", 1},
             Case{areaCode, "FFFD", 65533},
             Case{areaCode, "FFFE", {}},
             Case{areaCode, "FFFF", {}},
             Case{areaCode, "10000", {}},
             Case{longAreaCode, "000000", {}},
             Case{longAreaCode, "FFFE", {}},
             Case{longAreaCode, "FFFF", {}},
             Case{longAreaCode, "10000", 65536},
             Case{longAreaCode, "FFFFFD", 16777213},
             Case{longAreaCode, "FFFFFE", {}},
             Case{longAreaCode, "FFFFFF", {}},
             Case{earfcn, 0, 0},
             Case{earfcn, 65535, {}},
             Case{earfcn, 65536, 65536},
             Case{earfcn, 262144, {}},
             Case{earfcn, 0x7FFFFFFF, {}},
             Case{number<511>, 511, 511},
             Case{number<511>, 512, {}},
             Case{number<511>, -1, {}},
             Case{number<511>, 5.0, {}},
             Case{level<-150, 0>, -80.5, -80.5},
             Case{level<-150, 0>, -150.0, -150.0},
             Case{level<-150, 0>, -150.1, {}},
             Case{level<-150, 0>, 0.1, {}},
             Case{level<-150, 0>, -80, {}},
             Case{level<-150, 0>, std::nan(""), {}},
             Case{level<-150, 0>, -HUGE_VAL, {}},
             Case{wholeLevel<1, 200>, 110, 110.0},
             Case{wholeLevel<1, 200>, 0x7FFFFFFF, {}},
             Case{wholeLevel<1, 200>, 110.0, {}},
             // 3GPP TS 45.008: RXLEV 1 begins at -110 dBm, 63 at -48 dBm.
             Case{levelOfRXLEV, 0, -111.0},
             Case{levelOfRXLEV, 1, -110.0},
             Case{levelOfRXLEV, 63, -48.0},
             Case{levelOfRXLEV, 64, {}},
             Case{levelOfRXLEV, -1, {}},
             Case{levelOfRXLEV, 99, {}},
             Case{frequency, 2140000, 2140000},
             Case{frequency, 16383, {}},
             Case{channelInFrequency, 10700, 10700},
             Case{channelInFrequency, 0, {}},
             Case{channelInFrequency, 2140000, {}},
             Case{latitude, -90.0, -90.0},
             Case{latitude, 90.5, {}},
             Case{longitude, 180.0, 180.0},
             Case{longitude, -181.0, {}},
             Case{countryCode, "00101", 1},
             Case{countryCode, "310260", 310},
             Case{countryCode, "00000", {}},
             Case{networkCode, "00101", 1},
             Case{networkCode, "310260", 260},
             Case{networkCode, "310026", 26},
             Case{networkDigits, "00101", 2},
             Case{networkDigits, "310026", 3},
             Case{networkCode, "3102601", {}},
             Case{countryCode, "0010", {}},
             Case{countryCodeAlone, "001", 1},
             Case{countryCodeAlone, "000", {}},
             Case{countryCodeAlone, "1", {}},
             Case{networkCodeAlone, "026", 26},
             Case{networkCodeAlone, "1234", {}},
             Case{networkCodeAlone, "1a", {}},
             Case{networkDigitsAlone, "026", 3},
             Case{networkDigitsAlone, "26", 2},
             Case{mask, 0, {}},
             Case{mask, 1 << 14, 16384},
             Case{mask, 0xFFFFFFFF, {}},
             Case{flag, true, true},
             Case{flag, 1, {}},
             Case{qualityPercent, array({0, true}), 0},
             Case{qualityPercent, array({100, false}), 100},
             Case{qualityIsRecent, array({100, false}), false},
             Case{qualityPercent, array({101, true}), {}},
             Case{qualityIsRecent, array({101, true}), {}},
             Case{qualityPercent, array({50, 1}), {}},
             Case{qualityPercent, 50, {}},
             Case{date, 1, Date(std::chrono::seconds(1))},
             Case{date, 0, {}},
             Case{date, -1, {}},
             Case{date, std::int64_t(9'000'000'001), {}},
         })
        EXPECT_EQ(each.convert(each.given), each.wanted);
}

TEST(MemberConversionTest, texts) {
    using namespace convert;
    for (const Case& each : {
             Case{text, "Größe 5 €", "Größe 5 €"},
             Case{text, "a\tb", {}},
             Case{text, std::string(128, 'a'), std::string(128, 'a')},
             Case{text, std::string(129, 'a'), {}},
             Case{text, "\xC3", {}},
             Case{text, "\u0085", {}},
             Case{textList, array({"a", 5, "", "b"}), array({"a", "b"})},
             Case{textList, array({""}), {}},
             Case{textList, "a", {}},
             Case{digits, "0123456789", "0123456789"},
             Case{digits, "12a", {}},
             Case{equipment, "004999010640000", "004999010640000"},
             Case{equipment, "A10000009296F2", "A10000009296F2"},
             Case{equipment, "none", {}},
             Case{internetAddress, "::1", "::1"},
             Case{internetAddress, "10.0.0.1", "10.0.0.1"},
             Case{internetAddress, "10.0.0", {}},
             Case{internetAddress, "host", {}},
             Case{network, "00101", "00101"},
             Case{network, "310260", "310260"},
             Case{network, "x", {}},
             Case{error, array({"a.b.C", "no answer"}), "a.b.C: no answer"},
             Case{error, array({"a.b.C", ""}), "a.b.C"},
             Case{error, array({"", ""}), {}},
             Case{error, "a", {}},
         })
        EXPECT_EQ(each.convert(each.given), each.wanted);
}

} // namespace
} // namespace velmora
