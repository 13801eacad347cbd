// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

/// One frame, erased or not.
Data frame(bool erased) {
    const Data good = record(0x119D, "00 01 00 00"                   // 13; one sub-packet
                                     "0B 00 19 00"                   // 17 traffic demodulation, 25 bytes
                                     "00 00 00 00 00 00 00 00 00 00" // +4
                                     "00 00 00 00 00 00 00 00 00 00" // +14
                                     "00");                          // +24 erasure
    return erased ? withByte(good, 41, 1) : good;
}

TEST(TrafficFERTest, FirstFrameGivesZeroOrOneSixtyFourth) {
    ParserHarness good;
    good.update(frame(false));
    EXPECT_EQ(good.display(), "{k1xTrafficFER '0.00%'}");
    EXPECT_EQ(good.state["TrafficFER"], Value(0.0));

    ParserHarness erased;
    erased.update(frame(true));
    EXPECT_EQ(erased.display(), "{k1xTrafficFER '1.56%'}"); // 1/64 = 1.5625 %
    EXPECT_EQ(erased.state["TrafficFER"], Value(0.015625));
    EXPECT_EQ(erased.lines(), LogLines());
}

TEST(TrafficFERTest, AnyNonZeroByteIsAnErasure) {
    for (const unsigned erasure : {1u, 2u, 0x80u, 0xFFu}) {
        ParserHarness parser;
        parser.update(withFields(frame(false), {{41, 1, erasure}}));
        EXPECT_EQ(parser.text("k1xTrafficFER"), "1.56%");
    }
}

TEST(TrafficFERTest, AGoodFrameTakesASixtyFourthOff) {
    ParserHarness parser;
    parser.update(frame(true)).update(frame(false));
    EXPECT_EQ(parser.text("k1xTrafficFER"), "1.54%");          // 63/64/64 = 63/4096 = 1.53809 %
    EXPECT_EQ(parser.state["TrafficFER"], Value(63.0 / 4096)); // six bits: exact in any precision
}

TEST(TrafficFERTest, TenErasedFramesInSinglePrecision) {
    ParserHarness parser;
    for (int i = 0; i < 10; ++i)
        parser.update(frame(true));
    // 1 - (63/64)^10: ln(63/64) = -0.01574836; exp(-0.1574836) = 0.8542908; 1 - 0.8542908 = 0.1457092
    EXPECT_EQ(parser.text("k1xTrafficFER"), "14.57%");
    // 63^10 has 60 bits; what is kept has the 24 of a single.
    const double kept = *parser.state["TrafficFER"].asReal();
    EXPECT_EQ(kept, static_cast<double>(static_cast<float>(kept)));
    EXPECT_NEAR(kept, 0.1457092, 0.000001);
}

TEST(TrafficFERTest, OldAverageMayBeAnyNumberAndNothingElse) {
    ParserHarness integer;
    integer.state.set("TrafficFER", 1);
    integer.update(frame(true));
    EXPECT_EQ(integer.text("k1xTrafficFER"), "100.00%"); // 1/64 + 63/64

    ParserHarness real;
    real.state.set("TrafficFER", 0.5);
    real.update(frame(false));
    EXPECT_EQ(real.text("k1xTrafficFER"), "49.22%"); // 0.5 * 0.984375 = 0.4921875

    ParserHarness text;
    text.state.set("TrafficFER", "0.5");
    text.update(frame(true));
    EXPECT_EQ(text.text("k1xTrafficFER"), "1.56%");
}

TEST(TrafficFERTest, WithoutItsSubPacketIsRejected) {
    for (const Data& odd : {withByte(frame(true), 17, 12),   // another id
                            withByte(frame(true), 14, 0)}) { // no sub-packets
        ParserHarness parser;
        parser.update(odd);
        EXPECT_EQ(parser.display(), "{}");
        EXPECT_FALSE(parser.state.contains("TrafficFER"));
        EXPECT_EQ(parser.lines(),
                  (LogLines{{LogPriority::Warning, "Log code 0x119d: missing traffic demod subpacket."}}));
    }
}

TEST(TrafficFERTest, EveryPrefix) {
    for (std::size_t length = 13; length <= 42; ++length) {
        SCOPED_TRACE(length);
        ParserHarness parser;
        parser.update(prefixOf(frame(true), length));
        const std::string number = std::to_string(length);
        EXPECT_EQ(parser.display(), length < 42 ? "{}" : "{k1xTrafficFER '1.56%'}");
        EXPECT_EQ(parser.state.contains("TrafficFER"), length == 42);
        if (length < 17)
            EXPECT_EQ(parser.lines(),
                      error("Log code 0x119d is " + number + " bytes long but must be at least 17 bytes."));
        else if (length >= 21 && length <= 25) // its end, 42, lies at or past 17 + length
            EXPECT_EQ(
                parser.lines(),
                (LogLines{{LogPriority::Error, "Log code error in subpkt#0: bad size (25)."},
                          {LogPriority::Warning, "Log code 0x119d: missing traffic demod subpacket."}}));
        else if (length < 42) // without its header, or taken but without its byte 24
            EXPECT_EQ(parser.lines(), error("Log code 0x119d is " + number +
                                            " bytes long but its subpkt#0 needs at least 42 bytes."));
        else
            EXPECT_EQ(parser.lines(), LogLines());
    }
}

} // namespace
} // namespace velmora
