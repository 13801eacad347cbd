// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Service/LogFilter.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

Value numbers(std::initializer_list<Value> values) {
    return Value(std::make_shared<Array>(values));
}

LogFilter filterOf(const Dictionary& command) {
    auto filter = LogFilter::fromStartCommand(command);
    if (!filter)
        throw std::invalid_argument(filter.reason());
    return *filter;
}

TEST(LogFilterTest, withoutListsEverythingPasses) {
    const LogFilter filter = filterOf({{"SetState", "Streaming"}});
    EXPECT_TRUE(filter.passes(record(0x5137, "00").bytes()));
    EXPECT_TRUE(filter.passes(record(0x0002, "00", 0xFF).bytes()));
    EXPECT_TRUE(filter.passes(hex("").bytes()));
    EXPECT_TRUE(LogFilter().passes(record(0x5137, "00").bytes()));
}

TEST(LogFilterTest, listedCodesPass) {
    const LogFilter filter = filterOf({{"SetState", "Streaming"},
                                       {"SetOstrelLogCodes", numbers({0x5137, 0xFFFF})},
                                       {"SetVoxExtraCodes", numbers({0, 2})}});
    struct Case {
        const char* name;
        Data message;
        bool passes;
    };
    for (const Case& each : {
             Case{"listed", record(0x5137, "00"), true},
             Case{"listed, header alone", record(0x5137, ""), true},
             Case{"largest code", record(0xFFFF, ""), true},
             Case{"not listed", record(0x5138, "00"), false},
             Case{"not listed, header alone", record(0x5138, ""), false},
             Case{"an extra code in the baseband stream", record(0x0002, "00"), false},
             Case{"extra, listed", record(0x0002, "00", 0xFF), true},
             Case{"extra, not listed", record(0x0001, "00", 0xFF), false},
             Case{"a baseband code in the extra stream", record(0x5137, "00", 0xFF), false},
             Case{"prefixed, listed", joined(hex("81 00"), record(0x5137, "00")), true},
             Case{"prefixed, not listed", joined(hex("81 00"), record(0x5138, "00")), false},
             Case{"prefixed, 11 bytes after the prefix", hex("81 00 01 0A 00 38 51 00 00 00 00 00 00"),
                  false},
         })
        EXPECT_EQ(filter.passes(each.message.bytes()), each.passes) << each.name;
}

TEST(LogFilterTest, whatIsMalformedPasses) {
    const LogFilter filter = filterOf({{"SetState", "Streaming"}, {"SetOstrelLogCodes", numbers({})}});
    EXPECT_TRUE(filter.passes(hex("").bytes()));
    EXPECT_TRUE(filter.passes(hex("01 0B 00 37 51").bytes())) << "five bytes";
    EXPECT_TRUE(filter.passes(hex("01 0B 00 37 51 00 00 00 00 00 00 00").bytes())) << "twelve bytes";
    EXPECT_TRUE(filter.passes(record(0x5137, "00", 2).bytes())) << "type 2";
    EXPECT_TRUE(filter.passes(joined(hex("81 00"), record(0x5137, "00", 2)).bytes()))
        << "type 2 after the prefix";
    EXPECT_FALSE(filter.passes(record(0x5137, "00").bytes()));
}

TEST(LogFilterTest, aMissingListBesideTheOtherIsEmpty) {
    const LogFilter codes = filterOf({{"SetOstrelLogCodes", numbers({1})}});
    EXPECT_TRUE(codes.passes(record(1, "00").bytes()));
    EXPECT_FALSE(codes.passes(record(1, "00", 0xFF).bytes()));
    const LogFilter extra = filterOf({{"SetVoxExtraCodes", numbers({1})}});
    EXPECT_FALSE(extra.passes(record(1, "00").bytes()));
    EXPECT_TRUE(extra.passes(record(1, "00", 0xFF).bytes()));
}

TEST(LogFilterTest, refusesListsThatAreNone) {
    struct Case {
        Dictionary command;
        const char* reason;
    };
    for (const Case& each : {
             Case{{{"SetOstrelLogCodes", "all"}}, "SetOstrelLogCodes is of kind string, wanted an array"},
             Case{{{"SetVoxExtraCodes", 5}}, "SetVoxExtraCodes is of kind integer, wanted an array"},
             Case{{{"SetOstrelLogCodes", numbers({1, "2"})}},
                  "SetOstrelLogCodes holds a value of kind string, wanted numbers from 0 to 65535"},
             Case{{{"SetOstrelLogCodes", numbers({65536})}},
                  "SetOstrelLogCodes holds 65536, wanted numbers from 0 to 65535"},
             Case{{{"SetVoxExtraCodes", numbers({-1})}},
                  "SetVoxExtraCodes holds -1, wanted numbers from 0 to 65535"},
         }) {
        const auto filter = LogFilter::fromStartCommand(each.command);
        ASSERT_FALSE(filter) << each.reason;
        EXPECT_EQ(filter.reason(), each.reason);
    }
}

} // namespace
} // namespace velmora
