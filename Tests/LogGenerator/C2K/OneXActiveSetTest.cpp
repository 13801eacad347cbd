// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/OneXRecords.h"

#include <gtest/gtest.h>

namespace velmora::c2k {
namespace {

/// What the active set shows of a sub-packet.
std::string activeSetOf(const Data& subPacket) {
    ParserHarness parser;
    parser.update(status({paging, radio, fingers, subPacket}));
    EXPECT_EQ(parser.lines(), LogLines());
    const std::string display = parser.display();
    const std::size_t begin = display.find("k1xActiveSetInfo ") + 17;
    return display.substr(begin, display.size() - begin - 1);
}

TEST(OneXActiveSetTest, ActiveSetWithoutPilotsIsAnEmptyList) {
    EXPECT_EQ(activeSetOf(hex("03 00 0C 00 02 00 01 02 00 01 0E 01")), "{_sorted '_sorted'}");
}

TEST(OneXActiveSetTest, EnergiesAreHeldAtMinus50) {
    // E/18 - 1/2: 9 gives 0, 0 gives -0.5; both below 0.00001.
    EXPECT_EQ(activeSetOf(withFields(active, {{28, 2, 9}, {48, 2, 0}})),
              "{_sorted '_sorted', 0;100 '-50.00 dB', 1;270 '(ref pilot) -50.00 dB'}");
}

TEST(OneXActiveSetTest, SDoublesTwice) {
    // S of 0: E / (8 * 36) - 1/2; 720 / 288 - 0.5 = 2, 3.0103 dB.
    // S of 3: 8 E / 36 - 1/2; 27 gives 5.5, 7.4036 dB.
    EXPECT_EQ(activeSetOf(withFields(active, {{7, 1, 0}, {28, 2, 720}, {48, 2, 720}})),
              "{_sorted '_sorted', 0;100 '+3.01 dB', 1;270 '(ref pilot) +3.01 dB'}");
    EXPECT_EQ(activeSetOf(withFields(active, {{7, 1, 3}, {28, 2, 27}, {48, 2, 27}})),
              "{_sorted '_sorted', 0;100 '+7.40 dB', 1;270 '(ref pilot) +7.40 dB'}");
}

TEST(OneXActiveSetTest, LargeNAndG) {
    // N 512, G 4, S 8: 2^13 * 65535 / (9 * 262144 * 4) - 1/512 = 536862720 / 9437184 - 0.00195
    // = 56.888 - 0.002 = 56.886, 17.5501 dB; E 0: held.
    EXPECT_EQ(
        activeSetOf(withFields(active, {{4, 2, 512}, {6, 1, 4}, {7, 1, 8}, {28, 2, 65535}, {48, 2, 0}})),
        "{_sorted '_sorted', 0;100 '+17.55 dB', 1;270 '(ref pilot) -50.00 dB'}");
}

TEST(OneXActiveSetTest, DivisorsOfZeroAreSurvived) {
    // G 0: E/0 is infinite, 0/0 is no number and shows the floor. N 0: infinite less infinite, the floor.
    EXPECT_EQ(activeSetOf(withFields(active, {{6, 1, 0}, {28, 2, 18}, {48, 2, 0}})),
              "{_sorted '_sorted', 0;100 '+inf dB', 1;270 '(ref pilot) -50.00 dB'}");
    EXPECT_EQ(activeSetOf(withFields(active, {{4, 2, 0}})),
              "{_sorted '_sorted', 0;100 '-50.00 dB', 1;270 '(ref pilot) -50.00 dB'}");
}

TEST(OneXActiveSetTest, MSetsThePilotsStride) {
    // M of 2: 27 & 0xFFC = 24 bytes a pilot, the energy at 24 + 8 from the cursor, 20 into the pilot.
    EXPECT_EQ(activeSetOf(hex("03 00 3C 00 02 00 01 02 02 02 0E 01"
                              "64 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 12 00 00 00"
                              "0E 01 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 1B 00 00 00")),
              "{_sorted '_sorted', 0;100 '-3.01 dB', 1;270 '(ref pilot) +0.00 dB'}");
    // M of 0: 12 bytes a pilot, the energy where the next pilot's PN offset is.
    EXPECT_EQ(activeSetOf(hex("03 00 26 00 02 00 01 02 02 00 12 00"
                              "64 00 00 00 00 00 00 00 00 00 00 00" // PN 100; E is the next PN, 18
                              "12 00 00 00 00 00 00 00 00 00 00 00" // PN 18, the reference one
                              "1B 00")),                            // its E 27
              "{_sorted '_sorted', 0;100 '-3.01 dB', 1;18 '(ref pilot) +0.00 dB'}");
}

TEST(OneXActiveSetTest, EveryPilotWithTheReferencePNIsMarked) {
    EXPECT_EQ(activeSetOf(withFields(active, {{12, 2, 270}})),
              "{_sorted '_sorted', 0;270 '(ref pilot) -3.01 dB', 1;270 '(ref pilot) +0.00 dB'}");
}

} // namespace
} // namespace velmora::c2k
