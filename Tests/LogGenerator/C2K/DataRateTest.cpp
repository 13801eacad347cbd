// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <iterator>

namespace velmora {
namespace {

/// A forward-link record; the counter of 1024 bits (the fourth) shows how many packets came.
Data forward(std::uint32_t sequence, std::uint32_t packets) {
    return recordWith(0x1192, 241, {{13, 4, sequence}, {29, 4, packets}});
}

std::string stateOf(const ParserHarness& parser) {
    return shown(std::make_shared<Dictionary>(parser.state));
}

TEST(ForwardLinkDataRateTest, FirstRecordOnlySeeds) {
    ParserHarness parser;
    parser.show("kFLDataRate", "earlier");
    parser.update(forward(10, 100));
    EXPECT_EQ(parser.display(), "{kFLDataRate ''}");
    EXPECT_EQ(stateOf(parser), "{ExtraInfo {FLDataSeqNum1 10, FLDataSent1 102400}, "
                               "FLDataSeqNum 10, FLDataSent 102400}");
    EXPECT_EQ(parser.lines(), LogLines());
}

TEST(ForwardLinkDataRateTest, NextRecordsShowTheRate) {
    ParserHarness parser;
    parser.update(forward(10, 100)).update(forward(12, 300));
    // 200 packets of 1024 bits in two steps: 204800 / (2 * 1024)
    EXPECT_EQ(parser.display(), "{kFLDataRate '100.00 kbps'}");
    EXPECT_EQ(stateOf(parser), "{ExtraInfo {FLDataSeqNum1 12, FLDataSent1 307200, FLDataSeqNum2 10, "
                               "FLDataSent2 102400}, FLDataSeqNum 12, FLDataSent 307200}");
    parser.update(forward(15, 301));
    EXPECT_EQ(parser.text("kFLDataRate"), "0.33 kbps"); // 1024 / (3 * 1024)
}

TEST(ForwardLinkDataRateTest, SameOrEarlierSequenceKeepsTheRateAndMovesTheCounters) {
    ParserHarness parser;
    parser.update(forward(10, 100)).update(forward(11, 200));
    EXPECT_EQ(parser.text("kFLDataRate"), "100.00 kbps");
    parser.update(forward(11, 900));
    EXPECT_EQ(parser.text("kFLDataRate"), "100.00 kbps");
    EXPECT_EQ(stateOf(parser), "{ExtraInfo {FLDataSeqNum1 11, FLDataSent1 921600, FLDataSeqNum2 11, "
                               "FLDataSent2 204800}, FLDataSeqNum 11, FLDataSent 921600}");
    parser.update(forward(10, 950));
    EXPECT_EQ(parser.text("kFLDataRate"), "100.00 kbps");
    parser.update(forward(11, 1000)); // 50 since the latest
    EXPECT_EQ(parser.text("kFLDataRate"), "50.00 kbps");
}

struct Steps {
    const char* name;
    std::uint32_t from;
    std::uint32_t to;
    const char* rate; ///< of 1024 packets more
};

class SequenceTest : public testing::TestWithParam<Steps> {};

TEST_P(SequenceTest, DifferenceIsSigned32Bits) {
    ParserHarness parser;
    parser.update(forward(GetParam().from, 0)).update(forward(GetParam().to, 1024));
    EXPECT_EQ(parser.text("kFLDataRate"), GetParam().rate);
}

INSTANTIATE_TEST_SUITE_P(, SequenceTest,
                         testing::Values(Steps{"Wrapped", 0xFFFFFFFF, 0, "1024.00 kbps"},
                                         Steps{"WrappedByFour", 0xFFFFFFFE, 2, "256.00 kbps"},
                                         Steps{"IntoTheSignBit", 0x7FFFFFFF, 0x80000000, "1024.00 kbps"},
                                         Steps{"LargestStep", 1, 0x80000000,
                                               "0.00 kbps"},                       // 1024 / (2^31 - 1)
                                         Steps{"HalfWayRound", 0, 0x80000000, ""}, // -2^31
                                         Steps{"OneBack", 0, 0xFFFFFFFF, ""}),
                         [](const auto& test) { return std::string(test.param.name); });

TEST(ForwardLinkDataRateTest, CountersThatStartAgainShowANegativeRate) {
    ParserHarness parser;
    parser.update(forward(1, 200)).update(forward(2, 0));
    EXPECT_EQ(parser.text("kFLDataRate"), "-200.00 kbps");
}

TEST(ForwardLinkDataRateTest, SumsIn64Bits) {
    ParserHarness parser;
    parser.update(forward(1, 0));
    parser.update(recordWith(0x1192, 241, {{13, 4, 2}, {17 + 4 * 52, 4, 0xFFFFFFFF}}));
    // (2^32 - 1) * 5120 = 21990232555520 - 5120; that divided by 1024 is 21474836475
    EXPECT_EQ(parser.state["FLDataSent"], Value(std::int64_t{21990232550400}));
    EXPECT_EQ(parser.text("kFLDataRate"), "21474836475.00 kbps");
}

TEST(ForwardLinkDataRateTest, EveryCountersWeight) {
    const int weights[] = {128,  256,  512, 1024, 0,    128,  256,  512,  1024, 0,    128,  256,  512,  1024,
                           0,    128,  256, 512,  1024, 0,    128,  256,  512,  1024, 0,    512,  1024, 2048,
                           0,    128,  256, 512,  1024, 0,    512,  1024, 2048, 0,    1024, 3072, 0,    512,
                           1024, 2048, 0,   4096, 0,    1024, 3072, 0,    4096, 0,    5120, 0,    5120, 0};
    ASSERT_EQ(std::size(weights), 56u);
    for (std::size_t i = 0; i < std::size(weights); ++i) {
        ParserHarness parser;
        parser.update(recordWith(0x1192, 241, {{17 + 4 * i, 4, 3}}));
        EXPECT_EQ(parser.state["FLDataSent"], Value(3 * weights[i])) << i;
    }
}

TEST(ForwardLinkDataRateTest, AMissingCounterRestartsTheRate) {
    for (const char* key : {"FLDataSeqNum", "FLDataSent"}) {
        ParserHarness parser;
        parser.update(forward(1, 0)).update(forward(2, 100));
        parser.state.remove(key);
        parser.update(forward(3, 200));
        EXPECT_EQ(parser.text("kFLDataRate"), "");
        parser.state.set(key, "text");
        parser.update(forward(4, 300));
        EXPECT_EQ(parser.text("kFLDataRate"), "");
        parser.update(forward(5, 400));
        EXPECT_EQ(parser.text("kFLDataRate"), "100.00 kbps");
    }
}

TEST(ForwardLinkDataRateTest, WithoutExtraInfoTheRateIsShownAllTheSame) {
    for (const Value& extra : {Value(), Value("text"), Value(makeDictionary()).copy()}) {
        ParserHarness parser;
        parser.state.set("ExtraInfo", extra);
        parser.update(forward(1, 0)).update(forward(2, 100));
        EXPECT_EQ(parser.text("kFLDataRate"), "100.00 kbps");
        EXPECT_EQ(parser.state["ExtraInfo"], extra);
    }
}

TEST(ForwardLinkDataRateTest, Lengths) {
    for (std::size_t length = 13; length <= 250; ++length) {
        ParserHarness parser;
        parser.update(recordWith(0x1192, length));
        if (length < 241) {
            EXPECT_EQ(parser.lines(), error("Log code 0x1192 is " + std::to_string(length) +
                                            " bytes long but must be at least 241 bytes."));
            EXPECT_EQ(parser.display(), "{}");
            EXPECT_EQ(stateOf(parser), "{ExtraInfo {}}");
        } else {
            EXPECT_EQ(parser.lines(), LogLines());
            EXPECT_EQ(parser.display(), "{kFLDataRate ''}");
        }
    }
}

TEST(ReverseLinkDataRateTest, KeepsItsOwnNumbers) {
    ParserHarness parser;
    parser.update(forward(7, 9));
    // 128-bit packets; the sequence number lies at 14.
    parser.update(recordWith(0x127E, 1750, {{13, 1, 0xEE}, {14, 4, 100}, {18, 4, 80}}));
    EXPECT_EQ(parser.display(), "{kFLDataRate '', kRLDataRate ''}");
    parser.update(recordWith(0x127E, 1750, {{13, 1, 0xEE}, {14, 4, 105}, {18, 4, 160}}));
    EXPECT_EQ(parser.text("kRLDataRate"), "2.00 kbps"); // 80 * 128 / (5 * 1024)
    EXPECT_EQ(stateOf(parser),
              "{ExtraInfo {FLDataSeqNum1 7, FLDataSent1 9216, RLDataSeqNum1 105, RLDataSent1 20480, "
              "RLDataSeqNum2 100, RLDataSent2 10240}, FLDataSeqNum 7, FLDataSent 9216, RLDataSeqNum 105, "
              "RLDataSent 20480}");
}

TEST(ReverseLinkDataRateTest, EveryCountersPlaceAndWeight) {
    const int weights[] = {128, 256, 512, 768, 1024, 1536, 2048, 3072, 4096, 6144, 8192, 12288};
    // What each counter of the record is worth; bytes that belong to none are worth nothing.
    std::vector<int> worth(1750, 0);
    for (std::size_t j = 0; j < 12; ++j)
        for (std::size_t b = 0; b < 3; ++b)
            for (std::size_t i = 0; i < 4; ++i) {
                worth[18 + 24 * j + 576 * b + 4 * i] = weights[j];
                worth[306 + 24 * j + 576 * b + 4 * i] = weights[j];
            }
    for (std::size_t offset = 18; offset + 4 <= 1750; offset += 4) {
        ParserHarness parser;
        parser.update(recordWith(0x127E, 1750, {{offset, 4, 5}}));
        EXPECT_EQ(parser.state["RLDataSent"], Value(5 * worth[offset])) << offset;
    }
}

TEST(ReverseLinkDataRateTest, SumsIn64Bits) {
    std::vector<std::uint8_t> bytes(1750 - 18, 0xFF);
    const Data full = joined(recordWith(0x127E, 18), Data(std::move(bytes)));
    ParserHarness parser;
    parser.update(full);
    // 24 counters of each size; the weights add up to 40064: 24 * 40064 * (2^32 - 1) = 961536 * 4294967295
    EXPECT_EQ(parser.state["RLDataSent"], Value(std::int64_t{4129765672965120}));
}

TEST(ReverseLinkDataRateTest, Lengths) {
    for (const std::size_t length : {13u, 17u, 18u, 241u, 1738u, 1749u, 1750u, 1751u}) {
        ParserHarness parser;
        parser.update(recordWith(0x127E, length));
        if (length < 1750) {
            EXPECT_EQ(parser.lines(), error("Log code 0x127e is " + std::to_string(length) +
                                            " bytes long but must be at least 1750 bytes."));
            EXPECT_EQ(stateOf(parser), "{ExtraInfo {}}");
        } else {
            EXPECT_EQ(parser.lines(), LogLines());
            EXPECT_EQ(parser.display(), "{kRLDataRate ''}");
        }
    }
}

} // namespace
} // namespace velmora
